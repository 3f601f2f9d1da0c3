// bdmv-deskplayer: plays a play list of a disc without its streams and writes the callbacks that a
// navigator's listeners receive.

#include <CLI/CLI.hpp>
#include <fcntl.h>
#include <poll.h>
#include <unistd.h>

#include <array>
#include <chrono>
#include <cstdlib>
#include <fstream>
#include <iomanip>
#include <iostream>
#include <memory>
#include <optional>
#include <stdexcept>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include "bdmvnavigator/version.h"
#include "disc/disc.h"
#include "kevro_linux.h"
#include "listing/description.h"
#include "listing/listing.h"
#include "navigator/desk.h"
#include "output/outputformat.h"
#include "output/textoutput.h"
#include "session/remote.h"
#include "session/session.h"
#include "text/timetext.h"

namespace
{

// Exit statuses.
constexpr int ExitOk = 0;
constexpr int ExitOutput = 1;
constexpr int ExitUsage = 2;
constexpr int ExitDisc = 3;

/** The command line or the session is invalid. */
class UsageError : public std::runtime_error
{
public:
    using std::runtime_error::runtime_error;
};

/** The output could not be written. */
class OutputError : public std::runtime_error
{
public:
    using std::runtime_error::runtime_error;
};

struct Options {
    std::string disc;
    std::optional<std::uint32_t> playList;
    bool list = false;
    std::optional<std::uint32_t> describe;
    std::string session;
    bool realTime = false;
    bool remote = false;
    std::string format = "text";
    std::string output;
    std::string listen;
    std::string only;
    std::optional<std::string> log;
};

void PrintMessage(const std::string& message)
{
    std::cerr << "bdmv-deskplayer: " << message << '\n';
}

/** An open file. */
class File
{
public:
    explicit File(const std::string& fileName)
        : m_Descriptor(open(fileName.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC))
    {
    }

    ~File() { close(m_Descriptor); }

    File(const File&) = delete;
    File& operator=(const File&) = delete;

    /** Waits for input, the end or an error. @return false if a silent pipe made it time out */
    bool WaitForInput() const
    {
        constexpr int timeout = 500; // milliseconds
        pollfd input = {m_Descriptor, POLLIN, 0};
        return m_Descriptor < 0 || poll(&input, 1, timeout) != 0;
    }

    /** @return the number of bytes read; 0 at the end, negative on an error */
    ssize_t Read(char* bytes, std::size_t size) const { return read(m_Descriptor, bytes, size); }

private:
    int m_Descriptor;
};

/** Stops reading once the session is known to be too long. */
std::string ReadSession(const std::string& fileName)
{
    const File file(fileName);
    std::string text;
    std::array<char, 4096> buffer;
    ssize_t size = 1;
    while (size > 0 && text.size() <= deskplayer::LongestScript) {
        if (!file.WaitForInput()) {
            throw UsageError(fileName + ": timed out waiting for input");
        }
        size = file.Read(buffer.data(), buffer.size());
        if (size < 0) {
            throw UsageError(fileName + ": cannot read session, expected a text file");
        }
        text.append(buffer.data(), static_cast<std::size_t>(size));
    }
    if (text.size() > deskplayer::LongestScript) {
        throw UsageError(fileName + ": session too long, expected at most " +
                         std::to_string(deskplayer::LongestScript) + " bytes");
    }
    return text;
}

/** The steps of the session; none if no session is given. */
std::vector<deskplayer::ScriptStep> ReadSteps(const Options& options)
{
    if (options.session.empty()) {
        return {};
    }
    return deskplayer::ParseScript(ReadSession(options.session), options.session,
                                   deskplayer::CommandSyntaxes());
}

deskplayer::OutputOptions OutputOptionsOf(const Options& options)
{
    deskplayer::OutputOptions output;
    try {
        output.format = deskplayer::ParseOutputFormat(options.format);
        if (!options.listen.empty()) {
            output.filter.KeepInterfaces(options.listen);
        }
        if (!options.only.empty()) {
            output.filter.KeepCallbacks(options.only);
        }
    } catch (const std::invalid_argument& error) {
        throw UsageError(error.what());
    }
    output.coloured =
        options.output.empty() && deskplayer::WantsColours(STDOUT_FILENO, std::getenv("NO_COLOR"));
    return output;
}

deskplayer::LoadedPlayList Load(const deskplayer::Disc& disc, const Options& options)
{
    if (options.playList) {
        return deskplayer::LoadPlayList(disc, *options.playList,
                                        disc.ReadPlayList(*options.playList));
    }
    deskplayer::LongestPlayList longest = disc.FindLongestPlayList();
    for (const std::string& line : longest.unreadable) {
        PrintMessage("skipped: " + line);
    }
    return deskplayer::LoadPlayList(disc, longest.number, std::move(longest.playList));
}

/** Shows the time of the session on a terminal once playback takes more than a second. */
class Progress
{
public:
    /** @param options whether output goes to the same terminal, which rules out showing progress */
    Progress(const deskplayer::VirtualClock& clock, const Options& options)
        : m_rClock(clock), m_Possible(isatty(STDERR_FILENO) != 0 &&
                                      (isatty(STDOUT_FILENO) == 0 || !options.output.empty()))
    {
    }

