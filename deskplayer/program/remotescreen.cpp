#include "program/remotescreen.h"

#include <sys/ioctl.h>
#include <unistd.h>

#include <algorithm>
#include <iostream>

#include "program/failure.h"
#include "session/remotestatus.h"

namespace deskplayer
{

namespace
{

/** The characters of a line on the terminal, without the last, which may start a new line. */
std::size_t WidthOfTerminal()
{
    constexpr std::size_t usual = 80;
    winsize size = {};
    const bool known = ioctl(STDERR_FILENO, TIOCGWINSZ, &size) == 0 && size.ws_col > 1;
    return (known ? size.ws_col : usual) - 1;
}

} // namespace

RemoteScreen::RemoteScreen(DeskParts& desk, std::ostream& output)
    : m_rDesk(desk), m_rOutput(output), m_OnTerminal(isatty(STDERR_FILENO) != 0)
{
    std::cerr << RemoteHelp();
}

RemoteHooks RemoteScreen::Hooks()
{
    RemoteHooks hooks;
    hooks.beforeWaiting = [this] { ShowStatus(); };
    hooks.afterWaiting = [this] { EraseStatus(); };
    hooks.onKey = [this](char key) { TakeKey(key); };
    hooks.onRefused = [this](const std::string& reason) { ShowRefusal(reason); };
    return hooks;
}

void RemoteScreen::ShowStatus()
{
    m_rOutput.flush();
    if (!m_OnTerminal) {
        return;
    }
    // A refusal comes first, so that its reason is complete on a narrow terminal.
    std::string line;
    for (const std::string& part : {m_Refusal.empty() ? "" : "refused: " + m_Refusal,
                                    PlaybackSummary(m_rDesk), SelectionSummary(m_rDesk)}) {
        line += (line.empty() || part.empty() ? "" : "  ") + part;
    }
    line.resize(std::min(line.size(), WidthOfTerminal()));
    std::cerr << line << std::flush;
    m_Shown = line.size();
}

void RemoteScreen::EraseStatus()
{
    if (m_Shown != 0) {
        std::cerr << '\r' << std::string(m_Shown, ' ') << '\r' << std::flush;
        m_Shown = 0;
    }
}

void RemoteScreen::TakeKey(char key)
{
    m_Refusal.clear();
    if (key == HelpKey) {
        std::cerr << RemoteHelp();
    }
}

void RemoteScreen::ShowRefusal(const std::string& reason)
{
    if (m_OnTerminal) {
        m_Refusal = reason;
    } else {
        PrintMessage(reason);
    }
}

} // namespace deskplayer
