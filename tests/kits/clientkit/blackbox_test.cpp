#include "clientkit/blackbox.h"

#include <gtest/gtest.h>

#include <limits>
#include <new>
#include <stdexcept>
#include <string>
#include <type_traits>
#include <vector>

#include "boxtest.h"
#include "kits/clientkit/everycallback.h"
#include "samplecallbacks.h"
#include "testkit/allocationcounter.h"
#include "testkit/fakeplatform.h"
#include "testkit/operatornew.h"

namespace bdmvtest
{
namespace
{

constexpr std::size_t Most = std::numeric_limits<std::size_t>::max();

class BlackBox : public BoxTest
{
};

static_assert(!std::is_copy_constructible<bdmv::BlackBox>::value, "not copied");
static_assert(!std::is_copy_assignable<bdmv::BlackBox>::value, "not assigned");

TEST_F(BlackBox, RefusesToKeepNoCallbacks)
{
    EXPECT_THROW(bdmv::BlackBox(0, Ticks), std::invalid_argument);
    EXPECT_THROW(bdmv::BlackBox(0, Ticks, 1), std::invalid_argument);
}

TEST_F(BlackBox, RefusesToHaveNoClock)
{
    EXPECT_THROW(bdmv::BlackBox(1, nullptr), std::invalid_argument);
}

TEST_F(BlackBox, RefusesMoreThanCanBeAddressed)
{
    EXPECT_THROW(bdmv::BlackBox(Most, Ticks), std::length_error);
    EXPECT_THROW(bdmv::BlackBox(3, Ticks, Most / 2), std::length_error);
    EXPECT_THROW(bdmv::BlackBox(1, Ticks, Most), std::length_error);
}

TEST_F(BlackBox, WritesNothingBeforeTheFirstCallback)
{
    EXPECT_EQ(DumpOf(bdmv::BlackBox(3, Ticks)), "");
}

TEST_F(BlackBox, WritesCallbacksOldestFirstWithTheirTimes)
{
    bdmv::BlackBox box(3, Ticks);
    Deliver(box, 1);
    Deliver(box, 2);

    EXPECT_EQ(DumpOf(box), LineOf(1) + LineOf(2));
}

TEST_F(BlackBox, WritesTheSameAgain)
{
    bdmv::BlackBox box(3, Ticks);
    Deliver(box, 1);
    const std::string first = DumpOf(box);

    EXPECT_EQ(DumpOf(box), first);
}

TEST_F(BlackBox, KeepsAsManyCallbacksAsItHasRoomForWithoutAGap)
{
    bdmv::BlackBox box(3, Ticks);
    Deliver(box, {1, 2, 3});

    EXPECT_EQ(DumpOf(box), LineOf(1) + LineOf(2) + LineOf(3));
}

TEST_F(BlackBox, BeginsWithAGapThatCountsWhatWasOverwrittenBefore)
{
    bdmv::BlackBox box(3, Ticks);
    Deliver(box, {1, 2, 3, 4});
    EXPECT_EQ(DumpOf(box), GapOf(1, "capacity", 2) + LineOf(2) + LineOf(3) + LineOf(4));

    Deliver(box, {5, 6, 7, 8});
    EXPECT_EQ(DumpOf(box), GapOf(5, "capacity", 6) + LineOf(6) + LineOf(7) + LineOf(8));
}

TEST_F(BlackBox, CanKeepASingleCallback)
{
    bdmv::BlackBox box(1, Ticks);
    Deliver(box, 1);
    EXPECT_EQ(DumpOf(box), LineOf(1));

    Deliver(box, 2);
    EXPECT_EQ(DumpOf(box), GapOf(1, "capacity", 2) + LineOf(2));
}

TEST_F(BlackBox, KeepsTheSizeOfABlockAndItsFirstBytes)
{
    bdmv::BlackBox box(4, Ticks, 2);
    bd::UInt8 block[] = {0x11, 0x22, 0x33};
    box.SystemSuspended(block, 3);
    box.SystemSuspended(block, 2);
    box.SystemSuspended(block, 1);
    box.SystemSuspended(block, 0);
    block[0] = 0;

    const std::string dump = DumpOf(box);
    EXPECT_NE(dump.find(R"("data":"1122","size":3)"), std::string::npos) << dump;
    EXPECT_NE(dump.find(R"("data":"1122","size":2)"), std::string::npos) << dump;
    EXPECT_NE(dump.find(R"("data":"11","size":1)"), std::string::npos) << dump;
    EXPECT_NE(dump.find(R"("data":"","size":0)"), std::string::npos) << dump;
}

TEST_F(BlackBox, KeepsNoBytesOfABlockUnlessAskedTo)
{
    bdmv::BlackBox box(4, Ticks);
    const bd::UInt8 block[] = {0x11};
    box.SystemSuspended(block, 1);

    EXPECT_NE(DumpOf(box).find(R"("data":"","size":1)"), std::string::npos);
}

TEST_F(BlackBox, ReadsNoBytesThroughANullPointer)
{
    bdmv::BlackBox box(4, Ticks, 16);
    box.SystemSuspended(nullptr, 5);

    EXPECT_NE(DumpOf(box).find(R"("data":"","size":5)"), std::string::npos);
}

TEST_F(BlackBox, KeepsEveryByteOfLongBlocks)
{
    std::vector<bd::UInt8> block;
    std::string digits;
    for (int i = 0; i < 1000; ++i) {
        block.push_back(static_cast<bd::UInt8>(i % 10 * 0x11));
        digits += std::string(2, static_cast<char>('0' + i % 10));
    }
    bdmv::BlackBox box(2, Ticks, 1000);
    box.SystemSuspended(block.data() + 1, 999);
    box.SystemSuspended(block.data(), 1000);

    const std::string dump = DumpOf(box);
    EXPECT_NE(dump.find("\"" + digits.substr(2) + "\",\"size\":999}"), std::string::npos);
    EXPECT_NE(dump.find("\"" + digits + "\",\"size\":1000}"), std::string::npos);
}

TEST_F(BlackBox, KeepsTheNumberOfCommandsButNotTheProgram)
{
    bdmv::BlackBox box(4, Ticks);
    bdmv::IProgramData::RefPtr program(new ProgramOfCommands(3));
    box.ExecuteButton(1, 2, program);
    EXPECT_TRUE(program.IsUnique());
    program.Release();
    box.ExecuteButton(3, 4, program);

    const std::string dump = DumpOf(box);
    EXPECT_NE(dump.find(R"({"ticket":1,"buttonId":2,"commands":3})"), std::string::npos) << dump;
    EXPECT_NE(dump.find(R"({"ticket":3,"buttonId":4,"commands":0})"), std::string::npos) << dump;
}

TEST_F(BlackBox, AllocatesOnlyWhenConstructed)
{
    struct Total {
        static void Add(void* total, const char* /*bytes*/, std::size_t size)
        {
            *static_cast<std::size_t*>(total) += size;
        }
    };
    const std::vector<bdmv::Callback> callbacks = SampleCallbacks();
    bdmv::BlackBox box(callbacks.size() / 2, Ticks, 2);
    std::size_t total = 0;

    const std::size_t before = CountAllocations();
    for (const bdmv::Callback& callback : callbacks) {
        bdmv::Deliver(callback, box);
    }
    box.Dump(Total::Add, &total);

    EXPECT_EQ(CountAllocations(), before);
    EXPECT_GT(total, 0u);
}

TEST_F(BlackBox, ReportsThatThereIsNotEnoughMemory)
{
    const long before = CountLiveBlocks();
    for (const long allocations : {0, 1}) {
        FailAllocationAfter(allocations);
        EXPECT_THROW(bdmv::BlackBox(2, Ticks, 2), std::bad_alloc);
        FailAllocationAfter(-1);
    }
    EXPECT_EQ(CountLiveBlocks(), before);
}

TEST_F(BlackBox, PassesOnWhatWriteThrowsAndStaysUsable)
{
    bdmv::BlackBox box(3, Ticks);
    Deliver(box, 1);
    const auto fail = [](void*, const char*, std::size_t) { throw std::runtime_error("full"); };

    EXPECT_THROW(box.Dump(fail, nullptr), std::runtime_error);

    Deliver(box, 2);
    EXPECT_EQ(DumpOf(box), LineOf(1) + LineOf(2));
}

TEST_F(BlackBox, DoesNotRecordACallbackWhoseTimeCannotBeRead)
{
    static bool isBroken = false;
    struct Clock {
        static std::uint64_t Ticks()
        {
            if (isBroken) {
                throw std::runtime_error("no clock");
            }
            return BoxTest::s_Ticks;
        }
    };
    bdmv::BlackBox box(3, Clock::Ticks);
    isBroken = true;
    EXPECT_THROW(Deliver(box, 1), std::runtime_error);
    isBroken = false;
    Deliver(box, 2);

    EXPECT_EQ(DumpOf(box), LineOf(2));
}

TEST_F(BlackBox, WritesMasksAsTheyAreReportedDuringTheDump)
{
    FakePlatform platform(nullptr);
    bdmv::BlackBox box(3, Ticks);
    box.UOMask(bdmv::UOMaskTable(0x2000000000000000ULL));
    EXPECT_NE(DumpOf(box).find(R"("forbidden":["ChapterSearch"])"), std::string::npos);

    g_u1Bduopmask = 1;
    EXPECT_NE(DumpOf(box).find(R"("forbidden":[])"), std::string::npos);
}

} // namespace
} // namespace bdmvtest
