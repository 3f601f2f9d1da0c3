#include <gtest/gtest.h>

#include <filesystem>
#include <string>

#include "programtest.h"

namespace
{

using FaultyDisc = ScratchDisc;

TEST_F(FaultyDisc, IsRefusedWhenTheFolderDoesNotExist)
{
    const ProgramResult result = RunDeskPlayer({"no/such/folder"});

    EXPECT_EQ(result.status, 3);
    EXPECT_EQ(result.output, "");
    EXPECT_EQ(result.errors, "bdmv-deskplayer: no/such/folder: not a disc, expected a BDMV folder "
                             "or its parent\n");
}

TEST_F(FaultyDisc, IsRefusedWhenTheNamedPlayListIsMissing)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--playlist", "7"});

    EXPECT_EQ(result.status, 3);
    EXPECT_EQ(result.output, "");
    EXPECT_NE(result.errors.find("PLAYLIST/00007.mpls: "), std::string::npos) << result.errors;
}

TEST_F(FaultyDisc, IsRefusedWhenThePlayListIsAnotherKindOfFile)
{
    Patch(0, "INDX");
    ExpectRefused("PLAYLIST/00001\\.mpls: offset 0: .*INDX.*MPLS");
}

TEST_F(FaultyDisc, IsRefusedWhenThePlayListIsTruncated)
{
    fs::resize_file(playList, 600);
    ExpectRefused("PLAYLIST/00001\\.mpls: offset \\d+: .*expected");
    ExpectRefused("PLAYLIST/00001\\.mpls: offset \\d+: .*expected", {"--playlist", "1"});
    ExpectRefused("PLAYLIST/00001\\.mpls: offset \\d+: .*expected", {"--describe", "1"});
    ExpectRefused("PLAYLIST/00001\\.mpls: offset \\d+: .*expected", {"--session", Evening});
}

TEST_F(FaultyDisc, IsRefusedWhenThePlayListIsEmpty)
{
    fs::resize_file(playList, 0);
    ExpectRefused("PLAYLIST/00001\\.mpls: offset 0: .*expected");
}

TEST_F(FaultyDisc, IsRefusedWhenThePlayListIsTooLarge)
{
    ResizeSparsely(playList, std::uintmax_t{1} << 40);
    ExpectRefused("PLAYLIST/00001\\.mpls: .*expected");
}

TEST_F(FaultyDisc, IsRefusedWhenThePlayListIsAFolderOrADevice)
{
    fs::remove(playList);
    fs::create_directory(playList);
    ExpectRefused("PLAYLIST.*expected", {"--playlist", "1"});
    fs::remove(playList);
    fs::create_symlink("/dev/zero", playList);
    ExpectRefused("PLAYLIST.*expected", {"--playlist", "1"});
}

TEST_F(FaultyDisc, IsRefusedWhenAPlayItemEndsBeforeItStarts)
{
    const std::streamoff outTimeOfTheFirstItem = 58 + 10 + 18;
    Patch(outTimeOfTheFirstItem, std::string(4, '\0'));
    ExpectRefused("PLAYLIST/00001\\.mpls: offset 86: .*0.*expected");
}

TEST_F(FaultyDisc, IsRefusedWhenTheClipInformationIsTruncated)
{
    fs::resize_file(disc / "BDMV/CLIPINF/00002.clpi", 100);
    ExpectRefused("CLIPINF/00002\\.clpi: offset \\d+: .*expected");
}

TEST_F(FaultyDisc, IsRefusedIfThereIsNoPlayList)
{
    fs::remove(playList);
    ExpectRefused("PLAYLIST: .*expected");
}

} // namespace
