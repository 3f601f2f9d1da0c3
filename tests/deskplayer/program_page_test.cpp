// --format html: the page with the recordings in it. Its own tests are in page/.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "programtest.h"
#include "sanitized.h"

namespace
{

const fs::path SampleLogs = BDMVNAVIGATOR_SAMPLE_LOGS;

const std::string Head = "<!DOCTYPE html>\n<p>no <!--recordings--> here</p>\n";
const std::string Tail = "\n</html>\n";

const std::string Paused =
    R"({"ticks":45000,"time":"00:00:01.000","interface":"control","callback":"Paused","arguments":{}})"
    "\n";
const std::string Stopped =
    R"({"ticks":90000,"time":"00:00:02.000","interface":"control","callback":"Stopped","arguments":{}})"
    "\n";

const std::string Gap = R"({"ticks":90000,"gap":{"cause":"</script>"}})"
                        "\n";
const std::string GapInPage = R"({"ticks":90000,"gap":{"cause":"\u003c/script>"}})"
                              "\n";

std::string Element(const std::string& name, const std::string& lines)
{
    return "<script type=\"application/x-ndjson\" data-name=\"" + name + "\">\n" + lines +
           "</script>";
}

std::vector<std::string> operator+(std::vector<std::string> left,
                                   const std::vector<std::string>& right)
{
    left.insert(left.end(), right.begin(), right.end());
    return left;
}

class DeskPlayerPage : public ScratchFolder
{
protected:
    ProgramResult RunWithPage(const std::vector<std::string>& arguments) const
    {
        return RunDeskPlayer(arguments +
                             std::vector<std::string>{"--format", "html", "--page", page});
    }

    /** Expects a page with these elements. */
    void ExpectPage(const std::vector<std::string>& arguments, const std::string& elements) const
    {
        const ProgramResult result = RunWithPage(arguments);
        EXPECT_EQ(result.status, 0) << result.errors;
        EXPECT_TRUE(result.output == Head + elements + Tail) << result.output.substr(0, 2000);
    }

    /** Expects a message, and that neither a new nor an existing output is written. */
    void ExpectRefused(const std::vector<std::string>& arguments, const std::string& message) const
    {
        ExpectUsageError(arguments, message);
        const std::string existing = WriteFile("existing", "precious");
        const std::string created = folder / "created";
        for (const std::string& output : {existing, created}) {
            EXPECT_EQ(
                RunDeskPlayer(arguments + std::vector<std::string>{"--output", output}).status, 2);
        }
        EXPECT_EQ(ReadContents(existing), "precious");
        EXPECT_FALSE(fs::exists(created));
    }

