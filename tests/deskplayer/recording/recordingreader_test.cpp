#include "recording/recordingreader.h"

#include <gtest/gtest.h>

#include <fstream>
#include <random>

#include "bd/constants.h"
#include "keptrecords.h"
#include "kits/clientkit/everycallback.h"
#include "kits/clientkit/randomcallbacks.h"
#include "output/arguments.h"

namespace deskplayer
{
namespace
{

namespace callbacks = bdmv::callbacks;

/** Records as JSON lines. */
std::string LinesOf(const std::vector<CallbackRecord>& records)
{
    std::ostringstream stream;
    const VirtualClock clock;
    JsonOutput output(stream, clock, OutputFilter());
    RecordListener& listener = output;
    for (const CallbackRecord& record : records) {
        listener.OnRecord(record);
    }
    return stream.str();
}

/** The callback of a recording of one line. */
bdmv::Callback CallbackOf(const std::string& name, const std::string& arguments)
{
    return RecordsOf(R"({"ticks":0,"callback":")" + name + R"(","arguments":)" + arguments + "}")
        .callbacks.at(0)
        .callback;
}

TEST(RecordingReader, ReadsEveryCallback)
{
    std::vector<CallbackRecord> written;
    for (const bdmv::Callback& callback : bdmvtest::EveryCallback()) {
        written.push_back({Ticks(45000), callback, {}});
    }

    const KeptRecords read = RecordsOf(LinesOf(written));

    ASSERT_EQ(read.callbacks.size(), 56U);
    for (std::size_t i = 0; i < written.size(); ++i) {
        const bdmv::CallbackId id = written[i].callback.Id();
        EXPECT_EQ(read.callbacks[i].time, Ticks(45000));
        EXPECT_TRUE(read.callbacks[i].absent.none());
        if (id == bdmv::CallbackSystemSuspended || id == bdmv::CallbackExecuteButton) {
            EXPECT_EQ(read.callbacks[i].callback.Id(), id); // compared by address
        } else {
            EXPECT_EQ(read.callbacks[i].callback, written[i].callback) << NameOf(id);
        }
    }
}

TEST(RecordingReader, ReadsWhatIsWrittenAgainByteForByte)
{
    bdmvtest::RandomCallbacks random(1);
    std::mt19937_64 numbers(1);
    std::vector<CallbackRecord> records;
    for (int i = 0; i < 5000; ++i) {
        const std::uint64_t time = numbers() >> numbers() % 64;
        const ArgumentSet absent = numbers() % 2 == 0 ? ArgumentSet() : ArgumentSet(numbers());
        records.push_back({Ticks(time), random.Next(), absent});
    }

    const std::string lines = LinesOf(records);

    EXPECT_EQ(WrittenAgain(lines), lines);
}

TEST(RecordingReader, ReadsTheDumpOfABlackBoxByteForByte)
{
    std::ostringstream dump;
    dump << std::ifstream(BDMVNAVIGATOR_SAMPLE_DUMP, std::ios::binary).rdbuf();
    ASSERT_NE(dump.str().find("\"gap\""), std::string::npos);

    EXPECT_EQ(WrittenAgain(dump.str()), dump.str());
}

TEST(RecordingReader, ReadsGaps)
{
    const KeptRecords read =
        RecordsOf(R"({"ticks":7,"gap":{"lost":18446744073709551615,"cause":"capacity"}})"
                  "\n"
                  R"({"ticks":8,"gap":{"cause":"restart"}})"
                  "\n");

    ASSERT_EQ(read.gaps.size(), 2U);
    EXPECT_EQ(read.gaps[0].time, Ticks(7));
    EXPECT_EQ(read.gaps[0].lost, 18446744073709551615U);
    EXPECT_EQ(read.gaps[0].cause, "capacity");
    EXPECT_EQ(read.gaps[1].lost, std::nullopt);
}

TEST(RecordingReader, ReadsStarts)
{
    const std::string line = R"({"ticks":7,"start":{"wallClock":"2024-05-31 20:15:00.123456"}})"
                             "\n";
    const KeptRecords read = RecordsOf(line);

    ASSERT_EQ(read.starts.size(), 1U);
    EXPECT_EQ(read.starts[0].time, Ticks(7));
    EXPECT_EQ(read.starts[0].wallClock, "2024-05-31 20:15:00.123456");
    EXPECT_EQ(WrittenAgain(line), line);
}

TEST(RecordingReader, ReadsNumbersOf64BitsExactly)
{
    const KeptRecords read =
        RecordsOf(R"({"ticks":18446744073709551615,"callback":"CurrentTimePosition",)"
                  R"("arguments":{"position":18446744073709551614}})");

    EXPECT_EQ(read.callbacks.at(0).time.count(), 18446744073709551615U);
    EXPECT_EQ(read.callbacks.at(0).callback,
              bdmv::Callback(callbacks::CurrentTimePosition{18446744073709551614U}));
}

TEST(RecordingReader, GivesAbsentArgumentsNeutralValues)
{
    const KeptRecords read =
        RecordsOf(R"({"ticks":0,"callback":"MarkInfo","arguments":{"playListId":800}})");

    EXPECT_EQ(read.callbacks.at(0).absent, ArgumentSet(0b110));
    EXPECT_EQ(read.callbacks.at(0).callback,
              bdmv::Callback(callbacks::MarkInfo{800, 0, bd::TimePositionNone}));
}

TEST(RecordingReader, ReadsMasksWithOperationsThatHaveNoName)
{
    EXPECT_EQ(CallbackOf("UOMask", R"({"forbidden":["63","ChapterSearch","Stop"]})"),
              bdmv::Callback(callbacks::UOMask{bdmv::UOMaskTable(0x2100000000000001ULL)}));
}

TEST(RecordingReader, ReadsProgramsWithTheirNumberOfCommands)
{
    const bdmv::Callback callback =
        CallbackOf("ExecuteButton", R"({"ticket":1,"buttonId":2,"commands":3})");

    const auto& program = *callback.As<callbacks::ExecuteButton>()->program;
    EXPECT_EQ(program.GetNumberOfNavigationCommands(), 3);
    ASSERT_NE(program.GetNavigationCommandData(2), nullptr);
    EXPECT_EQ(program.GetNavigationCommandData(2)->GetCommand(),
              bdmv::INavigationCommandData::CommandNop);
    EXPECT_EQ(program.GetNavigationCommandData(3), nullptr);
}

TEST(RecordingReader, GivesAnAbsentProgramNoCommands)
{
    const bdmv::Callback callback = CallbackOf("ExecuteButton", "{}");

    EXPECT_EQ(callback.As<callbacks::ExecuteButton>()->program->GetNumberOfNavigationCommands(), 0);
}

/** Compares the block of one callback while it lasts. */
struct BlockExpectation : RecordListener {
    std::string expected; ///< in hexadecimal
    bd::UInt32 size = 0;
    std::optional<bd::UInt32> knownBytes;

