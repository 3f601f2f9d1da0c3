#include "program/fieldlogs.h"

#include <sys/stat.h>

#include <memory>
#include <stdexcept>
#include <vector>

#include "fieldlog/fieldlogreader.h"
#include "navigator/virtualclock.h"
#include "program/failure.h"
#include "program/logfile.h"
#include "program/progress.h"
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
    Progress progress(options);
    std::uint64_t bytes = 0;
    FieldLogCounts counts;
    {
        const VirtualClock unused; // records have times of their own
        const std::unique_ptr<Output> output = MakeOutput(settings, stream, unused);
        FieldLogReader reader(*output, std::move(pattern));
        for (const auto& log : logs) {
            for (std::string_view part = log->Read(); !part.empty(); part = log->Read()) {
                reader.Read(part);
                bytes += part.size();
                progress.Update([bytes] { return std::to_string(bytes >> 20) + " MiB read"; });
                if (log->IsLive()) {
                    stream.flush();
                }
            }
            reader.EndFile();
        }
        reader.Finish();
        counts = reader.Counts();
    }
    progress.Clear();
    PrintSkipped(counts);
    if (counts.callbacks == 0) {
        PrintMessage("no line announces a callback");
    }
}

} // namespace deskplayer
