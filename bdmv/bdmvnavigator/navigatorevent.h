/**
 * @file
 * The events of the navigator.
 *
 * @code
 * // where it happens
 * queue.Push(std::unique_ptr<bdmv::INavigatorEvent>(new bdmv::PausedEvent(context)));
 *
 * // on the delivering thread
 * std::unique_ptr<bdmv::INavigatorEvent> event = queue.Pop();
 * event->Dispatch(listeners);
 * @endcode
 *
 * Dispatching an event does three things, in the order that the event states: it queries the
 * playback context, it writes a log line that begins with "Sending", and it fires a callback on
 * every listener. The values are those of the moment of dispatch; what an event freezes at its
 * construction stands among its constructor's arguments.
 *
 * Lifetime. The context must outlive the event, which does not own it.
 *
 * Threads. An event starts no thread and has no lock. Between two callbacks of one event the lock
 * of the list is free, so listeners may see another thread's event there.
 */
#ifndef BDMVNAVIGATOR_NAVIGATOREVENT_H
#define BDMVNAVIGATOR_NAVIGATOREVENT_H

#include "bdmvnavigator/inavigatorevent.h"
#include "bdmvnavigator/iplaybackcontext.h"

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
    IPlaybackContext& m_rPlaybackContext;
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

/** Playback could not be started. */
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
 * Playback continues. The listeners receive the play mode that is set; the one that playback
 * currently runs in is only logged.
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
 * Playback reached its end, or starved. A reason that the streaming layer does not know is reported
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

} // namespace bdmv

#endif
