#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
#include <string>

#include "bd/logging.h"
#include "testkit/allocationcounter.h"
#include "testkit/fakeplatform.h"
#include "testkit/operatornew.h"

extern "C" KEVRO_Bool IsEnabledFromC();
extern "C" void WriteFromC(int ignored, ...);

namespace
{

constexpr bd::LogTag Event = {bd::CompIdBdmvNavigator, KEVRO_Log_LevelEvent, 0};
constexpr bd::LogTag HiFreqWarning = {bd::CompIdReader, KEVRO_Log_LevelWarning, 1};

class Logging : public testing::Test
{
protected:
    void SwitchAnswers(KEVRO_Bool answer)
    {
        platform.SetLogSwitch([answer](KEVRO_UInt32, KEVRO_Int32, KEVRO_Bool) { return answer; });
    }

    /** An argument of a line that records its evaluation. */
    int Argument()
    {
        journal.Add("argument");
        return 7;
    }

    bdmvtest::Journal journal;
    bdmvtest::FakePlatform platform{&journal};
};

} // namespace

TEST_F(Logging, LoggerHoldsItsThreeValuesInOrder)
{
    const bd::VargLogger logger(57, KEVRO_Log_LevelWarning, 9);
    std::uint32_t words[3];
    ASSERT_EQ(sizeof(words), sizeof(logger));
    std::memcpy(words, &logger, sizeof(words));

    EXPECT_EQ(57u, words[0]);
    EXPECT_EQ(3u, words[1]);
    EXPECT_EQ(9u, words[2]);
}

TEST_F(Logging, LoggerHoldsTheSameLevelFromEitherEnumeration)
{
    const bd::VargLogger one(bd::CompIdBdmvNavigator, KEVRO_Log_LevelEvent, 0);
    const bd::VargLogger other(bd::CompIdBdmvNavigator, bd::LogEvent, 0);

    EXPECT_EQ(0, std::memcmp(&one, &other, sizeof(other)));
}

TEST_F(Logging, LoggerWritesAtAnyLevelOfItsOwnEnumeration)
{
    for (KEVRO_Int32 level = bd::LogMethod; level < bd::LogLevel__sizeof; ++level) {
        bd::VargLogger(57, static_cast<bd::LogLevelDef>(level), 0).Log("text");

        EXPECT_EQ("log 57 " + std::to_string(level) + " 0: text\n", journal.Take());
    }
}

TEST_F(Logging, SwitchReceivesTheSameLevelFromEitherEnumeration)
{
    const KEVRO_Log_Level platformLevel = KEVRO_Log_LevelEvent;
    const bd::LogLevelDef ownLevel = bd::LogEvent;

    KEVRO_Log_IsEnabled(57, 5, 0);
    KEVRO_Log_IsEnabled(bd::CompIdBdmvNavigator, bd::LogEvent, 0);
    KEVRO_Log_IsEnabled(bd::CompIdBdmvNavigator, KEVRO_Log_LevelEvent, 0);
    KEVRO_Log_IsEnabled(bd::CompIdBdmvNavigator, platformLevel, 0);
    KEVRO_Log_IsEnabled(bd::CompIdBdmvNavigator, ownLevel, 0);

    EXPECT_EQ("log? 57 5 0 -> on\n"
              "log? 57 5 0 -> on\n"
              "log? 57 5 0 -> on\n"
              "log? 57 5 0 -> on\n"
              "log? 57 5 0 -> on\n",
              journal.Take());
}

TEST_F(Logging, SwitchReceivesTheSameArgumentsFromC)
{
    EXPECT_EQ(1, IsEnabledFromC());

    EXPECT_EQ("log? 57 5 0 -> on\n"
              "log? 57 5 0 -> on\n"
              "log? 57 5 0 -> on\n",
              journal.Take());
}

TEST_F(Logging, LineFromCIsTheSame)
{
    WriteFromC(0, 7);

    EXPECT_EQ("log 57 5 0: number 7\n"
              "log 57 5 0: number 7\n",
              journal.Take());
}

TEST_F(Logging, SwitchReceivesAnyNumber)
{
    KEVRO_Log_IsEnabled(57, bd::LogHighFrequency, 0);
    KEVRO_Log_IsEnabled(57, INT32_MIN, 0);

    EXPECT_EQ("log? 57 16 0 -> on\n"
              "log? 57 -2147483648 0 -> on\n",
              journal.Take());
}

TEST_F(Logging, ConstructingAndDestroyingALoggerCallsNothing)
{
    {
        const bd::VargLogger logger(57, KEVRO_Log_LevelEvent, 0);
    }

    EXPECT_EQ("", journal.Take());
}

