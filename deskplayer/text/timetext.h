/**
 * @file
 * Times for people to read.
 */
#ifndef DESKPLAYER_TEXT_TIMETEXT_H
#define DESKPLAYER_TEXT_TIMETEXT_H

#include <string>

#include "deskplayer/ticks.h"

namespace deskplayer
{

/**
 * Hours, minutes, seconds and milliseconds, "01:23:45.678". Fractions of a millisecond are dropped.
 */
std::string TimeText(Ticks time);

} // namespace deskplayer

#endif
