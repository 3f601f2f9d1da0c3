/**
 * @file
 * Makes a process multi-threaded.
 */
#ifndef BENCH_PARKEDTHREAD_H
#define BENCH_PARKEDTHREAD_H

#include <condition_variable>
#include <mutex>
#include <thread>

namespace bench
{

/**
 * A thread that does nothing. In a process that has never had a second thread, locking takes about
 * a third of the time, but every player has several threads.
 */
class ParkedThread
{
public:
    ParkedThread()
        : m_Thread([this] {
              std::unique_lock<std::mutex> lock(m_Mutex);
              m_Changed.wait(lock, [this] { return m_Over; });
          })
    {
    }

    ~ParkedThread()
    {
        {
            const std::lock_guard<std::mutex> lock(m_Mutex);
            m_Over = true;
        }
        m_Changed.notify_one();
        m_Thread.join();
    }

    ParkedThread(const ParkedThread&) = delete;
    ParkedThread& operator=(const ParkedThread&) = delete;

private:
    std::mutex m_Mutex;
    std::condition_variable m_Changed;
    bool m_Over = false;
    std::thread m_Thread;
};

} // namespace bench

#endif
