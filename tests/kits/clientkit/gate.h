/**
 * @file
 * Holds a client in its callbacks until a test lets it continue.
 */
#ifndef KITS_CLIENTKIT_GATE_H
#define KITS_CLIENTKIT_GATE_H

#include <condition_variable>
#include <cstddef>
#include <mutex>

namespace bdmvtest
{

/** Counts those who arrive, and lets as many pass as it is told to. Closed at first. */
class Gate
{
public:
    /** Arrives, and waits to pass. */
    void Pass()
    {
        std::unique_lock<std::mutex> lock(m_Mutex);
        ++m_Arrived;
        m_Changed.notify_all();
        m_Changed.wait(lock, [this] { return m_Open || m_Passed < m_Allowed; });
        ++m_Passed;
    }

    /** Waits until this many have arrived since construction. */
    void WaitForArrivals(std::size_t count)
    {
        std::unique_lock<std::mutex> lock(m_Mutex);
        m_Changed.wait(lock, [&] { return m_Arrived >= count; });
    }

    /** Whether more have arrived than may pass. */
    bool IsWaiting()
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        return !m_Open && m_Arrived > m_Allowed;
    }

    /** Lets one more pass. */
    void AllowOne()
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        ++m_Allowed;
        m_Changed.notify_all();
    }

    /** Lets all pass, from now on. */
    void Open()
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        m_Open = true;
        m_Changed.notify_all();
    }

private:
    std::mutex m_Mutex;
    std::condition_variable m_Changed;
    std::size_t m_Arrived = 0;
    std::size_t m_Allowed = 0;
    std::size_t m_Passed = 0;
    bool m_Open = false;
};

} // namespace bdmvtest

#endif
