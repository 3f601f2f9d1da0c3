#include <gtest/gtest.h>

#include <regex>
#include <string>
#include <vector>

#include "programtest.h"

namespace
{

TEST(DeskPlayerUsage, IsDescribedByHelp)
{
    const ProgramResult help = RunDeskPlayer({"--help"});
    EXPECT_EQ(help.status, 0);
    EXPECT_EQ(help.errors, "");
    for (const char* const option :
         {"--help", "--version", "--commands", "--playlist", "--list", "--check", "--describe", "--session",
          "--realtime", "--remote", "--format", "--output", "--listen", "--only", "--log"}) {
        EXPECT_NE(help.output.find(option), std::string::npos) << option;
    }

    const ProgramResult version = RunDeskPlayer({"--version"});
    EXPECT_EQ(version.status, 0);
    EXPECT_TRUE(
        std::regex_match(version.output, std::regex("bdmv-deskplayer \\d+\\.\\d+\\.\\d+\n")))
        << version.output;

    const ProgramResult commands = RunDeskPlayer({"--commands"});
    EXPECT_EQ(commands.status, 0);
    EXPECT_EQ(LinesOf(commands.output).front(),
              "play                                start at the beginning of the play list");
    EXPECT_EQ(LinesOf(commands.output).back(),
              "fail stream                         make the stream run out of data");
}

TEST(DeskPlayerUsage, IsRefusedWithStatus2WhenInvalid)
{
    const std::vector<std::vector<std::string>> wrong = {
        {},
        {"a", "b"},
        {SampleDisc, "--playlist", "100000"},
        {SampleDisc, "--playlist", "-1"},
        {SampleDisc, "--playlist", "first"},
        {SampleDisc, "--describe", "100000"},
        {SampleDisc, "--no-such-option"},
        {SampleDisc, "--session"},
        {SampleDisc, "--log", "NoSuchComponent=Event"}};
    for (const std::vector<std::string>& arguments : wrong) {
        const ProgramResult result = RunDeskPlayer(arguments);
        EXPECT_EQ(result.status, 2);
        EXPECT_EQ(result.output, "");
        EXPECT_NE(result.errors, "");
    }
}

TEST(DeskPlayerUsage, RefusesOptionsThatExcludeEachOther)
{
    const std::vector<std::vector<std::string>> pairs = {{"--list", "--describe", "1"},
                                                         {"--check", "--list"},
                                                         {"--check", "--describe", "1"},
                                                         {"--check", "--playlist", "1"},
                                                         {"--check", "--session", Evening},
                                                         {"--check", "--realtime"},
                                                         {"--check", "--remote"},
                                                         {"--list", "--playlist", "1"},
                                                         {"--list", "--session", Evening},
                                                         {"--list", "--realtime"},
                                                         {"--list", "--remote"},
                                                         {"--describe", "1", "--playlist", "1"},
                                                         {"--describe", "1", "--realtime"},
                                                         {"--describe", "1", "--session", Evening},
                                                         {"--describe", "1", "--remote"},
                                                         {"--remote", "--session", Evening}};
    for (std::vector<std::string> arguments : pairs) {
        SCOPED_TRACE(arguments.front() + " and others");
        arguments.insert(arguments.begin(), SampleDisc);
        const ProgramResult result = RunDeskPlayer(arguments);
        EXPECT_EQ(result.status, 2);
        EXPECT_EQ(result.output, "");
        EXPECT_NE(result.errors.find(" excludes "), std::string::npos) << result.errors;
    }
}

} // namespace
