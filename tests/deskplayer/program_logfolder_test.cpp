// The options --output-folder and --jobs.

#include <gtest/gtest.h>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstdlib>
#include <map>
#include <string>
#include <vector>

#include "programtest.h"
#include "sanitized.h"

namespace
{

std::string Chapter(int number)
{
    return "2024-05-31 20:15:01.123456 BdmvNavigator Event: Sending Chapter - chapterNumber: " +
           std::to_string(number) + "\n";
}

class LogFolder : public ScratchFolder
{
protected:
    /** Names of the files in the output folder, and their contents. */
    std::map<std::string, std::string> Outputs() const
    {
        std::map<std::string, std::string> outputs;
        for (const fs::directory_entry& entry : fs::directory_iterator(out)) {
            if (entry.is_regular_file()) {
                outputs[entry.path().filename()] = ReadContents(entry.path());
            }
        }
        return outputs;
    }

    /** Runs the program with logs, the output folder and further options. */
    ProgramResult Convert(const std::vector<std::string>& logs,
                          const std::vector<std::string>& options = {}) const
    {
        std::vector<std::string> arguments = {"--field-log"};
        arguments.insert(arguments.end(), logs.begin(), logs.end());
        arguments.insert(arguments.end(), {"--output-folder", out});
        arguments.insert(arguments.end(), options.begin(), options.end());
        return RunDeskPlayer(arguments);
    }

    /** Writes logs with different contents: more of them than jobs, and of different lengths. */
    std::vector<std::string> WriteLogs(int count) const
    {
        std::vector<std::string> logs;
        for (int i = 0; i < count; ++i) {
            std::string text = i % 3 == 0 ? "foreign\n" : "";
            for (int line = 0; line < 1 + (i * 7919) % 300; ++line) {
                text += Chapter(i % 200) + (line % 5 == 0 ? "foreign\n" : "");
            }
            logs.push_back(WriteFile("log" + std::to_string(i), text));
        }
        return logs;
    }

    const std::string out = folder / "out";
};

TEST_F(LogFolder, HasAFileForEachLogThatEqualsItsOutput)
{
    const std::vector<std::string> logs = WriteLogs(3);
    const std::vector<std::string> json = {"--format", "json",   "--tag",
                                           "device=7", "--only", "ChapterNumber"};

    const ProgramResult result = Convert(logs, json);

    EXPECT_EQ(result.status, 0) << result.errors;
    EXPECT_EQ(result.output, "");
    std::map<std::string, std::string> expected;
    for (const std::string& log : logs) {
        std::vector<std::string> arguments = {"--field-log", log};
        arguments.insert(arguments.end(), json.begin(), json.end());
        expected[fs::path(log).filename().string() + ".jsonl"] = RunDeskPlayer(arguments).output;
    }
    EXPECT_EQ(Outputs(), expected);
}

TEST_F(LogFolder, HasNamesWithTheExtensionOfTheFormat)
{
    const std::string log = WriteFile("player.log", PausedLogLine);

    for (const std::string format : {"text", "json", "trace"}) {
        EXPECT_EQ(Convert({log}, {"--format", format}).status, 0);
    }

    std::vector<std::string> names;
    for (const auto& [name, contents] : Outputs()) {
        names.push_back(name);
        EXPECT_NE(contents, "");
    }
    EXPECT_EQ(names,
              (std::vector<std::string>{"player.log.json", "player.log.jsonl", "player.log.txt"}));
}

TEST_F(LogFolder, HasWhatTheEndOfALogReveals)
{
    const std::string time = "2024-05-31 20:15:00.123456 ";
    const std::string start = "00:00:00.000  (start) at 2024-05-31 20:15:00.123456\n";
    const std::string pending =
        WriteFile("pending", time + "BdmvNavigator Event: Sending SecondaryAudioUnavailable\n");
    const std::string truncated = WriteFile("truncated", PausedLogLine + "x");

    EXPECT_EQ(Convert({pending, truncated}).status, 0);
    EXPECT_EQ(Outputs().at("pending.txt"), start + "00:00:00.000  SecondaryAudioUnavailable\n");
    EXPECT_EQ(Outputs().at("truncated.txt"),
              start + "00:00:00.000  Paused\n"
                      "00:00:00.000  (gap)                       cause=truncated\n");
}

TEST_F(LogFolder, MayHaveLogsWithLinesOfAnotherKind)
{
    const std::string log = WriteFile("log", "[   90.5] player: BdmvNavigator/5: Sending Paused\n");

    EXPECT_EQ(Convert({log}, {"--log-prefix", "[{time}] {any} {component}/{level}: {text}"}).status,
              0);
    EXPECT_EQ(Outputs().at("log.txt"), "00:00:00.000  Paused\n");
}

TEST_F(LogFolder, IsTheSameWhateverTheNumberOfJobs)
{
    std::vector<std::string> logs = WriteLogs(40);
    logs.insert(logs.begin() + 9, (folder / "missing").string());
    logs.push_back(WriteFile("empty", ""));

    const ProgramResult one = Convert(logs, {"--format", "json", "--jobs", "1"});
    const std::map<std::string, std::string> outputs = Outputs();
    EXPECT_EQ(outputs.size(), 41U);
    for (const std::string jobs : {"2", "7", "256"}) {
        fs::remove_all(out);
        const ProgramResult several = Convert(logs, {"--format", "json", "--jobs", jobs});
        EXPECT_EQ(several.status, one.status);
        EXPECT_EQ(several.errors, one.errors);
        EXPECT_TRUE(Outputs() == outputs) << jobs;
    }
}

TEST_F(LogFolder, HasTheOtherLogsIfOneCannotBeRead)
{
    const std::string first = WriteFile("first", PausedLogLine);
    const std::string missing = folder / "missing";
    const std::string last = WriteFile("last", Chapter(1));

    const ProgramResult result = Convert({first, missing, folder.string(), last});

    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.errors, "bdmv-deskplayer: " + missing +
                                 ": cannot be read: No such file or directory\n" +
                                 "bdmv-deskplayer: " + folder.string() +
                                 ": cannot be read: Is a directory\n"
                                 "bdmv-deskplayer: 2 of 4 logs were not converted\n");
    EXPECT_EQ(Outputs().size(), 2U);
    EXPECT_EQ(Outputs().count("first.txt"), 1U);
    EXPECT_EQ(Outputs().count("last.txt"), 1U);
}

