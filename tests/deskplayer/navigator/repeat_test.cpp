#include <gtest/gtest.h>

#include <functional>
#include <sstream>

#include "../testdesk.h"

namespace deskplayer
{

namespace
{

bd::PlayMode BackwardMode()
{
    return bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedNormal);
}

/** Sets A here and B @p later, which returns playback to A. */
void SetPoints(TestDesk& desk, Ticks later)
{
    desk.Do(desk.navigator.SetPointA());
    desk.navigator.Advance(later);
    desk.Do(desk.navigator.SetPointB());
}

TEST(Repeat, GoesFromBBackToA)
{
    TestDesk desk(ListOf({Item(100)}));
    desk.Start(10 * Second + Ticks(5));

    EXPECT_TRUE(desk.navigator.SetPointA().IsDone());
    EXPECT_EQ(desk.navigator.Context().GetCurrentABRepeatState(), bd::TRIGGER_A);
    EXPECT_FALSE(desk.navigator.IsRepeating());
    desk.navigator.Advance(Second / 2);
    EXPECT_TRUE(desk.navigator.SetPointB().IsDone());
    EXPECT_EQ(desk.navigator.Context().GetCurrentABRepeatState(), bd::TRIGGER_B);
    EXPECT_TRUE(desk.navigator.IsRepeating());
    desk.navigator.Advance(Second);

    EXPECT_EQ(desk.Take(), "10+5 TriggerSet(TRIGGER_A, true)\n"
                           "10+22505 TriggerSet(TRIGGER_B, true)\n"
                           "10+22505 TriggerTimeReached(TRIGGER_B, 472505)\n"
                           "10+22505 JumpOccurred()\n"
                           "10+22505 CurrentTimePosition(450005)\n"
                           "11+5 TriggerTimeReached(TRIGGER_B, 472505)\n"
                           "11+5 JumpOccurred()\n"
                           "11+5 CurrentTimePosition(450005)\n"
                           "11+22505 TriggerTimeReached(TRIGGER_B, 472505)\n"
                           "11+22505 JumpOccurred()\n"
                           "11+22505 CurrentTimePosition(450005)\n");
}

TEST(Repeat, GoesFromBBackToAInAnEarlierItem)
{
    TestDesk desk(ListOf({Item(2), Item(2)}));
    desk.Start(Second + Ticks(10));
    SetPoints(desk, 2 * Second);

    desk.navigator.Advance(2 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "4 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "5+10 TriggerTimeReached(TRIGGER_B, 135010)\n"
              "5+10 JumpOccurred()\n"
              "5+10 PlayItem(7, 0, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n");
}

TEST(Repeat, ReportsThatBFailedWhenThereIsNoA)
{
    TestDesk desk(ListOf({Item(100)}));
    desk.Start(Second);
    const std::string before = desk.Snapshot();

    EXPECT_TRUE(desk.navigator.SetPointB().IsDone());

    EXPECT_EQ(desk.Take(), "1 TriggerSet(TRIGGER_B, false)\n");
    EXPECT_EQ(desk.Snapshot(), before);
}

TEST(Repeat, ReportsThatBFailedWhenAIsNotBeforeIt)
{
    TestDesk desk(ListOf({Item(100)}));
    desk.Start(Second);
    desk.Do(desk.navigator.SetPointA());
    const std::string before = desk.Snapshot();

    EXPECT_TRUE(desk.navigator.SetPointB().IsDone());
    EXPECT_EQ(desk.Take(), "1 TriggerSet(TRIGGER_B, false)\n");
    EXPECT_EQ(desk.Snapshot(), before);

    desk.Do(desk.navigator.SearchTime(Ticks(0)));
    desk.Do(desk.navigator.SetPointB());
    EXPECT_EQ(desk.navigator.Context().GetCurrentABRepeatState(), bd::TRIGGER_A);
}

TEST(Repeat, StartsOverWithANewA)
{
    TestDesk desk(ListOf({Item(100)}));
    desk.Start(Second);
    SetPoints(desk, Second);

    desk.Do(desk.navigator.SetPointA());

    EXPECT_EQ(desk.navigator.Context().GetCurrentABRepeatState(), bd::TRIGGER_A);
    EXPECT_FALSE(desk.navigator.IsRepeating());
}

TEST(Repeat, ContinuesPastBOnceTheRepeatHasEnded)
{
    TestDesk desk(ListOf({Item(100)}));
    desk.Start(Second);
    SetPoints(desk, Second);

    EXPECT_TRUE(desk.navigator.EndABRepeat().IsDone());
    desk.navigator.Advance(2 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(), "2 TriggerSet(TRIGGER_AB_NONE, true)\n");
    EXPECT_EQ(desk.navigator.Context().GetCurrentABRepeatState(), bd::TRIGGER_AB_NONE);
    EXPECT_FALSE(desk.navigator.IsRepeating());
    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 3 * Second);
}

