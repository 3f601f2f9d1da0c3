/**
 * @file
 * Log files as input of the program.
 */
#ifndef DESKPLAYER_PROGRAM_FIELDLOGS_H
#define DESKPLAYER_PROGRAM_FIELDLOGS_H

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

} // namespace deskplayer

#endif
