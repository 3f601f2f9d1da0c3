/**
 * @file
 * What several tests of the port need: files, standard error, programs with an environment.
 */
#ifndef TESTS_PORTS_LINUX_PORTTESTING_H
#define TESTS_PORTS_LINUX_PORTTESTING_H

#include <atomic>
#include <string>
#include <thread>
#include <vector>

#include <gtest/gtest.h>

#include "bd/logging.h"
#include "kevro_linux.h"

namespace porttesting
{

/** A directory that goes, with everything in it, when the object does. */
class TemporaryDirectory
{
public:
    TemporaryDirectory();
    ~TemporaryDirectory();

    TemporaryDirectory(const TemporaryDirectory&) = delete;
    TemporaryDirectory& operator=(const TemporaryDirectory&) = delete;

    std::string Path(const std::string& name) const { return m_Path + "/" + name; }

private:
    std::string m_Path;
};

/** The file's text, empty when there is no such file. */
std::string ReadFile(const std::string& path);

/** The file's lines. */
std::vector<std::string> ReadLines(const std::string& path);

/** A log line without its time. */
std::string WithoutTime(const std::string& line);

/** A log line's own text, without time, component and level. */
std::string TextOf(const std::string& line);

/** Everything that can be read until the other end is closed. Closes the descriptor. */
std::string ReadToEnd(int descriptor);

std::vector<std::string> SplitLines(const std::string& text);

/** Sends standard error to a descriptor, which stays the caller's, while the object lives. */
class StderrRedirection
{
public:
    explicit StderrRedirection(int descriptor);
    ~StderrRedirection();

    StderrRedirection(const StderrRedirection&) = delete;
    StderrRedirection& operator=(const StderrRedirection&) = delete;

private:
    int m_Saved;
};

/** What became of a program. */
struct Outcome {
    int exitCode; ///< -1 when a signal ended it, 124 when it took more than 30 s
    int signal;   ///< 0 when it ended by itself
    std::string output;
    std::string errors; ///< standard error
};

/** Runs a program; its environment holds @p environment and nothing else of the port's. */
Outcome Run(const std::vector<std::string>& command, const std::vector<std::string>& environment);

/** Lets threads go on at the same moment, as often as they like. */
class StartLine
{
public:
    explicit StartLine(unsigned threads) : m_Threads(threads) {}

    /** Returns when every thread has called it as often as this one. */
    void Wait()
    {
        const unsigned round = m_Arrived++ / m_Threads;
        while (m_Arrived < (round + 1) * m_Threads) {
            std::this_thread::yield();
        }
    }

private:
    const unsigned m_Threads;
    std::atomic<unsigned> m_Arrived{0};
};

/** Configures the sink; a refusal fails the test. */
void ConfigureSink(const std::string& text);

/** Lines go to a file of the test's own. */
class LogFileTest : public testing::Test
{
protected:
    LogFileTest() { ConfigureSink("file:" + m_LogFile); }
    ~LogFileTest() override { ConfigureSink("stderr"); }

    const TemporaryDirectory m_Directory;
    const std::string m_LogFile = m_Directory.Path("log");
};

/** Writes lines as the navigator's events do. */
inline bd::VargLogger EventLogger()
{
    return bd::VargLogger(bd::CompIdBdmvNavigator, KEVRO_Log_LevelEvent, 0);
}

} // namespace porttesting

#endif
