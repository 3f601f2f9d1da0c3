#include "program.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <regex>

namespace
{

namespace fs = std::filesystem;

/** A disc of its own for every test, a copy of the sample disc, to be spoilt. */
class SpoiltDisc : public testing::Test
{
protected:
    SpoiltDisc()
    {
        fs::remove_all(folder);
        fs::copy(BDMVNAVIGATOR_SAMPLE_DISC, folder, fs::copy_options::recursive);
        fs::remove(folder / "BDMV/PLAYLIST/00002.mpls");
    }

    ~SpoiltDisc() override { fs::remove_all(folder); }

    void Write(std::streamoff offset, const std::string& bytes) const
    {
        std::fstream file(playList, std::ios::binary | std::ios::in | std::ios::out);
        file.seekp(offset);
        file << bytes;
    }

    /** The desk player says in one line what is wrong, plays nothing, and exits with status 3. */
    void ExpectRefused(const std::string& message) const
    {
        const ProgramResult result = RunDeskPlayer({folder});
        EXPECT_EQ(result.status, 3);
        EXPECT_EQ(result.output, "");
        EXPECT_EQ(std::count(result.errors.begin(), result.errors.end(), '\n'), 1);
        EXPECT_TRUE(std::regex_search(result.errors, std::regex(message))) << result.errors;
    }

