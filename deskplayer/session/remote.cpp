#include "session/remote.h"

#include <poll.h>
#include <termios.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <chrono>
#include <csignal>
#include <cstddef>
#include <sstream>

namespace deskplayer
{

namespace
{

typedef std::chrono::steady_clock Clock;

constexpr char QuitKey = 'q';
constexpr char ControlC = '\x03'; ///< quits as well: as a key, for the terminal must be put back

Outcome PauseOrContinue(Desk& desk)
{
    return desk.Navigator().CurrentStatus() == Status::Playing ? desk.Navigator().Pause()
                                                               : desk.Navigator().Continue();
}

Outcome PlayOrStop(Desk& desk)
{
    const Status status = desk.Navigator().CurrentStatus();
    return status == Status::Stopped || status == Status::Finished ? desk.Navigator().Play()
                                                                   : desk.Navigator().Stop();
}

/** One step faster in a direction; the first step from anything else is fast play. */
Outcome Faster(Desk& desk, bd::PlayDirectionDef direction)
{
    const bd::PlayMode& mode = desk.Navigator().Context().GetPlayMode();
    const bool goesOn = mode.Direction() == direction && mode.Speed() >= bd::PlaySpeedNormal;
    const int speed = goesOn ? std::min<int>(mode.Speed() + 1, bd::PlaySpeedFast12)
                             : static_cast<int>(bd::PlaySpeedFast1);
    return desk.Navigator().SetPlayMode(
        bd::PlayMode(direction, static_cast<bd::PlaySpeedDef>(speed)));
}

Outcome PerformNamed(Desk& desk, std::string_view pattern)
{
    const auto found =
        std::find_if(Commands().begin(), Commands().end(), [pattern](const Command& command) {
            return command.syntax.pattern == pattern;
        });
    return found->perform(desk, {});
}

/** Signals that end a program from outside, and that a program can still answer. */
constexpr std::array<int, 4> EndingSignals = {SIGHUP, SIGINT, SIGQUIT, SIGTERM};

/** The terminal to put back when a signal ends the program; there is one remote at a time. */
int g_Terminal = -1;
termios g_TerminalBefore = {};

extern "C" void PutTerminalBack(int signal)
{
    tcsetattr(g_Terminal, TCSANOW, &g_TerminalBefore);
    raise(signal); // its handler is gone: the program ends as it would have without one
}

/** Has a terminal give single keys without showing them; puts it back as it was. */
class SingleKeys
{
public:
    explicit SingleKeys(int terminal)
        : m_Terminal(terminal), m_Changed(tcgetattr(terminal, &m_Before) == 0)
    {
        if (!m_Changed) {
            return;
        }
        g_Terminal = m_Terminal;
        g_TerminalBefore = m_Before;
        struct sigaction putBack = {};
        putBack.sa_handler = PutTerminalBack;
        putBack.sa_flags = static_cast<int>(SA_RESETHAND);
        for (std::size_t i = 0; i < EndingSignals.size(); ++i) {
            sigaction(EndingSignals[i], nullptr, &m_Actions[i]);
            if (m_Actions[i].sa_handler == SIG_DFL) {
                sigaction(EndingSignals[i], &putBack, nullptr);
            }
        }
        termios single = m_Before;
        single.c_lflag &= ~static_cast<tcflag_t>(ICANON | ECHO | ISIG);
        single.c_cc[VMIN] = 1;
        single.c_cc[VTIME] = 0;
        tcsetattr(m_Terminal, TCSANOW, &single);
    }

    ~SingleKeys()
    {
        if (!m_Changed) {
            return;
        }
        tcsetattr(m_Terminal, TCSANOW, &m_Before);
        for (std::size_t i = 0; i < EndingSignals.size(); ++i) {
            sigaction(EndingSignals[i], &m_Actions[i], nullptr);
        }
    }

