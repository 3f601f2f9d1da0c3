/**
 * @file
 * The table of all events.
 */
#ifndef TESTS_BDMV_BDMVNAVIGATOR_ALLEVENTS_H
#define TESTS_BDMV_BDMVNAVIGATOR_ALLEVENTS_H

#include <memory>
#include <type_traits>
#include <vector>

#include "bdmvnavigator/navigatorevent.h"

/** An event class and the callbacks that it may fire. */
struct EventClass {
    const char* name;
    std::unique_ptr<bdmv::INavigatorEvent> (*make)(bdmv::IPlaybackContext&);
    std::vector<const char*> callbacks;
};

/**
 * Creates an event of a class, and makes the compiler check what all event classes share.
 *
 * @tparam Stored the constructor's parameters after the context
 */
template <typename Event, typename... Stored>
std::unique_ptr<bdmv::INavigatorEvent> Make(bdmv::IPlaybackContext& context)
{
    static_assert(std::is_base_of<bdmv::NavigatorEvent, Event>::value, "");
    static_assert(std::is_convertible<Event*, bdmv::NavigatorEvent*>::value, "derives publicly");
    static_assert(!std::is_abstract<Event>::value, "");
    static_assert(std::has_virtual_destructor<Event>::value, "");
    static_assert(!std::is_copy_constructible<Event>::value, "");
    static_assert(!std::is_copy_assignable<Event>::value, "");
    static_assert(!std::is_default_constructible<Event>::value, "");
    static_assert(std::is_constructible<Event, bdmv::IPlaybackContext&>::value ==
                      (sizeof...(Stored) == 0),
                  "takes the context and every value that it stores");
    static_assert(!std::is_constructible<Event, bdmv::IPlaybackContext&, Stored..., int>::value,
                  "takes no more than that");
    static_assert(sizeof...(Stored) != 0 || sizeof(Event) == sizeof(bdmv::NavigatorEvent),
                  "has no other members than the values it stores");
    return std::make_unique<Event>(context, Stored()...);
}

