#include "program/options.h"

#include <iomanip>
#include <memory>
#include <sstream>

#include "bdmvnavigator/version.h"
#include "session/commands.h"

namespace deskplayer
{

namespace
{

std::string CommandTable()
{
    std::ostringstream table;
    for (const CommandSyntax& syntax : CommandSyntaxes()) {
        table << (table.tellp() > 0 ? "\n" : "") << std::left << std::setw(38) << syntax.pattern
              << syntax.help;
    }
    return table.str();
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

/** Refuses an empty value, which is what a shell makes of an unset variable. */
CLI::Validator NotEmpty(const std::string& expected)
{
    return {[expected](const std::string& value) {
                return value.empty() ? "empty value; expected " + expected : std::string();
            },
            ""};
}

} // namespace

void AddOptions(CLI::App& app, Options& options)
{
    app.formatter(std::make_shared<HelpFormatter>());
    app.set_version_flag("--version", "bdmv-deskplayer " BDMVNAVIGATOR_VERSION_TEXT,
                         "Print the version and exit");
    app.add_flag_callback(
        "--commands",
        [] {
            // Like the version, a text that replaces the action.
            throw CLI::CallForVersion(CommandTable(), CLI::ExitCodes::Success);
        },
        "Print the commands of sessions and exit");
    auto* const disc =
        app.add_option("DISC", options.disc, "A BDMV folder or its parent")->type_name("");

    auto* const playList =
        app.add_option("--playlist", options.playList, "Play list to play; the longest by default")
            ->check(CLI::Range(0, 99999).description(""))
            ->type_name("N");
    auto* const list =
        app.add_flag("--list", options.list, "Print the titles and a table of the play lists");
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
    auto* const session = app.add_option("--session", options.session,
                                         "Session file to run; by default, play from start to end")
                              ->check(NotEmpty("the name of a file"))
                              ->type_name("FILE");
    auto* const strict = app.add_flag("--strict", options.strict,
                                      "Exit with status 4 if a command of the session was refused")
                             ->needs(session);
    auto* const realTime = app.add_flag("--realtime", options.realTime,
                                        "Play or replay in real time instead of at once");
    auto* const remote =
        app.add_flag("--remote", options.remote, "Play in real time, controlled by single keys")
            ->excludes(session);
    auto* const replay =
        app.add_option("--replay", options.replay,
                       "Recording to replay instead of a disc: JSON lines, - for standard input")
            ->check(NotEmpty("the name of a file"))
            ->type_name("FILE");
    auto* const fill = app.add_flag("--fill", options.fill,
                                    "Replace arguments that the recording lacks by neutral values")
                           ->needs(replay);
    app.add_option("--format", options.format,
                   "Output format: text, json (one object per line), trace (for trace viewers) or "
                   "html (a page for a browser)")
        ->type_name("FORMAT");
    auto* const output =
        app.add_option("--output", options.output, "File to write; standard output by default")
            ->check(NotEmpty("the name of a file"))
            ->type_name("FILE");
    auto* const compare =
        app.add_option(
               "--compare", options.compare,
               "Recording to show beside the callbacks, with --format html: JSON lines, - for "
               "standard input")
            ->check(NotEmpty("the name of a file"))
            ->type_name("FILE");
    app.add_option(
           "--page", options.page,
           "Page that --format html fills in; by default the one installed with the program")
        ->check(NotEmpty("the name of a file"))
        ->type_name("FILE");
    auto* const listen =
        app.add_option(
               "--listen", options.listen,
               "Write only callbacks of these interfaces: control, settings, button, interactive")
            ->check(NotEmpty("names of listener interfaces"))
            ->type_name("NAME,...");
    auto* const only = app.add_option("--only", options.only,
                                      "Write only these callbacks, such as PlayItem,AudioInfo")
                           ->check(NotEmpty("names of callbacks"))
                           ->type_name("NAME,...");
    auto* const log =
        app.add_option("--log", options.log,
                       "Log lines to write to standard error, such as BdmvNavigator=Event for "
                       "those of events")
            ->type_name("TEXT");
    auto* const fieldLog =
        app.add_option("--field-log", options.fieldLogs,
                       "Instead of a disc, log files to read back into callbacks, the oldest "
                       "first; - is standard input")
            ->check(NotEmpty("the name of a file"))
            ->type_name("FILE ...");
    auto* const logPrefix =
        app.add_option("--log-prefix", options.logPrefix,
                       "Pattern of the log lines, such as "
                       "\"[{time}] {component} {level}: {text}\"; without it, known forms are "
                       "recognised")
            ->needs(fieldLog)
            ->type_name("PATTERN");
    auto* const outputFolder =
        app.add_option("--output-folder", options.outputFolder,
                       "Take each log file as a log of its own, and write a file for each to this "
                       "folder")
            ->check(NotEmpty("the name of a folder"))
            ->needs(fieldLog)
            ->excludes(output)
            ->excludes(compare)
            ->type_name("FOLDER");
    app.add_option("--jobs", options.jobs,
                   "Log files to read at the same time; by default, one per processor")
        ->check(CLI::Range(1U, MostJobs).description(""))
        ->needs(outputFolder)
        ->type_name("N");
    auto* const tag =
        app.add_option("--tag", options.tags,
                       "A tag for every JSON object, such as device=7; may be given several times")
            ->allow_extra_args(false)
            ->type_name("NAME=VALUE");
    auto* const summary =
        app.add_flag("--summary", options.summary,
                     "Write a summary of the log or recording instead of its callbacks");
    for (CLI::Option* const ofCallbacks : {listen, only, realTime, fill, outputFolder, tag}) {
        summary->excludes(ofCallbacks);
    }
    for (CLI::Option* const playing : {playList, session, strict, realTime, remote, listen, only,
                                       log, fieldLog, logPrefix, tag}) {
        playing->excludes(list)->excludes(describe)->excludes(check);
    }
    for (CLI::Option* const ofDisc :
         {disc, playList, list, describe, check, session, strict, remote, log}) {
        ofDisc->excludes(fieldLog)->excludes(replay);
    }
    realTime->excludes(fieldLog);
    fieldLog->excludes(replay);
    app.final_callback([disc, fieldLog, replay, summary] {
        const bool isRecorded = fieldLog->count() != 0 || replay->count() != 0;
        if (summary->count() != 0 && !isRecorded) {
            throw CLI::RequiresError("--summary", "--field-log or --replay");
        }
        if (disc->count() == 0 && !isRecorded) {
            throw CLI::RequiredError("DISC");
        }
    });

    app.footer(
        "A session file has one command per line, which may begin with a time:\n"
        "\"at 00:01:30.500 chapter next\", \"after 2s pause\". --commands lists the commands.\n\n"
        "Examples:\n"
        "  bdmv-deskplayer --list disc\n"
        "  bdmv-deskplayer --check disc\n"
        "  bdmv-deskplayer disc --session evening.session\n"
        "  bdmv-deskplayer disc --only PlayItem,ChapterNumber --format json\n"
        "  bdmv-deskplayer disc --remote\n"
        "  bdmv-deskplayer --field-log player.1.log player.log --format json\n"
        "  bdmv-deskplayer --field-log logs/*.log --format json --output-folder recordings \\\n"
        "      --tag firmware=2.1\n"
        "  bdmv-deskplayer --field-log player.log --summary\n"
        "  bdmv-deskplayer --replay evening.jsonl --format trace\n"
        "  bdmv-deskplayer --replay new.jsonl --compare old.jsonl --format html\n\n"
        "Exit status: 0 success, 1 the output could not be written, 2 incorrect usage, or a\n"
        "session, recording, log or page that cannot be read, 3 the disc cannot be read or has\n"
        "faults, 4 the session failed: an expectation was not met or, with --strict, a command\n"
        "was refused.");
}

} // namespace deskplayer
