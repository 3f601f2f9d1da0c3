/**
 * @file
 * What a recording amounts to: what is looked for first in the log of a player.
 *
 * @code
 * deskplayer::Summarizer summarizer;
 * while (reader.Next(summarizer)) {
 * }
 * WriteSummary(std::cout, summarizer.Summary());
 * @endcode
 *
 * Nothing is assumed about what a recording lacks: after a gap, and from the callback before it,
 * the state of playback is unknown until a callback reports it.
 */
#ifndef DESKPLAYER_SUMMARY_RECORDINGSUMMARY_H
#define DESKPLAYER_SUMMARY_RECORDINGSUMMARY_H

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "clientkit/playbackstatus.h"
#include "deskplayer/ticks.h"
#include "output/record.h"

namespace deskplayer
{

/** The states of playback whose time is measured. */
enum class SummaryState : std::size_t {
    Playing,   ///< forward at normal speed, or with a play mode that was not reported
    TrickPlay, ///< with any other play mode
    Paused,
    Still,
    Suspended,
    Standby,
    Stopped,
    Unknown
};

/** Indexed by SummaryState. */
inline constexpr std::array<const char*, 8> SummaryStateNames{
    "Playing", "TrickPlay", "Paused", "Still", "Suspended", "Standby", "Stopped", "Unknown"};

/** How often something lasted, and how long altogether. */
struct Periods {
    std::uint64_t count = 0;
    Ticks total{0};
};

/** The gaps of one cause. */
struct GapSummary {
    std::string cause;
    std::uint64_t count = 0;
    std::optional<std::uint64_t> lost; ///< altogether; absent if no gap says how many
    Ticks first{0};
    Ticks last{0};
};

/** The time from a line to the next line of the same event. */
struct Wait {
    Ticks duration{0};
    Ticks time{0};           ///< of the first line
    bdmv::CallbackId after;  ///< what the first line announces: all listeners received it
    bdmv::CallbackId before; ///< what the next line announces
};

/** A user operation of the mask. */
struct OperationSummary {
    Periods forbidden;
    std::optional<bool> forbiddenAtEnd; ///< absent if no mask is known at the end
};

/** The callbacks of one kind. */
struct CallbackSummary {
    std::uint64_t count = 0;
    Ticks first{0};
    Ticks last{0};
};

/** What only a log has. */
struct LogSummary {
    std::uint64_t foreignLines = 0;
    std::uint64_t damagedLines = 0;
};

/** A plain value. */
struct RecordingSummary {
    Ticks begin{0};        ///< time of the first record
    Ticks end{0};          ///< time of the last record
    Ticks duration{0};     ///< from the first to the last, without steps back in time
    std::string wallClock; ///< of the first start; empty if there is none
    std::uint64_t callbacks = 0;
    std::vector<GapSummary> gaps; ///< in the order of their first occurrence

    /** The bytes of a block are absent. */
    std::optional<CallbackRecord> lastCallback;

    std::uint64_t waits = 0;                     ///< how many were measured
    std::vector<Wait> longestWaits;              ///< the longest first; all of them longer than 0
    std::array<Periods, 8> states;               ///< indexed by SummaryState
    std::array<OperationSummary, 64> operations; ///< by the bit of the mask
    std::array<CallbackSummary, bdmv::Callback__sizeof> callbackKinds; ///< by bdmv::CallbackId
    std::optional<LogSummary> log; ///< set by the reader of a log; waits are of logs only
};

/** Summarises a recording. Memory does not grow with the recording. */
class Summarizer : public RecordListener
{
public:
    /** The number of waits that are kept. */
    static constexpr std::size_t LongestWaits = 5;

    /** The number of causes that are told apart; gaps of any others have the cause "other". */
    static constexpr std::size_t GapCauses = 16;

    /** Of what has been received so far. */
    RecordingSummary Summary() const;

    void OnRecord(const CallbackRecord& record) override;
    void OnGap(const GapRecord& gap) override;
    void OnStart(const StartRecord& start) override;

private:
    void PassTime(Ticks time);
    void MeasureWait(const CallbackRecord& record);
    void FollowStatus(const CallbackRecord& record);
    void ForgetStatus();
    void Enter(SummaryState state);
    void Forbid(std::uint64_t mask);
    GapSummary& GapsOf(const std::string& cause);

    RecordingSummary m_Summary; ///< without the periods of operations that are still forbidden
    bdmv::PlaybackStatus m_Status;
    std::optional<std::uint64_t> m_Mask; ///< operation n at bit n, as reported last
    bool m_HasBegun = false;
    std::optional<SummaryState> m_State;
    std::uint64_t m_Forbidden = 0;            ///< operation n at bit n, in force
    std::array<Ticks, 64> m_ForbiddenSince{}; ///< in RecordingSummary::duration
};

} // namespace deskplayer

#endif
