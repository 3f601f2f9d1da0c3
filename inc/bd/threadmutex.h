/**
 * @file
 * The operating system's mutex.
 */
#ifndef BD_THREADMUTEX_H
#define BD_THREADMUTEX_H

#include <pthread.h>

#include <atomic>
#include <thread>

namespace bd
{

/**
 * A plain mutex of the operating system that knows its owner. Not recursive.
 *
 * A thread that acquires a mutex it already holds gets an exception: it never hangs, and the mutex
 * is unchanged. Both operations are const, so that a lock can be taken through a const reference.
 */
class ThreadMutex
{
public:
    ThreadMutex() : m_Mutex(PTHREAD_MUTEX_INITIALIZER), m_Owner(std::thread::id()) {}

    /** The mutex must be free. */
    ~ThreadMutex() { pthread_mutex_destroy(&m_Mutex); }

    ThreadMutex(const ThreadMutex&) = delete;
    ThreadMutex& operator=(const ThreadMutex&) = delete;

    /**
     * Waits until the mutex is free and takes it.
     *
     * @throw std::system_error std::errc::resource_deadlock_would_occur when the calling thread
     *        holds the mutex already; otherwise the operating system's error code. The mutex is
     *        then unchanged.
     */
    void Acquire() const
    {
        const std::thread::id self = std::this_thread::get_id();
        // Another thread's id may be stale when read here; the calling thread's own never is.
        if (m_Owner.load(std::memory_order_relaxed) == self) {
            ThrowHeldAlready();
        }
        const int error = pthread_mutex_lock(&m_Mutex);
        if (error != 0) {
            ThrowRefused(error);
        }
        m_Owner.store(self, std::memory_order_relaxed);
    }

    /**
     * Frees the mutex. Never throws: a call by a thread that does not hold the mutex, and an error
     * of the operating system, are reported through Assert() and leave the mutex unchanged.
     */
    void Release() const
    {
        const std::thread::id self = std::this_thread::get_id();
        if (m_Owner.load(std::memory_order_relaxed) != self) {
            ReportNotHeld();
            return;
        }
        m_Owner.store(std::thread::id(), std::memory_order_relaxed);
        if (pthread_mutex_unlock(&m_Mutex) != 0) {
            m_Owner.store(self, std::memory_order_relaxed);
            ReportNotReleased();
        }
    }

private:
    // The error paths are out of line, so that the inlined common path stays short.
    [[noreturn]] static void ThrowHeldAlready();
    [[noreturn]] static void ThrowRefused(int error);
    static void ReportNotHeld();
    static void ReportNotReleased();

    mutable pthread_mutex_t m_Mutex;
    mutable std::atomic<std::thread::id> m_Owner; ///< no thread while the mutex is free
};

} // namespace bd

#endif
