#include "fieldlog/logtimeline.h"

#include <algorithm>

namespace deskplayer
{

namespace
{

/** Beyond any log: times are no longer told apart, so that they stay within their 64 bits. */
constexpr Ticks LongestLog{std::uint64_t{1} << 56};

constexpr std::int64_t MicrosecondsPerDay = std::int64_t{24} * 3600 * 1000000;

/** The nearest tick. @param microseconds not negative, and less than 2^59 */
Ticks NearestTicks(std::int64_t microseconds)
{
    return Ticks((static_cast<std::uint64_t>(microseconds) * 9 + 100) / 200);
}

/** Without a year, December is followed by January of the same leap year. */
bool IsNewYear(std::int64_t passed)
{
    return passed < -180 * MicrosecondsPerDay;
}

} // namespace

TimeStep LogTimeLine::Advance(const LineTime& time)
{
    Instant next = {time.clock, time.microseconds};
    TimeStep step = TimeStep::Forward;
    if (!m_Last) {
        step = TimeStep::First;
        BeginAt(time.clock == LineClock::Session ? 0 : next.microseconds);
    } else {
        const std::int64_t passed = next.microseconds - m_Last->microseconds;
        const bool isWall =
            time.clock == LineClock::Wall || time.clock == LineClock::WallWithoutYear;
        if (m_Last->clock != time.clock || (isWall && passed > LongestSilence)) {
            step = TimeStep::ClockJump;
            BeginAt(next.microseconds);
        } else if (time.clock == LineClock::WallWithoutYear && IsNewYear(passed)) {
            m_Origin -= 366 * MicrosecondsPerDay;
        } else if (passed < (time.clock == LineClock::Session ? 0 : -LargestDisorder)) {
            step = isWall ? TimeStep::ClockJump : TimeStep::Restart;
            BeginAt(isWall ? next.microseconds : 0);
        } else if (passed < 0) {
            next = *m_Last;
        }
    }
    m_Last = next;
    const Ticks passed = NearestTicks(next.microseconds - m_Origin);
    m_Now = std::min(m_Base + passed, LongestLog);
    return step;
}

void LogTimeLine::BeginAt(std::int64_t microseconds)
{
    m_Base = m_Now;
    m_Origin = microseconds;
}

} // namespace deskplayer
