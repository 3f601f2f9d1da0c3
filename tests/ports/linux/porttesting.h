/**
 * @file
 * Helpers for tests of the port: files, standard error, programs with an environment.
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

/** A directory that is deleted with all its contents when the object is destroyed. */
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

/** Redirects standard error to a descriptor, still owned by the caller, while the object lives. */
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

/** The outcome of a program. */
struct Outcome {
    int exitCode; ///< -1 when a signal ended it, 124 when it took more than 30 s
    int signal;   ///< the signal that ended it, or 0
    std::string output;
    std::string errors; ///< standard error
};

/** Runs a program; its environment contains @p environment and no other variable of the port. */
Outcome Run(const std::vector<std::string>& command, const std::vector<std::string>& environment);

/** A reusable barrier: releases the threads at the same moment. */
class StartLine
{
public:
    explicit StartLine(unsigned threads) : m_Threads(threads) {}

    /** Returns once every thread has called it as often as this thread. */
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

/** Directs log lines to a file of the test. */
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
