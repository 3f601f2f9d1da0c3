#include "program/comparison.h"

#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstddef>
#include <system_error>

#include "navigator/virtualclock.h"
#include "output/jsonoutput.h"
#include "output/recordingelement.h"
#include "program/failure.h"
#include "program/recordingfile.h"
#include "program/target.h"
#include "recording/absence.h"
#include "recording/recordingreader.h"

namespace deskplayer
{

namespace
{

[[noreturn]] void Fail(int error)
{
    throw OutputError("temporary file: cannot be written: " +
                      std::generic_category().message(error));
}

/** Passes a recording on to an output, filled if the options say so. */
class Filler : public RecordListener
{
public:
    Filler(const Options& options, RecordListener& output) : m_rOptions(options), m_rOutput(output)
    {
    }

    void OnRecord(const CallbackRecord& record) override
    {
        CallbackRecord shown = record;
        if (m_rOptions.fill) {
            Fill(shown);
        }
        m_rOutput.OnRecord(shown);
    }

    void OnGap(const GapRecord& gap) override { m_rOutput.OnGap(gap); }
    void OnStart(const StartRecord& start) override { m_rOutput.OnStart(start); }

private:
    const Options& m_rOptions;
    RecordListener& m_rOutput;
};

void WriteElement(std::ostream& stream, const Options& options, const OutputFilter& filter)
{
    RecordingFile recording(options.compare);
    RecordingReader reader(recording.Stream(), recording.Name());
    RecordingElement element(stream, recording.Name());
    const VirtualClock unused; // records have times of their own
    JsonOutput output(element.Lines(), unused, filter);
    Filler filler(options, output);
    while (reader.Next(filler)) {
    }
}

} // namespace

Comparison::Comparison(const Options& options, const OutputFilter& filter) : m_pFile(std::tmpfile())
{
    if (!m_pFile) {
        Fail(errno);
    }
    DescriptorBuffer buffer;
    buffer.Attach(fileno(m_pFile.get()));
    std::ostream stream(&buffer);
    WriteElement(stream, options, filter);
    if (!stream.flush()) {
        Fail(buffer.Error());
    }
}

void Comparison::WriteTo(std::ostream& page) const
{
    std::array<char, std::size_t{64} * 1024> part;
    off_t position = 0;
    ssize_t size = 0;
    do {
        size = pread(fileno(m_pFile.get()), part.data(), part.size(), position);
        if (size > 0) {
            page.write(part.data(), size);
            position += size;
        }
    } while (size > 0 || (size < 0 && errno == EINTR));
    if (size < 0) {
        page.setstate(std::ios::badbit);
    }
}

} // namespace deskplayer
