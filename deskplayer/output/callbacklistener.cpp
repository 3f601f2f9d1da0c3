#include "output/callbacklistener.h"

#include "output/names.h"

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
    OnCallback({ListenerInterface::Control, "PlayStarted", {}});
}

void CallbackListener::FirstPictureDelivered()
{
    OnCallback({ListenerInterface::Control, "FirstPictureDelivered", {}});
}

void CallbackListener::PlayFailed()
{
    OnCallback({ListenerInterface::Control, "PlayFailed", {}});
}

void CallbackListener::Paused()
{
    OnCallback({ListenerInterface::Control, "Paused", {}});
}

void CallbackListener::Continued(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed)
{
    OnCallback({ListenerInterface::Control,
                "Continued",
                {{"direction", NameOf(direction)}, {"speed", NameOf(speed)}}});
}

void CallbackListener::Stepped(const bd::TimePosition& position, bd::PlayDirectionDef direction)
{
    OnCallback({ListenerInterface::Control,
                "Stepped",
                {{"position", Position{position}}, {"direction", NameOf(direction)}}});
}

void CallbackListener::TriggerTimeReached(bd::TriggerType type, const bd::TimePosition& time)
{
    OnCallback({ListenerInterface::Control,
                "TriggerTimeReached",
                {{"type", NameOf(type)}, {"time", Position{time}}}});
}

void CallbackListener::TriggerSet(bd::TriggerType type, bool result)
{
    OnCallback(
        {ListenerInterface::Control, "TriggerSet", {{"type", NameOf(type)}, {"result", result}}});
}

void CallbackListener::ZoomModeSet(bd::ZOOM_PARAM_Def zoom)
{
    OnCallback({ListenerInterface::Control,
                "ZoomModeSet",
                {{"clip", NameOf(zoom.rClipRectangle)},
                 {"destination", NameOf(zoom.rDestRectangle)},
                 {"delay", std::uint64_t{zoom.u4Delay}}}});
}

void CallbackListener::Stopped()
{
    OnCallback({ListenerInterface::Control, "Stopped", {}});
}

void CallbackListener::Finished(FinishedReason reason)
{
    OnCallback({ListenerInterface::Control, "Finished", {{"reason", NameOf(reason)}}});
}

void CallbackListener::StillOn()
{
    OnCallback({ListenerInterface::Control, "StillOn", {}});
}

void CallbackListener::StillOff()
{
    OnCallback({ListenerInterface::Control, "StillOff", {}});
}

void CallbackListener::Suspended()
{
    OnCallback({ListenerInterface::Control, "Suspended", {}});
}

void CallbackListener::Resumed()
{
    OnCallback({ListenerInterface::Control, "Resumed", {}});
}

void CallbackListener::ResumeFailed()
{
    OnCallback({ListenerInterface::Control, "ResumeFailed", {}});
}

void CallbackListener::SystemSuspended(const void* data, bd::UInt32 size)
{
    OnCallback({ListenerInterface::Control,
                "SystemSuspended",
                {{"data", HexOf(data, size)}, {"size", std::uint64_t{size}}}});
}

void CallbackListener::SystemResumed(bool playing)
{
    OnCallback({ListenerInterface::Control, "SystemResumed", {{"playing", playing}}});
}

void CallbackListener::SystemResumeFailed()
{
    OnCallback({ListenerInterface::Control, "SystemResumeFailed", {}});
}

void CallbackListener::JumpOccurred()
{
    OnCallback({ListenerInterface::Control, "JumpOccurred", {}});
}

void CallbackListener::PreloadFailed()
{
    OnCallback({ListenerInterface::Control, "PreloadFailed", {}});
}

void CallbackListener::Playlist(bd::PlayListIdDef playListId)
{
    OnCallback(
        {ListenerInterface::Settings, "Playlist", {{"playListId", std::uint64_t{playListId}}}});
}

void CallbackListener::PlayItem(bd::PlayListIdDef playListId, bd::PlayItemIdDef playItemId,
                                bd::VideoFormatType videoFormat,
                                bd::VideoAspectRatioType aspectRatio)
{
    OnCallback({ListenerInterface::Settings,
                "PlayItem",
                {{"playListId", std::uint64_t{playListId}},
                 {"playItemId", std::uint64_t{playItemId}},
                 {"videoFormat", NameOf(videoFormat)},
                 {"aspectRatio", NameOf(aspectRatio)}}});
}

void CallbackListener::PlayMode(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed)
{
    OnCallback({ListenerInterface::Settings,
                "PlayMode",
                {{"direction", NameOf(direction)}, {"speed", NameOf(speed)}}});
}

void CallbackListener::AudioInfo(bd::StreamNumberDef number)
{
    OnCallback({ListenerInterface::Settings, "AudioInfo", {{"number", std::uint64_t{number}}}});
}

void CallbackListener::VideoInfo(bd::StreamNumberDef number)
{
    OnCallback({ListenerInterface::Settings, "VideoInfo", {{"number", std::uint64_t{number}}}});
}

void CallbackListener::AngleInfo(bd::AngleNumberDef number)
{
    OnCallback({ListenerInterface::Settings, "AngleInfo", {{"number", std::uint64_t{number}}}});
}

void CallbackListener::InteractiveGraphicsInfo(bd::StreamNumberDef number)
{
    OnCallback({ListenerInterface::Settings,
                "InteractiveGraphicsInfo",
                {{"number", std::uint64_t{number}}}});
}

void CallbackListener::PresentationGraphicsInfo(bd::StreamNumberDef number, bool available)
{
    OnCallback({ListenerInterface::Settings,
                "PresentationGraphicsInfo",
                {{"number", std::uint64_t{number}}, {"available", available}}});
}