    const std::string page = WriteFile("page.html", Head + "<!--recordings-->" + Tail);
};

std::string JsonOf(const std::vector<std::string>& arguments)
{
    const std::string json =
        RunDeskPlayer(arguments + std::vector<std::string>{"--format", "json"}).output;
    EXPECT_NE(json, "");
    return json;
}

TEST_F(DeskPlayerPage, ContainsTheJsonOfASession)
{
    for (const std::string& session : {AllEvents, Evening}) {
        const std::vector<std::string> arguments = {SampleDisc, "--session", session};
        ExpectPage(arguments, Element(session, JsonOf(arguments)));
    }
}

TEST_F(DeskPlayerPage, ContainsTheJsonOfADiscFromStartToEnd)
{
    ExpectPage({SampleDisc}, Element(SampleDisc, JsonOf({SampleDisc})));
}

TEST_F(DeskPlayerPage, OfAReplayContainsWhatThatOfItsSessionDoes)
{
    const std::string json = JsonOf({SampleDisc, "--session", Evening});
    const std::string recording = WriteFile("recording", json);

    ExpectPage({"--replay", recording}, Element(recording, json));
}

TEST_F(DeskPlayerPage, ContainsTheJsonOfFieldLogs)
{
    int logs = 0;
    for (const fs::directory_entry& log : fs::directory_iterator(SampleLogs)) {
        const std::vector<std::string> arguments = {"--field-log", log.path()};
        ExpectPage(arguments, Element(log.path(), JsonOf(arguments)));
        ++logs;
    }
    EXPECT_GT(logs, 0);
}

TEST_F(DeskPlayerPage, NamesTheFirstOfSeveralLogs)
{
    const std::string log = SampleLogs / "field.log";
    const std::vector<std::string> arguments = {"--field-log", log, log, log};

    ExpectPage(arguments, Element(log + " and 2 more", JsonOf(arguments)));
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
    const std::string first = WriteFile("first", Paused + Stopped);
    const std::string second = WriteFile("second", Stopped + Paused + Stopped);

    ExpectPage({"--replay", first, "--compare", second, "--only", "Stopped"},
               Element(first, Stopped) + Element(second, Stopped + Stopped));
    ExpectPage({"--replay", first, "--compare", second, "--listen", "button"},
               Element(first, "") + Element(second, ""));
}

TEST_F(DeskPlayerPage, KeepsTextOfTheRecordingFromEndingTheElement)
{
    const std::string recording = WriteFile("recording", Gap);
    const std::string name = WriteFile("<\"&>", Gap);

    ExpectPage({"--replay", recording, "--compare", name},
               Element(recording, GapInPage) +
                   Element(folder.string() + "/&lt;&quot;&amp;&gt;", GapInPage));
}

TEST_F(DeskPlayerPage, ComparesASessionWithARecording)
{
    const std::string other = WriteFile("other", Paused);
    const std::vector<std::string> arguments = {SampleDisc, "--session", Evening};

    ExpectPage(arguments + std::vector<std::string>{"--compare", other},
               Element(Evening, JsonOf(arguments)) + Element(other, Paused));
}

TEST_F(DeskPlayerPage, ComparesAFieldLogWithARecording)
{
    const std::string other = WriteFile("other", Paused);
    const std::vector<std::string> arguments = {"--field-log", SampleLogs / "field.log"};

    ExpectPage(arguments + std::vector<std::string>{"--compare", other},
               Element(arguments[1], JsonOf(arguments)) + Element(other, Paused));
}

TEST_F(DeskPlayerPage, ContainsTheOtherRecordingAsItWouldBeWrittenAgain)
{
    const std::string recording = WriteFile("recording", "");
    const std::string other = WriteFile("other", " {\"callback\": \"Paused\", \"ticks\": 45000, "
                                                 "\"unknown\": 1, \"arguments\": {}}");

    ExpectPage({"--replay", recording, "--compare", other},
               Element(recording, "") + Element(other, Paused));
}

TEST_F(DeskPlayerPage, ContainsAllOfALongOtherRecording)
{
    std::string lines;
    for (int line = 0; line < 2000; ++line) {
        lines += Paused;
    }
    const std::string other = WriteFile("other", lines);

    ExpectPage({"--replay", WriteFile("recording", ""), "--compare", other},
               Element(folder / "recording", "") + Element(other, lines));
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

    ExpectPage(arguments, Element(recording, line("")) + Element(recording, line("")));
    ExpectPage(arguments + std::vector<std::string>{"--fill"},
               Element(recording, filled) + Element(recording, filled));
}

TEST_F(DeskPlayerPage, ReadsTheOtherRecordingFromStandardInput)
{
    const std::string recording = WriteFile("recording", Paused);

    const ProgramResult result = RunDeskPlayerWithInput(
        {"--replay", recording, "--compare", "-", "--format", "html", "--page", page},
        WriteFile("input", Stopped));

    EXPECT_EQ(result.output,
              Head + Element(recording, Paused) + Element("standard input", Stopped) + Tail);
}

TEST_F(DeskPlayerPage, UsesStandardInputOnce)
{
    const std::string message = "--compare: standard input is already in use";
    const std::vector<std::string> further = {"--compare", "-", "--format", "html", "--page", page};
    ExpectRefused(std::vector<std::string>{"--replay", "-"} + further, message);
    ExpectRefused(std::vector<std::string>{"--field-log", page, "-"} + further, message);
    ExpectRefused(std::vector<std::string>{SampleDisc, "--remote"} + further, message);
}

TEST_F(DeskPlayerPage, IsNotWrittenIfTheOtherRecordingIsFaulty)
{
    const std::string other = WriteFile("other", Paused + "{\"ticks\":1}\n");
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
    const std::string recording = WriteFile("recording", Paused + "x");
    const std::string other = WriteFile("other", Stopped);

    const ProgramResult result = RunWithPage({"--replay", recording, "--compare", other});

    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.output, Head + Element(recording, Paused) + Element(other, Stopped) + Tail);
}

TEST_F(DeskPlayerPage, OfALogThatCannotBeReadIsComplete)
{
    const ProgramResult result = RunWithPage({"--field-log", folder});

    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.output, Head + Element(folder, "") + Tail);
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
                 {Head + Tail, 0},
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
    EXPECT_EQ(RunWithPage({"--replay", WriteFile("recording", Paused)}).output,
              Element(folder / "recording", Paused));
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
    const std::string recording = WriteFile("recording", Paused);
    const std::string other = WriteFile("other", Paused);
    const std::vector<std::string> arguments = {
        "--replay", recording, "--compare", other, "--format", "html", "--page", page, "--output"};

    ExpectUsageError(arguments + std::vector<std::string>{recording}, "--output: is the recording");
    ExpectUsageError(arguments + std::vector<std::string>{other},
                     "--output: is the recording to compare with");
    ExpectUsageError(arguments + std::vector<std::string>{page}, "--output: is the page");

    EXPECT_EQ(ReadContents(recording), Paused);
    EXPECT_EQ(ReadContents(other), Paused);
    EXPECT_EQ(ReadContents(page), Head + "<!--recordings-->" + Tail);
}

TEST_F(DeskPlayerPage, IsRequiredToCompare)
{
    const std::string other = WriteFile("other", Paused);
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
                Head + Element(recording, lines) + Element(recording, lines) + Tail);
}

} // namespace
