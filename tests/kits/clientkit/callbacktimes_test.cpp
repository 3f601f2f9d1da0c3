// What is kept of the times of callbacks, and when a slow one is reported, at times that a test
// chooses.

#include "clientkit/callbacktimes.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <chrono>
#include <iterator>
#include <vector>

namespace
{

using bdmv::CallbackTimes;
using std::chrono::microseconds;
using std::chrono::milliseconds;
using std::chrono::nanoseconds;
using std::chrono::seconds;

constexpr microseconds Budget(5);

/** A point in time after an arbitrary beginning. */
CallbackTimes::Time At(nanoseconds time)
{
    return CallbackTimes::Time(std::chrono::duration_cast<CallbackTimes::Duration>(seconds(1000)) +
                               time);
}

class CallbackTimesTest : public ::testing::Test
{
protected:
    /** Adds a Paused() that takes this long. */
    bool Add(nanoseconds time) { return times.Add(bdmv::CallbackPaused, At(seconds(0)), At(time)); }

    /** Adds a slow callback that ends at this time. */
    bool AddSlow(bdmv::CallbackId id, nanoseconds end)
    {
        return times.Add(id, At(end - 2 * Budget), At(end));
    }

    /** The place in which a callback that took this long was counted. */
    std::size_t PlaceOf(nanoseconds time)
    {
        CallbackTimes alone(Budget);
        alone.Add(bdmv::CallbackPaused, At(seconds(0)), At(time));
        const CallbackTimes::Record record = alone.Get(bdmv::CallbackPaused);
        const bd::UInt64* const place =
            std::find(std::begin(record.histogram), std::end(record.histogram), 1);
        return static_cast<std::size_t>(place - std::begin(record.histogram));
    }

    CallbackTimes times{Budget};
};

} // namespace

TEST_F(CallbackTimesTest, AreZeroAtFirst)
{
    const CallbackTimes::Record record = times.Get(bdmv::CallbackPaused);
    EXPECT_EQ(record.count, 0U);
    EXPECT_EQ(record.longest, nanoseconds(0));
    EXPECT_EQ(record.total, nanoseconds(0));
    EXPECT_EQ(std::count(std::begin(record.histogram), std::end(record.histogram), 0), 24);
}

TEST_F(CallbackTimesTest, KeepNumberSumAndMaximum)
{
    Add(nanoseconds(1500));
    Add(nanoseconds(9700));
    Add(nanoseconds(800));
    const CallbackTimes::Record record = times.Get(bdmv::CallbackPaused);
    EXPECT_EQ(record.count, 3U);
    EXPECT_EQ(record.longest, nanoseconds(9700));
    EXPECT_EQ(record.total, nanoseconds(12000));
}

TEST_F(CallbackTimesTest, AreSeparateForEachCallback)
{
    Add(nanoseconds(1500));
    EXPECT_EQ(times.Get(bdmv::CallbackStopped).count, 0U);
    times.Add(bdmv::CallbackStopped, At(seconds(0)), At(seconds(1)));
    EXPECT_EQ(times.Get(bdmv::CallbackStopped).count, 1U);
    EXPECT_EQ(times.Get(bdmv::CallbackPaused).count, 1U);
}

TEST_F(CallbackTimesTest, OfTheFirstAndTheLastCallbackAreKept)
{
    for (const bdmv::CallbackId id :
         {bdmv::CallbackPlayStarted, bdmv::CallbackInteractiveGraphicsInactive}) {
        times.Add(id, At(seconds(0)), At(seconds(1)));
        EXPECT_EQ(times.Get(id).count, 1U) << id;
    }
}

TEST_F(CallbackTimesTest, OfAValueThatIsNoCallbackAreZero)
{
    for (int id = 0; id < bdmv::Callback__sizeof; ++id) {
        times.Add(static_cast<bdmv::CallbackId>(id), At(seconds(0)), At(seconds(1)));
    }
    EXPECT_EQ(times.Get(bdmv::Callback__sizeof).count, 0U);
    EXPECT_EQ(times.Get(static_cast<bdmv::CallbackId>(-1)).count, 0U);
    EXPECT_EQ(times.Get(static_cast<bdmv::CallbackId>(1000000)).count, 0U);
}

