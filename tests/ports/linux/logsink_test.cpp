// The destinations of lines: the sinks, the queue, and the count of lost lines.
#include <atomic>
#include <cstdio>
#include <ctime>
#include <filesystem>
#include <fstream>
#include <future>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include <fcntl.h>
#include <unistd.h>

#include "porttesting.h"

namespace
{

using porttesting::ConfigureSink;
using porttesting::EventLogger;
using porttesting::ReadLines;
using porttesting::ReadToEnd;
using porttesting::SplitLines;
using porttesting::StderrRedirection;
using porttesting::TextOf;
using porttesting::WithoutTime;

std::string RefusalOf(const std::string& text)
{
    char message[256] = "";
    EXPECT_FALSE(KEVRO_Log_ConfigureSink(text.c_str(), message, sizeof(message))) << text;
    return message;
}

/** The lines that a terminal received, and the losses reported among them. */
struct Received {
    explicit Received(const std::vector<std::string>& lines)
    {
        const std::string report = "Common Warning: lines lost: ";
        for (const std::string& line : lines) {
            const std::string text = WithoutTime(line);
            if (text.rfind(report, 0) == 0) {
                ++reports;
                linesBeforeReport = texts.size();
                lost += std::stoull(text.substr(report.size()));
            } else {
                texts.push_back(TextOf(line));
            }
        }
    }

    std::vector<std::string> texts;
    int reports = 0;
    std::size_t linesBeforeReport = 0;
    KEVRO_UInt64 lost = 0;
};

/** A pipe that accepts nothing until it is read, like a stopped terminal. */
class StoppedPipe
{
public:
    StoppedPipe()
    {
        int ends[2] = {-1, -1};
        EXPECT_EQ(pipe(ends), 0);
        m_ReadEnd = ends[0];
        m_WriteEnd = ends[1];
        SetNonBlocking(true);
        const std::string page(4096, '.');
        while (write(m_WriteEnd, page.data(), page.size()) > 0) {
            m_Filling += page.size();
        }
        SetNonBlocking(false);
    }

    ~StoppedPipe() { CloseWriteEnd(); }

    StoppedPipe(const StoppedPipe&) = delete;
    StoppedPipe& operator=(const StoppedPipe&) = delete;

    void SetNonBlocking(bool nonBlocking)
    {
        const int flags = fcntl(m_WriteEnd, F_GETFL);
        fcntl(m_WriteEnd, F_SETFL, nonBlocking ? flags | O_NONBLOCK : flags & ~O_NONBLOCK);
    }

    int WriteEnd() const { return m_WriteEnd; }

    void CloseWriteEnd()
    {
        if (m_WriteEnd >= 0) {
            close(m_WriteEnd);
            m_WriteEnd = -1;
        }
    }

    /** Starts reading; the lines written are available once both write ends are closed. */
    std::future<std::vector<std::string>> StartReading()
    {
        return std::async(std::launch::async,
                          [this] { return SplitLines(ReadToEnd(m_ReadEnd).substr(m_Filling)); });
    }

private:
    int m_ReadEnd = -1;
    int m_WriteEnd = -1;
    std::size_t m_Filling = 0;
};

class LogSink : public testing::Test
{
protected:
    ~LogSink() override { ConfigureSink("stderr"); }

