// Reads any bytes as a log.

#include <optional>
#include <stdexcept>
#include <utility>

#include "expect.h"
#include "fieldlog/fieldlogreader.h"

namespace
{

using namespace deskplayer;

/** Expects what every reader of records may rely on. */
class Checker : public RecordListener
{
public:
    std::uint64_t callbacks = 0;

private:
    void OnRecord(const CallbackRecord& record) override
    {
        ExpectOrder(record.time);
        ++callbacks;
        const auto* const suspended = record.callback.As<bdmv::callbacks::SystemSuspended>();
        fuzz::Expect(suspended == nullptr || (suspended->data == nullptr && record.absent[0]));
    }

    void OnGap(const GapRecord& gap) override
    {
        ExpectOrder(gap.time);
        fuzz::ExpectPrintableLine(gap.cause);
    }

    void OnStart(const StartRecord& start) override
    {
        ExpectOrder(start.time);
        fuzz::ExpectPrintableLine(start.wallClock);
    }

    void ExpectOrder(Ticks time)
    {
        fuzz::Expect(time >= m_Last);
        m_Last = time;
    }

    Ticks m_Last{0};
};

void ReadLog(std::string_view log, std::optional<PrefixPattern> pattern)
{
    Checker checker;
    FieldLogReader reader(checker, std::move(pattern));
    // In two parts and as two files.
    reader.Read(log.substr(0, log.size() / 3));
    reader.Read(log.substr(log.size() / 3));
    reader.EndFile();
    reader.Read(log);
    reader.EndFile();
    reader.Finish();
    fuzz::Expect(reader.Counts().callbacks == checker.callbacks);
}

/** The first line is the pattern of the others. */
void ReadByPattern(std::string_view text)
{
    const std::size_t end = text.find('\n');
    if (end == std::string_view::npos) {
        return;
    }
    try {
        ReadLog(text.substr(end + 1), PrefixPattern(text.substr(0, end)));
    } catch (const std::invalid_argument& error) {
        fuzz::ExpectPrintableLine(error.what());
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    ReadLog(text, std::nullopt);
    ReadByPattern(text);
    return 0;
}
