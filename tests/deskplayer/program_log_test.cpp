#include <gtest/gtest.h>

#include <cinttypes>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <nlohmann/json.hpp>
#include <regex>
#include <set>
#include <string>
#include <vector>

#include "programtest.h"

namespace
{

/** The line of every event, with every number replaced by #. */
const std::set<std::string> LinesOfEvents = {
    "Sending AngleInfo - angleNr: #",
    "Sending AudioChannelsChanged",
    "Sending AudioInfo - audioNr: #",
    "Sending ButtonActivationBusy",
    "Sending ButtonActivationDone",
    "Sending Chapter - chapterNumber: #",
    "Sending Continued with playmode: dir #, speed # (currentplaymode: dir #, speed #)",
    "Sending CurrentTimePosition - position: #",
    "Sending ExecuteButton - ticket: #, buttonId: #",
    "Sending Finished - reason: #",
    "Sending FirstPictureDeliveredEvent",
    "Sending InteractiveGraphicsActive",
    "Sending InteractiveGraphicsInactive",
    "Sending InteractiveGraphicsInfo - igNr: #",
    "Sending InteractiveGraphicsInvisible",
    "Sending InteractiveGraphicsVisible",
    "Sending JumpOccurred",
    "Sending MarkInfo - markId: #, time: #",
    "Sending Paused",
    "Sending PictureInPictureAvailable",
    "Sending PictureInPictureUnavailable",
    "Sending PipPgTextSelectEvent - pip pick?: #",
    "Sending PipPgTextStInfo - pgTextStNr: #, avaliable #",
    "Sending PlayFailed",
    "Sending PlayItem - playListId: #, playItemId: #, videoFormat #, aspectRatio #",
    "Sending PlayMode - direction: #, speedIndex: #",
    "Sending PlayStarted",
    "Sending Playlist - playListId: #",
    "Sending PopUpMenuAvailable",
    "Sending PopUpMenuUnavailable",
    "Sending PreloadFailed",
    "Sending PresentationGraphicsDisplay - shown: #",
    "Sending PresentationGraphicsInfo - pgTextStNr: #, available: #",
    "Sending ResumeFailed",
    "Sending Resumed",
    "Sending SecondaryAudioAvailable",
    "Sending SecondaryAudioDisplay - audioNr #, numOfAudios #, shown: #",
    "Sending SecondaryAudioInfo - audioNr: #",
    "Sending SecondaryAudioUnavailable",
    "Sending SecondaryVideoDisplay - video Nr #, numofVideos #, async #, shown: #",
    "Sending SecondaryVideoInfo - videoNr: #",
    "Sending Stepped - position: #,dir=#",
    "Sending StillOff",
    "Sending StillOn",
    "Sending Stopped",
    "Sending Suspended",
    "Sending SystemResumeFailed",
    "Sending SystemResumed - playing: #",
    "Sending SystemSuspended - dataSize: #",
    "Sending TextSubtitleStyleInfo - styleNumber: #",
    "Sending TextSubtitleStylesAvailable - numberOfStyles: #",
    "Sending Trigger Reached",
    "Sending Trigger Set",
    "Sending UOMask - uoMask: #",
    "Sending VideoInfo - videoNr: #",
    "Sending ZoomModeSetEvent callback"};

TEST(DeskPlayerLog, HasALineForEveryEvent)
{
    const ProgramResult result = RunDeskPlayer(
        {SampleDisc, "--session", AllEvents, "--log", "BdmvNavigator=Event+hifreq|Warning"});

    const std::regex eventLine(".{15} BdmvNavigator Event: (Sending [^(].*)");
    const std::regex value("[0-9]+|TRUE|FALSE");
    std::set<std::string> logged;
    for (const std::string& line : LinesOf(result.errors)) {
        std::smatch match;
        if (std::regex_match(line, match, eventLine)) {
            logged.insert(std::regex_replace(match[1].str(), value, "#"));
        }
    }
    EXPECT_EQ(LinesOfEvents.size(), 56U);
    EXPECT_EQ(logged, LinesOfEvents);
    EXPECT_NE(result.errors.find(" BdmvNavigator Warning: TriggerRead time type="),
              std::string::npos);
}

TEST(DeskPlayerLog, GoesToStandardError)
{
    const ProgramResult result =
        RunDeskPlayer({SampleDisc, "--playlist", "2", "--log", "BdmvNavigator=Event"});

    const std::vector<std::string> lines = LinesOf(result.errors);
    ASSERT_EQ(lines.size(), 12U);
    const std::string tag = "..:..:..\\....... BdmvNavigator Event: ";
    EXPECT_TRUE(std::regex_match(lines.front(), std::regex(tag + "Sending PlayStarted")));
    EXPECT_TRUE(std::regex_match(lines.back(), std::regex(tag + "Sending Finished - reason: 0")));
}

TEST(DeskPlayerLog, CarriesTheTimeOfTheSessionToTheTick)
{
    const std::vector<std::string> arguments = {SampleDisc, "--session", AllEvents,
                                                "--format", "json",      "--only",
                                                "MarkInfo", "--log",     "BdmvNavigator=Event"};
    const ProgramResult result = RunDeskPlayer(arguments);

    std::vector<std::string> ofCallbacks;
    for (const std::string& line : LinesOf(result.output)) {
        const auto ticks = nlohmann::json::parse(line).at("ticks").get<std::uint64_t>();
        const std::uint64_t microseconds = (ticks * 200 + 4) / 9;
        char time[64];
        std::snprintf(time, sizeof time, "%02" PRIu64 ":%02" PRIu64 ":%02" PRIu64 ".%06" PRIu64,
                      microseconds / 3600000000, microseconds / 60000000 % 60,
                      microseconds / 1000000 % 60, microseconds % 1000000);
        ofCallbacks.emplace_back(time);
    }
    std::vector<std::string> ofLines;
    for (const std::string& line : LinesOf(result.errors)) {
        if (line.find("Sending MarkInfo") != std::string::npos) {
            ofLines.push_back(line.substr(0, line.find(' ')));
        }
    }
    EXPECT_GT(ofLines.size(), 5U);
    EXPECT_EQ(ofLines, ofCallbacks);
}

TEST(DeskPlayerLog, IsTheSameInEveryRun)
{
    for (const char* const sink : {"stderr", "stderr,queue=1000"}) {
        setenv("KEVRO_LOG_SINK", sink, 1);
        const std::vector<std::string> arguments = {SampleDisc, "--session", AllEvents, "--log",
                                                    "*=*"};
        const ProgramResult first = RunDeskPlayer(arguments);
        const ProgramResult second = RunDeskPlayer(arguments);
        unsetenv("KEVRO_LOG_SINK");
        EXPECT_GT(LinesOf(first.errors).size(), 100U);
        EXPECT_EQ(first.errors, second.errors) << sink;
    }
}

} // namespace
