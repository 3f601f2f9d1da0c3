// bdmv-deskplayer: plays a play list of a disc without its streams and writes the callbacks that a
// navigator's listeners receive.

#include <CLI/CLI.hpp>
#include <unistd.h>

#include <array>
#include <chrono>
#include <cstdlib>
#include <iostream>
#include <memory>
#include <stdexcept>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include "check/check.h"
#include "check/faultoutput.h"
#include "disc/disc.h"
#include "kevro_linux.h"
#include "listing/description.h"
#include "listing/listing.h"
#include "listing/listingjson.h"
#include "navigator/desk.h"
#include "output/outputformat.h"
#include "output/textoutput.h"
#include "program/failure.h"
#include "program/logclock.h"
#include "program/options.h"
#include "program/playbacktype.h"
#include "program/progress.h"
#include "program/remotescreen.h"
#include "program/sessionchecks.h"
#include "program/sessionfile.h"
#include "program/target.h"
#include "session/remote.h"
#include "session/session.h"
#include "text/printable.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

OutputOptions OutputOptionsOf(const Options& options)
{
    OutputOptions output;
    try {
        output.format = ParseOutputFormat(options.format);
        if (!options.listen.empty()) {
            output.filter.KeepInterfaces(options.listen);
        }
        if (!options.only.empty()) {
            output.filter.KeepCallbacks(options.only);
        }
    } catch (const std::invalid_argument& error) {
        throw UsageError(error.what());
    }
    if ((options.list || options.describe || options.check) &&
        output.format == OutputFormat::Trace) {
        throw UsageError(std::string(options.list       ? "--list"
                                     : options.describe ? "--describe"
                                                        : "--check") +
                         " excludes --format trace");
    }
    output.coloured = options.output.empty() &&
                      WantsColours(STDOUT_FILENO, std::getenv("NO_COLOR"), std::getenv("TERM"));
    return output;
}

LoadedPlayList Load(const Disc& disc, const Options& options)
{
    if (options.playList) {
        return LoadPlayList(disc, *options.playList, disc.ReadPlayList(*options.playList));
    }
    LongestPlayList longest = disc.FindLongestPlayList();
    for (const std::string& line : longest.skipped) {
        PrintMessage("skipped: " + line);
    }
    return LoadPlayList(disc, longest.number, std::move(longest.playList));
}

/** @return the exit status */
int Play(LoadedPlayList playList, const std::vector<ScriptStep>& steps, const Options& options,
         const OutputOptions& outputOptions, std::ostream& stream)
{
    Desk desk(std::move(playList));
    const LogClock logClock(desk.Clock());
    const std::unique_ptr<Output> output = MakeOutput(outputOptions, stream, desk.Clock());
    desk.Listeners().AddListener(output.get());

    if (options.remote) {
        RemoteScreen screen(desk, stream);
        PlayByRemote(desk, STDIN_FILENO, screen.Hooks());
        return ExitOk;
    }

    Progress progress(options);
    SessionHooks hooks;
    const auto start = std::chrono::steady_clock::now();
    hooks.beforeTimePasses = [&](Ticks time) {
        progress.Update([&desk] { return TimeText(desk.Clock().Now()); });
        if (options.realTime) {
            stream.flush();
            std::this_thread::sleep_until(
                start +
                std::chrono::duration_cast<std::chrono::nanoseconds>(desk.Clock().Now() + time));
        }
    };
    SessionChecks checks(options, steps, desk);
    checks.AddTo(hooks);
    if (options.session.empty()) {
        PlayFromStartToEnd(desk, hooks);
    } else {
        PlaySession(steps, desk, hooks);
    }
    return checks.HaveFailed() ? ExitSession : ExitOk;
}

/** @return the exit status */
int Check(const Options& options, OutputFormat format, std::ostream& stream)
{
    const Disc disc(options.disc, BackupCopies::Ignore);
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
    const OutputOptions outputOptions = OutputOptionsOf(options);
    const Disc disc(options.disc, BackupCopies::Use, PrintMessage);
    Target target(options.output);
    int status = ExitOk;
    const bool json = outputOptions.format == OutputFormat::Json;
    if (options.check) {
        status = Check(options, outputOptions.format, target.Open());
    } else if (options.list) {
        const std::vector<std::uint32_t> numbers = disc.PlayListNumbers();
        const auto list = json ? ListPlayListsAsJson : ListPlayLists;
        status = list(target.Open(), disc, numbers, PrintMessage) == 0 ? ExitOk : ExitDisc;
    } else if (options.describe) {
        const PlayList playList = disc.ReadPlayList(*options.describe);
        const auto describe = json ? DescribePlayListAsJson : DescribePlayList;
        const std::size_t faults =
            describe(target.Open(), disc, *options.describe, playList, PrintMessage);
        status = faults == 0 ? ExitOk : ExitDisc;
    } else {
        LoadedPlayList playList = Load(disc, options);
        ReportPlaybackType(playList);
        for (const std::string& note : playList.notes) {
            PrintMessage(note);
        }
        const std::vector<ScriptStep> steps =
            options.session.empty() ? std::vector<ScriptStep>() : ReadSessionFile(options.session);
        status = Play(std::move(playList), steps, options, outputOptions, target.Open());
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
    } catch (const deskplayer::ScriptError& error) {
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
