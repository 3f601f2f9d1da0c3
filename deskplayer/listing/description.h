/**
 * @file
 * The full contents of a play list as text.
 *
 * A line is a label and named values; its parts follow, indented by two more blanks. A value is
 * printed as it is in the file, with its meaning after it.
 *
 *     play item 0: clip 00001, codec M2TS, STC sequence 0, connection condition 1 (not seamless)
 *       time: IN 27000000 (00:10:00.000), OUT 29700823 (00:11:00.018), ...
 *       primary audio 1: entry type 1 (play item), PID 0x1100, coding type 0x81 (AC-3 audio), ...
 *
 * Streams, chapters and angles are numbered from 1, as a viewer sees them, and everything else from
 * 0, as in the file. A missing value is "none".
 */
#ifndef DESKPLAYER_LISTING_DESCRIPTION_H
#define DESKPLAYER_LISTING_DESCRIPTION_H

#include <cstddef>
#include <cstdint>
#include <ostream>

#include "disc/disc.h"

namespace deskplayer
{

/**
 * Prints the contents of a play list, the positions of its parts on the time line, and the aspect
 * ratios from the clip information. Lines are written one by one; @p output is not flushed.
 *
 * If clip information cannot be read, the reason is printed in place of the aspect ratio.
 *
 * @param playList the one with this @p number, read from @p disc
 * @param onFault receives a line for each clip information that is missing or cannot be read
 * @return the number of faults
 */
std::size_t DescribePlayList(std::ostream& output, const Disc& disc, std::uint32_t number,
                             const PlayList& playList, const MessageHandler& onFault = {});

} // namespace deskplayer

#endif