TEST_F(LogFolder, HasTheOtherLogsIfOneCannotBeWritten)
{
    const std::string first = WriteFile("first", PausedLogLine);
    const std::string last = WriteFile("last", PausedLogLine);
    fs::create_directories(fs::path(out) / "first.txt");

    const ProgramResult result = Convert({first, (folder / "missing").string(), last});

    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(LinesOf(result.errors).at(0),
              "bdmv-deskplayer: " + out + "/first.txt: cannot be written: Is a directory");
    EXPECT_EQ(Outputs().size(), 1U);
    EXPECT_EQ(Outputs().count("last.txt"), 1U);
}

TEST_F(LogFolder, KeepsAnEarlierFileIfItsLogCannotBeReadAgain)
{
    const std::string log = WriteFile("log", PausedLogLine);
    EXPECT_EQ(Convert({log}).status, 0);
    const std::map<std::string, std::string> before = Outputs();
    fs::remove(log);

    EXPECT_EQ(Convert({log}).status, 2);
    EXPECT_EQ(Outputs(), before);
}

TEST_F(LogFolder, HasNewContentsIfALogIsConvertedAgain)
{
    EXPECT_EQ(Convert({WriteFile("log", PausedLogLine + Chapter(1))}).status, 0);
    EXPECT_EQ(Convert({WriteFile("log", PausedLogLine)}).status, 0);

    EXPECT_EQ(Outputs().at("log.txt"), "00:00:00.000  (start) at 2024-05-31 20:15:00.123456\n"
                                       "00:00:00.000  Paused\n");
}

TEST_F(LogFolder, CountsTheSkippedLinesOfAllLogsAndNamesThoseWithoutCallbacks)
{
    const std::string one = WriteFile("one", "foreign\n" + PausedLogLine);
    const std::string two = WriteFile("two", "foreign\n");

    const ProgramResult result = Convert({one, two});

    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.errors, "bdmv-deskplayer: " + two +
                                 ": no line announces a callback\n"
                                 "bdmv-deskplayer: skipped 2 foreign lines and 0 damaged lines\n");
}

TEST_F(LogFolder, HasNoPlaceForTwoLogsOfTheSameName)
{
    fs::create_directories(folder / "other");
    const std::string one = WriteFile("log", PausedLogLine);
    const std::string other = WriteFile("other/log", PausedLogLine);

    ExpectUsageError({"--field-log", one, other, "--output-folder", out},
                     "--output-folder: " + one + " and " + other + " would both become " + out +
                         "/log.txt");
    EXPECT_FALSE(fs::exists(out));
}

TEST_F(LogFolder, DoesNotOverwriteLogs)
{
    const std::string log = WriteFile("log", PausedLogLine);
    const std::string other = WriteFile("log.txt", PausedLogLine);

    ExpectUsageError({"--field-log", log, other, "--output-folder", folder},
                     "--output-folder: " + other + " is being read");
    EXPECT_EQ(ReadContents(other), PausedLogLine);

    const std::string part = WriteFile("log.txt.part", PausedLogLine);
    ExpectUsageError({"--field-log", log, part, "--output-folder", folder},
                     "--output-folder: " + part + " is being read");
    EXPECT_EQ(ReadContents(part), PausedLogLine);
}

