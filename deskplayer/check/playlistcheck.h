/**
 * @file
 * Checks what a play list refers to.
 */
#ifndef DESKPLAYER_CHECK_PLAYLISTCHECK_H
#define DESKPLAYER_CHECK_PLAYLISTCHECK_H

#include <string>

#include "check/clips.h"
#include "check/fault.h"
#include "disc/playlist.h"

namespace deskplayer
{

/**
 * Checks that everything exists that the play list refers to: clips, their STC sequences and
 * streams, sub paths, play items, other streams; and that times are within what they refer to.
 *
 * Clips that exist but cannot be read are not checked any further.
 *
 * @param file its name, for faults
 */
void CheckPlayList(const PlayList& playList, const std::string& file, const Clips& clips,
                   const FaultHandler& onFault);

} // namespace deskplayer

#endif
