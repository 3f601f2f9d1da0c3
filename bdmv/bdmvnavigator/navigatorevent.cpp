#include "bdmvnavigator/navigatorevent.h"

#include "bd/constants.h"
#include "bd/logging.h"
#include "kevro/kevro_osa.h"

namespace bdmv
{

namespace
{

/** The lines that announce a callback. */
constexpr bd::LogTag Notification = {bd::CompIdBdmvNavigator, KEVRO_Log_LevelEvent, 0};

/** The notification that repeats many times a second during playback. */
constexpr bd::LogTag HighFrequencyNotification = {bd::CompIdBdmvNavigator, KEVRO_Log_LevelEvent, 1};

/** The line that helps to explain which trigger was reported. */
constexpr bd::LogTag Diagnostic = {bd::CompIdBdmvNavigator, KEVRO_Log_LevelWarning, 0};

/** Identifies the report of an unknown finish reason in the field; independent of the real line. */
constexpr int FinishReasonAssertionLine = 885;

/** A 32-bit value as "%lu" expects it, whichever type has 32 bits on the target. */
unsigned long Lu(bd::UInt32 value)
{
    return value;
}

/** A 64-bit value as "%llu" expects it, whichever type has 64 bits on the target. */
unsigned long long Llu(bd::UInt64 value)
{
    return value;
}

const char* TrueOrFalse(bool value)
{
    return value ? "TRUE" : "FALSE";
}

/** The selected stream and the number of streams; 0 where the context does not write them. */
struct StreamInfo {
    bd::StreamNumberDef number = 0;
    bd::UInt8 count = 0;
};

struct SecondaryAudioInfo : StreamInfo {
    explicit SecondaryAudioInfo(IPlaybackContext& context)
    {
        context.GetSecondaryAudioInfo(&number, &count);
    }
};

struct SecondaryVideoInfo : StreamInfo {
    bool async = false;

    explicit SecondaryVideoInfo(IPlaybackContext& context)
    {
        context.GetSecondaryVideoInfo(&number, &count, &async);
    }
};

/** Which secondary streams play asynchronously; none where the context does not write it. */
struct AsyncFlags {
    bool fg2ndVid = false;
    bool fg2ndAud = false;
    bool fgPrev2ndVid = false;
    bool fgPrev2ndAud = false;

    explicit AsyncFlags(IPlaybackContext& context)
    {
        context.IsAsyncPipInCurrentPlayItem(fg2ndVid, fg2ndAud, fgPrev2ndVid, fgPrev2ndAud);
    }
};

/**
 * The trigger that listeners receive when a time of kind @p type was reached.
 *
 * Point B without an A-B repeat, while a chapter or title repeats, is a notification. A time of no
 * valid kind is attributed to point B first, then to the chapter or title repeat, and last to
 * the trigger that is set.
 */
bd::TriggerType CorrectByRepeatStates(IPlaybackContext& context, bd::TriggerType type)
{
    if (type != bd::TRIGGER_B && type != bd::TRIGGER_INVALID) {
        return type;
    }
    const bd::TriggerType abState = context.GetCurrentABRepeatState();
    const bd::TriggerType chpTitleState = context.GetCurrentChpTitleRepeatState();
    const bool chpTitleRepeats = chpTitleState != bd::TRIGGER_NONE;
    if (type == bd::TRIGGER_B) {
        return chpTitleRepeats && abState == bd::TRIGGER_AB_NONE ? bd::TRIGGER_NOTIFY_FROM_CURPOS
                                                                 : bd::TRIGGER_B;
    }
    if (abState == bd::TRIGGER_B) {
        return bd::TRIGGER_B;
    }
    return chpTitleRepeats ? chpTitleState : context.GetTrigger().triggerType;
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

// Notifications that several events send, each event with its own line.

void FirePictureInPictureAvailable(INavigatorEvent::Listeners& listeners)
{
    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::PictureInPictureAvailable);
}

void FirePictureInPictureUnavailable(INavigatorEvent::Listeners& listeners)
{
    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::PictureInPictureUnavailable);
}

void FireSecondaryAudioAvailable(INavigatorEvent::Listeners& listeners)
{
    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::SecondaryAudioAvailable);
}

void FireSecondaryAudioUnavailable(INavigatorEvent::Listeners& listeners)
{
    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::SecondaryAudioUnavailable);
}

