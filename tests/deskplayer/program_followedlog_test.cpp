// Logs that are long, or still being written.

#include <fcntl.h>
#include <gtest/gtest.h>
#include <poll.h>
#include <sys/stat.h>
#include <unistd.h>

#include <atomic>
#include <cstdint>
#include <regex>
#include <string>
#include <thread>
#include <vector>

#include "programtest.h"

namespace
{

const std::string PausedAfterASecond = "00:00:01.000000 BdmvNavigator Event: Sending Paused\n";
const std::string StoppedAfterTwo = "00:00:02.000000 BdmvNavigator Event: Sending Stopped\n";

/** A named pipe. Neither end waits for the other to be opened. */
class Pipe
{
public:
    explicit Pipe(std::string name) : m_Name(std::move(name))
    {
        EXPECT_EQ(mkfifo(m_Name.c_str(), 0600), 0);
        m_Descriptor = open(m_Name.c_str(), O_RDWR | O_NONBLOCK | O_CLOEXEC);
    }

    ~Pipe() { Close(); }

    Pipe(const Pipe&) = delete;
    Pipe& operator=(const Pipe&) = delete;

    const std::string& Name() const { return m_Name; }

    /** @return false if nobody has read anything for 20 s */
    bool Write(std::string_view text) const
    {
        pollfd writable = {m_Descriptor, POLLOUT, 0};
        while (!text.empty() && poll(&writable, 1, Silence) > 0) {
            const ssize_t size = write(m_Descriptor, text.data(), text.size());
            text.remove_prefix(static_cast<std::size_t>(size > 0 ? size : 0));
        }
        return text.empty();
    }

    /** Reads until @p text has appeared. @return false if nothing was written for 20 s */
    bool WaitFor(const std::string& text)
    {
        pollfd readable = {m_Descriptor, POLLIN, 0};
        while (m_Read.find(text) == std::string::npos) {
            char piece[1000];
            if (poll(&readable, 1, Silence) <= 0) {
                return false;
            }
            const ssize_t size = read(m_Descriptor, piece, sizeof piece);
            m_Read.append(piece, static_cast<std::size_t>(size > 0 ? size : 0));
        }
        return true;
    }

    void Close()
    {
        if (m_Descriptor >= 0) {
            close(m_Descriptor);
            m_Descriptor = -1;
        }
    }

private:
    static constexpr int Silence = 20000; // milliseconds

    const std::string m_Name;
    int m_Descriptor = -1;
    std::string m_Read;
};

using FollowedLog = ScratchFolder;

TEST_F(FollowedLog, FromAPipeThatStaysOpenShowsEachCallbackAsItComes)
{
    for (const std::string format : {"text", "json", "trace"}) {
        Pipe log(folder / ("log." + format));
        Pipe output(folder / ("output." + format));
        ProgramResult result;
        std::thread program([&] {
            result = RunDeskPlayerWithInput(
                {"--field-log", "-", "--format", format, "--output", output.Name()}, log.Name());
        });

        EXPECT_TRUE(log.Write(PausedAfterASecond));
        EXPECT_TRUE(output.WaitFor("Paused")) << format;
        EXPECT_TRUE(log.Write(StoppedAfterTwo.substr(0, 30)));
        EXPECT_TRUE(log.Write(StoppedAfterTwo.substr(30)));
        EXPECT_TRUE(output.WaitFor("Stopped")) << format;

        log.Close();
        program.join();
        EXPECT_EQ(result.status, 0) << result.errors;
    }
}

/** What a terminal shows while a log is read that is written until progress is shown. */
std::string ScreenDuringALongLog(const std::string& folder, const std::vector<std::string>& options)
{
    Pipe log(folder + "/log");
    std::vector<std::string> arguments = {"--field-log", log.Name()};
    arguments.insert(arguments.end(), options.begin(), options.end());
    TerminalProgram program(arguments);
    std::atomic<bool> isShown{false};
    std::thread writer([&] {
        std::string part = "a foreign line\n";
        while (part.size() < 60000) {
            part += PausedAfterASecond;
        }
        while (!isShown && log.Write(part)) {
        }
    });
    isShown = program.WaitFor(" MiB");
    EXPECT_TRUE(isShown);
    writer.join();
    log.Close();
    const ProgramResult result = program.Finish();
    EXPECT_EQ(result.status, 0);
    return result.output.substr(0, 10000);
}

const std::string ErasedProgress = "(\r[0-9]+ MiB\r {5,}\r)+";

TEST_F(FollowedLog, ShowsProgressOnATerminalAndErasesItBeforeTheSummary)
{
    const std::string screen = ScreenDuringALongLog(folder, {"--summary"});
    EXPECT_TRUE(
        std::regex_search(screen, std::regex("^" + ErasedProgress + "Recording\r\n  begin ")))
        << testing::PrintToString(screen);
}

TEST_F(FollowedLog, ErasesItsProgressBeforeAMessage)
{
    const std::string screen = ScreenDuringALongLog(folder, {"--output", "/dev/null"});
    EXPECT_TRUE(
        std::regex_search(screen, std::regex("^" + ErasedProgress + "bdmv-deskplayer: skipped ")))
        << testing::PrintToString(screen);
}

TEST_F(FollowedLog, ShowsHowMuchOfTheFilesHasBeenRead)
{
    const std::string log = WriteFile("log", "");
    ResizeSparsely(log, std::uintmax_t{1} << 30);
    std::vector<std::string> arguments(101, log);
    arguments.front() = "--field-log";
    arguments.emplace_back("--summary");
    TerminalProgram program(arguments);

    EXPECT_TRUE(program.WaitFor(" of 102400 MiB, "));
    EXPECT_TRUE(program.WaitFor(" %\r"));
}

} // namespace
