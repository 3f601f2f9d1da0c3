#include "clientkit/callbacktimes.h"

#include <algorithm>

#include "bd/guard.h"

namespace bdmv
{

namespace
{

constexpr std::chrono::seconds BetweenReports(1);

/** The number of binary digits of the time in microseconds, as far as there are places. */
std::size_t PlaceOf(CallbackTimes::Duration time)
{
    const auto microseconds = std::chrono::duration_cast<std::chrono::microseconds>(time).count();
    std::size_t place = 0;
    while (place < TimePlaces - 1 && (microseconds >> place) > 0) {
        ++place;
    }
    return place;
}

} // namespace

// The largest number of microseconds is more than the clock's unit can express.
CallbackTimes::CallbackTimes(std::chrono::microseconds budget)
    : m_Budget(
          std::min(budget, std::chrono::duration_cast<std::chrono::microseconds>(Duration::max()))),
      m_Entries()
{
}

bool CallbackTimes::Add(CallbackId id, Time begin, Time end)
{
    const Duration time = end - begin;
    const std::size_t place = PlaceOf(time);
    const bd::Guard<bd::ThreadMutex> guard(m_Mutex);
    Entry& entry = m_Entries[id];
    ++entry.record.count;
    entry.record.longest = std::max(entry.record.longest, time);
    entry.record.total += time;
    ++entry.record.histogram[place];
    if (time <= m_Budget || (entry.reported && end - entry.lastReport < BetweenReports)) {
        return false;
    }
    entry.reported = true;
    entry.lastReport = end;
    return true;
}

CallbackTimes::Record CallbackTimes::Get(CallbackId id) const
{
    if (id < 0 || id >= Callback__sizeof) {
        return Record();
    }
    const bd::Guard<bd::ThreadMutex> guard(m_Mutex);
    return m_Entries[id].record;
}

} // namespace bdmv
