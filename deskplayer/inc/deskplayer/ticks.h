/**
 * @file
 * The unit of time of a disc.
 */
#ifndef DESKPLAYER_INC_DESKPLAYER_TICKS_H
#define DESKPLAYER_INC_DESKPLAYER_TICKS_H

#include <chrono>
#include <cstdint>
#include <ratio>

namespace deskplayer
{

/** Ticks per second of the times on a disc. */
constexpr std::uint32_t TicksPerSecond = 45000;

/**
 * A duration, or a position as its distance from the start of a play list or session, in
 * 45 kHz ticks. Whole seconds and milliseconds convert implicitly.
 */
using Ticks = std::chrono::duration<std::uint64_t, std::ratio<1, TicksPerSecond>>;

/** The nearest whole number of microseconds, which is different for every tick. */
constexpr std::uint64_t Microseconds(Ticks time)
{
    return (time.count() * 200 + 4) / 9;
}

} // namespace deskplayer

#endif
