#include <gtest/gtest.h>

#include <filesystem>
#include <map>
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "disc/testdiscs.h"
#include "programtest.h"

namespace
{

using DeskPlayerOutput = ScratchDisc;

TEST_F(DeskPlayerOutput, IsOneJsonObjectPerLine)
{
    const ProgramResult text = RunDeskPlayer({SampleDisc, "--session", AllEvents});
    const ProgramResult json =
        RunDeskPlayer({SampleDisc, "--session", AllEvents, "--format", "json"});

    EXPECT_EQ(json.status, 0);
    const std::vector<std::string> lines = LinesOf(text.output);
    const std::vector<std::string> objects = LinesOf(json.output);
    ASSERT_EQ(objects.size(), lines.size());
    for (std::size_t i = 0; i < lines.size(); ++i) {
        const nlohmann::json object = nlohmann::json::parse(objects[i]);
        const std::string start =
            object.at("time").get<std::string>() + "  " + object.at("callback").get<std::string>();
        EXPECT_EQ((lines[i] + " ").rfind(start + " ", 0), 0U) << lines[i];
    }
}

/** Reads a trace track by track, as a viewer does. */
void ExpectTraceThatAViewerCanShow(const std::string& output)
{
    struct Track {
        double last = 0;
        std::vector<std::string> open;
    };
    std::map<int, Track> tracks;
    const nlohmann::json trace = nlohmann::json::parse(output);
    ASSERT_TRUE(trace.is_array());
    for (const nlohmann::json& event : trace) {
        const std::string phase = event.at("ph");
        if (phase == "M") {
            continue;
        }
        Track& track = tracks[event.at("tid")];
        EXPECT_GE(event.at("ts"), track.last) << event;
        track.last = event.at("ts");
        if (phase == "B") {
            track.open.push_back(event.at("name"));
            EXPECT_EQ(track.open.size(), 1U) << event;
        } else if (phase == "E") {
            ASSERT_FALSE(track.open.empty()) << event;
            EXPECT_EQ(track.open.back(), event.at("name")) << event;
            track.open.pop_back();
        } else {
            EXPECT_EQ(phase, "i") << event;
        }
    }
    EXPECT_GT(tracks.size(), 5U);
    for (const auto& [thread, track] : tracks) {
        EXPECT_TRUE(track.open.empty()) << thread << ": " << testing::PrintToString(track.open);
    }
}

TEST_F(DeskPlayerOutput, IsATraceWhoseSlicesPairAndWhoseTimesNeverDecrease)
{
    for (const std::string& session : {AllEvents, Evening}) {
        SCOPED_TRACE(session);
        const ProgramResult result =
            RunDeskPlayer({SampleDisc, "--session", session, "--format", "trace"});

        EXPECT_EQ(result.status, 0);
        ExpectTraceThatAViewerCanShow(result.output);
    }
}

TEST_F(DeskPlayerOutput, IsAValidTraceOfEveryDisc)
{
    for (const fs::directory_entry& entry : fs::directory_iterator(BDMVNAVIGATOR_TEST_DISCS)) {
        if (fs::is_directory(entry.path() / "BDMV")) {
            SCOPED_TRACE(entry.path().filename());
            ExpectTraceThatAViewerCanShow(
                RunDeskPlayer({entry.path(), "--format", "trace"}).output);
        }
    }
}

TEST_F(DeskPlayerOutput, GoesToTheNamedFile)
{
    const std::string file = folder / "out.txt";

    const ProgramResult result = RunDeskPlayer({SampleDisc, "--output", file});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "");
    EXPECT_EQ(ReadContents(file), RunDeskPlayer({SampleDisc}).output);
}

