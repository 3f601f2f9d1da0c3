/**
 * @file
 * A play list with all that is needed to play it.
 */
#ifndef DESKPLAYER_NAVIGATOR_LOADEDPLAYLIST_H
#define DESKPLAYER_NAVIGATOR_LOADEDPLAYLIST_H

#include <cstdint>
#include <optional>
#include <vector>

#include "disc/disc.h"
#include "disc/playlist.h"
#include "disc/timeline.h"

namespace deskplayer
{

/** A play list, where its parts lie in time, and what the clips add to it. */
struct LoadedPlayList {
    std::uint32_t number = 0;
    PlayList playList;
    TimeLine timeLine;

    /** Of the first primary video of every play item, as the disc codes it. */
    std::vector<std::optional<std::uint8_t>> aspectRatios;
};

/**
 * Completes a play list that was read from @p disc.
 *
 * @throw DiscError clip information that is there cannot be read
 */
LoadedPlayList LoadPlayList(const Disc& disc, std::uint32_t number, PlayList playList);

} // namespace deskplayer

#endif
