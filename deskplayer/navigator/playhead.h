/**
 * @file
 * The position of playback on the time line of its play list, and the next stop.
 */
#ifndef DESKPLAYER_NAVIGATOR_PLAYHEAD_H
#define DESKPLAYER_NAVIGATOR_PLAYHEAD_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <vector>

#include "navigator/loadedplaylist.h"
#include "navigator/playbackstate.h"

namespace deskplayer
{

/** The time between two reports of the position. */
constexpr Ticks PositionInterval = std::chrono::seconds(1);

/**
 * Arithmetic on the time line: reads the state of playback, and changes its position and play item.
 * Sends no events. Only JumpTo() and Enter() change the play item.
 *
 * Use it on the navigator's thread. The delivering thread may call the queries while the navigator
 * waits for it.
 */
class Playhead
{
public:
    /** @param playList and @p state must outlive the playhead */
    Playhead(const LoadedPlayList& playList, PlaybackState& state)
        : m_rPlayList(playList), m_rState(state)
    {
    }

    Playhead(const Playhead&) = delete;
    Playhead& operator=(const Playhead&) = delete;

    // Queries.

    const LoadedPlayList& LoadedList() const { return m_rPlayList; }

    /** The active play item; null if the play list has none. */
    const PlayItem* CurrentItem() const;

    /** The streams of the active play item; none if there is no play item. */
    const StreamTable& CurrentStreams() const;

    /** The chapter at the position; null before the first, or if there are none. */
    const Chapter* CurrentChapter() const;

    /** The chapter with this number, from 1; null if there is none. */
    const Chapter* FindChapter(std::uint64_t number) const;

    /**
     * The first chapter with a greater number; null if there is none. Chapters without a position,
     * whose marks are outside their play items, are passed over here and in ChapterBefore().
     */
    const Chapter* ChapterAfter(std::uint64_t number) const;

    /** The last chapter with a smaller number; null if there is none. */
    const Chapter* ChapterBefore(std::uint64_t number) const;

    /** The play item at a position: the later one where two meet. */
    std::size_t ItemAt(Ticks position) const;

    Ticks StartOfItem(std::size_t item) const { return m_rPlayList.timeLine.itemStarts[item]; }
    Ticks EndOfItem(std::size_t item) const;

    /**
     * The marks at the position, as indices into the play list and in its order.
     *
     * @param firstItem marks of play items from this one to the active one are returned: a mark at
     *        OUT of an earlier play item has the same position
     */
    std::vector<std::size_t> MarksHere(std::size_t firstItem) const;

    /** Whether playback runs forward; while paused, whether the next step does. */
    bool IsForward() const;

    /** Whether a repeat lies ahead, so that playback never reaches its end. */
    bool IsRepeating() const;

    /** The distance in the direction of play to the next stop, a position where events are due. */
    Ticks DistanceToNextStop() const;

    /** The session time until the next stop at the current speed. */
    Ticks TimeToNextStop() const;

    // Movement.

    /**
     * Moves as far as playback advances in this session time, at most to the next stop. A remainder
     * of less than one tick of the play list is carried over to the next call.
     *
     * @return the distance
     */
    Ticks Pass(Ticks time);

    /** Moves by @p distance in the direction of play. */
    void Move(Ticks distance);

    /** Drops the remainder of Pass(), after a jump or a change of speed. */
    void DropRemainder() { m_SubTickRemainder = 0; }

    /** Moves to a position and its play item. @return whether the play item changed */
    bool JumpTo(Ticks position);

    /** Makes a play item the active one without changing the position. */
    void Enter(std::size_t item);

private:
    Ticks NextStop() const;
    Ticks NextStopForward() const;
    Ticks NextStopBackward() const;

    const LoadedPlayList& m_rPlayList;
    PlaybackState& m_rState;
    Ticks::rep m_SubTickRemainder = 0; ///< in units of 1 / SpeedRatio::passed of a tick
};

} // namespace deskplayer

#endif
