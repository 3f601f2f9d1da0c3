#include <gtest/gtest.h>

#include "bytewriter.h"
#include "disc/errors.h"
#include "disc/index.h"
#include "expectederror.h"

namespace deskplayer
{

namespace
{

const std::string FileName = "BDMV/index.bdmv";

const Bytes Nothing = Zeros(12);

Bytes IndexBytes(const Bytes& applicationInfo, const Bytes& indexes)
{
    const auto address = std::uint32_t(40 + applicationInfo.size());
    return Join({Ascii("INDX0200"), U32(address), Zeros(28), applicationInfo, indexes});
}

Bytes WithTitle(const Bytes& title)
{
    return IndexBytes(Part32(Zeros(34)), Part32(Join({Nothing, Nothing, U16(1), title})));
}

TEST(ParseIndex, ReadsPreferenceAndPresenceOfStereoscopicContent)
{
    const Bytes indexes = Part32(Join({Nothing, Nothing, U16(0)}));
    Index index = ParseIndex(IndexBytes(Part32({0x40, 0x84}), indexes), FileName);
    EXPECT_TRUE(index.stereoscopicOutputPreferred);
    EXPECT_FALSE(index.stereoscopicContent);
    EXPECT_EQ(index.videoFormat, 8u);
    EXPECT_EQ(index.frameRate, 4u);

    index = ParseIndex(IndexBytes(Part32({0xBF, 0}), indexes), FileName);
    EXPECT_FALSE(index.stereoscopicOutputPreferred);
    EXPECT_TRUE(index.stereoscopicContent);
}

TEST(ParseIndex, ReadsAMovieObjectTitleNextToPadding)
{
    const Bytes title = Join({U32(0x6FFFFFFF), U16(0x7FFF), U16(0x1234), U32(0xFFFFFFFF)});
    const Index index = ParseIndex(WithTitle(title), FileName);
    ASSERT_EQ(index.titles.size(), 1u);
    EXPECT_EQ(index.titles[0].objectType, ObjectTypeMovieObject);
    EXPECT_EQ(index.titles[0].accessType, 2u);
    EXPECT_EQ(index.titles[0].playbackType, 1u);
    EXPECT_EQ(index.titles[0].movieObject, 0x1234u);
    EXPECT_EQ(index.titles[0].javaObject, "");
}

TEST(ParseIndex, ReadsAJavaTitle)
{
    const Bytes title = Join({U32(0x90000000), U16(0xC000), Ascii("12345"), U8(0xFF)});
    const Index index = ParseIndex(WithTitle(title), FileName);
    ASSERT_EQ(index.titles.size(), 1u);
    EXPECT_EQ(index.titles[0].objectType, ObjectTypeJavaObject);
    EXPECT_EQ(index.titles[0].accessType, 1u);
    EXPECT_EQ(index.titles[0].playbackType, 3u);
    EXPECT_EQ(index.titles[0].javaObject, "12345");
    EXPECT_EQ(index.titles[0].movieObject, 0u);
}

TEST(ParseIndex, DistinguishesFirstPlaybackFromTopMenu)
{
    const auto object = [](unsigned number) {
        return Join({U32(0x40000000), U16(0), U16(number), U32(0)});
    };
    const Index index = ParseIndex(
        IndexBytes(Part32(Zeros(34)), Part32(Join({object(1), object(2), U16(0)}))), FileName);
    EXPECT_EQ(index.firstPlayback.movieObject, 1u);
    EXPECT_EQ(index.topMenu.movieObject, 2u);
    EXPECT_TRUE(index.titles.empty());
}

TEST(ParseIndex, RefusesMoreTitlesThanFollow)
{
    const Bytes bytes =
        IndexBytes(Part32(Zeros(34)), Part32(Join({Nothing, Nothing, U16(65535), Nothing})));
    EXPECT_EQ(FormatErrorOf([&] { ParseIndex(bytes, FileName); }),
              "BDMV/index.bdmv: offset 106: number of titles is 65535, but expected at most 1 in "
              "the 12 bytes left in indexes");
}

TEST(ParseIndex, RefusesAnAddressInTheHeader)
{
    Bytes bytes = WithTitle(Nothing);
    Overwrite(bytes, 8, U32(39));
    EXPECT_EQ(FormatErrorOf([&] { ParseIndex(bytes, FileName); }),
              "BDMV/index.bdmv: offset 8: indexes has address 39, but expected at least 40 and at "
              "most 120, the end of the file");
}

TEST(ParseIndex, RefusesAnotherType)
{
    Bytes bytes = WithTitle(Nothing);
    Overwrite(bytes, 0, Ascii("MPLS"));
    EXPECT_EQ(FormatErrorOf([&] { ParseIndex(bytes, FileName); }),
              "BDMV/index.bdmv: offset 0: type indicator is \"MPLS\", but expected \"INDX\"");
}

} // namespace

} // namespace deskplayer
