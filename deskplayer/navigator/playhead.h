/**
 * @file
 * Where playback is on the time line of its play list, and what lies ahead.
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

/**
 * Arithmetic on the time line: reads the state of playback, and changes its position and play item.
 * It sends no events, and never leaves the play item except through Enter().
 *
 * Belongs to the navigator's thread; the queries may be made by the delivering thread as long as
 * the navigator waits for it.
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

    /** The streams of the active play item; none while there is no play item. */
    const StreamTable& CurrentStreams() const;

    /** The chapter at the position; null before the first, or when there is none. */
    const Chapter* CurrentChapter() const;

    /** The chapter with this number, which counts from 1; null if there is none. */
    const Chapter* FindChapter(std::uint64_t number) const;

    /** The play item that a position belongs to: the later one where two meet. */
    std::size_t ItemAt(Ticks position) const;

    Ticks StartOfItem(std::size_t item) const { return m_rPlayList.timeLine.itemStarts[item]; }
    Ticks EndOfItem(std::size_t item) const;

    /**
     * The marks at the position, as indices into the play list and in its order.
     *
     * @param firstItem the first play item whose marks count, up to the active one: a mark at OUT
     *        of an earlier play item lies at the same position
     */
    std::vector<std::size_t> MarksHere(std::size_t firstItem) const;

    /** The direction of play; while paused, that of the next step. */
    bool IsForward() const;

    /** Whether a repeat lies ahead, so that playback never ends by itself. */
    bool IsRepeating() const;

    /** How far it is to the next position at which something happens, in the direction of play. */
    Ticks DistanceToNextStop() const;

    /** How long playback takes to the next stop at its current speed, in time of the session. */
    Ticks TimeToNextStop() const;

    // Movement.

    /**
     * Moves as far as playback gets in this time of the session, at most to the next stop.
     *
     * What is too short to be a tick of the play list counts for the next call.
     *
     * @return the distance
     */
    Ticks Pass(Ticks time);

    /** Moves by @p distance in the direction of play. */
    void Move(Ticks distance);

    /** Forgets the time that did not add up to a tick: after a jump or a change of speed. */
    void DropRemainder() { m_SubTickRemainder = 0; }

    /** Moves to a position and to the play item there. @return whether that is another one */
    bool JumpTo(Ticks position);

    /** Makes a play item the active one; the position stays. */
    void Enter(std::size_t item);

private:
    Ticks NextStop() const;
    Ticks NextStopForward() const;
    Ticks NextStopBackward() const;

    const LoadedPlayList& m_rPlayList;
    PlaybackState& m_rState;
    Ticks::rep m_SubTickRemainder = 0; ///< in parts of a tick, as the speed divides it
};

} // namespace deskplayer

#endif
