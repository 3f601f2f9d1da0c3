#include <gtest/gtest.h>

#include <filesystem>
#include <regex>

#include "programtest.h"

namespace
{

using DeskPlayerListing = ScratchDisc;

TEST_F(DeskPlayerListing, ListsThePlayListsOfADisc)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--list"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
    EXPECT_NE(result.output.find("\n00001   00:02:54.000      6         7       3  "),
              std::string::npos)
        << result.output;
    EXPECT_NE(result.output.find("\n00002   00:00:20.000      1         1       1  "),
              std::string::npos);
}

TEST_F(DeskPlayerListing, DescribesAPlayList)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--describe", "2"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
    EXPECT_NE(result.output.find("00020"), std::string::npos) << "its clip";
}

TEST_F(DeskPlayerListing, ListsTheReadablePlayListsOfADamagedDisc)
{
    fs::copy_file(disc / "BDMV/index.bdmv", disc / "BDMV/PLAYLIST/00003.mpls");

    const ProgramResult result = RunDeskPlayer({disc, "--list"});

    EXPECT_EQ(result.status, 3);
    EXPECT_NE(result.output.find("\n00001 "), std::string::npos);
    EXPECT_TRUE(
        std::regex_search(result.output + result.errors, std::regex("00003.*offset 0: .*INDX")))
        << result.output << result.errors;
}

TEST_F(DeskPlayerListing, RefusesToDescribeAMissingPlayList)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--describe", "7"});

    EXPECT_EQ(result.status, 3);
    EXPECT_EQ(result.output, "");
    EXPECT_NE(result.errors.find("PLAYLIST/00007.mpls: "), std::string::npos) << result.errors;
}

} // namespace
