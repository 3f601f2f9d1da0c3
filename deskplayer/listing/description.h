/**
 * @file
 * A play list in full, as text.
 *
 * A line is a label and named values; what belongs to it follows, indented by two more blanks. A
 * value stands as it is in the file, with its meaning behind it.
 *
 *     play item 0: clip 00001, codec M2TS, STC sequence 0, connection condition 1 (not seamless)
 *       time: IN 27000000 (00:10:00.000), OUT 29700823 (00:11:00.018), ...
 *       primary audio 1: entry type 1 (play item), PID 0x1100, coding type 0x81 (AC-3 audio), ...
 *
 * Streams, chapters and angles are numbered as the viewer numbers them, from 1, everything else as
 * in the file, from 0. A value that is not there is "none".
 */
#ifndef DESKPLAYER_LISTING_DESCRIPTION_H
#define DESKPLAYER_LISTING_DESCRIPTION_H

#include <cstdint>
#include <ostream>

#include "disc/disc.h"

namespace deskplayer
{

/**
 * Prints everything that a play list says, where its parts lie in time, and the aspect ratios that
 * the clip information adds. Lines are written as they are made; nobody flushes @p output.
 *
 * Clip information that cannot be read is told in the place of the aspect ratio.
 *
 * @param playList the one with this @p number, read from @p disc
 */
void DescribePlayList(std::ostream& output, const Disc& disc, std::uint32_t number,
                      const PlayList& playList);

} // namespace deskplayer

#endif
