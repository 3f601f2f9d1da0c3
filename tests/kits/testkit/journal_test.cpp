#include "testkit/journal.h"

#include <gtest/gtest.h>

namespace
{

TEST(Journal, KeepsTheOrderOfItsEntries)
{
    bdmvtest::Journal journal;
    journal.Add("first");
    journal.Add("second");
    EXPECT_EQ(journal.Take(), "first\nsecond\n");
}

TEST(Journal, ForgetsWhatWasTaken)
{
    bdmvtest::Journal journal;
    journal.Add("first");
    journal.Take();
    journal.Add("second");
    EXPECT_EQ(journal.Take(), "second\n");
    EXPECT_EQ(journal.Take(), "");
}

} // namespace
