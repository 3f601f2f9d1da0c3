/**
 * @file
 * Many log files as input of the program, and a folder as its output.
 */
#ifndef DESKPLAYER_PROGRAM_LOGFOLDER_H
#define DESKPLAYER_PROGRAM_LOGFOLDER_H

#include "output/outputformat.h"
#include "program/options.h"

namespace deskplayer
{

/**
 * Reads every file that the options name as a log of its own, several at the same time, and writes
 * a file for each to the output folder, which is created if necessary. Its name is that of the log
 * with the extension of the format.
 *
 * A file appears once it is complete. A log that cannot be read, or written again, is reported, and
 * the others are still converted. Messages are in the order of the options, whatever the number of
 * jobs. Memory is proportional to the number of jobs; of each log only its name is kept.
 *
 * @return the exit status
 * @throw UsageError before anything is written: the pattern is invalid, standard input is among
 *        the logs, two logs would have the same file, or a log would be overwritten
 * @throw OutputError the folder cannot be created
 */
int ConvertFieldLogsToFolder(const Options& options, const OutputSettings& settings);

} // namespace deskplayer

#endif
