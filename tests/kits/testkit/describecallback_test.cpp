// Callbacks and enumerators in messages.

#include "testkit/describecallback.h"

#include <gtest/gtest.h>

#include <string>

#include "testkit/fakeplatform.h"

namespace
{

namespace callbacks = bdmv::callbacks;
using bdmvtest::Describe;
using testing::PrintToString;

TEST(DescribeCallback, NamesTheArgumentsOfACallback)
{
    EXPECT_EQ(Describe(bdmv::Callback(callbacks::PlayItem{800, 1, bd::VideoFormatType1080p,
                                                          bd::VideoAspectRatioType16x9})),
              "PlayItem(playListId=800, playItemId=1, videoFormat=1080p, aspectRatio=16:9)");
}

TEST(DescribeCallback, LeavesTheParenthesesOfACallbackWithoutArgumentsEmpty)
{
    EXPECT_EQ(Describe(bdmv::Callback(callbacks::Paused())), "Paused()");
}

TEST(DescribeCallback, ShowsTruthValuesAsWordsAndSmallNumbersInDecimal)
{
    EXPECT_EQ(Describe(bdmv::Callback(callbacks::PresentationGraphicsInfo{2, true})),
              "PresentationGraphicsInfo(number=2, available=true)");
    EXPECT_EQ(Describe(bdmv::Callback(callbacks::TextSubtitleStylesAvailable{65})),
              "TextSubtitleStylesAvailable(numberOfStyles=65)");
}

TEST(DescribeCallback, ShowsAnEnumeratorWithoutANameInDecimal)
{
    EXPECT_EQ(
        Describe(bdmv::Callback(callbacks::PlayMode{bd::PlayDirectionForward, bd::PlaySpeedFast2})),
        "PlayMode(direction=Forward, speed=Fast2)");
    EXPECT_EQ(Describe(bdmv::Callback(callbacks::PlayMode{bd::PlayDirectionForward,
                                                          static_cast<bd::PlaySpeedDef>(99)})),
              "PlayMode(direction=Forward, speed=99)");
}

TEST(DescribeCallback, ListsTheOperationsThatAMaskForbids)
{
    bd::UInt8 field[8] = {};
    bdmv::UOMaskTable none;
    none.Init(field);
    EXPECT_EQ(Describe(bdmv::Callback(callbacks::UOMask{none})), "UOMask(forbidden={})");
    field[0] = 0x01;
    field[1] = 0x80;
    bdmv::UOMaskTable two;
    two.Init(field);
    EXPECT_EQ(Describe(bdmv::Callback(callbacks::UOMask{two})),
              "UOMask(forbidden={Stop, PauseOn})");
    EXPECT_EQ(PrintToString(two), "{Stop, PauseOn}");
}

TEST(DescribeCallback, ShowsBytesInDecimal)
{
    const bd::UInt8 bytes[] = {1, 20, 255};
    EXPECT_EQ(Describe(bdmv::Callback(callbacks::SystemSuspended{bytes, 3})),
              "SystemSuspended(data=bytes 1 20 255, size=3)");
    EXPECT_EQ(Describe(bdmv::Callback(callbacks::SystemSuspended{nullptr, 3})),
              "SystemSuspended(data=null, size=3)");
}

class TwoCommands : public bdmv::IProgramData
{
public:
    bd::UInt16 GetNumberOfNavigationCommands() const override { return 2; }
    const bdmv::INavigationCommandData* GetNavigationCommandData(CommandIdDef) const override
    {
        return nullptr;
    }
};

TEST(DescribeCallback, ShowsTheNumberOfCommandsOfAProgram)
{
    const bdmv::IProgramData::RefPtr program(new TwoCommands);
    EXPECT_EQ(Describe(bdmv::Callback(callbacks::ExecuteButton{7, 3, program})),
              "ExecuteButton(ticket=7, buttonId=3, commands=2)");
    EXPECT_EQ(Describe(bdmv::Callback(callbacks::ExecuteButton{7, 3, nullptr})),
              "ExecuteButton(ticket=7, buttonId=3, commands=null)");
}

TEST(DescribeCallback, ShowsRectanglesAsPositionAndSize)
{
    EXPECT_EQ(
        Describe(bdmv::Callback(callbacks::ZoomModeSet{{{0, 1, 1920, 1080}, {2, 3, 960, 540}, 5}})),
        "ZoomModeSet(clip=(0, 1, 1920, 1080), destination=(2, 3, 960, 540), delay=5)");
}

TEST(DescribeCallback, LetsGoogleTestShowCallbacksAndTheirKinds)
{
    EXPECT_EQ(PrintToString(bdmv::Callback(callbacks::Playlist{800})), "Playlist(playListId=800)");
    EXPECT_EQ(PrintToString(bdmv::CallbackPaused), "Paused");
}

TEST(DescribeCallback, LetsGoogleTestShowEnumeratorsAsASourceWritesThem)
{
    EXPECT_EQ(PrintToString(bd::PlayDirectionBackward), "PlayDirectionBackward");
    EXPECT_EQ(PrintToString(bd::PlaySpeedFast2), "PlaySpeedFast2");
    EXPECT_EQ(PrintToString(bd::TRIGGER_B), "TRIGGER_B");
    EXPECT_EQ(PrintToString(bd::VideoFormatType1080p), "VideoFormatType1080p");
    EXPECT_EQ(PrintToString(bd::VideoAspectRatioType16x9), "VideoAspectRatioType16x9");
    EXPECT_EQ(PrintToString(bd::AudioFormatAc3), "AudioFormatAc3");
    EXPECT_EQ(PrintToString(bd::AudioSampleRate_48000), "AudioSampleRate_48000");
    EXPECT_EQ(PrintToString(bd::AudioBitsPerSamplingType24), "AudioBitsPerSamplingType24");
    EXPECT_EQ(PrintToString(bd::AudioChannelType5_1), "AudioChannelType5_1");
    EXPECT_EQ(PrintToString(bd::UserOperationStop), "UserOperationStop");
    EXPECT_EQ(PrintToString(bdmv::INavControlListener::EndOfMedia), "EndOfMedia");
}

TEST(DescribeCallback, LetsGoogleTestShowStructures)
{
    EXPECT_EQ(PrintToString(bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedSlow1)),
              "(PlayDirectionForward, PlaySpeedSlow1)");
    EXPECT_EQ(PrintToString(bd::ZOOM_PARAM_Def{{0, 1, 2, 3}, {4, 5, 6, 7}, 8}),
              "((0, 1, 2, 3), (4, 5, 6, 7), 8)");
    EXPECT_EQ(PrintToString(bd::AudioInfoType()),
              "(AudioFormatUnknown, AudioSampleRateUnknown, AudioBitsPerSamplingTypeInvalid, "
              "AudioChannelTypeUnknown, 0, 0)");
}

} // namespace
