#include <gtest/gtest.h>

#include <chrono>
#include <string>
#include <vector>

#include "disc/testdiscs.h"
#include "programtest.h"

namespace
{

const std::string SampleDump = BDMVNAVIGATOR_SAMPLE_DUMP;
const fs::path SampleLogs = BDMVNAVIGATOR_SAMPLE_LOGS;

const std::string TwoCallbacks = R"({"ticks":9000000000,"time":"55:33:20.000",)"
                                 R"("interface":"control","callback":"Paused","arguments":{}})"
                                 "\n"
                                 R"({"ticks":9000009000,"time":"55:33:20.200",)"
                                 R"("interface":"control","callback":"Stopped","arguments":{}})"
                                 "\n";

const std::string Incomplete = "{\"ticks\":45000,\"callback\":\"TriggerSet\",\"arguments\":{}}\n"
                               "{\"ticks\":45000,\"gap\":{\"lost\":2,\"cause\":\"capacity\"}}\n";

using DeskPlayerReplay = ScratchFolder;

TEST_F(DeskPlayerReplay, EqualsTheSessionInEveryFormat)
{
    for (const std::string& session : {AllEvents, Evening}) {
        const std::string recording =
            WriteFile("recording",
                      RunDeskPlayer({SampleDisc, "--session", session, "--format", "json"}).output);
        for (const std::string format : {"text", "json", "trace"}) {
            const ProgramResult direct =
                RunDeskPlayer({SampleDisc, "--session", session, "--format", format});
            const ProgramResult replayed =
                RunDeskPlayer({"--replay", recording, "--format", format});
            EXPECT_EQ(replayed.status, 0);
            EXPECT_EQ(replayed.errors, "");
            EXPECT_FALSE(direct.output.empty());
            EXPECT_TRUE(replayed.output == direct.output) << session << ' ' << format;
        }
    }
}

/** Expects that the JSON of field logs, when replayed, equals what they give in every format. */
void ExpectReplayOfFieldLog(const std::vector<std::string>& logs, const fs::path& recording)
{
    const auto read = [&logs](const std::vector<std::string>& further) {
        std::vector<std::string> arguments = {"--field-log"};
        arguments.insert(arguments.end(), logs.begin(), logs.end());
        arguments.insert(arguments.end(), further.begin(), further.end());
        return RunDeskPlayer(arguments);
    };
    ASSERT_EQ(read({"--format", "json", "--output", recording.string()}).status, 0);
    for (const std::string format : {"text", "json", "trace"}) {
        const ProgramResult direct = read({"--format", format});
        const ProgramResult replayed =
            RunDeskPlayer({"--replay", recording.string(), "--format", format});
        EXPECT_EQ(replayed.status, 0) << replayed.errors;
        EXPECT_FALSE(direct.output.empty());
        EXPECT_EQ(replayed.output, direct.output) << format;
    }
}

TEST_F(DeskPlayerReplay, EqualsTheFieldLogOfEachSampleLog)
{
    int logs = 0;
    for (const fs::directory_entry& log : fs::directory_iterator(SampleLogs)) {
        SCOPED_TRACE(log.path());
        ExpectReplayOfFieldLog({log.path().string()}, folder / "recording");
        ++logs;
    }
    EXPECT_GT(logs, 0);
}

TEST_F(DeskPlayerReplay, EqualsTheFieldLogOfSessions)
{
    for (const std::string& session : {AllEvents, Evening}) {
        SCOPED_TRACE(session);
        const ProgramResult result = RunDeskPlayer(
            {SampleDisc, "--session", session, "--log", "BdmvNavigator=Event+hifreq|Warning"});
        ASSERT_NE(result.errors, "");
        ExpectReplayOfFieldLog({WriteFile("log", result.errors)}, folder / "recording");
    }
}

TEST_F(DeskPlayerReplay, EqualsAFieldLogWithGapsAndSeveralStarts)
{
    const std::string log = "2024-05-31 20:15:00.123456 BdmvNavigator Event: Sending Paused\n"
                            "2024-05-31 20:15:01.123456 Common Warning: lines lost: 17\n"
                            "2024-05-31 20:15:02.123456 BdmvNavigator Event: Sending Continued\n"
                            "2024-06-30 20:15:00.123456 BdmvNavigator Event: Sending Stopped\n";
    const std::string file = WriteFile("log", log + "x");
    ExpectReplayOfFieldLog({file, file}, folder / "recording");

    const std::string recording = ReadContents(folder / "recording");
    EXPECT_NE(recording.find(R"("start":{"wallClock":"2024-06-30 20:15:00.123456"})"),
              std::string::npos);
    EXPECT_NE(recording.find(R"("gap":{"lost":17,"cause":"lost"})"), std::string::npos);
}

TEST_F(DeskPlayerReplay, AppliesFilters)
{
    const std::vector<std::string> filter = {"--only", "Paused,Stepped", "--listen", "control"};
    const std::string recording =
        WriteFile("recording",
                  RunDeskPlayer({SampleDisc, "--session", AllEvents, "--format", "json"}).output);

    const ProgramResult direct = RunDeskPlayer(
        {SampleDisc, "--session", AllEvents, filter[0], filter[1], filter[2], filter[3]});
    const ProgramResult replayed =
        RunDeskPlayer({"--replay", recording, filter[0], filter[1], filter[2], filter[3]});

    EXPECT_FALSE(direct.output.empty());
    EXPECT_EQ(replayed.output, direct.output);
}

TEST_F(DeskPlayerReplay, EqualsTheDumpOfABlackBoxAndCountsItsGaps)
{
    const ProgramResult result = RunDeskPlayer({"--replay", SampleDump, "--format", "json"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, ReadContents(SampleDump));
    EXPECT_EQ(result.errors,
              "bdmv-deskplayer: " + SampleDump + ": 0 callbacks with absent arguments; 1 gap\n");
}

TEST_F(DeskPlayerReplay, ReadsStandardInput)
{
    const ProgramResult result = RunDeskPlayerWithInput({"--replay", "-", "--format", "json"},
                                                        WriteFile("recording", TwoCallbacks));

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, TwoCallbacks);
}

TEST_F(DeskPlayerReplay, ShowsIncompleteCallbacksAsTheyAre)
{
    const ProgramResult result = RunDeskPlayer({"--replay", WriteFile("recording", Incomplete)});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "00:00:01.000  TriggerSet\n"
                             "00:00:01.000  (gap)                       lost=2 cause=capacity\n");
    EXPECT_EQ(LastLine(result.errors).substr(result.errors.find("/recording: ")),
              "/recording: 1 callback with absent arguments; 1 gap");
}

