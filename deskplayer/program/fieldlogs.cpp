#include "program/fieldlogs.h"

#include <sys/stat.h>

#include <algorithm>
#include <memory>
#include <stdexcept>
#include <vector>

#include "fieldlog/fieldlogreader.h"
#include "program/failure.h"
#include "program/logfile.h"
#include "program/progress.h"
#include "program/recordwriter.h"
#include "text/printable.h"

namespace deskplayer
{

namespace
{

using LogFiles = std::vector<std::unique_ptr<LogFile>>;

/** Opens all, so that a misspelt name is noticed before anything is written. */
LogFiles OpenLogs(const Options& options)
{
    LogFiles logs;
    for (const std::string& name : options.fieldLogs) {
        logs.push_back(std::make_unique<LogFile>(name));
    }
    struct stat output = {};
    if (!options.output.empty() && stat(options.output.c_str(), &output) == 0) {
        for (const auto& log : logs) {
            if (log->IsFile(output)) {
                throw UsageError("--output: " + log->Name() + " is being read");
            }
        }
    }
    return logs;
}

std::string CountText(std::uint64_t count, const std::string& kind)
{
    return std::to_string(count) + " " + kind + (count == 1 ? " line" : " lines");
}

/** How far the logs have been read. */
class ReadProgress
{
public:
    ReadProgress(const Options& options, const LogFiles& logs) : m_Progress(options)
    {
        for (const auto& log : logs) {
            m_IsLive = m_IsLive || log->IsLive();
            m_Total += log->IsLive() ? 0 : log->Size();
        }
    }

    void Advance(std::size_t bytes)
    {
        m_Read += bytes;
        m_Progress.Update([this] { return Text(); });
    }

    void Clear() { m_Progress.Clear(); }

private:
    /** "512 of 1024 MiB, 50 %". A file may have grown. */
    std::string Text() const
    {
        const std::string read = std::to_string(m_Read >> 20);
        if (m_IsLive) {
            return read + " MiB";
        }
        const std::uint64_t total = std::max(m_Total, m_Read);
        return read + " of " + std::to_string(total >> 20) + " MiB, " +
               std::to_string(m_Read * 100 / total) + " %";
    }

    Progress m_Progress;
    std::uint64_t m_Read = 0;  ///< bytes
    std::uint64_t m_Total = 0; ///< bytes
    bool m_IsLive = false;     ///< so the total is unknown
};

} // namespace

std::optional<PrefixPattern> PatternOf(const Options& options)
{
    if (!options.logPrefix) {
        return std::nullopt;
    }
    try {
        return PrefixPattern(*options.logPrefix);
    } catch (const std::invalid_argument& error) {
        throw UsageError(std::string("--log-prefix: ") + error.what());
    }
}

void PrintSkipped(const FieldLogCounts& counts)
{
    if (counts.foreignLines > 0 || counts.damagedLines > 0) {
        PrintMessage("skipped " + CountText(counts.foreignLines, "foreign") + " and " +
                     CountText(counts.damagedLines, "damaged"));
    }
}

void ConvertFieldLogs(const Options& options, const OutputSettings& settings, Target& target)
{
    std::optional<PrefixPattern> pattern = PatternOf(options);
    const LogFiles logs = OpenLogs(options);
    std::ostream& stream = target.Open();
    ReadProgress progress(options, logs);
    RecordWriter writer(options, settings, stream);
    FieldLogReader reader(writer.Listener(), std::move(pattern));
    for (const auto& log : logs) {
        for (std::string_view part = log->Read(); !part.empty(); part = log->Read()) {
            reader.Read(part);
            progress.Advance(part.size());
            if (log->IsLive()) {
                stream.flush();
            }
        }
        reader.EndFile();
    }
    reader.Finish();
    progress.Clear();
    const FieldLogCounts& counts = reader.Counts();
    writer.Finish(LogSummary{counts.foreignLines, counts.damagedLines});
    if (options.summary) {
        return; // it has these counts
    }
    PrintSkipped(counts);
    if (counts.callbacks == 0) {
        PrintMessage("no line announces a callback");
    }
}

} // namespace deskplayer
