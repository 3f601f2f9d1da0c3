/**
 * @file
 * Replays recordings: a client's listeners receive the callbacks that others received before.
 *
 * @code
 * std::ifstream recording("evening.jsonl"); // of bdmv-deskplayer --format json, or of a black box
 * bdmv::INavigatorEvent::Listeners listeners;
 * listeners.AddListener(&frontPanel);
 * const deskplayer::ReplayReport report = deskplayer::Replay(recording, listeners);
 * EXPECT_EQ(report.skipped, 0U);
 * listeners.RemoveListener(&frontPanel);
 * @endcode
 *
 * A recording may lack arguments and have gaps. A callback that lacks arguments is skipped, unless
 * ReplayOptions::fill replaces them. Nothing takes the place of a gap, so a listener that follows
 * the state of playback may be wrong after one.
 *
 * A program of ExecuteButton() has as many commands as it had, but their contents are not recorded:
 * they do nothing.
 *
 * docs/outputs.md describes recordings and the neutral values of arguments.
 */
#ifndef DESKPLAYER_INC_DESKPLAYER_REPLAY_H
#define DESKPLAYER_INC_DESKPLAYER_REPLAY_H

#include <cstdint>
#include <functional>
#include <istream>
#include <string>

#include "bdmvnavigator/inavigatorevent.h"
#include "deskplayer/errors.h"
#include "deskplayer/ticks.h"

namespace deskplayer
{

/**
 * Called before each callback, and at each gap and start, with its time as recorded, which may be
 * less than that of the one before. Sets the clock of a test, or waits.
 */
using ReplayClock = std::function<void(Ticks time)>;

/** How to replay a recording. */
struct ReplayOptions {
    /** Whether callbacks that lack arguments are delivered with neutral values. */
    bool fill = false;

    /** The name of the recording in messages. */
    std::string name = "recording";

    /**
     * Receives a line for each gap, and for each callback that lacks arguments. May be empty.
     *
     *     recording:3: skipped TriggerSet, which lacks type, result
     *     recording:4: filled TriggerSet, which lacks type, result
     *     recording:5: gap: capacity
     */
    MessageHandler onMessage;
};

/** How many callbacks, gaps and starts a recording had. */
struct ReplayReport {
    std::uint64_t delivered = 0; ///< callbacks, with those that were filled
    std::uint64_t filled = 0;    ///< callbacks that lacked arguments and were delivered
    std::uint64_t skipped = 0;   ///< callbacks that lacked arguments and were not delivered
    std::uint64_t gaps = 0;      ///< where callbacks are missing
    std::uint64_t starts = 0;    ///< where a field log shows the wall clock; only counted
};

/**
 * Delivers a recording to listeners, on the calling thread. Memory does not grow with the
 * recording.
 *
 * @param stream    does not throw
 * @param listeners its lock is held during each callback, as when a navigator delivers
 * @param clock     called outside that lock; may be empty
 * @throw RecordingError a line cannot be read; those before it were delivered
 * @throw whatever a listener throws; the rest of the recording is not delivered
 */
ReplayReport Replay(std::istream& stream, bdmv::INavigatorEvent::Listeners& listeners,
                    const ReplayClock& clock = {}, const ReplayOptions& options = {});

} // namespace deskplayer

#endif
