#include "clientkit/queuedlistener.h"

#include <condition_variable>
#include <mutex>
#include <system_error>

#include "bd/guard.h"
#include "clientkit/callbackqueue.h"
#include "kevro/kevro_osa.h"

namespace bdmv
{

/** The queue with its lock, and the client's thread. */
class QueuedListener::Delivery : private CallbackListener
{
public:
    Delivery(INavigatorListener& client, const Options& options)
        : m_rClient(client), m_Queue(options), m_Closed(false), m_Sleeping(false)
    {
    }

    Delivery(const Delivery&) = delete;
    Delivery& operator=(const Delivery&) = delete;

    void Put(const Callback& callback)
    {
        bool wake = false;
        {
            const std::lock_guard<std::mutex> lock(m_Mutex);
            if (m_Closed) {
                m_Queue.Refuse();
            } else {
                m_Queue.Put(callback);
            }
            wake = m_Sleeping;
            m_Sleeping = false;
        }
        if (wake) {
            m_Changed.notify_one();
        }
    }

    void Close()
    {
        {
            const std::lock_guard<std::mutex> lock(m_Mutex);
            m_Closed = true;
            m_Queue.LoseAll();
        }
        m_Changed.notify_one();
    }

    bool IsClientThread() const
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        return m_ClientThread == std::this_thread::get_id();
    }

    Counters GetCounters() const
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        return m_Queue.GetCounters();
    }

    /** Delivers on the calling thread, until closed. */
    void Run()
    {
        Callback callback = callbacks::PlayStarted();
        PlaybackStatus status;
        std::unique_lock<std::mutex> lock(m_Mutex);
        m_ClientThread = std::this_thread::get_id();
        while (WaitForWork(lock)) {
            const CallbackQueue::Step step = m_Queue.Take(callback, status);
            lock.unlock();
            if (step == CallbackQueue::StepDeliver) {
                Call(callback);
            } else if (step == CallbackQueue::StepResync) {
                Deliver(status, *this);
            }
            // Releases a program while no lock is held: its destructor is not ours.
            callback = callbacks::PlayStarted();
            lock.lock();
            m_Queue.Finish();
        }
        m_ClientThread = std::thread::id(); // the system may give it to another thread
    }

private:
    /** Whether there is something to take; false once the queue is closed and empty. */
    bool WaitForWork(std::unique_lock<std::mutex>& lock)
    {
        while (m_Queue.IsEmpty() && !m_Closed) {
            m_Sleeping = true;
            m_Changed.wait(lock);
        }
        return !m_Queue.IsEmpty();
    }

    /** Receives the callbacks of a resync. */
    void OnCallback(const Callback& callback) override
    {
        if (!IsClosed()) {
            Call(callback);
        }
    }

    bool IsClosed() const
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        return m_Closed;
    }

    void Call(const Callback& callback)
    {
        try {
            Deliver(callback, m_rClient);
        } catch (...) {
            Assert("bdmv::QueuedListener: the client does not throw", __FILE__, __LINE__);
        }
    }

    INavigatorListener& m_rClient;
    // The kit's other locks are of type bd::ThreadMutex; a condition variable needs std::mutex.
    mutable std::mutex m_Mutex; ///< guards the following; the client is called without it
    std::condition_variable m_Changed;
    CallbackQueue m_Queue;
    bool m_Closed;
    bool m_Sleeping;                ///< whether the thread waits and has not been woken
    std::thread::id m_ClientThread; ///< none before the thread begins and after it has ended
};

QueuedListener::QueuedListener(INavigatorListener& client, Options options)
    : m_pDelivery(std::make_shared<Delivery>(client, options))
{
    const std::shared_ptr<Delivery> delivery = m_pDelivery;
    m_Thread = std::thread([delivery] { delivery->Run(); });
}

QueuedListener::~QueuedListener()
{
    if (m_pDelivery->IsClientThread()) {
        Assert("bdmv::QueuedListener: not destroyed inside a callback of its client", __FILE__,
               __LINE__);
        m_pDelivery->Close();
        m_Thread.detach();
    } else {
        Close();
    }
}

void QueuedListener::Close()
{
    if (m_pDelivery->IsClientThread()) {
        throw std::system_error(std::make_error_code(std::errc::resource_deadlock_would_occur),
                                "bdmv::QueuedListener: closed inside a callback of its client");
    }
    m_pDelivery->Close();
    const bd::Guard<bd::ThreadMutex> guard(m_Joining);
    if (m_Thread.joinable()) {
        m_Thread.join();
    }
}

QueuedListener::Counters QueuedListener::GetCounters() const
{
    return m_pDelivery->GetCounters();
}

void QueuedListener::OnCallback(const Callback& callback)
{
    m_pDelivery->Put(callback);
}

} // namespace bdmv
