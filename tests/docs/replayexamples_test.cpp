// The examples of docs/clients.md that need the desk player.

#include <gtest/gtest.h>

#include <sstream>
#include <string>
#include <vector>

#include "bdmvnavigator/inavigatorevent.h"
#include "clientkit/playbackstatus.h"
#include "deskplayer/replay.h"

namespace
{

const char* const Dump =
    R"({"ticks":45000,"gap":{"lost":2,"cause":"capacity"}})"
    "\n"
    R"({"ticks":45000,"callback":"ChapterNumber","arguments":{"chapter":3}})"
    "\n"
    R"({"ticks":90000,"callback":"PlayMode","arguments":{"direction":"Forward"}})"
    "\n"
    R"({"ticks":135000,"callback":"Paused","arguments":{}})"
    "\n";

TEST(ReplayExamples, Replay)
{
    const std::string dump = Dump;

    std::istringstream recording(dump); // or a std::ifstream
    bdmv::StatusListener follower;
    bdmv::INavigatorEvent::Listeners listeners;
    listeners.AddListener(&follower);

    const deskplayer::ReplayReport report = deskplayer::Replay(recording, listeners);

    EXPECT_EQ(follower.Status().state.value, bdmv::PlaybackPaused);
    EXPECT_EQ(follower.Status().chapter.value, 3);
    EXPECT_EQ(report.delivered, 2U);
    EXPECT_EQ(report.skipped, 1U); // lacks arguments
    EXPECT_EQ(report.gaps, 1U);
}

deskplayer::Ticks g_Now{0};
std::vector<std::string> g_Messages;

void SetClock(deskplayer::Ticks time)
{
    g_Now = time;
}

void Show(const std::string& message)
{
    g_Messages.push_back(message);
}

TEST(ReplayExamples, ReplayWithOptions)
{
    std::istringstream recording(Dump);
    bdmv::StatusListener follower;
    bdmv::INavigatorEvent::Listeners listeners;
    listeners.AddListener(&follower);

    deskplayer::ReplayOptions options;
    options.name = "failure.jsonl";
    options.fill = true;      // delivers neutral values instead of absent arguments
    options.onMessage = Show; // "failure.jsonl:3: filled PlayMode, which lacks speed"
    Replay(recording, listeners, SetClock, options);

    EXPECT_EQ(g_Now, deskplayer::Ticks(135000));
    EXPECT_EQ(g_Messages,
              (std::vector<std::string>{"failure.jsonl:1: gap: capacity",
                                        "failure.jsonl:3: filled PlayMode, which lacks speed"}));
    EXPECT_TRUE(follower.Status().playMode.known);
}

} // namespace