TEST_F(LogFolder, RefusesStandardInputAndWrongOptions)
{
    const std::string log = WriteFile("log", PausedLogLine);

    ExpectUsageError({"--field-log", "-", "--output-folder", out},
                     "--output-folder: standard input has no name for its output");
    ExpectUsageError({"--field-log", log, "--jobs", "2"},
                     "--jobs requires --output-folder; see --help");
    ExpectUsageError({SampleDisc, "--output-folder", out},
                     "--output-folder requires --field-log; see --help");
    for (const std::string jobs : {"0", "257", "-1", "all"}) {
        EXPECT_EQ(Convert({log}, {"--jobs", jobs}).status, 2) << jobs;
    }
    EXPECT_EQ(Convert({log}, {"--output", folder / "file"}).status, 2);
    EXPECT_EQ(Convert({log}, {"--log-prefix", "{time}"}).status, 2);
    EXPECT_FALSE(fs::exists(out));
}

TEST_F(LogFolder, IsReportedIfItCannotBeCreated)
{
    const std::string log = WriteFile("log", PausedLogLine);
    const ProgramResult result = RunDeskPlayer({"--field-log", log, "--output-folder", log});

    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.errors, "bdmv-deskplayer: " + log + ": cannot be created: Not a directory\n");
}

TEST_F(LogFolder, NeedsLittleMemoryForEachJob)
{
    if (bdmvtest::Sanitized) {
        GTEST_SKIP() << "sanitizers need more memory";
    }
    std::vector<std::string> arguments = {"--output-folder", out,      "--jobs",     "64",
                                          "--only",          "Paused", "--field-log"};
    for (const std::string& log : WriteLogs(64)) {
        ResizeSparsely(log, std::uintmax_t{3} << 20);
        arguments.push_back(log);
    }

    // There is no room for the stacks of all threads.
    const ProgramResult result = RunDeskPlayerWithLimitedMemory(arguments, 100 * 1024);

    EXPECT_EQ(result.status, 0) << result.errors;
    EXPECT_EQ(Outputs().size(), 64U);
}

TEST_F(LogFolder, HasNothingIncompleteAfterAnInterruption)
{
    const std::string pipe = folder / "pipe";
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    TerminalProgram program({"--field-log", pipe, "--output-folder", out});
    const int writer = open(pipe.c_str(), O_WRONLY | O_CLOEXEC); // once the program reads
    ASSERT_GE(writer, 0);

    program.Send(SIGINT);
    // The signal may reach the program later than some of these lines.
    const auto before = std::signal(SIGPIPE, SIG_IGN);
    while (write(writer, PausedLogLine.data(), PausedLogLine.size()) > 0) {
    }
    EXPECT_EQ(errno, EPIPE);
    std::signal(SIGPIPE, before);
    close(writer);

    EXPECT_EQ(program.Finish().status, -1) << "ended by the signal";
    EXPECT_EQ(Outputs().size(), 0U);
}

TEST_F(LogFolder, IsCompletedIfTheSignalIsIgnored)
{
    const std::string pipe = folder / "pipe";
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    const auto before = std::signal(SIGINT, SIG_IGN); // which the program inherits
    TerminalProgram program({"--field-log", pipe, "--output-folder", out});
    std::signal(SIGINT, before);
    const int writer = open(pipe.c_str(), O_WRONLY | O_CLOEXEC);
    ASSERT_GE(writer, 0);

    program.Send(SIGINT);
    EXPECT_EQ(write(writer, PausedLogLine.data(), PausedLogLine.size()),
              static_cast<ssize_t>(PausedLogLine.size()));
    close(writer);

    EXPECT_EQ(program.Finish().status, 0);
    EXPECT_EQ(Outputs().count("pipe.txt"), 1U);
}

TEST_F(LogFolder, HasNoColours)
{
    setenv("TERM", "xterm", 1);
    unsetenv("NO_COLOR");
    const std::string log = WriteFile("log", PausedLogLine);

    EXPECT_EQ(RunDeskPlayerOnTerminal({"--field-log", log, "--output-folder", out}).status, 0);
    EXPECT_EQ(Outputs().at("log.txt").find('\x1B'), std::string::npos);
}

TEST_F(LogFolder, ShowsProgressOnATerminal)
{
    const std::string pipe = folder / "pipe";
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    const std::string first = WriteFile("first", PausedLogLine);
    TerminalProgram program(
        {"--field-log", first, pipe, "--output-folder", out, "--jobs", "1", "--only", "Stopped"});
    const int writer = open(pipe.c_str(), O_WRONLY | O_CLOEXEC);
    ASSERT_GE(writer, 0);
    const auto end = std::chrono::steady_clock::now() + std::chrono::milliseconds(1200);
    while (std::chrono::steady_clock::now() < end) {
        EXPECT_GT(write(writer, PausedLogLine.data(), PausedLogLine.size()), 0);
    }

    EXPECT_TRUE(program.WaitFor("1 of 2 logs"));
    close(writer);
    EXPECT_EQ(program.Finish().status, 0);
}

} // namespace
