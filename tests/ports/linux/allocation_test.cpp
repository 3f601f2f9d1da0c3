// The heap allocations of log lines, and what happens when an allocation fails.
#include <string>

#include "porttesting.h"
#include "testkit/allocationcounter.h"
#include "testkit/operatornew.h"

namespace
{

using porttesting::ReadLines;
using porttesting::TextOf;

class LogAllocation : public porttesting::LogFileTest
{
};

/** The heap allocations of a line of the calling thread, after earlier lines. */
std::size_t AllocationsOfALine(const std::string& text)
{
    porttesting::EventLogger().Log("%s", text.c_str());
    porttesting::EventLogger().Log("%s", text.c_str());
    const std::size_t before = bdmvtest::CountAllocations();
    porttesting::EventLogger().Log("%s", text.c_str());
    return bdmvtest::CountAllocations() - before;
}

TEST_F(LogAllocation, DoesNotOccurForALineOfTwoHundredBytes)
{
    EXPECT_EQ(AllocationsOfALine(std::string(200, 'x')), 0U);
}

TEST_F(LogAllocation, DoesNotOccurForAQueuedLineOfTwoHundredBytes)
{
    porttesting::ConfigureSink("file:" + m_LogFile + ",queue=2");
    EXPECT_EQ(AllocationsOfALine(std::string(200, 'x')), 0U);
}

TEST_F(LogAllocation, DoesNotOccurWithAClockOfTheProgram)
{
    KEVRO_Log_SetClock([](void*) { return KEVRO_UInt64{0}; }, nullptr);
    EXPECT_EQ(AllocationsOfALine(std::string(200, 'x')), 0U);
    porttesting::ConfigureSink("file:" + m_LogFile + ",queue=2");
    EXPECT_EQ(AllocationsOfALine(std::string(200, 'x')), 0U);
    KEVRO_Log_SetClock(nullptr, nullptr);
}

TEST_F(LogAllocation, DoesNotOccurWhenTheQueueDropsLines)
{
    porttesting::ConfigureSink("file:" + m_LogFile + ",queue=1");
    const std::string text(200, 'x');
    const std::size_t before = bdmvtest::CountAllocations();
    for (int i = 0; i < 1000; ++i) {
        porttesting::EventLogger().Log("%s", text.c_str());
    }
    EXPECT_EQ(bdmvtest::CountAllocations() - before, 0U);
}

TEST_F(LogAllocation, OccursForEveryLongLineWhoseMemoryTheQueueReleases)
{
    porttesting::ConfigureSink("file:" + m_LogFile + ",queue=1");
    const std::string text(2000, 'x');
    for (int i = 0; i < 10; ++i) {
        const std::size_t before = bdmvtest::CountAllocations();
        porttesting::EventLogger().Log("%s", text.c_str());
        EXPECT_GT(bdmvtest::CountAllocations(), before);
        KEVRO_Log_Flush();
    }
}

TEST_F(LogAllocation, DoesNotOccurWhenTheSwitchIsChecked)
{
    const std::size_t before = bdmvtest::CountAllocations();
    KEVRO_Log_IsEnabled(bd::CompIdBdmvNavigator, KEVRO_Log_LevelEvent, 0);
    EXPECT_EQ(bdmvtest::CountAllocations() - before, 0U);
}

TEST_F(LogAllocation, LosesAndCountsALongLineWhenItFails)
{
    const std::string text(2000, 'x');
    for (const char* queue : {"", ",queue=10"}) {
        porttesting::ConfigureSink("file:" + m_LogFile + queue);
        bool complete = false;
        for (long succeeding = 0; !complete; ++succeeding) {
            const std::size_t linesBefore = ReadLines(m_LogFile).size();
            const KEVRO_UInt64 lostBefore = KEVRO_Log_GetDroppedLines();

            const bd::VargLogger logger = porttesting::EventLogger();
            bdmvtest::FailAllocationAfter(succeeding);
            bd::VargLogger(logger).Log("%s", text.c_str());
            bdmvtest::FailAllocationAfter(-1);
            KEVRO_Log_Flush();

            const auto lines = ReadLines(m_LogFile);
            complete = KEVRO_Log_GetDroppedLines() == lostBefore;
            EXPECT_EQ(lines.size(), linesBefore + 1);
            if (!complete) {
                EXPECT_EQ(KEVRO_Log_GetDroppedLines(), lostBefore + 1);
                EXPECT_EQ(TextOf(lines.back()), "lines lost: 1");
            } else {
                EXPECT_EQ(TextOf(lines.back()), text);
            }
            ASSERT_LT(succeeding, 20);
        }
    }
}

TEST_F(LogAllocation, RefusesAConfigurationWhenItFails)
{
    for (long succeeding = 0;; ++succeeding) {
        char message[100] = "";
        bdmvtest::FailAllocationAfter(succeeding);
        const bool taken =
            KEVRO_Log_Configure("Jpi=Event+hifreq|Info,*=Fatal", message, sizeof(message));
        bdmvtest::FailAllocationAfter(-1);
        EXPECT_EQ(KEVRO_Log_IsEnabled(bd::CompIdJpi, KEVRO_Log_LevelEvent, 1) != 0, taken);
        if (taken) {
            EXPECT_GT(succeeding, 0);
            break;
        }
        EXPECT_STRNE(message, "");
        ASSERT_LT(succeeding, 100);
    }
    EXPECT_TRUE(KEVRO_Log_Configure("*=Exception|Warning|Fatal", nullptr, 0));
}

TEST_F(LogAllocation, RefusesASinkWhenItFailsAndKeepsTheOldOne)
{
    const std::string other = m_Directory.Path("other");
    const std::string text = "file:" + other + ",queue=10";
    for (long succeeding = 0;; ++succeeding) {
        char message[100] = "";
        bdmvtest::FailAllocationAfter(succeeding);
        const bool taken = KEVRO_Log_ConfigureSink(text.c_str(), message, sizeof(message));
        bdmvtest::FailAllocationAfter(-1);
        const std::size_t linesBefore = ReadLines(m_LogFile).size();
        porttesting::EventLogger().Log("here");
        if (taken) {
            EXPECT_GT(succeeding, 0);
            EXPECT_EQ(ReadLines(m_LogFile).size(), linesBefore);
            break;
        }
        EXPECT_STRNE(message, "");
        EXPECT_EQ(ReadLines(m_LogFile).size(), linesBefore + 1);
        ASSERT_LT(succeeding, 200);
    }
}

} // namespace
