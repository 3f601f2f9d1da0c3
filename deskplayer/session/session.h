/**
 * @file
 * Carries out sessions.
 */
#ifndef DESKPLAYER_SESSION_SESSION_H
#define DESKPLAYER_SESSION_SESSION_H

#include <functional>
#include <string>
#include <vector>

#include "session/commands.h"

namespace deskplayer
{

/** What a session calls when time passes, for commands and for expectations. */
struct SessionHooks {
    /**
     * Called before the clock advances by @p time; a session in real time waits here. May be empty.
     */
    std::function<void(Ticks time)> beforeTimePasses;

    /** Called before a command is carried out. May be empty. */
    std::function<void()> beforeCommand;

    /**
     * Called for an expectation at its time, with the name of a callback and its arguments as the
     * words of the step; no words expect no callback. May be empty: nothing is expected then.
     */
    std::function<void(const ScriptStep& step)> onExpectation;

    /** Called when a command was refused, with its line and the reason. May be empty. */
    std::function<void(std::size_t line, const std::string& reason)> onRefused;
};

/** What happens after the last step. */
enum class SessionEnd {
    PlayOn, ///< playback continues until it ends, waits for an operation, or would repeat forever
    Stay    ///< nothing: time stands still
};

/**
 * Carries out a script, each step at its time, which counts from the moment of the call.
 *
 * @throw any exception thrown by a listener
 */
void PlaySession(const std::vector<ScriptStep>& steps, DeskParts& desk, const SessionHooks& hooks,
                 SessionEnd end = SessionEnd::PlayOn);

/**
 * Plays from start to end without a viewer: an endless still is left after three seconds.
 *
 * @throw any exception thrown by a listener
 */
void PlayFromStartToEnd(DeskParts& desk, const SessionHooks& hooks);

} // namespace deskplayer

#endif
