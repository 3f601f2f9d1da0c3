// How the outputs write recordings: callbacks with absent arguments, and gaps.

#include "output/record.h"

#include <gtest/gtest.h>

#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include <nlohmann/json.hpp>

#include "output/outputformat.h"

namespace deskplayer
{
namespace
{

namespace callbacks = bdmv::callbacks;
using nlohmann::json;

class WrittenRecords : public testing::Test
{
protected:
    void WriteIn(OutputFormat format)
    {
        settings.format = format;
        m_Output = MakeOutput(settings, m_Stream, m_Clock);
    }

    RecordListener& Listener() { return *m_Output; }

    /** Completes the output. */
    std::string Text()
    {
        m_Output.reset();
        return m_Stream.str();
    }

    /** The events of the trace that are not metadata: phase, time, name and arguments. */
    std::vector<std::string> Events()
    {
        std::vector<std::string> events;
        for (const json& event : json::parse(Text())) {
            if (event.at("ph") != "M") {
                events.push_back(event.at("ph").get<std::string>() + " " + event.at("ts").dump() +
                                 " " + event.at("name").get<std::string>() + " " +
                                 event.at("args").dump());
            }
        }
        return events;
    }

    OutputSettings settings;

private:
    std::ostringstream m_Stream;
    VirtualClock m_Clock;
    std::unique_ptr<Output> m_Output;
};

TEST_F(WrittenRecords, HaveTheirOwnTimes)
{
    WriteIn(OutputFormat::Text);
    Listener().OnRecord({Ticks(90000), callbacks::Paused{}, {}});
    Listener().OnRecord({Ticks(45000), callbacks::Stopped{}, {}});

    EXPECT_EQ(Text(), "00:00:02.000  Paused\n00:00:01.000  Stopped\n");
}

TEST_F(WrittenRecords, LackAbsentArgumentsInText)
{
    WriteIn(OutputFormat::Text);
    Listener().OnRecord({Ticks(0), callbacks::MarkInfo{800, 2, 45000}, 0b010});

    EXPECT_EQ(Text(), "00:00:00.000  MarkInfo                    playListId=800 "
                      "time=00:00:01.000\n");
}

TEST_F(WrittenRecords, LackAbsentArgumentsInJson)
{
    WriteIn(OutputFormat::Json);
    Listener().OnRecord({Ticks(45000), callbacks::MarkInfo{800, 2, 45000}, 0b001});
    Listener().OnRecord({Ticks(45000), callbacks::MarkInfo{800, 2, 45000}, 0b111});

    EXPECT_EQ(Text(), R"({"ticks":45000,"time":"00:00:01.000","interface":"settings",)"
                      R"("callback":"MarkInfo","arguments":{"markId":2,"time":45000}})"
                      "\n"
                      R"({"ticks":45000,"time":"00:00:01.000","interface":"settings",)"
                      R"("callback":"MarkInfo","arguments":{}})"
                      "\n");
}

TEST_F(WrittenRecords, LackAbsentArgumentsInTraces)
{
    WriteIn(OutputFormat::Trace);
    Listener().OnRecord(
        {Ticks(45000), callbacks::TriggerSet{bd::TRIGGER_NOTIFY_FROM_CURPOS, true}, 0b10});

    EXPECT_EQ(Events(), std::vector<std::string>{
                            R"(i 1000000 TriggerSet {"type":"TRIGGER_NOTIFY_FROM_CURPOS"})"});
}

TEST_F(WrittenRecords, ShowTheKnownBeginningOfABlock)
{
    const bd::UInt8 block[] = {0x00, 0xA5};
    CallbackRecord record = {Ticks(0), callbacks::SystemSuspended{block, 5}, {}};
    record.knownBytes = 2;

    WriteIn(OutputFormat::Text);
    Listener().OnRecord(record);

    EXPECT_EQ(Text(), "00:00:00.000  SystemSuspended             data=00a5 size=5\n");
}

TEST_F(WrittenRecords, BeginNoSliceThatAnAbsentArgumentWouldName)
{
    WriteIn(OutputFormat::Trace);
    Listener().OnRecord({Ticks(0), callbacks::AudioInfo{1}, {}});
    Listener().OnRecord({Ticks(9), callbacks::AudioInfo{2}, 0b1});

    const std::vector<std::string> events = Events();
    EXPECT_EQ(events, (std::vector<std::string>{
                          R"(B 0 audio 1 {"number":1})", R"(i 0 AudioInfo {"number":1})",
                          R"(E 200 audio 1 {"number":1})", "i 200 AudioInfo {}"}));
}

TEST_F(WrittenRecords, EndTheSlicesOfTheTraceAtTheLastTime)
{
    WriteIn(OutputFormat::Trace);
    Listener().OnRecord({Ticks(0), callbacks::Paused{}, {}});
    Listener().OnRecord({Ticks(9), callbacks::JumpOccurred{}, {}});

    EXPECT_EQ(Events().back(), "E 200 Paused {}");
}

TEST_F(WrittenRecords, ShowGapsInText)
{
    WriteIn(OutputFormat::Text);
    Listener().OnGap({Ticks(45000), "capacity", 2});
    Listener().OnGap({Ticks(45000), "restart", std::nullopt});

    EXPECT_EQ(Text(), "00:00:01.000  (gap)                       lost=2 cause=capacity\n"
                      "00:00:01.000  (gap)                       cause=restart\n");
}

TEST_F(WrittenRecords, ShowGapsInColour)
{
    settings.coloured = true;
    WriteIn(OutputFormat::Text);
    Listener().OnGap({Ticks(0), "restart", std::nullopt});

    EXPECT_NE(Text().find("\033[31m(gap)\033[0m"), std::string::npos);
}

TEST_F(WrittenRecords, ShowGapsInJsonAsABlackBoxDoes)
{
    WriteIn(OutputFormat::Json);
    Listener().OnGap({Ticks(45000), "capacity", 18446744073709551615U});
    Listener().OnGap({Ticks(45000), "restart", std::nullopt});

    EXPECT_EQ(Text(), R"({"ticks":45000,"gap":{"lost":18446744073709551615,"cause":"capacity"}})"
                      "\n"
                      R"({"ticks":45000,"gap":{"cause":"restart"}})"
                      "\n");
}

TEST_F(WrittenRecords, EndAllSlicesOfATraceAtAGap)
{
    WriteIn(OutputFormat::Trace);
    Listener().OnRecord({Ticks(0), callbacks::Paused{}, {}});
    Listener().OnGap({Ticks(9), "lost", 2});
    Listener().OnGap({Ticks(18), "restart", std::nullopt});

    EXPECT_EQ(Events(),
              (std::vector<std::string>{"B 0 Paused {}", "i 0 Paused {}", "E 200 Paused {}",
                                        R"(i 200 gap {"cause":"lost","lost":2})",
                                        R"(i 400 gap {"cause":"restart"})"}));
}

TEST_F(WrittenRecords, ShowStartsInText)
{
    WriteIn(OutputFormat::Text);
    Listener().OnStart({Ticks(45000), "2024-05-31 20:15:00.123456"});

    EXPECT_EQ(Text(), "00:00:01.000  (start) at 2024-05-31 20:15:00.123456\n");
}

TEST_F(WrittenRecords, ShowStartsInJson)
{
    WriteIn(OutputFormat::Json);
    Listener().OnStart({Ticks(45000), "2024-05-31 20:15:00.123456"});

    EXPECT_EQ(Text(), R"({"ticks":45000,"start":{"wallClock":"2024-05-31 20:15:00.123456"}})"
                      "\n");
}

TEST_F(WrittenRecords, ShowStartsInTracesWithoutEndingSlices)
{
    WriteIn(OutputFormat::Trace);
    Listener().OnRecord({Ticks(0), callbacks::Paused{}, {}});
    Listener().OnStart({Ticks(9), "2024-05-31 20:15:00"});

    EXPECT_EQ(Events(),
              (std::vector<std::string>{"B 0 Paused {}", "i 0 Paused {}",
                                        R"(i 200 start {"wallClock":"2024-05-31 20:15:00"})",
                                        "E 200 Paused {}"}));
}

TEST_F(WrittenRecords, ShowStartsWhateverTheFilter)
{
    settings.filter.KeepCallbacks("Stopped");
    WriteIn(OutputFormat::Text);
    Listener().OnStart({Ticks(0), "20:15"});

    EXPECT_EQ(Text(), "00:00:00.000  (start) at 20:15\n");
}

TEST_F(WrittenRecords, ShowGapsWhateverTheFilter)
{
    settings.filter.KeepCallbacks("Stopped");
    WriteIn(OutputFormat::Text);
    Listener().OnRecord({Ticks(0), callbacks::Paused{}, {}});
    Listener().OnGap({Ticks(0), "restart", std::nullopt});

    EXPECT_EQ(Text(), "00:00:00.000  (gap)                       cause=restart\n");
}

} // namespace
} // namespace deskplayer