    const porttesting::TemporaryDirectory m_Directory;
    const std::string m_LogFile = m_Directory.Path("log.txt");
};

TEST_F(LogSink, WritesToStandardError)
{
    const int file = open(m_LogFile.c_str(), O_WRONLY | O_CREAT, 0600);
    {
        const StderrRedirection redirection(file);
        ConfigureSink(" stderr ");
        EventLogger().Log("here");
    }
    close(file);
    const auto lines = ReadLines(m_LogFile);
    ASSERT_EQ(lines.size(), 1U);
    EXPECT_EQ(WithoutTime(lines[0]), "BdmvNavigator Event: here");
}

TEST_F(LogSink, AppendsToAFile)
{
    std::ofstream(m_LogFile) << "already here\n";
    ConfigureSink("file:" + m_LogFile);
    EventLogger().Log("added");
    const auto lines = ReadLines(m_LogFile);
    ASSERT_EQ(lines.size(), 2U);
    EXPECT_EQ(lines[0], "already here");
    EXPECT_EQ(WithoutTime(lines[1]), "BdmvNavigator Event: added");
}

TEST_F(LogSink, RefusesAFileInAMissingDirectoryAndCreatesNone)
{
    ConfigureSink("file:" + m_LogFile);
    const std::string file = m_Directory.Path("one/two/log");

    EXPECT_EQ(RefusalOf("file:" + file),
              "Failed opening file " + file + " for writing: No such file or directory");

    EXPECT_FALSE(std::filesystem::exists(m_Directory.Path("one")));
    EventLogger().Log("still here");
    EXPECT_EQ(ReadLines(m_LogFile).size(), 1U);
}

TEST_F(LogSink, DoesNotCreateAgainADirectoryThatWasRemoved)
{
    const std::string directory = m_Directory.Path("one");
    std::filesystem::create_directory(directory);
    ConfigureSink("file:" + directory + "/log,size=10");
    EventLogger().Log("fills the file");
    std::filesystem::remove_all(directory);

    testing::internal::CaptureStderr();
    EventLogger().Log("starts a new file");
    testing::internal::GetCapturedStderr();

    EXPECT_FALSE(std::filesystem::exists(directory));
}

TEST_F(LogSink, RotatesAFileAndKeepsTheNewest)
{
    ConfigureSink("file:" + m_LogFile + ", size=110, files=2");
    for (int i = 1; i <= 5; ++i) {
        EventLogger().Log("line %d", i);
        EventLogger().Log("fill");
    }
    const auto textOf = [this](const char* name) {
        const auto lines = ReadLines(m_Directory.Path(name));
        return lines.empty() ? "none" : TextOf(lines[0]);
    };
    EXPECT_EQ(textOf("log.txt"), "line 5");
    EXPECT_EQ(textOf("log.1.txt"), "line 4");
    EXPECT_EQ(textOf("log.2.txt"), "line 3");
    EXPECT_EQ(textOf("log.3.txt"), "none");
    EXPECT_LE(std::filesystem::file_size(m_Directory.Path("log.1.txt")), 110U);
}

TEST_F(LogSink, KeepsNoOldFileOnRequest)
{
    ConfigureSink("file:" + m_LogFile + ",size=100,files=0");
    for (int i = 1; i <= 3; ++i) {
        EventLogger().Log("line %d, long enough to fill the file", i);
    }
    EXPECT_EQ(ReadLines(m_LogFile).size(), 1U);
    EXPECT_FALSE(std::filesystem::exists(m_Directory.Path("log.1.txt")));
}

TEST_F(LogSink, RefusesAnUnreadableTextWithTheWordItsPositionAndWhatWasExpected)
{
    const std::vector<std::pair<const char*, const char*>> refusals = {
        {"", "nothing at character 1: expected stderr, file:PATH, syslog or syslog:IDENT"},
        {"paper", "\"paper\" at character 1: expected stderr, file:PATH, syslog or syslog:IDENT"},
        {"stderr:2",
         "\"stderr:2\" at character 1: expected stderr, file:PATH, syslog or syslog:IDENT"},
        {"file", "\"file\" at character 1: expected stderr, file:PATH, syslog or syslog:IDENT"},
        {"file:", "\"file:\" at character 1: expected stderr, file:PATH, syslog or syslog:IDENT"},
        {"syslog:",
         "\"syslog:\" at character 1: expected stderr, file:PATH, syslog or syslog:IDENT"},
        {"stderr,queue", "nothing at character 13: expected a number from 1 to 65536"},
        {"stderr,queue=", "nothing at character 14: expected a number from 1 to 65536"},
        {"stderr,queue=0", "\"0\" at character 14: expected a number from 1 to 65536"},
        {"stderr,queue=65537", "\"65537\" at character 14: expected a number from 1 to 65536"},
        {"stderr, queue = 5k", "\"5k\" at character 17: expected a number from 1 to 65536"},
        {"stderr,queue=-1", "\"-1\" at character 14: expected a number from 1 to 65536"},
        {"stderr,queue=99999999999999999999",
         "\"99999999999999999999\" at character 14: expected a number from 1 to 65536"},
        {"stderr,queue=5,queue=6", "\"queue\" at character 16: given twice"},
        {"stderr,size=5", "\"size\" at character 8: expected queue=LINES"},
        {"syslog,files=5", "\"files\" at character 8: expected queue=LINES"},
        {"stderr,", "nothing at character 8: expected queue=LINES"},
        {"file:/x,sise=5", "\"sise\" at character 9: expected size=BYTES, files=N or queue=LINES"},
        {"file:/x,size=0", "\"0\" at character 14: expected a number from 1 to 2147483647"},
        {"file:/x,files=1001", "\"1001\" at character 15: expected a number from 0 to 1000"},
    };
    ConfigureSink("file:" + m_LogFile);
    for (const auto& refusal : refusals) {
        EXPECT_EQ(RefusalOf(refusal.first), refusal.second);
    }
    EventLogger().Log("still here");
    EXPECT_EQ(ReadLines(m_LogFile).size(), 1U);
}

TEST_F(LogSink, RefusesAFileThatCannotBeOpenedAndNamesIt)
{
    ConfigureSink("file:" + m_LogFile);
    const std::string directory = m_Directory.Path("");
    EXPECT_NE(RefusalOf("file:" + directory).find(directory), std::string::npos);
    EventLogger().Log("still here");
    EXPECT_EQ(ReadLines(m_LogFile).size(), 1U);
}

TEST_F(LogSink, RefusesANullText)
{
    char message[64] = "";
    EXPECT_FALSE(KEVRO_Log_ConfigureSink(nullptr, message, sizeof(message)));
    EXPECT_STREQ(message, "no text");
}

TEST_F(LogSink, FlushesQueuedLines)
{
    ConfigureSink("file:" + m_LogFile + ",queue=100");
    for (std::size_t round = 1; round <= 50; ++round) {
        for (int i = 0; i < 20; ++i) {
            EventLogger().Log("line");
        }
        KEVRO_Log_Flush();
        ASSERT_EQ(ReadLines(m_LogFile).size(), 20 * round);
    }
}

TEST_F(LogSink, WritesQueuedLinesBeforeChangingTheSink)
{
    for (std::size_t round = 1; round <= 50; ++round) {
        ConfigureSink("file:" + m_LogFile + ",queue=100");
        for (int i = 0; i < 20; ++i) {
            EventLogger().Log("line");
        }
        ConfigureSink("stderr");
        ASSERT_EQ(ReadLines(m_LogFile).size(), 20 * round);
    }
}

TEST_F(LogSink, KeepsTheOrderOfQueuedLines)
{
    ConfigureSink("file:" + m_LogFile + ",queue=1000");
    for (int i = 0; i < 1000; ++i) {
        EventLogger().Log("%d", i);
    }
    KEVRO_Log_Flush();
    const auto lines = ReadLines(m_LogFile);
    ASSERT_EQ(lines.size(), 1000U);
    for (std::size_t i = 0; i < lines.size(); ++i) {
        ASSERT_EQ(TextOf(lines[i]), std::to_string(i));
    }
}

/** The time as a line shows it. */
std::string Now()
{
    timespec now;
    clock_gettime(CLOCK_REALTIME, &now);
    tm local;
    localtime_r(&now.tv_sec, &local);
    char text[64];
    const std::size_t length = std::strftime(text, sizeof(text), "%Y-%m-%d %H:%M:%S", &local);
    std::snprintf(text + length, sizeof(text) - length, ".%06ld", now.tv_nsec / 1000);
    return text;
}

TEST_F(LogSink, ShowsTheTimeAtWhichAQueuedLineWasLogged)
{
    StoppedPipe terminal;
    std::string before;
    std::string after;
    std::future<std::vector<std::string>> reading;
    {
        const StderrRedirection redirection(terminal.WriteEnd());
        ConfigureSink("stderr,queue=10");
        EventLogger().Log("blocks at the terminal");
        before = Now();
        EventLogger().Log("waits in the queue");
        after = Now();
        reading = terminal.StartReading();
        ConfigureSink("file:" + m_LogFile);
    }
    terminal.CloseWriteEnd();
    const auto lines = reading.get();
    ASSERT_EQ(lines.size(), 2U);
    const std::string shown = lines[1].substr(0, before.size());
    EXPECT_LE(before, shown);
    EXPECT_LE(shown, after);
}

TEST_F(LogSink, DropsTheOldestQueuedLinesInsteadOfWaitingAndReportsTheirNumber)
{
    constexpr int Queue = 10;
    constexpr int Written = 100;
    StoppedPipe terminal;
    const KEVRO_UInt64 before = KEVRO_Log_GetDroppedLines();
    std::future<std::vector<std::string>> reading;
    {
        const StderrRedirection redirection(terminal.WriteEnd());
        ConfigureSink("stderr,queue=" + std::to_string(Queue));
        for (int i = 0; i < Written; ++i) {
            EventLogger().Log("%d", i); // a writer that waited would never return
        }
        reading = terminal.StartReading();
        ConfigureSink("file:" + m_LogFile);
    }
    terminal.CloseWriteEnd();
    const Received received(reading.get());

    // The thread of the queue may have held one line already when the pipe was found full.
    const KEVRO_UInt64 dropped = KEVRO_Log_GetDroppedLines() - before;
    EXPECT_TRUE(dropped == Written - Queue || dropped == Written - Queue - 1) << dropped;
    EXPECT_EQ(received.lost, dropped);
    EXPECT_EQ(received.reports, 1);
    ASSERT_EQ(received.texts.size(), Written - dropped);
    EXPECT_EQ(received.linesBeforeReport, received.texts.size() - 1)
        << "the report comes once the queue has caught up";
    for (std::size_t i = 1; i <= Queue; ++i) {
        EXPECT_EQ(received.texts[received.texts.size() - i], std::to_string(Written - i));
    }
}

TEST_F(LogSink, KeepsCountingDroppedLinesAcrossSinks)
{
    StoppedPipe terminal;
    const KEVRO_UInt64 before = KEVRO_Log_GetDroppedLines();
    std::future<std::vector<std::string>> reading;
    {
        const StderrRedirection redirection(terminal.WriteEnd());
        ConfigureSink("stderr,queue=1");
        for (int i = 0; i < 10; ++i) {
            EventLogger().Log("%d", i);
        }
        EXPECT_GE(KEVRO_Log_GetDroppedLines(), before + 8);
        reading = terminal.StartReading();
        ConfigureSink("file:" + m_LogFile + ",queue=1");
    }
    terminal.CloseWriteEnd();
    const Received received(reading.get());
    EXPECT_EQ(KEVRO_Log_GetDroppedLines(), before + 10 - received.texts.size());
    EXPECT_EQ(received.lost, 10 - received.texts.size());
}

TEST_F(LogSink, LetsWritersContinueAndKeepsItsCountWhileThePreviousSinkStillWrites)
{
    StoppedPipe terminal;
    const KEVRO_UInt64 before = KEVRO_Log_GetDroppedLines();
    std::future<std::vector<std::string>> reading;
    {
        const StderrRedirection redirection(terminal.WriteEnd());
        ConfigureSink("stderr,queue=1");
        for (int i = 0; i < 10; ++i) {
            EventLogger().Log("%d", i);
        }
        std::thread configurer([this] { ConfigureSink("file:" + m_LogFile); });
        while (ReadLines(m_LogFile).empty()) {
            EventLogger().Log("is the file in force yet?");
        }
        EXPECT_GE(KEVRO_Log_GetDroppedLines(), before + 8);
        reading = terminal.StartReading();
        configurer.join();
    }
    terminal.CloseWriteEnd();
    EXPECT_EQ(KEVRO_Log_GetDroppedLines(), before + Received(reading.get()).lost);
}

TEST_F(LogSink, DoesNotEndAFlushBeforeThePreviousSinkHasWritten)
{
    StoppedPipe terminal;
    std::future<std::vector<std::string>> reading;
    {
        const StderrRedirection redirection(terminal.WriteEnd());
        ConfigureSink("stderr,queue=10");
        EventLogger().Log("a line for the terminal");
        std::thread configurer([this] { ConfigureSink("file:" + m_LogFile); });
        while (ReadLines(m_LogFile).empty()) {
            EventLogger().Log("is the file in force yet?");
        }

        std::atomic<bool> flushed{false};
        porttesting::StartLine line(2);
        std::thread flusher([&] {
            line.Wait();
            KEVRO_Log_Flush();
            flushed = true;
        });
        line.Wait();
        for (int i = 0; i < 1000; ++i) {
            EventLogger().Log("gives a flush that does not wait time to return");
            std::this_thread::yield();
        }
        EXPECT_FALSE(flushed);

        reading = terminal.StartReading();
        flusher.join();
        configurer.join();
    }
    terminal.CloseWriteEnd();
    EXPECT_FALSE(reading.get().empty());
}

TEST_F(LogSink, CountsLinesThatTheSinkRejects)
{
    const KEVRO_UInt64 before = KEVRO_Log_GetDroppedLines();
    for (const char* sink : {"file:/dev/full", "file:/dev/full,queue=10"}) {
        ConfigureSink(sink);
        EventLogger().Log("lost");
        EventLogger().Log("lost, too");
    }
    ConfigureSink("stderr");
    EXPECT_EQ(KEVRO_Log_GetDroppedLines(), before + 4);
}

TEST_F(LogSink, ReportsTheFirstRejectedLineOnceOnStandardError)
{
    const std::string report =
        "Log lines are lost: Failed writing to file /dev/full: No space left on device\n";
    testing::internal::CaptureStderr();
    for (const char* sink : {"file:/dev/full", "file:/dev/full,queue=10"}) {
        ConfigureSink(sink);
        EventLogger().Log("lost");
        EventLogger().Log("lost, too");
    }
    ConfigureSink("file:" + m_LogFile);
    EXPECT_EQ(testing::internal::GetCapturedStderr(), report + report) << "once per sink";
}

TEST_F(LogSink, ReportsTheNumberOfLostLinesWhenItAcceptsLinesAgain)
{
    const int full = open("/dev/full", O_WRONLY);
    const int file = open(m_LogFile.c_str(), O_WRONLY | O_CREAT, 0600);
    {
        const StderrRedirection redirection(full);
        ConfigureSink("stderr");
        EventLogger().Log("lost");
        EventLogger().Log("lost, too");
        dup2(file, STDERR_FILENO);
        EventLogger().Log("written");
        EventLogger().Log("written, too");
    }
    close(full);
    close(file);
    const auto lines = ReadLines(m_LogFile);
    ASSERT_EQ(lines.size(), 3U);
    EXPECT_EQ(WithoutTime(lines[0]), "Common Warning: lines lost: 2");
    EXPECT_EQ(TextOf(lines[1]), "written");
    EXPECT_EQ(TextOf(lines[2]), "written, too");
}

TEST_F(LogSink, WaitsForANonBlockingTerminal)
{
    StoppedPipe terminal;
    const KEVRO_UInt64 before = KEVRO_Log_GetDroppedLines();
    terminal.SetNonBlocking(true);
    std::future<std::vector<std::string>> reading;
    {
        const StderrRedirection redirection(terminal.WriteEnd());
        ConfigureSink("stderr,queue=10");
        EventLogger().Log("%s", std::string(200000, 'x').c_str());
        reading = terminal.StartReading();
        ConfigureSink("file:" + m_LogFile);
    }
    terminal.CloseWriteEnd();
    const auto lines = reading.get();
    ASSERT_EQ(lines.size(), 1U);
    EXPECT_EQ(TextOf(lines[0]), std::string(200000, 'x'));
    EXPECT_EQ(KEVRO_Log_GetDroppedLines(), before);
}

} // namespace
