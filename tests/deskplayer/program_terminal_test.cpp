#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <chrono>
#include <csignal>
#include <cstdlib>
#include <regex>
#include <string>
#include <thread>
#include <vector>

#include "programtest.h"

namespace
{

using DeskPlayerTerminal = ScratchDisc;

/** Waits for a file that another process writes. @return whether @p text appeared in it in time */
bool AppearsIn(const fs::path& file, const std::string& text)
{
    const auto end = std::chrono::steady_clock::now() + std::chrono::seconds(20);
    while (std::chrono::steady_clock::now() < end) {
        if (ReadContents(file).find(text) != std::string::npos) {
            return true;
        }
        std::this_thread::sleep_for(std::chrono::milliseconds(10));
    }
    return false;
}

TEST_F(DeskPlayerTerminal, ShowsProgressIfPlaybackTakesLong)
{
    MakeShort(45 * 1500);

    const ProgramResult result =
        RunDeskPlayerOnTerminal({disc, "--realtime", "--output", folder / "out.txt"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "\r00:00:01.000\r             \r") << "erased at the end";
}

TEST_F(DeskPlayerTerminal, ShowsProgressIfACheckTakesLong)
{
    fs::resize_file(playList, 1024 * 1024);
    for (int number = 10000; number < 18000; ++number) {
        fs::create_symlink(playList, disc / "BDMV/PLAYLIST" / (std::to_string(number) + ".mpls"));
    }

    const ProgramResult result = RunDeskPlayerOnTerminal({disc, "--check"});

    EXPECT_EQ(result.status, 0);
    EXPECT_TRUE(
        std::regex_match(result.output, std::regex("(\rBDMV/PLAYLIST/1[0-9]{4}\\.mpls\r {25}\r)+")))
        << testing::PrintToString(result.output);
}

TEST_F(DeskPlayerTerminal, IsNeededForProgress)
{
    MakeShort(45 * 1500);

    const ProgramResult result =
        RunDeskPlayer({disc, "--realtime", "--output", folder / "out.txt"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
}

TEST_F(DeskPlayerTerminal, ShowsNoProgressNextToOutput)
{
    MakeShort(45 * 1500);

    const ProgramResult result =
        RunDeskPlayerOnTerminal({disc, "--realtime", "--only", "Finished"});

    EXPECT_EQ(result.output.find("\r0"), std::string::npos) << result.output;
    EXPECT_NE(result.output.find("Finished"), std::string::npos);
}

TEST_F(DeskPlayerTerminal, ShowsColoursUnlessTheEnvironmentForbidsThem)
{
    const std::vector<std::string> arguments = {SampleDisc, "--only", "Finished"};
    unsetenv("NO_COLOR");
    setenv("TERM", "dumb", 1);
    EXPECT_EQ(RunDeskPlayerOnTerminal(arguments).output.find('\x1B'), std::string::npos);
    setenv("TERM", "xterm", 1);
    EXPECT_NE(RunDeskPlayerOnTerminal(arguments).output.find('\x1B'), std::string::npos);
    setenv("NO_COLOR", "1", 1);
    EXPECT_EQ(RunDeskPlayerOnTerminal(arguments).output,
              "00:03:02.000  Finished                    reason=EndOfMedia\r\n");
    unsetenv("NO_COLOR");
    EXPECT_EQ(RunDeskPlayer(arguments).output.find('\x1B'), std::string::npos);
}

TEST_F(DeskPlayerTerminal, ShowsTheKeysOfTheRemoteAndEndsWithoutInput)
{
    const ProgramResult result =
        RunDeskPlayer({SampleDisc, "--remote", "--only", "PlayStarted,Finished"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "00:00:00.000  PlayStarted\n");
    EXPECT_NE(result.errors.find("space pause/continue"), std::string::npos) << result.errors;
}

TEST_F(DeskPlayerTerminal, WritesEveryCallbackOfTheRemoteAtOnceWhereverTheOutputGoes)
{
    const std::string file = folder / "out.txt";
    for (const bool redirected : {false, true}) {
        fs::remove(file);
        std::vector<std::string> arguments = {SampleDisc, "--remote"};
        if (!redirected) {
            arguments.insert(arguments.end(), {"--output", file});
        }
        TerminalProgram program(arguments, redirected ? file : "");
        EXPECT_TRUE(AppearsIn(file, "CurrentTimePosition")) << redirected;
        program.Press(" ");
        EXPECT_TRUE(AppearsIn(file, "Paused\n")) << redirected;

        program.Send(SIGTERM);

        EXPECT_EQ(program.Finish().status, -1);
        EXPECT_NE(ReadContents(file).find("Paused\n"), std::string::npos);
    }
}

TEST_F(DeskPlayerTerminal, IsRestoredWhenTheReaderOfTheOutputHasEnded)
{
    const std::string pipe = folder / "pipe";
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    const int reader = open(pipe.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
    TerminalProgram program({SampleDisc, "--remote"}, pipe);
    char first = '\0';
    while (read(reader, &first, 1) != 1) {
        std::this_thread::sleep_for(std::chrono::milliseconds(10));
    }
    EXPECT_FALSE(program.HasUsualSettings());

    close(reader);

    EXPECT_EQ(program.Finish().status, -1) << "ended by SIGPIPE";
    EXPECT_TRUE(program.HasUsualSettings());
}

TEST_F(DeskPlayerTerminal, HasAStatusLineThatAnswersEveryKey)
{
    TerminalProgram program({SampleDisc, "--remote", "--only", "Paused"});
    EXPECT_TRUE(program.WaitFor("quit\r\nplaying  00:00:0"));
    EXPECT_TRUE(program.WaitFor(" of 00:02:54  chapter 1 of 7  audio 1 of "));

    program.Press(" ");
    EXPECT_TRUE(program.WaitFor("  \r")) << "the line is erased before a callback";
    EXPECT_TRUE(program.WaitFor("Paused"));
    EXPECT_TRUE(program.WaitFor("\npaused  00:00:0"));

    program.Press("o");
    EXPECT_TRUE(program.WaitFor("\rrefused: not in a still, but paused  paused  00:00:0"));
    program.Press("y");
    EXPECT_TRUE(program.WaitFor("\rrefused: no key 'y'; ? lists the keys  paused  00:00:0"));
    program.Press("?");
    EXPECT_TRUE(program.WaitFor("space pause/continue"));
    EXPECT_TRUE(program.WaitFor("quit\r\npaused  00:00:0"));
    EXPECT_TRUE(program.WaitFor("chapter 1 of 7  audio 1 of ")) << "no refusal any more";

    program.Press("q");
    const ProgramResult result = program.Finish();
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output.substr(result.output.size() - 3), "  \r") << "erased at the end";
}

TEST_F(DeskPlayerTerminal, WritesEveryCallbackInRealTimeAtOnce)
{
    const std::string file = folder / "out.txt";
    TerminalProgram program({SampleDisc, "--realtime"}, file);

    EXPECT_TRUE(AppearsIn(file, "00:00:01.000  CurrentTimePosition"));
}

} // namespace
