#include "output/callbacklistener.h"

#include "text/names.h"

namespace deskplayer
{

namespace
{

std::uint64_t CountCommands(const bdmv::IProgramData::RefPtr& program)
{
    return program ? program->GetNumberOfNavigationCommands() : 0;
}

} // namespace

void CallbackListener::PlayStarted()
{
    OnCallback({CallbackId::PlayStarted, {}});
}

void CallbackListener::FirstPictureDelivered()
{
    OnCallback({CallbackId::FirstPictureDelivered, {}});
}

void CallbackListener::PlayFailed()
{
    OnCallback({CallbackId::PlayFailed, {}});
}

void CallbackListener::Paused()
{
    OnCallback({CallbackId::Paused, {}});
}

void CallbackListener::Continued(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed)
{
    OnCallback(
        {CallbackId::Continued, {{"direction", NameOf(direction)}, {"speed", NameOf(speed)}}});
}

void CallbackListener::Stepped(const bd::TimePosition& position, bd::PlayDirectionDef direction)
{
    OnCallback({CallbackId::Stepped,
                {{"position", Position{position}}, {"direction", NameOf(direction)}}});
}

void CallbackListener::TriggerTimeReached(bd::TriggerType type, const bd::TimePosition& time)
{
    OnCallback(
        {CallbackId::TriggerTimeReached, {{"type", NameOf(type)}, {"time", Position{time}}}});
}

void CallbackListener::TriggerSet(bd::TriggerType type, bool result)
{
    OnCallback({CallbackId::TriggerSet, {{"type", NameOf(type)}, {"result", result}}});
}

void CallbackListener::ZoomModeSet(bd::ZOOM_PARAM_Def zoom)
{
    OnCallback({CallbackId::ZoomModeSet,
                {{"clip", zoom.rClipRectangle},
                 {"destination", zoom.rDestRectangle},
                 {"delay", std::uint64_t{zoom.u4Delay}}}});
}

void CallbackListener::Stopped()
{
    OnCallback({CallbackId::Stopped, {}});
}

void CallbackListener::Finished(FinishedReason reason)
{
    OnCallback({CallbackId::Finished, {{"reason", NameOf(reason)}}});
}

void CallbackListener::StillOn()
{
    OnCallback({CallbackId::StillOn, {}});
}

void CallbackListener::StillOff()
{
    OnCallback({CallbackId::StillOff, {}});
}

void CallbackListener::Suspended()
{
    OnCallback({CallbackId::Suspended, {}});
}

void CallbackListener::Resumed()
{
    OnCallback({CallbackId::Resumed, {}});
}

void CallbackListener::ResumeFailed()
{
    OnCallback({CallbackId::ResumeFailed, {}});
}

void CallbackListener::SystemSuspended(const void* data, bd::UInt32 size)
{
    OnCallback({CallbackId::SystemSuspended,
                {{"data", HexOf(data, size)}, {"size", std::uint64_t{size}}}});
}

void CallbackListener::SystemResumed(bool playing)
{
    OnCallback({CallbackId::SystemResumed, {{"playing", playing}}});
}

void CallbackListener::SystemResumeFailed()
{
    OnCallback({CallbackId::SystemResumeFailed, {}});
}

void CallbackListener::JumpOccurred()
{
    OnCallback({CallbackId::JumpOccurred, {}});
}

void CallbackListener::PreloadFailed()
{
    OnCallback({CallbackId::PreloadFailed, {}});
}

void CallbackListener::Playlist(bd::PlayListIdDef playListId)
{
    OnCallback({CallbackId::Playlist, {{"playListId", std::uint64_t{playListId}}}});
}

void CallbackListener::PlayItem(bd::PlayListIdDef playListId, bd::PlayItemIdDef playItemId,
                                bd::VideoFormatType videoFormat,
                                bd::VideoAspectRatioType aspectRatio)
{
    OnCallback({CallbackId::PlayItem,
                {{"playListId", std::uint64_t{playListId}},
                 {"playItemId", std::uint64_t{playItemId}},
                 {"videoFormat", NameOf(videoFormat)},
                 {"aspectRatio", NameOf(aspectRatio)}}});
}

void CallbackListener::PlayMode(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed)
{
    OnCallback(
        {CallbackId::PlayMode, {{"direction", NameOf(direction)}, {"speed", NameOf(speed)}}});
}

void CallbackListener::AudioInfo(bd::StreamNumberDef number)
{
    OnCallback({CallbackId::AudioInfo, {{"number", std::uint64_t{number}}}});
}

void CallbackListener::VideoInfo(bd::StreamNumberDef number)
{
    OnCallback({CallbackId::VideoInfo, {{"number", std::uint64_t{number}}}});
}

void CallbackListener::AngleInfo(bd::AngleNumberDef number)
{
    OnCallback({CallbackId::AngleInfo, {{"number", std::uint64_t{number}}}});
}

void CallbackListener::InteractiveGraphicsInfo(bd::StreamNumberDef number)
{
    OnCallback({CallbackId::InteractiveGraphicsInfo, {{"number", std::uint64_t{number}}}});
}

void CallbackListener::PresentationGraphicsInfo(bd::StreamNumberDef number, bool available)
{
    OnCallback({CallbackId::PresentationGraphicsInfo,
                {{"number", std::uint64_t{number}}, {"available", available}}});
}

void CallbackListener::SecondaryAudioInfo(bd::StreamNumberDef number)
{
    OnCallback({CallbackId::SecondaryAudioInfo, {{"number", std::uint64_t{number}}}});
}

void CallbackListener::SecondaryVideoInfo(bd::StreamNumberDef number)
{
    OnCallback({CallbackId::SecondaryVideoInfo, {{"number", std::uint64_t{number}}}});
}

void CallbackListener::PipPgTextStInfo(bd::StreamNumberDef number, bool available)
{
    OnCallback({CallbackId::PipPgTextStInfo,
                {{"number", std::uint64_t{number}}, {"available", available}}});
}

void CallbackListener::AudioInfoChanged(bool isPrimary, bd::AudioInfoType info)
{
    OnCallback({CallbackId::AudioInfoChanged,
                {{"isPrimary", isPrimary},
                 {"format", NameOf(info.format)},
                 {"sampleRate", NameOf(info.sampleRate)},
                 {"bitsPerSample", NameOf(info.bitsPerSampling)},
                 {"channels", NameOf(info.channels)},
                 {"pid", std::uint64_t{info.pid}},
                 {"channelLayout", std::uint64_t{info.u4AudChannelLayout}}}});
}

void CallbackListener::TextSubtitleStyleInfo(bd::UserStyleNumber styleNumber)
{
    OnCallback({CallbackId::TextSubtitleStyleInfo, {{"styleNumber", std::uint64_t{styleNumber}}}});
}

void CallbackListener::TextSubtitleStylesAvailable(bd::UInt8 numberOfStyles)
{
    OnCallback({CallbackId::TextSubtitleStylesAvailable,
                {{"numberOfStyles", std::uint64_t{numberOfStyles}}}});
}

void CallbackListener::UOMask(const bdmv::UOMaskTable& mask)
{
    OnCallback({CallbackId::UOMask, {{"forbidden", NamesOf(mask)}}});
}

void CallbackListener::ChapterNumber(const bd::ChapterNumberDef& chapter)
{
    OnCallback({CallbackId::ChapterNumber, {{"chapter", std::uint64_t{chapter}}}});
}

void CallbackListener::MarkInfo(bd::PlayListIdDef playListId, const bd::PlayListMarkIdDef& markId,
                                const bd::TimePosition& time)
{
    OnCallback({CallbackId::MarkInfo,
                {{"playListId", std::uint64_t{playListId}},
                 {"markId", std::uint64_t{markId}},
                 {"time", Position{time}}}});
}

void CallbackListener::CurrentTimePosition(const bd::TimePosition& position)
{
    OnCallback({CallbackId::CurrentTimePosition, {{"position", Position{position}}}});
}

void CallbackListener::PictureInPictureAvailable()
{
    OnCallback({CallbackId::PictureInPictureAvailable, {}});
}

void CallbackListener::PictureInPictureUnavailable()
{
    OnCallback({CallbackId::PictureInPictureUnavailable, {}});
}

void CallbackListener::SecondaryAudioAvailable()
{
    OnCallback({CallbackId::SecondaryAudioAvailable, {}});
}

void CallbackListener::SecondaryAudioUnavailable()
{
    OnCallback({CallbackId::SecondaryAudioUnavailable, {}});
}

void CallbackListener::PresentationGraphicsDisplay(bool shown)
{
    OnCallback({CallbackId::PresentationGraphicsDisplay, {{"shown", shown}}});
}

void CallbackListener::SecondaryVideoDisplay(bd::StreamNumberDef number, bool shown)
{
    OnCallback(
        {CallbackId::SecondaryVideoDisplay, {{"number", std::uint64_t{number}}, {"shown", shown}}});
}

void CallbackListener::SecondaryAudioDisplay(bd::StreamNumberDef number, bool shown)
{
    OnCallback(
        {CallbackId::SecondaryAudioDisplay, {{"number", std::uint64_t{number}}, {"shown", shown}}});
}

void CallbackListener::PipPgTextSelect(bool pick)
{
    OnCallback({CallbackId::PipPgTextSelect, {{"pick", pick}}});
}

void CallbackListener::ExecuteButton(bd::UInt32 ticket, bd::ButtonId buttonId,
                                     bdmv::IProgramData::RefPtr& program)
{
    OnCallback({CallbackId::ExecuteButton,
                {{"ticket", std::uint64_t{ticket}},
                 {"buttonId", std::uint64_t{buttonId}},
                 {"commands", CountCommands(program)}}});
}

void CallbackListener::InteractiveGraphicsVisible()
{
    OnCallback({CallbackId::InteractiveGraphicsVisible, {}});
}

void CallbackListener::InteractiveGraphicsInvisible()
{
    OnCallback({CallbackId::InteractiveGraphicsInvisible, {}});
}

void CallbackListener::PopUpMenuAvailable()
{
    OnCallback({CallbackId::PopUpMenuAvailable, {}});
}

void CallbackListener::PopUpMenuUnavailable()
{
    OnCallback({CallbackId::PopUpMenuUnavailable, {}});
}

void CallbackListener::ButtonActivationBusy()
{
    OnCallback({CallbackId::ButtonActivationBusy, {}});
}

void CallbackListener::ButtonActivationDone()
{
    OnCallback({CallbackId::ButtonActivationDone, {}});
}

void CallbackListener::InteractiveGraphicsActive()
{
    OnCallback({CallbackId::InteractiveGraphicsActive, {}});
}

void CallbackListener::InteractiveGraphicsInactive()
{
    OnCallback({CallbackId::InteractiveGraphicsInactive, {}});
}

} // namespace deskplayer
