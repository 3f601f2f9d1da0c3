/**
 * @file
 * The clock of log lines: the system's, or one that the program sets.
 */
#ifndef KEVRO_LOGCLOCK_H
#define KEVRO_LOGCLOCK_H

#include <memory>

#include <spdlog/common.h>
#include <spdlog/formatter.h>

#include "kevro/kevro_types.h"

namespace kevro
{

/** The time of a line, as one of the clocks shows it. */
struct LineTime {
    spdlog::log_clock::time_point point; ///< the program's clock counts from the epoch
    KEVRO_UInt32 isOfProgram;            ///< whether the program's clock shows it
};

/** The time now, by the clock in force. */
LineTime CurrentTime() noexcept;

/** The name of the logger in a message of spdlog, which has no field for the clock. */
spdlog::string_view_t NameForClock(const LineTime& time);

/** Formats the lines of sinks that show the time, from messages with a NameForClock(). */
std::unique_ptr<spdlog::formatter> MakeLineFormatter();

} // namespace kevro

#endif
