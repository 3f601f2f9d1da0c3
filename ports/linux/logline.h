/**
 * @file
 * A log line between its writer and its destination.
 */
#ifndef KEVRO_LOGLINE_H
#define KEVRO_LOGLINE_H

#include <string_view>

#include <spdlog/common.h>

#include "kevro/kevro_types.h"
#include "logclock.h"

namespace kevro
{

/** Characters, on the stack unless they are many. */
using TextBuffer = spdlog::memory_buf_t;

/** What a line has besides its text. */
struct LineHead {
    LineTime time;
    KEVRO_UInt32 component;
    KEVRO_Int32 level;
};

/** Appends the part of a log line after the time: component, level, and the escaped text. */
void AppendLine(TextBuffer& buffer, const LineHead& head, std::string_view text);

/** The level of spdlog, and of the system's logger, that corresponds to a level. */
spdlog::level::level_enum Severity(KEVRO_Int32 level);

} // namespace kevro

#endif
