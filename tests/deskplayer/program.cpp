#include "program.h"

#include <fcntl.h>
#include <poll.h>
#include <pty.h>
#include <sys/wait.h>
#include <termios.h>

#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <utility>

#include <unistd.h>

namespace
{

std::string ReadWhole(const std::filesystem::path& path)
{
    std::ostringstream content;
    content << std::ifstream(path, std::ios::binary).rdbuf();
    return content.str();
}

std::string Quoted(const std::string& word)
{
    std::string quoted = "'";
    for (const char character : word) {
        quoted += character == '\'' ? std::string("'\\''") : std::string(1, character);
    }
    return quoted + "'";
}

/** Longer than any run, even on a slow machine or in an emulator. */
constexpr unsigned SecondsOfARun = 120;

/** Exit status of coreutils' timeout after it has killed the program. */
constexpr int TimedOut = 124;

ProgramResult ResultOf(int status, std::string output, std::string errors)
{
    ProgramResult result;
    result.status = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    result.output = std::move(output);
    result.errors = std::move(errors);
    if (result.status == TimedOut) {
        result.errors += "\nended by the test after " + std::to_string(SecondsOfARun) + " s\n";
    }
    return result;
}

/** @param preparation a shell command to run first */
ProgramResult Run(const std::string& preparation, const std::vector<std::string>& arguments,
                  const std::string& output, const std::string& input = {})
{
    const std::filesystem::path folder =
        std::filesystem::temp_directory_path() / ("deskplayer-" + std::to_string(getpid()));
    std::filesystem::create_directories(folder);
    std::string command = preparation + "exec timeout " + std::to_string(SecondsOfARun) + " " +
                          Quoted(BDMVNAVIGATOR_DESKPLAYER);
    for (const std::string& argument : arguments) {
        command += ' ' + Quoted(argument);
    }
    command += input.empty() ? " <&-" : " <" + Quoted(input);
    command += " >" + Quoted(output.empty() ? (folder / "output").string() : output) + " 2>" +
               Quoted(folder / "errors");
    const int status = std::system(command.c_str());

    ProgramResult result = ResultOf(status, output.empty() ? ReadWhole(folder / "output") : "",
                                    ReadWhole(folder / "errors"));
    std::filesystem::remove_all(folder);
    return result;
}

} // namespace

ProgramResult RunDeskPlayer(const std::vector<std::string>& arguments, const std::string& output)
{
    return Run("", arguments, output);
}

ProgramResult RunDeskPlayerWithInput(const std::vector<std::string>& arguments,
                                     const std::string& input)
{
    return Run("", arguments, {}, input);
}

ProgramResult RunDeskPlayerOnTerminal(const std::vector<std::string>& arguments)
{
    return TerminalProgram(arguments).Finish();
}

TerminalProgram::TerminalProgram(const std::vector<std::string>& arguments,
                                 const std::string& output)
    : m_Program(forkpty(&m_Screen, nullptr, nullptr, nullptr))
{
    if (m_Program == 0) {
        if (!output.empty()) {
            dup2(open(output.c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600), STDOUT_FILENO);
        }
        std::vector<std::string> words = {BDMVNAVIGATOR_DESKPLAYER};
        words.insert(words.end(), arguments.begin(), arguments.end());
        std::vector<char*> pointers;
        for (std::string& word : words) {
            pointers.push_back(word.data());
        }
        pointers.push_back(nullptr);
        alarm(SecondsOfARun);
        execvp(pointers.front(), pointers.data());
        _exit(127);
    }
}

TerminalProgram::~TerminalProgram()
{
    if (m_Program > 0) {
        kill(m_Program, SIGKILL);
        Finish();
    }
    close(m_Screen);
}

bool TerminalProgram::WaitFor(const std::string& text)
{
    std::size_t found = m_Output.find(text, m_Seen);
    constexpr int silence = 20000; // milliseconds
    pollfd shown = {m_Screen, POLLIN, 0};
    while (found == std::string::npos && poll(&shown, 1, silence) > 0 && Read()) {
        found = m_Output.find(text, m_Seen);
    }
    if (found == std::string::npos) {
        return false;
    }
    m_Seen = found + text.size();
    return true;
}

void TerminalProgram::Press(const std::string& keys) const
{
    static_cast<void>(!write(m_Screen, keys.data(), keys.size()));
}

void TerminalProgram::Send(int signal) const
{
    kill(m_Program, signal);
}

bool TerminalProgram::HasUsualSettings() const
{
    termios settings = {};
    tcgetattr(m_Screen, &settings);
    return (settings.c_lflag & ICANON) != 0 && (settings.c_lflag & ECHO) != 0;
}

ProgramResult TerminalProgram::Finish()
{
    while (Read()) {
    }
    int status = 0;
    waitpid(m_Program, &status, 0);
    m_Program = -1;
    return ResultOf(status, m_Output, "");
}

bool TerminalProgram::Read()
{
    char piece[1000];
    const ssize_t size = read(m_Screen, piece, sizeof piece);
    m_Output.append(piece, static_cast<std::size_t>(size > 0 ? size : 0));
    return size > 0;
}

ProgramResult RunDeskPlayerWithLimitedMemory(const std::vector<std::string>& arguments,
                                             unsigned long kibibytes)
{
    return Run("ulimit -S -v " + std::to_string(kibibytes) + " && ", arguments, "");
}
