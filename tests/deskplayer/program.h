/**
 * @file
 * Runs programs and captures their output.
 */
#ifndef TESTS_DESKPLAYER_PROGRAM_H
#define TESTS_DESKPLAYER_PROGRAM_H

#include <string>
#include <vector>

/** The result of a program. Programs are killed after 30 s. */
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

/** The same with a terminal for input and all output; the result contains the screen's text. */
ProgramResult RunDeskPlayerOnTerminal(const std::vector<std::string>& arguments);

/** The same with a limited address space. */
ProgramResult RunDeskPlayerWithLimitedMemory(const std::vector<std::string>& arguments,
                                             unsigned long kibibytes);

#endif
