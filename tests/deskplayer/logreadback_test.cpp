// The log of every playback, read back, is the session again, except for arguments that no line
// shows.

#include <gtest/gtest.h>

#include <cstdlib>
#include <map>
#include <nlohmann/json.hpp>
#include <sstream>
#include <string>
#include <vector>

#include "disc/playbacks.h"
#include "disc/testdiscs.h"
#include "output/jsonoutput.h"
#include "programtest.h"
#include "recording/recordingreader.h"
#include "unshownarguments.h"

namespace
{

using bdmvtest::ArgumentNames;
using bdmvtest::InNoLine;
using deskplayer::Playback;
using nlohmann::ordered_json;

/** The arguments that only the diagnostic line shows, which is at another level. */
const ArgumentNames InTheDiagnosticLine = {{"TriggerTimeReached", {"type", "time"}}};

/** The callback that is logged at high frequency only. */
const std::string HighFrequency = "CurrentTimePosition";

/** JSON lines of a session without these arguments. */
std::string WithoutArguments(const ArgumentNames& arguments, const std::string& output)
{
    std::string result;
    for (const std::string& line : LinesOf(output)) {
        ordered_json object = ordered_json::parse(line);
        const auto absent = arguments.find(object["callback"]);
        if (absent != arguments.end()) {
            for (const std::string& name : absent->second) {
                EXPECT_EQ(object["arguments"].erase(name), 1U) << line;
            }
        }
        result += object.dump() + "\n";
    }
    return result;
}

/** The arguments of the desk player for a playback. */
std::vector<std::string> ArgumentsOf(const Playback& playback)
{
    std::vector<std::string> arguments = {playback.disc.string(), "--playlist",
                                          std::to_string(playback.playList), "--format", "json"};
    if (!playback.session.empty()) {
        arguments.insert(arguments.end(), {"--session", playback.session.string()});
    }
    return arguments;
}

/** What the desk player writes for a recording, as JSON. */
std::string Replayed(const std::string& recording)
{
    std::istringstream input(recording);
    std::ostringstream output;
    const deskplayer::VirtualClock clock;
    deskplayer::JsonOutput listener(output, clock, deskplayer::OutputFilter());
    deskplayer::RecordingReader reader(input, "recording");
    while (reader.Next(listener)) {
    }
    return output.str();
}

class LogOf : public ScratchFolder, public testing::WithParamInterface<Playback>
{
protected:
    /** The playback's direct output, and what its log gives. */
    struct Outputs {
        std::string direct;
        std::string fromLog;
    };

    Outputs Play(const Playback& playback, const std::string& log) const
    {
        std::vector<std::string> arguments = ArgumentsOf(playback);
        arguments.insert(arguments.end(), {"--log", log});
        const ProgramResult direct = RunDeskPlayer(arguments);
        EXPECT_TRUE(direct.status == 0 || direct.status == 4) << direct.errors;
        EXPECT_NE(direct.output, "");
        const ProgramResult read =
            RunDeskPlayer({"--field-log", WriteFile("log", direct.errors), "--format", "json"});
        EXPECT_EQ(read.status, 0) << read.errors;
        return {direct.output, read.output};
    }
};

TEST_P(LogOf, GivesTheOutputAgainExceptWhatNoLineShows)
{
    const Outputs outputs = Play(GetParam(), "BdmvNavigator=Event+hifreq|Warning");

    // Not EXPECT_EQ: it would print megabytes.
    EXPECT_TRUE(outputs.fromLog == WithoutArguments(InNoLine, outputs.direct));
    EXPECT_TRUE(Replayed(outputs.fromLog) == outputs.fromLog);
}

INSTANTIATE_TEST_SUITE_P(Disc, LogOf,
                         testing::ValuesIn(deskplayer::PlaybacksOf(deskplayer::SampleDiscs())),
                         testing::PrintToStringParamName());
INSTANTIATE_TEST_SUITE_P(FurtherDisc, LogOf,
                         testing::ValuesIn(deskplayer::PlaybacksOf(deskplayer::FurtherDiscs())),
                         testing::PrintToStringParamName());

class LogOfASampleSession : public LogOf
{
};

TEST_P(LogOfASampleSession, LacksTheTriggerWithoutTheDiagnosticLine)
{
    const Outputs outputs = Play(GetParam(), "BdmvNavigator=Event+hifreq");

    EXPECT_TRUE(outputs.fromLog ==
                WithoutArguments(InTheDiagnosticLine, WithoutArguments(InNoLine, outputs.direct)));
}

TEST_P(LogOfASampleSession, LacksPositionsWithoutHighFrequency)
{
    const Outputs outputs = Play(GetParam(), "BdmvNavigator=Event|Warning");

    EXPECT_TRUE(outputs.fromLog ==
                WithoutArguments(InNoLine, Without("\"" + HighFrequency + "\"", outputs.direct)));
}

TEST_P(LogOfASampleSession, MayBeARotatedSetOfFiles)
{
    const std::string sink =
        "file:" + (folder / "player.log").string() + ",size=3000,files=99,queue=1000";
    setenv("KEVRO_LOG_SINK", sink.c_str(), 1);
    std::vector<std::string> arguments = ArgumentsOf(GetParam());
    arguments.insert(arguments.end(), {"--log", "BdmvNavigator=Event+hifreq|Warning"});
    const ProgramResult direct = RunDeskPlayer(arguments);
    unsetenv("KEVRO_LOG_SINK");

    std::vector<std::string> files = {(folder / "player.log").string()};
    for (int age = 1; fs::exists(folder / ("player." + std::to_string(age) + ".log")); ++age) {
        files.push_back((folder / ("player." + std::to_string(age) + ".log")).string());
    }
    EXPECT_GT(files.size(), 5U);
    std::vector<std::string> reading = {"--format", "json", "--field-log"};
    reading.insert(reading.end(), files.rbegin(), files.rend()); // the oldest first
    const ProgramResult read = RunDeskPlayer(reading);

    EXPECT_EQ(read.errors, "");
    EXPECT_TRUE(read.output == WithoutArguments(InNoLine, direct.output));
}

INSTANTIATE_TEST_SUITE_P(Disc, LogOfASampleSession,
                         testing::Values(Playback{SampleDisc, 1, AllEvents},
                                         Playback{SampleDisc, 1, Evening}),
                         testing::PrintToStringParamName());

} // namespace