    void OnRecord(const CallbackRecord& record) override
    {
        const auto& suspended = *record.callback.As<callbacks::SystemSuspended>();
        EXPECT_EQ(HexOf({suspended.data, knownBytes.value_or(size)}), expected);
        EXPECT_EQ(suspended.size, size);
        EXPECT_EQ(record.knownBytes, knownBytes);
    }

    void OnGap(const GapRecord& /*gap*/) override {}
    void OnStart(const StartRecord& /*start*/) override {}
};

TEST(RecordingReader, ReadsBlocks)
{
    BlockExpectation block;
    block.expected = "00a5ff";
    block.size = 3;
    ReadAll(R"({"ticks":0,"callback":"SystemSuspended","arguments":{"data":"00a5ff","size":3}})",
            block);
    ReadAll(R"({"ticks":0,"callback":"SystemSuspended","arguments":{"data":"00a5ff"}})", block);
}

TEST(RecordingReader, KeepsTheSizeOfABlockThatIsKnownInPart)
{
    BlockExpectation block;
    block.expected = "00a5";
    block.size = 3;
    block.knownBytes = 2;
    ReadAll(R"({"ticks":0,"callback":"SystemSuspended","arguments":{"data":"00a5","size":3}})",
            block);
}

TEST(RecordingReader, ReadsMembersInAnyOrderAndIgnoresUnknownOnes)
{
    const std::string line = R"({"arguments":{"number":2},"mood":{"viewer":["a"]},)"
                             R"( "callback":"AngleInfo", "ticks":9 })";

    EXPECT_EQ(WrittenAgain(line), R"({"ticks":9,"time":"00:00:00.000","interface":"settings",)"
                                  R"("callback":"AngleInfo","arguments":{"number":2}})"
                                  "\n");
}

TEST(RecordingReader, NeedsNoEndOfTheLastLine)
{
    EXPECT_EQ(RecordsOf("").callbacks.size(), 0U);
    EXPECT_EQ(RecordsOf("{\"ticks\":1,\"callback\":\"Paused\",\"arguments\":{}}\r\n"
                        "{\"ticks\":1,\"callback\":\"Paused\",\"arguments\":{}}")
                  .callbacks.size(),
              2U);
}

TEST(RecordingReader, ReadsLinesOfAnyLength)
{
    const std::string line = R"({"ticks":1,"callback":"Paused","arguments":{}})";
    std::string text;
    for (std::size_t size = 4080; size < 4110; ++size) {
        text += line + std::string(size - line.size(), ' ') + "\n";
    }

    EXPECT_EQ(RecordsOf(text).callbacks.size(), 30U);
}

TEST(RecordingReader, ReadsTheLongestLine)
{
    std::string line = R"({"ticks":1,"callback":"Paused","arguments":{}})";
    line += std::string(LongestRecordLine - line.size(), ' ');

    EXPECT_EQ(RecordsOf(line + "\n" + line).callbacks.size(), 2U);
}

TEST(RecordingReader, KnowsThePlaceOfTheLastRecord)
{
    std::istringstream stream(R"({"ticks":1,"callback":"Paused","arguments":{}})"
                              "\n"
                              R"({"ticks":8,"gap":{"cause":"restart"}})"
                              "\n");
    RecordingReader reader(stream, "a\nb");
    KeptRecords records;

    reader.Next(records);
    EXPECT_EQ(reader.Place(), "a\\x0Ab:1");
    reader.Next(records);
    EXPECT_EQ(reader.Place(), "a\\x0Ab:2");
}

} // namespace
} // namespace deskplayer
