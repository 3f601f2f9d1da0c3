/**
 * @file
 * A log line, taken apart.
 */
#ifndef DESKPLAYER_FIELDLOG_LOGLINE_H
#define DESKPLAYER_FIELDLOG_LOGLINE_H

#include <optional>
#include <string_view>

#include "fieldlog/linetime.h"

namespace deskplayer
{

/** The parts of a line that was written through a port. The text still has its escapes. */
struct LogLine {
    LineTime time;
    std::string_view process;   ///< name and identifier; empty if the line does not show them
    std::string_view component; ///< a name or a number; empty if the line does not show it
    std::string_view level;     ///< the same
    std::string_view text;
};

/**
 * Reads what a port passes to the system's log: component, level and text, possibly after a time
 * of its own.
 *
 * @param line receives component, level and text, and the time if there is one
 */
bool ReadMessage(std::string_view message, LogLine& line);

/**
 * Reads a line of a file of the Linux port, of the system's log as rsyslog writes it, or of
 * journalctl's formats short, short-precise, short-iso and short-iso-precise.
 *
 * @return nothing if the line is none of these
 */
std::optional<LogLine> ReadPlainLine(std::string_view text);

} // namespace deskplayer

#endif