TEST_F(CallbackTimesTest, BelowAMicrosecondAreInPlaceZero)
{
    EXPECT_EQ(PlaceOf(nanoseconds(0)), 0U);
    EXPECT_EQ(PlaceOf(nanoseconds(999)), 0U);
}

TEST_F(CallbackTimesTest, DoubleFromPlaceToPlace)
{
    for (std::size_t place = 1; place < 23; ++place) {
        const microseconds least(1LL << (place - 1));
        EXPECT_EQ(PlaceOf(least), place);
        EXPECT_EQ(PlaceOf(2 * least - nanoseconds(1)), place);
    }
}

TEST_F(CallbackTimesTest, LongerThanAllPlacesAreInTheLast)
{
    EXPECT_EQ(PlaceOf(microseconds(1LL << 22)), 23U);
    EXPECT_EQ(PlaceOf(microseconds(1LL << 23)), 23U);
    EXPECT_EQ(PlaceOf(std::chrono::hours(24 * 365)), 23U);
}

TEST_F(CallbackTimesTest, PlacesAreCountedSeparately)
{
    Add(nanoseconds(1));
    Add(nanoseconds(1000));
    Add(nanoseconds(1999));
    Add(nanoseconds(2000));
    const CallbackTimes::Record record = times.Get(bdmv::CallbackPaused);
    EXPECT_EQ(record.histogram[0], 1U);
    EXPECT_EQ(record.histogram[1], 2U);
    EXPECT_EQ(record.histogram[2], 1U);
}

TEST_F(CallbackTimesTest, WithinTheBudgetAreNotReported)
{
    EXPECT_FALSE(Add(nanoseconds(0)));
    EXPECT_FALSE(Add(Budget));
}

TEST_F(CallbackTimesTest, OverTheBudgetAreReported)
{
    EXPECT_TRUE(Add(Budget + nanoseconds(1)));
}

TEST_F(CallbackTimesTest, AreReportedInTheFirstSecondOfTheClock)
{
    EXPECT_TRUE(
        times.Add(bdmv::CallbackPaused, CallbackTimes::Time(), CallbackTimes::Time() + 2 * Budget));
}

TEST_F(CallbackTimesTest, AreNotReportedAgainWithinASecond)
{
    EXPECT_TRUE(AddSlow(bdmv::CallbackPaused, seconds(1)));
    EXPECT_FALSE(AddSlow(bdmv::CallbackPaused, seconds(1) + milliseconds(1)));
    EXPECT_FALSE(AddSlow(bdmv::CallbackPaused, seconds(2) - nanoseconds(1)));
}

TEST_F(CallbackTimesTest, AreReportedAgainASecondAfterTheLastReport)
{
    AddSlow(bdmv::CallbackPaused, seconds(1));
    AddSlow(bdmv::CallbackPaused, milliseconds(1500));
    EXPECT_TRUE(AddSlow(bdmv::CallbackPaused, seconds(2)));
    EXPECT_FALSE(AddSlow(bdmv::CallbackPaused, milliseconds(2999)));
}

TEST_F(CallbackTimesTest, AreReportedForEachCallbackSeparately)
{
    AddSlow(bdmv::CallbackPaused, seconds(1));
    EXPECT_TRUE(AddSlow(bdmv::CallbackStopped, seconds(1)));
    EXPECT_FALSE(AddSlow(bdmv::CallbackPaused, milliseconds(1001)));
}

TEST_F(CallbackTimesTest, AreKeptWhetherReportedOrNot)
{
    AddSlow(bdmv::CallbackPaused, seconds(1));
    AddSlow(bdmv::CallbackPaused, milliseconds(1001));
    EXPECT_EQ(times.Get(bdmv::CallbackPaused).count, 2U);
}

TEST(CallbackTimes, WithTheLargestBudgetAreNeverReported)
{
    CallbackTimes times((microseconds::max)());
    EXPECT_FALSE(times.Add(bdmv::CallbackPaused, At(seconds(0)), At(std::chrono::hours(24 * 365))));
}
