// The clock that a program sets for its lines.
#include <atomic>
#include <string>
#include <thread>

#include "porttesting.h"

namespace
{

using porttesting::ConfigureSink;
using porttesting::EventLogger;
using porttesting::ReadLines;

KEVRO_UInt64 ValueOf(void* user)
{
    return *static_cast<KEVRO_UInt64*>(user);
}

class LogClock : public porttesting::LogFileTest
{
protected:
    ~LogClock() override { KEVRO_Log_SetClock(nullptr, nullptr); }

    std::string LastLine() const
    {
        KEVRO_Log_Flush();
        const auto lines = ReadLines(m_LogFile);
        return lines.empty() ? "" : lines.back();
    }

    KEVRO_UInt64 m_Microseconds = 0;
};

TEST_F(LogClock, ReplacesTheDateAndTimeByTheTimeOfTheProgram)
{
    KEVRO_Log_SetClock(ValueOf, &m_Microseconds);
    EventLogger().Log("at the start");
    EXPECT_EQ(LastLine(), "00:00:00.000000 BdmvNavigator Event: at the start");

    m_Microseconds = (((3 * 60) + 25) * 60 + 45) * 1000000ULL + 22;
    EventLogger().Log("later");
    EXPECT_EQ(LastLine(), "03:25:45.000022 BdmvNavigator Event: later");

    m_Microseconds = 1000 * 3600 * 1000000ULL;
    EventLogger().Log("much later");
    EXPECT_EQ(LastLine(), "1000:00:00.000000 BdmvNavigator Event: much later");
}

TEST_F(LogClock, ShowsNoMoreThanTwoHundredAndNinetyTwoYears)
{
    m_Microseconds = ~KEVRO_UInt64{0};
    KEVRO_Log_SetClock(ValueOf, &m_Microseconds);
    EventLogger().Log("at the end");
    EXPECT_EQ(LastLine(), "2562047:47:16.854775 BdmvNavigator Event: at the end");
}

TEST_F(LogClock, KeepsTheTimeAtWhichAQueuedLineWasLogged)
{
    ConfigureSink("file:" + m_LogFile + ",queue=1000");
    KEVRO_Log_SetClock(ValueOf, &m_Microseconds);
    for (m_Microseconds = 0; m_Microseconds < 500; ++m_Microseconds) {
        EventLogger().Log("%llu", static_cast<unsigned long long>(m_Microseconds));
    }
    KEVRO_Log_SetClock(nullptr, nullptr);
    KEVRO_Log_Flush();

    const auto lines = ReadLines(m_LogFile);
    ASSERT_EQ(lines.size(), 500U);
    EXPECT_EQ(lines[0], "00:00:00.000000 BdmvNavigator Event: 0");
    EXPECT_EQ(lines[499], "00:00:00.000499 BdmvNavigator Event: 499");
}

TEST_F(LogClock, GivesWayToTheDateAndTimeWhenItIsRemoved)
{
    KEVRO_Log_SetClock(ValueOf, &m_Microseconds);
    KEVRO_Log_SetClock(nullptr, nullptr);
    EventLogger().Log("here");
    EXPECT_EQ(porttesting::WithoutTime(LastLine()), "BdmvNavigator Event: here");
}

TEST_F(LogClock, IsNotCalledOnceItIsRemoved)
{
    std::atomic<bool> ended{false};
    std::thread writer([&ended] {
        while (!ended) {
            EventLogger().Log("line");
        }
    });
    for (int round = 0; round < 200; ++round) {
        std::atomic<bool> alive{true};
        KEVRO_Log_SetClock(
            [](void* user) {
                std::this_thread::yield();
                EXPECT_TRUE(*static_cast<std::atomic<bool>*>(user));
                return KEVRO_UInt64{0};
            },
            &alive);
        std::this_thread::yield();
        KEVRO_Log_SetClock(nullptr, nullptr);
        alive = false;
    }
    ended = true;
    writer.join();
}

} // namespace
