#include "navigator/eventdelivery.h"

#include <utility>

namespace deskplayer
{

namespace
{

/** How often a waiting thread yields the processor before it blocks. */
constexpr int YieldsBeforeBlocking = 100;

} // namespace

EventDelivery::EventDelivery() : m_Thread(&EventDelivery::Deliver, this) {}

EventDelivery::~EventDelivery()
{
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        m_Ending = true;
    }
    m_Changed.notify_all();
    m_Thread.join();
}

void EventDelivery::Post(std::unique_ptr<bdmv::INavigatorEvent> event)
{
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        m_Queue.push_back(std::move(event));
        ++m_Undelivered;
    }
    m_Changed.notify_all();
}

void EventDelivery::Settle()
{
    std::unique_lock<std::mutex> lock(m_Mutex);
    Wait(lock, [this] { return m_Undelivered == 0; });
    if (const std::exception_ptr failure = std::exchange(m_Failure, nullptr)) {
        std::rethrow_exception(failure);
    }
}

/** Yields before blocking, because waking a thread takes far longer than delivering an event. */
template <typename Condition>
void EventDelivery::Wait(std::unique_lock<std::mutex>& lock, Condition condition)
{
    for (int yields = 0; yields < YieldsBeforeBlocking && !condition(); ++yields) {
        lock.unlock();
        std::this_thread::yield();
        lock.lock();
    }
    m_Changed.wait(lock, condition);
}

void EventDelivery::Deliver()
{
    std::unique_lock<std::mutex> lock(m_Mutex);
    for (;;) {
        Wait(lock, [this] { return m_Ending || !m_Queue.empty(); });
        if (m_Queue.empty()) {
            return;
        }
        std::unique_ptr<bdmv::INavigatorEvent> event = std::move(m_Queue.front());
        m_Queue.pop_front();
        lock.unlock();
        std::exception_ptr failure;
        try {
            event->Dispatch(m_Listeners);
        } catch (...) {
            failure = std::current_exception();
        }
        event.reset();
        lock.lock();
        if (!m_Failure) {
            m_Failure = failure;
        }
        --m_Undelivered;
        m_Changed.notify_all();
    }
}

} // namespace deskplayer
