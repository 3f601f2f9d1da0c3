/**
 * @file
 * A navigator that plays a play list without its streams.
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

/** The picture in the coordinates of zoom rectangles, whatever the format of the video. */
constexpr bd::ZoomRectangleDef WholePicture = {0, 0, 1920, 1080};

/**
 * Plays a play list on a virtual clock and sends the events that a navigator would.
 *
 * User operations return an Outcome. One that the current mask forbids, or that is not possible at
 * that moment, is refused: it sends no event and changes nothing.
 *
 * Every event is delivered with the values of the moment when it is sent, before the operation
 * returns. Call all operations from one thread. They rethrow exceptions of listeners.
 *
 * Positions are on the time line of the play list. Play items are played in sequence, whatever the
 * playback type of the play list.
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

    /** Answers queries about playback, streams and position, for events and for callers. */
    PlaybackContext& Context() { return m_Context; }

    /** The play list and its time line. */
    const LoadedPlayList& LoadedList() const { return m_PlayList; }

    /** @copydoc Playhead::IsRepeating() */
    bool IsRepeating() const { return m_Playhead.IsRepeating(); }

    // Time.

    /** @copydoc Transport::TimeToNextChange() */
    std::optional<Ticks> TimeToNextChange() const { return m_Transport.TimeToNextChange(); }

    /** @copydoc Transport::Advance() */
    Ticks Advance(Ticks time) { return m_Transport.Advance(time); }

    // Playback.

    /** Starts at the beginning of the play list. */
    Outcome Play();
    Outcome Stop();
    Outcome Pause();

    /** Continues after Pause(), in the play mode that was set last. */
    Outcome Continue();

    /**
     * Shows the next picture in the direction of play, which may be in another play item; only
     * while paused. Refused where a still, or the end or start of the play list, comes first.
     * Listeners are notified of everything passed, and then of the step.
     */
    Outcome Step();

    /** Takes effect at once while playing, and with Continue() while paused. */
    Outcome SetPlayMode(bd::PlayMode mode);

    /** Ends a still and continues with the next play item. */
    Outcome EndStill();

    /** The same, on behalf of a disc program: no mask forbids it. Does nothing outside a still. */
    void LeaveStill() { m_Transport.LeaveStill(); }

    /** Suspends playback until Resume(), as a title does when it calls a menu. */
    Outcome Suspend();
    Outcome Resume();

    // Position.

    // A jump into another play item whose random access flag is set is refused. Buttons, repeats
    // and the return from standby are not the viewer's jumps and ignore the flag.

    Outcome SearchTime(Ticks position);
    Outcome SearchChapter(std::uint64_t number);
    Outcome SkipToNextChapter();

    /** Goes to the start of this chapter; within its first three seconds, of the previous one. */
    Outcome SkipToPreviousChapter();

    // Repeat and triggers.

    Outcome SetPointA();

    /** Repeats from A to this position. Reports a failure to listeners unless A is before it. */
    Outcome SetPointB();
    Outcome EndABRepeat();
    Outcome RepeatChapter();
    Outcome RepeatTitle();

    /** Leaves an A-B repeat as it is. */
    Outcome EndChapterTitleRepeat();

    /** Notifies listeners when playback reaches @p position, which may be the end. */
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

    /** Both rectangles must lie within WholePicture and have an area. */
    Outcome Zoom(const bd::ZOOM_PARAM_Def& zoom);

    // The menu. Its buttons, numbered from 1, each play a chapter from its start.

    Outcome OpenPopUpMenu();
    Outcome ClosePopUpMenu();
    Outcome SelectPreviousButton();
    Outcome SelectNextButton();
    Outcome SelectButton(std::uint64_t number);
    Outcome ActivateButton();
    Outcome SelectAndActivateButton(std::uint64_t number);

    // The system.

    /** Sends the system to standby and passes the resume data to the listeners. */
    Outcome GoToStandby();

    /**
     * Wakes up from standby at the position where playback was. A still starts again.
     *
     * @param resumeData the data that SystemSuspended() passed; any other data makes it fail
     */
    Outcome WakeUp(const std::vector<bd::UInt8>& resumeData);

    // Failures.

    /** Makes the next Play() fail. */
    void FailNextPlay() { m_PlayFails = true; }

    /** Makes the next Resume() fail. */
    void FailNextResume() { m_ResumeFails = true; }

    Outcome FailPreload();

    /** The stream runs out of data, and playback ends. */
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

    /** The same for an operation that a disc can forbid; that reason takes precedence. */
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
    Outcome Switch(bd::UserOperationMaskDef operation, const Outcome& possible, bool& shown,
                   bool value);
    Outcome CheckShowing(bool shown, const std::vector<Stream>& streams, const char* what) const;
    Outcome JumpToChapter(bd::UserOperationMaskDef operation, std::uint64_t number);
    Outcome CheckRandomAccess(Ticks position) const;
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
