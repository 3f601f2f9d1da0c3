/**
 * @file
 * A log line on its way from its writer to a destination.
 */
#ifndef KEVRO_LOGLINE_H
#define KEVRO_LOGLINE_H

#include <string_view>

#include <spdlog/common.h>

#include "kevro/kevro_types.h"

namespace kevro
{

/** Characters on the stack unless they are many. */
using TextBuffer = spdlog::memory_buf_t;

/** A line as its writer gave it; the text belongs to somebody else. */
struct LogLine {
    spdlog::log_clock::time_point time;
    KEVRO_UInt32 component;
    KEVRO_Int32 level;
    std::string_view text;
};

/** Appends what stands in the log behind the time: component, level, and the text made harmless. */
void AppendLine(TextBuffer& buffer, const LogLine& line);

/** What spdlog and the system's logger call a level. */
spdlog::level::level_enum Severity(KEVRO_Int32 level);

} // namespace kevro

#endif
