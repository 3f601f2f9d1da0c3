#include "recording/recordingreader.h"

#include <array>
#include <cstddef>
#include <optional>

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
    void operator()(const StartRecord& start) const { listener.OnStart(start); }
};

} // namespace

RecordingReader::RecordingReader(std::istream& stream, const std::string& name)
    : m_Name(Printable(name)), m_rStream(stream)
{
}

bool RecordingReader::Next(RecordListener& listener)
{
    if (!ReadLine()) {
        return false;
    }
    std::optional<Record> record;
    try {
        record = ReadRecordLine(m_Line, m_Block);
    } catch (const LineError& error) {
        throw RecordingError(Place() + ":" + std::to_string(error.column) + ": " +
                             Printable(error.message));
    }
    std::visit(PassOn{listener}, *record);
    return true;
}

/** @return false at the end of the recording */
bool RecordingReader::ReadLine()
{
    m_Line.clear();
    ++m_Number;
    std::array<char, 4096> part{};
    while (m_Line.size() <= LongestRecordLine) {
        m_rStream.getline(part.data(), part.size());
        const auto extracted = static_cast<std::size_t>(m_rStream.gcount());
        if (m_rStream.bad() || (extracted == 0 && !m_rStream.eof())) {
            throw RecordingError(m_Name + ": cannot read recording");
        }
        const bool reachedLineEnd = m_rStream.good();
        m_Line.append(part.data(), reachedLineEnd ? extracted - 1 : extracted);
        if (reachedLineEnd || m_rStream.eof()) {
            break;
        }
        m_rStream.clear(); // the line is longer than the part
    }
    if (m_Line.size() > LongestRecordLine) {
        throw RecordingError(Place() + ": line too long; expected at most " +
                             std::to_string(LongestRecordLine) + " bytes");
    }
    return m_rStream.good() || !m_Line.empty();
}

std::string RecordingReader::Place() const
{
    return m_Name + ":" + std::to_string(m_Number);
}

} // namespace deskplayer
