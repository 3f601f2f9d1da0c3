/**
 * @file
 * Single keys as a remote control.
 */
#ifndef DESKPLAYER_SESSION_REMOTE_H
#define DESKPLAYER_SESSION_REMOTE_H

#include <functional>
#include <string>
#include <vector>

#include "session/commands.h"
#include "session/session.h"

namespace deskplayer
{

/** A key, what it is for, and what it does. */
struct RemoteKey {
    char key;
    const char* help;
    Outcome (*perform)(Desk& desk);
};

/** All keys but those that quit, `q` and Ctrl-C. */
const std::vector<RemoteKey>& RemoteKeys();

/** The keys and what they are for, in a few lines. */
std::string RemoteHelp();

/**
 * Plays in real time under the keys that are read from a terminal, until `q`, Ctrl-C, the end of
 * the input, or the end of playback. What is no terminal is read as it is.
 *
 * The terminal is put back as it was at the end, also when a signal ends the program.
 *
 * @param keys file descriptor to read single characters from
 * @param onRefused called when a key could not be obeyed, with the reason
 * @throw what a listener threw
 */
void PlayByRemote(Desk& desk, int keys,
                  const std::function<void(const std::string& reason)>& onRefused);

} // namespace deskplayer

#endif
