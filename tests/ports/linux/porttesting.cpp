#include "porttesting.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <system_error>

#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

namespace porttesting
{

namespace
{

void Check(bool succeeded, const char* what)
{
    if (!succeeded) {
        throw std::system_error(errno, std::generic_category(), what);
    }
}

} // namespace

TemporaryDirectory::TemporaryDirectory()
{
    std::string name = (std::filesystem::temp_directory_path() / "porttestXXXXXX").string();
    Check(mkdtemp(name.data()) != nullptr, "mkdtemp");
    m_Path = name;
}

TemporaryDirectory::~TemporaryDirectory()
{
    std::error_code ignored;
    std::filesystem::remove_all(m_Path, ignored);
}

std::string ReadFile(const std::string& path)
{
    std::ifstream file(path, std::ios::binary);
    std::ostringstream text;
    text << file.rdbuf();
    return text.str();
}

std::vector<std::string> ReadLines(const std::string& path)
{
    return SplitLines(ReadFile(path));
}

std::vector<std::string> SplitLines(const std::string& text)
{
    std::vector<std::string> lines;
    std::istringstream stream(text);
    for (std::string line; std::getline(stream, line);) {
        lines.push_back(line);
    }
    return lines;
}

std::string WithoutTime(const std::string& line)
{
    constexpr std::size_t TimeLength = sizeof("2000-01-01 00:00:00.000000 ") - 1;
    return line.size() < TimeLength ? "no time: " + line : line.substr(TimeLength);
}

std::string TextOf(const std::string& line)
{
    const std::size_t colon = WithoutTime(line).find(": ");
    return colon == std::string::npos ? "no text: " + line : WithoutTime(line).substr(colon + 2);
}

std::string ReadToEnd(int descriptor)
{
    std::string text;
    char buffer[4096];
    for (ssize_t count; (count = read(descriptor, buffer, sizeof(buffer))) != 0;) {
        if (count > 0) {
            text.append(buffer, static_cast<std::size_t>(count));
        } else {
            Check(errno == EINTR, "read");
        }
    }
    close(descriptor);
    return text;
}

StderrRedirection::StderrRedirection(int descriptor) : m_Saved(dup(STDERR_FILENO))
{
    Check(m_Saved >= 0 && dup2(descriptor, STDERR_FILENO) >= 0, "dup");
}

StderrRedirection::~StderrRedirection()
{
    dup2(m_Saved, STDERR_FILENO);
    close(m_Saved);
}

Outcome Run(const std::vector<std::string>& command, const std::vector<std::string>& environment)
{
    const TemporaryDirectory directory;
    const std::string outputFile = directory.Path("output");
    const std::string errorsFile = directory.Path("errors");

    const pid_t child = fork();
    Check(child >= 0, "fork");
    if (child == 0) {
        const rlimit noCore = {0, 0};
        setrlimit(RLIMIT_CORE, &noCore);
        for (const char* name : {"KEVRO_LOG", "KEVRO_LOG_SINK", "KEVRO_ASSERT", "KEVRO_UOPMASK"}) {
            unsetenv(name);
        }
        for (const std::string& setting : environment) {
            const std::size_t equals = setting.find('=');
            setenv(setting.substr(0, equals).c_str(), setting.substr(equals + 1).c_str(), 1);
        }
        std::vector<char*> arguments = {const_cast<char*>("timeout"), const_cast<char*>("30")};
        for (const std::string& argument : command) {
            arguments.push_back(const_cast<char*>(argument.c_str()));
        }
        arguments.push_back(nullptr);
        if (std::freopen(outputFile.c_str(), "w", stdout) != nullptr &&
            std::freopen(errorsFile.c_str(), "a", stderr) != nullptr) {
            execvp(arguments[0], arguments.data());
        }
        _exit(127);
    }
    int status = 0;
    Check(waitpid(child, &status, 0) == child, "waitpid");
    return Outcome{WIFEXITED(status) ? WEXITSTATUS(status) : -1,
                   WIFSIGNALED(status) ? WTERMSIG(status) : 0, ReadFile(outputFile),
                   ReadFile(errorsFile)};
}

void ConfigureSink(const std::string& text)
{
    char message[256];
    EXPECT_TRUE(KEVRO_Log_ConfigureSink(text.c_str(), message, sizeof(message))) << message;
}

} // namespace porttesting
