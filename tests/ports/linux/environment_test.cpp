// The environment that the port reads at the start of a program, and its actions at the end.
#include <csignal>
#include <string>
#include <vector>

#include "porttesting.h"

namespace
{

using porttesting::Outcome;
using porttesting::ReadLines;
using porttesting::SplitLines;
using porttesting::WithoutTime;

Outcome RunHelper(std::vector<std::string> arguments, const std::vector<std::string>& environment)
{
    arguments.insert(arguments.begin(), PORT_HELPER);
    return porttesting::Run(arguments, environment);
}

TEST(Environment, IsOptional)
{
    EXPECT_EQ(RunHelper({"enabled", "57", "3", "0"}, {}).output, "1\n");
    EXPECT_EQ(RunHelper({"enabled", "57", "5", "0"}, {}).output, "0\n");
    EXPECT_EQ(RunHelper({"uopmask"}, {}).output, "0\n");
    EXPECT_EQ(RunHelper({"uopmask"}, {}).errors, "");
}

TEST(Environment, ConfiguresTheSwitch)
{
    const std::vector<std::string> environment = {"KEVRO_LOG=BdmvNavigator=Event+hifreq"};
    EXPECT_EQ(RunHelper({"enabled", "57", "5", "1"}, environment).output, "1\n");
    EXPECT_EQ(RunHelper({"enabled", "57", "3", "0"}, environment).output, "0\n");
}

TEST(Environment, SwitchesEverythingOffForAnEmptyText)
{
    const Outcome outcome = RunHelper({"enabled", "57", "13", "0"}, {"KEVRO_LOG="});
    EXPECT_EQ(outcome.output, "0\n");
    EXPECT_EQ(outcome.errors, "");
}

TEST(Environment, ReportsAnUnreadableSwitchInOneLineAndKeepsTheDefault)
{
    const Outcome outcome = RunHelper({"enabled", "57", "3", "0"}, {"KEVRO_LOG=Jpi=Evnt"});
    EXPECT_EQ(outcome.output, "1\n");
    EXPECT_EQ(outcome.errors, "KEVRO_LOG: \"Evnt\" at character 5: expected a level or *; "
                              "did you mean Event?; using the default\n");
}

TEST(Environment, WritesToStandardErrorByDefault)
{
    const auto lines = SplitLines(RunHelper({"write", "2"}, {}).errors);
    ASSERT_EQ(lines.size(), 2U);
    EXPECT_EQ(WithoutTime(lines[1]), "BdmvNavigator Event: a line");
}

TEST(Environment, ConfiguresTheSink)
{
    const porttesting::TemporaryDirectory directory;
    const std::string file = directory.Path("log");
    const Outcome outcome = RunHelper({"write", "2"}, {"KEVRO_LOG_SINK=file:" + file});
    EXPECT_EQ(ReadLines(file).size(), 2U);
    EXPECT_EQ(outcome.errors, "");
}

TEST(Environment, ReportsAnUnreadableSinkInOneLineAndKeepsStandardError)
{
    const auto lines = SplitLines(RunHelper({"write", "1"}, {"KEVRO_LOG_SINK=paper"}).errors);
    ASSERT_EQ(lines.size(), 2U);
    EXPECT_EQ(lines[0], "KEVRO_LOG_SINK: \"paper\" at character 1: expected stderr, file:PATH, "
                        "syslog or syslog:IDENT; using the default");
    EXPECT_EQ(WithoutTime(lines[1]), "BdmvNavigator Event: a line");
}

TEST(Environment, ReportsAnUnreadableSinkEvenIfNothingIsWritten)
{
    EXPECT_EQ(SplitLines(RunHelper({"write", "0"}, {"KEVRO_LOG_SINK=paper"}).errors).size(), 1U);
}

TEST(Environment, PresetsTheUserOperationMask)
{
    EXPECT_EQ(RunHelper({"uopmask"}, {"KEVRO_UOPMASK=2"}).output, "2\n");
    EXPECT_EQ(RunHelper({"uopmask"}, {"KEVRO_UOPMASK=-1"}).output, "-1\n");
}

TEST(Environment, ReportsAnUnreadableUserOperationMaskInOneLineAndKeepsZero)
{
    for (const char* value : {"two", "", "2x", "99999999999"}) {
        const Outcome outcome = RunHelper({"uopmask"}, {std::string("KEVRO_UOPMASK=") + value});
        EXPECT_EQ(outcome.output, "0\n") << value;
        const auto lines = SplitLines(outcome.errors);
        ASSERT_EQ(lines.size(), 1U) << value;
        EXPECT_EQ(lines[0].rfind("KEVRO_UOPMASK: ", 0), 0U) << lines[0];
    }
}

TEST(EndOfProgram, WritesLinesStillQueued)
{
    const Outcome outcome = RunHelper({"write", "500"}, {"KEVRO_LOG_SINK=stderr,queue=1000"});
    EXPECT_EQ(SplitLines(outcome.errors).size(), 500U);
}

TEST(EndOfProgram, WritesLinesQueuedByALateDestructor)
{
    for (const char* sink : {"stderr", "stderr,queue=10"}) {
        const auto lines =
            SplitLines(RunHelper({"write-at-end"}, {std::string("KEVRO_LOG_SINK=") + sink}).errors);
        ASSERT_EQ(lines.size(), 1U) << sink;
        EXPECT_EQ(WithoutTime(lines[0]), "BdmvNavigator Event: from a destructor");
    }
}

constexpr char ReportedAssertion[] = "Common Fatal: Assertion failed: a > b (some/file.cpp:12)";

TEST(AssertInAProgram, ReturnsByDefault)
{
    const Outcome outcome = RunHelper({"assert", "0"}, {"KEVRO_LOG="});
    EXPECT_EQ(outcome.output, "continued\n");
    EXPECT_EQ(outcome.exitCode, 0);
    const auto lines = SplitLines(outcome.errors);
    ASSERT_EQ(lines.size(), 1U);
    EXPECT_EQ(WithoutTime(lines[0]), ReportedAssertion);
}

TEST(AssertInAProgram, AbortsOnRequestAfterTheReport)
{
    for (const char* sink : {"stderr", "stderr,queue=1000"}) {
        const Outcome outcome = RunHelper(
            {"assert", "500"}, {"KEVRO_ASSERT=abort", std::string("KEVRO_LOG_SINK=") + sink});
        EXPECT_EQ(outcome.signal, SIGABRT);
        EXPECT_EQ(outcome.output, "");
        const auto lines = SplitLines(outcome.errors);
        ASSERT_GT(lines.size(), 500U);
        EXPECT_EQ(WithoutTime(lines[500]), ReportedAssertion);
    }
}

TEST(AssertInAProgram, ReportsAnUnreadableRequestInOneLineAndReturns)
{
    const Outcome outcome = RunHelper({"assert", "0"}, {"KEVRO_ASSERT=stop"});
    EXPECT_EQ(outcome.output, "continued\n");
    const auto lines = SplitLines(outcome.errors);
    ASSERT_EQ(lines.size(), 2U);
    EXPECT_EQ(lines[0], "KEVRO_ASSERT: \"stop\" at character 1: expected abort; using the default");
}

} // namespace
