#include <gtest/gtest.h>

#include "bytewriter.h"
#include "disc/bytereader.h"
#include "disc/errors.h"
#include "disc/fields.h"
#include "expectederror.h"

namespace deskplayer
{

namespace
{

const std::string FileName = "file";

TEST(ByteReader, ReadsBigEndianNumbersOfEverySize)
{
    const Bytes bytes{0x81, 0x82, 0x83, 0x84, 0x85, 0x86, 0x87, 0x88,
                      0x89, 0x8A, 0x8B, 0x8C, 0x8D, 0x8E, 0x8F};
    ByteReader reader(bytes, FileName);
    EXPECT_EQ(reader.UInt8("a"), 0x81u);
    EXPECT_EQ(reader.UInt16("b"), 0x8283u);
    EXPECT_EQ(reader.UInt32("c"), 0x84858687u);
    EXPECT_EQ(reader.UInt64("d"), 0x88898A8B8C8D8E8Fu);
    EXPECT_EQ(reader.BytesLeft(), 0u);
}

TEST(ByteReader, KnowsItsOffsetAndTheBytesLeft)
{
    const Bytes bytes = Zeros(10);
    ByteReader reader(bytes, FileName);
    reader.Skip(3, "padding");
    EXPECT_EQ(reader.Offset(), 3u);
    EXPECT_EQ(reader.BytesLeft(), 7u);
}

TEST(ByteReader, DropsOnlyTrailingNulBytesOfText)
{
    const Bytes bytes{'a', 0, 'b', 0, 0};
    ByteReader reader(bytes, FileName);
    EXPECT_EQ(reader.Text(5, "text"), std::string("a\0b", 3));
}

TEST(ByteReader, ReadsNulBytesAsEmptyText)
{
    const Bytes bytes = Zeros(3);
    ByteReader reader(bytes, FileName);
    EXPECT_EQ(reader.Text(3, "text"), "");
}

TEST(ByteReader, RefusesATruncatedNumber)
{
    const Bytes bytes = Zeros(5);
    ByteReader reader(bytes, FileName);
    reader.Skip(2, "padding");
    EXPECT_EQ(FormatErrorOf([&] { reader.UInt32("IN time"); }),
              "file: offset 2: file has 3 bytes left, but expected 4 bytes for IN time");
}

TEST(ByteReader, RefusesTruncatedText)
{
    const Bytes bytes = Zeros(1);
    ByteReader reader(bytes, FileName);
    EXPECT_EQ(FormatErrorOf([&] { reader.Text(5, "clip name"); }),
              "file: offset 0: file has 1 byte left, but expected 5 bytes for clip name");
}

TEST(ByteReader, RefusesToSkipBeyondTheEnd)
{
    const Bytes bytes = Zeros(1);
    ByteReader reader(bytes, FileName);
    EXPECT_EQ(FormatErrorOf([&] { reader.Skip(2, "padding"); }),
              "file: offset 0: file has 1 byte left, but expected 2 bytes for padding");
}

TEST(ByteReader, KeepsItsOffsetAfterARefusal)
{
    const Bytes bytes{1, 2, 3};
    ByteReader reader(bytes, FileName);
    EXPECT_THROW(reader.UInt32("number"), FormatError);
    EXPECT_EQ(reader.UInt8("number"), 1u);
}

TEST(ByteReader, TakesPartsWithLengthsOfEverySize)
{
    const Bytes bytes = Join({Part8({1}), Part16({2, 2}), Part32({3, 3, 3}), {4}});
    ByteReader reader(bytes, FileName);
    EXPECT_EQ(reader.TakePart8({"part"}).BytesLeft(), 1u);
    EXPECT_EQ(reader.TakePart16({"part"}).BytesLeft(), 2u);
    EXPECT_EQ(reader.TakePart32({"part"}).BytesLeft(), 3u);
    EXPECT_EQ(reader.UInt8("next"), 4u);
}

TEST(ByteReader, CountsOffsetsOfAPartFromTheStartOfTheFile)
{
    const Bytes bytes = Join({Zeros(4), Part16({7, 8})});
    ByteReader reader(bytes, FileName);
    reader.Skip(4, "padding");
    ByteReader part = reader.TakePart16({"part"});
    EXPECT_EQ(part.Offset(), 6u);
    EXPECT_EQ(part.UInt8("first"), 7u);
}

TEST(ByteReader, KeepsAPartWithinItsLength)
{
    const Bytes bytes = Join({Part8({1}), {2}});
    ByteReader reader(bytes, FileName);
    ByteReader part = reader.TakePart8({"play item", 3});
    EXPECT_EQ(FormatErrorOf([&] { part.UInt16("number"); }),
              "file: offset 1: play item 3 has 1 byte left, but expected 2 bytes for number");
}

TEST(ByteReader, RefusesAPartLongerThanTheEnclosingOne)
{
    const Bytes bytes = Join({Part16(Join({U16(3), Zeros(2)})), Zeros(5)});
    ByteReader reader(bytes, FileName);
    ByteReader section = reader.TakePart16({"play list section"});
    EXPECT_EQ(FormatErrorOf([&] {
                  section.TakePart16({"play item", 0});
              }),
              "file: offset 2: play item 0 has length 3, but expected at most the 2 bytes left in "
              "play list section");
}

TEST(ByteReader, RefusesTheMaximumLength)
{
    const Bytes bytes = U32(0xFFFFFFFF);
    ByteReader reader(bytes, FileName);
    EXPECT_EQ(FormatErrorOf([&] { reader.TakePart32({"part"}); }),
              "file: offset 0: part has length 4294967295, but expected at most the 0 bytes left "
              "in file");
}

TEST(ByteReader, TakesAPartAtAnAddressAndContinuesAfterTheAddress)
{
    const Bytes bytes = Join({U32(6), U16(9), Part32({1, 2}), Zeros(3)});
    ByteReader reader(bytes, FileName);
    ByteReader part = reader.PartAtAddress(6, {"part"});
    EXPECT_EQ(part.Offset(), 10u);
    EXPECT_EQ(part.BytesLeft(), 2u);
    EXPECT_EQ(reader.UInt16("next"), 9u);
}

TEST(ByteReader, RefusesAnAddressBelowTheLowest)
{
    const Bytes bytes = Join({Zeros(2), U32(5), Zeros(10)});
    ByteReader reader(bytes, FileName);
    reader.Skip(2, "padding");
    EXPECT_EQ(FormatErrorOf([&] { reader.PartAtAddress(6, {"mark section"}); }),
              "file: offset 2: mark section has address 5, but expected at least 6 and at most 16, "
              "the end of the file");
}

TEST(ByteReader, RefusesAnAddressPastTheEndOfTheFile)
{
    const Bytes bytes = U32(5);
    ByteReader reader(bytes, FileName);
    EXPECT_EQ(FormatErrorOf([&] { reader.PartAtAddress(0, {"part"}); }),
              "file: offset 0: part has address 5, but expected at least 0 and at most 4, the end "
              "of the file");
}

TEST(ByteReader, RefusesTheEndOfTheFileAsAnAddressBecauseNoLengthFollows)
{
    const Bytes bytes = U32(4);
    ByteReader reader(bytes, FileName);
    EXPECT_EQ(FormatErrorOf([&] { reader.PartAtAddress(0, {"part"}); }),
              "file: offset 4: file has 0 bytes left, but expected 4 bytes for length");
}

TEST(ByteReader, TreatsAddressZeroOfAnOptionalPartAsNoPart)
{
    const Bytes bytes = U32(0);
    ByteReader reader(bytes, FileName);
    EXPECT_FALSE(reader.OptionalPartAtAddress(0, {"part"}));
    EXPECT_EQ(reader.BytesLeft(), 0u);
}

TEST(ByteReader, TakesAnOptionalPartAtItsAddress)
{
    const Bytes bytes = Join({U32(4), Part32({1})});
    ByteReader reader(bytes, FileName);
    EXPECT_TRUE(reader.OptionalPartAtAddress(4, {"part"}));
}

TEST(ByteReader, AcceptsACountOfEntriesThatJustFit)
{
    const Bytes bytes = Join({U8(2), U16(2), Zeros(7)});
    ByteReader reader(bytes, FileName);
    EXPECT_EQ(reader.Count8(4, "count"), 2u);
    EXPECT_EQ(reader.Count16(3, "count"), 2u);
}

TEST(ByteReader, RefusesACountOfMoreEntriesThanFit)
{
    const Bytes bytes = Join({U16(3), Zeros(29)});
    ByteReader reader(bytes, FileName);
    EXPECT_EQ(FormatErrorOf([&] { reader.Count16(10, "number of marks"); }),
              "file: offset 0: number of marks is 3, but expected at most 2 in the 29 bytes left "
              "in file");
}

TEST(FormatError, ReportsFileOffsetWhatWasFoundAndWhatWasExpected)
{
    const FormatError error("BDMV/index.bdmv", 12, "length 3", "2");
    EXPECT_EQ(error.FileName(), "BDMV/index.bdmv");
    EXPECT_EQ(error.Offset(), 12u);
    EXPECT_EQ(error.Found(), "length 3");
    EXPECT_EQ(error.Expected(), "2");
    EXPECT_STREQ(error.what(), "BDMV/index.bdmv: offset 12: length 3, but expected 2");
}

TEST(Bit, CountsFromTheMostSignificantOne)
{
    EXPECT_TRUE(Bit(std::uint8_t{0x80}, 0));
    EXPECT_TRUE(Bit(std::uint16_t{0x0001}, 15));
    EXPECT_TRUE(Bit(std::uint32_t{0x00000001}, 31));
    EXPECT_FALSE(Bit(std::uint16_t{0xFFEF}, 11));
}

} // namespace

} // namespace deskplayer
