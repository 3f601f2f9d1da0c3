#include "navigator/simulatednavigator.h"

#include <string>
#include <utility>

#include "bdmvnavigator/navigatorevent.h"
#include "navigator/resumedata.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

/** SkipToPreviousChapter() goes to the previous chapter if this one has played for less. */
constexpr Ticks SkipBackWindow = std::chrono::seconds(3);

} // namespace

SimulatedNavigator::SimulatedNavigator(LoadedPlayList playList, VirtualClock& clock,
                                       EventDelivery& delivery)
    : m_PlayList(std::move(playList)), m_Sender(m_Context, delivery),
      m_Transport(clock, m_State, m_Playhead, m_Menu, m_Announcer, m_Sender)
{
}

// ---------------------------------------------------------------------------------------------
// Playback

Outcome SimulatedNavigator::Play()
{
    const Outcome outcome = m_Permission.CheckStatus({Status::Stopped, Status::Finished});
    if (!outcome.IsDone()) {
        return outcome;
    }
    if (std::exchange(m_PlayFails, false)) {
        m_Sender.Send<bdmv::PlayFailedEvent>();
        return outcome;
    }
    m_Transport.Start();
    return outcome;
}

Outcome SimulatedNavigator::Stop()
{
    return Operate(bd::UserOperationStop, m_Permission.CheckActive(),
                   [this] { m_Transport.Stop(); });
}

Outcome SimulatedNavigator::Pause()
{
    return Operate(bd::UserOperationPauseOn, m_Permission.CheckStatus({Status::Playing}), [this] {
        m_State.status = Status::Paused;
        m_Sender.Send<bdmv::PausedEvent>();
    });
}

Outcome SimulatedNavigator::Continue()
{
    return Operate(m_Permission.CheckStatus({Status::Paused}), [this] {
        m_State.status = Status::Playing;
        m_Sender.Send<bdmv::ContinuedEvent>();
        m_Transport.ChangePlayMode(m_State.playMode);
    });
}

Outcome SimulatedNavigator::Step()
{
    Outcome outcome = m_Permission.CheckStatus({Status::Paused});
    if (outcome.IsDone() && !m_Transport.CanStep()) {
        outcome = Outcome::Refused(m_State.playMode.Direction() == bd::PlayDirectionForward
                                       ? "no further picture before a still or the end"
                                       : "this is the first picture");
    }
    return Operate(outcome, [this] { m_Transport.Step(); });
}

Outcome SimulatedNavigator::SetPlayMode(bd::PlayMode mode)
{
    const Outcome possible = m_Permission.CheckStatus({Status::Playing, Status::Paused});
    const auto change = [this, mode] {
        if (m_State.status == Status::Playing) {
            m_Transport.ChangePlayMode(mode);
        } else {
            m_State.playMode = mode;
        }
    };
    if (mode.Direction() == bd::PlayDirectionBackward) {
        return Operate(bd::UserOperationBackwardPlay, possible, change);
    }
    if (mode.Speed() != bd::PlaySpeedNormal) {
        return Operate(bd::UserOperationForwardPlay, possible, change);
    }
    return Operate(possible, change);
}

Outcome SimulatedNavigator::EndStill()
{
    return Operate(bd::UserOperationStillOff, m_Permission.CheckStatus({Status::Still}),
                   [this] { m_Transport.LeaveStill(); });
}

Outcome SimulatedNavigator::Suspend()
{
    return Operate(m_Permission.CheckActive(), [this] {
        m_State.statusBeforeSuspend = std::exchange(m_State.status, Status::Suspended);
        m_Sender.Send<bdmv::SuspendedEvent>();
    });
}

Outcome SimulatedNavigator::Resume()
{
    return Operate(bd::UserOperationResume, m_Permission.CheckStatus({Status::Suspended}), [this] {
        if (std::exchange(m_ResumeFails, false)) {
            m_Menu.Close();
            m_State.status = Status::Stopped;
            m_Sender.Send<bdmv::ResumeFailedEvent>();
        } else {
            m_State.status = m_State.statusBeforeSuspend;
            m_Sender.Send<bdmv::ResumedEvent>();
        }
    });
}

