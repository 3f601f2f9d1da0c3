/**
 * @file
 * Exit statuses, errors and messages of the program.
 */
#ifndef DESKPLAYER_PROGRAM_FAILURE_H
#define DESKPLAYER_PROGRAM_FAILURE_H

#include <iostream>
#include <stdexcept>
#include <string>

namespace deskplayer
{

// Exit statuses.
constexpr int ExitOk = 0;
constexpr int ExitOutput = 1;
constexpr int ExitUsage = 2;
constexpr int ExitDisc = 3;
constexpr int ExitSession = 4;

/** The command line, the session or a log is invalid. */
class UsageError : public std::runtime_error
{
public:
    using std::runtime_error::runtime_error;
};

/** The output could not be written. */
class OutputError : public std::runtime_error
{
public:
    using std::runtime_error::runtime_error;
};

/** Writes one line to standard error, after the name of the program. */
inline void PrintMessage(const std::string& message)
{
    std::cerr << "bdmv-deskplayer: " << message << '\n';
}

} // namespace deskplayer

#endif