    const fs::path folder = fs::temp_directory_path() / ("spoilt-disc-" + std::to_string(getpid()));
    const fs::path playList = folder / "BDMV/PLAYLIST/00001.mpls";
};

std::string LastLine(const std::string& text)
{
    const std::size_t end = text.find_last_not_of('\n');
    const std::size_t begin = text.find_last_of('\n', end);
    return text.substr(begin + 1, end - begin);
}

TEST(DeskPlayer, PlaysTheLongestPlayListOfADiscToItsEnd)
{
    const ProgramResult result = RunDeskPlayer({BDMVNAVIGATOR_SAMPLE_DISC});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(result.output,
              "00:00:00.000  PlayStarted\n"
              "00:00:00.000  FirstPictureDelivered\n"
              "00:00:58.000  Paused\n"
              "00:01:00.000  Stepped                     "
              "position=00:00:58.041 direction=Forward\n"
              "00:01:00.000  Continued                   direction=Forward speed=Normal\n"
              "00:02:54.958  StillOn\n"
              "00:02:59.958  StillOff\n"
              "00:03:00.958  StillOn\n"
              "00:03:03.958  StillOff\n"
              "00:03:03.958  Finished                    reason=EndOfMedia\n");
}

TEST(DeskPlayer, PlaysThePlayListThatIsNamed)
{
    const ProgramResult result = RunDeskPlayer({BDMVNAVIGATOR_SAMPLE_DISC, "--playlist", "2"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(LastLine(result.output),
              "00:00:21.966  Finished                    reason=EndOfMedia");
}

TEST(DeskPlayer, TakesTheBdmvFolderItselfForADisc)
{
    EXPECT_EQ(RunDeskPlayer({std::string(BDMVNAVIGATOR_SAMPLE_DISC) + "/BDMV"}).output,
              RunDeskPlayer({BDMVNAVIGATOR_SAMPLE_DISC}).output);
}

TEST(DeskPlayer, WritesTheLogLinesThatAreAskedForToStandardError)
{
    const ProgramResult result = RunDeskPlayer(
        {BDMVNAVIGATOR_SAMPLE_DISC, "--playlist", "2", "--log", "BdmvNavigator=Event"});

    const std::string time = "....-..-.. ..:..:..\\.......";
    const std::string tag = time + " BdmvNavigator Event: ";
    EXPECT_TRUE(std::regex_match(result.errors,
                                 std::regex(tag + "Sending PlayStarted\n" + tag +
                                            "Sending FirstPictureDeliveredEvent\n" + tag +
                                            "Sending Paused\n" + tag +
                                            "Sending Stepped - position: 301502,dir=0\n" + tag +
                                            "Sending Continued with playmode: dir 0, speed 5 "
                                            "\\(currentplaymode: dir 0, speed 5\\)\n" +
                                            tag + "Sending Finished - reason: 0\n")))
        << result.errors;
}

TEST(DeskPlayer, PlaysEveryDiscToTheEndOfItsMedia)
{
    std::vector<fs::path> folders = {BDMVNAVIGATOR_TEST_DISCS};
    if (const char* const more = std::getenv("BDMVNAVIGATOR_DISCS")) {
        folders.emplace_back(more);
    }
    int discs = 0;
    for (const fs::path& folder : folders) {
        for (const fs::directory_entry& disc : fs::directory_iterator(folder)) {
            if (!fs::is_directory(disc.path() / "BDMV")) {
                continue;
            }
            SCOPED_TRACE(disc.path().filename());
            const ProgramResult result = RunDeskPlayer({disc.path()});
            EXPECT_EQ(result.status, 0);
            EXPECT_EQ(result.errors, "");
            EXPECT_EQ(LastLine(result.output).substr(sizeof "hh:mm:ss.mmm"),
                      " Finished                    reason=EndOfMedia");
            ++discs;
        }
    }
    EXPECT_GE(discs, 15);
}

TEST(DeskPlayer, RefusesAFolderThatIsNotThere)
{
    const ProgramResult result = RunDeskPlayer({"no/such/folder"});

    EXPECT_EQ(result.status, 3);
    EXPECT_EQ(result.output, "");
    EXPECT_EQ(result.errors, "bdmv-deskplayer: no/such/folder: no disc, expected a folder that "
                             "holds BDMV or is it\n");
}

TEST(DeskPlayer, RefusesAPlayListThatIsNotOnTheDisc)
{
    const ProgramResult result = RunDeskPlayer({BDMVNAVIGATOR_SAMPLE_DISC, "--playlist", "7"});

    EXPECT_EQ(result.status, 3);
    EXPECT_EQ(result.output, "");
    EXPECT_NE(result.errors.find("PLAYLIST/00007.mpls: "), std::string::npos) << result.errors;
}

TEST(DeskPlayer, ExplainsWrongUsageAndExitsWithStatus2)
{
    const std::vector<std::vector<std::string>> wrong = {
        {},
        {"a", "b"},
        {BDMVNAVIGATOR_SAMPLE_DISC, "--playlist", "100000"},
        {BDMVNAVIGATOR_SAMPLE_DISC, "--playlist", "first"},
        {BDMVNAVIGATOR_SAMPLE_DISC, "--no-such-option"},
        {BDMVNAVIGATOR_SAMPLE_DISC, "--log", "NoSuchComponent=Event"}};
    for (const std::vector<std::string>& arguments : wrong) {
        const ProgramResult result = RunDeskPlayer(arguments);
        EXPECT_EQ(result.status, 2);
        EXPECT_EQ(result.output, "");
        EXPECT_NE(result.errors, "");
    }
}

TEST(DeskPlayer, ReportsThatItsOutputCannotBeWritten)
{
    const std::string command = std::string(BDMVNAVIGATOR_DESKPLAYER) + " " +
                                BDMVNAVIGATOR_SAMPLE_DISC + " >/dev/full 2>&1";
    EXPECT_EQ(WEXITSTATUS(std::system(command.c_str())), 1);
}

TEST_F(SpoiltDisc, IsRefusedWhenThePlayListIsAnotherKindOfFile)
{
    Write(0, "INDX");
    ExpectRefused("PLAYLIST/00001\\.mpls: offset 0: .*INDX.*MPLS");
}

TEST_F(SpoiltDisc, IsRefusedWhenThePlayListIsTruncated)
{
    fs::resize_file(playList, 600);
    ExpectRefused("PLAYLIST/00001\\.mpls: offset \\d+: .*expected");
}

TEST_F(SpoiltDisc, IsRefusedWhenThePlayListIsEmpty)
{
    fs::resize_file(playList, 0);
    ExpectRefused("PLAYLIST/00001\\.mpls: offset 0: .*expected");
}

TEST_F(SpoiltDisc, IsRefusedWhenAPlayItemEndsBeforeItStarts)
{
    const std::streamoff outTimeOfTheFirstItem = 58 + 10 + 18;
    Write(outTimeOfTheFirstItem, std::string(4, '\0'));
    ExpectRefused("PLAYLIST/00001\\.mpls: offset 86: .*0.*expected");
}

TEST_F(SpoiltDisc, IsRefusedWhenTheClipInformationIsSpoilt)
{
    fs::resize_file(folder / "BDMV/CLIPINF/00002.clpi", 100);
    ExpectRefused("CLIPINF/00002\\.clpi: offset \\d+: .*expected");
}

TEST_F(SpoiltDisc, IsRefusedWhenThereIsNoPlayList)
{
    fs::remove(playList);
    ExpectRefused("PLAYLIST: .*expected");
}

TEST_F(SpoiltDisc, PlaysWhatCanBeReadAndNamesWhatCannot)
{
    fs::copy_file(folder / "BDMV/index.bdmv", folder / "BDMV/PLAYLIST/00003.mpls");

    const ProgramResult result = RunDeskPlayer({folder});

    EXPECT_EQ(result.status, 0);
    EXPECT_TRUE(
        std::regex_search(result.errors, std::regex("left out: .*00003\\.mpls: offset 0: .*INDX")))
        << result.errors;
    EXPECT_EQ(LastLine(result.output),
              "00:03:03.958  Finished                    reason=EndOfMedia");
}

} // namespace