/** Every event, in the order of declaration. */
inline std::vector<EventClass> AllEvents()
{
    using namespace bdmv;
    return {
        {"PlayStartedEvent", Make<PlayStartedEvent>, {"PlayStarted"}},
        {"FirstPictureDeliveredEvent", Make<FirstPictureDeliveredEvent>, {"FirstPictureDelivered"}},
        {"PlayFailedEvent", Make<PlayFailedEvent>, {"PlayFailed"}},
        {"PausedEvent", Make<PausedEvent>, {"Paused"}},
        {"ContinuedEvent", Make<ContinuedEvent>, {"Continued"}},
        {"SteppedEvent", Make<SteppedEvent>, {"Stepped"}},
        {"StoppedEvent", Make<StoppedEvent>, {"Stopped"}},
        {"TriggerReachedEvent", Make<TriggerReachedEvent>, {"TriggerTimeReached"}},
        {"TriggerSetEvent", Make<TriggerSetEvent, bd::TriggerType, bool>, {"TriggerSet"}},
        {"ZoomModeSetEvent", Make<ZoomModeSetEvent>, {"ZoomModeSet"}},
        {"PlaylistEvent", Make<PlaylistEvent>, {"Playlist"}},
        {"PlayItemEvent",
         Make<PlayItemEvent>,
         {"PlayItem", "PictureInPictureAvailable", "PictureInPictureUnavailable",
          "SecondaryAudioAvailable", "SecondaryAudioUnavailable"}},
        {"UOMaskEvent", Make<UOMaskEvent>, {"UOMask"}},
        {"ChapterEvent", Make<ChapterEvent>, {"ChapterNumber"}},
        {"MarkInfoEvent", Make<MarkInfoEvent, IPlayListMark::MarkType>, {"MarkInfo"}},
        {"PlayModeEvent",
         Make<PlayModeEvent>,
         {"PlayMode", "PictureInPictureAvailable", "PictureInPictureUnavailable",
          "SecondaryAudioAvailable", "SecondaryAudioUnavailable"}},
        {"AudioInfoEvent", Make<AudioInfoEvent>, {"AudioInfo"}},
        {"VideoInfoEvent", Make<VideoInfoEvent>, {"VideoInfo"}},
        {"InteractiveGraphicsInfoEvent",
         Make<InteractiveGraphicsInfoEvent>,
         {"InteractiveGraphicsInfo"}},
        {"PresentationGraphicsInfoEvent",
         Make<PresentationGraphicsInfoEvent>,
         {"PresentationGraphicsInfo"}},
        {"SecondaryAudioInfoEvent",
         Make<SecondaryAudioInfoEvent>,
         {"SecondaryAudioInfo", "SecondaryAudioDisplay"}},
        {"SecondaryVideoInfoEvent",
         Make<SecondaryVideoInfoEvent>,
         {"SecondaryVideoInfo", "SecondaryVideoDisplay"}},
        {"PipPgTextStInfoEvent", Make<PipPgTextStInfoEvent>, {"PipPgTextStInfo"}},
        {"AngleInfoEvent", Make<AngleInfoEvent>, {"AngleInfo"}},
        {"PresentationGraphicsDisplayEvent",
         Make<PresentationGraphicsDisplayEvent>,
         {"PresentationGraphicsDisplay"}},
        {"SecondaryVideoDisplayEvent", Make<SecondaryVideoDisplayEvent>, {"SecondaryVideoDisplay"}},
        {"SecondaryAudioDisplayEvent", Make<SecondaryAudioDisplayEvent>, {"SecondaryAudioDisplay"}},
        {"PipPgTextSelectEvent", Make<PipPgTextSelectEvent>, {"PipPgTextSelect"}},
        {"TextSubtitleStyleInfoEvent", Make<TextSubtitleStyleInfoEvent>, {"TextSubtitleStyleInfo"}},
        {"TextSubtitleStylesAvailableEvent",
         Make<TextSubtitleStylesAvailableEvent>,
         {"TextSubtitleStylesAvailable"}},
        {"FinishedEvent", Make<FinishedEvent>, {"Finished"}},
        {"StillOnEvent", Make<StillOnEvent>, {"StillOn"}},
        {"StillOffEvent", Make<StillOffEvent>, {"StillOff"}},
        {"SuspendedEvent", Make<SuspendedEvent>, {"Suspended"}},
        {"ResumedEvent", Make<ResumedEvent>, {"Resumed"}},
        {"ResumeFailedEvent", Make<ResumeFailedEvent>, {"ResumeFailed"}},
        {"SystemSuspendedEvent", Make<SystemSuspendedEvent>, {"SystemSuspended"}},
        {"SystemResumedEvent", Make<SystemResumedEvent>, {"SystemResumed"}},
        {"SystemResumeFailedEvent", Make<SystemResumeFailedEvent>, {"SystemResumeFailed"}},
        {"InteractiveGraphicsVisibleEvent",
         Make<InteractiveGraphicsVisibleEvent>,
         {"InteractiveGraphicsVisible"}},
        {"InteractiveGraphicsInvisibleEvent",
         Make<InteractiveGraphicsInvisibleEvent>,
         {"InteractiveGraphicsInvisible"}},
        {"PopUpMenuAvailableEvent", Make<PopUpMenuAvailableEvent>, {"PopUpMenuAvailable"}},
        {"PopUpMenuUnavailableEvent", Make<PopUpMenuUnavailableEvent>, {"PopUpMenuUnavailable"}},
        {"AudioInfoChangedEvent",
         Make<AudioInfoChangedEvent, bool, bd::AudioInfoType>,
         {"AudioInfoChanged"}},
        {"ButtonActivationBusyEvent", Make<ButtonActivationBusyEvent>, {"ButtonActivationBusy"}},
        {"ButtonActivationDoneEvent", Make<ButtonActivationDoneEvent>, {"ButtonActivationDone"}},
        {"InteractiveGraphicsActiveEvent",
         Make<InteractiveGraphicsActiveEvent>,
         {"InteractiveGraphicsActive"}},
        {"InteractiveGraphicsInactiveEvent",
         Make<InteractiveGraphicsInactiveEvent>,
         {"InteractiveGraphicsInactive"}},
        {"JumpOccurredEvent", Make<JumpOccurredEvent>, {"JumpOccurred"}},
        {"PreloadFailedEvent", Make<PreloadFailedEvent>, {"PreloadFailed"}},
        {"CurrentTimePositionEvent", Make<CurrentTimePositionEvent>, {"CurrentTimePosition"}},
        {"ExecuteButtonEvent", Make<ExecuteButtonEvent>, {"ExecuteButton"}},
        {"PipAvailableEvent", Make<PipAvailableEvent>, {"PictureInPictureAvailable"}},
        {"PipUnavailableEvent", Make<PipUnavailableEvent>, {"PictureInPictureUnavailable"}},
        {"SecondaryAudioAvailableEvent",
         Make<SecondaryAudioAvailableEvent>,
         {"SecondaryAudioAvailable"}},
        {"SecondaryAudioUnavailableEvent",
         Make<SecondaryAudioUnavailableEvent>,
         {"SecondaryAudioUnavailable"}},
    };
}

#endif
