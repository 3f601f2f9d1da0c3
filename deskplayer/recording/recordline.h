/**
 * @file
 * Reads one line of a recording.
 */
#ifndef DESKPLAYER_RECORDING_RECORDLINE_H
#define DESKPLAYER_RECORDING_RECORDLINE_H

#include <string_view>
#include <variant>
#include <vector>

#include "output/record.h"

namespace deskplayer
{

using Record = std::variant<CallbackRecord, GapRecord, StartRecord>;

/**
 * Reads a line, as docs/outputs.md describes it. Members of the line that are unknown are ignored;
 * those that repeat others must agree with them.
 *
 * @param block receives the bytes of callbacks::SystemSuspended, to which the record refers
 * @throw LineError
 */
Record ReadRecordLine(std::string_view line, std::vector<bd::UInt8>& block);

} // namespace deskplayer

#endif
