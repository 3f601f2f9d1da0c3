// Reads any bytes as a recording. What is read is written and read again: both must agree.

#include <cstdint>
#include <sstream>
#include <string>

#include "expect.h"
#include "output/jsonoutput.h"
#include "recording/absence.h"
#include "recording/recordingreader.h"

namespace
{

using namespace deskplayer;

/** Writes records as JSON, and looks at what is absent. */
class Writer : public RecordListener
{
public:
    std::string Text() const { return m_Stream.str(); }

    void OnRecord(const CallbackRecord& record) override
    {
        fuzz::Expect(IsComplete(record) == AbsentArguments(record).empty());
        CallbackRecord filled = record;
        Fill(filled);
        fuzz::Expect(IsComplete(filled));
        m_rOutput.OnRecord(record);
    }

    void OnGap(const GapRecord& gap) override { m_rOutput.OnGap(gap); }
    void OnStart(const StartRecord& start) override { m_rOutput.OnStart(start); }

private:
    std::ostringstream m_Stream;
    VirtualClock m_Clock;
    JsonOutput m_Output{m_Stream, m_Clock, OutputFilter()};
    RecordListener& m_rOutput = m_Output;
};

/** @return whether the whole text is a recording */
bool Read(const std::string& text, RecordListener& listener)
{
    std::istringstream stream(text);
    RecordingReader reader(stream, "file");
    try {
        while (reader.Next(listener)) {
        }
        return true;
    } catch (const RecordingError& error) {
        fuzz::ExpectPrintableLine(error.what());
        return false;
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    Writer first;
    Read(std::string(reinterpret_cast<const char*>(data), size), first);
    Writer second;
    fuzz::Expect(Read(first.Text(), second));
    fuzz::Expect(second.Text() == first.Text());
    return 0;
}
