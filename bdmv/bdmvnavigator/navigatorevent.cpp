#include "bdmvnavigator/navigatorevent.h"

#include "bd/logging.h"
#include "kevro/kevro_osa.h"

namespace bdmv
{

namespace
{

/** The lines that announce a callback. */
constexpr bd::LogTag Notification = {bd::CompIdBdmvNavigator, KEVRO_Log_LevelEvent, 0};

/** Identifies the report of an unknown finish reason in the field, wherever its line stands. */
constexpr int FinishReasonAssertionLine = 885;

/** A 64-bit value as "%llu" wants it, whatever type of the target carries 64 bits. */
unsigned long long Llu(bd::UInt64 value)
{
    return value;
}

INavControlListener::FinishedReason ToListenerReason(bdstreaming::FinishedReason reason)
{
    switch (reason) {
    case bdstreaming::FinishedReasonEndOfMedia:
        return INavControlListener::EndOfMedia;
    case bdstreaming::FinishedReasonDataStarvation:
        return INavControlListener::DataStarvation;
    }
    Assert("false", __FILE__, FinishReasonAssertionLine);
    return INavControlListener::EndOfMedia;
}

} // namespace

void PlayStartedEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending PlayStarted");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::PlayStarted);
}

void FirstPictureDeliveredEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending FirstPictureDeliveredEvent");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::FirstPictureDelivered);
}

void PlayFailedEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending PlayFailed");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::PlayFailed);
}

void PausedEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending Paused");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::Paused);
}

void ContinuedEvent::Dispatch(Listeners& listeners)
{
    const bd::PlayMode currentMode = m_rPlaybackContext.GetCurrentPlayMode();
    const bd::PlayMode mode = m_rPlaybackContext.GetPlayMode();
    const bd::PlayDirectionDef direction = mode.Direction();
    const bd::PlaySpeedDef speed = mode.Speed();

    BD_LOG(Notification,
           "Sending Continued with playmode: dir %d, speed %d (currentplaymode: dir %d, speed %d)",
           mode.Direction(), mode.Speed(), currentMode.Direction(), currentMode.Speed());

    bd::EventListenerList_FireParam2(listeners, &INavigatorListener::Continued, direction, speed);
}

void SteppedEvent::Dispatch(Listeners& listeners)
{
    const bd::TimePosition timePosition = m_rPlaybackContext.GetCurrentTimePosition();
    const bd::PlayDirectionDef direction = m_rPlaybackContext.GetPlayMode().Direction();

    BD_LOG(Notification, "Sending Stepped - position: %llu,dir=%d", Llu(timePosition), direction);

    bd::EventListenerList_FireParam2(listeners, &INavigatorListener::Stepped, timePosition,
                                     direction);
}

void StoppedEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending Stopped");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::Stopped);
}

void FinishedEvent::Dispatch(Listeners& listeners)
{
    const INavControlListener::FinishedReason reason =
        ToListenerReason(m_rPlaybackContext.GetFinishedReason());

    BD_LOG(Notification, "Sending Finished - reason: %d", reason);

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::Finished, reason);
}

void StillOnEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending StillOn");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::StillOn);
}

void StillOffEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending StillOff");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::StillOff);
}

void SuspendedEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending Suspended");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::Suspended);
}

void ResumedEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending Resumed");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::Resumed);
}

void ResumeFailedEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending ResumeFailed");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::ResumeFailed);
}

void JumpOccurredEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending JumpOccurred");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::JumpOccurred);
}

void PreloadFailedEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending PreloadFailed");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::PreloadFailed);
}

} // namespace bdmv
