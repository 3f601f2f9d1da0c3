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
         {"--help", "--version", "--commands", "--playlist", "--list", "--check", "--describe",
          "--session", "--strict", "--realtime", "--remote", "--format", "--output", "--listen",
          "--only", "--log", "--compare", "--page"}) {
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
              "play                                  start at the beginning of the play list");
    EXPECT_EQ(LinesOf(commands.output).back(), "expect CALLBACK [ARGUMENT=VALUE ...]  fail unless "
                                               "there was such a callback since the last "
                                               "command");
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
        {SampleDisc, "--strict"},
        {SampleDisc, "--strict", "--remote"},
        {SampleDisc, "--log", "NoSuchComponent=Event"}};
    for (const std::vector<std::string>& arguments : wrong) {
        const ProgramResult result = RunDeskPlayer(arguments);
        EXPECT_EQ(result.status, 2);
        EXPECT_EQ(result.output, "");
        EXPECT_EQ(result.errors.rfind("bdmv-deskplayer: ", 0), 0U) << result.errors;
        EXPECT_EQ(LinesOf(result.errors).size(), 1U) << result.errors;
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
                                                         {"--list", "--listen", "control"},
                                                         {"--list", "--only", "PlayItem"},
                                                         {"--list", "--log", "*=*"},
                                                         {"--list", "--log", ""},
                                                         {"--list", "--format", "trace"},
                                                         {"--list", "--format", "html"},
                                                         {"--describe", "1", "--listen", "button"},
                                                         {"--describe", "1", "--only", "PlayItem"},
                                                         {"--describe", "1", "--log", "*=*"},
                                                         {"--describe", "1", "--format", "trace"},
                                                         {"--describe", "1", "--format", "html"},
                                                         {"--check", "--only", "PlayItem"},
                                                         {"--check", "--log", "*=*"},
                                                         {"--check", "--format", "trace"},
                                                         {"--check", "--format", "html"},
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

TEST(DeskPlayerUsage, RefusesEmptyNames)
{
    for (const std::string option :
         {"--session", "--output", "--compare", "--page", "--listen", "--only"}) {
        for (const std::vector<std::string>& words :
             std::vector<std::vector<std::string>>{{option, ""}, {option + "="}}) {
            std::vector<std::string> arguments = {SampleDisc};
            arguments.insert(arguments.end(), words.begin(), words.end());
            const ProgramResult result = RunDeskPlayer(arguments);
            EXPECT_EQ(result.status, 2) << option;
            EXPECT_EQ(result.output, "");
            EXPECT_NE(result.errors.find(option), std::string::npos) << result.errors;
        }
    }
    EXPECT_EQ(RunDeskPlayer({SampleDisc, "--log", ""}).status, 0) << "switches every line off";
}

TEST(DeskPlayerUsage, EscapesEveryNameInTheSameWay)
{
    const std::string name = "caf\xC3\xA9\x1B[2J\n\xE9\\";
    const std::string escaped = "caf\xC3\xA9\\x1B[2J\\x0A\\xE9\\x5C";
    const std::vector<std::vector<std::string>> commandLines = {
        {name},
        {SampleDisc, name},
        {SampleDisc, "--" + name},
        {SampleDisc, "--playlist", name},
        {SampleDisc, "--format", name},
        {SampleDisc, "--listen", name},
        {SampleDisc, "--session", name},
        {SampleDisc, "--output", "no/such/" + name}};
    for (const std::vector<std::string>& arguments : commandLines) {
        const ProgramResult result = RunDeskPlayer(arguments);
        EXPECT_NE(result.status, 0);
        EXPECT_EQ(result.errors.rfind("bdmv-deskplayer: ", 0), 0U) << result.errors;
        EXPECT_EQ(LinesOf(result.errors).size(), 1U) << result.errors;
        EXPECT_NE(result.errors.find(escaped), std::string::npos) << result.errors;
    }
}

} // namespace
