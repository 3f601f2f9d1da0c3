/**
 * @file
 * The one way of all lines: through the output in force, also while it is exchanged.
 */
#ifndef KEVRO_LOGCHANNEL_H
#define KEVRO_LOGCHANNEL_H

#include <atomic>
#include <condition_variable>
#include <memory>
#include <mutex>
#include <string_view>

#include "kevro/kevro_types.h"
#include "logoutput.h"

namespace kevro
{

/** All operations may be called from several threads at once. */
class LogChannel
{
public:
    explicit LogChannel(std::unique_ptr<Output> output);

    LogChannel(const LogChannel&) = delete;
    LogChannel& operator=(const LogChannel&) = delete;

    void Write(spdlog::level::level_enum level, std::string_view line) noexcept;

    /** Counts a line that was lost on its way here. */
    void AddLost() noexcept;

    /** Sends the lines from now on to @p next; returns when the output before has written all. */
    void Exchange(std::unique_ptr<Output> next);

    /** Waits until every line written before is out. */
    void Flush() noexcept;

    /** Flushes now and after every line from now on: nobody will do it later. */
    void Finish() noexcept;

    KEVRO_UInt64 CountLost() noexcept;

private:
    struct Place {
        std::unique_ptr<Output> output;
        unsigned users; ///< threads that are writing a line to it
    };

    /** Keeps the output in force from being taken away while a thread writes to it. */
    class Use;

    std::mutex m_ExchangeMutex; ///< one exchange or flush at a time; taken before m_PlaceMutex
    std::mutex m_PlaceMutex;    ///< never held while anything is written
    std::condition_variable m_PlaceLeft;
    std::unique_ptr<Place> m_Current;
    std::unique_ptr<Place> m_Leaving; ///< null, or what an exchange is waiting for
    KEVRO_UInt64 m_LostBefore = 0;    ///< by outputs that are gone
    std::atomic<bool> m_Finishing{false};
};

/** The channel of the process, made when it is first asked for and never destroyed. */
LogChannel& TheLogChannel();

} // namespace kevro

#endif
