#include "summary/recordingsummary.h"

#include <algorithm>

namespace deskplayer
{

namespace
{

constexpr std::size_t Operations = 64;

const std::string OtherCauses = "other";

bool IsSet(std::uint64_t mask, std::size_t operation)
{
    return ((mask >> operation) & 1) != 0;
}

SummaryState StateOf(const bdmv::PlaybackStatus& status)
{
    if (!status.state.known) {
        return SummaryState::Unknown;
    }
    switch (status.state.value) {
    case bdmv::PlaybackPlaying:
        return status.playMode.value == bd::PlayMode() ? SummaryState::Playing
                                                       : SummaryState::TrickPlay;
    case bdmv::PlaybackPaused:
        return SummaryState::Paused;
    case bdmv::PlaybackStill:
        return SummaryState::Still;
    case bdmv::PlaybackSuspended:
        return SummaryState::Suspended;
    case bdmv::PlaybackStandby:
        return SummaryState::Standby;
    case bdmv::PlaybackStopped:
        break;
    }
    return SummaryState::Stopped;
}

/** A copy that outlasts the record. */
CallbackRecord Lasting(const CallbackRecord& record)
{
    const auto* const suspended = record.callback.As<bdmv::callbacks::SystemSuspended>();
    if (suspended == nullptr) {
        return record;
    }
    ArgumentSet absent = record.absent;
    absent.set(0);
    return {record.time, bdmv::callbacks::SystemSuspended{nullptr, suspended->size}, absent};
}

} // namespace

RecordingSummary Summarizer::Summary() const
{
    RecordingSummary summary = m_Summary;
    for (std::size_t operation = 0; operation < Operations; ++operation) {
        OperationSummary& ofOperation = summary.operations[operation];
        if (IsSet(m_Forbidden, operation)) {
            ofOperation.forbidden.total += summary.duration - m_ForbiddenSince[operation];
        }
        if (m_Mask) {
            ofOperation.forbiddenAtEnd = IsSet(m_Forbidden, operation);
        }
    }
    return summary;
}

void Summarizer::OnRecord(const CallbackRecord& record)
{
    PassTime(record.time);
    MeasureWait(record);
    CallbackSummary& kind = m_Summary.callbackKinds[static_cast<std::size_t>(record.callback.Id())];
    if (kind.count++ == 0) {
        kind.first = record.time;
    }
    kind.last = record.time;
    ++m_Summary.callbacks;
    m_Summary.lastCallback = Lasting(record);
    FollowStatus(record);
}

/** When the callbacks that are missing were sent is unknown: from the last callback on. */
void Summarizer::OnGap(const GapRecord& gap)
{
    ForgetStatus();
    PassTime(gap.time);
    GapSummary& gaps = GapsOf(gap.cause);
    if (gaps.count++ == 0) {
        gaps.first = gap.time;
    }
    gaps.last = gap.time;
    if (gap.lost) {
        gaps.lost = gaps.lost.value_or(0) + *gap.lost;
    }
}

void Summarizer::OnStart(const StartRecord& start)
{
    PassTime(start.time);
    if (m_Summary.wallClock.empty()) {
        m_Summary.wallClock = start.wallClock;
    }
}

/** Where time goes back, another recording begins. */
void Summarizer::PassTime(Ticks time)
{
    if (!m_HasBegun) {
        m_HasBegun = true;
        m_Summary.begin = time;
    } else if (time < m_Summary.end) {
        ForgetStatus();
    } else {
        const Ticks passed = time - m_Summary.end;
        m_Summary.duration += passed;
        m_Summary.states[static_cast<std::size_t>(m_State.value_or(SummaryState::Unknown))].total +=
            passed;
    }
    m_Summary.end = time;
}

void Summarizer::MeasureWait(const CallbackRecord& record)
{
    if (!record.continuesEvent || !m_Summary.lastCallback) {
        return;
    }
    ++m_Summary.waits;
    const CallbackRecord& last = *m_Summary.lastCallback;
    const Wait wait = {record.time - last.time, last.time, last.callback.Id(),
                       record.callback.Id()};
    std::vector<Wait>& longest = m_Summary.longestWaits;
    const auto place = std::find_if(longest.begin(), longest.end(), [&wait](const Wait& other) {
        return other.duration < wait.duration;
    });
    if (wait.duration > Ticks(0) && (place != longest.end() || longest.size() < LongestWaits)) {
        longest.insert(place, wait);
        longest.resize(std::min(longest.size(), LongestWaits), wait);
    }
}

void Summarizer::FollowStatus(const CallbackRecord& record)
{
    const bdmv::CallbackId id = record.callback.Id();
    Apply(record.callback, m_Status);
    if (record.absent.any()) {
        if (id == bdmv::CallbackSystemResumed) {
            m_Status.state = {};
        } else if (id == bdmv::CallbackPlayMode) {
            m_Status.playMode = {};
        }
    }
    if (const auto* const mask = record.callback.As<bdmv::callbacks::UOMask>()) {
        m_Mask.reset();
        if (record.absent.none()) {
            m_Mask = mask->mask.GetUOMaskTable();
        }
    }
    const SummaryState state = StateOf(m_Status);
    if (state == SummaryState::Stopped) {
        // They belong to what was played. What is played next has its own.
        m_Status.playMode = {};
        m_Mask = 0;
    }
    Enter(state);
    Forbid(state == SummaryState::Standby ? 0 : m_Mask.value_or(0));
}

void Summarizer::ForgetStatus()
{
    m_Status = {};
    m_Mask.reset();
    Enter(SummaryState::Unknown);
    Forbid(0);
}

void Summarizer::Enter(SummaryState state)
{
    if (m_State != state) {
        m_State = state;
        ++m_Summary.states[static_cast<std::size_t>(state)].count;
    }
}

void Summarizer::Forbid(std::uint64_t mask)
{
    if (mask == m_Forbidden) {
        return;
    }
    for (std::size_t operation = 0; operation < Operations; ++operation) {
        Periods& periods = m_Summary.operations[operation].forbidden;
        if (IsSet(mask & ~m_Forbidden, operation)) {
            ++periods.count;
            m_ForbiddenSince[operation] = m_Summary.duration;
        } else if (IsSet(m_Forbidden & ~mask, operation)) {
            periods.total += m_Summary.duration - m_ForbiddenSince[operation];
        }
    }
    m_Forbidden = mask;
}

GapSummary& Summarizer::GapsOf(const std::string& cause)
{
    std::vector<GapSummary>& gaps = m_Summary.gaps;
    const auto found = std::find_if(gaps.begin(), gaps.end(),
                                    [&cause](const GapSummary& gap) { return gap.cause == cause; });
    if (found != gaps.end()) {
        return *found;
    }
    if (gaps.size() >= GapCauses && cause != OtherCauses) {
        return GapsOf(OtherCauses);
    }
    gaps.emplace_back();
    gaps.back().cause = cause;
    return gaps.back();
}

} // namespace deskplayer
