#include <gtest/gtest.h>

#include "bytewriter.h"
#include "disc/errors.h"
#include "disc/movieobject.h"
#include "expectederror.h"

namespace deskplayer
{

namespace
{

const std::string FileName = "BDMV/MovieObject.bdmv";

Bytes MovieObjectBytes(unsigned count, const Bytes& objects)
{
    return Join({Ascii("MOBJ0200"), Zeros(32), Part32(Join({Zeros(4), U16(count), objects}))});
}

TEST(ParseMovieObjects, ReadsEachFlagNextToPadding)
{
    const MovieObjects movieObjects = ParseMovieObjects(
        MovieObjectBytes(3, Join({U16(0x9FFF), U16(0), U16(0x5FFF), U16(0), U16(0x3FFF), U16(0)})),
        FileName);
    ASSERT_EQ(movieObjects.objects.size(), 3u);
    EXPECT_TRUE(movieObjects.objects[0].resumeIntention);
    EXPECT_FALSE(movieObjects.objects[0].menuCallMask);
    EXPECT_FALSE(movieObjects.objects[0].titleSearchMask);
    EXPECT_FALSE(movieObjects.objects[1].resumeIntention);
    EXPECT_TRUE(movieObjects.objects[1].menuCallMask);
    EXPECT_FALSE(movieObjects.objects[1].titleSearchMask);
    EXPECT_FALSE(movieObjects.objects[2].resumeIntention);
    EXPECT_FALSE(movieObjects.objects[2].menuCallMask);
    EXPECT_TRUE(movieObjects.objects[2].titleSearchMask);
}

TEST(ParseMovieObjects, SkipsCommands)
{
    const MovieObjects movieObjects = ParseMovieObjects(
        MovieObjectBytes(2, Join({U16(0), U16(2), Repeat(24, {0xFF}), U16(0x8000), U16(0)})),
        FileName);
    ASSERT_EQ(movieObjects.objects.size(), 2u);
    EXPECT_EQ(movieObjects.objects[0].commandCount, 2u);
    EXPECT_TRUE(movieObjects.objects[1].resumeIntention);
}

TEST(ParseMovieObjects, RefusesMoreObjectsThanFollow)
{
    EXPECT_EQ(
        FormatErrorOf([&] { ParseMovieObjects(MovieObjectBytes(65535, Zeros(8)), FileName); }),
        "BDMV/MovieObject.bdmv: offset 48: number of movie objects is 65535, but expected at "
        "most 2 in the 8 bytes left in movie object section");
}

TEST(ParseMovieObjects, RefusesMoreCommandsThanFollow)
{
    const Bytes objects = Join({U16(0), U16(2), Zeros(23)});
    EXPECT_EQ(FormatErrorOf([&] { ParseMovieObjects(MovieObjectBytes(1, objects), FileName); }),
              "BDMV/MovieObject.bdmv: offset 52: number of commands is 2, but expected at most 1 "
              "in the 23 bytes left in movie object section");
}

} // namespace

} // namespace deskplayer