void CallbackListener::SecondaryAudioInfo(bd::StreamNumberDef number)
{
    OnCallback(
        {ListenerInterface::Settings, "SecondaryAudioInfo", {{"number", std::uint64_t{number}}}});
}

void CallbackListener::SecondaryVideoInfo(bd::StreamNumberDef number)
{
    OnCallback(
        {ListenerInterface::Settings, "SecondaryVideoInfo", {{"number", std::uint64_t{number}}}});
}

void CallbackListener::PipPgTextStInfo(bd::StreamNumberDef number, bool available)
{
    OnCallback({ListenerInterface::Settings,
                "PipPgTextStInfo",
                {{"number", std::uint64_t{number}}, {"available", available}}});
}

void CallbackListener::AudioInfoChanged(bool isPrimary, bd::AudioInfoType info)
{
    OnCallback({ListenerInterface::Settings,
                "AudioInfoChanged",
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
    OnCallback({ListenerInterface::Settings,
                "TextSubtitleStyleInfo",
                {{"styleNumber", std::uint64_t{styleNumber}}}});
}

void CallbackListener::TextSubtitleStylesAvailable(bd::UInt8 numberOfStyles)
{
    OnCallback({ListenerInterface::Settings,
                "TextSubtitleStylesAvailable",
                {{"numberOfStyles", std::uint64_t{numberOfStyles}}}});
}

void CallbackListener::UOMask(const bdmv::UOMaskTable& mask)
{
    OnCallback({ListenerInterface::Settings, "UOMask", {{"forbidden", NameOf(mask)}}});
}

void CallbackListener::ChapterNumber(const bd::ChapterNumberDef& chapter)
{
    OnCallback(
        {ListenerInterface::Settings, "ChapterNumber", {{"chapter", std::uint64_t{chapter}}}});
}

void CallbackListener::MarkInfo(bd::PlayListIdDef playListId, const bd::PlayListMarkIdDef& markId,
                                const bd::TimePosition& time)
{
    OnCallback({ListenerInterface::Settings,
                "MarkInfo",
                {{"playListId", std::uint64_t{playListId}},
                 {"markId", std::uint64_t{markId}},
                 {"time", Position{time}}}});
}

void CallbackListener::CurrentTimePosition(const bd::TimePosition& position)
{
    OnCallback(
        {ListenerInterface::Settings, "CurrentTimePosition", {{"position", Position{position}}}});
}

void CallbackListener::PictureInPictureAvailable()
{
    OnCallback({ListenerInterface::Settings, "PictureInPictureAvailable", {}});
}

void CallbackListener::PictureInPictureUnavailable()
{
    OnCallback({ListenerInterface::Settings, "PictureInPictureUnavailable", {}});
}

void CallbackListener::SecondaryAudioAvailable()
{
    OnCallback({ListenerInterface::Settings, "SecondaryAudioAvailable", {}});
}

void CallbackListener::SecondaryAudioUnavailable()
{
    OnCallback({ListenerInterface::Settings, "SecondaryAudioUnavailable", {}});
}

void CallbackListener::PresentationGraphicsDisplay(bool shown)
{
    OnCallback({ListenerInterface::Settings, "PresentationGraphicsDisplay", {{"shown", shown}}});
}

void CallbackListener::SecondaryVideoDisplay(bd::StreamNumberDef number, bool shown)
{
    OnCallback({ListenerInterface::Settings,
                "SecondaryVideoDisplay",
                {{"number", std::uint64_t{number}}, {"shown", shown}}});
}

void CallbackListener::SecondaryAudioDisplay(bd::StreamNumberDef number, bool shown)
{
    OnCallback({ListenerInterface::Settings,
                "SecondaryAudioDisplay",
                {{"number", std::uint64_t{number}}, {"shown", shown}}});
}

void CallbackListener::PipPgTextSelect(bool pick)
{
    OnCallback({ListenerInterface::Settings, "PipPgTextSelect", {{"pick", pick}}});
}

void CallbackListener::ExecuteButton(bd::UInt32 ticket, bd::ButtonId buttonId,
                                     bdmv::IProgramData::RefPtr& program)
{
    OnCallback({ListenerInterface::Button,
                "ExecuteButton",
                {{"ticket", std::uint64_t{ticket}},
                 {"buttonId", std::uint64_t{buttonId}},
                 {"commands", CountCommands(program)}}});
}

void CallbackListener::InteractiveGraphicsVisible()
{
    OnCallback({ListenerInterface::Interactive, "InteractiveGraphicsVisible", {}});
}

void CallbackListener::InteractiveGraphicsInvisible()
{
    OnCallback({ListenerInterface::Interactive, "InteractiveGraphicsInvisible", {}});
}

void CallbackListener::PopUpMenuAvailable()
{
    OnCallback({ListenerInterface::Interactive, "PopUpMenuAvailable", {}});
}

void CallbackListener::PopUpMenuUnavailable()
{
    OnCallback({ListenerInterface::Interactive, "PopUpMenuUnavailable", {}});
}

void CallbackListener::ButtonActivationBusy()
{
    OnCallback({ListenerInterface::Interactive, "ButtonActivationBusy", {}});
}

void CallbackListener::ButtonActivationDone()
{
    OnCallback({ListenerInterface::Interactive, "ButtonActivationDone", {}});
}

void CallbackListener::InteractiveGraphicsActive()
{
    OnCallback({ListenerInterface::Interactive, "InteractiveGraphicsActive", {}});
}

void CallbackListener::InteractiveGraphicsInactive()
{
    OnCallback({ListenerInterface::Interactive, "InteractiveGraphicsInactive", {}});
}

} // namespace deskplayer
