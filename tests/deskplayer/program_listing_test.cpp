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
    EXPECT_TRUE(std::regex_match(
        result.errors, std::regex("bdmv-deskplayer: .*00003\\.mpls: offset 0: .*INDX.*\n")))
        << result.errors;
}

TEST_F(DeskPlayerListing, EndsWithStatus3AndAMessageForEachFault)
{
    fs::remove(disc / "BDMV/index.bdmv");
    fs::remove(disc / "BDMV/CLIPINF/00002.clpi");
    const std::string missingClip = "bdmv-deskplayer: .*/CLIPINF/00002\\.clpi: No such file.*\n";

    const ProgramResult list = RunDeskPlayer({disc, "--list"});
    EXPECT_EQ(list.status, 3);
    EXPECT_NE(list.output.find("\n00001   00:02:54.000"), std::string::npos) << list.output;
    EXPECT_TRUE(std::regex_search(
        list.errors, std::regex("^bdmv-deskplayer: .*/index\\.bdmv: No such file.*\n")))
        << list.errors;

    const ProgramResult description = RunDeskPlayer({disc, "--describe", "1"});
    EXPECT_EQ(description.status, 3);
    EXPECT_NE(description.output.find("chapter 1: "), std::string::npos) << description.output;
    EXPECT_TRUE(std::regex_match(description.errors, std::regex(missingClip)))
        << description.errors;
}

TEST_F(DeskPlayerListing, IsWrittenAsJson)
{
    const ProgramResult list = RunDeskPlayer({SampleDisc, "--list", "--format", "json"});
    EXPECT_EQ(list.status, 0);
    EXPECT_EQ(list.output.rfind(R"({"part":"index","version":"0200",)", 0), 0u) << list.output;

    const ProgramResult description =
        RunDeskPlayer({SampleDisc, "--describe", "2", "--format", "json"});
    EXPECT_EQ(description.status, 0);
    EXPECT_EQ(description.output.rfind(R"({"part":"playList","number":2,)", 0), 0u)
        << description.output;
}

TEST_F(DeskPlayerListing, ChecksADisc)
{
    const ProgramResult sound = RunDeskPlayer({SampleDisc, "--check"});
    EXPECT_EQ(sound.status, 0);
    EXPECT_EQ(sound.output, "");
    EXPECT_EQ(sound.errors, "");

    fs::create_directory(disc / "BDMV/BACKUP");
    fs::copy(disc / "BDMV/index.bdmv", disc / "BDMV/BACKUP");
    fs::resize_file(disc / "BDMV/index.bdmv", 0);
    const ProgramResult text = RunDeskPlayer({disc, "--check"});
    EXPECT_EQ(text.status, 3);
    EXPECT_EQ(LinesOf(text.output).front(),
              "BDMV/index.bdmv: offset 0: file has 0 bytes left, but expected 4 bytes for type "
              "indicator");
    EXPECT_EQ(text.errors, "");

    const ProgramResult json = RunDeskPlayer({disc, "--check", "--format", "json"});
    EXPECT_EQ(json.status, 3);
    EXPECT_EQ(LinesOf(json.output).front(),
              R"({"file":"BDMV/index.bdmv","offset":0,"found":"file has 0 bytes left",)"
              R"("expected":"4 bytes for type indicator"})");
}

TEST_F(DeskPlayerListing, IsNotWrittenAsATrace)
{
    ExpectUsageError({SampleDisc, "--list", "--format", "trace"}, "--list excludes --format trace");
}

TEST_F(DeskPlayerListing, RefusesToDescribeAMissingPlayList)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--describe", "7"});

    EXPECT_EQ(result.status, 3);
    EXPECT_EQ(result.output, "");
    EXPECT_NE(result.errors.find("PLAYLIST/00007.mpls: "), std::string::npos) << result.errors;
}

} // namespace
