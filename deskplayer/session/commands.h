/**
 * @file
 * The commands of sessions.
 */
#ifndef DESKPLAYER_SESSION_COMMANDS_H
#define DESKPLAYER_SESSION_COMMANDS_H

#include <cstdint>
#include <vector>

#include "navigator/deskparts.h"
#include "navigator/outcome.h"
#include "session/script.h"

namespace deskplayer
{

/** A command: its syntax, and a function that performs it with the values of the placeholders. */
struct Command {
    CommandSyntax syntax;
    Outcome (*perform)(DeskParts& desk, const std::vector<std::uint64_t>& values);
};

/** All commands, in the order of the help. */
const std::vector<Command>& Commands();

/** Their syntaxes, in the same order, and those of expectations. */
const std::vector<CommandSyntax>& CommandSyntaxes();

/** Whether a step of CommandSyntaxes() is an expectation, which no command performs. */
bool IsExpectation(const ScriptStep& step);

} // namespace deskplayer

#endif
