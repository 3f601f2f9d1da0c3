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

/** A key, its description, and its action. */
struct RemoteKey {
    char key;
    const char* help;
    Outcome (*perform)(DeskParts& desk);
};

/** The key whose only operation is RemoteHooks::onKey(), where a program lists the keys. */
constexpr char HelpKey = '?';

/** All keys except the one for help and those that quit, `q` and Ctrl-C. */
const std::vector<RemoteKey>& RemoteKeys();

/** The keys and their descriptions, in a few lines. */
std::string RemoteHelp();

/** What a remote calls. Each may be empty. */
struct RemoteHooks {
    /**
     * Called before every wait for a key or for the next change, when all callbacks so far have
     * been delivered.
     */
    std::function<void()> beforeWaiting;

    /** Called after every wait, before anything else happens. */
    std::function<void()> afterWaiting;

    /** Called with every key that does not quit, before its operation. */
    std::function<void(char key)> onKey;

    /** Called with the reason when the operation of a key was refused, or when there is none. */
    std::function<void(const std::string& reason)> onRefused;
};

/**
 * Plays in real time, controlled by keys from a terminal, until `q`, Ctrl-C, the end of the input,
 * or the end of playback. Input that is not a terminal is read unchanged. Line ends are no keys.
 *
 * The terminal's settings are restored at the end, even if a signal ends the program.
 *
 * @param keys file descriptor to read single characters from
 * @throw any exception thrown by a listener
 */
void PlayByRemote(DeskParts& desk, int keys, const RemoteHooks& hooks);

} // namespace deskplayer

#endif
