/**
 * @file
 * A play list with all that is needed to play it.
 */
#ifndef DESKPLAYER_NAVIGATOR_LOADEDPLAYLIST_H
#define DESKPLAYER_NAVIGATOR_LOADEDPLAYLIST_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <utility>
#include <vector>

#include "disc/disc.h"
#include "disc/playlist.h"
#include "disc/timeline.h"
#include "text/ticks.h"

namespace deskplayer
{

/** The longest play list that is played. No disc holds so much. */
constexpr Ticks LongestDuration = std::chrono::hours(100);

/** A play list, where its parts lie in time, and what the clips add to it. */
struct LoadedPlayList {
    std::uint32_t number = 0;
    PlayList playList;
    TimeLine timeLine;

    /** Positions of the marks that have one, with their indices, in order of position. */
    std::vector<std::pair<Ticks, std::size_t>> marksByPosition;

    /** The chapters in order of their start, those at the same position of their play items. */
    std::vector<Chapter> chaptersByStart;

    /** Of the first primary video of every play item, as the disc codes it. */
    std::vector<std::optional<std::uint8_t>> aspectRatios;
};

/** Lays out a play list in time. */
LoadedPlayList LayOut(std::uint32_t number, PlayList playList);

/**
 * Completes a play list that was read from @p disc.
 *
 * @throw DiscError clip information that is there cannot be read, or the play list lasts longer
 * than LongestDuration
 */
LoadedPlayList LoadPlayList(const Disc& disc, std::uint32_t number, PlayList playList);

} // namespace deskplayer

#endif
