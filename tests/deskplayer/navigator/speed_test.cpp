#include "navigator/playspeed.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>

#include "../testdesk.h"

namespace deskplayer
{

namespace
{

bd::PlayMode Forward(bd::PlaySpeedDef speed)
{
    return bd::PlayMode(bd::PlayDirectionForward, speed);
}

bd::PlayMode Backward(bd::PlaySpeedDef speed)
{
    return bd::PlayMode(bd::PlayDirectionBackward, speed);
}

TEST(PlaySpeed, HasARatioForEveryStep)
{
    const SpeedRatio ratios[] = {{1, 32}, {1, 16}, {1, 8},  {1, 4},   {1, 2},   {1, 1},
                                 {2, 1},  {4, 1},  {8, 1},  {16, 1},  {32, 1},  {48, 1},
                                 {64, 1}, {80, 1}, {96, 1}, {112, 1}, {120, 1}, {128, 1}};
    for (int step = bd::PlaySpeedSlow5; step <= bd::PlaySpeedFast12; ++step) {
        SCOPED_TRACE(step);
        const SpeedRatio ratio = RatioOf(static_cast<bd::PlaySpeedDef>(step));
        EXPECT_EQ(ratio.played, ratios[step].played);
        EXPECT_EQ(ratio.passed, ratios[step].passed);
    }
}

TEST(PlaySpeed, IsNormalForAnUnknownStep)
{
    for (const int step : {-1, 18, 1000000}) {
        const SpeedRatio ratio = RatioOf(static_cast<bd::PlaySpeedDef>(step));
        EXPECT_EQ(ratio.played, 1);
        EXPECT_EQ(ratio.passed, 1);
    }
}

TEST(Speed, TakesEffectAtOnceWhilePlaying)
{
    TestDesk desk(ListOf({Item(100)}));
    desk.Start(Second);

    EXPECT_TRUE(desk.navigator.SetPlayMode(Forward(bd::PlaySpeedFast2)).IsDone());
    desk.navigator.Advance(Second / 2);

    EXPECT_EQ(desk.Take(), "1 PlayMode(PlayDirectionForward, PlaySpeedFast2)\n"
                           "1+11250 CurrentTimePosition(90000)\n"
                           "1+22500 CurrentTimePosition(135000)\n");
}

TEST(Speed, IsNotAnnouncedAgainIfUnchanged)
{
    TestDesk desk(ListOf({Item(100)}));
    desk.Start();
    desk.Do(desk.navigator.SetPlayMode(Forward(bd::PlaySpeedFast2)));

    EXPECT_TRUE(desk.navigator.SetPlayMode(Forward(bd::PlaySpeedFast2)).IsDone());

    EXPECT_EQ(desk.Take(), "");
}

TEST(Speed, TakesEffectWithContinueWhilePaused)
{
    TestDesk desk(ListOf({Item(100)}));
    desk.Start();
    desk.Do(desk.navigator.Pause());

    EXPECT_TRUE(desk.navigator.SetPlayMode(Forward(bd::PlaySpeedSlow1)).IsDone());
    EXPECT_EQ(desk.Take(), "");
    EXPECT_EQ(desk.navigator.Context().GetPlayMode(), Forward(bd::PlaySpeedSlow1));
    EXPECT_EQ(desk.navigator.Context().GetCurrentPlayMode(), bd::PlayMode());

    desk.navigator.Continue();
    EXPECT_EQ(desk.Take(), "0 Continued(PlayDirectionForward, PlaySpeedSlow1)\n"
                           "0 PlayMode(PlayDirectionForward, PlaySpeedSlow1)\n");
    EXPECT_EQ(desk.navigator.Context().GetCurrentPlayMode(), Forward(bd::PlaySpeedSlow1));
}

/** At every speed, many short advances move as far as one long one, and exactly as far as expected.
 */
TEST(Speed, DoesNotDrift)
{
    for (int step = bd::PlaySpeedSlow5; step <= bd::PlaySpeedFast12; ++step) {
        SCOPED_TRACE(step);
        const auto speed = static_cast<bd::PlaySpeedDef>(step);
        const SpeedRatio ratio = RatioOf(speed);
        const std::uint64_t passed = 101 * 997;
        TestDesk once(ListOf({Item(3600)}));
        TestDesk often(ListOf({Item(3600)}));
        for (TestDesk* const desk : {&once, &often}) {
            desk->Start(Ticks(12345));
            desk->Do(desk->navigator.SetPlayMode(Forward(speed)));
        }

        once.navigator.Advance(Ticks(passed));
        for (int i = 0; i < 997; ++i) {
            often.navigator.Advance(Ticks(101));
        }

        const std::uint64_t played = passed * ratio.played / ratio.passed;
        EXPECT_EQ(once.navigator.Context().GetCurrentTimePosition(), 12345 + played);
        EXPECT_EQ(often.Snapshot(), once.Snapshot());
        EXPECT_EQ(often.Take(), once.Take());
    }
}

TEST(Speed, ReachesTheNextChangeAfterTimeToNextChange)
{
    for (const bd::PlaySpeedDef speed :
         {bd::PlaySpeedSlow5, bd::PlaySpeedSlow2, bd::PlaySpeedNormal, bd::PlaySpeedFast1,
          bd::PlaySpeedFast6, bd::PlaySpeedFast12}) {
        SCOPED_TRACE(speed);
        TestDesk desk(ListOf({Item(100)}, {Link(0, Ticks(1)), Link(0, Ticks(12347))}));
        desk.Start();
        desk.Do(desk.navigator.SetPlayMode(Forward(speed)));
        for (int change = 0; change < 3; ++change) {
            const std::optional<Ticks> next = desk.navigator.TimeToNextChange();
            ASSERT_TRUE(next);
            if (*next > Ticks(0)) {
                desk.navigator.Advance(*next - Ticks(1));
                EXPECT_EQ(desk.Take(), "");
                desk.navigator.Advance(Ticks(1));
            } else {
                desk.navigator.Advance(Ticks(0));
            }
            EXPECT_NE(desk.Take(), "");
        }
    }
}

TEST(Speed, IsResetWhenPlaybackStops)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start();
    desk.Do(desk.navigator.SetPlayMode(Forward(bd::PlaySpeedSlow5)));
    desk.navigator.Advance(Ticks(31));
    desk.Do(desk.navigator.Stop());

