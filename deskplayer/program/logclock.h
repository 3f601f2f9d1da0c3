/**
 * @file
 * The clock of the log lines.
 */
#ifndef DESKPLAYER_PROGRAM_LOGCLOCK_H
#define DESKPLAYER_PROGRAM_LOGCLOCK_H

#include "deskplayer/ticks.h"
#include "kevro_linux.h"
#include "navigator/virtualclock.h"

namespace deskplayer
{

/** Makes log lines carry the time of a session while it exists. Only one may exist at a time. */
class LogClock
{
public:
    /** @param clock must outlive this object */
    explicit LogClock(VirtualClock& clock) { KEVRO_Log_SetClock(MicrosecondsOf, &clock); }
    ~LogClock() { KEVRO_Log_SetClock(nullptr, nullptr); }

    LogClock(const LogClock&) = delete;
    LogClock& operator=(const LogClock&) = delete;

private:
    static KEVRO_UInt64 MicrosecondsOf(void* clock)
    {
        return Microseconds(static_cast<const VirtualClock*>(clock)->Now());
    }
};

} // namespace deskplayer

#endif
