// --format html: the page with the recordings in it. Its own tests are in page/.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "programtest.h"
#include "sanitized.h"

namespace
{

const fs::path SampleLogFolder = BDMVNAVIGATOR_SAMPLE_LOGS;

const std::string PageHead = "<!DOCTYPE html>\n<p>no <!--recordings--> here</p>\n";
const std::string PageTail = "\n</html>\n";

const std::string PausedLine =
    R"({"ticks":45000,"time":"00:00:01.000","interface":"control","callback":"Paused","arguments":{}})"
    "\n";
const std::string StoppedLine =
    R"({"ticks":90000,"time":"00:00:02.000","interface":"control","callback":"Stopped","arguments":{}})"
    "\n";

const std::string GapLine = R"({"ticks":90000,"gap":{"cause":"</script>"}})"
                            "\n";
const std::string GapLineInPage = R"({"ticks":90000,"gap":{"cause":"\u003c/script>"}})"
                                  "\n";

std::string ElementOf(const std::string& name, const std::string& lines)
{
    return "<script type=\"application/x-ndjson\" data-name=\"" + name + "\">\n" + lines +
           "</script>";
}

std::vector<std::string> With(std::vector<std::string> arguments,
                              const std::vector<std::string>& further)
{
    arguments.insert(arguments.end(), further.begin(), further.end());
    return arguments;
}

class DeskPlayerPage : public ScratchFolder
{
protected:
    ProgramResult RunWithPage(const std::vector<std::string>& arguments) const
    {
        return RunDeskPlayer(With(arguments, {"--format", "html", "--page", page}));
    }

    /** Expects a page with these elements. */
    void ExpectPage(const std::vector<std::string>& arguments, const std::string& elements) const
    {
        const ProgramResult result = RunWithPage(arguments);
        EXPECT_EQ(result.status, 0) << result.errors;
        EXPECT_TRUE(result.output == PageHead + elements + PageTail)
            << result.output.substr(0, 2000);
    }

    /** Expects a message, and that neither a new nor an existing output is written. */
    void ExpectRefused(const std::vector<std::string>& arguments, const std::string& message) const
    {
        ExpectUsageError(arguments, message);
        const std::string existing = WriteFile("existing", "precious");
        const std::string created = folder / "created";
        for (const std::string& output : {existing, created}) {
            EXPECT_EQ(RunDeskPlayer(With(arguments, {"--output", output})).status, 2);
        }
        EXPECT_EQ(ReadContents(existing), "precious");
        EXPECT_FALSE(fs::exists(created));
    }

    const std::string page = WriteFile("page.html", PageHead + "<!--recordings-->" + PageTail);
};

std::string JsonLinesOf(const std::vector<std::string>& arguments)
{
    const std::string json = RunDeskPlayer(With(arguments, {"--format", "json"})).output;
    EXPECT_NE(json, "");
    return json;
}

TEST_F(DeskPlayerPage, ContainsTheJsonOfASession)
{
    for (const std::string& session : {AllEvents, Evening}) {
        const std::vector<std::string> arguments = {SampleDisc, "--session", session};
        ExpectPage(arguments, ElementOf(session, JsonLinesOf(arguments)));
    }
}

TEST_F(DeskPlayerPage, ContainsTheJsonOfADiscFromStartToEnd)
{
    ExpectPage({SampleDisc}, ElementOf(SampleDisc, JsonLinesOf({SampleDisc})));
}

TEST_F(DeskPlayerPage, OfAReplayContainsWhatThatOfItsSessionDoes)
{
    const std::string json = JsonLinesOf({SampleDisc, "--session", Evening});
    const std::string recording = WriteFile("recording", json);

    ExpectPage({"--replay", recording}, ElementOf(recording, json));
}

TEST_F(DeskPlayerPage, ContainsTheJsonOfFieldLogs)
{
    int logs = 0;
    for (const fs::directory_entry& log : fs::directory_iterator(SampleLogFolder)) {
        const std::vector<std::string> arguments = {"--field-log", log.path()};
        ExpectPage(arguments, ElementOf(log.path(), JsonLinesOf(arguments)));
        ++logs;
    }
    EXPECT_GT(logs, 0);
}

TEST_F(DeskPlayerPage, NamesTheFirstOfSeveralLogs)
{
    const std::string log = SampleLogFolder / "field.log";
    const std::vector<std::string> arguments = {"--field-log", log, log, log};

    ExpectPage(arguments, ElementOf(log + " and 2 more", JsonLinesOf(arguments)));
}

TEST_F(DeskPlayerPage, GoesToTheNamedFile)
{
    const std::string file = folder / "evening.html";

    const ProgramResult result = RunWithPage({SampleDisc, "--output", file});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "");
    EXPECT_EQ(ReadContents(file), RunWithPage({SampleDisc}).output);
}

