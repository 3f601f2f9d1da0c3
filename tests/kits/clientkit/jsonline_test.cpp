#include "clientkit/jsonline.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

#include "bd/constants.h"
#include "kits/clientkit/everycallback.h"
#include "samplecallbacks.h"
#include "testkit/allocationcounter.h"
#include "testkit/fakeplatform.h"
#include "testkit/operatornew.h"

namespace bdmvtest
{
namespace
{

using namespace bdmv::callbacks;

void AppendPiece(void* pieces, const char* bytes, std::size_t size)
{
    static_cast<std::vector<std::string>*>(pieces)->emplace_back(bytes, size);
}

void Count(void* total, const char* /*bytes*/, std::size_t size)
{
    *static_cast<std::size_t*>(total) += size;
}

std::vector<std::string> PiecesOf(bd::UInt64 ticks, const bdmv::Callback& callback)
{
    std::vector<std::string> pieces;
    bdmv::WriteJsonLine(ticks, callback, AppendPiece, &pieces);
    return pieces;
}

std::string LineOf(bd::UInt64 ticks, const bdmv::Callback& callback)
{
    std::string line;
    for (const std::string& piece : PiecesOf(ticks, callback)) {
        line += piece;
    }
    return line;
}

std::string ArgumentsOf(const bdmv::Callback& callback)
{
    const std::string line = LineOf(0, callback);
    const std::size_t begin = line.find("\"arguments\":") + 12;
    return line.substr(begin, line.size() - begin - 2);
}

std::string TimeOf(bd::UInt64 ticks)
{
    const std::string line = LineOf(ticks, Paused{});
    const std::size_t begin = line.find("\"time\":\"") + 8;
    return line.substr(begin, line.find('"', begin) - begin);
}

TEST(JsonLine, HasMembersInAFixedOrderAndALineEnd)
{
    EXPECT_EQ(LineOf(1237500, Paused{}),
              R"({"ticks":1237500,"time":"00:00:27.500","interface":"control",)"
              R"("callback":"Paused","arguments":{}})"
              "\n");
}

TEST(JsonLine, NamesTheInterfaceThatDeclaresTheCallback)
{
    EXPECT_NE(LineOf(0, AngleInfo{1}).find(R"("interface":"settings")"), std::string::npos);
    EXPECT_NE(LineOf(0, ExecuteButton{}).find(R"("interface":"button")"), std::string::npos);
    EXPECT_NE(LineOf(0, PopUpMenuAvailable{}).find(R"("interface":"interactive")"),
              std::string::npos);
}

TEST(JsonLine, TruncatesTimesToMilliseconds)
{
    EXPECT_EQ(TimeOf(0), "00:00:00.000");
    EXPECT_EQ(TimeOf(44), "00:00:00.000");
    EXPECT_EQ(TimeOf(45), "00:00:00.001");
    EXPECT_EQ(TimeOf(45000ULL * 3599 + 44999), "00:59:59.999");
    EXPECT_EQ(TimeOf(45000ULL * 3600), "01:00:00.000");
}

TEST(JsonLine, WritesAsManyHoursAsThereAre)
{
    EXPECT_EQ(TimeOf(45000ULL * 3600 * 100), "100:00:00.000");
    EXPECT_EQ(TimeOf(0xFFFFFFFFFFFFFFFFULL), "113868790578:27:14.480");
}

TEST(JsonLine, WritesNumbersExactly)
{
    EXPECT_EQ(ArgumentsOf(Playlist{0}), R"({"playListId":0})");
    EXPECT_EQ(ArgumentsOf(Playlist{4294967295}), R"({"playListId":4294967295})");
    EXPECT_EQ(LineOf(0xFFFFFFFFFFFFFFFFULL, Paused{}).substr(0, 30),
              "{\"ticks\":18446744073709551615,");
}

TEST(JsonLine, SeparatesArguments)
{
    EXPECT_EQ(ArgumentsOf(PresentationGraphicsInfo{3, false}), R"({"number":3,"available":false})");
    EXPECT_EQ(ArgumentsOf(PresentationGraphicsInfo{3, true}), R"({"number":3,"available":true})");
}

TEST(JsonLine, WritesPositionsAsNumbersOrNull)
{
    EXPECT_EQ(ArgumentsOf(CurrentTimePosition{0xFFFFFFFFFFFFFFFEULL}),
              R"({"position":18446744073709551614})");
    EXPECT_EQ(ArgumentsOf(CurrentTimePosition{bd::TimePositionNone}), R"({"position":null})");
}

TEST(JsonLine, WritesEnumeratorsByName)
{
    EXPECT_EQ(ArgumentsOf(PlayMode{bd::PlayDirectionBackward, bd::PlaySpeedFast2}),
              R"({"direction":"Backward","speed":"Fast2"})");
}

TEST(JsonLine, WritesValuesWithoutANameAsNumbersInQuotes)
{
    EXPECT_EQ(ArgumentsOf(PlayMode{static_cast<bd::PlayDirectionDef>(99),
                                   static_cast<bd::PlaySpeedDef>(-2147483647 - 1)}),
              R"({"direction":"99","speed":"-2147483648"})");
}

TEST(JsonLine, WritesMasksAsTheOperationsTheyForbid)
{
    EXPECT_EQ(ArgumentsOf(UOMask{bdmv::UOMaskTable()}), R"({"forbidden":[]})");
    EXPECT_EQ(ArgumentsOf(UOMask{bdmv::UOMaskTable(0x2100000000000000ULL)}),
              R"({"forbidden":["ChapterSearch","Stop"]})");
    EXPECT_EQ(ArgumentsOf(UOMask{bdmv::UOMaskTable(1)}), R"({"forbidden":["63"]})");
}

TEST(JsonLine, WritesMasksUnderTheDebugOverride)
{
    g_u1Bduopmask = 1;
    const std::string permitted = ArgumentsOf(UOMask{bdmv::UOMaskTable(0x2100000000000000ULL)});
    g_u1Bduopmask = 2;
    const std::string forbidden = ArgumentsOf(UOMask{bdmv::UOMaskTable()});
    g_u1Bduopmask = 0;

    EXPECT_EQ(permitted, R"({"forbidden":[]})");
    EXPECT_EQ(forbidden, ArgumentsOf(UOMask{bdmv::UOMaskTable(0xFFFFFFFFFFFFFFFFULL)}));
}

TEST(JsonLine, WritesRectanglesAsObjects)
{
    EXPECT_EQ(ArgumentsOf(ZoomModeSet{{{1, 2, 3, 4}, {5, 6, 7, 65535}, 9}}),
              R"({"clip":{"x":1,"y":2,"width":3,"height":4},)"
              R"("destination":{"x":5,"y":6,"width":7,"height":65535},"delay":9})");
}

TEST(JsonLine, WritesBytesInHexadecimal)
{
    const bd::UInt8 data[] = {0x00, 0xA5, 0xFF};

    EXPECT_EQ(ArgumentsOf(SystemSuspended{data, 3}), R"({"data":"00a5ff","size":3})");
}

TEST(JsonLine, WritesNoBytesForANullPointer)
{
    EXPECT_EQ(ArgumentsOf(SystemSuspended{nullptr, 0}), R"({"data":"","size":0})");
    EXPECT_EQ(ArgumentsOf(SystemSuspended{nullptr, 5}), R"({"data":"","size":5})");
}

TEST(JsonLine, WritesProgramsAsTheNumberOfTheirCommands)
{
    const bdmv::IProgramData::RefPtr program(new ProgramOfCommands(65535));

    EXPECT_EQ(ArgumentsOf(ExecuteButton{1, 2, program}),
              R"({"ticket":1,"buttonId":2,"commands":65535})");
    EXPECT_EQ(ArgumentsOf(ExecuteButton{1, 2, bdmv::IProgramData::RefPtr()}),
              R"({"ticket":1,"buttonId":2,"commands":0})");
}

TEST(JsonLine, WritesGapsAsObjectsOfAnotherKind)
{
    std::vector<std::string> pieces;
    bdmv::JsonLine(AppendPiece, &pieces).Gap(45000, 0xFFFFFFFFFFFFFFFFULL, "reason");

    EXPECT_EQ(pieces, std::vector<std::string>{
                          R"({"ticks":45000,"gap":{"lost":18446744073709551615,"cause":"reason"}})"
                          "\n"});
}

TEST(JsonLine, WritesGapsWithoutANumberThatIsUnknown)
{
    std::vector<std::string> pieces;
    bdmv::JsonLine(AppendPiece, &pieces).Gap(45000, "reason");

    EXPECT_EQ(pieces, std::vector<std::string>{R"({"ticks":45000,"gap":{"cause":"reason"}})"
                                               "\n"});
}

TEST(JsonLine, IsOnePieceUpTo512Bytes)
{
    const std::vector<bd::UInt8> block(512);
    const std::size_t others = LineOf(0, SystemSuspended{block.data(), 100}).size() - 200;
    const bd::UInt32 fitting = static_cast<bd::UInt32>((512 - others) / 2);

    EXPECT_EQ(PiecesOf(0, SystemSuspended{block.data(), fitting}).size(), 1u);
    EXPECT_EQ(PiecesOf(0, SystemSuspended{block.data(), fitting + 1}).size(), 2u);
}

TEST(JsonLine, KeepsEveryByteOfLongLines)
{
    std::vector<bd::UInt8> block;
    std::string digits;
    for (int i = 0; i < 1000; ++i) {
        block.push_back(static_cast<bd::UInt8>(i % 10 * 0x11));
        digits += std::string(2, static_cast<char>('0' + i % 10));
    }

    EXPECT_EQ(ArgumentsOf(SystemSuspended{block.data(), 1000}),
              R"({"data":")" + digits + R"(","size":1000})");
}

TEST(JsonLine, AllocatesNothing)
{
    const std::vector<bdmv::Callback> callbacks = SampleCallbacks();
    std::size_t total = 0;
    const std::size_t before = CountAllocations();
    for (const bdmv::Callback& callback : callbacks) {
        bdmv::WriteJsonLine(1, callback, Count, &total);
    }
    EXPECT_EQ(CountAllocations(), before);
    EXPECT_GT(total, 0u);
}

TEST(JsonLine, PassesOnWhatTheSinkThrows)
{
    const auto fail = [](void*, const char*, std::size_t) { throw std::runtime_error("full"); };

    EXPECT_THROW(bdmv::WriteJsonLine(1, Paused{}, fail, nullptr), std::runtime_error);
}

} // namespace
} // namespace bdmvtest