    ~Progress()
    {
        if (m_Shown) {
            std::cerr << '\r' << std::string(Width, ' ') << '\r';
        }
    }

    Progress(const Progress&) = delete;
    Progress& operator=(const Progress&) = delete;

    void Update()
    {
        const auto now = std::chrono::steady_clock::now();
        if (m_Possible && now >= m_Next) {
            m_Next = now + std::chrono::milliseconds(200);
            m_Shown = true;
            std::cerr << "\r" << deskplayer::TimeText(m_rClock.Now()) << std::flush;
        }
    }

private:
    static constexpr std::size_t Width = sizeof "00:00:00.000";

    const deskplayer::VirtualClock& m_rClock;
    const bool m_Possible;
    bool m_Shown = false;
    std::chrono::steady_clock::time_point m_Next =
        std::chrono::steady_clock::now() + std::chrono::seconds(1);
};

void Play(deskplayer::LoadedPlayList playList, const std::vector<deskplayer::ScriptStep>& steps,
          const Options& options, const deskplayer::OutputOptions& outputOptions,
          std::ostream& stream)
{
    deskplayer::Desk desk(std::move(playList));
    const std::unique_ptr<deskplayer::Output> output =
        deskplayer::MakeOutput(outputOptions, stream, desk.Clock());
    desk.Listeners().AddListener(output.get());

    if (options.remote) {
        std::cerr << deskplayer::RemoteHelp();
        deskplayer::PlayByRemote(desk, STDIN_FILENO, PrintMessage);
        return;
    }

    Progress progress(desk.Clock(), options);
    deskplayer::SessionHooks hooks;
    const auto start = std::chrono::steady_clock::now();
    hooks.beforeTimePasses = [&](deskplayer::Ticks time) {
        progress.Update();
        if (options.realTime) {
            stream.flush();
            std::this_thread::sleep_until(
                start +
                std::chrono::duration_cast<std::chrono::nanoseconds>(desk.Clock().Now() + time));
        }
    };
    hooks.onRefused = [&options, &desk](std::size_t line, const std::string& reason) {
        PrintMessage(options.session + ":" + std::to_string(line) + ": refused at " +
                     deskplayer::TimeText(desk.Clock().Now()) + ": " + reason);
    };
    if (options.session.empty()) {
        deskplayer::PlayFromStartToEnd(desk, hooks);
    } else {
        deskplayer::PlaySession(steps, desk, hooks);
    }
}

/** The output: a file, or standard output. */
class Target
{
public:
    /** @param fileName empty for standard output */
    explicit Target(const std::string& fileName) : m_rFileName(fileName) {}

    /** Discards the contents of an existing file, so call this only after reading all input. */
    std::ostream& Open()
    {
        if (m_rFileName.empty()) {
            return std::cout;
        }
        m_File.open(m_rFileName, std::ios::binary | std::ios::trunc);
        if (!m_File) {
            throw OutputError(m_rFileName + ": cannot be written");
        }
        return m_File;
    }

