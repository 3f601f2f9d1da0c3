#include <gtest/gtest.h>
#include <sys/stat.h>

#include <fstream>
#include <set>
#include <string>
#include <thread>

#include "clientkit/callbackid.h"
#include "programtest.h"

namespace
{

using DeskPlayerSession = ScratchFolder;

TEST_F(DeskPlayerSession, WithAllEventsCallsEveryCallbackAsExpected)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--strict", "--session", AllEvents});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "");
    std::set<std::string> called;
    for (const std::string& line : LinesOf(result.output)) {
        const std::string callback = line.substr(sizeof "hh:mm:ss.mmm ");
        called.insert(callback.substr(0, callback.find(' ')));
    }
    std::set<std::string> all;
    for (int id = 0; id < bdmv::Callback__sizeof; ++id) {
        all.emplace(NameOf(static_cast<bdmv::CallbackId>(id)));
    }
    EXPECT_EQ(all.size(), 56U);
    EXPECT_EQ(called, all);
}

TEST_F(DeskPlayerSession, WithTheEveningSessionPlaysToTheEnd)
{
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--session", Evening});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "bdmv-deskplayer: " + Evening +
                                 ":4: refused at 00:00:02.000: SkipToNextPoint is forbidden by "
                                 "play item 0\n");
    EXPECT_EQ(LastLine(result.output),
              "08:03:35.000  Finished                    reason=EndOfMedia");
}

TEST_F(DeskPlayerSession, FailsWithStrictIfACommandWasRefused)
{
    const std::string refused = WriteFile("a.session", "play\npause\nplay\nafter 1s stop\n");
    const std::string accepted = WriteFile("b.session", "play\npause\nafter 1s stop\n");

    const ProgramResult strict =
        RunDeskPlayer({SampleDisc, "--strict", "--session", refused, "--only", "Stopped"});
    const ProgramResult lenient =
        RunDeskPlayer({SampleDisc, "--session", refused, "--only", "Stopped"});

    EXPECT_EQ(strict.status, 4);
    EXPECT_EQ(lenient.status, 0);
    EXPECT_EQ(strict.output, "00:00:01.000  Stopped\n") << "the session continues";
    EXPECT_EQ(strict.output, lenient.output);
    EXPECT_EQ(strict.errors, "bdmv-deskplayer: " + refused +
                                 ":3: refused at 00:00:00.000: not stopped or finished, but "
                                 "paused\n");
    EXPECT_EQ(strict.errors, lenient.errors);
    EXPECT_EQ(RunDeskPlayer({SampleDisc, "--strict", "--session", accepted}).status, 0);
}

TEST_F(DeskPlayerSession, FailsIfAnExpectationIsNotMet)
{
    const std::string session =
        WriteFile("a.session", "expect nothing\n"
                               "play\n"
                               "after 2.5s expect PlayStarted\n"
                               "expect PlayItem playItemId=0\n"
                               "expect CurrentTimePosition position=00:00:02.000\n"
                               "subtitle off\n"
                               "expect PresentationGraphicsDisplay shown=true\n"
                               "pause\n"
                               "expect nothing\n"
                               "expect Paused\n"
                               "pause\n"
                               "expect Paused\n"
                               "expect nothing\n"
                               "after 1s stop\n"
                               "expect Stopped\n");

    const ProgramResult result =
        RunDeskPlayer({SampleDisc, "--playlist", "1", "--session", session, "--only", "Stopped"});

    EXPECT_EQ(result.status, 4);
    EXPECT_EQ(result.output, "00:00:03.500  Stopped\n") << "the session continues";
    const std::vector<std::string> lines = LinesOf(result.errors);
    const std::string start = "bdmv-deskplayer: " + session;
    ASSERT_EQ(lines.size(), 4U) << result.errors;
    EXPECT_EQ(lines[0], start + ":7: expected PresentationGraphicsDisplay shown=true by "
                                "00:00:02.500; since the last command: "
                                "PresentationGraphicsDisplay shown=false");
    EXPECT_EQ(lines[1], start + ":9: expected nothing by 00:00:02.500; since the last command: "
                                "Paused");
    EXPECT_EQ(lines[3], start + ":12: expected Paused by 00:00:02.500; since the last command: "
                                "nothing");
}

