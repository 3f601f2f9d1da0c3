/**
 * @file
 * Reads session files.
 */
#ifndef DESKPLAYER_PROGRAM_SESSIONFILE_H
#define DESKPLAYER_PROGRAM_SESSIONFILE_H

#include <string>
#include <vector>

#include "session/script.h"

namespace deskplayer
{

/**
 * The steps of a session file.
 *
 * @throw UsageError the file cannot be read, is too long, or is a pipe without input
 * @throw ScriptError the session is malformed
 */
std::vector<ScriptStep> ReadSessionFile(const std::string& fileName);

} // namespace deskplayer

#endif
