// bdmv-deskplayer: plays a play list of a disc without its streams and writes the callbacks that a
// navigator's listeners receive.

#include <CLI/CLI.hpp>
#include <unistd.h>

#include <array>
#include <chrono>
#include <cstdlib>
#include <iostream>
#include <memory>
#include <optional>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

#include "check/check.h"
#include "check/faultoutput.h"
#include "clientkit/scopedlistener.h"
#include "deskplayer/desk.h"
#include "deskplayer/output.h"
#include "deskplayer/session.h"
#include "disc/disc.h"
#include "facade/outputsettings.h"
#include "facade/parts.h"
#include "kevro_linux.h"
#include "listing/description.h"
#include "listing/listing.h"
#include "listing/listingjson.h"
#include "output/textoutput.h"
#include "program/failure.h"
#include "program/fieldlogs.h"
#include "program/logclock.h"
#include "program/logfolder.h"
#include "program/options.h"
#include "program/page.h"
#include "program/progress.h"
#include "program/remotescreen.h"
#include "program/replay.h"
#include "program/target.h"
#include "session/remote.h"
#include "text/printable.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

OutputOptions OutputOptionsOf(const Options& options)
{
    OutputOptions output;
    output.format = options.format;
    output.interfaces = options.listen;
    output.callbacks = options.only;
    output.tags = options.tags;
    output.coloured = options.output.empty() && options.outputFolder.empty() &&
                      WantsColours(STDOUT_FILENO, std::getenv("NO_COLOR"), std::getenv("TERM"));
    return output;
}

/**
 * @throw UsageError the options name no format, interface, callback or tag, or exclude each other
 * @throw whatever PreparePage() throws
 */
OutputSettings CheckOutput(const Options& options)
{
    OutputSettings settings;
    try {
        settings = ReadOutputOptions(OutputOptionsOf(options));
    } catch (const std::invalid_argument& error) {
        throw UsageError(error.what());
    }
    if ((options.list || options.describe || options.check) &&
        (settings.format == OutputFormat::Trace || settings.format == OutputFormat::Html)) {
        throw UsageError(std::string(options.list       ? "--list"
                                     : options.describe ? "--describe"
                                                        : "--check") +
                         " excludes --format " + options.format);
    }
    if (!options.tags.empty() && settings.format != OutputFormat::Json) {
        throw UsageError("--tag requires --format json");
    }
    if (options.summary && settings.format != OutputFormat::Text &&
        settings.format != OutputFormat::Json) {
        throw UsageError("--summary excludes --format " + options.format);
    }
    PreparePage(options, settings);
    return settings;
}

/** @return the exit status */
int Play(Desk& desk, const std::optional<Session>& session, const Options& options,
         const OutputSettings& settings, std::ostream& stream)
{
    VirtualClock& clock = PartsOf(desk).Clock();
    const LogClock logClock(clock);
    const std::unique_ptr<Output> output = MakeOutput(settings, stream, clock);
    const bdmv::ScopedListener<bdmv::INavigatorListener> registration(desk.Listeners(), *output);
    if (options.remote) {
        RemoteScreen screen(PartsOf(desk), stream);
        PlayByRemote(PartsOf(desk), STDIN_FILENO, screen.Hooks());
        return ExitOk;
    }

    Progress progress(options);
    const auto start = std::chrono::steady_clock::now();
    const TimeHandler beforeTimePasses = [&](Ticks time) {
        progress.Update([&desk] { return TimeText(desk.Now()); });
        if (options.realTime) {
            stream.flush();
            std::this_thread::sleep_until(
                start + std::chrono::duration_cast<std::chrono::nanoseconds>(desk.Now() + time));
        }
    };
    if (!session) {
        PlayFromStartToEnd(desk, beforeTimePasses);
        return ExitOk;
    }
    SessionOptions sessionOptions;
    sessionOptions.beforeTimePasses = beforeTimePasses;
    sessionOptions.onMessage = PrintMessage;
    const SessionReport report = PlaySession(desk, *session, sessionOptions);
    const bool failed = !report.unmet.empty() || (options.strict && !report.refused.empty());
    return failed ? ExitSession : ExitOk;
}