// ---------------------------------------------------------------------------------------------
// Position

Outcome SimulatedNavigator::SearchTime(Ticks position)
{
    const Ticks duration = m_PlayList.timeLine.duration;
    Outcome outcome = m_Permission.CheckActive();
    if (outcome.IsDone() && position >= duration) {
        outcome = Outcome::Refused("the play list ends at " + TimeText(duration));
    } else if (outcome.IsDone()) {
        outcome = CheckRandomAccess(position);
    }
    return Operate(bd::UserOperationTimeSearch, outcome,
                   [this, position] { m_Transport.JumpTo(position); });
}

Outcome SimulatedNavigator::SearchChapter(std::uint64_t number)
{
    return JumpToChapter(bd::UserOperationChapterSearch, number);
}

Outcome SimulatedNavigator::SkipToNextChapter()
{
    const std::uint64_t number = m_Context.GetCurrentChapter();
    const Chapter* const next = m_Playhead.ChapterAfter(number);
    return JumpToChapter(bd::UserOperationSkipToNextPoint,
                         next == nullptr ? number + 1U : next->number);
}

Outcome SimulatedNavigator::SkipToPreviousChapter()
{
    const std::uint64_t number = m_Context.GetCurrentChapter();
    const Chapter* const chapter = m_Playhead.FindChapter(number);
    const Chapter* const previous = m_Playhead.ChapterBefore(number);
    const bool justStarted = chapter != nullptr && previous != nullptr &&
                             m_State.position - chapter->start < SkipBackWindow;
    return JumpToChapter(bd::UserOperationSkipBackToPreviousPoint,
                         justStarted ? previous->number : number);
}

Outcome SimulatedNavigator::JumpToChapter(bd::UserOperationMaskDef operation, std::uint64_t number)
{
    const std::vector<Chapter>& chapters = m_PlayList.timeLine.chapters;
    const Chapter* const chapter = m_Playhead.FindChapter(number);
    Outcome outcome = m_Permission.CheckActive();
    if (outcome.IsDone() && chapter == nullptr) {
        const std::uint64_t last = chapters.empty() ? 0 : chapters.back().number;
        outcome = number != 0 && number < last
                      ? Outcome::Refused("the mark of chapter " + std::to_string(number) +
                                         " is outside its play item")
                      : Outcome::NoSuch("chapter", number, last);
    } else if (outcome.IsDone()) {
        outcome = CheckRandomAccess(chapter->start);
    }
    const Ticks start = chapter == nullptr ? Ticks(0) : chapter->start;
    return Operate(operation, outcome, [this, start] { m_Transport.JumpTo(start); });
}

/** A flag does not restrict jumps within its play item: playback has entered it already. */
Outcome SimulatedNavigator::CheckRandomAccess(Ticks position) const
{
    const std::size_t item = m_Playhead.ItemAt(position);
    return item != m_State.item && m_PlayList.playList.playItems[item].randomAccessFlag
               ? Outcome::Refused("play item " + std::to_string(item) +
                                  " does not permit random access")
               : Outcome::Done();
}

// ---------------------------------------------------------------------------------------------
// Repeat and triggers

void SimulatedNavigator::SetTriggerType(bd::TriggerType type, bool result)
{
    if (result) {
        m_State.trigger = type;
    }
    m_Sender.Send<bdmv::TriggerSetEvent>(type, result);
}

Outcome SimulatedNavigator::SetPointA()
{
    return Operate(m_Permission.CheckActive(), [this] {
        m_State.chapterTitleRepeat = bd::TRIGGER_NONE;
        m_State.pointA = m_State.position;
        m_State.pointB = std::nullopt;
        SetTriggerType(bd::TRIGGER_A, true);
    });
}

Outcome SimulatedNavigator::SetPointB()
{
    return Operate(m_Permission.CheckActive(), [this] {
        const bool possible = m_State.pointA && *m_State.pointA < m_State.position;
        if (possible) {
            m_State.pointB = m_State.position;
        }
        SetTriggerType(bd::TRIGGER_B, possible);
        if (possible) {
            m_Transport.RepeatFrom(*m_State.pointA);
        }
    });
}

