/**
 * @file
 * The path every line takes, even while the sink is swapped.
 */
#ifndef KEVRO_LOGCHANNEL_H
#define KEVRO_LOGCHANNEL_H

#include <atomic>
#include <cstdarg>
#include <cstddef>
#include <memory>
#include <mutex>

#include <spdlog/sinks/sink.h>

#include "bd/macros.h"
#include "logoutput.h"

namespace kevro
{

/** A sink and its queue. */
struct Destination {
    std::unique_ptr<spdlog::sinks::sink> sink;
    std::size_t queueLines; ///< lines that may wait for the sink; 0 writes each directly
};

/** All operations may be called from several threads at once. */
class LogChannel
{
public:
    explicit LogChannel(Destination destination);

    LogChannel(const LogChannel&) = delete;
    LogChannel& operator=(const LogChannel&) = delete;

    /** Writes or queues a line of which @p format and @p args make the text. */
    BD_PRINTF_FORMAT(3, 0)
    void Write(const LineHead& head, const char* format, va_list args) noexcept;

    /** Sends later lines to @p next; returns after the previous output has written its lines. */
    void Exchange(Destination next);

    /** Waits until every earlier line is written or lost. */
    void Flush() noexcept;

    /** Flushes now and after every later line, since no other flush follows. */
    void Finish() noexcept;

    KEVRO_UInt64 CountLost() noexcept;

private:
    std::mutex m_ExchangeMutex; ///< one exchange or flush at a time; taken before m_Mutex
    std::mutex m_Mutex;         ///< never held while a line is written
    std::unique_ptr<Output> m_Current;
    std::unique_ptr<Output> m_Previous; ///< null, or the output that an exchange is draining
    KEVRO_UInt64 m_LostBefore = 0;      ///< lines lost by earlier outputs
    std::atomic<bool> m_Finishing{false};
};

/** The channel of the process, created on first use and never destroyed. */
LogChannel& TheLogChannel();

} // namespace kevro

#endif
