#include "output/textoutput.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <stdlib.h>
#include <unistd.h>

#include <sstream>

#include "bd/constants.h"
#include "kits/clientkit/everycallback.h"
#include "text/names.h"

namespace deskplayer
{
namespace
{

class TextLines : public testing::Test
{
protected:
    std::ostringstream stream;
    VirtualClock clock;
    TextOutput output{stream, clock, OutputFilter(), false};
    bdmv::INavigatorListener& listener = output;
};

TEST_F(TextLines, PrintsTheTimeAndTheCallback)
{
    clock.Advance(Ticks(((1 * 60 + 2) * 60 + 3) * 45000ULL + 45 * 4 + 44));

    listener.PlayStarted();

    EXPECT_EQ(stream.str(), "01:02:03.004  PlayStarted\n");
}

TEST_F(TextLines, PrintsArgumentsByNameAndEnumerationsByName)
{
    listener.PlayItem(800, 2, bd::VideoFormatType1080p, bd::VideoAspectRatioType16x9);
    listener.TriggerTimeReached(bd::TRIGGER_NOTIFY_FROM_CURPOS, 45000);
    listener.SystemResumed(true);

    EXPECT_EQ(stream.str(), "00:00:00.000  PlayItem                    "
                            "playListId=800 playItemId=2 videoFormat=1080p aspectRatio=16:9\n"
                            "00:00:00.000  TriggerTimeReached          "
                            "type=TRIGGER_NOTIFY_FROM_CURPOS time=00:00:01.000\n"
                            "00:00:00.000  SystemResumed               playing=true\n");
}

TEST_F(TextLines, PrintsTheNumberOfAValueWithoutAName)
{
    listener.Continued(static_cast<bd::PlayDirectionDef>(2), static_cast<bd::PlaySpeedDef>(-1));

    EXPECT_EQ(stream.str(), "00:00:00.000  Continued                   direction=2 speed=-1\n");
}

TEST_F(TextLines, PrintsAMarkWithoutATimeAsNone)
{
    listener.MarkInfo(1, 2, bd::TimePositionNone);

    EXPECT_EQ(stream.str(),
              "00:00:00.000  MarkInfo                    playListId=1 markId=2 time=none\n");
}

TEST_F(TextLines, PrintsStructuresFieldByField)
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

    EXPECT_EQ(stream.str(),
              "00:00:00.000  AudioInfoChanged            isPrimary=true format=Ac3 "
              "sampleRate=48000 bitsPerSample=24 channels=5_1 pid=4352 channelLayout=7\n"
              "00:00:00.000  ZoomModeSet                 clip=3x4+1+2 destination=7x8+5+6 "
              "delay=9\n"
              "00:00:00.000  SystemSuspended             data=00a5ff size=3\n");
}

TEST_F(TextLines, PrintsTheOperationsThatAMaskForbids)
{
    listener.UOMask(bdmv::UOMaskTable(0x2100000000000000ULL));
    listener.UOMask(bdmv::UOMaskTable());

    EXPECT_EQ(stream.str(), "00:00:00.000  UOMask                      "
                            "forbidden=ChapterSearch,Stop\n"
                            "00:00:00.000  UOMask                      forbidden=nothing\n");
}

TEST_F(TextLines, WritesALineForEveryCallbackWithAlignedArguments)
{
    bdmvtest::CallEveryCallback(listener);

    std::istringstream lines(stream.str());
    std::string line;
    for (const std::string_view name : CallbackNames()) {
        ASSERT_TRUE(std::getline(lines, line)) << name;
        const std::string text = line.substr(std::string("00:00:00.000  ").size());
        EXPECT_EQ(text.substr(0, text.find(' ')), name);
        if (text != name) {
            EXPECT_EQ(text.find_first_not_of(' ', name.size()), 28U) << line;
        }
    }
    EXPECT_FALSE(std::getline(lines, line)) << line;
}

TEST(TextOutputFilter, HidesCallbacks)
{
    std::ostringstream stream;
    VirtualClock clock;
    OutputFilter filter;
    filter.KeepInterfaces("button");
    TextOutput output(stream, clock, filter, false);

    bdmvtest::CallEveryCallback(output);

    EXPECT_EQ(stream.str(),
              "00:00:00.000  ExecuteButton               ticket=25 buttonId=26 commands=3\n");
}

class ColouredTextOutput : public testing::Test
{
protected:
    std::ostringstream stream;
    VirtualClock clock;
    TextOutput output{stream, clock, OutputFilter(), true};
    bdmv::INavigatorListener& listener = output;
};

TEST_F(ColouredTextOutput, DimsTheTimeAndTheNamesOfArguments)
{
    listener.AudioInfo(1);

    EXPECT_EQ(stream.str(), "\033[2m00:00:00.000\033[0m  \033[36mAudioInfo\033[0m                  "
                            " \033[2mnumber=\033[0m1\n");
}

TEST_F(ColouredTextOutput, DistinguishesInterfacesByColour)
{
    bdmv::IProgramData::RefPtr none;

    listener.Paused();
    listener.PictureInPictureAvailable();
    listener.ExecuteButton(1, 2, none);
    listener.PopUpMenuAvailable();

    const std::string text = stream.str();
    EXPECT_NE(text.find("\033[32mPaused\033[0m\n"), std::string::npos) << text;
    EXPECT_NE(text.find("\033[36mPictureInPictureAvailable\033[0m\n"), std::string::npos) << text;
    EXPECT_NE(text.find("\033[33mExecuteButton\033[0m "), std::string::npos) << text;
    EXPECT_NE(text.find("\033[35mPopUpMenuAvailable\033[0m\n"), std::string::npos) << text;
}

/** A pseudo-terminal whose output is not read. */
class Terminal
{
public:
    Terminal() : m_FileDescriptor(posix_openpt(O_RDWR | O_NOCTTY)) {}
    ~Terminal() { close(m_FileDescriptor); }
    Terminal(const Terminal&) = delete;
    Terminal& operator=(const Terminal&) = delete;

    int FileDescriptor() const { return m_FileDescriptor; }

private:
    int m_FileDescriptor;
};

TEST(WantsColours, OnATerminal)
{
    const Terminal terminal;
    ASSERT_NE(terminal.FileDescriptor(), -1);

    EXPECT_TRUE(WantsColours(terminal.FileDescriptor(), nullptr, "xterm"));
}

TEST(WantsColours, NotInAFile)
{
    const int file = open("/dev/null", O_WRONLY);
    ASSERT_NE(file, -1);

    EXPECT_FALSE(WantsColours(file, nullptr, "xterm"));

    close(file);
}

TEST(WantsColours, NotIfNoColorHasAValue)
{
    const Terminal terminal;
    ASSERT_NE(terminal.FileDescriptor(), -1);

    EXPECT_FALSE(WantsColours(terminal.FileDescriptor(), "1", "xterm"));
    EXPECT_FALSE(WantsColours(terminal.FileDescriptor(), "0", "xterm"));
}

TEST(WantsColours, NotOnADumbTerminal)
{
    const Terminal terminal;
    ASSERT_NE(terminal.FileDescriptor(), -1);

    EXPECT_FALSE(WantsColours(terminal.FileDescriptor(), nullptr, "dumb"));
    EXPECT_TRUE(WantsColours(terminal.FileDescriptor(), nullptr, nullptr));
}

TEST(WantsColours, IfNoColorIsEmpty)
{
    const Terminal terminal;
    ASSERT_NE(terminal.FileDescriptor(), -1);

    EXPECT_TRUE(WantsColours(terminal.FileDescriptor(), "", "xterm"));
}

} // namespace
} // namespace deskplayer
