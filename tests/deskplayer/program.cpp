#include "program.h"

#include <pty.h>
#include <sys/wait.h>

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
const char* const SecondsOfARun = "120";

/** Exit status of coreutils' timeout after it has killed the program. */
constexpr int TimedOut = 124;

ProgramResult ResultOf(int status, std::string output, std::string errors)
{
    ProgramResult result;
    result.status = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    result.output = std::move(output);
    result.errors = std::move(errors);
    if (result.status == TimedOut) {
        result.errors += "\nended by the test after " + std::string(SecondsOfARun) + " s\n";
    }
    return result;
}

/** @param preparation a shell command to run first */
ProgramResult Run(const std::string& preparation, const std::vector<std::string>& arguments,
                  const std::string& output)
{
    const std::filesystem::path folder =
        std::filesystem::temp_directory_path() / ("deskplayer-" + std::to_string(getpid()));
    std::filesystem::create_directories(folder);
    std::string command =
        preparation + "exec timeout " + SecondsOfARun + " " + Quoted(BDMVNAVIGATOR_DESKPLAYER);
    for (const std::string& argument : arguments) {
        command += ' ' + Quoted(argument);
    }
    command += " <&- >" + Quoted(output.empty() ? (folder / "output").string() : output) + " 2>" +
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

ProgramResult RunDeskPlayerOnTerminal(const std::vector<std::string>& arguments)
{
    int screen = -1;
    const pid_t program = forkpty(&screen, nullptr, nullptr, nullptr);
    if (program == 0) {
        // In the foreground, so that the program can use the terminal.
        std::vector<std::string> words = {"timeout", "--foreground", SecondsOfARun,
                                          BDMVNAVIGATOR_DESKPLAYER};
        words.insert(words.end(), arguments.begin(), arguments.end());
        std::vector<char*> pointers;
        for (std::string& word : words) {
            pointers.push_back(word.data());
        }
        pointers.push_back(nullptr);
        execvp(pointers.front(), pointers.data());
        _exit(127);
    }
    std::string output;
    char piece[1000];
    for (ssize_t size = 0; (size = read(screen, piece, sizeof piece)) > 0;) {
        output.append(piece, static_cast<std::size_t>(size));
    }
    close(screen);
    int status = 0;
    waitpid(program, &status, 0);
    return ResultOf(status, output, "");
}

ProgramResult RunDeskPlayerWithLimitedMemory(const std::vector<std::string>& arguments,
                                             unsigned long kibibytes)
{
    return Run("ulimit -S -v " + std::to_string(kibibytes) + " && ", arguments, "");
}
