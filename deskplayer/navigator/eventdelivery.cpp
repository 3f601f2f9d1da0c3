#include "navigator/eventdelivery.h"

namespace deskplayer
{

namespace
{

/** The events that fit between two calls of Settle(). */
constexpr std::size_t Places = 256;

/** How often a waiting thread yields the processor before it blocks. */
constexpr int YieldsBeforeBlocking = 100;

} // namespace

/** Reaches no listener: when it is delivered, everything posted before it has been delivered. */
class EventDelivery::SettledEvent : public bdmv::INavigatorEvent
{
public:
    explicit SettledEvent(EventDelivery& delivery) : m_rDelivery(delivery) {}

    void Dispatch(bdmv::INavigatorEvent::Listeners& /*listeners*/) override
    {
        const std::lock_guard<std::mutex> lock(m_rDelivery.m_Mutex);
        m_rDelivery.m_IsSettled = true;
        m_rDelivery.m_Settled.notify_one();
    }

private:
    EventDelivery& m_rDelivery;
};

EventDelivery::EventDelivery() : m_Queue(Places), m_Thread(&EventDelivery::Deliver, this) {}

EventDelivery::~EventDelivery()
{
    m_Queue.Close();
    m_Thread.join();
}

void EventDelivery::Settle()
{
    while (!m_Queue.Post<SettledEvent>(*this)) {
        std::this_thread::yield();
    }
    std::unique_lock<std::mutex> lock(m_Mutex);
    // Waking a thread takes far longer than delivering an event.
    for (int yields = 0; yields < YieldsBeforeBlocking && !m_IsSettled; ++yields) {
        lock.unlock();
        std::this_thread::yield();
        lock.lock();
    }
    m_Settled.wait(lock, [this] { return m_IsSettled; });
    m_IsSettled = false;
    if (const std::exception_ptr failure = std::exchange(m_Failure, nullptr)) {
        std::rethrow_exception(failure);
    }
}

void EventDelivery::Deliver()
{
    for (;;) {
        try {
            m_Queue.Run(m_Listeners);
            return;
        } catch (...) {
            if (!m_Failure) {
                m_Failure = std::current_exception();
            }
        }
    }
}

} // namespace deskplayer
