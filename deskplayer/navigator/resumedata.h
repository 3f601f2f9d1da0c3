/**
 * @file
 * The resume data: a block that preserves playback across a standby.
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

/** Position and settings of playback at a standby. */
struct ResumePoint {
    bd::PlayListIdDef playList = 0;
    bool playing = false; ///< false if paused
    bd::PlayItemIdDef playItem = 0;
    Ticks position{0}; ///< may be the end of the play item, where the next one starts
    bd::PlayMode playMode;
    StreamSelection selection;
};

/** Encodes a resume point. Size and byte order are the same on every machine. */
std::vector<bd::UInt8> MakeResumeData(const ResumePoint& point);

/** Decodes a resume point; nothing if the block is damaged or is not resume data. */
std::optional<ResumePoint> ReadResumeData(const std::vector<bd::UInt8>& block);

} // namespace deskplayer

#endif
