/**
 * @file
 * The contents of a disc as a table.
 *
 *     Index           version 0200, 1 title
 *     First playback  movie object 2, interactive
 *     Top menu        movie object 1, interactive
 *     Title 1         movie object 0, movie, title search permitted
 *
 *     Number  Duration      Items  Chapters  Angles  Streams
 *     00000   00:01:00.018      1         3       1  video: H.264 video, 1080p, 23.976 Hz, 16:9
 *                                                    audio: English: AC-3 audio, stereo, 48 kHz
 *                                                    subtitles: English, French
 */
#ifndef DESKPLAYER_LISTING_LISTING_H
#define DESKPLAYER_LISTING_LISTING_H

#include <cstddef>
#include <cstdint>
#include <ostream>
#include <vector>

#include "disc/disc.h"

namespace deskplayer
{

/**
 * Prints the titles and the play lists of a disc. Only one play list is in memory at a time, and it
 * is written as soon as it is read; @p output is not flushed.
 *
 * Streams may differ between play items. The table shows those of the longest play item and the
 * number of play items with other streams. If the index or a play list cannot be read, a line gives
 * the reason.
 *
 * @param numbers of the play lists, as returned by Disc::PlayListNumbers()
 * @param onFault receives a line for each file that is missing or cannot be read: the index, a play
 *        list, or clip information with the aspect ratio of a stream in the table
 * @return the number of faults
 */
std::size_t ListPlayLists(std::ostream& output, const Disc& disc,
                          const std::vector<std::uint32_t>& numbers,
                          const MessageHandler& onFault = {});

} // namespace deskplayer

#endif