    /** Flushes the output and throws if anything could not be written. */
    void Finish()
    {
        if (m_rFileName.empty() ? !std::cout.flush() : !m_File.flush()) {
            throw OutputError((m_rFileName.empty() ? "standard output" : m_rFileName) +
                              ": could not be written");
        }
    }

private:
    const std::string& m_rFileName;
    std::ofstream m_File;
};

/** @return the exit status */
int Run(const Options& options)
{
    const deskplayer::OutputOptions outputOptions = OutputOptionsOf(options);
    const deskplayer::Disc disc(options.disc);
    Target target(options.output);
    int status = ExitOk;
    if (options.list) {
        const std::vector<std::uint32_t> numbers = disc.PlayListNumbers();
        status = deskplayer::ListPlayLists(target.Open(), disc, numbers) == 0 ? ExitOk : ExitDisc;
    } else if (options.describe) {
        const deskplayer::PlayList playList = disc.ReadPlayList(*options.describe);
        deskplayer::DescribePlayList(target.Open(), disc, *options.describe, playList);
    } else {
        deskplayer::LoadedPlayList playList = Load(disc, options);
        const std::vector<deskplayer::ScriptStep> steps = ReadSteps(options);
        Play(std::move(playList), steps, options, outputOptions, target.Open());
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

void PrintCommands()
{
    for (const deskplayer::CommandSyntax& syntax : deskplayer::CommandSyntaxes()) {
        std::cout << std::left << std::setw(36) << syntax.pattern << syntax.help << '\n';
    }
}

/** Help without the lists of mutually exclusive options. */
class HelpFormatter : public CLI::Formatter
{
public:
    std::string make_option_opts(const CLI::Option* option) const override
    {
        const std::string type = option->get_type_name();
        return type.empty() ? "" : " " + type;
    }
};

void AddOptions(CLI::App& app, Options& options)
{
    app.formatter(std::make_shared<HelpFormatter>());
    app.set_version_flag("--version", "bdmv-deskplayer " BDMVNAVIGATOR_VERSION_TEXT);
    app.add_flag_callback(
        "--commands",
        [] {
            PrintCommands();
            throw CLI::Success();
        },
        "Print the commands of sessions and exit");
    app.add_option("DISC", options.disc, "A BDMV folder or its parent")->required()->type_name("");

    auto* const playList =
        app.add_option("--playlist", options.playList, "Play list to play; the longest by default")
            ->check(CLI::Range(0, 99999).description(""))
            ->type_name("N");
    auto* const list = app.add_flag("--list", options.list, "Print a table of the play lists");
    auto* const describe =
        app.add_option("--describe", options.describe, "Print the full contents of a play list")
            ->check(CLI::Range(0, 99999).description(""))
            ->type_name("N")
            ->excludes(list);
    auto* const session =
        app.add_option("--session", options.session,
                       "Session file to carry out; by default, play from start to end")
            ->type_name("FILE");
    auto* const realTime =
        app.add_flag("--realtime", options.realTime, "Play in real time instead of at once");
    auto* const remote = app.add_flag("--remote", options.remote,
                                      "Play in real time, with single keys as a remote control")
                             ->excludes(session);
    for (CLI::Option* const playing : {playList, session, realTime, remote}) {
        playing->excludes(list)->excludes(describe);
    }

    app.add_option("--format", options.format,
                   "Output format: text, json (one object per line) or trace (for trace viewers)")
        ->type_name("FORMAT");
    app.add_option("--output", options.output, "File to write; standard output by default")
        ->type_name("FILE");
    app.add_option("--listen", options.listen,
                   "Listener interfaces to write: control, settings, button, interactive")
        ->type_name("NAME,...");
    app.add_option("--only", options.only, "Callbacks to write: PlayItem, AudioInfo, ...")
        ->type_name("NAME,...");
    app.add_option("--log", options.log,
                   "Log lines to write to standard error, such as BdmvNavigator=Event for those "
                   "of events")
        ->type_name("TEXT");
    app.footer(
        "A session file has one command per line, which may begin with a time:\n"
        "\"at 00:01:30.500 chapter next\", \"after 2s pause\". --commands lists the commands.\n\n"
        "Examples:\n"
        "  bdmv-deskplayer --list disc\n"
        "  bdmv-deskplayer disc --session evening.session\n"
        "  bdmv-deskplayer disc --only PlayItem,ChapterNumber --format json\n"
        "  bdmv-deskplayer disc --remote\n\n"
        "Exit status: 0 success, 1 the output could not be written, 2 wrong usage or a session\n"
        "that cannot be read, 3 the disc cannot be read.");
}

} // namespace

int main(int argc, char** argv)
{
    Options options;
    CLI::App app("Plays a play list of a Blu-ray disc without its streams and writes every "
                 "callback that the navigator's listeners receive, with its time and arguments.",
                 "bdmv-deskplayer");
    AddOptions(app, options);
    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        if (app.exit(error) != 0) {
            return ExitUsage;
        }
        return std::cout.flush() ? ExitOk : ExitOutput;
    }

    try {
        ConfigureLog(options);
        return Run(options);
    } catch (const deskplayer::DiscError& error) {
        PrintMessage(error.what());
        return ExitDisc;
    } catch (const deskplayer::ScriptError& error) {
        PrintMessage(error.what());
        return ExitUsage;
    } catch (const UsageError& error) {
        PrintMessage(error.what());
        return ExitUsage;
    } catch (const OutputError& error) {
        PrintMessage(error.what());
        return ExitOutput;
    }
}
