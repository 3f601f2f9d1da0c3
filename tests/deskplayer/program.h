/**
 * @file
 * Runs programs and captures their output.
 */
#ifndef TESTS_DESKPLAYER_PROGRAM_H
#define TESTS_DESKPLAYER_PROGRAM_H

#include <sys/types.h>

#include <cstddef>
#include <string>
#include <vector>

/** The result of a program. Programs are killed after two minutes. */
struct ProgramResult {
    int status = -1; ///< exit status; -1 if ended by a signal, 124 if killed by the test
    std::string output;
    std::string errors;
};

/**
 * Runs the desk player with these arguments and empty input, and waits until it ends.
 *
 * @param output file for its standard output; by default, it is returned in the result
 */
ProgramResult RunDeskPlayer(const std::vector<std::string>& arguments,
                            const std::string& output = {});

/** The same with a file for its standard input. */
ProgramResult RunDeskPlayerWithInput(const std::vector<std::string>& arguments,
                                     const std::string& input);

/** The same with a terminal for input and all output; the result contains the screen's text. */
ProgramResult RunDeskPlayerOnTerminal(const std::vector<std::string>& arguments);

/** The desk player with a terminal for input and all output, unless the arguments redirect it. */
class TerminalProgram
{
public:
    /** @param output file for its standard output; by default the terminal */
    explicit TerminalProgram(const std::vector<std::string>& arguments,
                             const std::string& output = {});
    ~TerminalProgram();

    TerminalProgram(const TerminalProgram&) = delete;
    TerminalProgram& operator=(const TerminalProgram&) = delete;

    /**
     * Waits until the screen has shown @p text since the last wait.
     *
     * @return false if the program ended, or showed nothing for 20 s
     */
    bool WaitFor(const std::string& text);

    void Press(const std::string& keys) const;

    void Send(int signal) const;

    /** Whether the terminal echoes and delivers whole lines, as before the program. */
    bool HasUsualSettings() const;

    /** Waits until the program has ended. The result has everything that the screen has shown. */
    ProgramResult Finish();

private:
    bool Read();

    int m_Screen = -1;
    pid_t m_Program;
    std::string m_Output;
    std::size_t m_Seen = 0;
};

/** The same with a limited address space. */
ProgramResult RunDeskPlayerWithLimitedMemory(const std::vector<std::string>& arguments,
                                             unsigned long kibibytes);

#endif
