/**
 * @file
 * The events of the navigator.
 *
 * @code
 * // where playback pauses
 * queue.Push(std::unique_ptr<bdmv::INavigatorEvent>(new bdmv::PausedEvent(context)));
 *
 * // on the delivering thread
 * std::unique_ptr<bdmv::INavigatorEvent> event = queue.Pop();
 * event->Dispatch(listeners);
 * @endcode
 *
 * Dispatching an event does three things, in most events in this order: it queries the playback
 * context, it writes a log line that begins with "Sending", and it fires a callback on
 * every listener. The values are those at the time of dispatch; values fixed at construction are
 * constructor arguments.
 *
 * Lifetime. The context must outlive the event, which does not own it.
 *
 * Threads. An event starts no thread and has no lock. The list is unlocked between two callbacks
 * of one event, so listeners may receive another thread's event in between.
 */
#ifndef BDMVNAVIGATOR_NAVIGATOREVENT_H
#define BDMVNAVIGATOR_NAVIGATOREVENT_H

#include "bdmvnavigator/inavigatorevent.h"
#include "bdmvnavigator/iplaybackcontext.h"
#include "database/iplaylistmark.h"

namespace bdmv
{

/** What all events share: the playback context they read. */
class NavigatorEvent : public INavigatorEvent
{
public:
    /** @param thePlaybackContext read when the event is dispatched; must outlive the event */
    explicit NavigatorEvent(IPlaybackContext& thePlaybackContext)
        : m_rPlaybackContext(thePlaybackContext)
    {
    }

    ~NavigatorEvent() override = default;
    NavigatorEvent(const NavigatorEvent&) = delete;
    NavigatorEvent& operator=(const NavigatorEvent&) = delete;

protected:
    IPlaybackContext& m_rPlaybackContext; ///< read when the event is dispatched
};

/** Playback started. */
class PlayStartedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PlayStartedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** The first picture reached the screen. */
class FirstPictureDeliveredEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~FirstPictureDeliveredEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** Playback failed, at its start or later. */
class PlayFailedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PlayFailedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** Playback paused. */
class PausedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PausedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/**
 * Playback continues. The listeners receive the play mode that is set; the current play mode is
 * only logged.
 */
class ContinuedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~ContinuedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** Playback made one step. */
class SteppedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~SteppedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** Playback stopped. */
class StoppedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~StoppedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/**
 * Playback reached the time of a trigger. The kind of trigger that listeners receive depends on the
 * kind at that time and on the repeat states.
 */
class TriggerReachedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~TriggerReachedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** A trigger was set. */
class TriggerSetEvent : public NavigatorEvent
{
public:
    /**
     * @param type       the trigger that was set
     * @param resultInfo the result of setting it
     */
    TriggerSetEvent(IPlaybackContext& thePlaybackContext, bd::TriggerType type, bool resultInfo)
        : NavigatorEvent(thePlaybackContext), m_Type(type), m_ResultInfo(resultInfo)
    {
    }

    ~TriggerSetEvent() override = default;
    void Dispatch(Listeners& listeners) override;

private:
    bd::TriggerType m_Type;
    bool m_ResultInfo;
};

/** A zoom was set. */
class ZoomModeSetEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~ZoomModeSetEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** A play list is being played. */
class PlaylistEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PlaylistEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/**
 * A play item is being played. After the play item itself, the event reports whether
 * picture-in-picture and secondary audio are available. This depends on the asynchronous streams of
 * this item and the secondary streams of the previous one.
 */
class PlayItemEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PlayItemEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** The set of forbidden user operations changed. */
class UOMaskEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~UOMaskEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** A chapter began. */
class ChapterEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~ChapterEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** Playback passed a play list mark: the current one of the context, whatever its type. */
class MarkInfoEvent : public NavigatorEvent
{
public:
    /** @param markType stored but unused: marks of all types are reported alike */
    MarkInfoEvent(IPlaybackContext& thePlaybackContext, IPlayListMark::MarkType markType)
        : NavigatorEvent(thePlaybackContext), m_MarkType(markType)
    {
    }