TEST_F(DeskPlayerPage, ContainsTheSelectedCallbacksOfBothRecordings)
{
    const std::string first = WriteFile("first", PausedLine + StoppedLine);
    const std::string second = WriteFile("second", StoppedLine + PausedLine + StoppedLine);

    ExpectPage({"--replay", first, "--compare", second, "--only", "Stopped"},
               ElementOf(first, StoppedLine) + ElementOf(second, StoppedLine + StoppedLine));
    ExpectPage({"--replay", first, "--compare", second, "--listen", "button"},
               ElementOf(first, "") + ElementOf(second, ""));
}

TEST_F(DeskPlayerPage, KeepsTextOfTheRecordingFromEndingTheElement)
{
    const std::string recording = WriteFile("recording", GapLine);
    const std::string name = WriteFile("<\"&>", GapLine);

    ExpectPage({"--replay", recording, "--compare", name},
               ElementOf(recording, GapLineInPage) +
                   ElementOf(folder.string() + "/&lt;&quot;&amp;&gt;", GapLineInPage));
}

TEST_F(DeskPlayerPage, ComparesASessionWithARecording)
{
    const std::string other = WriteFile("other", PausedLine);
    const std::vector<std::string> arguments = {SampleDisc, "--session", Evening};

    ExpectPage(With(arguments, {"--compare", other}),
               ElementOf(Evening, JsonLinesOf(arguments)) + ElementOf(other, PausedLine));
}

TEST_F(DeskPlayerPage, ComparesAFieldLogWithARecording)
{
    const std::string other = WriteFile("other", PausedLine);
    const std::vector<std::string> arguments = {"--field-log", SampleLogFolder / "field.log"};

    ExpectPage(With(arguments, {"--compare", other}),
               ElementOf(arguments[1], JsonLinesOf(arguments)) + ElementOf(other, PausedLine));
}

TEST_F(DeskPlayerPage, ContainsTheOtherRecordingAsItWouldBeWrittenAgain)
{
    const std::string recording = WriteFile("recording", "");
    const std::string other = WriteFile("other", " {\"callback\": \"Paused\", \"ticks\": 45000, "
                                                 "\"unknown\": 1, \"arguments\": {}}");

    ExpectPage({"--replay", recording, "--compare", other},
               ElementOf(recording, "") + ElementOf(other, PausedLine));
}

TEST_F(DeskPlayerPage, ContainsAllOfALongOtherRecording)
{
    std::string lines;
    for (int line = 0; line < 2000; ++line) {
        lines += PausedLine;
    }
    const std::string other = WriteFile("other", lines);

    ExpectPage({"--replay", WriteFile("recording", ""), "--compare", other},
               ElementOf(folder / "recording", "") + ElementOf(other, lines));
}

TEST_F(DeskPlayerPage, ContainsBothRecordingsFilledOnDemand)
{
    const auto line = [](const std::string& arguments) {
        return R"({"ticks":45000,"time":"00:00:01.000","interface":"control",)"
               R"("callback":"TriggerSet","arguments":{)" +
               arguments + "}}\n";
    };
    const std::string filled = line(R"("type":"TriggerTypeNone","result":false)");
    const std::string recording = WriteFile("recording", line(""));
    const std::vector<std::string> arguments = {"--replay", recording, "--compare", recording};

    ExpectPage(arguments, ElementOf(recording, line("")) + ElementOf(recording, line("")));
    ExpectPage(With(arguments, {"--fill"}),
               ElementOf(recording, filled) + ElementOf(recording, filled));
}

TEST_F(DeskPlayerPage, ReadsTheOtherRecordingFromStandardInput)
{
    const std::string recording = WriteFile("recording", PausedLine);

    const ProgramResult result = RunDeskPlayerWithInput(
        {"--replay", recording, "--compare", "-", "--format", "html", "--page", page},
        WriteFile("input", StoppedLine));

    EXPECT_EQ(result.output, PageHead + ElementOf(recording, PausedLine) +
                                 ElementOf("standard input", StoppedLine) + PageTail);
}

TEST_F(DeskPlayerPage, UsesStandardInputOnce)
{
    const std::string message = "--compare: standard input is already in use";
    const std::vector<std::string> further = {"--compare", "-", "--format", "html", "--page", page};
    ExpectRefused(With({"--replay", "-"}, further), message);
    ExpectRefused(With({"--field-log", page, "-"}, further), message);
    ExpectRefused(With({SampleDisc, "--remote"}, further), message);
}

TEST_F(DeskPlayerPage, IsNotWrittenIfTheOtherRecordingIsFaulty)
{
    const std::string other = WriteFile("other", PausedLine + "{\"ticks\":1}\n");
    const std::string missing = folder / "missing";
    const auto comparing = [this](const std::string& file) -> std::vector<std::string> {
        return {SampleDisc, "--format", "html", "--page", page, "--compare", file};
    };

    ExpectRefused(comparing(other), other + ":2:1: missing member 'callback'");
    ExpectRefused(comparing(missing), missing + ": cannot open recording");
    ExpectRefused(comparing(folder), folder.string() + ": cannot read recording");
}

