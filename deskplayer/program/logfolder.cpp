#include "program/logfolder.h"

#include <sys/stat.h>

#include <algorithm>
#include <atomic>
#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <map>
#include <memory>
#include <mutex>
#include <optional>
#include <set>
#include <string>
#include <system_error>
#include <thread>
#include <utility>
#include <vector>

#include "fieldlog/fieldlogreader.h"
#include "navigator/virtualclock.h"
#include "program/failure.h"
#include "program/fieldlogs.h"
#include "program/interruption.h"
#include "program/logfile.h"
#include "program/progress.h"
#include "program/target.h"
#include "text/printable.h"

namespace deskplayer
{

namespace
{

namespace fs = std::filesystem;

/** The work is not continued. */
struct Interrupted {
};

/** A log and the name of the file that it becomes. */
struct Conversion {
    std::string log;
    std::string output;

    /** The name of the file until it is complete. */
    std::string Part() const { return output + ".part"; }
};

/** What a conversion has to report. */
struct Outcome {
    int status = ExitOk;
    std::string message; ///< empty if there is none
    FieldLogCounts counts;
};

/** @throw UsageError two logs would become the same file */
std::vector<Conversion> PlanConversions(const Options& options, OutputFormat format)
{
    const std::string extension(OutputFormatExtensions[static_cast<std::size_t>(format)]);
    const fs::path folder = options.outputFolder;
    std::map<std::string, std::string> logs; // by the names of their outputs
    std::vector<Conversion> conversions;
    for (const std::string& log : options.fieldLogs) {
        if (log == "-") {
            throw UsageError("--output-folder: standard input has no name for its output");
        }
        const std::string output = folder / (fs::path(log).filename().string() + extension);
        const auto [other, isNew] = logs.emplace(output, log);
        if (!isNew) {
            throw UsageError("--output-folder: " + Printable(other->second) + " and " +
                             Printable(log) + " would both become " + Printable(output));
        }
        conversions.push_back({log, output});
    }
    return conversions;
}

using FileId = std::pair<dev_t, ino_t>;

/** Nothing if there is no such file. */
std::optional<FileId> IdOf(const std::string& name)
{
    struct stat status = {};
    return stat(name.c_str(), &status) == 0 ? std::optional<FileId>({status.st_dev, status.st_ino})
                                            : std::nullopt;
}

/** @throw UsageError a log would be overwritten */
void ExpectNoLogIsOverwritten(const std::vector<Conversion>& conversions)
{
    std::set<std::optional<FileId>> logs;
    for (const Conversion& conversion : conversions) {
        logs.insert(IdOf(conversion.log));
    }
    logs.erase(std::nullopt);
    for (const Conversion& conversion : conversions) {
        for (const std::string& written : {conversion.output, conversion.Part()}) {
            if (logs.count(IdOf(written)) != 0) {
                throw UsageError("--output-folder: " + Printable(written) + " is being read");
            }
        }
    }
}

/** A file that receives its name once it is complete, and that does not exist before. */
class OutputFile
{
public:
    explicit OutputFile(const Conversion& conversion)
        : m_Name(conversion.output), m_Part(conversion.Part()), m_Target(m_Part)
    {
    }

    ~OutputFile()
    {
        if (!m_IsComplete) {
            std::remove(m_Part.c_str());
        }
    }

    OutputFile(const OutputFile&) = delete;
    OutputFile& operator=(const OutputFile&) = delete;

    std::ostream& Open() { return m_Target.Open(); }

    void Complete()
    {
        m_Target.Finish();
        if (std::rename(m_Part.c_str(), m_Name.c_str()) != 0) {
            throw OutputError(Printable(m_Name) +
                              ": cannot be written: " + std::generic_category().message(errno));
        }
        m_IsComplete = true;
    }

private:
    const std::string m_Name;
    const std::string m_Part;
    Target m_Target;
    bool m_IsComplete = false;
};

/** Carries out conversions on several threads. */
class Conversions
{
public:
    Conversions(const Options& options, const OutputSettings& settings)
        : m_rSettings(settings), m_Pattern(PatternOf(options)),
          m_Conversions(PlanConversions(options, settings.format)),
          m_Outcomes(m_Conversions.size()), m_Progress(options)
    {
        ExpectNoLogIsOverwritten(m_Conversions);
    }

    std::size_t Count() const { return m_Conversions.size(); }