    SingleKeys(const SingleKeys&) = delete;
    SingleKeys& operator=(const SingleKeys&) = delete;

private:
    int m_Terminal;
    termios m_Before = {};
    std::array<struct sigaction, EndingSignals.size()> m_Actions = {};
    bool m_Changed;
};

/** Milliseconds until something happens by itself, for poll(). */
int TimeoutOf(const SimulatedNavigator& navigator)
{
    const std::optional<Ticks> next = navigator.TimeToNextChange();
    if (!next) {
        return -1;
    }
    const auto wait = std::min<std::chrono::milliseconds>(
        std::chrono::ceil<std::chrono::milliseconds>(*next), std::chrono::hours(1));
    return static_cast<int>(wait.count());
}

Ticks TimeSince(Clock::time_point start)
{
    return std::chrono::duration_cast<Ticks>(Clock::now() - start);
}

} // namespace

const std::vector<RemoteKey>& RemoteKeys()
{
    static const std::vector<RemoteKey> keys = {
        {' ', "pause/continue", PauseOrContinue},
        {'x', "stop/play", PlayOrStop},
        {'.', "step", [](Desk& d) { return PerformNamed(d, "step"); }},
        {'f', "faster", [](Desk& d) { return Faster(d, bd::PlayDirectionForward); }},
        {'r', "faster backward", [](Desk& d) { return Faster(d, bd::PlayDirectionBackward); }},
        {'w', "normal speed", [](Desk& d) { return PerformNamed(d, "forward"); }},
        {'n', "next chapter", [](Desk& d) { return PerformNamed(d, "chapter next"); }},
        {'p', "previous chapter", [](Desk& d) { return PerformNamed(d, "chapter previous"); }},
        {'o', "leave a still", [](Desk& d) { return PerformNamed(d, "still off"); }},
        {'a', "next audio", [](Desk& d) { return PerformNamed(d, "audio next"); }},
        {'s', "next subtitle", [](Desk& d) { return PerformNamed(d, "subtitle next"); }},
        {'g', "next angle", [](Desk& d) { return PerformNamed(d, "angle next"); }},
        {'m', "menu", [](Desk& d) { return PerformNamed(d, "menu on"); }},
        {'c', "close menu", [](Desk& d) { return PerformNamed(d, "menu off"); }},
        {'k', "button above", [](Desk& d) { return PerformNamed(d, "button previous"); }},
        {'j', "button below", [](Desk& d) { return PerformNamed(d, "button next"); }},
        {'e', "enter", [](Desk& d) { return PerformNamed(d, "button activate"); }},
        {'z', "standby", [](Desk& d) { return PerformNamed(d, "standby"); }},
        {'Z', "wake up", [](Desk& d) { return PerformNamed(d, "wake"); }},
    };
    return keys;
}

std::string RemoteHelp()
{
    constexpr std::size_t keysInALine = 4;
    constexpr std::size_t width = 22;

    std::ostringstream help;
    std::size_t column = 0;
    for (const RemoteKey& key : RemoteKeys()) {
        const std::string name = key.key == ' ' ? "space" : std::string(1, key.key);
        std::string entry = name + " " + key.help;
        entry.resize(std::max(entry.size() + 1, width), ' ');
        help << entry;
        if (++column % keysInALine == 0) {
            help << '\n';
        }
    }
    help << QuitKey << " or Ctrl-C quit\n";
    return help.str();
}

void PlayByRemote(Desk& desk, int keys,
                  const std::function<void(const std::string& reason)>& onRefused)
{
    const SingleKeys singleKeys(keys);
    const Clock::time_point start = Clock::now();
    desk.Navigator().Play();
    while (desk.Navigator().CurrentStatus() != Status::Finished) {
        pollfd input = {keys, POLLIN, 0};
        const int ready = poll(&input, 1, TimeoutOf(desk.Navigator()));
        const Ticks now = TimeSince(start);
        if (now > desk.Clock().Now()) {
            desk.Clock().Advance(desk.Navigator().Advance(now - desk.Clock().Now()));
        }
        if (ready <= 0) {
            continue;
        }
        char key = QuitKey;
        if (read(keys, &key, 1) <= 0 || key == QuitKey || key == ControlC) {
            return;
        }
        const auto found =
            std::find_if(RemoteKeys().begin(), RemoteKeys().end(),
                         [key](const RemoteKey& candidate) { return candidate.key == key; });
        if (found == RemoteKeys().end()) {
            continue;
        }
        const Outcome outcome = found->perform(desk);
        if (!outcome.IsDone()) {
            onRefused(outcome.Reason());
        }
    }
}

} // namespace deskplayer
