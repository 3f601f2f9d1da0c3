#include <gtest/gtest.h>

#include "disc/timeline.h"

namespace deskplayer
{

namespace
{

/** A play list of two items of 100 and 50 ticks whose clips start at 1000 and 5000. */
class TimeLines : public testing::Test
{
protected:
    TimeLines()
    {
        m_PlayList.playItems.resize(2);
        m_PlayList.playItems[0].inTime = 1000;
        m_PlayList.playItems[0].outTime = 1100;
        m_PlayList.playItems[1].inTime = 5000;
        m_PlayList.playItems[1].outTime = 5050;
    }

    void AddMark(std::uint8_t type, std::uint16_t playItem, std::uint32_t time)
    {
        m_PlayList.marks.push_back({type, playItem, time, MarkForAllStreams, 0});
    }

    std::optional<Ticks> PositionOfMark(std::uint16_t playItem, std::uint32_t time)
    {
        m_PlayList.marks.clear();
        AddMark(MarkTypeLink, playItem, time);
        return BuildTimeLine(m_PlayList).markPositions.at(0);
    }

    PlayList m_PlayList;
};

TEST_F(TimeLines, PutsItemsInSequence)
{
    const TimeLine timeLine = BuildTimeLine(m_PlayList);
    EXPECT_EQ(timeLine.itemStarts, (std::vector<Ticks>{Ticks(0), Ticks(100)}));
    EXPECT_EQ(timeLine.duration, Ticks(150u));
}

TEST_F(TimeLines, IsEmptyWithoutItems)
{
    const TimeLine timeLine = BuildTimeLine(PlayList());
    EXPECT_EQ(timeLine.duration, Ticks(0u));
    EXPECT_TRUE(timeLine.itemStarts.empty());
}

TEST_F(TimeLines, HasDurationsThatDoNotFitInThirtyTwoBits)
{
    m_PlayList.playItems.assign(65535, PlayItem());
    for (PlayItem& item : m_PlayList.playItems) {
        item.outTime = 0xFFFFFFFF;
    }
    const TimeLine timeLine = BuildTimeLine(m_PlayList);
    EXPECT_EQ(timeLine.duration, Ticks(65535u * 0xFFFFFFFFull));
    EXPECT_EQ(timeLine.itemStarts.back(), Ticks(65534u * 0xFFFFFFFFull));
}

TEST_F(TimeLines, PutsAMarkAtThePositionOfItsClipTime)
{
    EXPECT_EQ(PositionOfMark(0, 1000), Ticks(0));
    EXPECT_EQ(PositionOfMark(0, 1099), Ticks(99));
    EXPECT_EQ(PositionOfMark(1, 5020), Ticks(120));
}

TEST_F(TimeLines, TreatsOutAsPartOfTheItem)
{
    EXPECT_EQ(PositionOfMark(0, 1100), Ticks(100));
    EXPECT_EQ(PositionOfMark(1, 5050), Ticks(150));
}

TEST_F(TimeLines, HasNoPositionForAMarkOutsideItsItem)
{
    EXPECT_EQ(PositionOfMark(0, 999), std::nullopt);
    EXPECT_EQ(PositionOfMark(0, 1101), std::nullopt);
    EXPECT_EQ(PositionOfMark(2, 1000), std::nullopt) << "no such play item";
}

TEST_F(TimeLines, MakesChaptersOnlyOfEntryMarks)
{
    AddMark(MarkTypeEntry, 0, 1000);
    AddMark(MarkTypeLink, 0, 1030);
    AddMark(MarkTypeEntry, 1, 5010);
    const TimeLine timeLine = BuildTimeLine(m_PlayList);
    ASSERT_EQ(timeLine.chapters.size(), 2u);
    EXPECT_EQ(timeLine.chapters[0].number, 1u);
    EXPECT_EQ(timeLine.chapters[0].mark, 0u);
    EXPECT_EQ(timeLine.chapters[0].start, Ticks(0u));
    EXPECT_EQ(timeLine.chapters[0].end, Ticks(110u));
    EXPECT_EQ(timeLine.chapters[1].number, 2u);
    EXPECT_EQ(timeLine.chapters[1].mark, 2u);
    EXPECT_EQ(timeLine.chapters[1].start, Ticks(110u));
    EXPECT_EQ(timeLine.chapters[1].end, Ticks(150u));
}

TEST_F(TimeLines, KeepsTheNumberOfAChapterAfterAMarkWithoutPosition)
{
    AddMark(MarkTypeEntry, 0, 1000);
    AddMark(MarkTypeEntry, 0, 0);
    AddMark(MarkTypeEntry, 1, 5000);
    const TimeLine timeLine = BuildTimeLine(m_PlayList);
    ASSERT_EQ(timeLine.chapters.size(), 2u);
    EXPECT_EQ(timeLine.chapters[0].end, Ticks(100u));
    EXPECT_EQ(timeLine.chapters[1].number, 3u);
}

TEST_F(TimeLines, MakesAChapterEmptyIfTheNextMarkIsBeforeIt)
{
    AddMark(MarkTypeEntry, 1, 5000);
    AddMark(MarkTypeEntry, 0, 1000);
    const TimeLine timeLine = BuildTimeLine(m_PlayList);
    ASSERT_EQ(timeLine.chapters.size(), 2u);
    EXPECT_EQ(timeLine.chapters[0].start, Ticks(100u));
    EXPECT_EQ(timeLine.chapters[0].end, Ticks(100u));
    EXPECT_EQ(timeLine.chapters[1].end, Ticks(150u));
}

} // namespace

} // namespace deskplayer
