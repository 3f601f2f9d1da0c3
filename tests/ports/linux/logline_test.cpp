// The format of a line.
#include <cstdarg>
#include <cwchar>
#include <regex>
#include <string>

#include "porttesting.h"

namespace
{

using porttesting::EventLogger;
using porttesting::ReadFile;
using porttesting::ReadLines;
using porttesting::WithoutTime;

class LogLine : public porttesting::LogFileTest
{
protected:
    /** The one line of the file, without its time. */
    std::string TheLine() const
    {
        const auto lines = ReadLines(m_LogFile);
        return lines.size() == 1 ? WithoutTime(lines[0]) : std::to_string(lines.size()) + " lines";
    }
};

/** Writes without the logger, which restricts levels to those in the list. */
BD_PRINTF_FORMAT(2, 3) void WriteAtLevel(KEVRO_Int32 level, const char* format, ...)
{
    va_list args;
    va_start(args, format);
    KEVRO_Log_VWrite(bd::CompIdJpi, level, 0, format, args);
    va_end(args);
}

TEST_F(LogLine, BeginsWithTimeComponentAndLevel)
{
    EventLogger().Log("playListId: %lu", 3UL);
    const std::string text = ReadFile(m_LogFile);
    EXPECT_TRUE(
        std::regex_match(text, std::regex(R"(\d{4}-[01]\d-[0-3]\d [0-2]\d:[0-5]\d:[0-6]\d\.\d{6} )"
                                          R"(BdmvNavigator Event: playListId: 3\n)")))
        << text;
}

TEST_F(LogLine, ShowsNumbersThatHaveNoName)
{
    bd::VargLogger(42, static_cast<KEVRO_Log_Level>(15), 0).Log("x");
    EXPECT_EQ(TheLine(), "42 15: x");
}

TEST_F(LogLine, ShowsALevelBelowTheList)
{
    WriteAtLevel(-1, "x");
    EXPECT_EQ(TheLine(), "Jpi -1: x");
}

TEST_F(LogLine, ShowsTheLargestNumbers)
{
    bd::VargLogger(0xFFFFFFFFU, KEVRO_Log_LevelFatal, 1).Log("x");
    EXPECT_EQ(TheLine(), "4294967295 Fatal: x");
}

TEST_F(LogLine, IsWrittenWhateverTheSwitch)
{
    ASSERT_EQ(KEVRO_Log_IsEnabled(bd::CompIdJpi, KEVRO_Log_LevelMethod, 0), 0);
    bd::VargLogger(bd::CompIdJpi, KEVRO_Log_LevelMethod, 0).Log("x");
    EXPECT_EQ(TheLine(), "Jpi Method: x");
}

TEST_F(LogLine, EscapesAllButPrintableAscii)
{
    EventLogger().Log("%s", "a\nb\rc\td\x1B[31m\x7F\xC3\xA9\x01~");
    EXPECT_EQ(TheLine(), R"(BdmvNavigator Event: a\nb\rc\td\x1B[31m\x7F\xC3\xA9\x01~)");
}

TEST_F(LogLine, EscapesANulCharacter)
{
    EventLogger().Log("a%cb", 0);
    EXPECT_EQ(TheLine(), R"(BdmvNavigator Event: a\x00b)");
}

TEST_F(LogLine, DistinguishesABackslashFromAnEscapeSequence)
{
    EventLogger().Log("%s", R"(\n)");
    EXPECT_EQ(TheLine(), R"(BdmvNavigator Event: \\n)");
}

TEST_F(LogLine, MayBeEmpty)
{
    EventLogger().Log("%s", "");
    EXPECT_EQ(TheLine(), "BdmvNavigator Event: ");
}

TEST_F(LogLine, IsNotFormattedAgain)
{
    EventLogger().Log("%s", "100% %s {} {0}");
    EXPECT_EQ(TheLine(), "BdmvNavigator Event: 100% %s {} {0}");
}

TEST_F(LogLine, IsNeverTruncated)
{
    for (const char* queue : {"", ",queue=8"}) {
        for (const std::size_t length :
             {100U, 222U, 223U, 224U, 250U, 251U, 252U, 253U, 300U, 5000U, 70000U}) {
            porttesting::ConfigureSink("stderr");
            std::remove(m_LogFile.c_str());
            porttesting::ConfigureSink("file:" + m_LogFile + queue);

            const std::string text(length, 'x');
            EventLogger().Log("<%s %d>", text.c_str(), 7);
            KEVRO_Log_Flush();
            EXPECT_EQ(TheLine(), "BdmvNavigator Event: <" + text + " 7>");
        }
    }
}

TEST_F(LogLine, IsLostAndCountedWhenItsArgumentsCannotBePrinted)
{
    const KEVRO_UInt64 before = KEVRO_Log_GetDroppedLines();
    const wchar_t unprintable[] = {static_cast<wchar_t>(0x110000), 0};
    EventLogger().Log("%ls", unprintable);
    EXPECT_EQ(ReadFile(m_LogFile), "");
    EXPECT_EQ(KEVRO_Log_GetDroppedLines(), before + 1);
}

} // namespace
