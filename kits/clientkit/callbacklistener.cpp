#include "clientkit/callback.h"

namespace bdmv
{

void CallbackListener::PlayStarted()
{
    OnCallback(callbacks::PlayStarted{});
}

void CallbackListener::FirstPictureDelivered()
{
    OnCallback(callbacks::FirstPictureDelivered{});
}

void CallbackListener::PlayFailed()
{
    OnCallback(callbacks::PlayFailed{});
}

void CallbackListener::Paused()
{
    OnCallback(callbacks::Paused{});
}

void CallbackListener::Continued(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed)
{
    OnCallback(callbacks::Continued{direction, speed});
}

void CallbackListener::Stepped(const bd::TimePosition& position, bd::PlayDirectionDef direction)
{
    OnCallback(callbacks::Stepped{position, direction});
}

void CallbackListener::TriggerTimeReached(bd::TriggerType type, const bd::TimePosition& time)
{
    OnCallback(callbacks::TriggerTimeReached{type, time});
}

void CallbackListener::TriggerSet(bd::TriggerType type, bool result)
{
    OnCallback(callbacks::TriggerSet{type, result});
}

void CallbackListener::ZoomModeSet(bd::ZOOM_PARAM_Def zoom)
{
    OnCallback(callbacks::ZoomModeSet{zoom});
}

void CallbackListener::Stopped()
{
    OnCallback(callbacks::Stopped{});
}

void CallbackListener::Finished(FinishedReason reason)
{
    OnCallback(callbacks::Finished{reason});
}

void CallbackListener::StillOn()
{
    OnCallback(callbacks::StillOn{});
}

void CallbackListener::StillOff()
{
    OnCallback(callbacks::StillOff{});
}

void CallbackListener::Suspended()
{
    OnCallback(callbacks::Suspended{});
}

void CallbackListener::Resumed()
{
    OnCallback(callbacks::Resumed{});
}

void CallbackListener::ResumeFailed()
{
    OnCallback(callbacks::ResumeFailed{});
}

void CallbackListener::SystemSuspended(const void* data, bd::UInt32 size)
{
    OnCallback(callbacks::SystemSuspended{data, size});
}

void CallbackListener::SystemResumed(bool playing)
{
    OnCallback(callbacks::SystemResumed{playing});
}

void CallbackListener::SystemResumeFailed()
{
    OnCallback(callbacks::SystemResumeFailed{});
}

void CallbackListener::JumpOccurred()
{
    OnCallback(callbacks::JumpOccurred{});
}

void CallbackListener::PreloadFailed()
{
    OnCallback(callbacks::PreloadFailed{});
}

void CallbackListener::Playlist(bd::PlayListIdDef playListId)
{
    OnCallback(callbacks::Playlist{playListId});
}

void CallbackListener::PlayItem(bd::PlayListIdDef playListId, bd::PlayItemIdDef playItemId,
                                bd::VideoFormatType videoFormat,
                                bd::VideoAspectRatioType aspectRatio)
{
    OnCallback(callbacks::PlayItem{playListId, playItemId, videoFormat, aspectRatio});
}

void CallbackListener::PlayMode(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed)
{
    OnCallback(callbacks::PlayMode{direction, speed});
}

void CallbackListener::AudioInfo(bd::StreamNumberDef number)
{
    OnCallback(callbacks::AudioInfo{number});
}

void CallbackListener::VideoInfo(bd::StreamNumberDef number)
{
    OnCallback(callbacks::VideoInfo{number});
}

void CallbackListener::AngleInfo(bd::AngleNumberDef number)
{
    OnCallback(callbacks::AngleInfo{number});
}

void CallbackListener::InteractiveGraphicsInfo(bd::StreamNumberDef number)
{
    OnCallback(callbacks::InteractiveGraphicsInfo{number});
}

void CallbackListener::PresentationGraphicsInfo(bd::StreamNumberDef number, bool available)
{
    OnCallback(callbacks::PresentationGraphicsInfo{number, available});
}

void CallbackListener::SecondaryAudioInfo(bd::StreamNumberDef number)
{
    OnCallback(callbacks::SecondaryAudioInfo{number});
}

void CallbackListener::SecondaryVideoInfo(bd::StreamNumberDef number)
{
    OnCallback(callbacks::SecondaryVideoInfo{number});
}

void CallbackListener::PipPgTextStInfo(bd::StreamNumberDef number, bool available)
{
    OnCallback(callbacks::PipPgTextStInfo{number, available});
}

void CallbackListener::AudioInfoChanged(bool isPrimary, bd::AudioInfoType info)
{
    OnCallback(callbacks::AudioInfoChanged{isPrimary, info});
}

void CallbackListener::TextSubtitleStyleInfo(bd::UserStyleNumber styleNumber)
{
    OnCallback(callbacks::TextSubtitleStyleInfo{styleNumber});
}

void CallbackListener::TextSubtitleStylesAvailable(bd::UInt8 numberOfStyles)
{
    OnCallback(callbacks::TextSubtitleStylesAvailable{numberOfStyles});
}

void CallbackListener::UOMask(const UOMaskTable& mask)
{
    OnCallback(callbacks::UOMask{mask});
}

void CallbackListener::ChapterNumber(const bd::ChapterNumberDef& chapter)
{
    OnCallback(callbacks::ChapterNumber{chapter});
}

void CallbackListener::MarkInfo(bd::PlayListIdDef playListId, const bd::PlayListMarkIdDef& markId,
                                const bd::TimePosition& time)
{
    OnCallback(callbacks::MarkInfo{playListId, markId, time});
}

void CallbackListener::CurrentTimePosition(const bd::TimePosition& position)
{
    OnCallback(callbacks::CurrentTimePosition{position});
}

void CallbackListener::PictureInPictureAvailable()
{
    OnCallback(callbacks::PictureInPictureAvailable{});
}

void CallbackListener::PictureInPictureUnavailable()
{
    OnCallback(callbacks::PictureInPictureUnavailable{});
}

void CallbackListener::SecondaryAudioAvailable()
{
    OnCallback(callbacks::SecondaryAudioAvailable{});
}

void CallbackListener::SecondaryAudioUnavailable()
{
    OnCallback(callbacks::SecondaryAudioUnavailable{});
}

void CallbackListener::PresentationGraphicsDisplay(bool shown)
{
    OnCallback(callbacks::PresentationGraphicsDisplay{shown});
}

void CallbackListener::SecondaryVideoDisplay(bd::StreamNumberDef number, bool shown)
{
    OnCallback(callbacks::SecondaryVideoDisplay{number, shown});
}

void CallbackListener::SecondaryAudioDisplay(bd::StreamNumberDef number, bool shown)
{
    OnCallback(callbacks::SecondaryAudioDisplay{number, shown});
}

void CallbackListener::PipPgTextSelect(bool pick)
{
    OnCallback(callbacks::PipPgTextSelect{pick});
}

void CallbackListener::ExecuteButton(bd::UInt32 ticket, bd::ButtonId buttonId,
                                     IProgramData::RefPtr& program)
{
    OnCallback(callbacks::ExecuteButton{ticket, buttonId, program});
}

void CallbackListener::InteractiveGraphicsVisible()
{
    OnCallback(callbacks::InteractiveGraphicsVisible{});
}

void CallbackListener::InteractiveGraphicsInvisible()
{
    OnCallback(callbacks::InteractiveGraphicsInvisible{});
}

void CallbackListener::PopUpMenuAvailable()
{
    OnCallback(callbacks::PopUpMenuAvailable{});
}

void CallbackListener::PopUpMenuUnavailable()
{
    OnCallback(callbacks::PopUpMenuUnavailable{});
}

void CallbackListener::ButtonActivationBusy()
{
    OnCallback(callbacks::ButtonActivationBusy{});
}

void CallbackListener::ButtonActivationDone()
{
    OnCallback(callbacks::ButtonActivationDone{});
}

void CallbackListener::InteractiveGraphicsActive()
{
    OnCallback(callbacks::InteractiveGraphicsActive{});
}

void CallbackListener::InteractiveGraphicsInactive()
{
    OnCallback(callbacks::InteractiveGraphicsInactive{});
}

} // namespace bdmv
