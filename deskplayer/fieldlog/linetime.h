/**
 * @file
 * The time in front of a log line.
 */
#ifndef DESKPLAYER_FIELDLOG_LINETIME_H
#define DESKPLAYER_FIELDLOG_LINETIME_H

#include <cstdint>
#include <optional>
#include <string_view>

namespace deskplayer
{

/** What a time counts from. */
enum class LineClock {
    Wall,            ///< a date and a time of day
    WallWithoutYear, ///< the same, of an unknown year
    Session,         ///< the time of a session, from its start
    Counter          ///< seconds from an unknown start, such as that of the system
};

/** A time as a log line shows it. */
struct LineTime {
    LineClock clock = LineClock::Wall;
    /** In order within a log: from 1970 for a wall clock, from the zero of the others. */
    std::int64_t microseconds = 0;
    bool hasT = false;     ///< whether a `T` separates date and time of day
    std::string_view text; ///< as in the line
};

/**
 * Removes a time from the beginning of @p rest.
 *
 * These forms are read; seconds may have a fraction of any length, after a point or a comma:
 *
 *     2024-05-31 20:15:00.123456           with T instead of the blank; with Z, +02:00 or +0200
 *     May 31 20:15:00                      without a year; also 05-31 20:15:00
 *     00:01:30.500000                      time of a session, which may have more digits of hours
 *     90.5                                 a counter
 *
 * A time without an offset is taken as it is. A time without a year is that of a leap year.
 *
 * @return nothing, and @p rest unchanged, if it does not begin with a time
 */
std::optional<LineTime> TakeLineTime(std::string_view& rest);

} // namespace deskplayer

#endif
