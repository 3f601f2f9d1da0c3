/**
 * @file
 * Running a program and catching what it prints.
 */
#ifndef TESTS_DESKPLAYER_PROGRAM_H
#define TESTS_DESKPLAYER_PROGRAM_H

#include <string>
#include <vector>

/** What a program left behind. One that does not end within 30 s is ended. */
struct ProgramResult {
    int status = -1; ///< exit status; -1 when a signal ended it, 124 when the test did
    std::string output;
    std::string errors;
};

/**
 * Runs the desk player with these arguments and nothing to read, and waits for its end.
 *
 * @param output where its standard output goes; into the result unless given
 */
ProgramResult RunDeskPlayer(const std::vector<std::string>& arguments,
                            const std::string& output = {});

/** The same on a terminal, for input and all output: the result holds what the screen shows. */
ProgramResult RunDeskPlayerOnTerminal(const std::vector<std::string>& arguments);

/** The same with so many KiB of address space at the most. */
ProgramResult RunDeskPlayerInLittleMemory(const std::vector<std::string>& arguments,
                                          unsigned long kibibytes);

#endif
