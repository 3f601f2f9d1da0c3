/**
 * @file
 * Writes summaries.
 *
 * @code
 * WriteSummary(std::cout, summarizer.Summary());
 * @endcode
 *
 * docs/outputs.md describes both forms. Waits and skipped lines are written for logs only.
 */
#ifndef DESKPLAYER_SUMMARY_SUMMARYWRITER_H
#define DESKPLAYER_SUMMARY_SUMMARYWRITER_H

#include <ostream>

#include "summary/recordingsummary.h"

namespace deskplayer
{

/** Writes tables for people. @param stream does not throw */
void WriteSummary(std::ostream& stream, const RecordingSummary& summary);

/** Writes one JSON object and a line end. @param stream does not throw */
void WriteSummaryAsJson(std::ostream& stream, const RecordingSummary& summary);

} // namespace deskplayer

#endif
