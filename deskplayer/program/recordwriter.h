/**
 * @file
 * Writes what was read from a log or a recording.
 */
#ifndef DESKPLAYER_PROGRAM_RECORDWRITER_H
#define DESKPLAYER_PROGRAM_RECORDWRITER_H

#include <memory>
#include <optional>
#include <ostream>

#include "navigator/virtualclock.h"
#include "output/outputformat.h"
#include "program/options.h"
#include "summary/recordingsummary.h"
#include "summary/summarywriter.h"

namespace deskplayer
{

/** Writes records as they come, or a summary of them once they are complete. */
class RecordWriter
{
public:
    /** @param stream does not throw, and must outlive this object */
    RecordWriter(const Options& options, const OutputSettings& settings, std::ostream& stream)
        : m_Format(settings.format), m_rStream(stream)
    {
        if (!options.summary) {
            m_pOutput = MakeOutput(settings, stream, m_Unused);
        }
    }

    RecordListener& Listener()
    {
        return m_pOutput ? static_cast<RecordListener&>(*m_pOutput) : m_Summarizer;
    }

    /** Completes the output; nothing may be received afterwards. @param log of a log only */
    void Finish(const std::optional<LogSummary>& log = std::nullopt)
    {
        if (m_pOutput) {
            m_pOutput.reset();
            return;
        }
        RecordingSummary summary = m_Summarizer.Summary();
        summary.log = log;
        const auto write = m_Format == OutputFormat::Json ? WriteSummaryAsJson : WriteSummary;
        write(m_rStream, summary);
    }

private:
    const OutputFormat m_Format;
    std::ostream& m_rStream;
    const VirtualClock m_Unused;       ///< records have times of their own
    std::unique_ptr<Output> m_pOutput; ///< null for a summary
    Summarizer m_Summarizer;
};

} // namespace deskplayer

#endif
