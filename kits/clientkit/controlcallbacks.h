/**
 * @file
 * The callbacks of INavControlListener as values: each has the name and the arguments of its
 * callback.
 */
#ifndef CLIENTKIT_CONTROLCALLBACKS_H
#define CLIENTKIT_CONTROLCALLBACKS_H

#include "clientkit/bytes.h"
#include "clientkit/callbackid.h"
#include "clientkit/withoutarguments.h"

namespace bdmv
{
namespace callbacks
{

/** INavControlListener::PlayStarted(). */
typedef WithoutArguments<CallbackPlayStarted, INavControlListener,
                         &INavControlListener::PlayStarted>
    PlayStarted;

/** INavControlListener::FirstPictureDelivered(). */
typedef WithoutArguments<CallbackFirstPictureDelivered, INavControlListener,
                         &INavControlListener::FirstPictureDelivered>
    FirstPictureDelivered;

/** INavControlListener::PlayFailed(). */
typedef WithoutArguments<CallbackPlayFailed, INavControlListener, &INavControlListener::PlayFailed>
    PlayFailed;

/** INavControlListener::Paused(). */
typedef WithoutArguments<CallbackPaused, INavControlListener, &INavControlListener::Paused> Paused;

/** INavControlListener::Continued(). */
struct Continued {
    static constexpr CallbackId Id() { return CallbackContinued; }

    bd::PlayDirectionDef direction;
    bd::PlaySpeedDef speed;

    void CallOn(INavigatorListener& listener) const { listener.Continued(direction, speed); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("direction", self.direction);
        visitor("speed", self.speed);
    }
};

/** INavControlListener::Stepped(). */
struct Stepped {
    static constexpr CallbackId Id() { return CallbackStepped; }

    bd::TimePosition position;
    bd::PlayDirectionDef direction;

    void CallOn(INavigatorListener& listener) const { listener.Stepped(position, direction); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("position", self.position);
        visitor("direction", self.direction);
    }
};

/** INavControlListener::TriggerTimeReached(). */
struct TriggerTimeReached {
    static constexpr CallbackId Id() { return CallbackTriggerTimeReached; }

    bd::TriggerType type;
    bd::TimePosition time;

    void CallOn(INavigatorListener& listener) const { listener.TriggerTimeReached(type, time); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("type", self.type);
        visitor("time", self.time);
    }
};

/** INavControlListener::TriggerSet(). */
struct TriggerSet {
    static constexpr CallbackId Id() { return CallbackTriggerSet; }

    bd::TriggerType type;
    bool result;

    void CallOn(INavigatorListener& listener) const { listener.TriggerSet(type, result); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("type", self.type);
        visitor("result", self.result);
    }
};

/** INavControlListener::ZoomModeSet(). */
struct ZoomModeSet {
    static constexpr CallbackId Id() { return CallbackZoomModeSet; }

    bd::ZOOM_PARAM_Def zoom;

    void CallOn(INavigatorListener& listener) const { listener.ZoomModeSet(zoom); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("clip", self.zoom.rClipRectangle);
        visitor("destination", self.zoom.rDestRectangle);
        visitor("delay", self.zoom.u4Delay);
    }
};

/** INavControlListener::Stopped(). */
typedef WithoutArguments<CallbackStopped, INavControlListener, &INavControlListener::Stopped>
    Stopped;

/** INavControlListener::Finished(). */
struct Finished {
    static constexpr CallbackId Id() { return CallbackFinished; }

    INavControlListener::FinishedReason reason;

    void CallOn(INavigatorListener& listener) const { listener.Finished(reason); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("reason", self.reason);
    }
};

/** INavControlListener::StillOn(). */
typedef WithoutArguments<CallbackStillOn, INavControlListener, &INavControlListener::StillOn>
    StillOn;

/** INavControlListener::StillOff(). */
typedef WithoutArguments<CallbackStillOff, INavControlListener, &INavControlListener::StillOff>
    StillOff;

/** INavControlListener::Suspended(). */
typedef WithoutArguments<CallbackSuspended, INavControlListener, &INavControlListener::Suspended>
    Suspended;

/** INavControlListener::Resumed(). */
typedef WithoutArguments<CallbackResumed, INavControlListener, &INavControlListener::Resumed>
    Resumed;

/** INavControlListener::ResumeFailed(). */
typedef WithoutArguments<CallbackResumeFailed, INavControlListener,
                         &INavControlListener::ResumeFailed>
    ResumeFailed;

/** INavControlListener::SystemSuspended(). */
struct SystemSuspended {
    static constexpr CallbackId Id() { return CallbackSystemSuspended; }

    const void* data;
    bd::UInt32 size;

    void CallOn(INavigatorListener& listener) const { listener.SystemSuspended(data, size); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("data", Bytes(self.data, self.size));
        visitor("size", self.size);
    }
};

/** INavControlListener::SystemResumed(). */
struct SystemResumed {
    static constexpr CallbackId Id() { return CallbackSystemResumed; }

    bool playing;

    void CallOn(INavigatorListener& listener) const { listener.SystemResumed(playing); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("playing", self.playing);
    }
};

/** INavControlListener::SystemResumeFailed(). */
typedef WithoutArguments<CallbackSystemResumeFailed, INavControlListener,
                         &INavControlListener::SystemResumeFailed>
    SystemResumeFailed;

/** INavControlListener::JumpOccurred(). */
typedef WithoutArguments<CallbackJumpOccurred, INavControlListener,
                         &INavControlListener::JumpOccurred>
    JumpOccurred;

/** INavControlListener::PreloadFailed(). */
typedef WithoutArguments<CallbackPreloadFailed, INavControlListener,
                         &INavControlListener::PreloadFailed>
    PreloadFailed;

} // namespace callbacks
} // namespace bdmv

#endif
