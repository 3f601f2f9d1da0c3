/**
 * @file
 * The commands that sessions are made of.
 */
#ifndef DESKPLAYER_SESSION_COMMANDS_H
#define DESKPLAYER_SESSION_COMMANDS_H

#include <cstdint>
#include <vector>

#include "navigator/desk.h"
#include "navigator/outcome.h"
#include "session/script.h"

namespace deskplayer
{

/** A command: how it is written, and what it does with the values of its placeholders. */
struct Command {
    CommandSyntax syntax;
    Outcome (*perform)(Desk& desk, const std::vector<std::uint64_t>& values);
};

/** All commands, in the order in which help lists them. */
const std::vector<Command>& Commands();

/** Their syntaxes, in the same order. */
const std::vector<CommandSyntax>& CommandSyntaxes();

} // namespace deskplayer

#endif
