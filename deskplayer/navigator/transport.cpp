#include "navigator/transport.h"

#include <algorithm>
#include <vector>

#include "bdmvnavigator/navigatorevent.h"

namespace deskplayer
{

namespace
{

/** The duration of a picture, rounded to the nearest tick. */
Ticks PictureDuration(const std::vector<Stream>& videos)
{
    switch (videos.empty() ? 0 : videos.front().attributes.frameRate) {
    case 1: // 24000/1001 Hz
        return Ticks(1877);
    case 2: // 24 Hz
        return Ticks(1875);
    case 4: // 30000/1001 Hz
        return Ticks(1502);
    case 6: // 50 Hz
        return Ticks(900);
    case 7: // 60000/1001 Hz
        return Ticks(751);
    default: // 25 Hz
        return Ticks(1800);
    }
}

} // namespace

// ---------------------------------------------------------------------------------------------
// Time passes

std::optional<Ticks> Transport::TimeToNextChange() const
{
    switch (m_rState.status) {
    case Status::Playing:
        return m_rPlayhead.TimeToNextStop();
    case Status::Still:
        return m_rState.stillLeft;
    default:
        return std::nullopt;
    }
}

Ticks Transport::Advance(Ticks time)
{
    while (m_rState.status != Status::Stopped && m_rState.status != Status::Finished) {
        const std::optional<Ticks> next = TimeToNextChange();
        const bool changes = next && *next <= time;
        const Ticks pass = changes ? *next : time;
        m_rClock.Advance(pass);
        time -= pass;

        Ticks distance(0);
        if (m_rState.status == Status::Playing) {
            distance = m_rPlayhead.Pass(pass);
        } else if (m_rState.status == Status::Still && m_rState.stillLeft) {
            *m_rState.stillLeft -= pass;
        }

        if (!changes) {
            break;
        }
        if (m_rState.status == Status::Still) {
            LeaveStill();
        } else if (distance > Ticks(0)) {
            ReachPosition();
        } else {
            ReachEnd();
        }
    }
    return time;
}

/** Sends the events of a position that playback has reached, and carries out a repeat there. */
void Transport::ReachPosition()
{
    if (m_rState.position % PositionInterval == Ticks(0)) {
        m_rSender.Send<bdmv::CurrentTimePositionEvent>();
    }
    if (m_rState.position == m_rState.notifyAt) {
        ReachTrigger(bd::TRIGGER_NOTIFY_FROM_CURPOS);
    }
    if (m_rPlayhead.IsForward()) {
        ReachForward();
    } else {
        ReachBackward();
    }
}

void Transport::ReachForward()
{
    const Ticks position = m_rState.position;
    if (RepeatsAt(position)) {
        RepeatFrom(position == m_rState.pointB
                       ? *m_rState.pointA
                       : m_rPlayhead.FindChapter(m_rAnnouncer.AnnouncedChapter())->start);
        return;
    }
    AnnounceMarks(m_rState.item);
    m_rAnnouncer.AnnounceChapter();
}

void Transport::ReachBackward()
{
    if (m_rState.position < m_rPlayhead.StartOfItem(m_rState.item)) {
        m_rPlayhead.Enter(m_rPlayhead.ItemAt(m_rState.position));
        EnterItem();
    }
    AnnounceMarks(0);
    m_rAnnouncer.AnnounceChapter();
}

/** @param type of the trigger, since there can be several at the position */
void Transport::ReachTrigger(bd::TriggerType type)
{
    m_rState.triggerReachedTime = m_rState.position;
    m_rState.triggerReached = type;
    m_rSender.Send<bdmv::TriggerReachedEvent>();
    m_rState.triggerReached.reset();
}

/** Handles the end of the play item or, playing backward, the start of the play list. */
void Transport::ReachEnd()
{
    if (m_rPlayhead.IsForward()) {
        ReachEndOfItem();
    } else {
        ChangePlayMode(bd::PlayMode()); // as players do at the start of a disc
    }
}

void Transport::ReachEndOfItem()
{
    const PlayItem& item = *m_rPlayhead.CurrentItem();
    if (item.stillMode == StillModeNone) {
        EnterNextItem();
        return;
    }
    m_rState.status = Status::Still;
    m_rState.stillLeft = std::nullopt;
    if (item.stillMode == StillModeTimed) {
        m_rState.stillLeft = std::chrono::seconds(item.stillTime);
    }
    m_rSender.Send<bdmv::StillOnEvent>();
}

void Transport::LeaveStill()
{
    if (m_rState.status != Status::Still) {
        return;
    }
    m_rState.status = Status::Playing;
    m_rState.stillLeft = std::nullopt;
    m_rSender.Send<bdmv::StillOffEvent>();
    EnterNextItem();
}

void Transport::EnterNextItem()
{
    const TimeLine& timeLine = m_rPlayhead.LoadedList().timeLine;
    if (m_rState.item + 1 < timeLine.itemStarts.size()) {
        m_rPlayhead.Enter(m_rState.item + 1);
        m_rState.position = m_rPlayhead.StartOfItem(m_rState.item);
        EnterItem();
        AnnounceMarks(m_rState.item); // earlier items' marks were announced at their end
        m_rAnnouncer.AnnounceChapter();
    } else if (m_rState.chapterTitleRepeat == bd::TRIGGER_TITLE && timeLine.duration > Ticks(0)) {
        RepeatFrom(Ticks(0));
    } else {
        Finish(bdstreaming::FinishedReasonEndOfMedia);
    }
}

void Transport::EnterItem()
{
    m_rAnnouncer.AnnounceItem();
    if (m_rPlayhead.CurrentStreams().ig.empty()) {
        m_rMenu.Close();
    }
    m_rAnnouncer.AnnounceMenu();
}

void Transport::AnnounceMarks(std::size_t firstItem)
{
    for (const std::size_t mark : m_rPlayhead.MarksHere(firstItem)) {
        m_rState.mark = mark;
        m_rSender.Send<bdmv::MarkInfoEvent>(static_cast<bdmv::IPlayListMark::MarkType>(
            m_rPlayhead.LoadedList().playList.marks[mark].type));
    }
}

// ---------------------------------------------------------------------------------------------
// Starting and ending

/** Resets playback except for the viewer's selection, and forgets all announcements. */
void Transport::StartFresh()
{
    const StreamSelection selection = m_rState.selection;
    m_rState = PlaybackState();
    m_rState.selection = selection;
    m_rPlayhead.DropRemainder();
    m_rAnnouncer.Forget();
}

void Transport::Start()
{
    StartFresh();
    m_rState.status = Status::Playing;
    m_rSender.Send<bdmv::PlayStartedEvent>();
    m_rSender.Send<bdmv::PlaylistEvent>();
    if (m_rPlayhead.CurrentItem() == nullptr) {
        Finish(bdstreaming::FinishedReasonEndOfMedia);
        return;
    }
    EnterItem();
    m_rSender.Send<bdmv::FirstPictureDeliveredEvent>();
    AnnounceMarks(0);
    m_rAnnouncer.AnnounceChapter();
    m_rSender.Send<bdmv::CurrentTimePositionEvent>();
}

void Transport::StartFrom(const ResumePoint& point)
{
    StartFresh();
    m_rState.position = point.position;
    m_rState.item = point.playItem;
    m_rState.playMode = point.playMode;
    if (point.playing) {
        m_rState.currentPlayMode = point.playMode;
    }
    m_rState.selection = point.selection;
    m_rState.playingAfterSystemResume = point.playing;
    m_rState.status = point.playing ? Status::Playing : Status::Paused;
    m_rSender.Send<bdmv::SystemResumedEvent>();
    m_rSender.Send<bdmv::PlaylistEvent>();
    EnterItem();
    if (m_rState.currentPlayMode != bd::PlayMode()) {
        m_rSender.Send<bdmv::PlayModeEvent>();
    }
    m_rAnnouncer.AnnounceChapter();
    m_rSender.Send<bdmv::CurrentTimePositionEvent>();
}

void Transport::Stop()
{
    m_rMenu.Close();
    m_rState.status = Status::Stopped;
    m_rState.stillLeft = std::nullopt;
    m_rSender.Send<bdmv::StoppedEvent>();
}

void Transport::Finish(bdstreaming::FinishedReason reason)
{
    m_rMenu.Close();
    m_rState.status = Status::Finished;
    m_rState.stillLeft = std::nullopt;
    m_rState.finishedReason = reason;
    m_rSender.Send<bdmv::FinishedEvent>();
}

// ---------------------------------------------------------------------------------------------
// Moving

void Transport::ChangePlayMode(bd::PlayMode mode)
{
    m_rPlayhead.DropRemainder();
    m_rState.playMode = mode;
    if (m_rState.currentPlayMode != mode) {
        m_rState.currentPlayMode = mode;
        m_rSender.Send<bdmv::PlayModeEvent>();
        m_rAnnouncer.AnnounceSyncStreams();
    }
}

/** The position of the next picture; the end of the play item, or the position, without one. */
Ticks Transport::NextPicture() const
{
    const std::vector<PlayItem>& items = m_rPlayhead.LoadedList().playList.playItems;
    const Ticks position = m_rState.position;
    const Ticks duration = PictureDuration(m_rPlayhead.CurrentStreams().primaryVideo);
    if (m_rPlayhead.IsForward()) {
        return std::min(position + duration, m_rPlayhead.EndOfItem(m_rState.item));
    }
    const Ticks start = m_rPlayhead.StartOfItem(m_rState.item);
    if (position >= start + duration) {
        return position - duration;
    }
    if (start == Ticks(0)) {
        return position;
    }
    const std::size_t before = m_rPlayhead.ItemAt(start - Ticks(1));
    const Ticks last = PictureDuration(items[before].streams.primaryVideo);
    return std::max(m_rPlayhead.StartOfItem(before), start - std::min(start, last));
}

/** Whether playback that reaches @p position, forward, jumps back to the start of a repeat. */
bool Transport::RepeatsAt(Ticks position) const
{
    if (position == m_rState.pointB) {
        return true;
    }
    if (m_rState.chapterTitleRepeat != bd::TRIGGER_CHP) {
        return false;
    }
    const Chapter* const chapter = m_rPlayhead.FindChapter(m_rAnnouncer.AnnouncedChapter());
    return chapter != nullptr && chapter->start < chapter->end && position == chapter->end;
}

/** Whether a picture follows the active play item without a still in between. */
bool Transport::CanLeaveItem() const
{
    const std::vector<PlayItem>& items = m_rPlayhead.LoadedList().playList.playItems;
    for (std::size_t item = m_rState.item; item < items.size(); ++item) {
        const bool hasPicture = m_rPlayhead.StartOfItem(item) < m_rPlayhead.EndOfItem(item);
        if (item != m_rState.item && hasPicture) {
            return true;
        }
        if (items[item].stillMode != StillModeNone) {
            return false;
        }
    }
    return m_rState.chapterTitleRepeat == bd::TRIGGER_TITLE &&
           m_rPlayhead.LoadedList().timeLine.duration > Ticks(0);
}

bool Transport::CanStep() const
{
    if (!m_rPlayhead.IsForward()) {
        return m_rState.position != NextPicture();
    }
    const Ticks end = m_rPlayhead.EndOfItem(m_rState.item);
    return NextPicture() < end || (m_rState.position < end && RepeatsAt(end)) || CanLeaveItem();
}

void Transport::Step()
{
    m_rPlayhead.DropRemainder();
    const bool isForward = m_rPlayhead.IsForward();
    const Ticks target = NextPicture();
    bool repeats = false;
    while (m_rState.position != target && !repeats) {
        const Ticks left = isForward ? target - m_rState.position : m_rState.position - target;
        m_rPlayhead.Move(std::min(left, m_rPlayhead.DistanceToNextStop()));
        const Ticks reached = m_rState.position;
        ReachPosition();
        repeats = m_rState.position != reached;
    }
    // Play items without length have no picture.
    while (isForward && !repeats && m_rState.status == Status::Paused &&
           m_rState.position == m_rPlayhead.EndOfItem(m_rState.item)) {
        ReachEndOfItem();
    }
    m_rSender.Send<bdmv::SteppedEvent>();
}

void Transport::JumpTo(Ticks position)
{
    if (m_rState.status == Status::Still) {
        m_rState.status = Status::Playing;
        m_rState.stillLeft = std::nullopt;
        m_rSender.Send<bdmv::StillOffEvent>();
    }
    const bool changesItem = m_rPlayhead.JumpTo(position);
    m_rSender.Send<bdmv::JumpOccurredEvent>();
    if (changesItem) {
        EnterItem();
    }
    AnnounceMarks(0);
    m_rAnnouncer.AnnounceChapter();
    m_rSender.Send<bdmv::CurrentTimePositionEvent>();
}

void Transport::RepeatFrom(Ticks position)
{
    ReachTrigger(bd::TRIGGER_INVALID); // the repeat states identify the repeat
    JumpTo(position);
}

} // namespace deskplayer
