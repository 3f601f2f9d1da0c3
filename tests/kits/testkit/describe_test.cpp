// Values as they appear in journals.

#include "testkit/describe.h"

#include <gtest/gtest.h>

#include "bdmvnavigator/inavcontrollistener.h"
#include "bdmvnavigator/inaverror.h"
#include "bdstreaming/types.h"

namespace
{

using bdmvtest::Describe;
using bdmvtest::DescribeCall;

TEST(Describe, NamesEnumerators)
{
    EXPECT_EQ(Describe(bd::PlayDirectionForward), "PlayDirectionForward");
    EXPECT_EQ(Describe(bd::PlaySpeedFast12), "PlaySpeedFast12");
    EXPECT_EQ(Describe(bd::TRIGGER_B), "TRIGGER_B");
    EXPECT_EQ(Describe(bd::VideoFormatTypeNoInfo), "VideoFormatTypeNoInfo");
    EXPECT_EQ(Describe(bdstreaming::FinishedReasonDataStarvation), "FinishedReasonDataStarvation");
}

TEST(Describe, NamesEnumeratorsOfAClassWithoutTheClass)
{
    EXPECT_EQ(Describe(bdmv::INavControlListener::EndOfMedia), "EndOfMedia");
    EXPECT_EQ(Describe(bdmv::INavError::ErrNotAllowed), "ErrNotAllowed");
}

TEST(Describe, NamesTheLargestEnumeratorOfACallback)
{
    EXPECT_EQ(Describe(bd::AudioChannelTypeOthers), "AudioChannelTypeOthers");
}

TEST(Describe, ShowsAValueWithoutAnEnumeratorAsItsNumber)
{
    EXPECT_EQ(Describe(static_cast<bd::VideoFormatType>(0)), "0");
    EXPECT_EQ(Describe(static_cast<bd::VideoFormatType>(64)), "64");
    EXPECT_EQ(Describe(static_cast<bd::VideoFormatType>(-1)), "-1");
}

TEST(Describe, ShowsBooleansAsWords)
{
    EXPECT_EQ(DescribeCall("TriggerSet", bd::TRIGGER_B, true), "TriggerSet(TRIGGER_B, true)");
}

TEST(Describe, ShowsIntegersInDecimal)
{
    EXPECT_EQ(Describe(bd::UInt8{65}), "65");
    EXPECT_EQ(Describe(bd::TimePosition{90000}), "90000");
}

} // namespace
