// Play lists that no studio makes but that a file can contain.

#include <gtest/gtest.h>

#include <algorithm>
#include <random>

#include "../testdesk.h"

namespace deskplayer
{

namespace
{

TEST(OddPlayList, PassesItemsWithoutLength)
{
    TestDesk desk(
        ListOf({Item(0), Item(0), ItemOfTicks(Ticks(100)), Item(0)}, {Entry(1, Ticks(0))}));
    desk.Start();

    EXPECT_EQ(desk.navigator.TimeToNextChange(), Ticks(0));
    EXPECT_EQ(desk.navigator.Advance(Second), Second - Ticks(100));

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "0 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "0 MarkInfo(7, 0, 0)\n"
              "0 ChapterNumber(1)\n"
              "0 PlayItem(7, 2, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "0+100 PlayItem(7, 3, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "0+100 Finished(EndOfMedia)\n");
}

TEST(OddPlayList, ShowsTheStillOfAnItemWithoutLength)
{
    TestDesk desk(ListOf({WithTimedStill(Item(0), 5)}));
    desk.Start();

    desk.navigator.Advance(10 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(), "0 StillOn()\n"
                                           "5 StillOff()\n"
                                           "5 Finished(EndOfMedia)\n");
}

TEST(OddPlayList, PassesAStillWithoutLength)
{
    TestDesk desk(ListOf({WithTimedStill(Item(1), 0), Item(1)}));
    desk.Start();

    desk.navigator.Advance(Second);

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1 StillOn()\n"
              "1 StillOff()\n"
              "1 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n");
}

TEST(OddPlayList, TreatsAnUnknownStillModeAsAnEndlessStill)
{
    PlayItem item = Item(1);
    item.stillMode = 3;
    TestDesk desk(ListOf({item}));
    desk.Start();

    desk.navigator.Advance(100 * Second);

    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Still);
}

TEST(OddPlayList, PlaysThroughMarksThatAreNotInOrder)
{
    TestDesk desk(ListOf({Item(3)}, {Entry(0, 2 * Second), Entry(0, Second), Entry(0, Ticks(0))}));
    desk.Start();

    desk.navigator.Advance(5 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(), "1 MarkInfo(7, 1, 45000)\n"
                                           "1 ChapterNumber(2)\n"
                                           "2 MarkInfo(7, 0, 90000)\n"
                                           "2 ChapterNumber(1)\n"
                                           "3 Finished(EndOfMedia)\n");
}

TEST(OddPlayList, IgnoresMarksWithoutAPosition)
{
    TestDesk desk(
        ListOf({Item(1)}, {Entry(5, Ticks(0)), Link(0, 2 * Second), Entry(0, Ticks(10))}));
    desk.Start();

    desk.navigator.Advance(Second);

    EXPECT_EQ(desk.TakeWithoutPositions(), "0+10 MarkInfo(7, 2, 10)\n"
                                           "0+10 ChapterNumber(2)\n"
                                           "1 Finished(EndOfMedia)\n");
}

TEST(OddPlayList, AnnouncesMarksWhereTwoItemsMeetEachInItsItem)
{
    TestDesk desk(ListOf({WithTimedStill(Item(1), 5), Item(1)},
                         {Entry(1, Ticks(0)), Link(0, Second), Link(1, Ticks(0))}));
    desk.Start();

    desk.navigator.Advance(6 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1 MarkInfo(7, 1, 45000)\n"
              "1 StillOn()\n"
              "6 StillOff()\n"
              "6 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "6 MarkInfo(7, 0, 45000)\n"
              "6 MarkInfo(7, 2, 45000)\n"
              "6 ChapterNumber(1)\n");
}

TEST(OddPlayList, AnnouncesAChapterAtTheEndOfAnItemWithItsMark)
{
    TestDesk desk(ListOf({Item(1), Item(1)}, {Entry(0, Ticks(0)), Entry(0, Second)}));
    desk.Start();

    desk.navigator.Advance(Second + Ticks(1));
    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1 MarkInfo(7, 1, 45000)\n"
              "1 ChapterNumber(2)\n"
              "1 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n");

    desk.navigator.SetPlayMode(bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedNormal));
    desk.navigator.Advance(Ticks(2));
    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1+1 PlayMode(PlayDirectionBackward, PlaySpeedNormal)\n"
              "1+2 MarkInfo(7, 1, 45000)\n"
              "1+3 PlayItem(7, 0, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "1+3 ChapterNumber(1)\n");

    desk.navigator.SearchChapter(2);
    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1+3 JumpOccurred()\n"
              "1+3 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "1+3 MarkInfo(7, 1, 45000)\n"
              "1+3 ChapterNumber(2)\n");
}

