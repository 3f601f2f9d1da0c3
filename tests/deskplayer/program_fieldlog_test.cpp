#include <gtest/gtest.h>

#include <filesystem>
#include <nlohmann/json.hpp>
#include <regex>
#include <string>
#include <vector>

#include "programtest.h"
#include "sanitized.h"

namespace
{

using FieldLog = ScratchFolder;

const std::string Stopped = "2024-05-31 20:15:01.123456 BdmvNavigator Event: Sending Stopped\n";

TEST_F(FieldLog, OfSeveralFilesIsOneLog)
{
    const std::string first = WriteFile("player.1.log", PausedLogLine);
    const std::string second = WriteFile("player.log", Stopped);
    const ProgramResult together = RunDeskPlayer({"--field-log", first, second});

    EXPECT_EQ(together.output, "00:00:00.000  (start) at 2024-05-31 20:15:00.123456\n"
                               "00:00:00.000  Paused\n"
                               "00:00:01.000  Stopped\n");
    EXPECT_EQ(together.errors, "");
    EXPECT_EQ(RunDeskPlayer({"--field-log", first, "--field-log", second}).output, together.output);
}

TEST_F(FieldLog, IsWrittenInEveryFormatAndFiltered)
{
    const std::string log = WriteFile("log", PausedLogLine + Stopped);

    EXPECT_EQ(RunDeskPlayer({"--field-log", log, "--format", "json", "--only", "Paused"}).output,
              "{\"ticks\":0,\"start\":{\"wallClock\":\"2024-05-31 20:15:00.123456\"}}\n"
              "{\"ticks\":0,\"time\":\"00:00:00.000\",\"interface\":\"control\","
              "\"callback\":\"Paused\",\"arguments\":{}}\n");
    EXPECT_EQ(RunDeskPlayer({"--field-log", log, "--listen", "settings"}).output,
              "00:00:00.000  (start) at 2024-05-31 20:15:00.123456\n");
    const auto trace =
        nlohmann::json::parse(RunDeskPlayer({"--field-log", log, "--format", "trace"}).output);
    EXPECT_EQ(trace.back().at("name"), "Stopped");
    EXPECT_EQ(trace.back().at("ts"), 1000000);
}

TEST_F(FieldLog, CountsTheLinesThatItSkips)
{
    const std::string damaged =
        std::regex_replace(PausedLogLine, std::regex("Paused"), "AngleInfo - angleNr: 256");
    const ProgramResult result =
        RunDeskPlayer({"--field-log", WriteFile("log", "one\ntwo\n" + damaged)});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "bdmv-deskplayer: skipped 2 foreign lines and 1 damaged line\n"
                             "bdmv-deskplayer: no line announces a callback\n");
}

TEST_F(FieldLog, FromStandardInputShowsEachCallbackAsItComes)
{
    TerminalProgram program({"--field-log", "-", "--format", "json"});
    program.Press(PausedLogLine);
    EXPECT_TRUE(program.WaitFor("\"callback\":\"Paused\""));
    program.Press(Stopped);
    EXPECT_TRUE(program.WaitFor("\"callback\":\"Stopped\""));
    program.Press("\004");
    EXPECT_EQ(program.Finish().status, 0);
}

TEST_F(FieldLog, MayHaveLinesOfAnotherKind)
{
    const std::string log = WriteFile("log", "[   90.5] player: BdmvNavigator/5: Sending Paused\n");

    EXPECT_EQ(RunDeskPlayer({"--field-log", log, "--log-prefix",
                             "[{time}] {any} {component}/{level}: {text}"})
                  .output,
              "00:00:00.000  Paused\n");
}

TEST_F(FieldLog, OfAnySizeIsReadInConstantMemory)
{
    if (bdmvtest::Sanitized) {
        GTEST_SKIP() << "sanitizers need more memory";
    }
    const std::string log = WriteFile("log", PausedLogLine + "x");
    ResizeSparsely(log, std::uintmax_t{100} << 20);

    const ProgramResult result =
        RunDeskPlayerWithLimitedMemory({"--field-log", log, "--only", "Paused"}, 64 * 1024);

    EXPECT_EQ(result.status, 0) << result.errors;
    EXPECT_EQ(result.output, "00:00:00.000  (start) at 2024-05-31 20:15:00.123456\n"
                             "00:00:00.000  Paused\n"
                             "00:00:00.000  (gap)                       cause=truncated\n");
}

TEST_F(FieldLog, ThatCannotBeReadIsRefused)
{
    ExpectUsageError({"--field-log", (folder / "none").string()},
                     (folder / "none").string() + ": cannot be read: No such file or directory");
    ExpectUsageError({"--field-log", folder.string()},
                     folder.string() + ": cannot be read: Is a directory");
}

TEST_F(FieldLog, IsNotOverwritten)
{
    const std::string log = WriteFile("log", PausedLogLine);

    ExpectUsageError({"--field-log", log, "--output", log}, "--output: " + log + " is being read");
    EXPECT_EQ(ReadContents(log), PausedLogLine);
}

TEST_F(FieldLog, ExcludesADiscAndNeedsAValidPattern)
{
    const std::string log = WriteFile("log", PausedLogLine);

    ExpectUsageError({"--field-log", log, "--log-prefix", "{time}"},
                     "--log-prefix: '{text}' must be at the end");
    EXPECT_EQ(RunDeskPlayer({SampleDisc, "--field-log", log}).status, 2);
    EXPECT_EQ(RunDeskPlayer({"--list", "--field-log", log}).status, 2);
    EXPECT_EQ(RunDeskPlayer({SampleDisc, "--log-prefix", "{time} {text}"}).status, 2);
}

} // namespace
