/**
 * @file
 * Positions of play items, marks and chapters on the time line of their play list.
 */
#ifndef DESKPLAYER_DISC_TIMELINE_H
#define DESKPLAYER_DISC_TIMELINE_H

#include <chrono>
#include <cstddef>
#include <optional>
#include <vector>

#include "deskplayer/ticks.h"
#include "disc/playlist.h"

namespace deskplayer
{

/** The part from an entry mark to the next. */
struct Chapter {
    std::size_t number = 0;   ///< from 1; see TimeLine::chapters
    std::size_t mark = 0;     ///< index of its mark
    std::size_t playItem = 0; ///< of its mark
    Ticks start{0};
    Ticks end{0}; ///< not before start
};

/**
 * Positions from the start of the play list, valid if the play items are played in sequence.
 */
struct TimeLine {
    Ticks duration{0};
    std::vector<Ticks> itemStarts;

    /**
     * One for each mark; nothing for a mark whose play item is missing, or that is before IN or
     * after OUT of its play item.
     */
    std::vector<std::optional<Ticks>> markPositions;

    /**
     * In the order of their marks. An entry mark without a position has no chapter here, but uses
     * up a chapter number, so that the numbers are those the disc was authored with.
     */
    std::vector<Chapter> chapters;
};

/** The longest play list that is played. No disc has one as long. */
constexpr Ticks LongestDuration = std::chrono::hours(100);

/** Lays out @p playList. Takes time proportional to the number of play items and marks. */
TimeLine BuildTimeLine(const PlayList& playList);

} // namespace deskplayer

#endif
