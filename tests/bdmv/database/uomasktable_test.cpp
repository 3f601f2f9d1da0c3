#include <gtest/gtest.h>

#include <climits>
#include <cstdint>
#include <cstring>
#include <string>
#include <type_traits>
#include <vector>

#include "database/uomasktable.h"
#include "testkit/fakeplatform.h"

using bdmv::UOMaskTable;

namespace
{

constexpr bd::UInt64 AllOnes = 0xFFFFFFFFFFFFFFFFu;

const std::vector<bd::UInt64>& SomeMasks()
{
    static const std::vector<bd::UInt64> masks = {0,
                                                  1,
                                                  0x8000000000000000u,
                                                  0xFF,
                                                  0x0123456789ABCDEFu,
                                                  0xF0F0F0F00F0F0F0Fu,
                                                  0x55555555,
                                                  0xDEADBEEF,
                                                  0xFFFFFFFF00000000u,
                                                  AllOnes,
                                                  0x8000000000000001u};
    return masks;
}

/** The bits in reverse order, by swapping ever larger groups of them. */
bd::UInt64 Reversed(bd::UInt64 value)
{
    value = ((value & 0x5555555555555555u) << 1) | ((value >> 1) & 0x5555555555555555u);
    value = ((value & 0x3333333333333333u) << 2) | ((value >> 2) & 0x3333333333333333u);
    value = ((value & 0x0F0F0F0F0F0F0F0Fu) << 4) | ((value >> 4) & 0x0F0F0F0F0F0F0F0Fu);
    value = ((value & 0x00FF00FF00FF00FFu) << 8) | ((value >> 8) & 0x00FF00FF00FF00FFu);
    value = ((value & 0x0000FFFF0000FFFFu) << 16) | ((value >> 16) & 0x0000FFFF0000FFFFu);
    return (value << 32) | (value >> 32);
}

bd::UserOperationMaskDef Operation(int number)
{
    return static_cast<bd::UserOperationMaskDef>(number);
}

class UOMask : public testing::Test
{
protected:
    bdmvtest::Journal journal;
    bdmvtest::FakePlatform platform{&journal}; ///< clears g_u1Bduopmask at the end
};

} // namespace

TEST_F(UOMask, StartsWithNothingForbidden)
{
    EXPECT_EQ(0u, UOMaskTable().GetUOMaskTable());
}

TEST_F(UOMask, ConvertsFromANumberOnlyExplicitly)
{
    EXPECT_TRUE((std::is_constructible_v<UOMaskTable, bd::UInt64>));
    EXPECT_FALSE((std::is_convertible_v<bd::UInt64, UOMaskTable>));
}

TEST_F(UOMask, IsAPlainValueOfEightBytes)
{
    EXPECT_EQ(8u, sizeof(UOMaskTable));
    EXPECT_TRUE(std::is_trivially_copyable_v<UOMaskTable>);
    EXPECT_TRUE(std::is_trivially_destructible_v<UOMaskTable>);
    EXPECT_FALSE(std::is_polymorphic_v<UOMaskTable>);
}

TEST_F(UOMask, HoldsTheNumberAsStored)
{
    const UOMaskTable mask(0x0123456789ABCDEFu);
    bd::UInt64 stored = 0;
    std::memcpy(&stored, &mask, sizeof(stored));

    EXPECT_EQ(0x0123456789ABCDEFu, stored);
}

TEST_F(UOMask, CopyHoldsTheSame)
{
    const UOMaskTable mask(0x0123456789ABCDEFu);
    const UOMaskTable copy(mask);
    UOMaskTable assigned;
    assigned = mask;

    EXPECT_TRUE(copy == mask);
    EXPECT_TRUE(assigned == mask);
}

TEST_F(UOMask, FieldHasEightBytes)
{
    EXPECT_TRUE((std::is_same_v<decltype(UOMaskTable::UO_MASK_TABLE_SIZE), const int>));
    EXPECT_EQ(8, UOMaskTable::UO_MASK_TABLE_SIZE); // binds it to a reference
}

TEST_F(UOMask, SizeOfTheFieldHasAnAddress)
{
    const int* volatile address = &UOMaskTable::UO_MASK_TABLE_SIZE;

    EXPECT_EQ(8, *address);
}

// The reported form

TEST_F(UOMask, ReportsTheLowestBitAsTheHighest)
{
    EXPECT_EQ(0x8000000000000000u, UOMaskTable(1).GetUOMaskTable());
}

TEST_F(UOMask, ReportsTheHighestBitAsTheLowest)
{
    EXPECT_EQ(1u, UOMaskTable(0x8000000000000000u).GetUOMaskTable());
}

