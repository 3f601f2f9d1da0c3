/**
 * @file
 * Times as a person reads them.
 */
#ifndef DESKPLAYER_OUTPUT_TIMETEXT_H
#define DESKPLAYER_OUTPUT_TIMETEXT_H

#include <cstdint>
#include <string>

namespace deskplayer
{

/**
 * Hours, minutes, seconds and milliseconds, "01:23:45.678".
 *
 * @param ticks ticks of 45 kHz; parts of a millisecond are dropped
 */
std::string TimeText(std::uint64_t ticks);

} // namespace deskplayer

#endif
