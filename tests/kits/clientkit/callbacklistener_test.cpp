// Every slot becomes the value of its callback, and delivering the value calls the slot again.

#include <gtest/gtest.h>

#include <functional>
#include <random>
#include <stdexcept>
#include <vector>

#include "bd/constants.h"
#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "kits/clientkit/changedarguments.h"
#include "kits/clientkit/everycallback.h"
#include "testkit/recordinglistener.h"

namespace bdmv
{
namespace
{

using namespace callbacks;

/** The values of CallEveryCallback(), written out. */
std::vector<Callback> ExpectedValues(const IProgramData::RefPtr& program)
{
    bd::AudioInfoType audio;
    audio.format = bd::AudioFormatAc3;
    audio.sampleRate = bd::AudioSampleRate_48000;
    audio.bitsPerSampling = bd::AudioBitsPerSamplingType24;
    audio.channels = bd::AudioChannelType5_1;
    audio.pid = 0x1100;
    audio.u4AudChannelLayout = 7;

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
        Finished{INavControlListener::DataStarvation},
        StillOn{},
        StillOff{},
        Suspended{},
        Resumed{},
        ResumeFailed{},
        SystemSuspended{bdmvtest::StandbyBlock, 3},
        SystemResumed{true},
        SystemResumeFailed{},
        JumpOccurred{},
        PreloadFailed{},
        Playlist{800},
        PlayItem{801, 2, bd::VideoFormatType1080p, bd::VideoAspectRatioType16x9},
        PlayMode{bd::PlayDirectionForward, bd::PlaySpeedSlow1},
        AudioInfo{11},
        VideoInfo{12},
        AngleInfo{13},
        InteractiveGraphicsInfo{14},
        PresentationGraphicsInfo{15, true},
        SecondaryAudioInfo{16},
        SecondaryVideoInfo{17},
        PipPgTextStInfo{18, false},
        AudioInfoChanged{true, audio},
        TextSubtitleStyleInfo{19},
        TextSubtitleStylesAvailable{20},
        UOMask{UOMaskTable(0x2100000000000000ULL)},
        ChapterNumber{21},
        MarkInfo{802, 22, bd::TimePositionNone},
        CurrentTimePosition{900003},
        PictureInPictureAvailable{},
        PictureInPictureUnavailable{},
        SecondaryAudioAvailable{},
        SecondaryAudioUnavailable{},
        PresentationGraphicsDisplay{true},
        SecondaryVideoDisplay{23, true},
        SecondaryAudioDisplay{24, false},
        PipPgTextSelect{true},
        ExecuteButton{25, 26, program},
        InteractiveGraphicsVisible{},
        InteractiveGraphicsInvisible{},
        PopUpMenuAvailable{},
        PopUpMenuUnavailable{},
        ButtonActivationBusy{},
        ButtonActivationDone{},
        InteractiveGraphicsActive{},
        InteractiveGraphicsInactive{},
    };
}

/** Delivers a value to a CallbackListener and returns what it receives. */
Callback Delivered(const Callback& callback)
{
    bdmvtest::CollectingListener listener;
    Deliver(callback, listener);
    EXPECT_EQ(1U, listener.callbacks.size()) << NameOf(callback.Id());
    return listener.callbacks.front();
}

void ExpectDeliveredAsTheyAre(const std::function<bd::UInt64()>& numbers)
{
    for (const Callback& callback : bdmvtest::EveryCallback()) {
        const Callback other = bdmvtest::WithNumbers(callback, numbers);
        EXPECT_TRUE(Delivered(other) == other) << NameOf(callback.Id());
    }
}

TEST(CallbackListener, MakesTheValueOfEveryCallback)
{
    IProgramData::RefPtr program = bdmvtest::MakeProgram();
    bdmvtest::CollectingListener listener;
    bdmvtest::CallEveryCallback(listener, program);
    const std::vector<Callback> expected = ExpectedValues(program);

    ASSERT_EQ(std::size_t{Callback__sizeof}, expected.size());
    ASSERT_EQ(expected.size(), listener.callbacks.size());
    for (std::size_t id = 0; id < expected.size(); ++id) {
        EXPECT_EQ(id, static_cast<std::size_t>(listener.callbacks[id].Id()));
        EXPECT_TRUE(expected[id] == listener.callbacks[id]) << NameOf(expected[id].Id());
    }
}

TEST(CallbackListener, LeavesTheProgramOfTheCallerAlone)
{
    IProgramData::RefPtr program = bdmvtest::MakeProgram();
    bdmvtest::CollectingListener listener;

    listener.ExecuteButton(1, 2, program);

    EXPECT_EQ(2, program.GetCount());
}

TEST(Deliver, CallsTheSlotOfEveryCallbackWithItsArguments)
{
    bdmvtest::Journal journal;
    bdmvtest::RecordingListener listener(journal, "listener");
    IProgramData::RefPtr program = bdmvtest::MakeProgram();
    const std::vector<Callback> callbacks = ExpectedValues(program);
    for (const Callback& callback : callbacks) {
        Deliver(callback, listener);
    }
    const std::string delivered = journal.Take();

    const IProgramData::RefPtr copy(program); // a delivery makes one as well
    bdmvtest::CallEveryCallback(listener, program);

    EXPECT_EQ(journal.Take(), delivered);
}

TEST(Deliver, KeepsNumbersThatAreZero)
{
    ExpectDeliveredAsTheyAre([] { return 0; });
}

TEST(Deliver, KeepsNumbersWithAllBitsSet)
{
    ExpectDeliveredAsTheyAre([] { return ~bd::UInt64(0); });
}

TEST(Deliver, KeepsRandomNumbers)
{
    std::mt19937_64 random(56);
    for (int round = 0; round < 100; ++round) {
        ExpectDeliveredAsTheyAre(std::ref(random));
    }
}

TEST(Deliver, KeepsTheProgramWhenTheListenerResetsIt)
{
    class ResettingListener : public NavigatorListenerAdapter
    {
    public:
        void ExecuteButton(bd::UInt32, bd::ButtonId, IProgramData::RefPtr& program) override
        {
            program = nullptr;
        }
    } listener;
    const IProgramData::RefPtr program = bdmvtest::MakeProgram();
    const Callback callback = callbacks::ExecuteButton{1, 2, program};

    Deliver(callback, listener);

    EXPECT_EQ(program.Get(), callback.As<ExecuteButton>()->program.Get());
    EXPECT_EQ(2, program.GetCount());
}

TEST(Deliver, PassesAnExceptionOn)
{
    class ThrowingListener : public NavigatorListenerAdapter
    {
    public:
        void Paused() override { throw std::runtime_error("paused"); }
    } listener;

    EXPECT_THROW(Deliver(Paused{}, listener), std::runtime_error);
}

} // namespace
} // namespace bdmv
