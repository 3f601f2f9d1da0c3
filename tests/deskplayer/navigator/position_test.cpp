#include <gtest/gtest.h>

#include "../testdesk.h"

namespace deskplayer
{

namespace
{

/** Two items of ten seconds, with chapters at 0, 5, 10 and 15 s. */
PlayList FourChapters()
{
    return ListOf({Item(10), Item(10)}, {Entry(0, Ticks(0)), Entry(0, 5 * Second),
                                         Entry(1, Ticks(0)), Entry(1, 5 * Second)});
}

TEST(Position, JumpsWithinAnItem)
{
    TestDesk desk(FourChapters());
    desk.Start(Second);

    EXPECT_TRUE(desk.navigator.SearchTime(2 * Second + Ticks(1)).IsDone());

    EXPECT_EQ(desk.Take(), "1 JumpOccurred()\n"
                           "1 CurrentTimePosition(90001)\n");
}

TEST(Position, JumpsToAnotherItemAndAnnouncesTheDifferences)
{
    TestDesk desk(FourChapters());
    desk.Start(Second);

    EXPECT_TRUE(desk.navigator.SearchTime(15 * Second).IsDone());

    EXPECT_EQ(desk.Take(), "1 JumpOccurred()\n"
                           "1 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
                           "1 MarkInfo(7, 3, 675000)\n"
                           "1 ChapterNumber(4)\n"
                           "1 CurrentTimePosition(675000)\n");
}

TEST(Position, StaysPausedWhenItJumps)
{
    TestDesk desk(FourChapters());
    desk.Start();
    desk.Do(desk.navigator.Pause());

    desk.Do(desk.navigator.SearchTime(7 * Second));

    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Paused);
    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 7 * Second);
}

TEST(Position, LeavesAStillWhenItJumps)
{
    TestDesk desk(ListOf({WithTimedStill(Item(2), 5), Item(2)}));
    desk.Start(2 * Second);

    EXPECT_TRUE(desk.navigator.SearchTime(Second).IsDone());

    EXPECT_EQ(desk.Take(), "2 StillOff()\n"
                           "2 JumpOccurred()\n"
                           "2 CurrentTimePosition(45000)\n");
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Playing);
    EXPECT_EQ(desk.navigator.TimeToNextChange(), Second);
}

TEST(Position, ForgetsTheFractionOfATickWhenItJumps)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start();
    desk.Do(desk.navigator.SetPlayMode(bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedSlow5)));
    desk.navigator.Advance(Ticks(31));

    desk.Do(desk.navigator.SearchTime(Ticks(0)));

    EXPECT_EQ(desk.navigator.TimeToNextChange(), 32 * Second);
}

TEST(Position, RefusesATimeAtOrPastTheEnd)
{
    TestDesk desk(FourChapters());
    desk.Start();
    const std::string before = desk.Snapshot();

    for (const Ticks time : {20 * Second, 1000 * Second}) {
        EXPECT_EQ(desk.navigator.SearchTime(time).Reason(), "the play list ends at 00:00:20.000");
    }
    EXPECT_EQ(desk.Take(), "");
    EXPECT_EQ(desk.Snapshot(), before);

    EXPECT_TRUE(desk.navigator.SearchTime(20 * Second - Ticks(1)).IsDone());
}

TEST(Position, GoesToAChapter)
{
    TestDesk desk(FourChapters());
    desk.Start(Second);

    EXPECT_TRUE(desk.navigator.SearchChapter(2).IsDone());

    EXPECT_EQ(desk.Take(), "1 JumpOccurred()\n"
                           "1 MarkInfo(7, 1, 225000)\n"
                           "1 ChapterNumber(2)\n"
                           "1 CurrentTimePosition(225000)\n");
}

TEST(Position, DoesNotAnnounceTheCurrentChapterAgainWhenItJumpsThere)
{
    TestDesk desk(FourChapters());
    desk.Start(Second);

    EXPECT_TRUE(desk.navigator.SearchChapter(1).IsDone());

    EXPECT_EQ(desk.Take(), "1 JumpOccurred()\n"
                           "1 MarkInfo(7, 0, 0)\n"
                           "1 CurrentTimePosition(0)\n");
}

TEST(Position, SkipsToTheNextChapter)
{
    TestDesk desk(FourChapters());
    desk.Start(9 * Second);

    EXPECT_TRUE(desk.navigator.SkipToNextChapter().IsDone());

    EXPECT_EQ(desk.Take(), "9 JumpOccurred()\n"
                           "9 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
                           "9 MarkInfo(7, 2, 450000)\n"
                           "9 ChapterNumber(3)\n"
                           "9 CurrentTimePosition(450000)\n");
}

TEST(Position, SkipsToTheFirstChapterFromBeforeIt)
{
    TestDesk desk(ListOf({Item(10)}, {Entry(0, 5 * Second)}));
    desk.Start(Second);
    EXPECT_EQ(desk.navigator.Context().GetCurrentChapter(), 0);

    EXPECT_TRUE(desk.navigator.SkipToNextChapter().IsDone());

    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 5 * Second);
}

TEST(Position, SkipsBackToTheStartOfTheChapterAfterThreeSeconds)
{
    TestDesk desk(FourChapters());
    desk.Start(8 * Second);

    EXPECT_TRUE(desk.navigator.SkipToPreviousChapter().IsDone());

    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 5 * Second);
}

TEST(Position, SkipsBackToThePreviousChapterWithinThreeSeconds)
{
    TestDesk desk(FourChapters());
    desk.Start(8 * Second - Ticks(1));

    EXPECT_TRUE(desk.navigator.SkipToPreviousChapter().IsDone());

    EXPECT_EQ(desk.navigator.Context().GetCurrentTimePosition(), 0);
}