    ~MarkInfoEvent() override = default;
    void Dispatch(Listeners& listeners) override;

private:
    IPlayListMark::MarkType m_MarkType;
};

/**
 * The current play mode changed. After the play mode itself, the event reports the asynchronous
 * streams of the play item as available at normal speed and as unavailable at any other.
 */
class PlayModeEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PlayModeEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** A primary audio stream is selected. */
class AudioInfoEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~AudioInfoEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** A primary video stream is selected. */
class VideoInfoEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~VideoInfoEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** An interactive graphics stream is selected. */
class InteractiveGraphicsInfoEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~InteractiveGraphicsInfoEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/**
 * A presentation graphics or text subtitle stream is selected. Neither logged nor sent when the
 * context does not allow the query.
 */
class PresentationGraphicsInfoEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PresentationGraphicsInfoEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** A secondary audio stream is selected. Reports the stream, then whether it is output. */
class SecondaryAudioInfoEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~SecondaryAudioInfoEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** A secondary video stream is selected. Reports the stream, then whether it is shown. */
class SecondaryVideoInfoEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~SecondaryVideoInfoEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/**
 * A subtitle stream is selected for the picture-in-picture window. It is available while subtitles
 * are shown, the window offers more of them than the primary picture, and the selected one is among
 * them.
 */
class PipPgTextStInfoEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PipPgTextStInfoEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** An angle is selected. */
class AngleInfoEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~AngleInfoEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** Presentation graphics and text subtitles were switched on or off. */
class PresentationGraphicsDisplayEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PresentationGraphicsDisplayEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** The secondary video was switched on or off. */
class SecondaryVideoDisplayEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~SecondaryVideoDisplayEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** The secondary audio was switched on or off. */
class SecondaryAudioDisplayEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~SecondaryAudioDisplayEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** The picture-in-picture subtitle was selected or deselected. */
class PipPgTextSelectEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PipPgTextSelectEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** A text subtitle user style is selected. */
class TextSubtitleStyleInfoEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~TextSubtitleStyleInfoEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** Text subtitle user styles are available. */
class TextSubtitleStylesAvailableEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~TextSubtitleStylesAvailableEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/**
 * Playback reached the end of the media, or was starved of data. Any other reason is reported
 * through Assert() and sent as the end of the media.
 */
class FinishedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~FinishedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** A still began. */
class StillOnEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~StillOnEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** A still ended. */
class StillOffEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~StillOffEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** Playback was suspended. */
class SuspendedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~SuspendedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** Playback was resumed. */
class ResumedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~ResumedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** Playback could not be resumed. */
class ResumeFailedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~ResumeFailedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/**
 * The system goes into standby. Passes the resume data to the listeners, then makes the context
 * discard it.
 */
class SystemSuspendedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~SystemSuspendedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** The system returned from standby. Makes the context discard its resume data afterwards. */
class SystemResumedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~SystemResumedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/**
 * The system returned from standby, and playback could not be restored. Makes the context discard
 * its resume data afterwards.
 */
class SystemResumeFailedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~SystemResumeFailedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** The menu became visible. */
class InteractiveGraphicsVisibleEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~InteractiveGraphicsVisibleEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** The menu became invisible. */
class InteractiveGraphicsInvisibleEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~InteractiveGraphicsInvisibleEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** A pop-up menu became available. */
class PopUpMenuAvailableEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PopUpMenuAvailableEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** A pop-up menu became unavailable. */
class PopUpMenuUnavailableEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PopUpMenuUnavailableEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** The attributes of an audio stream changed. */
class AudioInfoChangedEvent : public NavigatorEvent
{
public:
    /**
     * @param isPrimary whether the change concerns the primary audio rather than the secondary
     * @param info      the new attributes
     */
    AudioInfoChangedEvent(IPlaybackContext& thePlaybackContext, bool isPrimary,
                          bd::AudioInfoType info)
        : NavigatorEvent(thePlaybackContext), m_IsPrimary(isPrimary), m_Info(info)
    {
    }

    ~AudioInfoChangedEvent() override = default;
    void Dispatch(Listeners& listeners) override;

private:
    bool m_IsPrimary;
    bd::AudioInfoType m_Info;
};

/** The activation of a button is under way. */
class ButtonActivationBusyEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~ButtonActivationBusyEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** The activation of a button is done. */
class ButtonActivationDoneEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~ButtonActivationDoneEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** The menu became active. */
class InteractiveGraphicsActiveEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~InteractiveGraphicsActiveEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** The menu became inactive. */
class InteractiveGraphicsInactiveEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~InteractiveGraphicsInactiveEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** Playback jumped to another position. */
class JumpOccurredEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~JumpOccurredEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** Preloading failed. */
class PreloadFailedEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PreloadFailedEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** The current time position. Its log line is the only high-frequency line of the events. */
class CurrentTimePositionEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~CurrentTimePositionEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/**
 * A button was activated: its navigation program is to be executed. Holds one counted reference to
 * the program while it is dispatched.
 */
class ExecuteButtonEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~ExecuteButtonEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** Picture-in-picture became available. */
class PipAvailableEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PipAvailableEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/**
 * Picture-in-picture became unavailable. Only logged while the play item has an asynchronous
 * secondary video.
 */
class PipUnavailableEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~PipUnavailableEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/** Secondary audio became available. */
class SecondaryAudioAvailableEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~SecondaryAudioAvailableEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

/**
 * Secondary audio became unavailable. Only logged while the play item has an asynchronous secondary
 * audio.
 */
class SecondaryAudioUnavailableEvent : public NavigatorEvent
{
public:
    using NavigatorEvent::NavigatorEvent;
    ~SecondaryAudioUnavailableEvent() override = default;
    void Dispatch(Listeners& listeners) override;
};

} // namespace bdmv

#endif