void FireSecondaryAudioDisplay(INavigatorEvent::Listeners& listeners, bd::StreamNumberDef number,
                               bool shown)
{
    bd::EventListenerList_FireParam2(listeners, &INavigatorListener::SecondaryAudioDisplay, number,
                                     shown);
}

void FireSecondaryVideoDisplay(INavigatorEvent::Listeners& listeners, bd::StreamNumberDef number,
                               bool shown)
{
    bd::EventListenerList_FireParam2(listeners, &INavigatorListener::SecondaryVideoDisplay, number,
                                     shown);
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

void TriggerReachedEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending Trigger Reached");

    const bd::TimePosition timePosition = m_rPlaybackContext.GetTriggerReachedTime();
    const bd::TriggerType type = CorrectByRepeatStates(
        m_rPlaybackContext, m_rPlaybackContext.GetTriggerTypeByTime(timePosition));

    BD_LOG(Diagnostic, "TriggerRead time type=%d,time = %llu", type, Llu(timePosition));

    bd::EventListenerList_FireParam2(listeners, &INavigatorListener::TriggerTimeReached, type,
                                     timePosition);
}

void TriggerSetEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending Trigger Set");

    bd::EventListenerList_FireParam2(listeners, &INavigatorListener::TriggerSet, m_Type,
                                     m_ResultInfo);
}

void ZoomModeSetEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending ZoomModeSetEvent callback");

    bd::ZOOM_PARAM_Def zoomInfo = bd::ZOOM_PARAM_Def();
    m_rPlaybackContext.GetZoomScaleInfo(zoomInfo);

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::ZoomModeSet, zoomInfo);
}

void PlaylistEvent::Dispatch(Listeners& listeners)
{
    const bd::PlayListIdDef playListId = m_rPlaybackContext.GetPlayListId();

    BD_LOG(Notification, "Sending Playlist - playListId: %lu", Lu(playListId));

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::Playlist, playListId);
}

void PlayItemEvent::Dispatch(Listeners& listeners)
{
    const bd::PlayListIdDef playListId = m_rPlaybackContext.GetPlayListId();
    const bd::PlayItemIdDef playItemId = m_rPlaybackContext.GetPlayItemId();
    bd::VideoFormatType videoFormat = bd::VideoFormatTypeNoInfo;
    bd::VideoAspectRatioType aspectRatio = bd::VideoAspectRatioTypeNoInfo;
    m_rPlaybackContext.GetVideoAttributes(videoFormat, aspectRatio);

    BD_LOG(Notification,
           "Sending PlayItem - playListId: %lu, playItemId: %u, videoFormat %d, aspectRatio %d",
           Lu(playListId), playItemId, videoFormat, aspectRatio);

    bd::EventListenerList_FireParam4(listeners, &INavigatorListener::PlayItem, playListId,
                                     playItemId, videoFormat, aspectRatio);

    const AsyncFlags async(m_rPlaybackContext);

    if (async.fg2ndVid) {
        BD_LOG(Notification, "Send available for async 2nd video");
        FirePictureInPictureAvailable(listeners);
    } else if (async.fgPrev2ndVid) {
        BD_LOG(Notification, "Send unavailable for 2nd video");
        FirePictureInPictureUnavailable(listeners);
    }

    if (async.fg2ndAud) {
        BD_LOG(Notification, "Send available for async 2nd audio");
        FireSecondaryAudioAvailable(listeners);
    } else if (async.fgPrev2ndAud) {
        BD_LOG(Notification, "Send unavailable for 2nd audio");
        FireSecondaryAudioUnavailable(listeners);
    }
}

void UOMaskEvent::Dispatch(Listeners& listeners)
{
    UOMaskTable mask;
    m_rPlaybackContext.GetUOMask(mask);

    BD_LOG(Notification, "Sending UOMask - uoMask: %llu", Llu(mask.GetUOMaskTable()));

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::UOMask, mask);
}

void ChapterEvent::Dispatch(Listeners& listeners)
{
    const bd::ChapterNumberDef chapter = m_rPlaybackContext.GetCurrentChapter();

    BD_LOG(Notification, "Sending Chapter - chapterNumber: %u", chapter);

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::ChapterNumber, chapter);
}

