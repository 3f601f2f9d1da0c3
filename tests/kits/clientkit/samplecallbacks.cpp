#include "samplecallbacks.h"

#include "bd/constants.h"

namespace bdmvtest
{

namespace
{

using namespace bdmv::callbacks;

const bd::UInt8 g_Block[] = {0x00, 0xA5, 0xFF};

bd::AudioInfoType AudioDetails()
{
    bd::AudioInfoType info;
    info.format = bd::AudioFormatDtsHd_Es_Discrete_6_1_Chan;
    info.sampleRate = bd::AudioSampleRate_192000;
    info.bitsPerSampling = bd::AudioBitsPerSamplingType24;
    info.channels = bd::AudioChannelTypeStereoDolbySurround;
    info.pid = 0x1100;
    info.u4AudChannelLayout = 0xFFFFFFFF;
    return info;
}

bd::AudioInfoType AudioDetailsWithoutNames()
{
    bd::AudioInfoType info;
    info.format = static_cast<bd::AudioFormatType>(-1);
    info.sampleRate = static_cast<bd::AudioSampleRateType>(1000);
    info.bitsPerSampling = static_cast<bd::AudioBitsPerSamplingType>(-2147483647 - 1);
    info.channels = static_cast<bd::AudioChannelType>(2147483647);
    info.pid = 0xFFFF;
    return info;
}

} // namespace

std::vector<bdmv::Callback> SampleCallbacks()
{
    return {
        PlayStarted{},
        FirstPictureDelivered{},
        PlayFailed{},
        Paused{},
        Continued{bd::PlayDirectionBackward, bd::PlaySpeedFast2},
        Stepped{900001, bd::PlayDirectionForward},
        TriggerTimeReached{bd::TRIGGER_NOTIFY_FROM_CURPOS, 900002},
        TriggerSet{bd::TRIGGER_A, true},
        ZoomModeSet{{{1, 2, 3, 4}, {5, 6, 7, 8}, 9}},
        Stopped{},
        Finished{bdmv::INavControlListener::DataStarvation},
        StillOn{},
        StillOff{},
        Suspended{},
        Resumed{},
        ResumeFailed{},
        SystemSuspended{g_Block, sizeof g_Block},
        SystemResumed{true},
        SystemResumeFailed{},
        JumpOccurred{},
        PreloadFailed{},
        Playlist{800},
        PlayItem{801, 2, bd::VideoFormatType1080p, bd::VideoAspectRatioType2_21x1},
        PlayMode{bd::PlayDirectionForward, bd::PlaySpeedSlow1},
        AudioInfo{11},
        VideoInfo{12},
        AngleInfo{13},
        InteractiveGraphicsInfo{14},
        PresentationGraphicsInfo{15, true},
        SecondaryAudioInfo{16},
        SecondaryVideoInfo{17},
        PipPgTextStInfo{18, false},
        AudioInfoChanged{true, AudioDetails()},
        TextSubtitleStyleInfo{19},
        TextSubtitleStylesAvailable{20},
        UOMask{bdmv::UOMaskTable(0x2100000000000000ULL)},
        ChapterNumber{21},
        MarkInfo{802, 22, 27000},
        CurrentTimePosition{900003},
        PictureInPictureAvailable{},
        PictureInPictureUnavailable{},
        SecondaryAudioAvailable{},
        SecondaryAudioUnavailable{},
        PresentationGraphicsDisplay{true},
        SecondaryVideoDisplay{23, true},
        SecondaryAudioDisplay{24, false},
        PipPgTextSelect{true},
        ExecuteButton{25, 26, bdmv::IProgramData::RefPtr(new ProgramOfCommands(3))},
        InteractiveGraphicsVisible{},
        InteractiveGraphicsInvisible{},
        PopUpMenuAvailable{},
        PopUpMenuUnavailable{},
        ButtonActivationBusy{},
        ButtonActivationDone{},
        InteractiveGraphicsActive{},
        InteractiveGraphicsInactive{},

        Continued{static_cast<bd::PlayDirectionDef>(-1), static_cast<bd::PlaySpeedDef>(99)},
        ZoomModeSet{{{65535, 0, 65535, 0}, {0, 65535, 0, 65535}, 0xFFFFFFFF}},
        Finished{static_cast<bdmv::INavControlListener::FinishedReason>(7)},
        SystemSuspended{nullptr, 0},
        Playlist{0xFFFFFFFF},
        AngleInfo{255},
        AudioInfoChanged{false, AudioDetailsWithoutNames()},
        UOMask{bdmv::UOMaskTable()},
        UOMask{bdmv::UOMaskTable(0xFFFFFFFFFFFFFFFFULL)},
        MarkInfo{0xFFFFFFFF, 0xFFFF, bd::TimePositionNone},
        CurrentTimePosition{bd::TimePositionNone},
        CurrentTimePosition{0xFFFFFFFFFFFFFFFEULL},
        CurrentTimePosition{0},
        ExecuteButton{0xFFFFFFFF, 0xFFFF, bdmv::IProgramData::RefPtr()},
        ExecuteButton{0, 0, bdmv::IProgramData::RefPtr(new ProgramOfCommands(65535))},
    };
}

} // namespace bdmvtest
