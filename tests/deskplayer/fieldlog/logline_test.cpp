#include "fieldlog/logline.h"

#include <gtest/gtest.h>

#include <string>
#include <utility>

#include "fieldlog/journalline.h"

namespace deskplayer
{

namespace
{

struct Form {
    const char* name;
    const char* prefix;
    LineClock clock;
    const char* time;
    const char* process;
};

class PlainLine : public testing::TestWithParam<Form>
{
};

TEST_P(PlainLine, IsTakenApart)
{
    const std::string text =
        std::string(GetParam().prefix) + "BdmvNavigator Event: Sending: Paused";
    const auto line = ReadPlainLine(text);

    ASSERT_TRUE(line);
    EXPECT_EQ(line->time.clock, GetParam().clock);
    EXPECT_EQ(line->time.text, GetParam().time);
    EXPECT_EQ(line->process, GetParam().process);
    EXPECT_EQ(line->component, "BdmvNavigator");
    EXPECT_EQ(line->level, "Event");
    EXPECT_EQ(line->text, "Sending: Paused");
}

INSTANTIATE_TEST_SUITE_P(
    OfEveryForm, PlainLine,
    testing::Values(
        Form{"PortWithTheSystemsClock", "2024-05-31 20:15:00.123456 ", LineClock::Wall,
             "2024-05-31 20:15:00.123456", ""},
        Form{"PortWithTheClockOfAProgram", "00:01:30.500000 ", LineClock::Session,
             "00:01:30.500000", ""},
        Form{"SyslogRfc3164", "<14>May 31 20:15:00 box player[42]: ", LineClock::WallWithoutYear,
             "May 31 20:15:00", "player[42]"},
        Form{"RsyslogTraditional", "May  1 20:15:00 box player[42]: ", LineClock::WallWithoutYear,
             "May  1 20:15:00", "player[42]"},
        Form{"RsyslogWithoutIdentifier", "May  1 20:15:00 box player: ", LineClock::WallWithoutYear,
             "May  1 20:15:00", "player"},
        Form{"RsyslogFile", "2024-05-31T20:15:00.123456+02:00 box player[42]: ", LineClock::Wall,
             "2024-05-31T20:15:00.123456+02:00", "player[42]"},
        Form{"SyslogRfc5424", "<14>1 2024-05-31T20:15:00.123456+02:00 box player 42 - - ",
             LineClock::Wall, "2024-05-31T20:15:00.123456+02:00", "player 42"},
        Form{"RsyslogSyslogProtocol23",
             "<14>1 2026-11-22T00:15:40.566471+00:00 box player 42 - -  ", LineClock::Wall,
             "2026-11-22T00:15:40.566471+00:00", "player 42"},
        Form{"RsyslogTraditionalFile", "Nov 22 00:15:40 box player[42]: ",
             LineClock::WallWithoutYear, "Nov 22 00:15:40", "player[42]"},
        Form{"JournalShortIsoPrecise", "2024-05-31T22:15:00.000000+0200 box player[42]: ",
             LineClock::Wall, "2024-05-31T22:15:00.000000+0200", "player[42]"},
        Form{"SyslogRfc5424WithData",
             "<14>1 2024-05-31T20:15:00Z box player 42 id [a b=\"\\]\"][c d=\"\\\"\"] \xEF\xBB\xBF",
             LineClock::Wall, "2024-05-31T20:15:00Z", "player 42"},
        Form{"JournalShortPrecise", "May 31 20:15:00.123456 box player[42]: ",
             LineClock::WallWithoutYear, "May 31 20:15:00.123456", "player[42]"},
        Form{"JournalShortIso", "2024-05-31T20:15:00+0200 box player[42]: ", LineClock::Wall,
             "2024-05-31T20:15:00+0200", "player[42]"},
        Form{"TimeOfThePortInTheSystemsLog", "May 31 20:15:01 box player[42]: 00:01:30.500000 ",
             LineClock::Session, "00:01:30.500000", "player[42]"}),
    [](const testing::TestParamInfo<Form>& parameter) { return parameter.param.name; });

TEST(PlainLineOfAnotherKind, IsNotRead)
{
    for (const char* const text :
         {"", "hello", "2024-05-31 20:15:00.123456", "2024-05-31 20:15:00.123456 word",
          "2024-05-31 20:15:00.123456 BdmvNavigator", "2024-05-31 20:15:00 BdmvNavigator Event:x",
          "May 31 20:15:00 box", "May 31 20:15:00 box player[42]:", "<14>", "<1x>May 31",
          "<14>1 2024-05-31T20:15:00Z box player 42 - [a", "12.5 BdmvNavigator Event: x",
          "<14>1 2024-05-31T20:15:00Z box player 42 - - no", "<14>1 2024-05-31T20:15:00Z box",
          "<14>1 2024-05-31T20:15:00Z box player 42 - x A B: c"}) {
        EXPECT_FALSE(ReadPlainLine(text)) << text;
    }
}

TEST(JournalLine, IsTakenApart)
{
    JournalLineReader reader;
    const auto line =
        reader.Read(R"({"__REALTIME_TIMESTAMP":"1717186500123456","_BOOT_ID":"ab","_PID":"42",)"
                    R"("MESSAGE":"BdmvNavigator Event: Sending Paused"})");

    ASSERT_TRUE(line);
    EXPECT_EQ(line->time.clock, LineClock::Wall);
    EXPECT_EQ(line->time.microseconds, 1717186500123456);
    EXPECT_EQ(line->time.text, "2024-05-31T20:15:00.123456Z");
    EXPECT_EQ(line->process, "ab 42");
    EXPECT_EQ(line->component, "BdmvNavigator");
    EXPECT_EQ(line->text, "Sending Paused");
}

TEST(JournalLine, IsTakenApartAsJournalctlWritesIt)
{
    JournalLineReader reader;
    const auto line = reader.Read(
        R"({"PRIORITY":"6","SYSLOG_PID":"42","_MACHINE_ID":"0123456789abcdef0123456789abcdef",)"
        R"("_BOOT_ID":"0123456789abcdef0123456789abcdef","_PID":"42","__MONOTONIC_TIMESTAMP":"0",)"
        R"("MESSAGE":"BdmvNavigator Event: Sending PlayItem - playListId: 1, playItemId: 0, )"
        R"(videoFormat 6, aspectRatio 3","_HOSTNAME":"box","SYSLOG_FACILITY":"1",)"
        R"("__REALTIME_TIMESTAMP":"1717186500000000","__CURSOR":"s=e2e91c1e5e41451994f9ce7f703e89b5;)"
        R"(i=1;b=0123456789abcdef0123456789abcdef;m=0;t=619c5a3587900;x=44c800308fc7cceb",)"
        R"("SYSLOG_IDENTIFIER":"player","_TRANSPORT":"syslog"})");

    ASSERT_TRUE(line);
    EXPECT_EQ(line->time.text, "2024-05-31T20:15:00.000000Z");
    EXPECT_EQ(line->process, "0123456789abcdef0123456789abcdef 42");
    EXPECT_EQ(line->text,
              "Sending PlayItem - playListId: 1, playItemId: 0, videoFormat 6, aspectRatio 3");
}

