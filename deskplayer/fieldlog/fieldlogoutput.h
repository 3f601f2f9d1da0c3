/**
 * @file
 * Writes what a log contains.
 */
#ifndef DESKPLAYER_FIELDLOG_FIELDLOGOUTPUT_H
#define DESKPLAYER_FIELDLOG_FIELDLOGOUTPUT_H

#include <memory>
#include <ostream>

#include "fieldlog/fieldlogreader.h"
#include "output/outputformat.h"

namespace deskplayer
{

/**
 * Writes callbacks and gaps as any output does, and starts in text and JSON. A trace has no starts.
 */
class FieldLogOutput : public FieldLogListener
{
public:
    /** @param stream does not throw; must outlive this object */
    FieldLogOutput(const OutputSettings& settings, std::ostream& stream);

    void OnRecord(const CallbackRecord& record) override { m_rRecords.OnRecord(record); }
    void OnGap(const GapRecord& gap) override { m_rRecords.OnGap(gap); }
    void OnStart(const StartRecord& start) override;

private:
    const OutputFormat m_Format;
    std::ostream& m_rStream;
    const VirtualClock m_Clock; ///< never advances: records have their own times
    const std::unique_ptr<Output> m_pOutput;
    RecordListener& m_rRecords; ///< the same
};

} // namespace deskplayer

#endif
