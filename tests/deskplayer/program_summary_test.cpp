#include <gtest/gtest.h>

#include <cstdint>
#include <cstdio>
#include <iterator>
#include <nlohmann/json.hpp>
#include <regex>
#include <sstream>
#include <string>
#include <vector>

#include "programtest.h"
#include "recount.h"

namespace
{

using nlohmann::json;

const std::string ExampleLogs = BDMVNAVIGATOR_SAMPLE_LOGS;
const std::string Document = BDMVNAVIGATOR_DOCS "/outputs.md";

std::string Word(const json& value)
{
    return value.is_string() ? value.get<std::string>() : value.dump();
}

/** The words of a summary as text, according to the same summary as JSON. */
std::vector<std::string> WordsOf(const json& summary)
{
    std::ostringstream text;
    const auto time = [](const json& value) { return Word(value.at("time")) + " "; };
    const auto none = [&text](const json& rows, const char* titles) {
        text << (rows.empty() ? "none" : titles) << ' ';
    };
    text << "Recording ";
    if (summary.contains("wallClock")) {
        text << "wall clock " << Word(summary["wallClock"]) << ' ';
    }
    text << "begin " << time(summary["begin"]) << "end " << time(summary["end"]) << "duration "
         << time(summary["duration"]) << "callbacks " << summary["callbacks"] << ' ';
    if (summary.contains("foreignLines")) {
        text << "foreign lines " << summary["foreignLines"] << " damaged lines "
             << summary["damagedLines"] << ' ';
    }
    text << "Gaps ";
    none(summary["gaps"], "cause count lost first last");
    for (const json& gap : summary["gaps"]) {
        text << Word(gap["cause"]) << ' ' << gap["count"] << ' '
             << (gap.contains("lost") ? gap["lost"].dump() : "-") << ' ' << time(gap["first"])
             << time(gap["last"]);
    }
    const json& last = summary["lastCallback"];
    text << "Last callback " << time(last["at"]) << Word(last["callback"]) << ' ';
    for (const auto& argument : last["arguments"].items()) {
        text << argument.key() << '=' << Word(argument.value()) << ' ';
    }
    if (summary.contains("waits")) {
        const json& waits = summary["waits"];
        text << "Longest waits within events, of " << waits["measured"] << ' ';
        none(waits["longest"], "wait at after before");
        for (const json& wait : waits["longest"]) {
            text << time(wait["wait"]) << time(wait["at"]) << Word(wait["after"]) << ' '
                 << Word(wait["before"]) << ' ';
        }
    }
    text << "States of playback state total share count ";
    for (const json& state : summary["states"]) {
        char share[32];
        std::snprintf(share, sizeof share, "%.1f %% ",
                      100 * state["total"]["ticks"].get<double>() /
                          summary["duration"]["ticks"].get<double>());
        text << Word(state["state"]) << ' ' << time(state["total"]) << share << state["count"]
             << ' ';
    }
    text << "Forbidden user operations ";
    none(summary["forbiddenOperations"], "operation total count at the end");
    for (const json& operation : summary["forbiddenOperations"]) {
        text << Word(operation["operation"]) << ' ' << time(operation["total"])
             << operation["count"] << ' '
             << (operation["forbiddenAtEnd"].is_null()     ? "unknown "
                 : operation["forbiddenAtEnd"].get<bool>() ? "forbidden "
                                                           : "permitted ");
    }
    text << "Callbacks callback count first last ";
    for (const json& kind : summary["callbackKinds"]) {
        text << Word(kind["callback"]) << ' ' << kind["count"] << ' ' << time(kind["first"])
             << time(kind["last"]);
    }
    std::istringstream stream(text.str());
    return {std::istream_iterator<std::string>(stream), {}};
}

std::vector<std::string> WordsIn(const std::string& text)
{
    std::istringstream stream(text);
    return {std::istream_iterator<std::string>(stream), {}};
}

std::vector<std::string> operator+(std::vector<std::string> left,
                                   const std::vector<std::string>& right)
{
    left.insert(left.end(), right.begin(), right.end());
    return left;
}

/** @param input the option for it and its file */
json SummaryOf(const std::vector<std::string>& input)
{
    const ProgramResult result =
        RunDeskPlayer(input + std::vector<std::string>{"--summary", "--format", "json"});
    EXPECT_EQ(result.status, 0) << result.errors;
    return json::parse(result.output);
}

using Summary = ScratchFolder;

class SummaryOfALog : public ScratchFolder, public testing::WithParamInterface<std::string>
{
protected:
    /** A log: the file itself, or that of a session. */
    std::string Log() const
    {
        if (fs::path(GetParam()).extension() == ".log") {
            return GetParam();
        }
        const ProgramResult session = RunDeskPlayer(
            {SampleDisc, "--session", GetParam(), "--log", "BdmvNavigator=Event+hifreq|Warning"});
        return WriteFile("log", session.errors);
    }
};

TEST_P(SummaryOfALog, AgreesWithItsCallbacks)
{
    const std::vector<std::string> input = {"--field-log", Log()};
    const ProgramResult lines = RunDeskPlayer(input + std::vector<std::string>{"--format", "json"});

    ExpectAgreement(SummaryOf(input), ParseLines(lines.output));
}

TEST_P(SummaryOfALog, SaysTheSameInTextAndJson)
{
    const std::vector<std::string> input = {"--field-log", Log()};
    const ProgramResult text = RunDeskPlayer(input + std::vector<std::string>{"--summary"});

    EXPECT_EQ(text.errors, "");
    EXPECT_EQ(WordsIn(text.output), WordsOf(SummaryOf(input)));
}

TEST_P(SummaryOfALog, EqualsThatOfItsRecordingExceptForWhatLinesShow)
{
    const std::vector<std::string> input = {"--field-log", Log()};
    const std::string recording = WriteFile(
        "recording", RunDeskPlayer(input + std::vector<std::string>{"--format", "json"}).output);
    json expected = SummaryOf(input);
    for (const char* const member : {"foreignLines", "damagedLines", "waits"}) {
        EXPECT_EQ(expected.erase(member), 1U) << member;
    }

    const json replayed = SummaryOf({"--replay", recording});
    EXPECT_EQ(replayed, expected);
    const ProgramResult text = RunDeskPlayer({"--replay", recording, "--summary"});
    EXPECT_EQ(WordsIn(text.output), WordsOf(replayed));
}

INSTANTIATE_TEST_SUITE_P(OfTheExamples, SummaryOfALog,
                         testing::Values(ExampleLogs + "/field.log", ExampleLogs + "/session.log",
                                         AllEvents, Evening));

/** A log from which no lines were taken. */
class SummaryOfASession : public SummaryOfALog
{
};

TEST_P(SummaryOfASession, MeasuresAWaitForEachLineThatContinuesAnEvent)
{
    const std::string log = Log();
    const std::regex continuing(
        ".* BdmvNavigator Event: (Send (un)?available |For (normal|speed) play |Sending \\(\\().*");
    std::uint64_t waits = 0;
    for (const std::string& line : LinesOf(ReadContents(log))) {
        waits += std::regex_match(line, continuing) ? 1 : 0;
    }

    EXPECT_GT(waits, 0U);
    EXPECT_EQ(SummaryOf({"--field-log", log}).at("waits").at("measured"), waits);
}

INSTANTIATE_TEST_SUITE_P(OfTheExamples, SummaryOfASession, testing::Values(AllEvents, Evening));

/** The block of code after the one of the documentation that has this command. */
std::string BlockAfter(const std::string& command)
{
    const std::string document = ReadContents(Document);
    const std::size_t place = document.find("\nbdmv-deskplayer " + command + "\n```\n");
    if (place == std::string::npos) {
        return "not documented: " + command;
    }
    const std::size_t fence = document.find("\n```", document.find("\n```\n", place) + 1);
    const std::size_t begin = document.find('\n', fence + 1) + 1;
    return document.substr(begin, document.find("```\n", begin) - begin);
}

TEST_F(Summary, OfTheSampleLogIsThatOfTheDocumentation)
{
    const std::vector<std::string> input = {"--field-log", ExampleLogs + "/field.log", "--summary"};

    EXPECT_EQ(RunDeskPlayer(input).output,
              BlockAfter("--field-log examples/logs/field.log --summary"));
    EXPECT_EQ(
        json::parse(RunDeskPlayer(input + std::vector<std::string>{"--format", "json"}).output),
        json::parse(BlockAfter("--field-log examples/logs/field.log --summary --format json")));
}

TEST_F(Summary, SaysWhichCallbackAWaitFollowed)
{
    const std::string begin = " BdmvNavigator Event: ";
    const json summary = SummaryOf(
        {"--field-log",
         WriteFile("log", "00:00:10.000000" + begin + "Sending SecondaryAudioInfo - audioNr: 1\n" +
                              "00:00:10.250000" + begin +
                              "Sending ((SecondaryAudioDisplay)) - audioNr 1, numOfAudios 1, "
                              "shown: TRUE\n")});

    EXPECT_EQ(summary.at("waits"),
              json::parse(R"({"measured":1,"longest":[{"wait":{"ticks":11250,"time":"00:00:00.250"},
                  "at":{"ticks":450000,"time":"00:00:10.000"},
                  "after":"SecondaryAudioInfo","before":"SecondaryAudioDisplay"}]})"));
}

