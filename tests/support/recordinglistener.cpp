#include "support/recordinglistener.h"

#include <utility>

#include "support/describe.h"

namespace bdmvtest
{

RecordingListener::RecordingListener(Journal& journal, std::string name)
    : m_rJournal(journal), m_Name(std::move(name))
{
}

void RecordingListener::PlayStarted()
{
    Record(DescribeCall("PlayStarted"));
}

void RecordingListener::FirstPictureDelivered()
{
    Record(DescribeCall("FirstPictureDelivered"));
}

void RecordingListener::PlayFailed()
{
    Record(DescribeCall("PlayFailed"));
}

void RecordingListener::Paused()
{
    Record(DescribeCall("Paused"));
}

void RecordingListener::Continued(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed)
{
    Record(DescribeCall("Continued", direction, speed));
}

void RecordingListener::Stepped(const bd::TimePosition& position, bd::PlayDirectionDef direction)
{
    Record(DescribeCall("Stepped", position, direction));
}

void RecordingListener::TriggerTimeReached(bd::TriggerType type, const bd::TimePosition& time)
{
    Record(DescribeCall("TriggerTimeReached", type, time));
}

void RecordingListener::TriggerSet(bd::TriggerType type, bool result)
{
    Record(DescribeCall("TriggerSet", type, result));
}

void RecordingListener::ZoomModeSet(bd::ZOOM_PARAM_Def zoom)
{
    Record(DescribeCall("ZoomModeSet", zoom));
}

void RecordingListener::Stopped()
{
    Record(DescribeCall("Stopped"));
}

void RecordingListener::Finished(FinishedReason reason)
{
    Record(DescribeCall("Finished", reason));
}

void RecordingListener::StillOn()
{
    Record(DescribeCall("StillOn"));
}

void RecordingListener::StillOff()
{
    Record(DescribeCall("StillOff"));
}

void RecordingListener::Suspended()
{
    Record(DescribeCall("Suspended"));
}

void RecordingListener::Resumed()
{
    Record(DescribeCall("Resumed"));
}

void RecordingListener::ResumeFailed()
{
    Record(DescribeCall("ResumeFailed"));
}

void RecordingListener::SystemSuspended(const void* data, bd::UInt32 size)
{
    Record("SystemSuspended(" + DescribeBytes(data, size) + ")");
}

void RecordingListener::SystemResumed(bool playing)
{
    Record(DescribeCall("SystemResumed", playing));
}

void RecordingListener::SystemResumeFailed()
{
    Record(DescribeCall("SystemResumeFailed"));
}

void RecordingListener::JumpOccurred()
{
    Record(DescribeCall("JumpOccurred"));
}

void RecordingListener::PreloadFailed()
{
    Record(DescribeCall("PreloadFailed"));
}

void RecordingListener::Playlist(bd::PlayListIdDef playListId)
{
    Record(DescribeCall("Playlist", playListId));
}

void RecordingListener::PlayItem(bd::PlayListIdDef playListId, bd::PlayItemIdDef playItemId,
                                 bd::VideoFormatType videoFormat,
                                 bd::VideoAspectRatioType aspectRatio)
{
    Record(DescribeCall("PlayItem", playListId, playItemId, videoFormat, aspectRatio));
}

void RecordingListener::PlayMode(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed)
{
    Record(DescribeCall("PlayMode", direction, speed));
}

void RecordingListener::AudioInfo(bd::StreamNumberDef number)
{
    Record(DescribeCall("AudioInfo", number));
}

void RecordingListener::VideoInfo(bd::StreamNumberDef number)
{
    Record(DescribeCall("VideoInfo", number));
}

void RecordingListener::AngleInfo(bd::AngleNumberDef number)
{
    Record(DescribeCall("AngleInfo", number));
}

void RecordingListener::InteractiveGraphicsInfo(bd::StreamNumberDef number)
{
    Record(DescribeCall("InteractiveGraphicsInfo", number));
}

void RecordingListener::PresentationGraphicsInfo(bd::StreamNumberDef number, bool available)
{
    Record(DescribeCall("PresentationGraphicsInfo", number, available));
}

void RecordingListener::SecondaryAudioInfo(bd::StreamNumberDef number)
{
    Record(DescribeCall("SecondaryAudioInfo", number));
}

void RecordingListener::SecondaryVideoInfo(bd::StreamNumberDef number)
{
    Record(DescribeCall("SecondaryVideoInfo", number));
}

void RecordingListener::PipPgTextStInfo(bd::StreamNumberDef number, bool available)
{
    Record(DescribeCall("PipPgTextStInfo", number, available));
}

void RecordingListener::AudioInfoChanged(bool isPrimary, bd::AudioInfoType info)
{
    Record(DescribeCall("AudioInfoChanged", isPrimary, info));
}

void RecordingListener::TextSubtitleStyleInfo(bd::UserStyleNumber styleNumber)
{
    Record(DescribeCall("TextSubtitleStyleInfo", styleNumber));
}

void RecordingListener::TextSubtitleStylesAvailable(bd::UInt8 numberOfStyles)
{
    Record(DescribeCall("TextSubtitleStylesAvailable", numberOfStyles));
}

void RecordingListener::UOMask(const bdmv::UOMaskTable& mask)
{
    Record(DescribeCall("UOMask", mask));
}

void RecordingListener::ChapterNumber(const bd::ChapterNumberDef& chapter)
{
    Record(DescribeCall("ChapterNumber", chapter));
}

void RecordingListener::MarkInfo(bd::PlayListIdDef playListId, const bd::PlayListMarkIdDef& markId,
                                 const bd::TimePosition& time)
{
    Record(DescribeCall("MarkInfo", playListId, markId, time));
}

void RecordingListener::CurrentTimePosition(const bd::TimePosition& position)
{
    Record(DescribeCall("CurrentTimePosition", position));
}

void RecordingListener::PictureInPictureAvailable()
{
    Record(DescribeCall("PictureInPictureAvailable"));
}

void RecordingListener::PictureInPictureUnavailable()
{
    Record(DescribeCall("PictureInPictureUnavailable"));
}

void RecordingListener::SecondaryAudioAvailable()
{
    Record(DescribeCall("SecondaryAudioAvailable"));
}

void RecordingListener::SecondaryAudioUnavailable()
{
    Record(DescribeCall("SecondaryAudioUnavailable"));
}

void RecordingListener::PresentationGraphicsDisplay(bool shown)
{
    Record(DescribeCall("PresentationGraphicsDisplay", shown));
}

void RecordingListener::SecondaryVideoDisplay(bd::StreamNumberDef number, bool shown)
{
    Record(DescribeCall("SecondaryVideoDisplay", number, shown));
}

void RecordingListener::SecondaryAudioDisplay(bd::StreamNumberDef number, bool shown)
{
    Record(DescribeCall("SecondaryAudioDisplay", number, shown));
}

void RecordingListener::PipPgTextSelect(bool pick)
{
    Record(DescribeCall("PipPgTextSelect", pick));
}

void RecordingListener::ExecuteButton(bd::UInt32 ticket, bd::ButtonId buttonId,
                                      bdmv::IProgramData::RefPtr& program)
{
    Record(DescribeCall("ExecuteButton", ticket, buttonId, program));
}

void RecordingListener::InteractiveGraphicsVisible()
{
    Record(DescribeCall("InteractiveGraphicsVisible"));
}

void RecordingListener::InteractiveGraphicsInvisible()
{
    Record(DescribeCall("InteractiveGraphicsInvisible"));
}

void RecordingListener::PopUpMenuAvailable()
{
    Record(DescribeCall("PopUpMenuAvailable"));
}

void RecordingListener::PopUpMenuUnavailable()
{
    Record(DescribeCall("PopUpMenuUnavailable"));
}

void RecordingListener::ButtonActivationBusy()
{
    Record(DescribeCall("ButtonActivationBusy"));
}

void RecordingListener::ButtonActivationDone()
{
    Record(DescribeCall("ButtonActivationDone"));
}

void RecordingListener::InteractiveGraphicsActive()
{
    Record(DescribeCall("InteractiveGraphicsActive"));
}

void RecordingListener::InteractiveGraphicsInactive()
{
    Record(DescribeCall("InteractiveGraphicsInactive"));
}

void RecordingListener::Record(const std::string& callback)
{
    m_rJournal.Add(m_Name + "." + callback);
    if (onCallback) {
        onCallback(callback);
    }
}

} // namespace bdmvtest
