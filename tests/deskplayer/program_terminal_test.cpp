#include <gtest/gtest.h>

#include <cstdlib>
#include <string>
#include <vector>

#include "programtest.h"

namespace
{

using DeskPlayerTerminal = ScratchDisc;

TEST_F(DeskPlayerTerminal, ShowsProgressIfPlaybackTakesLong)
{
    MakeShort(45 * 1500);

    const ProgramResult result =
        RunDeskPlayerOnTerminal({disc, "--realtime", "--output", folder / "out.txt"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "\r00:00:01.000\r             \r") << "erased at the end";
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

} // namespace