void MarkInfoEvent::Dispatch(Listeners& listeners)
{
    static_cast<void>(m_MarkType); // marks of all types are reported alike
    bd::TimePosition time = bd::TimePositionNone;
    const bd::PlayListMarkIdDef markId = m_rPlaybackContext.GetCurrentPLMarkId(time);
    const bd::PlayListIdDef playListId = m_rPlaybackContext.GetPlayListId();

    BD_LOG(Notification, "Sending MarkInfo - markId: %u, time: %llu", markId, Llu(time));

    bd::EventListenerList_FireParam3(listeners, &INavigatorListener::MarkInfo, playListId, markId,
                                     time);
}

void PlayModeEvent::Dispatch(Listeners& listeners)
{
    const bd::PlayMode& playMode = m_rPlaybackContext.GetCurrentPlayMode();
    const bd::PlayDirectionDef direction = playMode.Direction();
    const bd::PlaySpeedDef speed = playMode.Speed();

    BD_LOG(Notification, "Sending PlayMode - direction: %u, speedIndex: %u",
           static_cast<unsigned>(direction), static_cast<unsigned>(speed));

    bd::EventListenerList_FireParam2(listeners, &INavigatorListener::PlayMode, direction, speed);

    const AsyncFlags async(m_rPlaybackContext);

    if (speed == bd::PlaySpeedNormal) {
        if (async.fg2ndVid) {
            BD_LOG(Notification, "For normal play notify async pip available");
            FirePictureInPictureAvailable(listeners);
        }
        if (async.fg2ndAud) {
            BD_LOG(Notification, "For normal play notify async 2ndaud available");
            FireSecondaryAudioAvailable(listeners);
        }
    } else {
        if (async.fg2ndVid) {
            BD_LOG(Notification, "For speed play notify async pip unavailable");
            FirePictureInPictureUnavailable(listeners);
        }
        if (async.fg2ndAud) {
            BD_LOG(Notification, "For speed play notify async 2ndaud unavailable");
            FireSecondaryAudioUnavailable(listeners);
        }
    }
}

void AudioInfoEvent::Dispatch(Listeners& listeners)
{
    StreamInfo audio;
    m_rPlaybackContext.GetAudioInfo(&audio.number, &audio.count);

    BD_LOG(Notification, "Sending AudioInfo - audioNr: %u", audio.number);

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::AudioInfo, audio.number);
}

void VideoInfoEvent::Dispatch(Listeners& listeners)
{
    StreamInfo video;
    m_rPlaybackContext.GetVideoInfo(&video.number, &video.count);

    BD_LOG(Notification, "Sending VideoInfo - videoNr: %u", video.number);

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::VideoInfo, video.number);
}

void InteractiveGraphicsInfoEvent::Dispatch(Listeners& listeners)
{
    StreamInfo ig;
    m_rPlaybackContext.GetIgInfo(&ig.number, &ig.count);

    BD_LOG(Notification, "Sending InteractiveGraphicsInfo - igNr: %u", ig.number);

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::InteractiveGraphicsInfo,
                                     ig.number);
}

void PresentationGraphicsInfoEvent::Dispatch(Listeners& listeners)
{
    StreamInfo pgTextSt;
    if (m_rPlaybackContext.rGetPgTextStInfo(&pgTextSt.number, &pgTextSt.count) ==
        INavError::ErrNotAllowed) {
        return;
    }
    m_rPlaybackContext.GetPgTextStInfo(&pgTextSt.number, &pgTextSt.count);
    const bool available = m_rPlaybackContext.GetPgTextStDisplay() && pgTextSt.count != 0;

    BD_LOG(Notification, "Sending PresentationGraphicsInfo - pgTextStNr: %u, available: %s",
           pgTextSt.number, TrueOrFalse(available));

    bd::EventListenerList_FireParam2(listeners, &INavigatorListener::PresentationGraphicsInfo,
                                     pgTextSt.number, available);
}

void SecondaryAudioInfoEvent::Dispatch(Listeners& listeners)
{
    const SecondaryAudioInfo audio(m_rPlaybackContext);

    BD_LOG(Notification, "Sending SecondaryAudioInfo - audioNr: %u", audio.number);

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::SecondaryAudioInfo,
                                     audio.number);

    const bool shown = m_rPlaybackContext.GetSecondaryAudioDisplay();

    BD_LOG(Notification,
           "Sending ((SecondaryAudioDisplay)) - audioNr %d, numOfAudios %d, shown: %s",
           audio.number, audio.count, TrueOrFalse(shown));

    FireSecondaryAudioDisplay(listeners, audio.number, shown);
}

