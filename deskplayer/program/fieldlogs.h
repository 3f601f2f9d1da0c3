/**
 * @file
 * Log files as input of the program.
 */
#ifndef DESKPLAYER_PROGRAM_FIELDLOGS_H
#define DESKPLAYER_PROGRAM_FIELDLOGS_H

#include <optional>

#include "fieldlog/fieldlogreader.h"
#include "fieldlog/prefixpattern.h"
#include "output/outputformat.h"
#include "program/options.h"
#include "program/target.h"

namespace deskplayer
{

/**
 * Reads the logs that the options name and writes the callbacks that they announce.
 *
 * @throw UsageError a log cannot be read, or would be overwritten, or the pattern is invalid
 */
void ConvertFieldLogs(const Options& options, const OutputSettings& settings, Target& target);

/** The pattern that the options name, if any. @throw UsageError it is invalid */
std::optional<PrefixPattern> PatternOf(const Options& options);

/** Writes a message that counts the lines that were skipped, if there were any. */
void PrintSkipped(const FieldLogCounts& counts);

} // namespace deskplayer

#endif