Outcome SimulatedNavigator::EndABRepeat()
{
    return Operate(m_Permission.CheckActive(), [this] {
        m_State.pointA = std::nullopt;
        m_State.pointB = std::nullopt;
        SetTriggerType(bd::TRIGGER_AB_NONE, true);
    });
}

Outcome SimulatedNavigator::SetChapterTitleRepeat(bd::TriggerType repeat)
{
    return Operate(m_Permission.CheckActive(), [this, repeat] {
        m_State.pointA = std::nullopt;
        m_State.pointB = std::nullopt;
        m_State.chapterTitleRepeat = repeat;
        SetTriggerType(repeat, true);
    });
}

Outcome SimulatedNavigator::RepeatChapter()
{
    return SetChapterTitleRepeat(bd::TRIGGER_CHP);
}

Outcome SimulatedNavigator::RepeatTitle()
{
    return SetChapterTitleRepeat(bd::TRIGGER_TITLE);
}

Outcome SimulatedNavigator::EndChapterTitleRepeat()
{
    return Operate(m_Permission.CheckActive(), [this] {
        m_State.chapterTitleRepeat = bd::TRIGGER_NONE;
        SetTriggerType(bd::TRIGGER_NONE, true);
    });
}

Outcome SimulatedNavigator::SetTrigger(Ticks position)
{
    const Ticks duration = m_PlayList.timeLine.duration;
    Outcome outcome = m_Permission.CheckActive();
    if (outcome.IsDone() && position > duration) {
        outcome = Outcome::Refused(TimeText(position) + " is past the end of the play list, " +
                                   "which lasts " + TimeText(duration));
    }
    return Operate(outcome, [this, position] {
        m_State.notifyAt = position;
        SetTriggerType(bd::TRIGGER_NOTIFY_FROM_CURPOS, true);
    });
}

// ---------------------------------------------------------------------------------------------
// The system

Outcome SimulatedNavigator::GoToStandby()
{
    return Operate(m_Permission.CheckActive(), [this] {
        ResumePoint point;
        point.playList = m_PlayList.number;
        point.playing = m_State.status != Status::Paused;
        point.playItem = m_Context.GetPlayItemId();
        point.position = m_State.position;
        point.playMode = m_State.playMode;
        point.selection = m_State.selection;
        m_Context.StoreSystemResumeData(MakeResumeData(point));
        m_Menu.Close();
        m_State.status = Status::Standby;
        m_State.stillLeft = std::nullopt;
        m_Sender.Send<bdmv::SystemSuspendedEvent>();
    });
}

Outcome SimulatedNavigator::WakeUp(const std::vector<bd::UInt8>& resumeData)
{
    return Operate(m_Permission.CheckStatus({Status::Standby}), [this, &resumeData] {
        const std::optional<ResumePoint> point = ReadResumeData(resumeData);
        if (!point || !IsInPlayList(*point)) {
            m_State.status = Status::Stopped;
            m_Sender.Send<bdmv::SystemResumeFailedEvent>();
            return;
        }
        m_Transport.StartFrom(*point);
    });
}

bool SimulatedNavigator::IsInPlayList(const ResumePoint& point) const
{
    return point.playList == m_PlayList.number &&
           point.playItem < m_PlayList.timeLine.itemStarts.size() &&
           point.position >= m_Playhead.StartOfItem(point.playItem) &&
           point.position <= m_Playhead.EndOfItem(point.playItem);
}

// ---------------------------------------------------------------------------------------------
// Failures

Outcome SimulatedNavigator::FailPreload()
{
    return Operate(m_Permission.CheckActive(),
                   [this] { m_Sender.Send<bdmv::PreloadFailedEvent>(); });
}

Outcome SimulatedNavigator::Starve()
{
    return Operate(m_Permission.CheckActive(),
                   [this] { m_Transport.Finish(bdstreaming::FinishedReasonDataStarvation); });
}

} // namespace deskplayer