    desk.Start();

    EXPECT_EQ(desk.navigator.TimeToNextChange(), Second);
    desk.navigator.Advance(Ticks(100));
    EXPECT_EQ(desk.navigator.Context().GetCurrentTimePosition(), 100);
}

TEST(Speed, IsKeptInTheNextItem)
{
    TestDesk desk(ListOf({Item(2), Item(2)}));
    desk.Start();
    desk.Do(desk.navigator.SetPlayMode(Forward(bd::PlaySpeedFast1)));

    desk.navigator.Advance(3 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "2 Finished(EndOfMedia)\n");
}

TEST(Backward, PassesItemsChaptersAndMarksInReverseOrder)
{
    TestDesk desk(ListOf({Item(2), Item(2)}, {Entry(0, Ticks(0)), Entry(0, Second),
                                              Link(1, Ticks(100)), Entry(1, Second)}));
    desk.Start(3 * Second + Ticks(10));

    EXPECT_TRUE(desk.navigator.SetPlayMode(Backward(bd::PlaySpeedNormal)).IsDone());
    desk.navigator.Advance(2 * Second + Ticks(100));

    EXPECT_EQ(desk.Take(), "3+10 PlayMode(PlayDirectionBackward, PlaySpeedNormal)\n"
                           "3+20 CurrentTimePosition(135000)\n"
                           "3+20 MarkInfo(7, 3, 135000)\n"
                           "3+21 ChapterNumber(2)\n"
                           "3+44920 MarkInfo(7, 2, 90100)\n"
                           "4+20 CurrentTimePosition(90000)\n"
                           "4+21 PlayItem(7, 0, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
                           "5+20 CurrentTimePosition(45000)\n"
                           "5+20 MarkInfo(7, 1, 45000)\n"
                           "5+21 ChapterNumber(1)\n");
    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), Second - Ticks(90));
}

