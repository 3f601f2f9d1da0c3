/**
 * @file
 * Playback types that the program does not simulate.
 */
#ifndef DESKPLAYER_PROGRAM_PLAYBACKTYPE_H
#define DESKPLAYER_PROGRAM_PLAYBACKTYPE_H

#include <cstdint>
#include <string>

#include "navigator/loadedplaylist.h"
#include "program/failure.h"

namespace deskplayer
{

/** Writes a message if a player would not play the play items in sequence, as the program does. */
inline void ReportPlaybackType(const LoadedPlayList& playList)
{
    const std::uint8_t type = playList.playList.applicationInfo.playbackType;
    if (type == PlaybackTypeRandom || type == PlaybackTypeShuffle) {
        PrintMessage("play list " + std::to_string(playList.number) + ": the playback type is " +
                     (type == PlaybackTypeRandom ? "random" : "shuffle") +
                     "; its play items are played in sequence");
    }
}

} // namespace deskplayer

#endif
