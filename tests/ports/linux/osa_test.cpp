// Atomic addition and Assert().
#include <algorithm>
#include <cstdint>
#include <limits>
#include <thread>
#include <vector>

#include "kevro/kevro_osa.h"
#include "porttesting.h"

namespace
{

TEST(AtomicAdd, ReturnsTheValueAfterTheAddition)
{
    KEVRO_Int32 counter = 5;
    EXPECT_EQ(KEVRO_Osa_TaskAtomicAdd(&counter, 3), 8);
    EXPECT_EQ(KEVRO_Osa_TaskAtomicAdd(&counter, -10), -2);
    EXPECT_EQ(KEVRO_Osa_TaskAtomicAdd(&counter, 0), -2);
    EXPECT_EQ(counter, -2);
}

TEST(AtomicAdd, WrapsAround)
{
    KEVRO_Int32 counter = std::numeric_limits<KEVRO_Int32>::max();
    EXPECT_EQ(KEVRO_Osa_TaskAtomicAdd(&counter, 1), std::numeric_limits<KEVRO_Int32>::min());
}

TEST(AtomicAdd, GivesEachThreadADistinctValue)
{
    constexpr int ThreadCount = 2;
    constexpr int Additions = 100000;
    KEVRO_Int32 counter = 0;
    std::vector<std::vector<KEVRO_Int32>> seen(ThreadCount);
    porttesting::StartLine startLine(ThreadCount);
    std::vector<std::thread> threads;
    for (auto& values : seen) {
        values.reserve(Additions);
        threads.emplace_back([&counter, &values, &startLine] {
            startLine.Wait();
            for (int i = 0; i < Additions; ++i) {
                values.push_back(KEVRO_Osa_TaskAtomicAdd(&counter, 1));
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }

    std::vector<KEVRO_Int32> all;
    for (const auto& values : seen) {
        all.insert(all.end(), values.begin(), values.end());
    }
    std::sort(all.begin(), all.end());
    for (int i = 0; i < ThreadCount * Additions; ++i) {
        ASSERT_EQ(all[static_cast<std::size_t>(i)], i + 1);
    }
}

TEST(AtomicAdd, PublishesWhatWasWrittenBefore)
{
    for (int round = 0; round < 500; ++round) {
        int first = 0;
        int second = 0;
        int sum = 0;
        KEVRO_Int32 left = 2;
        const auto work = [&](int& own) {
            own = 1;
            if (KEVRO_Osa_TaskAtomicAdd(&left, -1) == 0) {
                sum = first + second;
            }
        };
        std::thread one(work, std::ref(first));
        std::thread other(work, std::ref(second));
        one.join();
        other.join();
        ASSERT_EQ(sum, 2);
    }
}

class AssertReport : public porttesting::LogFileTest
{
};

TEST_F(AssertReport, IsAFatalLineOfTheCommonComponent)
{
    Assert("count < 3", "bdmv/some.cpp", 885);
    const auto lines = porttesting::ReadLines(m_LogFile);
    ASSERT_EQ(lines.size(), 1U);
    EXPECT_EQ(porttesting::WithoutTime(lines[0]),
              "Common Fatal: Assertion failed: count < 3 (bdmv/some.cpp:885)");
}

TEST_F(AssertReport, IsWrittenWhateverTheSwitch)
{
    ASSERT_TRUE(KEVRO_Log_Configure("", nullptr, 0));
    Assert("count < 3", "bdmv/some.cpp", 885);
    EXPECT_EQ(porttesting::ReadLines(m_LogFile).size(), 1U);
    EXPECT_TRUE(KEVRO_Log_Configure("*=Exception|Warning|Fatal", nullptr, 0));
}

} // namespace
