/**
 * @file
 * The times of a log on one time line.
 */
#ifndef DESKPLAYER_FIELDLOG_LOGTIMELINE_H
#define DESKPLAYER_FIELDLOG_LOGTIMELINE_H

#include <cstdint>
#include <optional>

#include "deskplayer/ticks.h"
#include "fieldlog/linetime.h"

namespace deskplayer
{

/** What the time of a line reveals. */
enum class TimeStep {
    First,    ///< it is the first one
    Forward,  ///< time has passed, or none has
    Restart,  ///< the clock began anew: that of a session, or a counter
    ClockJump ///< the wall clock was set, or the log has lines with times of different kinds
};

/**
 * Converts times of lines to ticks since the first one, or since the start of the session if they
 * are times of a session. Time never decreases: after a restart or a jump it continues where it
 * was.
 */
class LogTimeLine
{
public:
    /** A wall clock that advances by more between two lines has been set. */
    static constexpr std::int64_t LongestSilence = std::int64_t{24} * 3600 * 1000000;

    /**
     * A line may be older than the one before by as much: threads write at the same time. The time
     * of a session advances on one thread only.
     */
    static constexpr std::int64_t LargestDisorder = 1000000;

    TimeStep Advance(const LineTime& time);

    bool HasBegun() const { return m_Last.has_value(); }

    /** The clock of the last line. Only if HasBegun(). */
    LineClock Clock() const { return m_Last->clock; }

    /** The time of the last line; 0 before the first. */
    Ticks Now() const { return m_Now; }

private:
    struct Instant {
        LineClock clock;
        std::int64_t microseconds;
    };

    void BeginAt(std::int64_t microseconds);

    std::optional<Instant> m_Last;
    std::int64_t m_Origin = 0; ///< where microseconds have passed since m_Base
    Ticks m_Base{0};
    Ticks m_Now{0};
};

} // namespace deskplayer

#endif
