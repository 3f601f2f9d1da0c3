#include "deskplayer/ticks.h"

#include <gtest/gtest.h>

#include "text/timetext.h"

namespace deskplayer
{

namespace
{

TEST(Ticks, ConvertExactlyFromSecondsAndMilliseconds)
{
    EXPECT_EQ(Ticks(std::chrono::seconds(2)).count(), 90000U);
    EXPECT_EQ(Ticks(std::chrono::milliseconds(1)).count(), 45U);
    static_assert(!std::is_convertible<std::chrono::microseconds, Ticks>::value,
                  "what has no whole number of ticks is converted explicitly");
    static_assert(!std::is_convertible<std::uint64_t, Ticks>::value,
                  "a number without a unit is not a time");
}

TEST(Ticks, AreDistinguishedByTheNearestMicrosecond)
{
    EXPECT_EQ(Microseconds(Ticks(0)), 0U);
    EXPECT_EQ(Microseconds(Ticks(1)), 22U);
    EXPECT_EQ(Microseconds(Ticks(2)), 44U);
    EXPECT_EQ(Microseconds(Ticks(44)), 978U);
    EXPECT_EQ(Microseconds(Ticks(45)), 1000U);
}

TEST(TimeText, ShowsHoursMinutesSecondsAndMilliseconds)
{
    EXPECT_EQ(TimeText(std::chrono::hours(100) + std::chrono::milliseconds(3723004)),
              "101:02:03.004");
}

TEST(TimeText, DropsFractionsOfAMillisecond)
{
    EXPECT_EQ(TimeText(Ticks(44)), "00:00:00.000");
    EXPECT_EQ(TimeText(Ticks(45)), "00:00:00.001");
}

} // namespace

} // namespace deskplayer
