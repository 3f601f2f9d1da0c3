#include "logchannel.h"

#include <utility>

namespace kevro
{

LogChannel::LogChannel(Destination destination)
    : m_Current(
          std::make_unique<Output>(m_Mutex, std::move(destination.sink), destination.queueLines))
{
}

void LogChannel::Write(const LineHead& head, const char* format, va_list args) noexcept
{
    {
        Output::Lock lock(m_Mutex);
        m_Current->Write(lock, head, format, args);
    }
    if (m_Finishing) {
        Flush();
    }
}

void LogChannel::Exchange(Destination next)
{
    auto output = std::make_unique<Output>(m_Mutex, std::move(next.sink), next.queueLines);
    const std::lock_guard<std::mutex> exchange(m_ExchangeMutex);
    std::unique_ptr<Output> drained; // ends its queue's thread after the lock is released
    Output::Lock lock(m_Mutex);
    m_Previous = std::exchange(m_Current, std::move(output));
    m_Previous->Drain(lock);
    m_LostBefore += m_Previous->CountLost(lock);
    drained = std::move(m_Previous);
}

void LogChannel::Flush() noexcept
{
    // An exchange ends by draining the previous output, so waiting for it covers that output, too.
    const std::lock_guard<std::mutex> exchange(m_ExchangeMutex);
    Output::Lock lock(m_Mutex);
    m_Current->Drain(lock);
}

void LogChannel::Finish() noexcept
{
    m_Finishing = true;
    Flush();
}

KEVRO_UInt64 LogChannel::CountLost() noexcept
{
    const Output::Lock lock(m_Mutex);
    return m_LostBefore + m_Current->CountLost(lock) +
           (m_Previous ? m_Previous->CountLost(lock) : 0);
}

} // namespace kevro
