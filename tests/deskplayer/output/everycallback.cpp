#include "everycallback.h"

#include "bd/constants.h"
#include "testkit/fakeplatform.h"

namespace deskplayer
{

namespace
{

class ProgramOfThreeCommands : public bdmv::IProgramData
{
public:
    bd::UInt16 GetNumberOfNavigationCommands() const override { return 3; }
    const bdmv::INavigationCommandData*
    GetNavigationCommandData(CommandIdDef /*commandId*/) const override
    {
        return nullptr;
    }
};

void CallControl(bdmv::INavControlListener& listener)
{
    const bd::UInt8 data[] = {0x00, 0xA5, 0xFF};

    listener.PlayStarted();
    listener.FirstPictureDelivered();
    listener.PlayFailed();
    listener.Paused();
    listener.Continued(bd::PlayDirectionBackward, bd::PlaySpeedFast2);
    listener.Stepped(900001, bd::PlayDirectionForward);
    listener.TriggerTimeReached(bd::TRIGGER_NOTIFY_FROM_CURPOS, 900002);
    listener.TriggerSet(bd::TRIGGER_A, true);
    listener.ZoomModeSet({{1, 2, 3, 4}, {5, 6, 7, 8}, 9});
    listener.Stopped();
    listener.Finished(bdmv::INavControlListener::DataStarvation);
    listener.StillOn();
    listener.StillOff();
    listener.Suspended();
    listener.Resumed();
    listener.ResumeFailed();
    listener.SystemSuspended(data, sizeof data);
    listener.SystemResumed(true);
    listener.SystemResumeFailed();
    listener.JumpOccurred();
    listener.PreloadFailed();
}

void CallSettings(bdmv::INavSettingsListener& listener)
{
    bd::AudioInfoType audio;
    audio.format = bd::AudioFormatAc3;
    audio.sampleRate = bd::AudioSampleRate_48000;
    audio.bitsPerSampling = bd::AudioBitsPerSamplingType24;
    audio.channels = bd::AudioChannelType5_1;
    audio.pid = 0x1100;
    audio.u4AudChannelLayout = 7;

    listener.Playlist(800);
    listener.PlayItem(801, 2, bd::VideoFormatType1080p, bd::VideoAspectRatioType16x9);
    listener.PlayMode(bd::PlayDirectionForward, bd::PlaySpeedSlow1);
    listener.AudioInfo(11);
    listener.VideoInfo(12);
    listener.AngleInfo(13);
    listener.InteractiveGraphicsInfo(14);
    listener.PresentationGraphicsInfo(15, true);
    listener.SecondaryAudioInfo(16);
    listener.SecondaryVideoInfo(17);
    listener.PipPgTextStInfo(18, false);
    listener.AudioInfoChanged(true, audio);
    listener.TextSubtitleStyleInfo(19);
    listener.TextSubtitleStylesAvailable(20);
    listener.UOMask(bdmv::UOMaskTable(0x2100000000000000ULL));
    listener.ChapterNumber(21);
    listener.MarkInfo(802, 22, bd::TimePositionNone);
    listener.CurrentTimePosition(900003);
    listener.PictureInPictureAvailable();
    listener.PictureInPictureUnavailable();
    listener.SecondaryAudioAvailable();
    listener.SecondaryAudioUnavailable();
    listener.PresentationGraphicsDisplay(true);
    listener.SecondaryVideoDisplay(23, true);
    listener.SecondaryAudioDisplay(24, false);
    listener.PipPgTextSelect(true);
}

void CallButton(bdmv::INavButtonListener& listener)
{
    bdmv::IProgramData::RefPtr program(new ProgramOfThreeCommands);

    listener.ExecuteButton(25, 26, program);
}

void CallInteractive(bdmv::INavInteractiveListener& listener)
{
    listener.InteractiveGraphicsVisible();
    listener.InteractiveGraphicsInvisible();
    listener.PopUpMenuAvailable();
    listener.PopUpMenuUnavailable();
    listener.ButtonActivationBusy();
    listener.ButtonActivationDone();
    listener.InteractiveGraphicsActive();
    listener.InteractiveGraphicsInactive();
}

} // namespace

void CallEveryCallback(bdmv::INavigatorListener& listener)
{
    CallControl(listener);
    CallSettings(listener);
    CallButton(listener);
    CallInteractive(listener);
}

} // namespace deskplayer
