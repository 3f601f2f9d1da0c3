/**
 * @file
 * The state of playback in one line, for the screen of a remote control.
 */
#ifndef DESKPLAYER_SESSION_REMOTESTATUS_H
#define DESKPLAYER_SESSION_REMOTESTATUS_H

#include <string>

#include "navigator/deskparts.h"

namespace deskplayer
{

/**
 * The status, play mode, position and chapter, as far as they are known.
 *
 *     playing  00:01:30 of 00:03:02  chapter 2 of 7
 */
std::string PlaybackSummary(DeskParts& desk);

/**
 * The selected streams, the angle and the A-B repeat, as far as there are any; empty while nothing
 * plays.
 *
 *     audio 1 of 3  subtitle off  pip 1 of 2  repeat A-B
 */
std::string SelectionSummary(DeskParts& desk);

} // namespace deskplayer

#endif
