#include "output/jsonoutput.h"

#include <gtest/gtest.h>

#include <set>
#include <sstream>
#include <string>
#include <vector>

#include <nlohmann/json.hpp>

#include "kits/clientkit/everycallback.h"

namespace deskplayer
{
namespace
{

using nlohmann::json;

class JsonLines : public testing::Test
{
protected:
    /** The output, line by line. */
    std::vector<json> Lines() const
    {
        std::vector<json> lines;
        std::istringstream text(stream.str());
        for (std::string line; std::getline(text, line);) {
            lines.push_back(json::parse(line));
        }
        return lines;
    }

    json LastArguments() const { return Lines().back().at("arguments"); }

    std::ostringstream stream;
    VirtualClock clock;
    JsonOutput output{stream, clock, OutputFilter()};
    bdmv::INavigatorListener& listener = output;
};

TEST_F(JsonLines, WritesAnObjectPerLineWithMembersInAFixedOrder)
{
    clock.Advance(Ticks(45000 * 27 + 22500));

    listener.Paused();
    listener.AngleInfo(1);

    EXPECT_EQ(stream.str(), R"({"ticks":1237500,"time":"00:00:27.500","interface":"control",)"
                            R"("callback":"Paused","arguments":{}})"
                            "\n"
                            R"({"ticks":1237500,"time":"00:00:27.500","interface":"settings",)"
                            R"("callback":"AngleInfo","arguments":{"number":1}})"
                            "\n");
}

TEST_F(JsonLines, CanBeParsedForEveryCallback)
{
    bdmvtest::CallEveryCallback(listener);

    const std::vector<json> lines = Lines();
    const std::vector<bdmv::Callback> callbacks = bdmvtest::EveryCallback();
    ASSERT_EQ(lines.size(), callbacks.size());
    for (std::size_t i = 0; i < lines.size(); ++i) {
        const bdmv::CallbackId id = callbacks[i].Id();
        EXPECT_EQ(lines[i].at("callback"), NameOf(id));
        EXPECT_EQ(lines[i].at("interface"), NameOf(InterfaceOf(id))) << NameOf(id);

        std::set<std::string> expected;
        callbacks[i].VisitArguments(
            [&expected](const char* name, const auto&) { expected.insert(name); });
        const json& arguments = lines[i].at("arguments");
        ASSERT_TRUE(arguments.is_object()) << NameOf(id);
        std::set<std::string> written;
        for (const auto& argument : arguments.items()) {
            written.insert(argument.key());
        }
        EXPECT_EQ(written, expected) << NameOf(id);
    }
}

TEST_F(JsonLines, WritesNumbersAsNumbers)
{
    listener.Playlist(0xFFFFFFFF);

    EXPECT_EQ(LastArguments(), json({{"playListId", 4294967295}}));
}

TEST_F(JsonLines, WritesBooleansAsBooleans)
{
    listener.PresentationGraphicsInfo(3, false);

    EXPECT_EQ(LastArguments(), json({{"number", 3}, {"available", false}}));
}

TEST_F(JsonLines, WritesPositionsInTicks)
{
    listener.CurrentTimePosition(0xFFFFFFFFFFFFFFFEULL);

    EXPECT_EQ(LastArguments(), json({{"position", 0xFFFFFFFFFFFFFFFEULL}}));
}

TEST_F(JsonLines, WritesNoPositionAsNull)
{
    listener.MarkInfo(1, 2, 0xFFFFFFFFFFFFFFFFULL);

    EXPECT_EQ(LastArguments(), json({{"playListId", 1}, {"markId", 2}, {"time", nullptr}}));
}

TEST_F(JsonLines, WritesEnumerationsAsTheirNames)
{
    listener.PlayItem(800, 2, bd::VideoFormatType1080p, static_cast<bd::VideoAspectRatioType>(99));

    EXPECT_EQ(LastArguments().at("videoFormat"), "1080p");
    EXPECT_EQ(LastArguments().at("aspectRatio"), "99");
}

TEST_F(JsonLines, WritesMasksAsTheOperationsTheyForbid)
{
    listener.UOMask(bdmv::UOMaskTable(0x2100000000000000ULL));
    EXPECT_EQ(LastArguments(), json({{"forbidden", {"ChapterSearch", "Stop"}}}));

    listener.UOMask(bdmv::UOMaskTable());
    EXPECT_EQ(LastArguments(), json({{"forbidden", json::array()}}));

    listener.UOMask(bdmv::UOMaskTable(0x2000000000000000ULL));
    EXPECT_EQ(LastArguments(), json({{"forbidden", json::array({"ChapterSearch"})}}));
}

TEST_F(JsonLines, WritesBytesInHexadecimal)
{
    const bd::UInt8 data[] = {0x00, 0xA5, 0xFF};

    listener.SystemSuspended(data, 3);
    EXPECT_EQ(LastArguments(), json({{"data", "00a5ff"}, {"size", 3}}));

    listener.SystemSuspended(nullptr, 0);
    EXPECT_EQ(LastArguments(), json({{"data", ""}, {"size", 0}}));

    listener.SystemSuspended(nullptr, 3);
    EXPECT_EQ(LastArguments(), json({{"data", ""}, {"size", 3}}));
}

TEST_F(JsonLines, WritesRectanglesAsObjects)
{
    listener.ZoomModeSet({{1, 2, 3, 4}, {5, 6, 7, 8}, 9});

    EXPECT_EQ(LastArguments(), json::parse(R"({"clip":{"x":1,"y":2,"width":3,"height":4},
                              "destination":{"x":5,"y":6,"width":7,"height":8},"delay":9})"));
}

TEST_F(JsonLines, WritesNothingForAnEmptySession)
{
    EXPECT_EQ(stream.str(), "");
}

} // namespace
} // namespace deskplayer