TEST_F(DeskPlayerPage, OfAMalformedReplayHasTheLinesBeforeAndIsComplete)
{
    const std::string recording = WriteFile("recording", PausedLine + "x");
    const std::string other = WriteFile("other", StoppedLine);

    const ProgramResult result = RunWithPage({"--replay", recording, "--compare", other});

    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.output, PageHead + ElementOf(recording, PausedLine) +
                                 ElementOf(other, StoppedLine) + PageTail);
}

TEST_F(DeskPlayerPage, OfALogThatCannotBeReadIsComplete)
{
    const ProgramResult result = RunWithPage({"--field-log", folder});

    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.output, PageHead + ElementOf(folder, "") + PageTail);
}

TEST_F(DeskPlayerPage, ReportsThatItCouldNotBeWritten)
{
    EXPECT_EQ(RunWithPage({SampleDisc, "--output", "/dev/full"}).status, 1);
}

TEST_F(DeskPlayerPage, HasOneLineForTheRecordings)
{
    const struct {
        std::string text;
        int found;
    } pages[] = {{"", 0},
                 {PageHead + PageTail, 0},
                 {" <!--recordings-->\n", 0},
                 {"<!--recordings--> \n", 0},
                 {"<!--recordings-->\n<!--recordings-->\n", 2}};
    for (const auto& wrong : pages) {
        WriteFile("page.html", wrong.text);
        ExpectRefused({SampleDisc, "--format", "html", "--page", page},
                      page +
                          ": not a page for recordings; expected one line <!--recordings-->, "
                          "found " +
                          std::to_string(wrong.found));
    }
    WriteFile("page.html", "<!--recordings-->");
    EXPECT_EQ(RunWithPage({"--replay", WriteFile("recording", PausedLine)}).output,
              ElementOf(folder / "recording", PausedLine));
}

TEST_F(DeskPlayerPage, CanBeReadWhole)
{
    const std::string missing = folder / "missing";
    const auto filling = [](const std::string& file) -> std::vector<std::string> {
        return {SampleDisc, "--format", "html", "--page", file};
    };
    ExpectRefused(filling(missing), missing + ": cannot open page");
    ExpectRefused(filling(folder), folder.string() + ": cannot read page");

    ResizeSparsely(page, (std::uintmax_t{16} << 20) + 1);
    ExpectRefused(filling(page), page + ": page too large; expected at most 16777216 bytes");
}

TEST_F(DeskPlayerPage, DoesNotOverwriteItsInputs)
{
    const std::string recording = WriteFile("recording", PausedLine);
    const std::string other = WriteFile("other", PausedLine);
    const std::vector<std::string> arguments = {
        "--replay", recording, "--compare", other, "--format", "html", "--page", page, "--output"};

    ExpectUsageError(With(arguments, {recording}), "--output: is the recording");
    ExpectUsageError(With(arguments, {other}), "--output: is the recording to compare with");
    ExpectUsageError(With(arguments, {page}), "--output: is the page");

    EXPECT_EQ(ReadContents(recording), PausedLine);
    EXPECT_EQ(ReadContents(other), PausedLine);
    EXPECT_EQ(ReadContents(page), PageHead + "<!--recordings-->" + PageTail);
}

TEST_F(DeskPlayerPage, IsRequiredToCompare)
{
    const std::string other = WriteFile("other", PausedLine);
    for (const std::string format : {"text", "json", "trace"}) {
        ExpectRefused({SampleDisc, "--format", format, "--compare", other},
                      "--compare requires --format html");
        ExpectRefused({SampleDisc, "--format", format, "--page", page},
                      "--page requires --format html");
    }
}

TEST_F(DeskPlayerPage, OfLongRecordingsIsWrittenInConstantMemory)
{
    if (bdmvtest::Sanitized) {
        GTEST_SKIP() << "sanitizers need more memory";
    }
    const std::string gap = R"({"ticks":0,"gap":{"cause":")" + std::string(1000000, 'a') + "\"}}\n";
    std::string lines;
    for (int line = 0; line < 12; ++line) {
        lines += gap;
    }
    const std::string recording = WriteFile("recording", lines);

    const std::string output = folder / "output";

    const ProgramResult result =
        RunDeskPlayerWithLimitedMemory({"--replay", recording, "--compare", recording, "--format",
                                        "html", "--page", page, "--output", output},
                                       24 * 1024);

    EXPECT_EQ(result.status, 0) << result.errors;
    EXPECT_TRUE(ReadContents(output) ==
                PageHead + ElementOf(recording, lines) + ElementOf(recording, lines) + PageTail);
}

} // namespace