TEST(OddPlayList, AnnouncesAChapterAtTheEndOfThePlayListOnceWithItsMark)
{
    TestDesk desk(ListOf({Item(2)}, {Entry(0, Ticks(0)), Entry(0, 2 * Second)}));
    desk.Start();

    desk.navigator.Advance(2 * Second);
    EXPECT_EQ(desk.TakeWithoutPositions(), "2 MarkInfo(7, 1, 90000)\n"
                                           "2 ChapterNumber(2)\n"
                                           "2 Finished(EndOfMedia)\n");

    desk.Start();
    desk.navigator.SearchChapter(2);
    desk.navigator.Advance(Second);
    EXPECT_EQ(desk.Take(), "2 JumpOccurred()\n"
                           "2 MarkInfo(7, 1, 90000)\n"
                           "2 ChapterNumber(2)\n"
                           "2 CurrentTimePosition(90000)\n"
                           "2 Finished(EndOfMedia)\n");
}

TEST(OddPlayList, HandlesTheMaximumNumberOfStreams)
{
    PlayItem item = Item(1);
    item.streams.primaryAudio.assign(255, StreamOf(CodingAc3));
    TestDesk desk(ListOf({item}));
    desk.Start();

    EXPECT_TRUE(desk.navigator.SelectAudio(255).IsDone());
    EXPECT_EQ(desk.Take(), "0 AudioInfo(255)\n");
    EXPECT_FALSE(desk.navigator.SelectAudio(256).IsDone());
}

/**
 * A random play list: short items, some without length, some with stills, and marks anywhere.
 */
PlayList RandomPlayList(std::mt19937& generator)
{
    const auto draw = [&generator](std::uint32_t below) {
        return static_cast<std::uint32_t>(generator() % below);
    };
    PlayList playList;
    for (std::uint32_t item = draw(5); item-- > 0;) {
        playList.playItems.push_back(draw(3) == 0 ? RichItem(0) : RichItem(draw(4)));
        playList.playItems.back().stillMode = static_cast<std::uint8_t>(draw(4) == 0 ? 1 : 0);
        playList.playItems.back().stillTime = static_cast<std::uint16_t>(draw(3));
        playList.playItems.back().outTime += draw(3);
    }
    for (std::uint32_t mark = draw(8); mark-- > 0;) {
        playList.marks.push_back(
            Entry(static_cast<std::uint16_t>(draw(6)), Ticks(draw(3 * TicksPerSecond))));
        playList.marks.back().time -= draw(2);
        playList.marks.back().type = static_cast<std::uint8_t>(draw(3));
    }
    return playList;
}

/** Carries out a random command, which may be refused. */
void PerformRandomCommand(TestDesk& desk, std::mt19937& generator)
{
    const Command& command = Commands()[generator() % Commands().size()];
    std::vector<std::uint64_t> values;
    for (int i = 0; i < 4; ++i) {
        values.push_back(generator() % 8 == 0 ? generator() : generator() % 12);
    }
    command.perform(desk.desk, values);
}

TEST(OddPlayList, StaysConsistentUnderAnyOperations)
{
    for (unsigned seed = 0; seed < 300; ++seed) {
        SCOPED_TRACE(seed);
        std::mt19937 generator(seed);
        const PlayList playList = RandomPlayList(generator);
        const LoadedPlayList loaded = LayOut(7, playList);
        TestDesk desk(playList);
        desk.navigator.Play();
        for (int operation = 0; operation < 60; ++operation) {
            PerformRandomCommand(desk, generator);
            const Ticks before = desk.clock.Now();
            const Ticks passes(generator() % (2 * Second).count());

            const Ticks left = desk.navigator.Advance(passes);

            EXPECT_EQ(desk.clock.Now(), before + passes - left);
            const Status status = desk.navigator.CurrentStatus();
            if (left != Ticks(0)) {
                EXPECT_TRUE(status == Status::Stopped || status == Status::Finished);
            }
            const Ticks position(desk.navigator.Context().GetCurrentTimePosition());
            EXPECT_LE(position, loaded.timeLine.duration);
            const std::size_t item = desk.navigator.Context().GetPlayItemId();
            if (!playList.playItems.empty()) {
                ASSERT_LT(item, playList.playItems.size());
                const Ticks start = loaded.timeLine.itemStarts[item];
                const PlayItem& current = playList.playItems[item];
                EXPECT_GE(position, start);
                EXPECT_LE(position, start + Ticks(current.outTime - current.inTime));
            }
        }
    }
}

} // namespace

} // namespace deskplayer
