#include "session/remotestatus.h"

#include <gtest/gtest.h>

#include "../testdesk.h"

namespace deskplayer
{

namespace
{

PlayList TwoMinutes()
{
    return ListOf({RichItem(120)}, {Entry(0, Ticks(0)), Entry(0, 60 * Second)});
}

TEST(PlaybackSummary, IsTheStatusAloneWhileNothingPlays)
{
    TestDesk desk(TwoMinutes());
    EXPECT_EQ(PlaybackSummary(desk.desk), "stopped");
    EXPECT_EQ(SelectionSummary(desk.desk), "");
}

TEST(PlaybackSummary, HasPositionAndChapter)
{
    TestDesk desk(TwoMinutes());
    desk.Start(Second * 61 + Ticks(40000));
    EXPECT_EQ(PlaybackSummary(desk.desk), "playing  00:01:01 of 00:02:00  chapter 2 of 2");
    desk.Do(desk.navigator.Pause());
    EXPECT_EQ(PlaybackSummary(desk.desk), "paused  00:01:01 of 00:02:00  chapter 2 of 2");
}

TEST(PlaybackSummary, HasNoChapterIfThereIsNone)
{
    TestDesk desk(ListOf({RichItem(120)}));
    desk.Start(Second);
    EXPECT_EQ(PlaybackSummary(desk.desk), "playing  00:00:01 of 00:02:00");
}

TEST(PlaybackSummary, HasThePlayModeUnlessItIsNormal)
{
    TestDesk desk(TwoMinutes());
    desk.Start(Second);
    desk.Do(
        desk.navigator.SetPlayMode(bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast2)));
    EXPECT_EQ(PlaybackSummary(desk.desk), "playing  " + std::string("Backward Fast2") +
                                              "  00:00:01 of 00:02:00  chapter 1 of 2");
}

TEST(SelectionSummary, HasTheStreamsThatThereAre)
{
    TestDesk desk(TwoMinutes());
    desk.Start();
    EXPECT_EQ(SelectionSummary(desk.desk), "audio 1 of 2  subtitle 1 of 2  pip off  angle 1 of 2");
    desk.Do(desk.navigator.SelectAudio(2));
    desk.Do(desk.navigator.ShowSubtitles(false));
    desk.Do(desk.navigator.ShowSecondaryVideo(true));
    desk.Do(desk.navigator.SelectAngle(2));
    EXPECT_EQ(SelectionSummary(desk.desk), "audio 2 of 2  subtitle off  pip 1 of 2  angle 2 of 2");

    TestDesk poor(ListOf({ItemOfTicks(Second)}));
    poor.Start();
    EXPECT_EQ(SelectionSummary(poor.desk), "");
}

TEST(SelectionSummary, HasTheABRepeat)
{
    TestDesk desk(ListOf({ItemOfTicks(60 * Second)}));
    desk.Start(Second);
    desk.Do(desk.navigator.SetPointA());
    EXPECT_EQ(SelectionSummary(desk.desk), "repeat A-");
    desk.navigator.Advance(Second);
    desk.Do(desk.navigator.SetPointB());
    EXPECT_EQ(SelectionSummary(desk.desk), "repeat A-B");
    desk.Do(desk.navigator.EndABRepeat());
    EXPECT_EQ(SelectionSummary(desk.desk), "");
}

} // namespace

} // namespace deskplayer