    /** @return the exit status */
    int Run(std::size_t jobs)
    {
        std::vector<std::thread> helpers;
        helpers.reserve(jobs);
        try {
            while (helpers.size() + 1 < jobs) {
                helpers.emplace_back([this] { Work(); });
            }
        } catch (const std::system_error&) {
            // The system has no more threads: those that there are do the work.
        }
        Work();
        for (std::thread& helper : helpers) {
            helper.join();
        }
        m_Progress.Clear();
        m_Interruption.EndIfRequested();
        PrintSkipped(m_Counts);
        if (m_Failed > 0) {
            PrintMessage(std::to_string(m_Failed) + " of " + std::to_string(Count()) +
                         " logs were not converted");
        }
        return m_Status;
    }

private:
    void Work()
    {
        try {
            for (std::size_t i = m_Next++; i < Count(); i = m_Next++) {
                Finish(i, Convert(m_Conversions[i]));
            }
        } catch (const Interrupted&) {
            m_Next = Count();
        }
    }

    Outcome Convert(const Conversion& conversion)
    {
        try {
            return {ExitOk, {}, Read(conversion)};
        } catch (const UsageError& error) {
            return {ExitUsage, error.what(), {}};
        } catch (const OutputError& error) {
            return {ExitOutput, error.what(), {}};
        }
    }

    /** @throw UsageError, OutputError or Interrupted; no output is left then */
    FieldLogCounts Read(const Conversion& conversion)
    {
        const auto log = std::make_unique<LogFile>(conversion.log); // too large for a stack
        OutputFile file(conversion);
        const VirtualClock unused; // records have times of their own
        OutputSettings settings = m_rSettings;
        settings.recordingName = conversion.log;
        std::unique_ptr<Output> output = MakeOutput(settings, file.Open(), unused);
        FieldLogReader reader(*output, m_Pattern);
        for (std::string_view part = log->Read(); !part.empty(); part = log->Read()) {
            Pass();
            reader.Read(part);
        }
        Pass();
        reader.EndFile();
        reader.Finish();
        output.reset();
        file.Complete();
        return reader.Counts();
    }

    /** Called while work is being done. */
    void Pass()
    {
        if (m_Interruption.IsRequested()) {
            throw Interrupted();
        }
        const std::lock_guard<std::mutex> lock(m_Mutex);
        ShowProgress();
    }

    /** Reports in the order of the options what can be reported by now. */
    void Finish(std::size_t index, Outcome outcome)
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        m_Outcomes[index] = std::move(outcome);
        ++m_Finished;
        for (; m_Reported < Count() && m_Outcomes[m_Reported]; ++m_Reported) {
            Report(m_Conversions[m_Reported].log, *m_Outcomes[m_Reported]);
        }
        ShowProgress();
    }

    void Report(const std::string& log, const Outcome& outcome)
    {
        m_Counts.foreignLines += outcome.counts.foreignLines;
        m_Counts.damagedLines += outcome.counts.damagedLines;
        if (outcome.status != ExitOk) {
            ++m_Failed;
            m_Status = m_Status == ExitOutput ? ExitOutput : outcome.status;
            Print(outcome.message);
        } else if (outcome.counts.callbacks == 0) {
            Print(Printable(log) + ": no line announces a callback");
        }
    }

    void Print(const std::string& message)
    {
        m_Progress.Clear();
        PrintMessage(message);
    }

    void ShowProgress()
    {
        m_Progress.Update([this] {
            return std::to_string(m_Finished) + " of " + std::to_string(Count()) + " logs";
        });
    }

    const OutputSettings& m_rSettings;
    const std::optional<PrefixPattern> m_Pattern;
    const std::vector<Conversion> m_Conversions;
    const Interruption m_Interruption;
    std::atomic<std::size_t> m_Next{0}; ///< conversion to begin

    std::mutex m_Mutex; ///< of all that follows
    std::vector<std::optional<Outcome>> m_Outcomes;
    std::size_t m_Finished = 0;
    std::size_t m_Reported = 0;
    std::size_t m_Failed = 0;
    FieldLogCounts m_Counts;
    int m_Status = ExitOk;
    Progress m_Progress;
};

std::size_t JobsOf(const Options& options)
{
    return options.jobs.value_or(std::max(1U, std::thread::hardware_concurrency()));
}

} // namespace

int ConvertFieldLogsToFolder(const Options& options, const OutputSettings& settings)
{
    Conversions conversions(options, settings);
    std::error_code error;
    fs::create_directories(options.outputFolder, error);
    if (error) {
        throw OutputError(Printable(options.outputFolder) +
                          ": cannot be created: " + error.message());
    }
    return conversions.Run(std::min(JobsOf(options), conversions.Count()));
}

} // namespace deskplayer
