// The format of a line.
#include <climits>
#include <cstdarg>
#include <cstdint>
#include <cstdio>
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

    /** The text of the last line of the file. */
    std::string LastText() const
    {
        KEVRO_Log_Flush();
        return porttesting::TextOf(ReadLines(m_LogFile).back());
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
        for (const std::size_t length : {100U, 222U, 223U, 224U, 244U, 245U, 246U, 250U, 251U, 252U,
                                         253U, 300U, 5000U, 70000U}) {
            porttesting::ConfigureSink("stderr");
            std::remove(m_LogFile.c_str());
            porttesting::ConfigureSink("file:" + m_LogFile + queue);

            const std::string text(length, 'x');
            EventLogger().Log("<%s %d>", text.c_str(), 7);
            EXPECT_EQ(LastText(), "<" + text + " 7>");
            EventLogger().Log("<%s %2d>", text.c_str(), 7);
            EXPECT_EQ(LastText(), "<" + text + "  7>");
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

/** What vsnprintf() makes of the arguments. */
BD_PRINTF_FORMAT(1, 2) std::string Printed(const char* format, ...)
{
    char text[200];
    va_list args;
    va_start(args, format);
    std::vsnprintf(text, sizeof(text), format, args);
    va_end(args);
    return text;
}

/** One conversion or several, whose line must have the text that vsnprintf() makes. */
#define EXPECT_LINE_OF(...)                                                                        \
    EventLogger().Log(__VA_ARGS__);                                                                \
    EXPECT_EQ(LastText(), Printed(__VA_ARGS__))

TEST_F(LogLine, FormatsIntegersAsPrintfDoes)
{
    for (const char* queue : {"", ",queue=8"}) {
        porttesting::ConfigureSink("file:" + m_LogFile + queue);
        EXPECT_LINE_OF("%d, %d, %d", 0, INT_MIN, INT_MAX);
        EXPECT_LINE_OF("%ld, %ld, %ld", 0L, LONG_MIN, LONG_MAX);
        EXPECT_LINE_OF("%lld, %lld, %lld", 0LL, LLONG_MIN, LLONG_MAX);
        EXPECT_LINE_OF("%u, %u", 0U, UINT_MAX);
        EXPECT_LINE_OF("%lu, %lu", 0UL, ULONG_MAX);
        EXPECT_LINE_OF("%llu, %llu", 0ULL, ULLONG_MAX);
    }
}

TEST_F(LogLine, FormatsEachArgumentByItsOwnConversion)
{
    EXPECT_LINE_OF("%d%s%llu%u%lu%s%lld%ld.", -1, "two", 3ULL, 4U, 5UL, "", -7LL, -8L);
}

TEST_F(LogLine, FormatsAnyOtherConversionAsPrintfDoes)
{
    EXPECT_LINE_OF("%5d|%-5d|%+d|%05d|% d|%.3d", 1, 2, 3, 4, 5, 6);
    EXPECT_LINE_OF("%x %X %#x %o %i %c", 0xABCU, 0xDEFU, 1U, 8U, -9, 'c');
    EXPECT_LINE_OF("%hhd %hd %zu %jd", static_cast<signed char>(-1), static_cast<short>(-2),
                   sizeof(int), std::intmax_t{-3});
    EXPECT_LINE_OF("%.2f %e %g", 1.005, 2.5, 0.1);
    EXPECT_LINE_OF("%10s|%-10s|%.2s|%.*s", "right", "left", "cut", 3, "length");
    EXPECT_LINE_OF("100 %%");
    EXPECT_LINE_OF("%ls", L"wide");
}

TEST_F(LogLine, ReadsItsArgumentsFromTheFirstAgainAfterAnotherConversion)
{
    EXPECT_LINE_OF("%d %s %llu %02u %s", 1, "two", 3ULL, 4U, "five");
}

TEST_F(LogLine, FormatsANullStringAsPrintfDoes)
{
    const char* volatile nothing = nullptr;
    const char* const text = nothing;
    EXPECT_LINE_OF("<%s>", text);
}

} // namespace