TEST_F(Summary, OfARecordingThatCannotBeReadIsOfItsBeginning)
{
    const ProgramResult result = RunDeskPlayer(
        {"--replay",
         WriteFile("recording", "{\"ticks\":1,\"callback\":\"Paused\",\"arguments\":{}}\n?\n"),
         "--summary"});

    EXPECT_EQ(result.status, 2);
    EXPECT_NE(result.output.find("callbacks  1\n"), std::string::npos) << result.output;
    EXPECT_NE(result.errors.find(":2:"), std::string::npos) << result.errors;
}

TEST_F(Summary, NeedsALogOrARecording)
{
    const std::string message = "--summary requires --field-log or --replay; see --help";
    ExpectUsageError({"--summary"}, message);
    ExpectUsageError({SampleDisc, "--summary"}, message);
}

TEST_F(Summary, ExcludesWhatChangesTheCallbacks)
{
    const std::string log = WriteFile("log", "");
    const std::string recording = WriteFile("recording", "");
    const std::vector<std::vector<std::string>> commandLines = {
        {"--field-log", log, "--listen", "control"},
        {"--field-log", log, "--only", "Paused"},
        {"--field-log", log, "--format", "trace"},
        {"--replay", recording, "--realtime"},
        {"--replay", recording, "--fill"},
        {"--replay", recording, "--format", "trace"},
        {"--list", SampleDisc},
        {"--check", SampleDisc}};
    for (const std::vector<std::string>& arguments : commandLines) {
        const ProgramResult result =
            RunDeskPlayer(arguments + std::vector<std::string>{"--summary"});
        EXPECT_EQ(result.status, 2) << arguments.back();
        EXPECT_EQ(result.output, "");
        EXPECT_NE(result.errors.find("--summary"), std::string::npos) << result.errors;
    }
}

} // namespace
