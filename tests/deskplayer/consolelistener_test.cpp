#include "output/consolelistener.h"

#include <gtest/gtest.h>

#include <sstream>

#include "bd/constants.h"

namespace
{

class ConsoleListenerTest : public testing::Test
{
protected:
    std::ostringstream output;
    deskplayer::VirtualClock clock;
    deskplayer::ConsoleListener console{output, clock};
    bdmv::INavigatorListener& listener = console;
};

TEST_F(ConsoleListenerTest, PrintsTheTimeAndTheCallback)
{
    clock.Advance(((1 * 60 + 2) * 60 + 3) * 45000ULL + 45 * 4 + 44);

    listener.PlayStarted();

    EXPECT_EQ(output.str(), "01:02:03.004  PlayStarted\n");
}

TEST_F(ConsoleListenerTest, PrintsArgumentsByNameAndEnumerationsByName)
{
    listener.PlayItem(800, 2, bd::VideoFormatType1080p, bd::VideoAspectRatioType16x9);
    listener.TriggerTimeReached(bd::TRIGGER_NOTIFY_FROM_CURPOS, 45000);
    listener.SystemResumed(true);

    EXPECT_EQ(output.str(), "00:00:00.000  PlayItem                    "
                            "playListId=800 playItemId=2 videoFormat=1080p aspectRatio=16:9\n"
                            "00:00:00.000  TriggerTimeReached          "
                            "type=TRIGGER_NOTIFY_FROM_CURPOS time=00:00:01.000\n"
                            "00:00:00.000  SystemResumed               playing=true\n");
}

TEST_F(ConsoleListenerTest, PrintsTheNumberOfAValueWithoutAName)
{
    listener.Continued(static_cast<bd::PlayDirectionDef>(2), static_cast<bd::PlaySpeedDef>(-1));

    EXPECT_EQ(output.str(), "00:00:00.000  Continued                   direction=2 speed=-1\n");
}

TEST_F(ConsoleListenerTest, PrintsAMarkWithoutATimeAsNone)
{
    listener.MarkInfo(1, 2, bd::TimePositionNone);

    EXPECT_EQ(output.str(),
              "00:00:00.000  MarkInfo                    playListId=1 markId=2 time=none\n");
}

TEST_F(ConsoleListenerTest, PrintsStructuresFieldByField)
{
    bd::AudioInfoType info;
    info.format = bd::AudioFormatAc3;
    info.sampleRate = bd::AudioSampleRate_48000;
    info.bitsPerSampling = bd::AudioBitsPerSamplingType24;
    info.channels = bd::AudioChannelType5_1;
    info.pid = 0x1100;
    info.u4AudChannelLayout = 7;
    const bd::UInt8 data[] = {0x00, 0xA5, 0xFF};

    listener.AudioInfoChanged(true, info);
    listener.ZoomModeSet({{1, 2, 3, 4}, {5, 6, 7, 8}, 9});
    listener.SystemSuspended(data, 3);

    EXPECT_EQ(output.str(),
              "00:00:00.000  AudioInfoChanged            isPrimary=true format=Ac3 "
              "sampleRate=48000 bitsPerSample=24 channels=5_1 pid=4352 channelLayout=7\n"
              "00:00:00.000  ZoomModeSet                 clip=3x4+1+2 destination=7x8+5+6 "
              "delay=9\n"
              "00:00:00.000  SystemSuspended             data=00a5ff size=3\n");
}

TEST_F(ConsoleListenerTest, PrintsTheOperationsThatAMaskForbids)
{
    listener.UOMask(bdmv::UOMaskTable(0x2100000000000000ULL));
    listener.UOMask(bdmv::UOMaskTable());

    EXPECT_EQ(output.str(), "00:00:00.000  UOMask                      "
                            "forbidden=ChapterSearch,Stop\n"
                            "00:00:00.000  UOMask                      forbidden=nothing\n");
}

} // namespace
