/**
 * @file
 * The speeds of bd::PlaySpeedDef.
 */
#ifndef DESKPLAYER_NAVIGATOR_PLAYSPEED_H
#define DESKPLAYER_NAVIGATOR_PLAYSPEED_H

#include <cstdint>

#include "bd/types.h"

namespace deskplayer
{

/** Playback advances by `played` ticks of the play list in `passed` ticks of the session. */
struct SpeedRatio {
    std::uint64_t played;
    std::uint64_t passed;
};

/**
 * The ratio of a speed.
 *
 * Each slow motion step halves the speed, down to 1/32; fast play is 2, 4, 8, 16, 32, 48, 64, 80,
 * 96, 112, 120 and 128 times normal. Players differ in this; bd::PlaySpeedDef defines only the
 * steps. A value that is not a step plays at normal speed.
 */
SpeedRatio RatioOf(bd::PlaySpeedDef speed);

} // namespace deskplayer

#endif
