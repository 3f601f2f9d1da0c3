/**
 * @file
 * How fast the steps of bd::PlaySpeedDef are.
 */
#ifndef DESKPLAYER_NAVIGATOR_PLAYSPEED_H
#define DESKPLAYER_NAVIGATOR_PLAYSPEED_H

#include <cstdint>

#include "bd/types.h"

namespace deskplayer
{

/** So many ticks of the play list pass in so many ticks of the session. */
struct SpeedRatio {
    std::uint64_t played;
    std::uint64_t passed;
};

/**
 * The ratio of a speed.
 *
 * Slow motion halves from step to step, down to a thirty-second; fast play is 2, 4, 8, 16, 32, 48,
 * 64, 80, 96, 112, 120 and 128 times normal. Players differ in this; a navigator knows the steps
 * only. A value that is no step plays at normal speed.
 */
SpeedRatio RatioOf(bd::PlaySpeedDef speed);

} // namespace deskplayer

#endif
