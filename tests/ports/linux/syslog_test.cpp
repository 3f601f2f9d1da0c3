// The system's log. This program replaces its functions to record their arguments.
#include <cstdarg>
#include <cstdio>
#include <map>
#include <string>
#include <utility>
#include <vector>

#include <syslog.h>

#include "porttesting.h"

namespace
{

std::string g_Ident = "none";
int g_CloseCount = 0;
std::vector<std::pair<int, std::string>> g_Lines;

BD_PRINTF_FORMAT(2, 0) void Record(int priority, const char* format, va_list args)
{
    char text[1000];
    std::vsnprintf(text, sizeof(text), format, args);
    g_Lines.emplace_back(priority, text);
}

} // namespace

extern "C" {
void openlog(const char* ident, int, int facility)
{
    EXPECT_EQ(facility, LOG_USER);
    g_Ident = ident == nullptr ? "program" : ident;
}

void closelog()
{
    ++g_CloseCount;
}

void syslog(int priority, const char* format, ...)
{
    va_list args;
    va_start(args, format);
    Record(priority, format, args);
    va_end(args);
}

// The function that replaces the same call where format strings are checked at run time.
BD_PRINTF_FORMAT(3, 4) void __syslog_chk(int priority, int, const char* format, ...)
{
    va_list args;
    va_start(args, format);
    Record(priority, format, args);
    va_end(args);
}
}

namespace
{

class Syslog : public testing::Test
{
protected:
    ~Syslog() override
    {
        porttesting::ConfigureSink("stderr");
        g_Lines.clear();
    }
};

TEST_F(Syslog, GetsLinesWithComponentAndLevelButWithoutTheTimeItAddsItself)
{
    porttesting::ConfigureSink("syslog");
    porttesting::EventLogger().Log("100%% %s", "%s\n");
    ASSERT_EQ(g_Lines.size(), 1U);
    EXPECT_EQ(g_Lines[0].second, R"(BdmvNavigator Event: 100% %s\n)");
}

TEST_F(Syslog, GetsLinesThroughTheQueue)
{
    porttesting::ConfigureSink("syslog,queue=10");
    porttesting::EventLogger().Log("queued");
    KEVRO_Log_Flush();
    ASSERT_EQ(g_Lines.size(), 1U);
    EXPECT_EQ(g_Lines[0].second, "BdmvNavigator Event: queued");
}

TEST_F(Syslog, GetsTheProgramsNameOrTheGivenOne)
{
    porttesting::ConfigureSink("syslog");
    EXPECT_EQ(g_Ident, "program");
    porttesting::ConfigureSink("syslog:player");
    EXPECT_EQ(g_Ident, "player");
}

TEST_F(Syslog, KeepsTheNameWhenThePreviousSinkIsDestroyed)
{
    porttesting::ConfigureSink("syslog:first");
    porttesting::ConfigureSink("syslog:second");
    EXPECT_EQ(g_Ident, "second");
    EXPECT_EQ(g_CloseCount, 0);
}

TEST_F(Syslog, GetsAPriorityForEachLevel)
{
    const std::map<int, int> priorities = {
        {KEVRO_Log_LevelMethod, LOG_DEBUG},  {KEVRO_Log_LevelInterface, LOG_DEBUG},
        {KEVRO_Log_LevelException, LOG_ERR}, {KEVRO_Log_LevelWarning, LOG_WARNING},
        {KEVRO_Log_LevelState, LOG_INFO},    {KEVRO_Log_LevelEvent, LOG_INFO},
        {KEVRO_Log_LevelInfo, LOG_INFO},     {KEVRO_Log_LevelFree1, LOG_DEBUG},
        {KEVRO_Log_LevelFree2, LOG_DEBUG},   {KEVRO_Log_LevelFree3, LOG_DEBUG},
        {KEVRO_Log_LevelFree4, LOG_DEBUG},   {KEVRO_Log_LevelDefault, LOG_INFO},
        {KEVRO_Log_LevelRuntime, LOG_INFO},  {KEVRO_Log_LevelFatal, LOG_CRIT},
        {KEVRO_Log_Level__sizeof, LOG_INFO},
    };
    porttesting::ConfigureSink("syslog");
    for (const auto& expected : priorities) {
        g_Lines.clear();
        bd::VargLogger(bd::CompIdTest, static_cast<KEVRO_Log_Level>(expected.first), 0).Log("x");
        ASSERT_EQ(g_Lines.size(), 1U);
        EXPECT_EQ(g_Lines[0].first, expected.second) << expected.first;
    }
}

} // namespace