TEST(Backward, TurnsAroundAtTheStart)
{
    TestDesk desk(ListOf({Item(10)}, {Entry(0, Ticks(0))}));
    desk.Start(Second / 2);
    desk.Do(desk.navigator.SetPlayMode(Backward(bd::PlaySpeedFast1)));

    desk.navigator.Advance(Second + Ticks(11250));

    EXPECT_EQ(desk.Take(), "0+33750 CurrentTimePosition(0)\n"
                           "0+33750 MarkInfo(7, 0, 0)\n"
                           "0+33750 PlayMode(PlayDirectionForward, PlaySpeedNormal)\n"
                           "1+33750 CurrentTimePosition(45000)\n");
    EXPECT_EQ(desk.navigator.Context().GetPlayMode(), bd::PlayMode());
}

TEST(Backward, TurnsAroundAtOnceAtTheStart)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start();
    desk.Do(desk.navigator.SetPlayMode(Backward(bd::PlaySpeedNormal)));

    EXPECT_EQ(desk.navigator.TimeToNextChange(), Ticks(0));
    desk.navigator.Advance(Second);

    EXPECT_EQ(desk.Take(), "0 PlayMode(PlayDirectionForward, PlaySpeedNormal)\n"
                           "1 CurrentTimePosition(45000)\n");
}

TEST(Backward, EntersAnItemOfOneTickBeforeTurningAround)
{
    TestDesk desk(
        ListOf({ItemOfTicks(Ticks(1)), Item(10)}, {Entry(0, Ticks(0)), Entry(1, Ticks(0))}));
    desk.Start(Ticks(10));
    desk.Do(desk.navigator.SetPlayMode(Backward(bd::PlaySpeedNormal)));

    desk.navigator.Advance(Ticks(11));

    EXPECT_EQ(desk.Take(), "0+19 MarkInfo(7, 1, 1)\n"
                           "0+20 CurrentTimePosition(0)\n"
                           "0+20 PlayItem(7, 0, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
                           "0+20 MarkInfo(7, 0, 0)\n"
                           "0+20 ChapterNumber(1)\n"
                           "0+20 PlayMode(PlayDirectionForward, PlaySpeedNormal)\n"
                           "0+21 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
                           "0+21 MarkInfo(7, 1, 1)\n"
                           "0+21 ChapterNumber(2)\n");
}

TEST(Backward, HasNoStills)
{
    TestDesk desk(ListOf({WithEndlessStill(Item(1)), Item(10)}));
    desk.Start();
    desk.Do(desk.navigator.SearchTime(2 * Second));
    desk.Do(desk.navigator.SetPlayMode(Backward(bd::PlaySpeedNormal)));

    desk.navigator.Advance(2 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1+1 PlayItem(7, 0, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "2 PlayMode(PlayDirectionForward, PlaySpeedNormal)\n");
}

TEST(Backward, AnnouncesTheStreamsOfTheItemItEnters)
{
    PlayItem withAudio = Item(1);
    withAudio.streams.primaryAudio = {StreamOf(CodingAc3, 0x1100)};
    TestDesk desk(ListOf({withAudio, Item(1)}));
    desk.Start(Second + Ticks(10));
    desk.Do(desk.navigator.SetPlayMode(Backward(bd::PlaySpeedNormal)));

    desk.navigator.Advance(Ticks(11));

    EXPECT_EQ(desk.Take(), "1+20 CurrentTimePosition(45000)\n"
                           "1+21 PlayItem(7, 0, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
                           "1+21 AudioInfo(1)\n"
                           "1+21 AudioInfoChanged(true, (AudioFormatAc3, AudioSampleRateUnknown, "
                           "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 4352, 0))\n");
}

} // namespace

} // namespace deskplayer
