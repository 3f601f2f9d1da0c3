#include "testkit/fakeplatform.h"

#include <gtest/gtest.h>
#include <setjmp.h>
#include <signal.h>

#include <csignal>
#include <cstdlib>
#include <stdexcept>

#include "bd/logging.h"

namespace
{

using bdmvtest::FakePlatform;
using bdmvtest::Journal;

__attribute__((format(printf, 1, 2))) void Write(const char* format, ...)
{
    va_list args;
    va_start(args, format);
    KEVRO_Log_VWrite(57, 5, 0, format, args);
    va_end(args);
}

TEST(FakePlatform, RecordsTheLogSwitchAndLines)
{
    Journal journal;
    FakePlatform platform(&journal);
    EXPECT_EQ(KEVRO_Log_IsEnabled(57, 5, 0), 1);
    Write("Sending %d", 7);
    EXPECT_EQ(journal.Take(), "log? 57 5 0 -> on\nlog 57 5 0: Sending 7\n");
}

TEST(FakePlatform, ReturnsWhatTheTestAnswers)
{
    Journal journal;
    FakePlatform platform(&journal);
    platform.SetLogSwitch(
        [](KEVRO_UInt32 component, KEVRO_Int32, KEVRO_Bool) { return component == 57 ? 1 : 0; });
    EXPECT_EQ(KEVRO_Log_IsEnabled(57, 5, 0), 1);
    EXPECT_EQ(KEVRO_Log_IsEnabled(58, 5, 1), 0);
    EXPECT_EQ(journal.Take(), "log? 57 5 0 -> on\nlog? 58 5 1 -> off\n");
}

TEST(FakePlatform, RecordsFormatsWhenAsked)
{
    Journal journal;
    FakePlatform platform(&journal);
    platform.RecordFormats();
    Write("Sending %d", 7);
    EXPECT_EQ(journal.Take(), "format: Sending %d\nlog 57 5 0: Sending 7\n");
}

TEST(FakePlatform, RecordsAtomicAdditionsWhenAsked)
{
    Journal journal;
    FakePlatform platform(&journal);
    KEVRO_Int32 counter = 3;
    EXPECT_EQ(KEVRO_Osa_TaskAtomicAdd(&counter, 1), 4);
    EXPECT_EQ(journal.Take(), "");
    platform.RecordAtomicAdds();
    EXPECT_EQ(KEVRO_Osa_TaskAtomicAdd(&counter, -1), 3);
    EXPECT_EQ(KEVRO_Osa_TaskAtomicAdd(&counter, 0), 3);
    EXPECT_EQ(journal.Take(), "atomic add -1 -> 3\n");
}

TEST(FakePlatform, RecordsFailedAssertionsAndRunsAnAction)
{
    Journal journal;
    FakePlatform platform(&journal);
    Assert("expression", "file.cpp", 7);
    platform.onAssert = [] { throw std::runtime_error("of the test"); };
    EXPECT_THROW(Assert("other", "file.cpp", 8), std::runtime_error);
    EXPECT_EQ(journal.Take(), "assert: expression, file.cpp:7\nassert: other, file.cpp:8\n");
}

TEST(FakePlatform, WorksWithoutAJournal)
{
    FakePlatform platform(nullptr);
    platform.RecordAtomicAdds();
    platform.RecordFormats();
    KEVRO_Int32 counter = 3;
    EXPECT_EQ(KEVRO_Log_IsEnabled(57, 5, 0), 1);
    Write("Sending %d", 7);
    EXPECT_EQ(KEVRO_Osa_TaskAtomicAdd(&counter, 1), 4);
    Assert("expression", "file.cpp", 7);
}

TEST(FakePlatform, RefusesToExistTwice)
{
    FakePlatform platform(nullptr);
    EXPECT_THROW(FakePlatform second(nullptr), std::logic_error);
}

TEST(FakePlatform, LeavesDefaultsBehind)
{
    {
        FakePlatform platform(nullptr);
        g_u1Bduopmask = 1;
    }
    EXPECT_EQ(g_u1Bduopmask, 0);
    KEVRO_Int32 counter = 3;
    EXPECT_EQ(KEVRO_Log_IsEnabled(57, 5, 0), 0);
    Write("Sending %d", 7);
    EXPECT_EQ(KEVRO_Osa_TaskAtomicAdd(&counter, 1), 4);
}

sigjmp_buf g_AfterAbort;

void LeaveAbort(int)
{
    siglongjmp(g_AfterAbort, 1);
}

/** Ends the program in order although the assertion aborts, so that its coverage is written. */
void FailAnAssertionAndExit()
{
    std::signal(SIGABRT, LeaveAbort);
    if (sigsetjmp(g_AfterAbort, 1) == 0) {
        Assert("expression", "file.cpp", 7);
        std::exit(1);
    }
    std::exit(7);
}

TEST(FakePlatformDeathTest, IsNeededToSurviveAFailedAssertion)
{
    EXPECT_EXIT(FailAnAssertionAndExit(), testing::ExitedWithCode(7),
                "file.cpp:7: assertion failed: expression");
}

} // namespace
