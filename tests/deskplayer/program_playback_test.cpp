#include <gtest/gtest.h>

#include <chrono>
#include <cstdlib>
#include <filesystem>
#include <regex>
#include <utility>
#include <vector>

#include "disc/testdiscs.h"
#include "programtest.h"

namespace
{

using DeskPlayerPlayback = ScratchDisc;

TEST_F(DeskPlayerPlayback, PlaysTheNamedPlayListFromStartToEnd)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--playlist", "2"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(Without("CurrentTimePosition", result.output),
              "00:00:00.000  PlayStarted\n"
              "00:00:00.000  Playlist                    playListId=2\n"
              "00:00:00.000  PlayItem                    playListId=2 playItemId=0 "
              "videoFormat=480i aspectRatio=4:3\n"
              "00:00:00.000  VideoInfo                   number=1\n"
              "00:00:00.000  AudioInfo                   number=1\n"
              "00:00:00.000  AngleInfo                   number=1\n"
              "00:00:00.000  AudioInfoChanged            isPrimary=true format=Ac3 "
              "sampleRate=48000 bitsPerSample=Invalid channels=Stereo pid=4352 channelLayout=0\n"
              "00:00:00.000  UOMask                      forbidden=nothing\n"
              "00:00:00.000  FirstPictureDelivered\n"
              "00:00:00.000  MarkInfo                    playListId=2 markId=0 "
              "time=00:00:00.000\n"
              "00:00:00.000  ChapterNumber               chapter=1\n"
              "00:00:20.000  Finished                    reason=EndOfMedia\n");
    EXPECT_EQ(LinesOf(result.output).size(), 12U + 21U) << "and the position of every second";
}

TEST_F(DeskPlayerPlayback, PlaysTheLongestPlayListAndLeavesEndlessStills)
{
    const ProgramResult result =
        RunDeskPlayer({SampleDisc, "--only", "Playlist,StillOn,StillOff,Finished"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(result.output, "00:00:00.000  Playlist                    playListId=1\n"
                             "00:02:53.000  StillOn\n"
                             "00:02:58.000  StillOff\n"
                             "00:02:59.000  StillOn\n"
                             "00:03:02.000  StillOff\n"
                             "00:03:02.000  Finished                    reason=EndOfMedia\n");
}

TEST_F(DeskPlayerPlayback, AcceptsTheBdmvFolderItself)
{
    EXPECT_EQ(RunDeskPlayer({SampleDisc + "/BDMV"}).output, RunDeskPlayer({SampleDisc}).output);
}

TEST_F(DeskPlayerPlayback, PlaysEveryDiscToTheEndOfItsMedia)
{
    std::vector<fs::path> collections = {BDMVNAVIGATOR_TEST_DISCS};
    if (const char* const more = std::getenv("BDMVNAVIGATOR_DISCS")) {
        collections.emplace_back(more);
    }
    int discs = 0;
    for (const fs::path& collection : collections) {
        for (const fs::directory_entry& entry : fs::directory_iterator(collection)) {
            if (!fs::is_directory(entry.path() / "BDMV")) {
                continue;
            }
            SCOPED_TRACE(entry.path().filename());
            const ProgramResult result = RunDeskPlayer({entry.path()});
            EXPECT_EQ(result.status, 0);
            EXPECT_EQ(Without("; its play items are played in sequence", result.errors), "");
            EXPECT_EQ(LastLine(result.output).substr(sizeof "hh:mm:ss.mmm"),
                      " Finished                    reason=EndOfMedia");
            ++discs;
        }
    }
    EXPECT_GE(discs, 15);
}

TEST_F(DeskPlayerPlayback, SaysThatRandomAndShuffleAreNotSimulated)
{
    for (const auto& [type, name] : {std::pair{'\2', "random"}, std::pair{'\3', "shuffle"}}) {
        Patch(45, std::string(1, type));

        const ProgramResult result = RunDeskPlayer({disc, "--only", "Finished"});

        EXPECT_EQ(result.status, 0);
        EXPECT_EQ(result.errors, "bdmv-deskplayer: play list 1: the playback type is " +
                                     std::string(name) +
                                     "; its play items are played in sequence\n");
        EXPECT_EQ(result.output, "00:03:02.000  Finished                    reason=EndOfMedia\n");
    }
}

TEST_F(DeskPlayerPlayback, TakesTheDurationOfThePlayListInRealTime)
{
    MakeShort(45 * 250);
    const auto start = std::chrono::steady_clock::now();

    const ProgramResult result =
        RunDeskPlayer({disc, "--realtime", "--only", "PlayStarted,Finished"});

    EXPECT_GE(std::chrono::steady_clock::now() - start, std::chrono::milliseconds(250));
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "00:00:00.000  PlayStarted\n"
                             "00:00:00.250  Finished                    reason=EndOfMedia\n");
}

TEST_F(DeskPlayerPlayback, ReportsEverySecondOfTwoHours)
{
    MakeShort(2 * 3600 * 45000);

    const ProgramResult result = RunDeskPlayer({disc, "--only", "CurrentTimePosition,Finished"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(LinesOf(result.output).size(), 7202U);
    EXPECT_EQ(LastLine(result.output),
              "02:00:00.000  Finished                    reason=EndOfMedia");
}

TEST_F(DeskPlayerPlayback, SkipsAndNamesPlayListsThatCannotBeRead)
{
    fs::copy_file(disc / "BDMV/index.bdmv", disc / "BDMV/PLAYLIST/00003.mpls");

    const ProgramResult result = RunDeskPlayer({disc});

    EXPECT_EQ(result.status, 0);
    EXPECT_TRUE(
        std::regex_search(result.errors, std::regex("skipped: .*00003\\.mpls: offset 0: .*INDX")))
        << result.errors;
    EXPECT_EQ(LastLine(result.output),
              "00:03:02.000  Finished                    reason=EndOfMedia");
}

} // namespace