TEST_F(DeskPlayerOutput, LeavesTheFileUnchangedIfAnInputIsRefused)
{
    const std::string file = WriteFile("precious.txt", "precious");
    const std::string wrong = WriteFile("wrong.session", "nxt");
    fs::copy_file(disc / "BDMV/index.bdmv", disc / "BDMV/PLAYLIST/00003.mpls");
    fs::create_directory(folder / "BDMV");
    const struct {
        int status;
        std::vector<std::string> arguments;
    } faults[] = {{2, {disc, "--format", "x"}},
                  {2, {disc, "--listen", "x"}},
                  {2, {disc, "--only", "x"}},
                  {2, {disc, "--list", "--format", "x"}},
                  {2, {disc, "--log", "x"}},
                  {2, {disc, "--session", wrong}},
                  {2, {disc, "--session", "no.session"}},
                  {3, {"no/such/folder"}},
                  {3, {folder}},
                  {3, {folder, "--list"}},
                  {3, {disc, "--playlist", "7"}},
                  {3, {disc, "--playlist", "3"}},
                  {3, {disc, "--describe", "7"}},
                  {3, {disc, "--describe", "3"}}};
    for (const auto& fault : faults) {
        SCOPED_TRACE(testing::PrintToString(fault.arguments));
        for (const std::string& output : {file, std::string(folder / "new.txt")}) {
            std::vector<std::string> arguments = fault.arguments;
            arguments.insert(arguments.end(), {"--output", output});
            EXPECT_EQ(RunDeskPlayer(arguments).status, fault.status);
        }
        EXPECT_EQ(ReadContents(file), "precious");
        EXPECT_FALSE(fs::exists(folder / "new.txt"));
    }
}

TEST_F(DeskPlayerOutput, IsLimitedToTheSelectedInterfacesAndCallbacks)
{
    EXPECT_EQ(RunDeskPlayer({SampleDisc, "--listen", "control,interactive"}).output,
              "00:00:00.000  PlayStarted\n"
              "00:00:00.000  FirstPictureDelivered\n"
              "00:00:06.000  PopUpMenuAvailable\n"
              "00:02:51.000  PopUpMenuUnavailable\n"
              "00:02:53.000  StillOn\n"
              "00:02:58.000  StillOff\n"
              "00:02:59.000  StillOn\n"
              "00:03:02.000  StillOff\n"
              "00:03:02.000  Finished                    reason=EndOfMedia\n");
    EXPECT_EQ(RunDeskPlayer({SampleDisc, "--only", "PlayStarted,PopUpMenuAvailable,ChapterNumber",
                             "--listen", "control,interactive"})
                  .output,
              "00:00:00.000  PlayStarted\n"
              "00:00:06.000  PopUpMenuAvailable\n");
}

TEST_F(DeskPlayerOutput, RefusesUnknownFormatsInterfacesAndCallbacks)
{
    ExpectUsageError({SampleDisc, "--format", "xml"},
                     "'xml' is not an output format; expected text, json, trace or html");
    ExpectUsageError({SampleDisc, "--listen", "control,x"},
                     "'x' is not a listener interface; expected control, settings, button or "
                     "interactive");
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--only", "PlayItem,Foo"});
    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.output, "");
    EXPECT_EQ(
        result.errors.rfind("bdmv-deskplayer: 'Foo' is not a callback; expected PlayStarted, ", 0),
        0U)
        << result.errors;
}

TEST_F(DeskPlayerOutput, IsReportedWithStatus1AndTheReasonIfItCannotBeWritten)
{
    for (const std::vector<std::string>& arguments :
         std::vector<std::vector<std::string>>{{SampleDisc},
                                               {SampleDisc, "--list"},
                                               {SampleDisc, "--describe", "1"},
                                               {"--commands"},
                                               {"--version"},
                                               {"--help"}}) {
        const ProgramResult result = RunDeskPlayer(arguments, "/dev/full");
        EXPECT_EQ(result.status, 1);
        EXPECT_EQ(result.errors, "bdmv-deskplayer: standard output: cannot be written: No space "
                                 "left on device\n");
    }

    const ProgramResult full = RunDeskPlayer({SampleDisc, "--output", "/dev/full"});
    EXPECT_EQ(full.status, 1);
    EXPECT_EQ(full.errors,
              "bdmv-deskplayer: /dev/full: cannot be written: No space left on device\n");
    const ProgramResult nowhere = RunDeskPlayer({SampleDisc, "--output", "no/such/folder/out"});
    EXPECT_EQ(nowhere.status, 1);
    EXPECT_EQ(nowhere.errors, "bdmv-deskplayer: no/such/folder/out: cannot be written: No such "
                              "file or directory\n");
    const ProgramResult isFolder = RunDeskPlayer({SampleDisc, "--output", folder});
    EXPECT_EQ(isFolder.errors,
              "bdmv-deskplayer: " + folder.string() + ": cannot be written: Is a directory\n");
}

} // namespace
