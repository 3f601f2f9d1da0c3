/**
 * @file
 * What is on a disc, as a table.
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
 * Prints the titles and the play lists of a disc. One play list is held at a time, and written as
 * soon as it is read; nobody flushes @p output.
 *
 * Streams can differ from play item to play item. Shown are those of the longest one, and how many
 * have others. Where the index or a play list cannot be read, a line says why.
 *
 * @param numbers of the play lists, as Disc::PlayListNumbers() gives them
 * @return how many play lists cannot be read
 */
std::size_t ListPlayLists(std::ostream& output, const Disc& disc,
                          const std::vector<std::uint32_t>& numbers);

} // namespace deskplayer

#endif
