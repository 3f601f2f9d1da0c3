#include "navigator/playhead.h"

#include <gtest/gtest.h>

#include "../testdesk.h"

namespace deskplayer
{

namespace
{

/** Two items of ten seconds, with chapters at 0, 5.5 and 10 s and a link where they meet. */
class PlayheadOnTwoItems : public testing::Test
{
protected:
    /** The next stop from a position of an item. */
    Ticks StopFrom(std::size_t item, Ticks position)
    {
        state.item = item;
        state.position = position;
        const Ticks distance = playhead.DistanceToNextStop();
        return playhead.IsForward() ? position + distance : position - distance;
    }

    void PlayBackward(bd::PlaySpeedDef speed = bd::PlaySpeedNormal)
    {
        state.currentPlayMode = bd::PlayMode(bd::PlayDirectionBackward, speed);
    }

    const LoadedPlayList playList = LayOut(
        7, ListOf({Item(10), Item(10)}, {Entry(0, Ticks(0)), Entry(0, 5 * Second + Second / 2),
                                         Link(0, 10 * Second), Entry(1, Ticks(0))}));
    PlaybackState state;
    Playhead playhead{playList, state};
};

TEST_F(PlayheadOnTwoItems, StopsAtEverySecond)
{
    EXPECT_EQ(StopFrom(0, Ticks(0)), Second);
    EXPECT_EQ(StopFrom(0, Second + Ticks(1)), 2 * Second);
}

TEST_F(PlayheadOnTwoItems, StopsAtMarks)
{
    EXPECT_EQ(StopFrom(0, 5 * Second), 5 * Second + Second / 2);
}

TEST_F(PlayheadOnTwoItems, StopsAtTheEndOfThePlayItem)
{
    EXPECT_EQ(StopFrom(0, 10 * Second), 10 * Second);
    EXPECT_EQ(StopFrom(1, 10 * Second), 11 * Second);
}

TEST_F(PlayheadOnTwoItems, StopsAtPointBAndAtTheTrigger)
{
    state.pointB = Second / 2;
    EXPECT_EQ(StopFrom(0, Ticks(0)), Second / 2);

    state.notifyAt = Second / 4;
    EXPECT_EQ(StopFrom(0, Ticks(0)), Second / 4);
}

TEST_F(PlayheadOnTwoItems, IgnoresPointAAndStopsAlreadyPassed)
{
    state.pointA = Second / 2;
    state.pointB = Ticks(5);
    state.notifyAt = Ticks(6);
    EXPECT_EQ(StopFrom(0, Ticks(10)), Second);
}

TEST_F(PlayheadOnTwoItems, LeavesAnItemBackwardToTheLastPositionBeforeIt)
{
    PlayBackward();
    EXPECT_EQ(StopFrom(1, 10 * Second), 10 * Second - Ticks(1));
}

TEST_F(PlayheadOnTwoItems, LeavesAChapterBackwardToTheLastPositionBeforeIt)
{
    PlayBackward();
    EXPECT_EQ(StopFrom(0, 6 * Second), 5 * Second + Second / 2) << "at its mark first";
    EXPECT_EQ(StopFrom(0, 5 * Second + Second / 2), 5 * Second + Second / 2 - Ticks(1));
}

TEST_F(PlayheadOnTwoItems, StopsBackwardAtSecondsAndAtTheTrigger)
{
    PlayBackward();
    EXPECT_EQ(StopFrom(0, 4 * Second), 3 * Second);

    state.notifyAt = 4 * Second - Ticks(1);
    EXPECT_EQ(StopFrom(0, 4 * Second), 4 * Second - Ticks(1));
}

TEST_F(PlayheadOnTwoItems, HasNoFurtherStopBackwardAtTheStart)
{
    PlayBackward();
    EXPECT_EQ(StopFrom(0, Ticks(0)), Ticks(0));
}

TEST_F(PlayheadOnTwoItems, NeedsLessTimeWhenPlayIsFast)
{
    state.currentPlayMode = bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedFast2);
    EXPECT_EQ(playhead.TimeToNextStop(), Ticks(Second.count() / 4));
}

TEST_F(PlayheadOnTwoItems, RoundsUpTheTimeToTheNextStop)
{
    state.currentPlayMode = bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedFast12);
    state.position = Second - Ticks(1);
    EXPECT_EQ(playhead.TimeToNextStop(), Ticks(1));
}

TEST_F(PlayheadOnTwoItems, PassesNoFurtherThanTheNextStop)
{
    EXPECT_EQ(playhead.Pass(3 * Second), Second);
    EXPECT_EQ(state.position, Second);
}

TEST_F(PlayheadOnTwoItems, KeepsARemainderOfLessThanATick)
{
    state.currentPlayMode = bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedSlow1);

    EXPECT_EQ(playhead.Pass(Ticks(1)), Ticks(0));
    EXPECT_EQ(playhead.TimeToNextStop(), 2 * Second - Ticks(1));
    EXPECT_EQ(playhead.Pass(Ticks(1)), Ticks(1));
    EXPECT_EQ(state.position, Ticks(1));
}

