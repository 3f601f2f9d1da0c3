/**
 * @file
 * The time of a session.
 */
#ifndef DESKPLAYER_NAVIGATOR_VIRTUALCLOCK_H
#define DESKPLAYER_NAVIGATOR_VIRTUALCLOCK_H

#include <atomic>

#include "deskplayer/ticks.h"

namespace deskplayer
{

/**
 * The time since the session began. Only the navigator's thread may advance it; any thread may read
 * it.
 */
class VirtualClock
{
public:
    Ticks Now() const { return Ticks(m_Now); }
    void Advance(Ticks time) { m_Now += time.count(); }

private:
    std::atomic<Ticks::rep> m_Now{0};
};

} // namespace deskplayer

#endif
