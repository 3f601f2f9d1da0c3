/**
 * @file
 * Carrying out a session.
 */
#ifndef DESKPLAYER_SESSION_SESSION_H
#define DESKPLAYER_SESSION_SESSION_H

#include <functional>
#include <string>
#include <vector>

#include "session/commands.h"

namespace deskplayer
{

/** How a session goes about its time, and whom it tells what it cannot do. */
struct SessionHooks {
    /**
     * Called before the clock advances by @p time; a session in real time waits here. May be empty.
     */
    std::function<void(Ticks time)> beforeTimePasses;

    /** Called when a command was refused, with its line and the reason. */
    std::function<void(std::size_t line, const std::string& reason)> onRefused;
};

/**
 * Carries out a script, each step at its time, and then lets playback go on to its end, or to where
 * it would stand or go round for ever.
 *
 * @throw what a listener threw
 */
void PlaySession(const std::vector<ScriptStep>& steps, Desk& desk, const SessionHooks& hooks);

/**
 * Plays from start to end, without a viewer: a still that would never end is left after three
 * seconds.
 *
 * @throw what a listener threw
 */
void PlayFromStartToEnd(Desk& desk, const SessionHooks& hooks);

} // namespace deskplayer

#endif