TEST(Position, SkipsBackToTheStartOfTheFirstChapterAtAnyTime)
{
    TestDesk desk(ListOf({Item(10)}, {Entry(0, Second)}));
    desk.Start(Second + Ticks(1));

    EXPECT_TRUE(desk.navigator.SkipToPreviousChapter().IsDone());

    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), Second);
}

/** An item of ten seconds with chapters 3 and 5; the marks of the others are after its end. */
PlayList ChaptersThreeAndFive()
{
    return ListOf({Item(10)}, {Entry(0, 11 * Second), Entry(0, 11 * Second), Entry(0, 2 * Second),
                               Entry(0, 11 * Second), Entry(0, 6 * Second), Entry(0, 11 * Second)});
}

TEST(Position, SkipsForwardOverChaptersWithoutAPosition)
{
    TestDesk desk(ChaptersThreeAndFive());
    desk.Start(Second);

    EXPECT_TRUE(desk.navigator.SkipToNextChapter().IsDone());
    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 2 * Second);
    EXPECT_TRUE(desk.navigator.SkipToNextChapter().IsDone());
    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 6 * Second);
    EXPECT_EQ(desk.navigator.SkipToNextChapter().Reason(),
              "no chapter 6; chapters are numbered 1 to 5");
}

TEST(Position, SkipsBackOverChaptersWithoutAPosition)
{
    TestDesk desk(ChaptersThreeAndFive());
    desk.Start(7 * Second);

    EXPECT_TRUE(desk.navigator.SkipToPreviousChapter().IsDone());
    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 2 * Second);
    desk.navigator.Advance(Second);
    EXPECT_TRUE(desk.navigator.SkipToPreviousChapter().IsDone());
    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 2 * Second);
}

TEST(Position, RefusesAChapterWithoutAPosition)
{
    TestDesk desk(ChaptersThreeAndFive());
    desk.Start(Second);

    EXPECT_EQ(desk.navigator.SearchChapter(4).Reason(),
              "the mark of chapter 4 is outside its play item");
    EXPECT_EQ(desk.navigator.SearchChapter(0).Reason(),
              "no chapter 0; chapters are numbered 1 to 5");
}

/** FourChapters() whose second item may be entered in sequence only. */
PlayList WithoutRandomAccessToTheSecondItem()
{
    PlayList playList = FourChapters();
    playList.playItems[1].randomAccessFlag = true;
    return playList;
}

TEST(Position, RefusesToJumpIntoAnItemWithoutRandomAccess)
{
    TestDesk desk(WithoutRandomAccessToTheSecondItem());
    desk.Start(6 * Second);
    const std::string before = desk.Snapshot();

    const std::string reason = "play item 1 does not permit random access";
    EXPECT_EQ(desk.navigator.SearchTime(10 * Second).Reason(), reason);
    EXPECT_EQ(desk.navigator.SearchChapter(4).Reason(), reason);
    EXPECT_EQ(desk.navigator.SkipToNextChapter().Reason(), reason);
    EXPECT_EQ(desk.Take(), "");
    EXPECT_EQ(desk.Snapshot(), before);

    EXPECT_TRUE(desk.navigator.SearchTime(10 * Second - Ticks(1)).IsDone());
}

TEST(Position, JumpsWithinAnItemWithoutRandomAccessAndOutOfIt)
{
    TestDesk desk(WithoutRandomAccessToTheSecondItem());
    desk.Start(11 * Second);

    EXPECT_TRUE(desk.navigator.SearchTime(19 * Second).IsDone());
    EXPECT_TRUE(desk.navigator.SearchChapter(3).IsDone());
    EXPECT_TRUE(desk.navigator.SkipToPreviousChapter().IsDone());
    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 5 * Second);
}

TEST(Position, RefusesToSkipBackIntoAnItemWithoutRandomAccess)
{
    PlayList playList = FourChapters();
    playList.playItems[0].randomAccessFlag = true;
    TestDesk desk(playList);
    desk.Start(11 * Second);

    EXPECT_EQ(desk.navigator.SkipToPreviousChapter().Reason(),
              "play item 0 does not permit random access");
}

TEST(Position, RefusesChaptersThatDoNotExist)
{
    TestDesk desk(FourChapters());
    desk.Start(16 * Second);
    const std::string before = desk.Snapshot();

    EXPECT_EQ(desk.navigator.SearchChapter(0).Reason(),
              "no chapter 0; chapters are numbered 1 to 4");
    EXPECT_EQ(desk.navigator.SearchChapter(5).Reason(),
              "no chapter 5; chapters are numbered 1 to 4");
    EXPECT_EQ(desk.navigator.SearchChapter(65537).Reason(),
              "no chapter 65537; chapters are numbered 1 to 4");
    EXPECT_EQ(desk.navigator.SkipToNextChapter().Reason(),
              "no chapter 5; chapters are numbered 1 to 4");
    EXPECT_EQ(desk.Take(), "");
    EXPECT_EQ(desk.Snapshot(), before);
}

TEST(Position, RefusesToSkipWhereThereAreNoChapters)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(Second);
    const std::string before = desk.Snapshot();

    EXPECT_EQ(desk.navigator.SkipToNextChapter().Reason(), "no chapter 1; there are no chapters");
    EXPECT_EQ(desk.navigator.SkipToPreviousChapter().Reason(),
              "no chapter 0; there are no chapters");
    EXPECT_EQ(desk.Take(), "");
    EXPECT_EQ(desk.Snapshot(), before);
}

} // namespace

} // namespace deskplayer
