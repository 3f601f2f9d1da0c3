/**
 * @file
 * Callbacks that report the state of playback.
 */
#ifndef BDMVNAVIGATOR_INAVCONTROLLISTENER_H
#define BDMVNAVIGATOR_INAVCONTROLLISTENER_H

#include "bd/types.h"

namespace bdmv
{

/**
 * The state of playback: started, paused, stopped, finished, standby and the like.
 *
 * INavigatorListener states the rules that all callbacks share. Their order is part of the binary
 * interface.
 */
class INavControlListener
{
public:
    /** Why playback finished. Same values, in the same order, as bdstreaming::FinishedReason. */
    enum FinishedReason : KEVRO_Int32 { EndOfMedia = 0, DataStarvation = 1 };

    INavControlListener() = default;
    virtual ~INavControlListener() = default;
    INavControlListener(const INavControlListener&) = default;
    INavControlListener& operator=(const INavControlListener&) = default;

    /** Playback started. Sent by PlayStartedEvent. */
    virtual void PlayStarted() = 0;

    /** The first picture reached the screen. Sent by FirstPictureDeliveredEvent. */
    virtual void FirstPictureDelivered() = 0;

    /** Playback failed, at its start or later. Sent by PlayFailedEvent. */
    virtual void PlayFailed() = 0;

    /** Playback paused. Sent by PausedEvent. */
    virtual void Paused() = 0;

    /**
     * Playback continues. Sent by ContinuedEvent.
     *
     * @param direction direction of the play mode that is set
     * @param speed     speed of the play mode that is set; the current play mode may still differ
     */
    virtual void Continued(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed) = 0;

    /**
     * Playback made one step. Sent by SteppedEvent.
     *
     * @param position  the current time position
     * @param direction direction of the play mode that is set
     */
    virtual void Stepped(const bd::TimePosition& position, bd::PlayDirectionDef direction) = 0;

    /**
     * Playback reached the time of a trigger. Sent by TriggerReachedEvent.
     *
     * @param type the kind of trigger, corrected by the repeat states
     * @param time the time at which it was reached
     */
    virtual void TriggerTimeReached(bd::TriggerType type, const bd::TimePosition& time) = 0;

    /**
     * A trigger was set. Sent by TriggerSetEvent.
     *
     * @param type   the trigger
     * @param result the result of setting it
     */
    virtual void TriggerSet(bd::TriggerType type, bool result) = 0;

    /**
     * A zoom was set. Sent by ZoomModeSetEvent.
     *
     * @param zoom the clip and destination rectangles, and the delay; their units are unspecified,
     *             see bd::ZOOM_PARAM_Def
     */
    virtual void ZoomModeSet(bd::ZOOM_PARAM_Def zoom) = 0;

    /** Playback stopped. Sent by StoppedEvent. */
    virtual void Stopped() = 0;

    /**
     * Playback finished. Sent by FinishedEvent.
     *
     * @param reason why
     */
    virtual void Finished(FinishedReason reason) = 0;

    /** A still began. Sent by StillOnEvent. */
    virtual void StillOn() = 0;

    /** A still ended. Sent by StillOffEvent. */
    virtual void StillOff() = 0;

    /** Playback was suspended. Sent by SuspendedEvent. */
    virtual void Suspended() = 0;

    /** Playback was resumed. Sent by ResumedEvent. */
    virtual void Resumed() = 0;

    /** Playback could not be resumed. Sent by ResumeFailedEvent. */
    virtual void ResumeFailed() = 0;

    /**
     * The system goes into standby. Sent by SystemSuspendedEvent.
     *
     * The block is discarded as soon as the last listener has returned: a listener that needs it
     * later copies the bytes during the call.
     *
     * @param data first byte of the system resume data; may be null, whatever the size
     * @param size its size in bytes
     */
    virtual void SystemSuspended(const void* data, bd::UInt32 size) = 0;

    /**
     * The system returned from standby. Sent by SystemResumedEvent.
     *
     * @param playing whether playback is running again
     */
    virtual void SystemResumed(bool playing) = 0;

    /**
     * The system returned from standby, and playback could not be restored. Sent by
     * SystemResumeFailedEvent.
     */
    virtual void SystemResumeFailed() = 0;

    /** Playback jumped to another position. Sent by JumpOccurredEvent. */
    virtual void JumpOccurred() = 0;

    /** Preloading failed. Sent by PreloadFailedEvent. */
    virtual void PreloadFailed() = 0;
};

} // namespace bdmv

#endif
