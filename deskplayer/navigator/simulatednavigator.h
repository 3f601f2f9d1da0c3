/**
 * @file
 * A navigator that plays a play list without a stream.
 */
#ifndef DESKPLAYER_NAVIGATOR_SIMULATEDNAVIGATOR_H
#define DESKPLAYER_NAVIGATOR_SIMULATEDNAVIGATOR_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <vector>

#include "navigator/announcer.h"
#include "navigator/eventdelivery.h"
#include "navigator/eventsender.h"
#include "navigator/outcome.h"
#include "navigator/permission.h"
#include "navigator/playbackcontext.h"
#include "navigator/playhead.h"
#include "navigator/popupmenu.h"
#include "navigator/transport.h"
#include "navigator/virtualclock.h"

namespace deskplayer
{

/**
 * Plays a play list on a virtual clock and sends the events that a navigator would.
 *
 * User operations say what became of them. One that the mask in force forbids, or that makes no
 * sense at that moment, is refused: it sends no event and changes nothing.
 *
 * Every event has been delivered when an operation returns, with the values of its moment. All
 * operations belong to one thread. They throw what a listener threw.
 *
 * Positions are on the time line of the play list. Play items are played in sequence, whatever
 * playback type the play list asks for.
 */
class SimulatedNavigator
{
public:
    /** @param clock and @p delivery must outlive the navigator */
    SimulatedNavigator(LoadedPlayList playList, VirtualClock& clock, EventDelivery& delivery);

    SimulatedNavigator(const SimulatedNavigator&) = delete;
    SimulatedNavigator& operator=(const SimulatedNavigator&) = delete;

    // State.

    Status CurrentStatus() const { return m_State.status; }

    /** Answers the queries of events, and those of a viewer: what plays, which streams, where. */
    PlaybackContext& Context() { return m_Context; }

    /** Whether playback repeats, so that it never ends by itself. */
    bool IsRepeating() const { return m_Playhead.IsRepeating(); }

    // Time.

    /** @copydoc Transport::TimeToNextChange() */
    std::optional<Ticks> TimeToNextChange() const { return m_Transport.TimeToNextChange(); }

    /** @copydoc Transport::Advance() */
    Ticks Advance(Ticks time) { return m_Transport.Advance(time); }

    // Playback.

    /** Starts at the beginning. */
    Outcome Play();
    Outcome Stop();
    Outcome Pause();

    /** Goes on after Pause(), in the play mode that was set last. */
    Outcome Continue();

    /**
     * Shows the next or the previous picture, as the direction says; only while paused. The
     * listeners are told of what lies on the way, and then of the step.
     */
    Outcome Step();

    /** Takes effect at once while playing, with Continue() while paused. */
    Outcome SetPlayMode(bd::PlayMode mode);

    /** Ends a still and goes on with the next play item. */
    Outcome EndStill();

    /** The same, by a program of the disc: no mask forbids it. Does nothing outside of a still. */
    void LeaveStill() { m_Transport.LeaveStill(); }

    /** Holds playback until Resume(), as a title does that calls a menu. */
    Outcome Suspend();
    Outcome Resume();

    // Position.

    Outcome SearchTime(Ticks position);
    Outcome SearchChapter(std::uint64_t number);
    Outcome SkipToNextChapter();

    /** To the start of this chapter, or of the one before within its first three seconds. */
    Outcome SkipToPreviousChapter();

    // Repeat and triggers.

    Outcome SetPointA();

    /** From now on, playback goes from here back to A. Reports a failure when A is not before it.
     */
    Outcome SetPointB();
    Outcome EndABRepeat();
    Outcome RepeatChapter();
    Outcome RepeatTitle();
    Outcome EndChapterTitleRepeat();

    /** Has the listeners told when playback gets to @p position, at most the end. */
    Outcome SetTrigger(Ticks position);

    // Streams.

    Outcome SelectAudio(std::uint64_t number);
    Outcome SelectSubtitle(std::uint64_t number);
    Outcome ShowSubtitles(bool shown);
    Outcome SelectStyle(std::uint64_t number);
    Outcome SelectAngle(std::uint64_t number);
    Outcome SelectSecondaryVideo(std::uint64_t number);
    Outcome ShowSecondaryVideo(bool shown);
    Outcome SelectSecondaryAudio(std::uint64_t number);
    Outcome ShowSecondaryAudio(bool shown);
    Outcome SelectPipSubtitle(std::uint64_t number);
    Outcome PickPipSubtitle(bool pick);

    // The picture.

    Outcome Zoom(const bd::ZOOM_PARAM_Def& zoom);

    // The menu. Its buttons, from 1, each play a chapter from its start.

    Outcome OpenPopUpMenu();
    Outcome ClosePopUpMenu();
    Outcome SelectPreviousButton();
    Outcome SelectNextButton();
    Outcome SelectButton(std::uint64_t number);
    Outcome ActivateButton();
    Outcome SelectAndActivateButton(std::uint64_t number);

    // The system.

    /** Gives the listeners the resume data, and goes to sleep. */
    Outcome GoToStandby();

    /**
     * Comes back from standby, to where playback stood. A still is shown again, in full.
     *
     * @param resumeData what a listener kept of SystemSuspended(); anything else fails
     */
    Outcome WakeUp(const std::vector<bd::UInt8>& resumeData);

    // Failures.

    /** Makes the next Play() fail. */
    void FailNextPlay() { m_PlayFails = true; }

    /** Makes the next Resume() fail. */
    void FailNextResume() { m_ResumeFails = true; }

    Outcome FailPreload();

    /** The stream runs dry: playback ends. */
    Outcome Starve();

private:
    /** Carries out an operation if it is possible. */
    template <typename Action> Outcome Operate(const Outcome& possible, Action action)
    {
        if (possible.IsDone()) {
            action();
        }
        return possible;
    }

    /** The same for an operation that a disc can forbid, which takes precedence as the reason. */
    template <typename Action>
    Outcome Operate(bd::UserOperationMaskDef operation, const Outcome& possible, Action action)
    {
        const Outcome allowed = m_Permission.CheckMask(operation);
        return Operate(allowed.IsDone() ? possible : allowed, action);
    }

    template <typename Number>
    Outcome SelectStream(bd::UserOperationMaskDef operation, std::uint64_t number,
                         std::size_t count, const char* what, Number& selected);
    template <typename Event>
    Outcome Switch(bd::UserOperationMaskDef operation, bool& shown, bool value);
    Outcome JumpToChapter(bd::UserOperationMaskDef operation, std::uint64_t number);
    void SetTriggerType(bd::TriggerType type, bool result);
    Outcome SetChapterTitleRepeat(bd::TriggerType repeat);
    Outcome CheckMenu() const;
    Outcome CheckButton(std::uint64_t number) const;
    void ActivateSelectedButton();
    bool IsInPlayList(const ResumePoint& point) const;

    const LoadedPlayList m_PlayList;
    PlaybackState m_State;
    Playhead m_Playhead{m_PlayList, m_State};
    Permission m_Permission{m_Playhead, m_State};
    PlaybackContext m_Context{m_Playhead, m_State};
    EventSender m_Sender;
    PopUpMenu m_Menu{m_Playhead, m_State, m_Sender};
    Announcer m_Announcer{m_Playhead, m_State, m_Context, m_Sender};
    Transport m_Transport;
    bool m_PlayFails = false;
    bool m_ResumeFails = false;
};

} // namespace deskplayer

#endif
