#include <gtest/gtest.h>

#include <filesystem>
#include <regex>
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

/** Expects the callbacks of the whole disc, except for the aspect ratio, and these notes. */
void ExpectPlayed(const fs::path& disc, const std::string& notes)
{
    const auto withoutAspectRatio = [](const std::string& text) {
        return std::regex_replace(text, std::regex(" *aspectRatio=\\S+"), "");
    };
    const ProgramResult result = RunDeskPlayer({disc, "--playlist", "1"});
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(withoutAspectRatio(result.output),
              withoutAspectRatio(RunDeskPlayer({SampleDisc, "--playlist", "1"}).output));
    EXPECT_TRUE(std::regex_match(result.errors, std::regex(notes))) << result.errors;
}

TEST_F(FaultyDisc, IsPlayedIfClipInformationIsDamaged)
{
    const fs::path clip = disc / "BDMV/CLIPINF/00002.clpi";
    fs::resize_file(clip, 100);
    ExpectPlayed(disc, "bdmv-deskplayer: aspect ratio not known: BDMV/CLIPINF/00002\\.clpi: offset "
                       "\\d+: .*expected.*\n");
}

TEST_F(FaultyDisc, IsPlayedIfClipInformationIsNotAFile)
{
    const fs::path clip = disc / "BDMV/CLIPINF/00002.clpi";
    fs::remove(clip);
    fs::create_directory(clip);
    ExpectPlayed(disc,
                 "bdmv-deskplayer: aspect ratio not known: .*/CLIPINF/00002\\.clpi: expected a "
                 "regular file\n");
}

TEST_F(FaultyDisc, IsPlayedFromBackupCopies)
{
    fs::create_directories(disc / "BDMV/BACKUP/PLAYLIST");
    fs::copy(playList, disc / "BDMV/BACKUP/PLAYLIST");
    Patch(0, "INDX");
    ExpectPlayed(disc, "bdmv-deskplayer: BDMV/PLAYLIST/00001\\.mpls: offset 0: .*INDX.*; using the "
                       "copy BDMV/BACKUP/PLAYLIST/00001\\.mpls\n");
}

TEST_F(FaultyDisc, IsPlayedWithoutANoteIfThereIsNoClipInformation)
{
    fs::remove_all(disc / "BDMV/CLIPINF");
    ExpectPlayed(disc, "");
}

TEST_F(FaultyDisc, IsPlayedIfTheClipInformationFolderCannotBeSearched)
{
    fs::remove_all(disc / "BDMV/CLIPINF");
    fs::create_symlink("CLIPINF", disc / "BDMV/CLIPINF"); // a loop, even for the superuser
    ExpectPlayed(disc,
                 "(bdmv-deskplayer: aspect ratio not known: .*/CLIPINF/\\d{5}\\.clpi: Too many "
                 "levels of symbolic links.*\n)+");
}

TEST_F(FaultyDisc, IsRefusedIfThereIsNoPlayList)
{
    fs::remove(playList);
    ExpectRefused("PLAYLIST: .*expected");
}

} // namespace
