#include "samplecallbacks.h"

#include "bd/constants.h"
#include "kits/clientkit/everycallback.h"

namespace bdmvtest
{

namespace
{

using namespace bdmv::callbacks;

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
    std::vector<bdmv::Callback> callbacks = EveryCallback();
    const std::vector<bdmv::Callback> extremes = {
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
    callbacks.insert(callbacks.end(), extremes.begin(), extremes.end());
    return callbacks;
}

} // namespace bdmvtest