TEST_F(DeskPlayerSession, RefusesAnExpectationOfAnUnknownCallback)
{
    const std::string session = WriteFile("a.session", "play\nexpect playstarted\n");

    ExpectUsageError({SampleDisc, "--session", session},
                     session + ":2:8: 'playstarted' is not a callback; did you mean PlayStarted?");
}

TEST_F(DeskPlayerSession, AlwaysHasTheSameOutput)
{
    for (const char* const format : {"text", "json", "trace"}) {
        const std::vector<std::string> arguments = {SampleDisc, "--session", AllEvents, "--format",
                                                    format};
        const ProgramResult first = RunDeskPlayer(arguments);
        const ProgramResult second = RunDeskPlayer(arguments);
        EXPECT_NE(first.output, "");
        EXPECT_EQ(first.output, second.output);
        EXPECT_EQ(first.errors, second.errors);
    }
}

TEST_F(DeskPlayerSession, IsRefusedIfItCannotBeRead)
{
    const std::string wrong = WriteFile("wrong.session", "play\n  nxt 3\n");
    const ProgramResult result = RunDeskPlayer({SampleDisc, "--session", wrong});
    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.output, "");
    EXPECT_EQ(result.errors.rfind("bdmv-deskplayer: " + wrong +
                                      ":2:3: unexpected 'nxt'; expected at, after, play, ",
                                  0),
              0U)
        << result.errors;
    EXPECT_EQ(LinesOf(result.errors).size(), 1U);

    const std::string noTextFile = ": cannot read session, expected a text file";
    ExpectUsageError({SampleDisc, "--session", "no.session"}, "no.session" + noTextFile);
    ExpectUsageError({SampleDisc, "--session", folder}, folder.string() + noTextFile);

    const std::string tooLong = ": session too long, expected at most 1048576 bytes";
    const std::string longFile = WriteFile("long.session", std::string(1024 * 1024 + 1, '\n'));
    ExpectUsageError({SampleDisc, "--session", longFile}, longFile + tooLong);
    ExpectUsageError({SampleDisc, "--session", "/dev/zero"}, "/dev/zero" + tooLong);
}

TEST_F(DeskPlayerSession, IsAcceptedUpToTheMaximumSize)
{
    const std::string script = WriteFile("a.session", std::string(1024 * 1024 - 4, '\n') + "play");

    const ProgramResult result =
        RunDeskPlayer({SampleDisc, "--session", script, "--only", "PlayStarted"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "00:00:00.000  PlayStarted\n");
}

TEST_F(DeskPlayerSession, PlaysTwoHoursToTheEnd)
{
    const std::string script =
        WriteFile("a.session", "play\nrepeat title\nafter 2h repeat off\nafter 1s stop\n");

    const ProgramResult result = RunDeskPlayer(
        {SampleDisc, "--playlist", "2", "--session", script, "--only", "JumpOccurred,Stopped"});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(LinesOf(result.output).size(), 360U + 1U);
    EXPECT_EQ(LastLine(result.output), "02:00:01.000  Stopped");
}

TEST_F(DeskPlayerSession, IsNamedWithoutControlCharacters)
{
    const std::string refused = WriteFile("a\nb\xC3\xA9.session", "stop\n");
    const std::string wrong = WriteFile("c\nd\xC3\xA9.session", "caf\xC3\xA9\n");

    EXPECT_NE(RunDeskPlayer({SampleDisc, "--session", refused})
                  .errors.find("a\\x0Ab\xC3\xA9.session:1: refused at "),
              std::string::npos);
    EXPECT_NE(RunDeskPlayer({SampleDisc, "--session", wrong})
                  .errors.find("c\\x0Ad\xC3\xA9.session:1:1: unexpected 'caf\xC3\xA9'"),
              std::string::npos);
}

TEST_F(DeskPlayerSession, IsReadFromAPipe)
{
    const std::string pipe = folder / "pipe.session";
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    std::thread writer([&pipe] { std::ofstream(pipe) << "play\nafter 1s stop\n"; });

    const ProgramResult result =
        RunDeskPlayer({SampleDisc, "--session", pipe, "--only", "Stopped"});

    writer.join();
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.output, "00:00:01.000  Stopped\n");
}

} // namespace