void SecondaryVideoInfoEvent::Dispatch(Listeners& listeners)
{
    const SecondaryVideoInfo video(m_rPlaybackContext);

    BD_LOG(Notification, "Sending SecondaryVideoInfo - videoNr: %u", video.number);

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::SecondaryVideoInfo,
                                     video.number);

    const bool shown = m_rPlaybackContext.GetSecondaryVideoDisplay();

    BD_LOG(Notification,
           "Sending ((SecondaryVideoDisplay)) - video Nr %d, numofVideos %d, async %d, shown: %s",
           video.number, video.count, video.async, TrueOrFalse(shown));

    FireSecondaryVideoDisplay(listeners, video.number, shown);
}

void PipPgTextStInfoEvent::Dispatch(Listeners& listeners)
{
    StreamInfo pip;
    m_rPlaybackContext.GetPipPgTextStInfo(&pip.number, &pip.count);
    StreamInfo primary;
    m_rPlaybackContext.GetPgTextStInfo(&primary.number, &primary.count);
    const bool shown = m_rPlaybackContext.GetPgTextStDisplay();
    const bool available = shown && primary.count < pip.count && pip.number <= pip.count;

    BD_LOG(Notification, "Sending PipPgTextStInfo - pgTextStNr: %u, avaliable %d", pip.number,
           available);

    bd::EventListenerList_FireParam2(listeners, &INavigatorListener::PipPgTextStInfo, pip.number,
                                     available);
}

void AngleInfoEvent::Dispatch(Listeners& listeners)
{
    bd::AngleNumberDef angle = 0;
    bd::UInt8 count = 0;
    m_rPlaybackContext.GetAngleInfo(&angle, &count);

    BD_LOG(Notification, "Sending AngleInfo - angleNr: %u", angle);

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::AngleInfo, angle);
}

void PresentationGraphicsDisplayEvent::Dispatch(Listeners& listeners)
{
    const bool shown = m_rPlaybackContext.GetPgTextStDisplay();

    BD_LOG(Notification, "Sending PresentationGraphicsDisplay - shown: %s", TrueOrFalse(shown));

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::PresentationGraphicsDisplay,
                                     shown);
}

void SecondaryVideoDisplayEvent::Dispatch(Listeners& listeners)
{
    const bool shown = m_rPlaybackContext.GetSecondaryVideoDisplay();
    const SecondaryVideoInfo video(m_rPlaybackContext);

    BD_LOG(Notification,
           "Sending SecondaryVideoDisplay - video Nr %d, numofVideos %d, async %d, shown: %s",
           video.number, video.count, video.async, TrueOrFalse(shown));

    FireSecondaryVideoDisplay(listeners, video.number, shown);
}

void SecondaryAudioDisplayEvent::Dispatch(Listeners& listeners)
{
    const bool shown = m_rPlaybackContext.GetSecondaryAudioDisplay();
    const SecondaryAudioInfo audio(m_rPlaybackContext);

    BD_LOG(Notification, "Sending SecondaryAudioDisplay - audioNr %d, numOfAudios %d, shown: %s",
           audio.number, audio.count, TrueOrFalse(shown));

    FireSecondaryAudioDisplay(listeners, audio.number, shown);
}

void PipPgTextSelectEvent::Dispatch(Listeners& listeners)
{
    const bool pick = m_rPlaybackContext.GetPipPgTextStSelect();

    BD_LOG(Notification, "Sending PipPgTextSelectEvent - pip pick?: %s", TrueOrFalse(pick));

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::PipPgTextSelect, pick);
}

void TextSubtitleStyleInfoEvent::Dispatch(Listeners& listeners)
{
    const bd::UserStyleNumber style = m_rPlaybackContext.GetCurrentTextSubtitleStyleNumber();

    BD_LOG(Notification, "Sending TextSubtitleStyleInfo - styleNumber: %u", style);

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::TextSubtitleStyleInfo, style);
}

void TextSubtitleStylesAvailableEvent::Dispatch(Listeners& listeners)
{
    const bd::UInt8 numberOfStyles = m_rPlaybackContext.GetNumberOfTextSubtitleStyles();

    BD_LOG(Notification, "Sending TextSubtitleStylesAvailable - numberOfStyles: %u",
           numberOfStyles);

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::TextSubtitleStylesAvailable,
                                     numberOfStyles);
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