TEST(Repeat, DoesNotRepeatPastB)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(Second);
    SetPoints(desk, Second);

    desk.Do(desk.navigator.SearchTime(2 * Second));
    EXPECT_FALSE(desk.navigator.IsRepeating());
    desk.Do(desk.navigator.SetPlayMode(BackwardMode()));
    EXPECT_TRUE(desk.navigator.IsRepeating());
    desk.Do(desk.navigator.SetPlayMode(bd::PlayMode()));
    desk.navigator.Advance(10 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(), "10 Finished(EndOfMedia)\n");
}

TEST(Repeat, RepeatsAChapter)
{
    TestDesk desk(
        ListOf({Item(10)}, {Entry(0, Ticks(0)), Entry(0, 3 * Second), Entry(0, 5 * Second)}));
    desk.Start(4 * Second);

    EXPECT_TRUE(desk.navigator.RepeatChapter().IsDone());
    EXPECT_EQ(desk.navigator.Context().GetCurrentChpTitleRepeatState(), bd::TRIGGER_CHP);
    EXPECT_TRUE(desk.navigator.IsRepeating());
    desk.navigator.Advance(3 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(), "4 TriggerSet(TRIGGER_CHP, true)\n"
                                           "5 TriggerTimeReached(TRIGGER_CHP, 225000)\n"
                                           "5 JumpOccurred()\n"
                                           "5 MarkInfo(7, 1, 135000)\n"
                                           "7 TriggerTimeReached(TRIGGER_CHP, 225000)\n"
                                           "7 JumpOccurred()\n"
                                           "7 MarkInfo(7, 1, 135000)\n");
}

TEST(Repeat, RepeatsTheLastChapterAtTheEndOfThePlayList)
{
    TestDesk desk(ListOf({WithEndlessStill(Item(2))}, {Entry(0, Ticks(0)), Entry(0, Second)}));
    desk.Start(Second);
    desk.Do(desk.navigator.RepeatChapter());

    desk.navigator.Advance(Second);

    EXPECT_EQ(desk.TakeWithoutPositions(), "2 TriggerTimeReached(TRIGGER_CHP, 90000)\n"
                                           "2 JumpOccurred()\n"
                                           "2 MarkInfo(7, 1, 45000)\n");
}

TEST(Repeat, RepeatsTheChapterThatTheViewerSelects)
{
    TestDesk desk(
        ListOf({Item(10)}, {Entry(0, Ticks(0)), Entry(0, 3 * Second), Entry(0, 5 * Second)}));
    desk.Start();
    desk.Do(desk.navigator.RepeatChapter());
    desk.Do(desk.navigator.SearchChapter(2));

    desk.navigator.Advance(3 * Second);

    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 4 * Second);
}

TEST(Repeat, PlaysToTheEndWhenThereIsNoChapterToRepeat)
{
    TestDesk desk(ListOf({Item(2)}));
    desk.Start();
    desk.Do(desk.navigator.RepeatChapter());

    EXPECT_FALSE(desk.navigator.IsRepeating());
    desk.navigator.Advance(3 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(), "2 Finished(EndOfMedia)\n");
}

TEST(Repeat, PlaysPastAnEmptyChapterAndRepeatsTheNext)
{
    TestDesk desk(ListOf({Item(3)}, {Entry(0, Second), Entry(0, Second), Entry(0, 2 * Second)}));
    desk.Start();
    desk.Do(desk.navigator.RepeatChapter());

    EXPECT_TRUE(desk.navigator.IsRepeating());
    desk.navigator.Advance(10 * Second);

    EXPECT_EQ(desk.navigator.Context().GetCurrentChapter(), 2);
    EXPECT_GE(Ticks(desk.navigator.Context().GetCurrentTimePosition()), Second);
    EXPECT_LT(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 2 * Second);
}

TEST(Repeat, EndsInAnEmptyChapterAtTheEndOfThePlayList)
{
    TestDesk desk(ListOf({Item(2)}, {Entry(0, Ticks(0)), Entry(0, 2 * Second)}));
    desk.Start();
    desk.Do(desk.navigator.RepeatChapter());
    desk.Do(desk.navigator.SearchChapter(2));

    EXPECT_FALSE(desk.navigator.IsRepeating());
    desk.navigator.Advance(Second);

    EXPECT_EQ(desk.TakeWithoutPositions(), "0 Finished(EndOfMedia)\n");
}