TEST_F(PlayheadOnTwoItems, DropsTheRemainderOnRequest)
{
    state.currentPlayMode = bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedSlow1);
    playhead.Pass(Ticks(1));

    playhead.DropRemainder();

    EXPECT_EQ(playhead.Pass(Ticks(1)), Ticks(0));
}

TEST_F(PlayheadOnTwoItems, DropsTheRemainderWhenItJumps)
{
    state.currentPlayMode = bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedSlow1);
    playhead.Pass(Ticks(1));

    playhead.JumpTo(Second);

    EXPECT_EQ(playhead.Pass(Ticks(1)), Ticks(0));
}

TEST_F(PlayheadOnTwoItems, MovesInTheDirectionOfPlay)
{
    state.position = 4 * Second;
    playhead.Move(Second);
    EXPECT_EQ(state.position, 5 * Second);

    PlayBackward();
    playhead.Move(2 * Second);
    EXPECT_EQ(state.position, 3 * Second);
}

TEST_F(PlayheadOnTwoItems, TakesTheDirectionOfTheNextStepWhilePaused)
{
    state.playMode = bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedNormal);
    EXPECT_TRUE(playhead.IsForward());

    state.status = Status::Paused;
    EXPECT_FALSE(playhead.IsForward());
}

TEST_F(PlayheadOnTwoItems, JumpsToAnotherItemAndKeepsThePrevious)
{
    EXPECT_TRUE(playhead.JumpTo(12 * Second));
    EXPECT_EQ(state.item, 1U);
    EXPECT_EQ(state.previousItem, 0U);
    EXPECT_EQ(state.position, 12 * Second);
}

TEST_F(PlayheadOnTwoItems, JumpsWithinAnItem)
{
    EXPECT_FALSE(playhead.JumpTo(9 * Second));
    EXPECT_EQ(state.item, 0U);
    EXPECT_EQ(state.previousItem, std::nullopt);
}

TEST_F(PlayheadOnTwoItems, FindsTheLaterItemWhereTwoMeet)
{
    EXPECT_EQ(playhead.ItemAt(10 * Second - Ticks(1)), 0U);
    EXPECT_EQ(playhead.ItemAt(10 * Second), 1U);
}

TEST_F(PlayheadOnTwoItems, FindsMarksAtThePositionStartingFromAnItem)
{
    state.position = 10 * Second;
    EXPECT_EQ(playhead.MarksHere(0), (std::vector<std::size_t>{2})) << "not those of a later item";

    state.item = 1;
    EXPECT_EQ(playhead.MarksHere(0), (std::vector<std::size_t>{2, 3}));
    EXPECT_EQ(playhead.MarksHere(1), (std::vector<std::size_t>{3}));
}

TEST_F(PlayheadOnTwoItems, FindsTheChapterAtThePosition)
{
    state.position = 5 * Second;
    EXPECT_EQ(playhead.CurrentChapter()->number, 1U);
    state.position = 6 * Second;
    EXPECT_EQ(playhead.CurrentChapter()->number, 2U);
    state.position = 10 * Second;
    EXPECT_EQ(playhead.CurrentChapter()->number, 2U) << "the next one belongs to the next item";
    state.item = 1;
    EXPECT_EQ(playhead.CurrentChapter()->number, 3U);
}

TEST_F(PlayheadOnTwoItems, FindsChaptersByNumber)
{
    EXPECT_EQ(playhead.FindChapter(2)->start, 5 * Second + Second / 2);
    EXPECT_EQ(playhead.FindChapter(0), nullptr);
    EXPECT_EQ(playhead.FindChapter(4), nullptr);
}

TEST_F(PlayheadOnTwoItems, RepeatsTheTitleForever)
{
    EXPECT_FALSE(playhead.IsRepeating());
    state.chapterTitleRepeat = bd::TRIGGER_TITLE;
    EXPECT_TRUE(playhead.IsRepeating());
}

TEST_F(PlayheadOnTwoItems, RepeatsChaptersThatAreAhead)
{
    state.chapterTitleRepeat = bd::TRIGGER_CHP;
    EXPECT_TRUE(playhead.IsRepeating());

    state.position = 20 * Second;
    EXPECT_FALSE(playhead.IsRepeating());
    PlayBackward();
    EXPECT_TRUE(playhead.IsRepeating()) << "turns around at the start";
}

TEST_F(PlayheadOnTwoItems, RepeatsFromAToBWhileBIsAhead)
{
    state.pointA = Second;
    EXPECT_FALSE(playhead.IsRepeating());
    state.pointB = 2 * Second;
    EXPECT_TRUE(playhead.IsRepeating());
    state.position = 2 * Second;
    EXPECT_FALSE(playhead.IsRepeating());
}

TEST(PlayheadOfAnEmptyPlayList, HasNoItemNoStreamsAndNoChapter)
{
    const LoadedPlayList playList = LayOut(7, ListOf({}));
    PlaybackState state;
    const Playhead playhead(playList, state);

    EXPECT_EQ(playhead.CurrentItem(), nullptr);
    EXPECT_TRUE(playhead.CurrentStreams().primaryVideo.empty());
    EXPECT_EQ(playhead.CurrentChapter(), nullptr);
}

} // namespace

} // namespace deskplayer
