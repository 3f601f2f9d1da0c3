#include "disc/timeline.h"

#include <algorithm>

namespace deskplayer
{

namespace
{

std::optional<Ticks> PositionOf(const Mark& mark, const PlayList& playList,
                                const std::vector<Ticks>& itemStarts)
{
    if (mark.playItem >= playList.playItems.size()) {
        return std::nullopt;
    }
    const PlayItem& item = playList.playItems[mark.playItem];
    if (mark.time < item.inTime || mark.time > item.outTime) {
        return std::nullopt;
    }
    return itemStarts[mark.playItem] + Ticks(mark.time - item.inTime);
}

} // namespace

TimeLine BuildTimeLine(const PlayList& playList)
{
    TimeLine timeLine;
    for (const PlayItem& item : playList.playItems) {
        timeLine.itemStarts.push_back(timeLine.duration);
        timeLine.duration += Ticks(item.outTime - item.inTime);
    }

    std::size_t chapterNumber = 0;
    for (std::size_t index = 0; index < playList.marks.size(); ++index) {
        const Mark& mark = playList.marks[index];
        const auto position = PositionOf(mark, playList, timeLine.itemStarts);
        timeLine.markPositions.push_back(position);
        if (mark.type != MarkTypeEntry) {
            continue;
        }
        ++chapterNumber;
        if (position) {
            timeLine.chapters.push_back(
                {chapterNumber, index, mark.playItem, *position, timeLine.duration});
        }
    }

    // Marks need not be in playback order; a chapter that would end before it starts is empty.
    for (std::size_t index = 1; index < timeLine.chapters.size(); ++index) {
        Chapter& chapter = timeLine.chapters[index - 1];
        chapter.end = std::max(chapter.start, timeLine.chapters[index].start);
    }
    return timeLine;
}

} // namespace deskplayer
