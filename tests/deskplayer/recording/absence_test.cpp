#include "recording/absence.h"

#include <gtest/gtest.h>

namespace deskplayer
{
namespace
{

namespace callbacks = bdmv::callbacks;

CallbackRecord PartOfABlock()
{
    static const bd::UInt8 block[] = {1, 2};
    CallbackRecord record = {Ticks(0), callbacks::SystemSuspended{block, 5}, {}};
    record.knownBytes = 2;
    return record;
}

TEST(Absence, IsReportedByTheNamesOfTheArguments)
{
    EXPECT_EQ(AbsentArguments({Ticks(0), callbacks::TriggerSet{}, 0b11}), "type, result");
    EXPECT_EQ(AbsentArguments({Ticks(0), callbacks::TriggerSet{}, 0b10}), "result");
    EXPECT_EQ(AbsentArguments({Ticks(0), callbacks::TriggerSet{}, {}}), "");
    EXPECT_EQ(AbsentArguments(PartOfABlock()), "data");
}

TEST(Absence, IncludesBlocksThatAreKnownInPart)
{
    EXPECT_TRUE(IsComplete({Ticks(0), callbacks::TriggerSet{}, {}}));
    EXPECT_FALSE(IsComplete({Ticks(0), callbacks::TriggerSet{}, 0b10}));
    EXPECT_FALSE(IsComplete(PartOfABlock()));
}

TEST(Absence, CanBeFilledWithTheNeutralValues)
{
    CallbackRecord record = {Ticks(0), callbacks::MarkInfo{800, 0, 5}, 0b010};
    Fill(record);

    EXPECT_TRUE(IsComplete(record));
    EXPECT_EQ(record.callback, bdmv::Callback(callbacks::MarkInfo{800, 0, 5}));
}

TEST(Absence, OfBytesIsFilledByAShorterBlock)
{
    CallbackRecord record = PartOfABlock();
    const void* const block = record.callback.As<callbacks::SystemSuspended>()->data;
    Fill(record);

    EXPECT_TRUE(IsComplete(record));
    EXPECT_EQ(record.callback, bdmv::Callback(callbacks::SystemSuspended{block, 2}));
}

TEST(Absence, OfABlockIsFilledByAnEmptyOne)
{
    CallbackRecord record = {Ticks(0), callbacks::SystemSuspended{nullptr, 5}, 0b01};
    Fill(record);

    EXPECT_EQ(record.callback, bdmv::Callback(callbacks::SystemSuspended{nullptr, 0}));
}

TEST(Absence, LeavesCompleteBlocksAlone)
{
    const bd::UInt8 block[] = {1, 2};
    CallbackRecord record = {Ticks(0), callbacks::SystemSuspended{block, 2}, {}};
    Fill(record);

    EXPECT_EQ(record.callback, bdmv::Callback(callbacks::SystemSuspended{block, 2}));
}

} // namespace
} // namespace deskplayer
