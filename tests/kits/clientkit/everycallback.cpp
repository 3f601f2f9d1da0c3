#include "kits/clientkit/everycallback.h"

#include "bd/constants.h"
#include "testkit/fakeplatform.h"

namespace bdmvtest
{

namespace
{

void CallControl(bdmv::INavControlListener& listener)
{
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
    listener.SystemSuspended(StandbyBlock, sizeof StandbyBlock);
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

bdmv::IProgramData::RefPtr MakeProgram()
{
    return new ProgramOfCommands(3);
}

void CallEveryCallback(bdmv::INavigatorListener& listener, bdmv::IProgramData::RefPtr& program)
{
    CallControl(listener);
    CallSettings(listener);
    listener.ExecuteButton(25, 26, program);
    CallInteractive(listener);
}

void CallEveryCallback(bdmv::INavigatorListener& listener)
{
    bdmv::IProgramData::RefPtr program = MakeProgram();
    CallEveryCallback(listener, program);
}

std::vector<bdmv::Callback> EveryCallback()
{
    CollectingListener listener;
    CallEveryCallback(listener);
    return listener.callbacks;
}

} // namespace bdmvtest
