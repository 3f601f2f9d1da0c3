/**
 * @file
 * What a viewer does when nobody tells the desk player.
 */
#ifndef DESKPLAYER_SESSION_BUILTINSESSION_H
#define DESKPLAYER_SESSION_BUILTINSESSION_H

#include "navigator/simulatednavigator.h"

namespace deskplayer
{

/**
 * Plays from start to end. A third of the way through it pauses for two seconds, steps once and
 * continues; a still that would never end is left after three seconds.
 *
 * @throw what a listener threw
 */
void PlayBuiltInSession(SimulatedNavigator& navigator, std::uint64_t duration);

} // namespace deskplayer

#endif
