#include "navigator/playhead.h"

#include <algorithm>
#include <iterator>
#include <limits>
#include <tuple>
#include <utility>

#include "navigator/playspeed.h"

namespace deskplayer
{

namespace
{

const StreamTable StreamsOfNoItem;

/** A search key for LoadedPlayList::marksByPosition. */
std::pair<Ticks, std::size_t> MarkAt(Ticks position, std::size_t index)
{
    return {position, index};
}

constexpr std::size_t LastMark = std::numeric_limits<std::size_t>::max();

} // namespace

const PlayItem* Playhead::CurrentItem() const
{
    const std::vector<PlayItem>& items = m_rPlayList.playList.playItems;
    return m_rState.item < items.size() ? &items[m_rState.item] : nullptr;
}

const StreamTable& Playhead::CurrentStreams() const
{
    const PlayItem* const item = CurrentItem();
    return item == nullptr ? StreamsOfNoItem : item->streams;
}

const Chapter* Playhead::CurrentChapter() const
{
    // Where one play item ends and the next starts, the chapters of the next one come later.
    const std::vector<Chapter>& chapters = m_rPlayList.chaptersByStart;
    const auto next = std::upper_bound(chapters.begin(), chapters.end(), m_rState,
                                       [](const PlaybackState& state, const Chapter& chapter) {
                                           return std::tie(state.position, state.item) <
                                                  std::tie(chapter.start, chapter.playItem);
                                       });
    return next == chapters.begin() ? nullptr : &*std::prev(next);
}

const Chapter* Playhead::FindChapter(std::uint64_t number) const
{
    const std::vector<Chapter>& chapters = m_rPlayList.timeLine.chapters;
    const auto found = std::find_if(chapters.begin(), chapters.end(),
                                    [number](const Chapter& c) { return c.number == number; });
    return found == chapters.end() ? nullptr : &*found;
}

const Chapter* Playhead::ChapterAfter(std::uint64_t number) const
{
    const std::vector<Chapter>& chapters = m_rPlayList.timeLine.chapters; // in order of number
    const auto found = std::find_if(chapters.begin(), chapters.end(),
                                    [number](const Chapter& c) { return c.number > number; });
    return found == chapters.end() ? nullptr : &*found;
}

const Chapter* Playhead::ChapterBefore(std::uint64_t number) const
{
    const std::vector<Chapter>& chapters = m_rPlayList.timeLine.chapters;
    const auto found = std::find_if(chapters.rbegin(), chapters.rend(),
                                    [number](const Chapter& c) { return c.number < number; });
    return found == chapters.rend() ? nullptr : &*found;
}

std::size_t Playhead::ItemAt(Ticks position) const
{
    const std::vector<Ticks>& starts = m_rPlayList.timeLine.itemStarts;
    const auto next = std::upper_bound(starts.begin(), starts.end(), position);
    return static_cast<std::size_t>(next - starts.begin()) - 1;
}

Ticks Playhead::EndOfItem(std::size_t item) const
{
    const TimeLine& timeLine = m_rPlayList.timeLine;
    return item + 1 < timeLine.itemStarts.size() ? timeLine.itemStarts[item + 1]
                                                 : timeLine.duration;
}

std::vector<std::size_t> Playhead::MarksHere(std::size_t firstItem) const
{
    std::vector<std::size_t> here;
    const auto& marks = m_rPlayList.marksByPosition;
    auto mark = std::lower_bound(marks.begin(), marks.end(), MarkAt(m_rState.position, 0));
    for (; mark != marks.end() && mark->first == m_rState.position; ++mark) {
        const std::size_t item = m_rPlayList.playList.marks[mark->second].playItem;
        if (item >= firstItem && item <= m_rState.item) {
            here.push_back(mark->second);
        }
    }
    return here;
}

bool Playhead::IsForward() const
{
    const bd::PlayMode& mode =
        m_rState.status == Status::Paused ? m_rState.playMode : m_rState.currentPlayMode;
    return mode.Direction() == bd::PlayDirectionForward;
}

bool Playhead::IsRepeating() const
{
    const TimeLine& timeLine = m_rPlayList.timeLine;
    // Backward playback turns around at the start, so every repeat is still ahead.
    const Ticks from = IsForward() ? m_rState.position : Ticks(0);
    switch (m_rState.chapterTitleRepeat) {
    case bd::TRIGGER_CHP:
        return std::any_of(timeLine.chapters.begin(), timeLine.chapters.end(),
                           [from](const Chapter& chapter) {
                               return chapter.start < chapter.end && from < chapter.end;
                           });
    case bd::TRIGGER_TITLE:
        return timeLine.duration > Ticks(0);
    default:
        return m_rState.pointB && from < *m_rState.pointB;
    }
}

Ticks Playhead::NextStop() const
{
    return IsForward() ? NextStopForward() : NextStopBackward();
}

Ticks Playhead::NextStopForward() const
{
    const Ticks position = m_rState.position;
    Ticks stop = std::min(EndOfItem(m_rState.item),
                          position - position % PositionInterval + PositionInterval);
    const auto consider = [&stop, position](std::optional<Ticks> candidate) {
        if (candidate && *candidate > position) {
            stop = std::min(stop, *candidate);
        }
    };
    const auto& marks = m_rPlayList.marksByPosition;
    const auto mark = std::upper_bound(marks.begin(), marks.end(), MarkAt(position, LastMark));
    if (mark != marks.end()) {
        consider(mark->first);
    }
    consider(m_rState.pointB);
    consider(m_rState.notifyAt);
    return stop;
}

Ticks Playhead::NextStopBackward() const
{
    const Ticks position = m_rState.position;
    if (position == Ticks(0)) {
        return position;
    }
    const Ticks last = position - Ticks(1);
    Ticks stop = last - last % PositionInterval;
    const auto consider = [&stop, position](std::optional<Ticks> candidate) {
        if (candidate && *candidate < position) {
            stop = std::max(stop, *candidate);
        }
    };
    // Backward playback leaves an item or a chapter at the last position before its start.
    const auto considerLeaving = [&consider](Ticks start) {
        if (start > Ticks(0)) {
            consider(start - Ticks(1));
        }
    };
    considerLeaving(StartOfItem(m_rState.item));
    if (const Chapter* const chapter = CurrentChapter()) {
        considerLeaving(chapter->start);
    }
    const auto& marks = m_rPlayList.marksByPosition;
    const auto mark = std::lower_bound(marks.begin(), marks.end(), MarkAt(position, 0));
    if (mark != marks.begin()) {
        consider(std::prev(mark)->first);
    }
    consider(m_rState.notifyAt);
    return stop;
}

Ticks Playhead::DistanceToNextStop() const
{
    const Ticks stop = NextStop();
    return IsForward() ? stop - m_rState.position : m_rState.position - stop;
}

Ticks Playhead::TimeToNextStop() const
{
    const SpeedRatio ratio = RatioOf(m_rState.currentPlayMode.Speed());
    const Ticks::rep needed = DistanceToNextStop().count() * ratio.passed;
    return Ticks(needed <= m_SubTickRemainder
                     ? 0
                     : (needed - m_SubTickRemainder + ratio.played - 1) / ratio.played);
}

Ticks Playhead::Pass(Ticks time)
{
    const SpeedRatio ratio = RatioOf(m_rState.currentPlayMode.Speed());
    m_SubTickRemainder += time.count() * ratio.played;
    const Ticks distance = std::min(DistanceToNextStop(), Ticks(m_SubTickRemainder / ratio.passed));
    m_SubTickRemainder -= distance.count() * ratio.passed;
    Move(distance);
    return distance;
}

void Playhead::Move(Ticks distance)
{
    if (IsForward()) {
        m_rState.position += distance;
    } else {
        m_rState.position -= distance;
    }
}

bool Playhead::JumpTo(Ticks position)
{
    DropRemainder();
    m_rState.position = position;
    const std::size_t item = ItemAt(position);
    const bool changes = item != m_rState.item;
    if (changes) {
        Enter(item);
    }
    return changes;
}

void Playhead::Enter(std::size_t item)
{
    m_rState.previousItem = m_rState.item;
    m_rState.item = item;
}

} // namespace deskplayer