TEST_F(UOMask, ReportsTheLowestByteAsTheHighest)
{
    EXPECT_EQ(0xFF00000000000000u, UOMaskTable(0xFF).GetUOMaskTable());
}

TEST_F(UOMask, ReportsEveryBitInReverseOrder)
{
    for (int bit = 0; bit < 64; ++bit) {
        EXPECT_EQ(bd::UInt64(1) << (63 - bit), UOMaskTable(bd::UInt64(1) << bit).GetUOMaskTable())
            << "bit " << bit;
    }
}

TEST_F(UOMask, ReportsAnyMaskInReverseOrder)
{
    for (const bd::UInt64 stored : SomeMasks()) {
        EXPECT_EQ(Reversed(stored), UOMaskTable(stored).GetUOMaskTable()) << "stored " << stored;
    }
}

TEST_F(UOMask, ReversingTwiceGivesTheStoredValueBack)
{
    for (const bd::UInt64 stored : SomeMasks()) {
        EXPECT_EQ(stored, UOMaskTable(UOMaskTable(stored).GetUOMaskTable()).GetUOMaskTable());
    }
}

// The override

TEST_F(UOMask, OverrideOneReportsNothingForbidden)
{
    g_u1Bduopmask = 1;
    for (const bd::UInt64 stored : SomeMasks()) {
        EXPECT_EQ(0u, UOMaskTable(stored).GetUOMaskTable()) << "stored " << stored;
    }
}

TEST_F(UOMask, OverrideTwoReportsEverythingForbidden)
{
    g_u1Bduopmask = 2;
    for (const bd::UInt64 stored : SomeMasks()) {
        EXPECT_EQ(AllOnes, UOMaskTable(stored).GetUOMaskTable()) << "stored " << stored;
    }
}

TEST_F(UOMask, AnyOtherOverrideReportsTheMaskUnchanged)
{
    for (const int other : {0, 3, 4, -1, -2, 257, 258, 65537, INT_MAX, INT_MIN}) {
        g_u1Bduopmask = other;
        EXPECT_EQ(0xFF00000000000000u, UOMaskTable(0xFF).GetUOMaskTable()) << "override " << other;
    }
}

TEST_F(UOMask, OverrideIsReadAtEveryCall)
{
    const UOMaskTable mask(0xFF);
    EXPECT_EQ(0xFF00000000000000u, mask.GetUOMaskTable());
    g_u1Bduopmask = 1;
    EXPECT_EQ(0u, mask.GetUOMaskTable());
    g_u1Bduopmask = 2;
    EXPECT_EQ(AllOnes, mask.GetUOMaskTable());
    g_u1Bduopmask = 0;
    EXPECT_EQ(0xFF00000000000000u, mask.GetUOMaskTable());
}

// Merging and comparing

TEST_F(UOMask, OrForbidsWhatEitherForbids)
{
    UOMaskTable mask(0x00FF00FF);
    mask |= UOMaskTable(0x0F0F0000);

    EXPECT_TRUE(mask == UOMaskTable(0x0FFF00FF));
}

TEST_F(UOMask, AndForbidsWhatBothForbid)
{
    UOMaskTable mask(0x00FF00FF);
    mask &= UOMaskTable(0x0F0F00F0);

    EXPECT_TRUE(mask == UOMaskTable(0x000F00F0));
}

TEST_F(UOMask, OrAndAndReturnTheTable)
{
    UOMaskTable mask(3);

    EXPECT_EQ(&mask, &(mask |= UOMaskTable(4)));
    EXPECT_EQ(&mask, &(mask &= UOMaskTable(4)));
    EXPECT_EQ(&mask, &(mask = UOMaskTable(4)));
}

TEST_F(UOMask, OrAndAndWithItselfChangeNothing)
{
    UOMaskTable mask(0x00FF00FF);
    const UOMaskTable& itself = mask;
    mask |= itself;
    mask &= itself;

    EXPECT_TRUE(mask == UOMaskTable(0x00FF00FF));
}

TEST_F(UOMask, IsEqualWhenTheStoredValuesAre)
{
    for (const bd::UInt64 stored : SomeMasks()) {
        EXPECT_TRUE(UOMaskTable(stored) == UOMaskTable(stored));
        EXPECT_FALSE(UOMaskTable(stored) == UOMaskTable(stored ^ 1));
        EXPECT_FALSE(UOMaskTable(stored) == UOMaskTable(stored ^ 0x8000000000000000u));
    }
}

