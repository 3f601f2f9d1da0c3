/**
 * @file
 * Replays a recording through the outputs.
 */
#ifndef DESKPLAYER_PROGRAM_REPLAY_H
#define DESKPLAYER_PROGRAM_REPLAY_H

#include "output/outputformat.h"
#include "program/options.h"
#include "program/target.h"

namespace deskplayer
{

/**
 * Writes the recording that the options name, and reports what it lacks.
 *
 * @param target is opened once the recording is
 * @throw UsageError the recording is also the output
 * @throw RecordingError the recording cannot be opened or read
 * @throw OutputError
 */
void ReplayRecording(const Options& options, const OutputSettings& settings, Target& target);

} // namespace deskplayer

#endif