TEST(JournalLine, HasItsTimeAsText)
{
    JournalLineReader reader;
    for (const auto& [microseconds, text] : {std::pair("0", "1970-01-01T00:00:00.000000Z"),
                                             {"951782399999999", "2000-02-28T23:59:59.999999Z"},
                                             {"951782400000000", "2000-02-29T00:00:00.000000Z"},
                                             {"978307199000000", "2000-12-31T23:59:59.000000Z"},
                                             {"4107542400000000", "2100-03-01T00:00:00.000000Z"},
                                             {"9999999999999999", "2286-11-20T17:46:39.999999Z"}}) {
        const auto line = reader.Read("{\"__REALTIME_TIMESTAMP\":\"" + std::string(microseconds) +
                                      "\",\"MESSAGE\":\"A B: c\"}");
        ASSERT_TRUE(line) << text;
        EXPECT_EQ(line->time.text, text);
    }
}

TEST(JournalLine, MayHaveItsTextAsBytes)
{
    JournalLineReader reader;
    const auto line = reader.Read(R"({"__REALTIME_TIMESTAMP":"0","MESSAGE":[65,32,66,58,32,255]})");

    ASSERT_TRUE(line);
    EXPECT_EQ(line->component, "A");
    EXPECT_EQ(line->text, "\xFF");
}

TEST(JournalLineOfAnotherKind, IsNotRead)
{
    JournalLineReader reader;
    for (const char* const text :
         {"{", "{}", "{\"MESSAGE\":\"A B: c\"}", "{\"__REALTIME_TIMESTAMP\":\"1\"}",
          R"({"__REALTIME_TIMESTAMP":"1","MESSAGE":null})",
          R"({"__REALTIME_TIMESTAMP":"1","MESSAGE":[256]})",
          R"({"__REALTIME_TIMESTAMP":"1","MESSAGE":["A"]})",
          R"({"__REALTIME_TIMESTAMP":"1x","MESSAGE":"A B: c"})",
          R"({"__REALTIME_TIMESTAMP":"12345678901234567","MESSAGE":"A B: c"})",
          R"({"__REALTIME_TIMESTAMP":"1","MESSAGE":"AB"})"}) {
        EXPECT_FALSE(reader.Read(text)) << text;
    }
}

} // namespace

} // namespace deskplayer
