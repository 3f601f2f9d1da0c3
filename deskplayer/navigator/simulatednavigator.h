/**
 * @file
 * A navigator that plays a play list without a stream.
 */
#ifndef DESKPLAYER_NAVIGATOR_SIMULATEDNAVIGATOR_H
#define DESKPLAYER_NAVIGATOR_SIMULATEDNAVIGATOR_H

#include <array>
#include <cstdint>
#include <initializer_list>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "navigator/eventdelivery.h"
#include "navigator/outcome.h"
#include "navigator/playbackcontext.h"
#include "navigator/resumedata.h"
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
 * Positions are on the time line of the play list, in ticks of 45 kHz. Play items are played in
 * sequence, whatever playback type the play list asks for.
 */
class SimulatedNavigator final : public PlaybackContext
{
public:
    enum class Status {
        Stopped, ///< not started yet, stopped on request, or failed
        Playing,
        Paused,
        Still,     ///< holds the last picture of a play item
        Suspended, ///< holds until it is resumed
        Standby,   ///< the system sleeps
        Finished   ///< everything has been played
    };

    /** @param clock and @p delivery must outlive the navigator */
    SimulatedNavigator(LoadedPlayList playList, VirtualClock& clock, EventDelivery& delivery);

    Status CurrentStatus() const { return m_Status; }

    /** Whether playback goes round and round, so that it never ends by itself. */
    bool IsRepeating() const;

    // Time.

    /**
     * How long it takes until playback changes by itself, in ticks of 45 kHz of the session;
     * nothing when it waits for an operation, or has ended.
     */
    std::optional<std::uint64_t> TimeToNextChange() const;

    /**
     * Lets time pass, and playback with it.
     *
     * @param ticks of the session, 45 kHz
     * @return how much of it was left when playback ended; the clock stands there
     */
    std::uint64_t Advance(std::uint64_t ticks);

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
    void LeaveStill();

    /** Holds playback until Resume(), as a title does that calls a menu. */
    Outcome Suspend();
    Outcome Resume();

    // Position.

    Outcome SearchTime(std::uint64_t position);
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
    Outcome SetTrigger(std::uint64_t position);

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

    /** Has the next Play() fail. */
    void FailNextPlay() { m_PlayFails = true; }

    /** Has the next Resume() fail. */
    void FailNextResume() { m_ResumeFails = true; }

    Outcome FailPreload();

    /** The stream runs dry: playback ends. */
    Outcome Starve();

private:
    /** The kinds of streams that events tell number and count of. */
    static constexpr std::size_t StreamKinds = 8;

    /** What the listeners were told last: they are told again only what has changed. */
    struct Told {
        std::array<NumberAndCount, StreamKinds> streams;
        std::optional<bd::AudioInfoType> audio;
        std::optional<bd::AudioInfoType> secondaryAudio;
        bool pipInStep = false;            ///< as available
        bool secondaryAudioInStep = false; ///< as available
        bd::UInt8 styles = 0;
        bool popUpMenu = false; ///< as available
        std::optional<bdmv::UOMaskTable> mask;
        bd::ChapterNumberDef chapter = 0;
    };

    template <typename Event, typename... Arguments> void Send(Arguments... arguments);

    // Whether an operation may be carried out now, and carrying it out.
    Outcome CheckMask(bd::UserOperationMaskDef operation) const;
    Outcome CheckStatus(std::initializer_list<Status> statuses) const;
    Outcome CheckActive() const;
    template <typename Action> Outcome Operate(const Outcome& possible, Action action);
    template <typename Action>
    Outcome Operate(bd::UserOperationMaskDef operation, const Outcome& possible, Action action);

    // Time.
    std::uint64_t EndOfItem(std::size_t item) const;
    bool IsForward() const;
    std::uint64_t NextStop() const;
    std::uint64_t NextStopForward() const;
    std::uint64_t NextStopBackward() const;
    std::uint64_t DistanceToNextStop() const;
    void Move(std::uint64_t distance);
    void ReachPosition();
    void ReachForward();
    void ReachBackward();
    void ReachTrigger(bd::TriggerType type);
    void ReachEnd();
    void ReachEndOfItem();
    void EnterNextItem();
    void Finish(bdstreaming::FinishedReason reason);

    // What the listeners are told.
    void StartFresh();
    void AnnounceItem();
    void AnnounceStreams();
    void AnnounceAudioInfo(bool isPrimary, const std::vector<Stream>& streams,
                           bd::StreamNumberDef number, std::optional<bd::AudioInfoType>& told);
    void AnnounceStreamsInStep();
    void AnnounceMask();
    void AnnounceMenu();
    void AnnounceChapter();
    void AnnounceMarks(std::size_t firstItem);

    // Steps of operations.
    std::size_t ItemAt(std::uint64_t position) const;
    const Chapter* FindChapter(std::uint64_t number) const;
    void StepBy(std::uint64_t duration);
    void JumpTo(std::uint64_t position);
    void RepeatFrom(std::uint64_t position);
    void ChangePlayMode(bd::PlayMode mode);
    Outcome JumpToChapter(bd::UserOperationMaskDef operation, std::uint64_t number);
    void SetTriggerType(bd::TriggerType type, bool result);
    Outcome SetChapterTitleRepeat(bd::TriggerType repeat);
    template <typename Number>
    Outcome SelectStream(bd::UserOperationMaskDef operation, std::uint64_t number,
                         std::size_t count, const char* what, Number& selected);
    template <typename Event>
    Outcome Switch(bd::UserOperationMaskDef operation, bool& shown, bool value);
    bd::ButtonId ButtonOfCurrentChapter();
    Outcome CheckMenu() const;
    Outcome CheckButton(std::uint64_t number) const;
    void CloseMenu();
    void ExecuteButton();
    bool IsInPlayList(const ResumePoint& point) const;

    VirtualClock& m_rClock;
    EventDelivery& m_rDelivery;
    Status m_Status = Status::Stopped;
    Status m_StatusBefore = Status::Stopped;  ///< the one that Resume() goes back to
    std::uint64_t m_Carry = 0;                ///< time that passed, too short to move the position
    std::optional<std::uint64_t> m_StillLeft; ///< of a still that ends by itself, in ticks
    Told m_Told;
    bool m_MenuOpen = false;
    bd::ButtonId m_SelectedButton = 1;
    bd::UInt32 m_LastTicket = 0;
    bool m_PlayFails = false;
    bool m_ResumeFails = false;
};

} // namespace deskplayer

#endif
