/**
 * @file
 * A play list with all that is needed to play it.
 */
#ifndef DESKPLAYER_NAVIGATOR_LOADEDPLAYLIST_H
#define DESKPLAYER_NAVIGATOR_LOADEDPLAYLIST_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "deskplayer/ticks.h"
#include "disc/disc.h"
#include "disc/playlist.h"
#include "disc/timeline.h"

namespace deskplayer
{

/** A play list, its time line, and the aspect ratios from its clips. */
struct LoadedPlayList {
    std::uint32_t number = 0;
    PlayList playList;
    TimeLine timeLine;

    /** Positions and indices of the marks that have a position, in order of position. */
    std::vector<std::pair<Ticks, std::size_t>> marksByPosition;

    /** The chapters in order of their start; at the same position, in order of play item. */
    std::vector<Chapter> chaptersByStart;

    /** The aspect ratio code of the first primary video stream of every play item. */
    std::vector<std::optional<std::uint8_t>> aspectRatios;

    /** One line for each clip whose information exists but cannot be read. */
    std::vector<std::string> notes;
};

/** Adds the time line to a play list. */
LoadedPlayList LayOut(std::uint32_t number, PlayList playList);

/**
 * Adds time line and aspect ratios to a play list that was read from @p disc. Clip information that
 * is missing or cannot be read does not stop playback: the aspect ratio is then unknown.
 *
 * @throw FileError the play list is longer than LongestDuration
 */
LoadedPlayList LoadPlayList(const Disc& disc, std::uint32_t number, PlayList playList);

} // namespace deskplayer

#endif
