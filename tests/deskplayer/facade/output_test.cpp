#include "deskplayer/output.h"

#include <gtest/gtest.h>

#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

#include "deskplayer/session.h"
#include "sampledisc.h"

namespace deskplayer
{

namespace
{

using bdmvtest::SampleDisc;

/** What an output writes of a pause, a stop and the callbacks before them. */
std::string WrittenWith(const OutputOptions& options)
{
    Desk desk(SampleDisc, 2);
    std::ostringstream stream;
    {
        const DeskOutput output(desk, stream, options);
        EXPECT_EQ(PlaySession(desk, Session("play\nat 5 pause\nafter 1s stop\n")).refused,
                  std::vector<std::string>());
    }
    return stream.str();
}

TEST(DeskOutput, WritesEveryCallbackAsTextByDefault)
{
    const std::string text = WrittenWith({});

    EXPECT_EQ(text.rfind("00:00:00.000  PlayStarted\n00:00:00.000  Playlist  ", 0), 0U) << text;
    EXPECT_NE(text.find("\n00:00:05.000  Paused\n00:00:06.000  Stopped\n"), std::string::npos)
        << text;
}

TEST(DeskOutput, WritesOnlyTheCallbacksSelected)
{
    OutputOptions options;
    options.callbacks = "Paused,AudioInfo";
    EXPECT_EQ(WrittenWith(options), "00:00:00.000  AudioInfo                   number=1\n"
                                    "00:00:05.000  Paused\n");

    options.interfaces = "control";
    EXPECT_EQ(WrittenWith(options), "00:00:05.000  Paused\n");
}

TEST(DeskOutput, WritesJson)
{
    OutputOptions options;
    options.format = "json";
    options.callbacks = "Paused";
    EXPECT_EQ(WrittenWith(options), "{\"ticks\":225000,\"time\":\"00:00:05.000\",\"interface\":"
                                    "\"control\",\"callback\":\"Paused\",\"arguments\":{}}\n");
}

TEST(DeskOutput, WritesTagsInJson)
{
    OutputOptions options;
    options.format = "json";
    options.callbacks = "Paused";
    options.tags = {"firmware=2.1", "device=box 7"};
    EXPECT_EQ(
        WrittenWith(options),
        "{\"ticks\":225000,\"time\":\"00:00:05.000\",\"interface\":\"control\",\"callback\":"
        "\"Paused\",\"arguments\":{},\"tags\":{\"device\":\"box 7\",\"firmware\":\"2.1\"}}\n");
}

TEST(DeskOutput, CompletesATrace)
{
    OutputOptions options;
    options.format = "trace";

    const std::string trace = WrittenWith(options);

    EXPECT_EQ(trace.front(), '[');
    EXPECT_EQ(trace.substr(trace.size() - 3), "\n]\n");
}

TEST(DeskOutput, ColoursText)
{
    OutputOptions options;
    options.callbacks = "Paused";
    options.coloured = true;
    EXPECT_NE(WrittenWith(options).find('\x1B'), std::string::npos);
}

TEST(DeskOutput, RefusesUnknownWords)
{
    Desk desk(SampleDisc, 2);
    std::ostringstream stream;
    const auto errorOf = [&desk, &stream](const OutputOptions& options) {
        try {
            const DeskOutput output(desk, stream, options);
        } catch (const std::invalid_argument& error) {
            return std::string(error.what());
        }
        return std::string("no error");
    };
    OutputOptions format;
    format.format = "xml";
    EXPECT_EQ(errorOf(format).rfind("'xml' is not an output format", 0), 0U) << errorOf(format);
    format.format = "html";
    EXPECT_EQ(errorOf(format), "only bdmv-deskplayer writes html; expected text, json or trace");
    OutputOptions callbacks;
    callbacks.callbacks = "Pause";
    EXPECT_EQ(errorOf(callbacks), "'Pause' is not a callback; did you mean Paused?");
    OutputOptions interfaces;
    interfaces.interfaces = "settngs";
    EXPECT_EQ(errorOf(interfaces), "'settngs' is not a listener interface; did you mean settings?");
}

TEST(DeskOutput, EndsWithTheObject)
{
    Desk desk(SampleDisc, 2);
    std::ostringstream stream;
    {
        const DeskOutput output(desk, stream);
    }
    PlayFromStartToEnd(desk);
    EXPECT_EQ(stream.str(), "");
}

} // namespace

} // namespace deskplayer
