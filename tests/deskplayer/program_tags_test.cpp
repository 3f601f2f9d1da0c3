// The option --tag.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "programtest.h"

namespace
{

using DeskPlayerTags = ScratchFolder;

/** The lines of a JSON output with a member at their ends. */
std::string WithLastMember(const std::string& member, const std::string& output)
{
    std::string result;
    for (const std::string& line : LinesOf(output)) {
        result += line.substr(0, line.size() - 1) + "," + member + "}\n";
    }
    return result;
}

TEST_F(DeskPlayerTags, AreTheLastMemberOfEachObjectOfASession)
{
    const std::vector<std::string> session = {SampleDisc, "--session", Evening, "--format", "json"};
    std::vector<std::string> tagged = session;
    tagged.insert(tagged.end(), {"--tag", "firmware=2.1", "--tag", "device=box 7"});

    const ProgramResult result = RunDeskPlayer(tagged);

    EXPECT_EQ(result.output, WithLastMember(R"("tags":{"device":"box 7","firmware":"2.1"})",
                                            RunDeskPlayer(session).output));
}

TEST_F(DeskPlayerTags, AreTheLastMemberOfEachObjectOfAFieldLog)
{
    const std::string log = WriteFile("log", PausedLogLine + "x");
    const std::string plain = RunDeskPlayer({"--field-log", log, "--format", "json"}).output;
    ASSERT_EQ(LinesOf(plain).size(), 3U) << "a start, a callback and a gap";

    EXPECT_EQ(RunDeskPlayer({"--field-log", log, "--tag", "device=", "--format", "json"}).output,
              WithLastMember(R"("tags":{"device":""})", plain));
}

TEST_F(DeskPlayerTags, AreKeptByAReplay)
{
    const std::string tagged =
        RunDeskPlayer({"--field-log", WriteFile("log", PausedLogLine + "x"), "--tag", "device=7",
                       "--tag", "firmware=2.1", "--format", "json"})
            .output;
    const std::string recording = WriteFile("recording", tagged);

    EXPECT_EQ(RunDeskPlayer({"--replay", recording, "--format", "json"}).output, tagged);
    EXPECT_EQ(RunDeskPlayer({"--replay", recording}).output,
              "00:00:00.000  (start) at 2024-05-31 20:15:00.123456\n"
              "00:00:00.000  Paused\n"
              "00:00:00.000  (gap)                       cause=truncated\n");
}

TEST_F(DeskPlayerTags, ReplaceThoseOfTheRecordingOrAreAdded)
{
    const std::string recording =
        WriteFile("recording", R"({"ticks":2,"gap":{"cause":"lost"},"tags":{"a":"1","b":"2"}})");

    EXPECT_EQ(
        RunDeskPlayer({"--replay", recording, "--format", "json", "--tag", "c=3", "--tag", "a=4"})
            .output,
        R"({"ticks":2,"gap":{"cause":"lost"},"tags":{"a":"4","b":"2","c":"3"}})"
        "\n");
}

TEST_F(DeskPlayerTags, AreRefusedWhenMalformed)
{
    ExpectUsageError({SampleDisc, "--format", "json", "--tag", "device"},
                     "'device' is not a tag; expected NAME=VALUE");
    ExpectUsageError({SampleDisc, "--format", "json", "--tag", "a=1", "--tag", "a=2"},
                     "tag 'a' given twice");
    ExpectUsageError({SampleDisc, "--format", "json", "--tag", "a=\xE9"},
                     "tag 'a=\\xE9' is not valid UTF-8");
}

TEST_F(DeskPlayerTags, RequireJson)
{
    ExpectUsageError({SampleDisc, "--tag", "a=1"}, "--tag requires --format json");
    ExpectUsageError({SampleDisc, "--tag", "a=1", "--format", "trace"},
                     "--tag requires --format json");
}

TEST_F(DeskPlayerTags, TakeNoFurtherWords)
{
    const ProgramResult result =
        RunDeskPlayer({"--tag", "a=1", SampleDisc, "--format", "json", "--only", "Paused"});

    EXPECT_EQ(result.status, 0) << result.errors;
}

TEST_F(DeskPlayerTags, ExcludeListings)
{
    for (const std::vector<std::string>& listing :
         std::vector<std::vector<std::string>>{{"--list"}, {"--describe", "1"}, {"--check"}}) {
        std::vector<std::string> arguments = {SampleDisc, "--tag", "a=1", "--format", "json"};
        arguments.insert(arguments.end(), listing.begin(), listing.end());
        const ProgramResult result = RunDeskPlayer(arguments);
        EXPECT_EQ(result.status, 2);
        EXPECT_NE(result.errors.find(" excludes "), std::string::npos) << result.errors;
    }
}

} // namespace
