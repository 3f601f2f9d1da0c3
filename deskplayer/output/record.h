/**
 * @file
 * What a recording consists of: callbacks, some arguments of which may be unknown, gaps, and
 * starts.
 *
 * @code
 * class Counter : public deskplayer::RecordListener
 * {
 *     void OnRecord(const deskplayer::CallbackRecord&) override { ++m_Callbacks; }
 *     void OnGap(const deskplayer::GapRecord& gap) override { m_Lost += gap.lost.value_or(0); }
 *     void OnStart(const deskplayer::StartRecord&) override {}
 *     ...
 * };
 * @endcode
 *
 * A record lives for the duration of the call. The bytes of callbacks::SystemSuspended do too, even
 * for a copy of the callback.
 */
#ifndef DESKPLAYER_OUTPUT_RECORD_H
#define DESKPLAYER_OUTPUT_RECORD_H

#include <bitset>
#include <cstdint>
#include <optional>
#include <string>

#include "clientkit/callback.h"
#include "deskplayer/ticks.h"
#include "output/tags.h"

namespace deskplayer
{

/** The arguments of a callback by their position in bdmv::Callback::VisitArguments(). */
using ArgumentSet = std::bitset<8>;

/** A callback of a recording. An absent argument has a neutral value in the callback. */
struct CallbackRecord {
    Ticks time;
    bdmv::Callback callback;
    ArgumentSet absent;

    /**
     * For a block of callbacks::SystemSuspended of which only the beginning is known: how many
     * bytes `data` points to. Without it, as many as `size` says.
     */
    std::optional<bd::UInt32> knownBytes = std::nullopt;

    Tags tags = {}; ///< that the recording has

    /**
     * Whether the record before it is an earlier callback of the same event. Only log lines show
     * that: it is false in all other recordings.
     */
    bool continuesEvent = false;
};

/** Where a recording lost something. */
struct GapRecord {
    /** Of the first record after the gap; in a log, of the line that reveals it. */
    Ticks time;

    std::string cause; ///< printable ASCII without quotes and backslashes: "capacity", "restart"
    std::optional<std::uint64_t> lost; ///< how many callbacks or lines, if that is known
    Tags tags = {};                    ///< that the recording has
};

/** Where a recording starts, or its clock begins anew after a gap. */
struct StartRecord {
    Ticks time;
    std::string wallClock; ///< printable ASCII without quotes and backslashes: "May 31 20:15:00"
    Tags tags = {};        ///< that the recording has
};

/** Receives a recording in its order. */
class RecordListener
{
public:
    virtual ~RecordListener() = default;
    virtual void OnRecord(const CallbackRecord& record) = 0;
    virtual void OnGap(const GapRecord& gap) = 0;
    virtual void OnStart(const StartRecord& start) = 0;

protected:
    RecordListener() = default;
    RecordListener(const RecordListener&) = default;
    RecordListener& operator=(const RecordListener&) = default;
};

} // namespace deskplayer

#endif
