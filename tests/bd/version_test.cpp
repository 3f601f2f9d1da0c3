#include <gtest/gtest.h>

#include <string>

#include "bdmvnavigator/version.h"

extern "C" const char* VersionFromC();

TEST(Version, IsThatOfTheProject)
{
    EXPECT_EQ(PROJECT_VERSION_MAJOR, BDMVNAVIGATOR_VERSION_MAJOR);
    EXPECT_EQ(PROJECT_VERSION_MINOR, BDMVNAVIGATOR_VERSION_MINOR);
    EXPECT_EQ(PROJECT_VERSION_PATCH, BDMVNAVIGATOR_VERSION_PATCH);
}

TEST(Version, TextIsThatOfTheProject)
{
    EXPECT_STREQ(PROJECT_VERSION, BDMVNAVIGATOR_VERSION_TEXT);
}

TEST(Version, NumberHasThreeDigitsForMinorAndPatch)
{
    EXPECT_EQ(PROJECT_VERSION_MAJOR * 1000000 + PROJECT_VERSION_MINOR * 1000 +
                  PROJECT_VERSION_PATCH,
              BDMVNAVIGATOR_VERSION_NUMBER);
}

TEST(Version, CanBeComparedByThePreprocessor)
{
#if BDMVNAVIGATOR_VERSION_NUMBER > 0 && BDMVNAVIGATOR_VERSION_NUMBER < 1000000000
    const bool compared = true;
#else
    const bool compared = false;
#endif

    EXPECT_TRUE(compared);
}

TEST(Version, IsTheSameInC)
{
    EXPECT_STREQ(BDMVNAVIGATOR_VERSION_TEXT, VersionFromC());
}
