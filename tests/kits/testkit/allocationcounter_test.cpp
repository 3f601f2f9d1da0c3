#include "testkit/allocationcounter.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <cstdint>
#include <limits>
#include <new>
#include <thread>

#include "sanitized.h"
#include "testkit/operatornew.h"

namespace
{

using bdmvtest::CountAllocations;
using bdmvtest::CountLiveBlocks;
using bdmvtest::FailAllocationAfter;
using bdmvtest::Sanitized;

constexpr std::align_val_t Alignment{256};

/** Whether the address is a multiple of Alignment. */
bool IsAligned(const void* block)
{
    return reinterpret_cast<std::uintptr_t>(block) % static_cast<std::size_t>(Alignment) == 0;
}

TEST(AllocationCounter, CountsAllocationsAndLiveBlocks)
{
    const std::size_t allocations = CountAllocations();
    const long blocks = CountLiveBlocks();
    void* const one = ::operator new(1);
    void* const several = ::operator new[](5);
    EXPECT_EQ(CountAllocations(), allocations + 2);
    EXPECT_EQ(CountLiveBlocks(), blocks + 2);
    ::operator delete(one);
    ::operator delete[](several);
    EXPECT_EQ(CountAllocations(), allocations + 2);
    EXPECT_EQ(CountLiveBlocks(), blocks);
}

TEST(AllocationCounter, CountsSizedDeletesAndIgnoresNull)
{
    const long blocks = CountLiveBlocks();
    ::operator delete (::operator new(1), std::size_t{1});
    ::operator delete[](::operator new[](1), std::size_t{1});
    ::operator delete(nullptr);
    EXPECT_EQ(CountLiveBlocks(), blocks);
}

// A sanitizer stops the program if a block of its own reaches our operator delete, or the reverse.

TEST(AllocationCounter, CountsAllocationsThatReportFailureAsNull)
{
    const std::size_t allocations = CountAllocations();
    const long blocks = CountLiveBlocks();
    void* const one = ::operator new(1, std::nothrow);
    void* const several = ::operator new[](5, std::nothrow);
    EXPECT_EQ(CountAllocations(), allocations + 2);
    EXPECT_EQ(CountLiveBlocks(), blocks + 2);
    ::operator delete(one, std::nothrow);
    ::operator delete[](several, std::nothrow);
    EXPECT_EQ(CountLiveBlocks(), blocks);
}

TEST(AllocationCounter, CountsAllocationsWithAnAlignment)
{
    const std::size_t allocations = CountAllocations();
    const long blocks = CountLiveBlocks();
    void* const one = ::operator new(1, Alignment);
    void* const several = ::operator new[](5, Alignment);
    EXPECT_EQ(CountAllocations(), allocations + 2);
    EXPECT_EQ(CountLiveBlocks(), blocks + 2);
    EXPECT_TRUE(IsAligned(one));
    EXPECT_TRUE(IsAligned(several));
    ::operator delete(one, Alignment);
    ::operator delete[](several, Alignment);
    EXPECT_EQ(CountLiveBlocks(), blocks);
}

TEST(AllocationCounter, CountsAllocationsWithAnAlignmentThatReportFailureAsNull)
{
    const std::size_t allocations = CountAllocations();
    const long blocks = CountLiveBlocks();
    void* const one = ::operator new(1, Alignment, std::nothrow);
    void* const several = ::operator new[](5, Alignment, std::nothrow);
    EXPECT_EQ(CountAllocations(), allocations + 2);
    EXPECT_EQ(CountLiveBlocks(), blocks + 2);
    EXPECT_TRUE(IsAligned(one));
    EXPECT_TRUE(IsAligned(several));
    ::operator delete(one, Alignment, std::nothrow);
    ::operator delete[](several, Alignment, std::nothrow);
    EXPECT_EQ(CountLiveBlocks(), blocks);
}

TEST(AllocationCounter, CountsSizedDeletesWithAnAlignment)
{
    const long blocks = CountLiveBlocks();
    ::operator delete (::operator new(1, Alignment), std::size_t{1}, Alignment);
    ::operator delete[](::operator new[](1, Alignment), std::size_t{1}, Alignment);
    EXPECT_EQ(CountLiveBlocks(), blocks);
}

TEST(AllocationCounter, AllocatesABlockOfNoBytes)
{
    void* const block = ::operator new(0);
    EXPECT_NE(block, nullptr);
    ::operator delete(block);
    void* const aligned = ::operator new(0, Alignment);
    EXPECT_NE(aligned, nullptr);
    ::operator delete(aligned, Alignment);
}

TEST(AllocationCounter, FailsTheChosenAllocationOnly)
{
    FailAllocationAfter(1);
    void* const first = ::operator new(1);
    EXPECT_THROW(::operator delete(::operator new(1)), std::bad_alloc);
    void* const third = ::operator new(1);
    ::operator delete(first);
    ::operator delete(third);
}

TEST(AllocationCounter, FailsAnAllocationInEveryForm)
{
    const long blocks = CountLiveBlocks();
    FailAllocationAfter(0);
    EXPECT_EQ(::operator new(1, std::nothrow), nullptr);
    FailAllocationAfter(0);
    EXPECT_EQ(::operator new(1, Alignment, std::nothrow), nullptr);
    FailAllocationAfter(0);
    EXPECT_THROW(::operator delete(::operator new(1, Alignment), Alignment), std::bad_alloc);
    EXPECT_EQ(CountLiveBlocks(), blocks);
}

TEST(AllocationCounter, ReportsThatTheHeapIsExhausted)
{
    if (Sanitized) {
        GTEST_SKIP() << "a sanitizer stops the program instead";
    }
    const long blocks = CountLiveBlocks();
    volatile std::size_t tooMuch = std::numeric_limits<std::size_t>::max() - 4096;
    EXPECT_THROW(::operator delete(::operator new(tooMuch)), std::bad_alloc);
    EXPECT_EQ(::operator new(tooMuch, std::nothrow), nullptr);
    EXPECT_EQ(::operator new(tooMuch, Alignment, std::nothrow), nullptr);
    EXPECT_EQ(CountLiveBlocks(), blocks);
}

TEST(AllocationCounter, CountsForEachThreadApart)
{
    std::size_t ofTheThread = 0;
    const std::size_t before = CountAllocations();
    std::thread thread([&ofTheThread] {
        const std::size_t start = CountAllocations();
        ::operator delete(::operator new(1));
        ofTheThread = CountAllocations() - start;
    });
    const std::size_t afterStart = CountAllocations();
    thread.join();
    EXPECT_EQ(ofTheThread, 1u);
    EXPECT_EQ(CountAllocations(), afterStart);
    EXPECT_GE(afterStart, before);
}

} // namespace
