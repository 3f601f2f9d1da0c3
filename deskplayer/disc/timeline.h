/**
 * @file
 * Where play items, marks and chapters are on the time line of their play list.
 */
#ifndef DESKPLAYER_DISC_TIMELINE_H
#define DESKPLAYER_DISC_TIMELINE_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <vector>

#include "disc/playlist.h"

namespace deskplayer
{

/** The stretch from a mark of type entry to the next. */
struct Chapter {
    std::size_t number = 0;   ///< from 1; see TimeLine::chapters
    std::size_t mark = 0;     ///< index of its mark
    std::size_t playItem = 0; ///< of its mark
    std::uint64_t start = 0;
    std::uint64_t end = 0; ///< not before start
};

/**
 * Positions in ticks of 45 kHz from the start of the play list. They make sense if the play items
 * play in sequence.
 */
struct TimeLine {
    std::uint64_t duration = 0;
    std::vector<std::uint64_t> itemStarts;

    /**
     * One for each mark; nothing for a mark whose play item is not there, or that is before IN or
     * after OUT of its play item.
     */
    std::vector<std::optional<std::uint64_t>> markPositions;

    /**
     * In the order of their marks. A mark of type entry that has no position is no chapter here,
     * but takes a chapter number, so that the numbers stay those the disc was made with.
     */
    std::vector<Chapter> chapters;
};

/** Lays out @p playList. Takes time proportional to the number of play items and marks. */
TimeLine BuildTimeLine(const PlayList& playList);

} // namespace deskplayer

#endif
