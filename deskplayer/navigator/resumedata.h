/**
 * @file
 * The block that carries playback across a standby.
 */
#ifndef DESKPLAYER_NAVIGATOR_RESUMEDATA_H
#define DESKPLAYER_NAVIGATOR_RESUMEDATA_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <vector>

#include "navigator/playbackstate.h"

namespace deskplayer
{

/** Where playback stood and how. */
struct ResumePoint {
    bd::PlayListIdDef playList = 0;
    bool playing = false; ///< rather than paused, or stopped
    bd::PlayItemIdDef playItem = 0;
    Ticks position{0}; ///< can be the end of the play item, where the next one starts
    bd::PlayMode playMode;
    StreamSelection selection;
};

/** The block for a resume point: a fixed size, the same bytes on every machine. */
std::vector<bd::UInt8> MakeResumeData(const ResumePoint& point);

/** The resume point in a block; nothing when the block is damaged or is not one. */
std::optional<ResumePoint> ReadResumeData(const std::vector<bd::UInt8>& block);

} // namespace deskplayer

#endif
