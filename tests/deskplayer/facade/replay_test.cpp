#include "deskplayer/replay.h"

#include <gtest/gtest.h>

#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "deskplayer/output.h"
#include "deskplayer/session.h"

namespace deskplayer
{

namespace
{

/** Keeps the callbacks of these tests as text. */
class Client : public bdmv::NavigatorListenerAdapter
{
public:
    std::vector<std::string> received;

    void Paused() override { received.emplace_back("Paused"); }
    void Stopped() override { throw std::runtime_error("client"); }

    void TriggerSet(bd::TriggerType type, bool result) override
    {
        received.push_back("TriggerSet " + std::to_string(type) + " " + std::to_string(result));
    }

    void SystemSuspended(const void* data, bd::UInt32 size) override
    {
        received.push_back("SystemSuspended " + std::string(static_cast<const char*>(data), size));
    }
};

std::string LineOf(const std::string& callback, const std::string& arguments, int ticks = 0)
{
    return "{\"ticks\":" + std::to_string(ticks) + R"(,"callback":")" + callback +
           R"(","arguments":{)" + arguments + "}}\n";
}

class Replayed : public testing::Test
{
protected:
    Replayed()
    {
        listeners.AddListener(&client);
        options.onMessage = [this](const std::string& message) { messages.push_back(message); };
    }

    ReplayReport Play(const std::string& recording, const ReplayClock& clock = {})
    {
        std::istringstream stream(recording);
        return Replay(stream, listeners, clock, options);
    }

    Client client;
    bdmv::INavigatorEvent::Listeners listeners;
    ReplayOptions options;
    std::vector<std::string> messages;
};

TEST_F(Replayed, RecordingReachesEveryListener)
{
    Client other;
    listeners.AddListener(&other);

    const ReplayReport report =
        Play(LineOf("Paused", "") + LineOf("TriggerSet", R"("type":"TRIGGER_A","result":true)"));

    const std::string trigger = "TriggerSet " + std::to_string(bd::TRIGGER_A) + " 1";
    EXPECT_EQ(client.received, (std::vector<std::string>{"Paused", trigger}));
    EXPECT_EQ(other.received, client.received);
    EXPECT_EQ(report.delivered, 2U);
    EXPECT_EQ(report.skipped, 0U);
    EXPECT_EQ(messages, std::vector<std::string>());
}

TEST_F(Replayed, CallbacksThatLackArgumentsAreSkippedAndReported)
{
    const ReplayReport report = Play(LineOf("TriggerSet", "") + LineOf("Paused", ""));

    EXPECT_EQ(client.received, std::vector<std::string>{"Paused"});
    EXPECT_EQ(report.skipped, 1U);
    EXPECT_EQ(report.filled, 0U);
    EXPECT_EQ(report.delivered, 1U);
    EXPECT_EQ(messages, std::vector<std::string>{
                            "recording:1: skipped TriggerSet, which lacks type, result"});
}

TEST_F(Replayed, CallbacksThatLackArgumentsAreFilledOnDemand)
{
    options.fill = true;
    options.name = "evening.jsonl";
    const ReplayReport report =
        Play(LineOf("TriggerSet", R"("result":true)") +
             LineOf("SystemSuspended", R"("data":"6162","size":2000000000)"));

    EXPECT_EQ(client.received, (std::vector<std::string>{"TriggerSet 0 1", "SystemSuspended ab"}));
    EXPECT_EQ(report.skipped, 0U);
    EXPECT_EQ(report.filled, 2U);
    EXPECT_EQ(report.delivered, 2U);
    EXPECT_EQ(messages, (std::vector<std::string>{
                            "evening.jsonl:1: filled TriggerSet, which lacks type",
                            "evening.jsonl:2: filled SystemSuspended, which lacks data"}));
}

TEST_F(Replayed, GapsAreReported)
{
    const ReplayReport report = Play("{\"ticks\":1,\"gap\":{\"cause\":\"capacity\"}}\n");

    EXPECT_EQ(report.gaps, 1U);
    EXPECT_EQ(report.delivered, 0U);
    EXPECT_EQ(messages, std::vector<std::string>{"recording:1: gap: capacity"});
}

TEST_F(Replayed, StartsAreCountedAndPassTime)
{
    std::vector<Ticks> times;
    const ReplayReport report =
        Play("{\"ticks\":7,\"start\":{\"wallClock\":\"2024-05-31 20:15:00\"}}\n",
             [&times](Ticks time) { times.push_back(time); });

    EXPECT_EQ(report.starts, 1U);
    EXPECT_EQ(report.gaps, 0U);
    EXPECT_EQ(report.delivered, 0U);
    EXPECT_EQ(times, std::vector<Ticks>{Ticks(7)});
    EXPECT_EQ(messages, std::vector<std::string>());
}

TEST_F(Replayed, ClockIsSetBeforeEachCallbackAndGap)
{
    std::vector<std::string> order;
    Play(LineOf("Paused", "", 5) + "{\"ticks\":7,\"gap\":{\"cause\":\"restart\"}}\n" +
             LineOf("Paused", "", 3),
         [&](Ticks time) {
             order.push_back(std::to_string(time.count()) + " after " +
                             std::to_string(client.received.size()));
         });

    EXPECT_EQ(order, (std::vector<std::string>{"5 after 0", "7 after 1", "3 after 1"}));
}

TEST_F(Replayed, MessagesNeedNoHandler)
{
    options.onMessage = {};

    EXPECT_EQ(Play(LineOf("TriggerSet", "")).skipped, 1U);
}

TEST_F(Replayed, MalformedLinesEndTheReplay)
{
    EXPECT_THROW(Play(LineOf("Paused", "") + "x\n" + LineOf("Paused", "")), RecordingError);
    EXPECT_EQ(client.received, std::vector<std::string>{"Paused"});
}

TEST_F(Replayed, ExceptionsOfListenersEndTheReplay)
{
    EXPECT_THROW(Play(LineOf("Stopped", "") + LineOf("Paused", "")), std::runtime_error);
    EXPECT_EQ(client.received, std::vector<std::string>());
    EXPECT_TRUE(listeners.RemoveListener(&client)); // the lock was released
}

TEST_F(Replayed, SessionGivesAClientWhatTheDeskGave)
{
    Desk desk(BDMVNAVIGATOR_SAMPLE_DISC, 2);
    Client direct;
    desk.Listeners().AddListener(&direct);
    std::stringstream recording;
    OutputOptions json;
    json.format = "json";
    {
        const DeskOutput output(desk, recording, json);
        EXPECT_EQ(PlaySession(desk, Session("play\nat 5 pause\nafter 1s standby\n")).refused,
                  std::vector<std::string>());
    }
    desk.Listeners().RemoveListener(&direct);

    EXPECT_EQ(Replay(recording, listeners).skipped, 0U);

    EXPECT_EQ(client.received, direct.received);
    EXPECT_EQ(client.received.size(), 2U);
}

} // namespace

} // namespace deskplayer
