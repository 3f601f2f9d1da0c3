/**
 * @file
 * Callbacks for trace viewers.
 */
#ifndef DESKPLAYER_OUTPUT_TRACEOUTPUT_H
#define DESKPLAYER_OUTPUT_TRACEOUTPUT_H

#include <cstddef>
#include <memory>
#include <string>
#include <vector>

#include <nlohmann/json_fwd.hpp>

#include "output/output.h"

namespace deskplayer
{

/**
 * Writes a trace in the JSON array form of the trace-event format: states as slices, with a track
 * for each kind of state, and every callback that passes the filter as an instant on the track of
 * its interface.
 *
 * The filter does not apply to slices: a state whose end is hidden would seem to last.
 *
 * A slice lasts from the callback that begins it until the next one on its track; those of playback
 * itself also end when playback ends, and all end at a gap. Open slices end when the output is
 * destroyed, which completes the trace. Memory does not grow with the length of the session.
 */
class TraceOutput : public Output
{
public:
    /** @copydoc Output::Output */
    TraceOutput(std::ostream& stream, const VirtualClock& clock, const OutputFilter& filter);

    /** Completes the trace at the current time of the clock, or at that of the last record. */
    ~TraceOutput() override;

private:
    enum class Track : std::size_t;

    struct Slice;

    struct TrackState {
        std::string name;
        bool named = false;           ///< whether the trace has named it
        std::unique_ptr<Slice> slice; ///< the open one; null if there is none
    };

    void Follow(const CallbackRecord& record) override;
    void Write(const CallbackRecord& record) override;
    void Write(const GapRecord& gap) override;
    void Write(const StartRecord& start) override;

    void Begin(Track track, const std::string& name, const CallbackRecord& record);
    void BeginNamed(Track track, const std::string& name, const CallbackRecord& record);
    void BeginNumbered(Track track, bd::UInt32 number, const CallbackRecord& record);
    void BeginCounted(Track track, bd::UInt32 number, const CallbackRecord& record);
    void End(Track track);
    void EndPlayback();
    void EndAll();
    void AppendSlice(Track track, const char* phase, const Slice& slice);
    void AppendEvent(Track track, const char* phase, const nlohmann::ordered_json& members);
    void Append(const nlohmann::ordered_json& event);
    TrackState& StateOf(Track track) { return m_Tracks[static_cast<std::size_t>(track)]; }

    std::vector<TrackState> m_Tracks;           ///< indexed by Track
    std::string m_BeforeSuspension = "Playing"; ///< the slice of playback that Resumed() begins
    Ticks m_Time{0};                            ///< of the events that are being written
    const char* m_Separator = "[\n";            ///< before the next event
};

} // namespace deskplayer

#endif
