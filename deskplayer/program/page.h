/**
 * @file
 * The page of `--format html`.
 */
#ifndef DESKPLAYER_PROGRAM_PAGE_H
#define DESKPLAYER_PROGRAM_PAGE_H

#include "output/outputformat.h"
#include "program/options.h"

namespace deskplayer
{

/**
 * Checks the options of a page. For an output in html, adds the page, the name of the recording,
 * and the recording to compare with.
 *
 * @throw UsageError the options need another format, or an input is also the output or used twice;
 *        or the page cannot be read
 * @throw RecordingError the recording to compare with cannot be opened or read
 * @throw OutputError there is no room for a temporary file
 */
void PreparePage(const Options& options, OutputSettings& settings);

} // namespace deskplayer

#endif