TEST(Repeat, RepeatsThePlayList)
{
    TestDesk desk(ListOf({Item(2), Item(1)}));
    desk.Start(Second);

    EXPECT_TRUE(desk.navigator.RepeatTitle().IsDone());
    EXPECT_EQ(desk.navigator.Context().GetCurrentChpTitleRepeatState(), bd::TRIGGER_TITLE);
    EXPECT_TRUE(desk.navigator.IsRepeating());
    desk.navigator.Advance(3 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1 TriggerSet(TRIGGER_TITLE, true)\n"
              "2 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "3 TriggerTimeReached(TRIGGER_TITLE, 135000)\n"
              "3 JumpOccurred()\n"
              "3 PlayItem(7, 0, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n");
    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), Second);
}

TEST(Repeat, EndsOnAPlayListWithoutLength)
{
    TestDesk desk(ListOf({WithEndlessStill(Item(0)), Item(0)}));
    desk.Start();
    desk.navigator.Advance(Ticks(0));
    desk.Do(desk.navigator.RepeatTitle());

    EXPECT_FALSE(desk.navigator.IsRepeating());
    desk.Do(desk.navigator.EndStill());
    desk.navigator.Advance(Second);

    EXPECT_EQ(desk.Take(), "0 Finished(EndOfMedia)\n");
}

TEST(Repeat, EndsTheRepeatOfAChapterOrThePlayList)
{
    TestDesk desk(ListOf({Item(2)}, {Entry(0, Ticks(0))}));
    for (Outcome (SimulatedNavigator::*repeat)() :
         {&SimulatedNavigator::RepeatChapter, &SimulatedNavigator::RepeatTitle}) {
        desk.Start();
        desk.Do((desk.navigator.*repeat)());

        EXPECT_TRUE(desk.navigator.EndChapterTitleRepeat().IsDone());
        EXPECT_FALSE(desk.navigator.IsRepeating());
        EXPECT_EQ(desk.navigator.Context().GetCurrentChpTitleRepeatState(), bd::TRIGGER_NONE);
        EXPECT_NE(desk.Take().find(" TriggerSet(TRIGGER_NONE, true)\n"), std::string::npos);
        desk.navigator.Advance(3 * Second);
        EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Finished);
    }
}

TEST(Repeat, BetweenTwoPointsContinuesWhenTheRepeatOfAChapterEnds)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start();
    SetPoints(desk, Second);

    EXPECT_TRUE(desk.navigator.EndChapterTitleRepeat().IsDone());

    EXPECT_EQ(desk.navigator.Context().GetCurrentABRepeatState(), bd::TRIGGER_B);
    EXPECT_TRUE(desk.navigator.IsRepeating());
}

TEST(Repeat, AllowsOnlyOneKindAtATime)
{
    TestDesk desk(ListOf({Item(10)}, {Entry(0, Ticks(0))}));
    desk.Start();
    SetPoints(desk, Second);

    desk.Do(desk.navigator.RepeatTitle());
    EXPECT_EQ(desk.navigator.Context().GetCurrentABRepeatState(), bd::TRIGGER_AB_NONE);
    EXPECT_EQ(desk.navigator.Context().GetCurrentChpTitleRepeatState(), bd::TRIGGER_TITLE);

    desk.Do(desk.navigator.SetPointA());
    EXPECT_EQ(desk.navigator.Context().GetCurrentABRepeatState(), bd::TRIGGER_A);
    EXPECT_EQ(desk.navigator.Context().GetCurrentChpTitleRepeatState(), bd::TRIGGER_NONE);
}

TEST(Repeat, RemembersTheTriggerThatWasSetLast)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(Second);
    EXPECT_EQ(desk.navigator.Context().GetTrigger().triggerType, bd::TRIGGER_NONE);

    desk.Do(desk.navigator.SetTrigger(5 * Second));
    EXPECT_EQ(desk.navigator.Context().GetTrigger().triggerType, bd::TRIGGER_NOTIFY_FROM_CURPOS);
    desk.Do(desk.navigator.SetPointB());
    EXPECT_EQ(desk.navigator.Context().GetTrigger().triggerType, bd::TRIGGER_NOTIFY_FROM_CURPOS)
        << "B could not be set";
    desk.Do(desk.navigator.SetPointA());
    EXPECT_EQ(desk.navigator.Context().GetTrigger().triggerType, bd::TRIGGER_A);
}

TEST(Trigger, IsReachedAtItsTime)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(Second);

    EXPECT_TRUE(desk.navigator.SetTrigger(Second + Ticks(100)).IsDone());
    EXPECT_EQ(desk.navigator.TimeToNextChange(), Ticks(100));
    desk.navigator.Advance(Second / 2);

    EXPECT_EQ(desk.Take(), "1 TriggerSet(TRIGGER_NOTIFY_FROM_CURPOS, true)\n"
                           "1+100 TriggerTimeReached(TRIGGER_NOTIFY_FROM_CURPOS, 45100)\n");
}

