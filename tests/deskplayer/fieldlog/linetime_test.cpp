#include "fieldlog/linetime.h"

#include <gtest/gtest.h>

#include <string_view>

namespace deskplayer
{

namespace
{

/** Microseconds of a text that is a time and nothing else; -1 if it is not. */
std::int64_t TimeOf(std::string_view text)
{
    const auto time = TakeLineTime(text);
    return time && text.empty() ? time->microseconds : -1;
}

constexpr std::int64_t Evening = 1717186500123456; // 2024-05-31 20:15:00.123456 as universal time
constexpr std::int64_t Hour = 3600000000;

TEST(LineTime, OfADateCountsFrom1970)
{
    EXPECT_EQ(TimeOf("1970-01-01 00:00:00"), 0);
    EXPECT_EQ(TimeOf("2000-02-29 00:00:00"), 951782400000000);
    EXPECT_EQ(TimeOf("2000-03-01 00:00:00"), 951868800000000);
    EXPECT_EQ(TimeOf("2024-05-31 20:15:00.123456"), Evening);
}

TEST(LineTime, HasAFractionOfAnyLength)
{
    EXPECT_EQ(TimeOf("1970-01-01 00:00:00.5"), 500000);
    EXPECT_EQ(TimeOf("1970-01-01 00:00:00,007"), 7000);
    EXPECT_EQ(TimeOf("1970-01-01 00:00:00.1234567899"), 123456);
}

TEST(LineTime, WithAnOffsetIsUniversal)
{
    EXPECT_EQ(TimeOf("2024-05-31T20:15:00.123456Z"), Evening);
    EXPECT_EQ(TimeOf("2024-05-31T20:15:00.123456+02:00"), Evening - 2 * Hour);
    EXPECT_EQ(TimeOf("2024-05-31T20:15:00.123456-0530"), Evening + 5 * Hour + Hour / 2);
}

TEST(LineTime, LeavesAnOffsetThatIsNone)
{
    for (const std::string_view text : {"+2", "+2460", "-02:61", "+02:0", "+24:00"}) {
        const std::string line = "2024-05-31 20:15:00" + std::string(text);
        std::string_view rest = line;
        ASSERT_TRUE(TakeLineTime(rest)) << text;
        EXPECT_EQ(rest, text);
    }
}

TEST(LineTime, WithoutAYearIsOfALeapYear)
{
    std::string_view text = "Feb 29 20:15:00";
    const auto time = TakeLineTime(text);

    ASSERT_TRUE(time);
    EXPECT_EQ(time->clock, LineClock::WallWithoutYear);
    EXPECT_EQ(TimeOf("Mar  1 20:15:00") - time->microseconds, 24 * Hour);
    EXPECT_EQ(TimeOf("03-01 20:15:00"), TimeOf("Mar  1 20:15:00"));
}

TEST(LineTime, OfASessionMayHaveMoreThanADay)
{
    std::string_view text = "99999:59:59.000001 x";
    const auto time = TakeLineTime(text);

    ASSERT_TRUE(time);
    EXPECT_EQ(time->clock, LineClock::Session);
    EXPECT_EQ(time->microseconds, 100000 * Hour - 999999);
    EXPECT_EQ(time->text, "99999:59:59.000001");
    EXPECT_EQ(text, " x");
}

TEST(LineTime, MayBeACounter)
{
    std::string_view text = "90.5]";
    const auto time = TakeLineTime(text);

    ASSERT_TRUE(time);
    EXPECT_EQ(time->clock, LineClock::Counter);
    EXPECT_EQ(time->microseconds, 90500000);
    EXPECT_EQ(text, "]");
}

TEST(LineTime, IsNotReadIfAPartIsOutOfRange)
{
    for (const std::string_view text :
         {"2024-13-01 00:00:00", "2024-00-01 00:00:00", "2024-01-32 00:00:00",
          "2024-01-00 00:00:00", "2024-01-01 24:00:00", "2024-01-01 00:60:00",
          "2024-01-01 00:00:61", "Foo  1 00:00:00", "Jan 32 00:00:00", "100000:00:00",
          "00:60:00.000000", "", "x"}) {
        EXPECT_EQ(TimeOf(text), -1) << text;
    }
}

} // namespace

} // namespace deskplayer
