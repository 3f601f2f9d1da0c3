#include "navigator/transport.h"

#include <algorithm>
#include <vector>

#include "bdmvnavigator/navigatorevent.h"

namespace deskplayer
{

namespace
{

constexpr Ticks Second = std::chrono::seconds(1); ///< the interval of position reports

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
    if (m_rState.position % Second == Ticks(0)) {
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
    if (position == m_rState.pointB) {
        RepeatFrom(*m_rState.pointA);
        return;
    }
    if (m_rState.chapterTitleRepeat == bd::TRIGGER_CHP) {
        const Chapter* const chapter = m_rPlayhead.FindChapter(m_rAnnouncer.AnnouncedChapter());
        if (chapter != nullptr && chapter->start < chapter->end && position == chapter->end) {
            RepeatFrom(chapter->start);
            return;
        }
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

bool Transport::CanStep() const
{
    const Ticks duration = PictureDuration(m_rPlayhead.CurrentStreams().primaryVideo);
    return m_rPlayhead.IsForward()
               ? m_rState.position + duration < m_rPlayhead.EndOfItem(m_rState.item)
               : m_rState.position >= m_rPlayhead.StartOfItem(m_rState.item) + duration;
}

void Transport::Step()
{
    m_rPlayhead.DropRemainder();
    Ticks left = PictureDuration(m_rPlayhead.CurrentStreams().primaryVideo);
    while (left > Ticks(0)) {
        const Ticks distance = std::min(left, m_rPlayhead.DistanceToNextStop());
        left -= distance;
        m_rPlayhead.Move(distance);
        const Ticks reached = m_rState.position;
        ReachPosition();
        if (m_rState.position != reached) {
            break;
        }
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
