/**
 * @file
 * What the listing shows of a play list with many parts.
 */
#ifndef DESKPLAYER_LISTING_SUMMARY_H
#define DESKPLAYER_LISTING_SUMMARY_H

#include <cstddef>
#include <functional>
#include <string>
#include <vector>

#include "disc/playlist.h"

namespace deskplayer
{

using Lines = std::vector<std::string>;

/** Describes the aspect ratio of a video stream. */
using AspectText = std::function<std::string(const Stream&)>;

/** The streams, one or more to a line. */
Lines StreamLines(const StreamTable& streams, const AspectText& aspectText);

/** The index of the longest play item; 0 if there is none. */
std::size_t LongestItem(const PlayList& playList);

/** The number of play items whose streams StreamLines() shows otherwise than those of @p item. */
std::size_t ItemsWithOtherStreams(const PlayList& playList, std::size_t item);

/** The greatest number of angles of a play item; 0 if there is none. */
std::size_t MostAngles(const PlayList& playList);

} // namespace deskplayer

#endif
