/**
 * @file
 * What the viewer of a remote control sees.
 */
#ifndef DESKPLAYER_PROGRAM_REMOTESCREEN_H
#define DESKPLAYER_PROGRAM_REMOTESCREEN_H

#include <cstddef>
#include <ostream>
#include <string>

#include "session/remote.h"

namespace deskplayer
{

/**
 * Writes to standard error: the keys, refusals, and, on a terminal, a status line at the bottom.
 *
 * The status line is there only while the remote waits, so that callbacks and log lines on the same
 * terminal appear above it. On a terminal a refusal is part of the status line until the next key;
 * otherwise it is a message.
 */
class RemoteScreen
{
public:
    /** Lists the keys. @param output is flushed before every wait; it and @p desk outlive this */
    RemoteScreen(DeskParts& desk, std::ostream& output);

    RemoteScreen(const RemoteScreen&) = delete;
    RemoteScreen& operator=(const RemoteScreen&) = delete;

    /** Hooks that call this object. */
    RemoteHooks Hooks();

private:
    void ShowStatus();
    void EraseStatus();
    void TakeKey(char key);
    void ShowRefusal(const std::string& reason);

    DeskParts& m_rDesk;
    std::ostream& m_rOutput;
    const bool m_OnTerminal;
    std::string m_Refusal;
    std::size_t m_Shown = 0; ///< the length of the status line on the screen
};

} // namespace deskplayer

#endif
