#include "recording/recordingreader.h"

#include "recording/linejson.h"
#include "recording/recordline.h"
#include "text/printable.h"

namespace deskplayer
{

namespace
{

/** Calls the operation for a record's kind. */
struct PassOn {
    RecordListener& listener;

    void operator()(const CallbackRecord& record) const { listener.OnRecord(record); }
    void operator()(const GapRecord& gap) const { listener.OnGap(gap); }
};

} // namespace

RecordingReader::RecordingReader(std::istream& stream, const std::string& name)
    : m_Name(Printable(name)), m_rStream(stream), m_Line(LongestRecordLine + 1)
{
}

bool RecordingReader::Next(RecordListener& listener)
{
    m_rStream.getline(m_Line.data(), static_cast<std::streamsize>(m_Line.size()));
    if (m_rStream.bad()) {
        throw RecordingError(m_Name + ": cannot read recording");
    }
    const auto extracted = static_cast<std::size_t>(m_rStream.gcount());
    if (extracted == 0) {
        return false;
    }
    ++m_Number;
    if (m_rStream.fail()) {
        throw RecordingError(Place() + ": line too long; expected at most " +
                             std::to_string(LongestRecordLine) + " bytes");
    }
    const std::size_t size = m_rStream.eof() ? extracted : extracted - 1;
    std::optional<Record> record;
    try {
        record = ReadRecordLine({m_Line.data(), size}, m_Block);
    } catch (const LineError& error) {
        throw RecordingError(Place() + ":" + std::to_string(error.column) + ": " +
                             Printable(error.message));
    }
    std::visit(PassOn{listener}, *record);
    return true;
}

std::string RecordingReader::Place() const
{
    return m_Name + ":" + std::to_string(m_Number);
}

} // namespace deskplayer
