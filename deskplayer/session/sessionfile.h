/**
 * @file
 * Reads session files.
 */
#ifndef DESKPLAYER_SESSION_SESSIONFILE_H
#define DESKPLAYER_SESSION_SESSIONFILE_H

#include <string>

namespace deskplayer
{

/**
 * The text of a session file, for ParseScript(). Reading stops once the session is known to be too
 * long.
 *
 * @throw SessionError the file cannot be read, is too long, or is a pipe without input
 */
std::string ReadSessionText(const std::string& fileName);

} // namespace deskplayer

#endif
