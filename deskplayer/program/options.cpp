#include "program/options.h"

#include <iomanip>
#include <iostream>
#include <memory>

#include "bdmvnavigator/version.h"
#include "session/commands.h"

namespace deskplayer
{

namespace
{

void PrintCommands()
{
    for (const CommandSyntax& syntax : CommandSyntaxes()) {
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

} // namespace

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
    auto* const check =
        app.add_flag("--check", options.check,
                     "Print what is wrong with the disc: a line for each fault in its metadata")
            ->excludes(list)
            ->excludes(describe);
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
        playing->excludes(list)->excludes(describe)->excludes(check);
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
        "  bdmv-deskplayer --check disc\n"
        "  bdmv-deskplayer disc --session evening.session\n"
        "  bdmv-deskplayer disc --only PlayItem,ChapterNumber --format json\n"
        "  bdmv-deskplayer disc --remote\n\n"
        "Exit status: 0 success, 1 the output could not be written, 2 wrong usage or a session\n"
        "that cannot be read, 3 the disc cannot be read or has faults.");
}

} // namespace deskplayer