void SystemSuspendedEvent::Dispatch(Listeners& listeners)
{
    const bd::DataBlockDef& resumeData = m_rPlaybackContext.GetSystemResumeData();

    BD_LOG(Notification, "Sending SystemSuspended - dataSize: %lu", Lu(resumeData.size));

    bd::EventListenerList_FireParam2(listeners, &INavigatorListener::SystemSuspended,
                                     resumeData.pData, resumeData.size);

    m_rPlaybackContext.CleanupSystemResumeData();
}

void SystemResumedEvent::Dispatch(Listeners& listeners)
{
    const bool playing = m_rPlaybackContext.IsPlayingAfterSystemResume();

    BD_LOG(Notification, "Sending SystemResumed - playing: %s", TrueOrFalse(playing));

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::SystemResumed, playing);

    m_rPlaybackContext.CleanupSystemResumeData();
}

void SystemResumeFailedEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending SystemResumeFailed");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::SystemResumeFailed);

    m_rPlaybackContext.CleanupSystemResumeData();
}

void InteractiveGraphicsVisibleEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending InteractiveGraphicsVisible");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::InteractiveGraphicsVisible);
}

void InteractiveGraphicsInvisibleEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending InteractiveGraphicsInvisible");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::InteractiveGraphicsInvisible);
}

void PopUpMenuAvailableEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending PopUpMenuAvailable");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::PopUpMenuAvailable);
}

void PopUpMenuUnavailableEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending PopUpMenuUnavailable");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::PopUpMenuUnavailable);
}

void AudioInfoChangedEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending AudioChannelsChanged");

    bd::EventListenerList_FireParam2(listeners, &INavigatorListener::AudioInfoChanged, m_IsPrimary,
                                     m_Info);
}

void ButtonActivationBusyEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending ButtonActivationBusy");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::ButtonActivationBusy);
}

void ButtonActivationDoneEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending ButtonActivationDone");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::ButtonActivationDone);
}

void InteractiveGraphicsActiveEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending InteractiveGraphicsActive");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::InteractiveGraphicsActive);
}

void InteractiveGraphicsInactiveEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending InteractiveGraphicsInactive");

    bd::EventListenerList_FireParam0(listeners, &INavigatorListener::InteractiveGraphicsInactive);
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

void CurrentTimePositionEvent::Dispatch(Listeners& listeners)
{
    const bd::TimePosition position = m_rPlaybackContext.GetCurrentTimePosition();

    BD_LOG(HighFrequencyNotification, "Sending CurrentTimePosition - position: %llu",
           Llu(position));

    bd::EventListenerList_FireParam1(listeners, &INavigatorListener::CurrentTimePosition, position);
}

void ExecuteButtonEvent::Dispatch(Listeners& listeners)
{
    IPlaybackContext::RefPtr program;
    bd::UInt32 ticket = 0;
    bd::ButtonId buttonId = 0;
    m_rPlaybackContext.GetExecuteButtonData(program, ticket, buttonId);

    BD_LOG(Notification, "Sending ExecuteButton - ticket: %lu, buttonId: %u", Lu(ticket), buttonId);

    bd::EventListenerList_FireParam3(listeners, &INavigatorListener::ExecuteButton, ticket,
                                     buttonId, program);
}

void PipAvailableEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending PictureInPictureAvailable");

    FirePictureInPictureAvailable(listeners);
}

void PipUnavailableEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending PictureInPictureUnavailable");

    if (AsyncFlags(m_rPlaybackContext).fg2ndVid) {
        BD_LOG(Notification, "Not send unavailable for async 2nd video");
        return;
    }

    FirePictureInPictureUnavailable(listeners);
}

void SecondaryAudioAvailableEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending SecondaryAudioAvailable");

    FireSecondaryAudioAvailable(listeners);
}

void SecondaryAudioUnavailableEvent::Dispatch(Listeners& listeners)
{
    BD_LOG(Notification, "Sending SecondaryAudioUnavailable");

    if (AsyncFlags(m_rPlaybackContext).fg2ndAud) {
        BD_LOG(Notification, "Not send unavailable for async 2nd audio");
        return;
    }

    FireSecondaryAudioUnavailable(listeners);
}

} // namespace bdmv