TEST(Trigger, IsReachedBackwardAsWell)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(2 * Second);
    desk.Do(desk.navigator.SetTrigger(Second + Ticks(100)));
    desk.Do(desk.navigator.SetPlayMode(BackwardMode()));

    desk.navigator.Advance(Second - Ticks(100));

    EXPECT_EQ(desk.Take(), "2+44900 TriggerTimeReached(TRIGGER_NOTIFY_FROM_CURPOS, 45100)\n");
}

TEST(Trigger, RemainsSetAndIsReachedAgain)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start();
    desk.Do(desk.navigator.SetTrigger(Ticks(100)));
    desk.navigator.Advance(Ticks(200));
    EXPECT_EQ(desk.Take(), "0+100 TriggerTimeReached(TRIGGER_NOTIFY_FROM_CURPOS, 100)\n");

    desk.Do(desk.navigator.SearchTime(Ticks(0)));
    desk.navigator.Advance(Ticks(200));

    EXPECT_EQ(desk.Take(), "0+300 TriggerTimeReached(TRIGGER_NOTIFY_FROM_CURPOS, 100)\n");
}

TEST(Trigger, IsANotificationDuringARepeatAsWell)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start();
    desk.Do(desk.navigator.RepeatTitle());
    desk.Do(desk.navigator.SetTrigger(Ticks(100)));

    desk.navigator.Advance(Ticks(200));

    EXPECT_EQ(desk.Take(), "0+100 TriggerTimeReached(TRIGGER_NOTIFY_FROM_CURPOS, 100)\n");
}

TEST(Trigger, IsReachedAtTheEndOfARepeat)
{
    TestDesk desk(ListOf({Item(10)}, {Entry(0, Ticks(0)), Entry(0, 2 * Second)}));
    const struct {
        std::function<void()> repeat;
        Ticks end;
        std::string received;
    } repeats[] = {{[&desk] { SetPoints(desk, Second / 2); }, Second / 2,
                    "TriggerTimeReached(TRIGGER_B, 22500)\n"},
                   {[&desk] { desk.Do(desk.navigator.RepeatChapter()); }, 2 * Second,
                    "TriggerTimeReached(TRIGGER_CHP, 90000)\n"},
                   {[&desk] { desk.Do(desk.navigator.RepeatTitle()); }, 10 * Second,
                    "TriggerTimeReached(TRIGGER_TITLE, 450000)\n"}};
    for (const auto& repeat : repeats) {
        SCOPED_TRACE(repeat.received);
        desk.Start();
        repeat.repeat();
        desk.Do(desk.navigator.SetTrigger(repeat.end));

        desk.navigator.Advance(repeat.end);

        std::string reached;
        std::istringstream received(desk.Take());
        for (std::string line; std::getline(received, line);) {
            if (line.find("TriggerTimeReached") != std::string::npos) {
                reached += line.substr(line.find(' ') + 1) + "\n";
            }
        }
        EXPECT_EQ(reached, "TriggerTimeReached(TRIGGER_NOTIFY_FROM_CURPOS, " +
                               std::to_string(repeat.end.count()) + ")\n" + repeat.received);
        desk.Do(desk.navigator.Stop());
    }
}

TEST(Trigger, IsReachedAtTheEndOfThePlayList)
{
    TestDesk desk(ListOf({Item(1)}));
    desk.Start();
    desk.Do(desk.navigator.SetTrigger(Second));

    desk.navigator.Advance(Second);

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1 TriggerTimeReached(TRIGGER_NOTIFY_FROM_CURPOS, 45000)\n"
              "1 Finished(EndOfMedia)\n");
}

TEST(Trigger, IsRefusedPastTheEndOfThePlayList)
{
    TestDesk desk(ListOf({Item(10), Item(10)}));
    desk.Start();
    const std::string before = desk.Snapshot();

    EXPECT_EQ(desk.navigator.SetTrigger(20 * Second + Ticks(45)).Reason(),
              "00:00:20.001 is past the end of the play list, which lasts 00:00:20.000");

    EXPECT_EQ(desk.Take(), "");
    EXPECT_EQ(desk.Snapshot(), before);
}

TEST(Trigger, DoesNotAffectOtherTriggers)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start();
    desk.Do(desk.navigator.RepeatTitle());

    desk.Do(desk.navigator.SetTrigger(Ticks(100)));

    EXPECT_EQ(desk.navigator.Context().GetCurrentChpTitleRepeatState(), bd::TRIGGER_TITLE);
}

} // namespace

} // namespace deskplayer
