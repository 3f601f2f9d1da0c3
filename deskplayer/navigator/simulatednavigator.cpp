#include "navigator/simulatednavigator.h"

#include <algorithm>
#include <iterator>
#include <limits>
#include <memory>

#include "bdmvnavigator/navigatorevent.h"
#include "disc/codes.h"
#include "navigator/audioinfo.h"
#include "navigator/buttonprogram.h"
#include "navigator/playspeed.h"
#include "output/names.h"
#include "output/timetext.h"

namespace deskplayer
{

namespace
{

/** SkipToPreviousChapter() goes to the chapter before within this time of the start. */
constexpr std::uint64_t SkipBackWindow = 3 * std::uint64_t{TicksPerSecond};

/** How long a picture is shown, in ticks, rounded to the nearest. */
std::uint64_t PictureDuration(const std::vector<Stream>& videos)
{
    switch (videos.empty() ? 0 : videos.front().attributes.frameRate) {
    case 1: // 24000/1001 Hz
        return 1877;
    case 2: // 24 Hz
        return 1875;
    case 4: // 30000/1001 Hz
        return 1502;
    case 6: // 50 Hz
        return 900;
    case 7: // 60000/1001 Hz
        return 751;
    default: // 25 Hz
        return 1800;
    }
}

/** A mark to compare those of LoadedPlayList::marksByPosition with. */
std::pair<std::uint64_t, std::size_t> MarkAt(std::uint64_t position, std::size_t index)
{
    return {position, index};
}

constexpr std::size_t LastMark = std::numeric_limits<std::size_t>::max();

bool SameAudio(const bd::AudioInfoType& left, const bd::AudioInfoType& right)
{
    return left.format == right.format && left.sampleRate == right.sampleRate &&
           left.bitsPerSampling == right.bitsPerSampling && left.channels == right.channels &&
           left.pid == right.pid && left.u4AudChannelLayout == right.u4AudChannelLayout;
}

Outcome NoSuch(const char* what, std::uint64_t number, std::size_t count)
{
    return Outcome::Refused(
        "there is no " + std::string(what) + " " + std::to_string(number) +
        (count == 0 ? ", there is none here" : ", they count from 1 to " + std::to_string(count)));
}

const char* NameOf(SimulatedNavigator::Status status)
{
    switch (status) {
    case SimulatedNavigator::Status::Stopped:
        return "stopped";
    case SimulatedNavigator::Status::Playing:
        return "playing";
    case SimulatedNavigator::Status::Paused:
        return "paused";
    case SimulatedNavigator::Status::Still:
        return "in a still";
    case SimulatedNavigator::Status::Suspended:
        return "suspended";
    case SimulatedNavigator::Status::Standby:
        return "in standby";
    case SimulatedNavigator::Status::Finished:
        return "at its end";
    }
    return "";
}

} // namespace

SimulatedNavigator::SimulatedNavigator(LoadedPlayList playList, VirtualClock& clock,
                                       EventDelivery& delivery)
    : PlaybackContext(std::move(playList)), m_rClock(clock), m_rDelivery(delivery)
{
}

template <typename Event, typename... Arguments>
void SimulatedNavigator::Send(Arguments... arguments)
{
    m_rDelivery.Post(std::make_unique<Event>(*this, arguments...));
    m_rDelivery.Settle();
}

// ---------------------------------------------------------------------------------------------
// Whether an operation may be carried out now

Outcome SimulatedNavigator::CheckMask(bd::UserOperationMaskDef operation) const
{
    if (m_Status == Status::Stopped || m_Status == Status::Standby ||
        m_Status == Status::Finished) {
        return Outcome::Done(); // no mask is in force
    }
    const PlayList& playList = PlayListInPlayback().playList;
    const PlayItem* const item = CurrentItem();
    const bool byPlayList = bdmv::UOMaskTable(playList.applicationInfo.uoMask).IsSet(operation);
    const bool byItem = item != nullptr && bdmv::UOMaskTable(item->uoMask).IsSet(operation);
    if (!byPlayList && !byItem) {
        return Outcome::Done();
    }
    const std::string list = "play list " + std::to_string(PlayListInPlayback().number);
    const std::string who = "play item " + std::to_string(State().item);
    return Outcome::Refused(deskplayer::NameOf(operation) + " is forbidden by " +
                            (!byItem       ? list
                             : !byPlayList ? who
                                           : list + " and its " + who));
}

Outcome SimulatedNavigator::CheckStatus(std::initializer_list<Status> statuses) const
{
    if (std::find(statuses.begin(), statuses.end(), m_Status) != statuses.end()) {
        return Outcome::Done();
    }
    std::string expected;
    for (const Status status : statuses) {
        expected += (expected.empty() ? "" : " or ") + std::string(NameOf(status));
    }
    return Outcome::Refused(std::string("playback is ") + NameOf(m_Status) + ", not " + expected);
}

/** Whether there is something on the screen that an operation could change. */
Outcome SimulatedNavigator::CheckActive() const
{
    return CheckStatus({Status::Playing, Status::Paused, Status::Still});
}

template <typename Action>
Outcome SimulatedNavigator::Operate(const Outcome& possible, Action action)
{
    if (possible.IsDone()) {
        action();
    }
    return possible;
}

/** The same for an operation that a disc can forbid; that counts more than what else is wrong. */
template <typename Action>
Outcome SimulatedNavigator::Operate(bd::UserOperationMaskDef operation, const Outcome& possible,
                                    Action action)
{
    const Outcome allowed = CheckMask(operation);
    return Operate(allowed.IsDone() ? possible : allowed, action);
}

bool SimulatedNavigator::IsRepeating() const
{
    const TimeLine& timeLine = PlayListInPlayback().timeLine;
    // Playing backward turns around at the start, so that everything is still ahead.
    const std::uint64_t from = IsForward() ? State().position : 0;
    switch (State().chapterTitleRepeat) {
    case bd::TRIGGER_CHP:
        return std::any_of(timeLine.chapters.begin(), timeLine.chapters.end(),
                           [from](const Chapter& chapter) {
                               return chapter.start < chapter.end && from < chapter.end;
                           });
    case bd::TRIGGER_TITLE:
        return timeLine.duration > 0;
    default:
        return State().pointB && from < *State().pointB;
    }
}

// ---------------------------------------------------------------------------------------------
// Time

std::uint64_t SimulatedNavigator::EndOfItem(std::size_t item) const
{
    const TimeLine& timeLine = PlayListInPlayback().timeLine;
    return item + 1 < timeLine.itemStarts.size() ? timeLine.itemStarts[item + 1]
                                                 : timeLine.duration;
}

/** The direction of play; while paused, that of the next step. */
bool SimulatedNavigator::IsForward() const
{
    const bd::PlayMode& mode =
        m_Status == Status::Paused ? State().playMode : State().currentPlayMode;
    return mode.Direction() == bd::PlayDirectionForward;
}

/** The next position at which something happens by itself, ahead in the direction of play. */
std::uint64_t SimulatedNavigator::NextStop() const
{
    return IsForward() ? NextStopForward() : NextStopBackward();
}

std::uint64_t SimulatedNavigator::NextStopForward() const
{
    const std::uint64_t position = State().position;
    std::uint64_t stop =
        std::min(EndOfItem(State().item), (position / TicksPerSecond + 1) * TicksPerSecond);
    const auto consider = [&stop, position](std::optional<std::uint64_t> candidate) {
        if (candidate && *candidate > position) {
            stop = std::min(stop, *candidate);
        }
    };
    const auto& marks = PlayListInPlayback().marksByPosition;
    const auto mark = std::upper_bound(marks.begin(), marks.end(), MarkAt(position, LastMark));
    if (mark != marks.end()) {
        consider(mark->first);
    }
    consider(State().pointB);
    consider(State().notifyAt);
    return stop;
}

std::uint64_t SimulatedNavigator::NextStopBackward() const
{
    const std::uint64_t position = State().position;
    if (position == 0) {
        return 0;
    }
    std::uint64_t stop = (position - 1) / TicksPerSecond * TicksPerSecond;
    const auto consider = [&stop, position](std::optional<std::uint64_t> candidate) {
        if (candidate && *candidate < position) {
            stop = std::max(stop, *candidate);
        }
    };
    // An item or a chapter is left with the last position before its start.
    const auto considerLeaving = [&consider](std::uint64_t start) {
        if (start > 0) {
            consider(start - 1);
        }
    };
    const LoadedPlayList& list = PlayListInPlayback();
    considerLeaving(list.timeLine.itemStarts[State().item]);
    if (const Chapter* const chapter = CurrentChapter()) {
        considerLeaving(chapter->start);
    }
    const auto& marks = list.marksByPosition;
    const auto mark = std::lower_bound(marks.begin(), marks.end(), MarkAt(position, 0));
    if (mark != marks.begin()) {
        consider(std::prev(mark)->first);
    }
    consider(State().notifyAt);
    return stop;
}

std::uint64_t SimulatedNavigator::DistanceToNextStop() const
{
    const std::uint64_t stop = NextStop();
    return IsForward() ? stop - State().position : State().position - stop;
}

void SimulatedNavigator::Move(std::uint64_t distance)
{
    if (IsForward()) {
        State().position += distance;
    } else {
        State().position -= distance;
    }
}

std::optional<std::uint64_t> SimulatedNavigator::TimeToNextChange() const
{
    if (m_Status == Status::Still) {
        return m_StillLeft;
    }
    if (m_Status != Status::Playing) {
        return std::nullopt;
    }
    const SpeedRatio ratio = RatioOf(State().currentPlayMode.Speed());
    const std::uint64_t needed = DistanceToNextStop() * ratio.passed;
    return needed <= m_Carry ? 0 : (needed - m_Carry + ratio.played - 1) / ratio.played;
}

std::uint64_t SimulatedNavigator::Advance(std::uint64_t ticks)
{
    while (m_Status != Status::Stopped && m_Status != Status::Finished) {
        const std::optional<std::uint64_t> next = TimeToNextChange();
        const bool changes = next && *next <= ticks;
        const std::uint64_t pass = changes ? *next : ticks;
        m_rClock.Advance(pass);
        ticks -= pass;

        std::uint64_t distance = 0;
        if (m_Status == Status::Playing) {
            const SpeedRatio ratio = RatioOf(State().currentPlayMode.Speed());
            m_Carry += pass * ratio.played;
            distance = changes ? DistanceToNextStop() : m_Carry / ratio.passed;
            m_Carry -= distance * ratio.passed;
            Move(distance);
        } else if (m_Status == Status::Still && m_StillLeft) {
            *m_StillLeft -= pass;
        }

        if (!changes) {
            break;
        }
        if (m_Status == Status::Still) {
            LeaveStill();
        } else if (distance > 0) {
            ReachPosition();
        } else {
            ReachEnd();
        }
    }
    return ticks;
}

/** Does what is due at a position that playback has moved to by itself, but for leaving it. */
void SimulatedNavigator::ReachPosition()
{
    const std::uint64_t position = State().position;
    if (position % TicksPerSecond == 0) {
        Send<bdmv::CurrentTimePositionEvent>();
    }
    if (position == State().notifyAt) {
        ReachTrigger(bd::TRIGGER_NOTIFY_FROM_CURPOS);
    }
    if (IsForward()) {
        ReachForward();
    } else {
        ReachBackward();
    }
}

void SimulatedNavigator::ReachForward()
{
    const std::uint64_t position = State().position;
    if (position == State().pointB) {
        RepeatFrom(*State().pointA);
        return;
    }
    if (State().chapterTitleRepeat == bd::TRIGGER_CHP) {
        const Chapter* const chapter = FindChapter(m_Told.chapter);
        if (chapter != nullptr && chapter->start < chapter->end && position == chapter->end) {
            RepeatFrom(chapter->start);
            return;
        }
    }
    AnnounceMarks(State().item);
    AnnounceChapter();
}

void SimulatedNavigator::ReachBackward()
{
    const PlaybackState& state = State();
    if (state.position < PlayListInPlayback().timeLine.itemStarts[state.item]) {
        State().previousItem = state.item;
        State().item = ItemAt(state.position);
        AnnounceItem();
    }
    AnnounceMarks(0);
    AnnounceChapter();
}

/** Goes on where there is nothing left ahead in the play item, or before the play list. */
void SimulatedNavigator::ReachEnd()
{
    if (IsForward()) {
        ReachEndOfItem();
    } else {
        ChangePlayMode(bd::PlayMode()); // a player turns around
    }
}

void SimulatedNavigator::ReachEndOfItem()
{
    const PlayItem& item = *CurrentItem();
    if (item.stillMode == StillModeNone) {
        EnterNextItem();
        return;
    }
    m_Status = Status::Still;
    m_StillLeft = std::nullopt;
    if (item.stillMode == StillModeTimed) {
        m_StillLeft = std::uint64_t{item.stillTime} * TicksPerSecond;
    }
    Send<bdmv::StillOnEvent>();
}

void SimulatedNavigator::LeaveStill()
{
    if (m_Status != Status::Still) {
        return;
    }
    m_Status = Status::Playing;
    m_StillLeft = std::nullopt;
    Send<bdmv::StillOffEvent>();
    EnterNextItem();
}

void SimulatedNavigator::EnterNextItem()
{
    const TimeLine& timeLine = PlayListInPlayback().timeLine;
    if (State().item + 1 < timeLine.itemStarts.size()) {
        State().previousItem = State().item;
        ++State().item;
        State().position = timeLine.itemStarts[State().item];
        AnnounceItem();
        AnnounceMarks(State().item); // the end of the one before told of those there
        AnnounceChapter();
    } else if (State().chapterTitleRepeat == bd::TRIGGER_TITLE && timeLine.duration > 0) {
        RepeatFrom(0);
    } else {
        Finish(bdstreaming::FinishedReasonEndOfMedia);
    }
}

void SimulatedNavigator::Finish(bdstreaming::FinishedReason reason)
{
    CloseMenu();
    m_Status = Status::Finished;
    m_StillLeft = std::nullopt;
    State().finishedReason = reason;
    Send<bdmv::FinishedEvent>();
}

// ---------------------------------------------------------------------------------------------
// What the listeners are told

std::size_t SimulatedNavigator::ItemAt(std::uint64_t position) const
{
    const std::vector<std::uint64_t>& starts = PlayListInPlayback().timeLine.itemStarts;
    const auto behind = std::upper_bound(starts.begin(), starts.end(), position);
    return static_cast<std::size_t>(behind - starts.begin()) - 1;
}

/** Tells about the play item, its streams and what it forbids. */
void SimulatedNavigator::AnnounceItem()
{
    Send<bdmv::PlayItemEvent>();
    AnnounceStreams();
    AnnounceStreamsInStep();
    AnnounceMask();
    AnnounceMenu();
}

/** Tells about the kinds of streams whose number or count is not what was told last. */
void SimulatedNavigator::AnnounceStreams()
{
    struct Kind {
        NumberAndCount now;
        void (SimulatedNavigator::*send)();
    };
    const std::array<Kind, StreamKinds> kinds = {
        {{ChosenVideo(), &SimulatedNavigator::Send<bdmv::VideoInfoEvent>},
         {ChosenAudio(), &SimulatedNavigator::Send<bdmv::AudioInfoEvent>},
         {ChosenAngle(), &SimulatedNavigator::Send<bdmv::AngleInfoEvent>},
         {ChosenPg(), &SimulatedNavigator::Send<bdmv::PresentationGraphicsInfoEvent>},
         {ChosenSecondaryVideo(), &SimulatedNavigator::Send<bdmv::SecondaryVideoInfoEvent>},
         {ChosenSecondaryAudio(), &SimulatedNavigator::Send<bdmv::SecondaryAudioInfoEvent>},
         {ChosenPipPg(), &SimulatedNavigator::Send<bdmv::PipPgTextStInfoEvent>},
         {ChosenIg(), &SimulatedNavigator::Send<bdmv::InteractiveGraphicsInfoEvent>}}};

    for (std::size_t i = 0; i < kinds.size(); ++i) {
        if (std::exchange(m_Told.streams[i], kinds[i].now) != kinds[i].now) {
            (this->*kinds[i].send)();
        }
    }

    const StreamTable& streams = CurrentStreams();
    AnnounceAudioInfo(true, streams.primaryAudio, State().selection.audio, m_Told.audio);
    AnnounceAudioInfo(false, streams.secondaryAudio, State().selection.secondaryAudio,
                      m_Told.secondaryAudio);

    const bd::UInt8 styles = GetNumberOfTextSubtitleStyles();
    if (styles != m_Told.styles) {
        m_Told.styles = styles;
        Send<bdmv::TextSubtitleStylesAvailableEvent>();
        if (styles != 0) {
            Send<bdmv::TextSubtitleStyleInfoEvent>();
        }
    }
}

void SimulatedNavigator::AnnounceAudioInfo(bool isPrimary, const std::vector<Stream>& streams,
                                           bd::StreamNumberDef number,
                                           std::optional<bd::AudioInfoType>& told)
{
    if (streams.empty()) {
        told.reset();
        return;
    }
    const bd::AudioInfoType now =
        AudioInfoOf(streams[std::min<std::size_t>(number, streams.size()) - 1]);
    if (!told || !SameAudio(now, *told)) {
        told = now;
        Send<bdmv::AudioInfoChangedEvent>(isPrimary, now);
    }
}

/**
 * Tells whether the secondary streams that are in step with the play item are available.
 * PlayItemEvent and PlayModeEvent tell about those that are not.
 */
void SimulatedNavigator::AnnounceStreamsInStep()
{
    const bool atNormalSpeed = State().currentPlayMode.Speed() == bd::PlaySpeedNormal;
    const auto anyInStep = [this](const std::vector<Stream>& streams) {
        return std::any_of(streams.begin(), streams.end(),
                           [this](const Stream& stream) { return !IsAsync(stream); });
    };
    const StreamTable& streams = CurrentStreams();
    const bool pip = anyInStep(streams.secondaryVideo) && atNormalSpeed;
    const bool audio = anyInStep(streams.secondaryAudio) && atNormalSpeed;
    if (std::exchange(m_Told.pipInStep, pip) != pip) {
        if (pip) {
            Send<bdmv::PipAvailableEvent>();
        } else if (!streams.secondaryVideo.empty()) {
            Send<bdmv::PipUnavailableEvent>();
        }
    }
    if (std::exchange(m_Told.secondaryAudioInStep, audio) != audio) {
        if (audio) {
            Send<bdmv::SecondaryAudioAvailableEvent>();
        } else if (!streams.secondaryAudio.empty()) {
            Send<bdmv::SecondaryAudioUnavailableEvent>();
        }
    }
}

void SimulatedNavigator::AnnounceMask()
{
    bdmv::UOMaskTable mask;
    GetUOMask(mask);
    if (!m_Told.mask || !(*m_Told.mask == mask)) {
        m_Told.mask = mask;
        Send<bdmv::UOMaskEvent>();
    }
}

void SimulatedNavigator::AnnounceMenu()
{
    const bool available = !CurrentStreams().ig.empty();
    if (std::exchange(m_Told.popUpMenu, available) == available) {
        return;
    }
    if (available) {
        Send<bdmv::PopUpMenuAvailableEvent>();
    } else {
        CloseMenu();
        Send<bdmv::PopUpMenuUnavailableEvent>();
    }
}

void SimulatedNavigator::AnnounceChapter()
{
    const bd::ChapterNumberDef chapter = GetCurrentChapter();
    if (chapter != m_Told.chapter) {
        m_Told.chapter = chapter;
        Send<bdmv::ChapterEvent>();
    }
}

/**
 * Tells about the marks at the position, in the order of the play list.
 *
 * @param firstItem the first whose marks are told, up to the one in playback: those at OUT of play
 *        items before it lie at the same position
 */
void SimulatedNavigator::AnnounceMarks(std::size_t firstItem)
{
    const LoadedPlayList& list = PlayListInPlayback();
    const auto& marks = list.marksByPosition;
    auto mark = std::lower_bound(marks.begin(), marks.end(), MarkAt(State().position, 0));
    for (; mark != marks.end() && mark->first == State().position; ++mark) {
        const Mark& passed = list.playList.marks[mark->second];
        if (passed.playItem >= firstItem && passed.playItem <= State().item) {
            State().mark = mark->second;
            Send<bdmv::MarkInfoEvent>(static_cast<bdmv::IPlayListMark::MarkType>(passed.type));
        }
    }
}

/** Moves playback and tells about all that is different there. */
void SimulatedNavigator::JumpTo(std::uint64_t position)
{
    m_Carry = 0;
    if (m_Status == Status::Still) {
        m_Status = Status::Playing;
        m_StillLeft = std::nullopt;
        Send<bdmv::StillOffEvent>();
    }
    const std::size_t item = ItemAt(position);
    State().position = position;
    const bool changesItem = item != State().item;
    if (changesItem) {
        State().previousItem = State().item;
        State().item = item;
    }
    Send<bdmv::JumpOccurredEvent>();
    if (changesItem) {
        AnnounceItem();
    }
    AnnounceMarks(0);
    AnnounceChapter();
    Send<bdmv::CurrentTimePositionEvent>();
}

/** Goes back in a repeat, after telling that its end was reached. */
void SimulatedNavigator::RepeatFrom(std::uint64_t position)
{
    ReachTrigger(bd::TRIGGER_INVALID); // the repeat states tell which repeat it is
    JumpTo(position);
}

/** @param type of the trigger, for there can be several at the position */
void SimulatedNavigator::ReachTrigger(bd::TriggerType type)
{
    State().triggerReachedTime = State().position;
    State().triggerReached = type;
    Send<bdmv::TriggerReachedEvent>();
    State().triggerReached.reset();
}

void SimulatedNavigator::ChangePlayMode(bd::PlayMode mode)
{
    m_Carry = 0;
    State().playMode = mode;
    if (State().currentPlayMode != mode) {
        State().currentPlayMode = mode;
        Send<bdmv::PlayModeEvent>();
        AnnounceStreamsInStep();
    }
}

// ---------------------------------------------------------------------------------------------
// Playback

/** Forgets what the listeners know, so that they are told everything. */
void SimulatedNavigator::StartFresh()
{
    const StreamSelection selection = State().selection;
    State() = PlaybackState();
    State().selection = selection;
    m_Carry = 0;
    m_Told = Told();
}

Outcome SimulatedNavigator::Play()
{
    const Outcome outcome = CheckStatus({Status::Stopped, Status::Finished});
    if (!outcome.IsDone()) {
        return outcome;
    }
    if (std::exchange(m_PlayFails, false)) {
        Send<bdmv::PlayFailedEvent>();
        return outcome;
    }
    StartFresh();
    m_Status = Status::Playing;
    Send<bdmv::PlayStartedEvent>();
    Send<bdmv::PlaylistEvent>();
    if (CurrentItem() == nullptr) {
        Finish(bdstreaming::FinishedReasonEndOfMedia);
        return outcome;
    }
    AnnounceItem();
    Send<bdmv::FirstPictureDeliveredEvent>();
    AnnounceMarks(0);
    AnnounceChapter();
    Send<bdmv::CurrentTimePositionEvent>();
    return outcome;
}

Outcome SimulatedNavigator::Stop()
{
    return Operate(bd::UserOperationStop, CheckActive(), [this] {
        CloseMenu();
        m_Status = Status::Stopped;
        m_StillLeft = std::nullopt;
        Send<bdmv::StoppedEvent>();
    });
}

Outcome SimulatedNavigator::Pause()
{
    return Operate(bd::UserOperationPauseOn, CheckStatus({Status::Playing}), [this] {
        m_Status = Status::Paused;
        Send<bdmv::PausedEvent>();
    });
}

Outcome SimulatedNavigator::Continue()
{
    return Operate(CheckStatus({Status::Paused}), [this] {
        m_Status = Status::Playing;
        Send<bdmv::ContinuedEvent>();
        ChangePlayMode(State().playMode);
    });
}

Outcome SimulatedNavigator::Step()
{
    const std::uint64_t duration = PictureDuration(CurrentStreams().primaryVideo);
    const std::uint64_t position = State().position;
    Outcome outcome = CheckStatus({Status::Paused});
    if (outcome.IsDone() &&
        (IsForward()
             ? position + duration >= EndOfItem(State().item)
             : position < PlayListInPlayback().timeLine.itemStarts[State().item] + duration)) {
        outcome = Outcome::Refused("the play item has no further picture in this direction");
    }
    return Operate(outcome, [&] {
        m_Carry = 0;
        StepBy(duration);
        Send<bdmv::SteppedEvent>();
    });
}

/** Passes what lies ahead as playback does. A repeat ends the step at its start. */
void SimulatedNavigator::StepBy(std::uint64_t duration)
{
    while (duration > 0) {
        const std::uint64_t distance = std::min(duration, DistanceToNextStop());
        duration -= distance;
        Move(distance);
        const std::uint64_t reached = State().position;
        ReachPosition();
        if (State().position != reached) {
            return;
        }
    }
}

Outcome SimulatedNavigator::SetPlayMode(bd::PlayMode mode)
{
    const Outcome possible = CheckStatus({Status::Playing, Status::Paused});
    const auto change = [this, mode] {
        if (m_Status == Status::Playing) {
            ChangePlayMode(mode);
        } else {
            State().playMode = mode;
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
    return Operate(bd::UserOperationStillOff, CheckStatus({Status::Still}),
                   [this] { LeaveStill(); });
}

Outcome SimulatedNavigator::Suspend()
{
    return Operate(CheckActive(), [this] {
        m_StatusBefore = std::exchange(m_Status, Status::Suspended);
        Send<bdmv::SuspendedEvent>();
    });
}

Outcome SimulatedNavigator::Resume()
{
    return Operate(bd::UserOperationResume, CheckStatus({Status::Suspended}), [this] {
        if (std::exchange(m_ResumeFails, false)) {
            CloseMenu();
            m_Status = Status::Stopped;
            Send<bdmv::ResumeFailedEvent>();
        } else {
            m_Status = m_StatusBefore;
            Send<bdmv::ResumedEvent>();
        }
    });
}

// ---------------------------------------------------------------------------------------------
// Position

Outcome SimulatedNavigator::SearchTime(std::uint64_t position)
{
    const std::uint64_t duration = PlayListInPlayback().timeLine.duration;
    Outcome outcome = CheckActive();
    if (outcome.IsDone() && position >= duration) {
        outcome = Outcome::Refused("the play list ends at " + TimeText(duration));
    }
    return Operate(bd::UserOperationTimeSearch, outcome, [this, position] { JumpTo(position); });
}

Outcome SimulatedNavigator::SearchChapter(std::uint64_t number)
{
    return JumpToChapter(bd::UserOperationChapterSearch, number);
}

Outcome SimulatedNavigator::SkipToNextChapter()
{
    return JumpToChapter(bd::UserOperationSkipToNextPoint, GetCurrentChapter() + 1U);
}

Outcome SimulatedNavigator::SkipToPreviousChapter()
{
    const std::uint64_t number = GetCurrentChapter();
    const Chapter* const chapter = FindChapter(number);
    const bool justStarted =
        chapter != nullptr && number > 1 && State().position - chapter->start < SkipBackWindow;
    return JumpToChapter(bd::UserOperationSkipBackToPreviousPoint,
                         justStarted ? number - 1 : number);
}

Outcome SimulatedNavigator::JumpToChapter(bd::UserOperationMaskDef operation, std::uint64_t number)
{
    const std::vector<Chapter>& chapters = PlayListInPlayback().timeLine.chapters;
    const Chapter* const chapter = FindChapter(number);
    Outcome outcome = CheckActive();
    if (outcome.IsDone() && chapter == nullptr) {
        outcome = NoSuch("chapter", number, chapters.empty() ? 0 : chapters.back().number);
    }
    const std::uint64_t start = chapter == nullptr ? 0 : chapter->start;
    return Operate(operation, outcome, [this, start] { JumpTo(start); });
}

const Chapter* SimulatedNavigator::FindChapter(std::uint64_t number) const
{
    const std::vector<Chapter>& chapters = PlayListInPlayback().timeLine.chapters;
    const auto found = std::find_if(chapters.begin(), chapters.end(),
                                    [number](const Chapter& c) { return c.number == number; });
    return found == chapters.end() ? nullptr : &*found;
}

// ---------------------------------------------------------------------------------------------
// Repeat and triggers

void SimulatedNavigator::SetTriggerType(bd::TriggerType type, bool result)
{
    if (result) {
        State().trigger = type;
    }
    Send<bdmv::TriggerSetEvent>(type, result);
}

Outcome SimulatedNavigator::SetPointA()
{
    return Operate(CheckActive(), [this] {
        State().chapterTitleRepeat = bd::TRIGGER_NONE;
        State().pointA = State().position;
        State().pointB = std::nullopt;
        SetTriggerType(bd::TRIGGER_A, true);
    });
}

Outcome SimulatedNavigator::SetPointB()
{
    return Operate(CheckActive(), [this] {
        const bool possible = State().pointA && *State().pointA < State().position;
        if (possible) {
            State().pointB = State().position;
        }
        SetTriggerType(bd::TRIGGER_B, possible);
        if (possible) {
            RepeatFrom(*State().pointA);
        }
    });
}

Outcome SimulatedNavigator::EndABRepeat()
{
    return Operate(CheckActive(), [this] {
        State().pointA = std::nullopt;
        State().pointB = std::nullopt;
        SetTriggerType(bd::TRIGGER_AB_NONE, true);
    });
}

Outcome SimulatedNavigator::SetChapterTitleRepeat(bd::TriggerType repeat)
{
    return Operate(CheckActive(), [this, repeat] {
        State().pointA = std::nullopt;
        State().pointB = std::nullopt;
        State().chapterTitleRepeat = repeat;
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
    return SetChapterTitleRepeat(bd::TRIGGER_NONE);
}

Outcome SimulatedNavigator::SetTrigger(std::uint64_t position)
{
    const std::uint64_t duration = PlayListInPlayback().timeLine.duration;
    Outcome outcome = CheckActive();
    if (outcome.IsDone() && position > duration) {
        outcome = Outcome::Refused(TimeText(position) + " is behind the end of the play list, " +
                                   "which lasts " + TimeText(duration));
    }
    return Operate(outcome, [this, position] {
        State().notifyAt = position;
        SetTriggerType(bd::TRIGGER_NOTIFY_FROM_CURPOS, true);
    });
}

// ---------------------------------------------------------------------------------------------
// Streams

template <typename Number>
Outcome SimulatedNavigator::SelectStream(bd::UserOperationMaskDef operation, std::uint64_t number,
                                         std::size_t count, const char* what, Number& selected)
{
    Outcome outcome = CheckActive();
    if (outcome.IsDone() && (number == 0 || number > count)) {
        outcome = NoSuch(what, number, count);
    }
    return Operate(operation, outcome, [&] {
        selected = static_cast<Number>(number);
        AnnounceStreams();
    });
}

template <typename Event>
Outcome SimulatedNavigator::Switch(bd::UserOperationMaskDef operation, bool& shown, bool value)
{
    return Operate(operation, CheckActive(), [&, value] {
        shown = value;
        Send<Event>();
    });
}

Outcome SimulatedNavigator::SelectAudio(std::uint64_t number)
{
    return SelectStream(bd::UserOperationPrimaryAudioStreamNumberChange, number,
                        CurrentStreams().primaryAudio.size(), "audio stream",
                        State().selection.audio);
}

Outcome SimulatedNavigator::SelectSubtitle(std::uint64_t number)
{
    return SelectStream(bd::UserOperationPGTextSTStreamNumberChange, number,
                        CurrentStreams().pg.size(), "subtitle stream", State().selection.pg);
}

Outcome SimulatedNavigator::ShowSubtitles(bool shown)
{
    return Switch<bdmv::PresentationGraphicsDisplayEvent>(bd::UserOperationPGTextSTEnableDisable,
                                                          State().selection.pgShown, shown);
}

Outcome SimulatedNavigator::SelectStyle(std::uint64_t number)
{
    Outcome outcome = CheckActive();
    const bd::UInt8 count = GetNumberOfTextSubtitleStyles();
    if (outcome.IsDone() && (number == 0 || number > count)) {
        outcome = NoSuch("text subtitle style", number, count);
    }
    return Operate(outcome, [this, number] {
        State().selection.style = static_cast<bd::UserStyleNumber>(number);
        Send<bdmv::TextSubtitleStyleInfoEvent>();
    });
}

Outcome SimulatedNavigator::SelectAngle(std::uint64_t number)
{
    return SelectStream(bd::UserOperationAngleNumberChange, number, ChosenAngle().second, "angle",
                        State().selection.angle);
}

Outcome SimulatedNavigator::SelectSecondaryVideo(std::uint64_t number)
{
    return SelectStream(bd::UserOperationSecondaryVideoStreamNumberChange, number,
                        CurrentStreams().secondaryVideo.size(), "secondary video stream",
                        State().selection.secondaryVideo);
}

Outcome SimulatedNavigator::ShowSecondaryVideo(bool shown)
{
    return Switch<bdmv::SecondaryVideoDisplayEvent>(bd::UserOperationSecondaryVideoEnableDisable,
                                                    State().selection.secondaryVideoShown, shown);
}

Outcome SimulatedNavigator::SelectSecondaryAudio(std::uint64_t number)
{
    return SelectStream(bd::UserOperationSecondaryAudioStreamNumberChange, number,
                        CurrentStreams().secondaryAudio.size(), "secondary audio stream",
                        State().selection.secondaryAudio);
}

Outcome SimulatedNavigator::ShowSecondaryAudio(bool shown)
{
    return Switch<bdmv::SecondaryAudioDisplayEvent>(bd::UserOperationSecondaryAudioEnableDisable,
                                                    State().selection.secondaryAudioShown, shown);
}

Outcome SimulatedNavigator::SelectPipSubtitle(std::uint64_t number)
{
    return SelectStream(bd::UserOperationPiPPGTextSTStreamNumberChange, number,
                        CurrentStreams().pipPg.size(), "picture-in-picture subtitle stream",
                        State().selection.pipPg);
}

Outcome SimulatedNavigator::PickPipSubtitle(bool pick)
{
    return Switch<bdmv::PipPgTextSelectEvent>(bd::UserOperationPiPPGTextSTStreamNumberChange,
                                              State().selection.pipPgPicked, pick);
}

Outcome SimulatedNavigator::Zoom(const bd::ZOOM_PARAM_Def& zoom)
{
    return Operate(CheckActive(), [this, &zoom] {
        State().zoom = zoom;
        Send<bdmv::ZoomModeSetEvent>();
    });
}

// ---------------------------------------------------------------------------------------------
// The menu

Outcome SimulatedNavigator::OpenPopUpMenu()
{
    Outcome outcome = CheckActive();
    if (outcome.IsDone() && CurrentStreams().ig.empty()) {
        outcome = Outcome::Refused("the play item has no menu");
    } else if (outcome.IsDone() && m_MenuOpen) {
        outcome = Outcome::Refused("the menu is open");
    }
    return Operate(bd::UserOperationPopupOn, outcome, [this] {
        m_MenuOpen = true;
        m_SelectedButton = ButtonOfCurrentChapter();
        Send<bdmv::InteractiveGraphicsActiveEvent>();
        Send<bdmv::InteractiveGraphicsVisibleEvent>();
    });
}

Outcome SimulatedNavigator::ClosePopUpMenu()
{
    return Operate(bd::UserOperationPopupOff, CheckMenu(), [this] { CloseMenu(); });
}

void SimulatedNavigator::CloseMenu()
{
    if (std::exchange(m_MenuOpen, false)) {
        Send<bdmv::InteractiveGraphicsInvisibleEvent>();
        Send<bdmv::InteractiveGraphicsInactiveEvent>();
    }
}

/** The first button before the first chapter. */
bd::ButtonId SimulatedNavigator::ButtonOfCurrentChapter()
{
    // Numbers of chapters can have gaps, those of buttons cannot.
    const Chapter* const chapter = FindChapter(GetCurrentChapter());
    const Chapter* const first = PlayListInPlayback().timeLine.chapters.data();
    return static_cast<bd::ButtonId>(chapter == nullptr ? 1 : chapter - first + 1);
}

Outcome SimulatedNavigator::CheckMenu() const
{
    return m_MenuOpen ? CheckActive() : Outcome::Refused("no menu is open");
}

Outcome SimulatedNavigator::CheckButton(std::uint64_t number) const
{
    const std::size_t count = PlayListInPlayback().timeLine.chapters.size();
    const Outcome outcome = CheckMenu();
    return !outcome.IsDone() || (number != 0 && number <= count) ? outcome
                                                                 : NoSuch("button", number, count);
}

Outcome SimulatedNavigator::SelectPreviousButton()
{
    return Operate(bd::UserOperationMoveUpSelectedButton, CheckButton(m_SelectedButton - 1U),
                   [this] { --m_SelectedButton; });
}

Outcome SimulatedNavigator::SelectNextButton()
{
    return Operate(bd::UserOperationMoveDownSelectedButton, CheckButton(m_SelectedButton + 1U),
                   [this] { ++m_SelectedButton; });
}

Outcome SimulatedNavigator::SelectButton(std::uint64_t number)
{
    return Operate(bd::UserOperationSelectButton, CheckButton(number),
                   [this, number] { m_SelectedButton = static_cast<bd::ButtonId>(number); });
}

Outcome SimulatedNavigator::ActivateButton()
{
    return Operate(bd::UserOperationActivateButton, CheckButton(m_SelectedButton),
                   [this] { ExecuteButton(); });
}

Outcome SimulatedNavigator::SelectAndActivateButton(std::uint64_t number)
{
    return Operate(bd::UserOperationSelectButtonAndActivate, CheckButton(number), [this, number] {
        m_SelectedButton = static_cast<bd::ButtonId>(number);
        ExecuteButton();
    });
}

/** Hands the program of the button to the listeners, then does what the program says. */
void SimulatedNavigator::ExecuteButton()
{
    const LoadedPlayList& list = PlayListInPlayback();
    const Chapter& chapter = list.timeLine.chapters[m_SelectedButton - 1U];
    State().button.program =
        new ButtonProgram({ButtonCommand(bdmv::INavigationCommandData::CommandPopupMenuOff),
                           ButtonCommand(bdmv::INavigationCommandData::CommandPlayPLatMK,
                                         list.number, static_cast<bd::UInt32>(chapter.mark))});
    State().button.ticket = ++m_LastTicket;
    State().button.id = m_SelectedButton;
    Send<bdmv::ButtonActivationBusyEvent>();
    Send<bdmv::ExecuteButtonEvent>();
    Send<bdmv::ButtonActivationDoneEvent>();
    State().button = PendingButton();
    CloseMenu();
    JumpTo(chapter.start);
}

// ---------------------------------------------------------------------------------------------
// The system

Outcome SimulatedNavigator::GoToStandby()
{
    return Operate(CheckActive(), [this] {
        ResumePoint point;
        point.playList = PlayListInPlayback().number;
        point.playing = m_Status != Status::Paused;
        point.playItem = GetPlayItemId();
        point.position = State().position;
        point.playMode = State().playMode;
        point.selection = State().selection;
        StoreSystemResumeData(MakeResumeData(point));
        CloseMenu();
        m_Status = Status::Standby;
        m_StillLeft = std::nullopt;
        Send<bdmv::SystemSuspendedEvent>();
    });
}

Outcome SimulatedNavigator::WakeUp(const std::vector<bd::UInt8>& resumeData)
{
    return Operate(CheckStatus({Status::Standby}), [this, &resumeData] {
        const std::optional<ResumePoint> point = ReadResumeData(resumeData);
        if (!point || !IsInPlayList(*point)) {
            m_Status = Status::Stopped;
            Send<bdmv::SystemResumeFailedEvent>();
            return;
        }
        StartFresh();
        State().position = point->position;
        State().item = point->playItem;
        State().playMode = point->playMode;
        if (point->playing) {
            State().currentPlayMode = point->playMode;
        }
        State().selection = point->selection;
        State().playingAfterSystemResume = point->playing;
        m_Status = point->playing ? Status::Playing : Status::Paused;
        Send<bdmv::SystemResumedEvent>();
        Send<bdmv::PlaylistEvent>();
        AnnounceItem();
        if (State().currentPlayMode != bd::PlayMode()) {
            Send<bdmv::PlayModeEvent>();
        }
        AnnounceChapter();
        Send<bdmv::CurrentTimePositionEvent>();
    });
}

bool SimulatedNavigator::IsInPlayList(const ResumePoint& point) const
{
    const std::vector<std::uint64_t>& starts = PlayListInPlayback().timeLine.itemStarts;
    return point.playList == PlayListInPlayback().number && point.playItem < starts.size() &&
           point.position >= starts[point.playItem] && point.position <= EndOfItem(point.playItem);
}

// ---------------------------------------------------------------------------------------------
// Failures

Outcome SimulatedNavigator::FailPreload()
{
    return Operate(CheckActive(), [this] { Send<bdmv::PreloadFailedEvent>(); });
}

Outcome SimulatedNavigator::Starve()
{
    return Operate(CheckActive(), [this] { Finish(bdstreaming::FinishedReasonDataStarvation); });
}

} // namespace deskplayer