TEST_F(Logging, LoggerWritesUnderItsThreeValues)
{
    bd::VargLogger(53, KEVRO_Log_LevelWarning, 1).Log("text");

    EXPECT_EQ("log 53 3 1: text\n", journal.Take());
}

TEST_F(Logging, LoggerFormatsItsArguments)
{
    bd::VargLogger(57, KEVRO_Log_LevelEvent, 0)
        .Log("%d %u %lu %llu %s", -1, 2u, 4000000000ul, 18446744073709551615ull, "TRUE");

    EXPECT_EQ("log 57 5 0: -1 2 4000000000 18446744073709551615 TRUE\n", journal.Take());
}

TEST_F(Logging, LoggerWritesOneLinePerCall)
{
    bd::VargLogger logger(57, KEVRO_Log_LevelEvent, 0);
    logger.Log("first %d", 1);
    logger.Log("second %d", 2);

    EXPECT_EQ("log 57 5 0: first 1\n"
              "log 57 5 0: second 2\n",
              journal.Take());
}

TEST_F(Logging, LoggerDoesNotCheckTheSwitch)
{
    SwitchAnswers(0);
    bd::VargLogger(57, KEVRO_Log_LevelEvent, 0).Log("text");

    EXPECT_EQ("log 57 5 0: text\n", journal.Take());
}

TEST_F(Logging, LineIsCheckedAndWrittenOnceWhenOn)
{
    BD_LOG(Event, "text");

    EXPECT_EQ("log? 57 5 0 -> on\n"
              "log 57 5 0: text\n",
              journal.Take());
}

TEST_F(Logging, LineIsCheckedAndWrittenUnderTheSameTag)
{
    BD_LOG(HiFreqWarning, "text");

    EXPECT_EQ("log? 53 3 1 -> on\n"
              "log 53 3 1: text\n",
              journal.Take());
}

TEST_F(Logging, TagTakesItsLevelFromEitherEnumeration)
{
    constexpr bd::LogTag tag = {bd::CompIdBdmvNavigator, bd::LogWarning, 0};
    constexpr bd::LogTag platformTag = {bd::CompIdBdmvNavigator, KEVRO_Log_LevelWarning, 0};
    BD_LOG(tag, "text");
    BD_LOG(platformTag, "text");

    EXPECT_EQ("log? 57 3 0 -> on\n"
              "log 57 3 0: text\n"
              "log? 57 3 0 -> on\n"
              "log 57 3 0: text\n",
              journal.Take());
}

TEST_F(Logging, LineCallsNothingButTheSwitchWhenOff)
{
    SwitchAnswers(0);
    BD_LOG(Event, "text");

    EXPECT_EQ("log? 57 5 0 -> off\n", journal.Take());
}

TEST_F(Logging, ArgumentsAreEvaluatedOnceAndAfterTheSwitchWhenOn)
{
    BD_LOG(Event, "text %d", Argument());

    EXPECT_EQ("log? 57 5 0 -> on\n"
              "argument\n"
              "log 57 5 0: text 7\n",
              journal.Take());
}

TEST_F(Logging, ArgumentsAreNotEvaluatedWhenOff)
{
    SwitchAnswers(0);
    BD_LOG(Event, "text %d", Argument());

    EXPECT_EQ("log? 57 5 0 -> off\n", journal.Take());
}

TEST_F(Logging, AnyNonZeroAnswerIsOn)
{
    for (const KEVRO_Bool answer : {1, 2, 256, 65536, INT32_MAX, -1, INT32_MIN}) {
        SwitchAnswers(answer);
        BD_LOG(Event, "text");

        EXPECT_EQ("log? 57 5 0 -> on\n"
                  "log 57 5 0: text\n",
                  journal.Take())
            << "answer " << answer;
    }
}

TEST_F(Logging, LineIsOneStatement)
{
    if (journal.Take() != "")
        BD_LOG(Event, "not reached");
    else
        BD_LOG(Event, "reached");

    EXPECT_EQ("log? 57 5 0 -> on\n"
              "log 57 5 0: reached\n",
              journal.Take());
}

TEST(LoggingMemory, LineAllocatesNothing)
{
    int lines = 0;
    bdmvtest::FakePlatform platform(nullptr);
    platform.SetLogSwitch([&lines](KEVRO_UInt32, KEVRO_Int32, KEVRO_Bool) -> KEVRO_Bool {
        ++lines;
        return lines % 2;
    });

    const std::size_t before = bdmvtest::CountAllocations();
    BD_LOG(Event, "on %d", 1);
    BD_LOG(Event, "off %d", 2);
    const std::size_t after = bdmvtest::CountAllocations();

    EXPECT_EQ(2, lines);
    EXPECT_EQ(before, after);
}