TEST_F(UOMask, MergesAndComparesTheStoredValuesWhateverTheOverride)
{
    for (const int override : {1, 2}) {
        g_u1Bduopmask = override;
        UOMaskTable merged(1);
        merged |= UOMaskTable(2);
        UOMaskTable common(3);
        common &= UOMaskTable(2);

        EXPECT_TRUE(merged == UOMaskTable(3));
        EXPECT_TRUE(common == UOMaskTable(2));
        EXPECT_FALSE(UOMaskTable(1) == UOMaskTable(2));
    }
}

// Fields of a disc

TEST_F(UOMask, InitTakesTheFirstByteAsTheMostSignificant)
{
    const bd::UInt8 field[] = {0x01, 0x23, 0x45, 0x67, 0x89, 0xAB, 0xCD, 0xEF};
    UOMaskTable mask;
    mask.Init(field);

    EXPECT_TRUE(mask == UOMaskTable(0x0123456789ABCDEFu));
}

TEST_F(UOMask, InitReadsEightBytesAtAnyAddress)
{
    const bd::UInt8 bytes[] = {0xEE, 0x80, 0, 0, 0, 0, 0, 0, 0x01, 0xEE};
    UOMaskTable mask;
    mask.Init(bytes + 1);

    EXPECT_TRUE(mask == UOMaskTable(0x8000000000000001u));
}

TEST_F(UOMask, InitReplacesTheEarlierMask)
{
    const bd::UInt8 field[8] = {};
    UOMaskTable mask(AllOnes);
    mask.Init(field);

    EXPECT_TRUE(mask == UOMaskTable());
}

TEST_F(UOMask, InitNumbersTheOperationsFromTheFirstBitOfTheField)
{
    for (int position = 0; position < 64; ++position) {
        bd::UInt8 field[8] = {};
        field[position / 8] = static_cast<bd::UInt8>(0x80 >> (position % 8));
        UOMaskTable mask;
        mask.Init(field);

        EXPECT_EQ(bd::UInt64(1) << position, mask.GetUOMaskTable()) << "position " << position;
        for (int other = 0; other < 64; ++other) {
            EXPECT_EQ(other == position, mask.IsSet(Operation(other)))
                << "position " << position << ", operation " << other;
        }
    }
}

TEST_F(UOMask, InitOfNullIsReportedAndForbidsNothing)
{
    UOMaskTable mask(AllOnes);
    mask.Init(nullptr);

    const std::string report = journal.Take();
    EXPECT_EQ(0u, report.find("assert: field != nullptr, ")) << report;
    EXPECT_EQ(report.size() - 1, report.find('\n')) << report;
    EXPECT_TRUE(mask == UOMaskTable());
}

TEST_F(UOMask, ReportOfInitNamesItsFileRelativeToTheSources)
{
    UOMaskTable().Init(nullptr);

    const std::string report = journal.Take();
    EXPECT_NE(std::string::npos, report.find(", bdmv/database/uomasktable.cpp:")) << report;
}

// Single operations

TEST_F(UOMask, IsSetReportsNamedOperations)
{
    // Chapter search, stop and pop-up on: positions 2, 7 and 24 from the most significant bit.
    const UOMaskTable mask(0x2100008000000000u);

    EXPECT_TRUE(mask.IsSet(bd::UserOperationChapterSearch));
    EXPECT_TRUE(mask.IsSet(bd::UserOperationStop));
    EXPECT_TRUE(mask.IsSet(bd::UserOperationPopupOn));
    EXPECT_FALSE(mask.IsSet(bd::UserOperationTimeSearch));
    EXPECT_FALSE(mask.IsSet(bd::UserOperationPiPPGTextSTStreamNumberChange));
}

TEST_F(UOMask, IsSetHonoursTheOverride)
{
    const UOMaskTable mask(0x2000000000000000u);
    g_u1Bduopmask = 1;
    EXPECT_FALSE(mask.IsSet(bd::UserOperationChapterSearch));
    g_u1Bduopmask = 2;
    EXPECT_TRUE(mask.IsSet(bd::UserOperationStop));
    g_u1Bduopmask = 3;
    EXPECT_TRUE(mask.IsSet(bd::UserOperationChapterSearch));
    EXPECT_FALSE(mask.IsSet(bd::UserOperationStop));
}

TEST_F(UOMask, IsSetIsFalseOutsideTheFieldWithoutAReport)
{
    const UOMaskTable mask(AllOnes);
    for (const int override : {0, 2}) {
        g_u1Bduopmask = override;
        for (const int number : {-1, -63, -64, 64, 65, 127, 128, INT_MAX, INT_MIN}) {
            EXPECT_FALSE(mask.IsSet(Operation(number))) << "operation " << number;
        }
        EXPECT_TRUE(mask.IsSet(Operation(0)));
        EXPECT_TRUE(mask.IsSet(Operation(63)));
    }
    EXPECT_EQ("", journal.Take());
}