/** @return the exit status */
int Check(const Options& options, OutputFormat format, Target& target)
{
    const Disc disc(options.disc, BackupCopies::Ignore);
    std::ostream& stream = target.Open();
    const auto write = format == OutputFormat::Json ? WriteFaultAsJson : WriteFault;
    Progress progress(options);
    const std::size_t faults = CheckDisc(
        disc,
        [&](const Fault& fault) {
            progress.Clear();
            write(stream, fault);
            stream.flush();
        },
        [&progress](const std::string& file) { progress.Update([&file] { return file; }); });
    return faults == 0 ? ExitOk : ExitDisc;
}

/** @return the exit status */
int Run(const Options& options)
{
    const OutputSettings settings = CheckOutput(options);
    const OutputFormat format = settings.format;
    const bool json = format == OutputFormat::Json;
    Target target(options.output);
    int status = ExitOk;
    if (!options.outputFolder.empty()) {
        status = ConvertFieldLogsToFolder(options, settings);
    } else if (!options.fieldLogs.empty()) {
        try {
            ConvertFieldLogs(options, settings, target);
        } catch (const UsageError&) {
            target.Finish(); // what could be read
            throw;
        }
    } else if (!options.replay.empty()) {
        ReplayRecording(options, settings, target);
    } else if (options.check) {
        status = Check(options, format, target);
    } else if (options.list) {
        const Disc disc(options.disc, BackupCopies::Use, PrintMessage);
        const std::vector<std::uint32_t> numbers = disc.PlayListNumbers();
        const auto list = json ? ListPlayListsAsJson : ListPlayLists;
        status = list(target.Open(), disc, numbers, PrintMessage) == 0 ? ExitOk : ExitDisc;
    } else if (options.describe) {
        const Disc disc(options.disc, BackupCopies::Use, PrintMessage);
        const PlayList playList = disc.ReadPlayList(*options.describe);
        const auto describe = json ? DescribePlayListAsJson : DescribePlayList;
        const std::size_t faults =
            describe(target.Open(), disc, *options.describe, playList, PrintMessage);
        status = faults == 0 ? ExitOk : ExitDisc;
    } else {
        Desk desk(options.disc, options.playList, PrintMessage);
        std::optional<Session> session;
        if (!options.session.empty()) {
            session = ReadSessionFile(options.session);
        }
        status = Play(desk, session, options, settings, target.Open());
    }
    target.Finish();
    return status;
}

/** Log lines are written only if an option or the environment selects them. */
void ConfigureLog(const Options& options)
{
    if (!options.log && std::getenv("KEVRO_LOG") != nullptr) {
        return;
    }
    std::array<char, 300> message{};
    if (!KEVRO_Log_Configure(options.log.value_or("").c_str(), message.data(), message.size())) {
        throw UsageError(std::string("--log: ") + message.data());
    }
}

/** @return the exit status */
int ParseAndRun(int argc, char** argv)
{
    Options options;
    CLI::App app("Plays a play list of a Blu-ray disc without its streams and writes every "
                 "callback that the navigator's listeners receive, with its time and arguments.",
                 "bdmv-deskplayer");
    AddOptions(app, options);
    try {
        app.parse(argc, argv);
    } catch (const CLI::Success& text) {
        Target target("");
        std::ostream& stream = target.Open();
        app.exit(text, stream, stream);
        target.Finish();
        return ExitOk;
    } catch (const CLI::ParseError& error) {
        throw UsageError(Printable(error.what()) + "; see --help");
    }
    ConfigureLog(options);
    return Run(options);
}

} // namespace

} // namespace deskplayer

int main(int argc, char** argv)
{
    try {
        return deskplayer::ParseAndRun(argc, argv);
    } catch (const deskplayer::DiscError& error) {
        deskplayer::PrintMessage(error.what());
        return deskplayer::ExitDisc;
    } catch (const deskplayer::SessionError& error) {
        deskplayer::PrintMessage(error.what());
        return deskplayer::ExitUsage;
    } catch (const deskplayer::RecordingError& error) {
        deskplayer::PrintMessage(error.what());
        return deskplayer::ExitUsage;
    } catch (const deskplayer::UsageError& error) {
        deskplayer::PrintMessage(error.what());
        return deskplayer::ExitUsage;
    } catch (const deskplayer::OutputError& error) {
        deskplayer::PrintMessage(error.what());
        return deskplayer::ExitOutput;
    }
}
