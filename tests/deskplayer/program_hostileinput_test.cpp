#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>

#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

#include "disc/bytewriter.h"
#include "disc/testdiscs.h"
#include "programtest.h"
#include "sanitized.h"
#include "session/script.h"

namespace
{

using bdmvtest::Sanitized;

/** The CPU time of the children of this process. */
double SecondsOfChildren()
{
    rusage usage = {};
    getrusage(RUSAGE_CHILDREN, &usage);
    const auto seconds = [](const timeval& time) {
        return static_cast<double>(time.tv_sec) + 1e-6 * static_cast<double>(time.tv_usec);
    };
    return seconds(usage.ru_utime) + seconds(usage.ru_stime);
}

/** Expects a message of one line within 64 MiB and a second of CPU time. */
class HostileInput : public ScratchDisc
{
protected:
    void SetUp() override
    {
        if (Sanitized) {
            GTEST_SKIP() << "sanitizers need more memory";
        }
    }

    static void ExpectFault(const std::vector<std::string>& arguments, int status,
                            const std::string& message)
    {
        SCOPED_TRACE(testing::PrintToString(arguments));
        const double before = SecondsOfChildren();
        const ProgramResult result = RunDeskPlayerWithLimitedMemory(arguments, 64 * 1024);
        EXPECT_LT(SecondsOfChildren() - before, 1);
        EXPECT_EQ(result.status, status);
        EXPECT_EQ(result.output, "");
        EXPECT_EQ(LinesOf(result.errors).size(), 1U) << result.errors;
        EXPECT_NE(result.errors.find(message), std::string::npos) << result.errors;
    }

    /** Whether the play list is named, searched for or described. */
    void ExpectRefusedPlayList(const std::string& message) const
    {
        ExpectFault({disc}, 3, message);
        ExpectFault({disc, "--playlist", "1"}, 3, message);
        ExpectFault({disc, "--describe", "1"}, 3, message);
    }

    void ExpectRefusedSession(const std::string& session, const std::string& message) const
    {
        ExpectFault({disc, "--session", session}, 2, message);
    }

    static constexpr std::uintmax_t ThreeGibibytes = std::uintmax_t{3} << 30;
};

TEST_F(HostileInput, MayBeAHugePlayList)
{
    ResizeSparsely(playList, ThreeGibibytes);
    ExpectRefusedPlayList("PLAYLIST/00001.mpls: has 3221225472 bytes, expected at most 1048576");
}

TEST_F(HostileInput, MayBeHugeClipInformation)
{
    ResizeSparsely(disc / "BDMV/CLIPINF/00002.clpi", ThreeGibibytes);
    ExpectFault({disc, "--only", "PlayFailed"}, 0,
                "CLIPINF/00002.clpi: has 3221225472 bytes, expected at most 4194304");
}

TEST_F(HostileInput, MayBeAPipeOrAFolderInsteadOfAPlayList)
{
    fs::remove(playList);
    ASSERT_EQ(mkfifo(playList.c_str(), 0600), 0);
    ExpectRefusedPlayList("PLAYLIST/00001.mpls: expected a regular file");
    fs::remove(playList);
    fs::create_directory(playList);
    ExpectRefusedPlayList("PLAYLIST/00001.mpls: expected a regular file");
}

TEST_F(HostileInput, MayClaimMorePlayItemsThanItHas)
{
    deskplayer::PlayListBytes bytes = deskplayer::DensePlayList();
    bytes.itemCount = 20000;
    deskplayer::WriteBytes(playList, bytes.Make());
    ExpectRefusedPlayList("PLAYLIST/00001.mpls: offset ");
}

TEST_F(HostileInput, MayBeThePlayListThatTakesTheMostMemory)
{
    const deskplayer::Bytes dense = deskplayer::DensePlayList().Make();
    deskplayer::WriteBytes(playList, dense);
    deskplayer::WriteBytes(disc / "BDMV/PLAYLIST/00002.mpls", dense);
    for (const std::vector<std::string>& option :
         {std::vector<std::string>{"--list"}, {"--describe", "1"}, {}}) {
        std::vector<std::string> arguments = {disc};
        arguments.insert(arguments.end(), option.begin(), option.end());
        const ProgramResult result = RunDeskPlayerWithLimitedMemory(arguments, 64 * 1024);
        EXPECT_EQ(result.status, 0);
        EXPECT_EQ(result.errors, "");
    }
}

TEST_F(HostileInput, MayReferToALargeClipInEveryPlayItem)
{
    using namespace deskplayer;
    PlayItemBytes item;
    item.clip = "00000";
    item.inTime = item.outTime;
    item.streamTable =
        StreamTableBytes({1, 0, 0, 0, 0, 0, 0, 0},
                         Join({StreamEntry(1), StreamAttributesBytes(0x1B, {0x61, 0, 0, 0})}));
    PlayListBytes bytes;
    bytes.itemCount = 1000;
    bytes.items = Repeat(bytes.itemCount, item.Make());
    WriteBytes(playList, bytes.Make());
    const Bytes stream = Join({U16(1), Part8({0x1B, 0x61, 0x30})});
    WriteBytes(disc / "BDMV/CLIPINF/00000.clpi",
               ClipInfoOf(255, Repeat(255, ProgramBytes(255, Repeat(255, stream)))));

    const double before = SecondsOfChildren();
    const ProgramResult result =
        RunDeskPlayerWithLimitedMemory({disc, "--only", "Finished"}, 64 * 1024);
    EXPECT_LT(SecondsOfChildren() - before, 1);
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
}

TEST_F(HostileInput, MayBeAnEndlessOrSilentSession)
{
    const std::string tooLong = ": session too long, expected at most 1048576 bytes";
    ExpectRefusedSession("/dev/zero", "/dev/zero" + tooLong);
    const std::string huge = WriteFile("huge.session", "");
    ResizeSparsely(huge, ThreeGibibytes);
    ExpectRefusedSession(huge, huge + tooLong);
    const std::string silent = folder / "silent.session";
    ASSERT_EQ(mkfifo(silent.c_str(), 0600), 0);
    ExpectRefusedSession(silent, silent + ": timed out waiting for input");
}

TEST_F(HostileInput, MayBeASessionOfOneLineOrWord)
{
    std::string words;
    while (words.size() + 2 < deskplayer::LongestScript) {
        words += "a ";
    }
    const std::string line = WriteFile("line.session", words);
    ExpectRefusedSession(line, line + ":1:1: unexpected 'a'");
    const std::string word = WriteFile("word.session", std::string(deskplayer::LongestScript, 'a'));
    ExpectRefusedSession(word, word + ":1:1: unexpected 'aaa");
    const std::string late =
        WriteFile("late.session", std::string(deskplayer::LongestScript - 1, '\n') + "x");
    ExpectRefusedSession(late, late + ":1048576:1: unexpected 'x'");
}

} // namespace
