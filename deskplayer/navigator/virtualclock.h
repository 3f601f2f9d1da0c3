/**
 * @file
 * The time of a session.
 */
#ifndef DESKPLAYER_NAVIGATOR_VIRTUALCLOCK_H
#define DESKPLAYER_NAVIGATOR_VIRTUALCLOCK_H

#include <atomic>
#include <cstdint>

namespace deskplayer
{

/**
 * Counts ticks of 45 kHz since the session began; stands still but for Advance().
 *
 * The navigator's thread moves it, any thread reads it.
 */
class VirtualClock
{
public:
    std::uint64_t Now() const { return m_Now; }
    void Advance(std::uint64_t ticks) { m_Now += ticks; }

private:
    std::atomic<std::uint64_t> m_Now{0};
};

} // namespace deskplayer

#endif
