/**
 * @file
 * Playback as time passes, and every way it moves.
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
 * Plays, jumps and repeats, and sends the events on the way. It does what it is told: whether an
 * operation is permitted is checked by its caller.
 */
class Transport
{
public:
    /** All must outlive the transport. */
    Transport(VirtualClock& clock, PlaybackState& state, Playhead& playhead, PopUpMenu& menu,
              Announcer& announcer, EventSender& sender)
        : m_rClock(clock), m_rState(state), m_rPlayhead(playhead), m_rMenu(menu),
          m_rAnnouncer(announcer), m_rSender(sender)
    {
    }

    Transport(const Transport&) = delete;
    Transport& operator=(const Transport&) = delete;

    /**
     * The time of the session until playback changes by itself; nothing when it waits for an
     * operation, or has ended.
     */
    std::optional<Ticks> TimeToNextChange() const;

    /**
     * Lets time pass, and playback with it.
     *
     * @return how much of @p time was left when playback ended; the clock has not passed it
     */
    Ticks Advance(Ticks time);

    /** Starts at the beginning, with everything announced. */
    void Start();

    /** Starts where a resume point says, which lies in the play list. */
    void StartFrom(const ResumePoint& point);

    /** Ends playback on request. */
    void Stop();

    /** Ends playback by itself. */
    void Finish(bdstreaming::FinishedReason reason);

    /** Ends a still and plays the next play item; does nothing outside of a still. */
    void LeaveStill();

    /** Sets the play mode and applies it at once. */
    void ChangePlayMode(bd::PlayMode mode);

    /**
     * Moves by one picture and announces what lies on the way. A repeat ends the step at its start.
     */
    void Step();

    /** Whether there is another picture of the play item in the direction of the step. */
    bool CanStep() const;

    /** Moves to a position and announces all that is different there. */
    void JumpTo(Ticks position);

    /** Jumps in a repeat, after announcing that its end was reached. */
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

    VirtualClock& m_rClock;
    PlaybackState& m_rState;
    Playhead& m_rPlayhead;
    PopUpMenu& m_rMenu;
    Announcer& m_rAnnouncer;
    EventSender& m_rSender;
};

} // namespace deskplayer

#endif