TEST_F(DeskPlayerReplay, FillsIncompleteCallbacksOnDemand)
{
    const ProgramResult result =
        RunDeskPlayer({"--replay", WriteFile("recording", Incomplete), "--fill"});

    EXPECT_EQ(LinesOf(result.output)[0],
              "00:00:01.000  TriggerSet                  type=TriggerTypeNone result=false");
    EXPECT_EQ(LastLine(result.errors).substr(result.errors.find("/recording: ")),
              "/recording: 1 callback with absent arguments, filled; 1 gap");
}

TEST_F(DeskPlayerReplay, TakesItsTimeOnlyInRealTime)
{
    const std::string recording = WriteFile("recording", TwoCallbacks);
    const auto start = std::chrono::steady_clock::now();
    const ProgramResult result =
        RunDeskPlayer({"--replay", recording, "--realtime", "--format", "json"});
    const auto duration = std::chrono::steady_clock::now() - start;

    EXPECT_EQ(result.output, TwoCallbacks);
    EXPECT_GE(duration, std::chrono::milliseconds(200)); // the distance between the callbacks
    EXPECT_LT(duration, std::chrono::hours(55));         // not the time of the first one
}

TEST_F(DeskPlayerReplay, RefusesMalformedRecordingsAfterTheLinesBefore)
{
    const ProgramResult result =
        RunDeskPlayer({"--replay", WriteFile("recording", TwoCallbacks + "{\"ticks\":1}\n")});

    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.output, "55:33:20.000  Paused\n55:33:20.200  Stopped\n");
    EXPECT_EQ(result.errors.substr(result.errors.find("/recording:")),
              "/recording:3:1: missing member 'callback'\n");
}

TEST_F(DeskPlayerReplay, CompletesTheTraceOfAMalformedRecording)
{
    const ProgramResult result = RunDeskPlayer(
        {"--replay", WriteFile("recording", TwoCallbacks + "x"), "--format", "trace"});

    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(LastLine(result.output), "]");
}

TEST_F(DeskPlayerReplay, RefusesWhatItCannotRead)
{
    const std::string missing = (folder / "missing").string();
    ExpectUsageError({"--replay", missing}, missing + ": cannot open recording");
    ExpectUsageError({"--replay", folder.string()}, folder.string() + ": cannot read recording");
    ExpectUsageError({"--replay", ""},
                     "--replay: empty value; expected the name of a file; see --help");
}

TEST_F(DeskPlayerReplay, DoesNotOverwriteTheRecording)
{
    const std::string recording = WriteFile("recording", TwoCallbacks);

    ExpectUsageError({"--replay", recording, "--output", recording}, "--output: is the recording");
    EXPECT_EQ(ReadContents(recording), TwoCallbacks);
}

TEST_F(DeskPlayerReplay, ExcludesADiscAndItsOptions)
{
    const std::string recording = WriteFile("recording", TwoCallbacks);
    for (const std::vector<std::string>& arguments :
         std::vector<std::vector<std::string>>{{SampleDisc},
                                               {"--playlist", "1"},
                                               {"--list"},
                                               {"--describe", "1"},
                                               {"--check"},
                                               {"--session", AllEvents},
                                               {"--remote"},
                                               {"--log", "BdmvNavigator=Event"}}) {
        std::vector<std::string> all = {"--replay", recording};
        all.insert(all.end(), arguments.begin(), arguments.end());
        const ProgramResult result = RunDeskPlayer(all);
        EXPECT_EQ(result.status, 2);
        EXPECT_NE(result.errors.find(" excludes "), std::string::npos) << result.errors;
    }
}

TEST_F(DeskPlayerReplay, IsNeededToFill)
{
    ExpectUsageError({SampleDisc, "--fill"}, "--fill requires --replay; see --help");
}

} // namespace
