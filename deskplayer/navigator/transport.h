/**
 * @file
 * Playback over time: playing, stepping, jumping and repeating.
 */
#ifndef DESKPLAYER_NAVIGATOR_TRANSPORT_H
#define DESKPLAYER_NAVIGATOR_TRANSPORT_H

#include <cstddef>
#include <optional>

#include "navigator/announcer.h"
#include "navigator/eventsender.h"
#include "navigator/playbackstate.h"
#include "navigator/playhead.h"
#include "navigator/popupmenu.h"
#include "navigator/resumedata.h"
#include "navigator/virtualclock.h"

namespace deskplayer
{

/**
 * Plays, jumps and repeats, and sends the resulting events. The caller checks whether an operation
 * is permitted.
 */
class Transport
{
public:
    /** All parameters must outlive the transport. */
    Transport(VirtualClock& clock, PlaybackState& state, Playhead& playhead, PopUpMenu& menu,
              Announcer& announcer, EventSender& sender)
        : m_rClock(clock), m_rState(state), m_rPlayhead(playhead), m_rMenu(menu),
          m_rAnnouncer(announcer), m_rSender(sender)
    {
    }

    Transport(const Transport&) = delete;
    Transport& operator=(const Transport&) = delete;

    /**
     * The session time until playback changes without an operation; nothing if it waits for an
     * operation or has ended.
     */
    std::optional<Ticks> TimeToNextChange() const;

    /**
     * Advances the clock and playback.
     *
     * @return the part of @p time that was left when playback ended; the clock has not advanced by
     *         it
     */
    Ticks Advance(Ticks time);

    /** Starts at the beginning and announces everything. */
    void Start();

    /** Starts at a resume point, which must lie in the play list. */
    void StartFrom(const ResumePoint& point);

    /** Ends playback on request. */
    void Stop();

    /** Ends playback without a request. */
    void Finish(bdstreaming::FinishedReason reason);

    /** Ends a still and plays the next play item; does nothing outside a still. */
    void LeaveStill();

    /** Sets the play mode and applies it at once. */
    void ChangePlayMode(bd::PlayMode mode);

    /**
     * Moves to the next picture, which may be in another play item, and announces everything passed
     * as playback does. A step that reaches the end of a repeat ends at the start of the repeat.
     * Only if CanStep().
     */
    void Step();

    /** Whether there is another picture in the direction of the step, and no still before it. */
    bool CanStep() const;

    /** Moves to a position and announces everything that differs there. */
    void JumpTo(Ticks position);

    /** Announces that the end of a repeat was reached and jumps to its start. */
    void RepeatFrom(Ticks position);

private:
    void StartFresh();
    void EnterItem();
    void EnterNextItem();
    void AnnounceMarks(std::size_t firstItem);
    void ReachPosition();
    void ReachForward();
    void ReachBackward();
    void ReachTrigger(bd::TriggerType type);
    void ReachEnd();
    void ReachEndOfItem();
    Ticks NextPicture() const;
    bool RepeatsAt(Ticks position) const;
    bool CanLeaveItem() const;

    VirtualClock& m_rClock;
    PlaybackState& m_rState;
    Playhead& m_rPlayhead;
    PopUpMenu& m_rMenu;
    Announcer& m_rAnnouncer;
    EventSender& m_rSender;
};

} // namespace deskplayer

#endif
