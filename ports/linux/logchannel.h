/**
 * @file
 * The one way of all lines: through the output in force, also while it is exchanged.
 */
#ifndef KEVRO_LOGCHANNEL_H
#define KEVRO_LOGCHANNEL_H

#include <atomic>
#include <cstddef>
#include <memory>
#include <mutex>

#include <spdlog/sinks/sink.h>

#include "logoutput.h"

namespace kevro
{

/** Where lines go. */
struct Destination {
    std::unique_ptr<spdlog::sinks::sink> sink;
    std::size_t queueLines; ///< lines that may wait for it; 0 writes each directly
};

/** All operations may be called from several threads at once. */
class LogChannel
{
public:
    explicit LogChannel(Destination destination);

    LogChannel(const LogChannel&) = delete;
    LogChannel& operator=(const LogChannel&) = delete;

    void Write(const LogLine& line) noexcept;

    /** Counts a line that was lost on its way here. */
    void AddLost() noexcept;

    /** Sends the lines from now on to @p next; returns when the output before has written all. */
    void Exchange(Destination next);

    /** Waits until every line written before is out. */
    void Flush() noexcept;

    /** Flushes now and after every line from now on: nobody will do it later. */
    void Finish() noexcept;

    KEVRO_UInt64 CountLost() noexcept;

private:
    std::mutex m_ExchangeMutex; ///< one exchange or flush at a time; taken before m_Mutex
    std::mutex m_Mutex;         ///< never held while anything is written
    std::unique_ptr<Output> m_Current;
    std::unique_ptr<Output> m_Leaving; ///< null, or what an exchange is waiting for
    KEVRO_UInt64 m_LostBefore = 0;     ///< by outputs that are gone
    std::atomic<bool> m_Finishing{false};
};

/** The channel of the process, made when it is first asked for and never destroyed. */
LogChannel& TheLogChannel();

} // namespace kevro

#endif
