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

#include "text/printable.h"

namespace deskplayer
{

namespace
{

typedef std::chrono::steady_clock Clock;

constexpr char QuitKey = 'q';
constexpr char ControlC = '\x03'; ///< a key, not a signal, so that the terminal is restored

Outcome PauseOrContinue(DeskParts& desk)
{
    return desk.Navigator().CurrentStatus() == Status::Playing ? desk.Navigator().Pause()
                                                               : desk.Navigator().Continue();
}

Outcome PlayOrStop(DeskParts& desk)
{
    const Status status = desk.Navigator().CurrentStatus();
    return status == Status::Stopped || status == Status::Finished ? desk.Navigator().Play()
                                                                   : desk.Navigator().Stop();
}

Outcome SetSpeed(DeskParts& desk, bd::PlayDirectionDef direction, int speed)
{
    return desk.Navigator().SetPlayMode(
        bd::PlayMode(direction, static_cast<bd::PlaySpeedDef>(speed)));
}

/** One step faster in a direction; from another direction or slow motion, the first fast step. */
Outcome Faster(DeskParts& desk, bd::PlayDirectionDef direction)
{
    const bd::PlayMode& mode = desk.Navigator().Context().GetPlayMode();
    const bool accelerates = mode.Direction() == direction && mode.Speed() >= bd::PlaySpeedNormal;
    return SetSpeed(desk, direction,
                    accelerates ? std::min<int>(mode.Speed() + 1, bd::PlaySpeedFast12)
                                : static_cast<int>(bd::PlaySpeedFast1));
}

/** One step slower in a direction; from another direction or fast play, the first slow step. */
Outcome Slower(DeskParts& desk, bd::PlayDirectionDef direction)
{
    const bd::PlayMode& mode = desk.Navigator().Context().GetPlayMode();
    const bool slowsDown = mode.Direction() == direction && mode.Speed() <= bd::PlaySpeedNormal;
    return SetSpeed(desk, direction,
                    slowsDown ? std::max<int>(mode.Speed() - 1, bd::PlaySpeedSlow5)
                              : static_cast<int>(bd::PlaySpeedSlow1));
}

constexpr Ticks SeekDistance = std::chrono::seconds(10);

Outcome SeekBackward(DeskParts& desk)
{
    const Ticks position(desk.Navigator().Context().GetCurrentTimePosition());
    return desk.Navigator().SearchTime(position - std::min(position, SeekDistance));
}

Outcome SeekForward(DeskParts& desk)
{
    const Ticks position(desk.Navigator().Context().GetCurrentTimePosition());
    return desk.Navigator().SearchTime(position + SeekDistance);
}

/** Sets A, then B, and then ends the repeat. */
Outcome NextStepOfABRepeat(DeskParts& desk)
{
    switch (desk.Navigator().Context().GetCurrentABRepeatState()) {
    case bd::TRIGGER_A:
        return desk.Navigator().SetPointB();
    case bd::TRIGGER_B:
        return desk.Navigator().EndABRepeat();
    default:
        return desk.Navigator().SetPointA();
    }
}

Outcome ShowOrHideSubtitles(DeskParts& desk)
{
    return desk.Navigator().ShowSubtitles(!desk.Navigator().Context().GetPgTextStDisplay());
}

Outcome ShowOrHidePictureInPicture(DeskParts& desk)
{
    return desk.Navigator().ShowSecondaryVideo(
        !desk.Navigator().Context().GetSecondaryVideoDisplay());
}

Outcome PerformCommand(DeskParts& desk, std::string_view pattern)
{
    const auto found =
        std::find_if(Commands().begin(), Commands().end(), [pattern](const Command& command) {
            return command.syntax.pattern == pattern;
        });
    return found->perform(desk, {});
}

/** Signals that terminate a program and that it can handle. */
constexpr std::array<int, 5> TerminatingSignals = {SIGHUP, SIGINT, SIGQUIT, SIGTERM, SIGPIPE};

/** The terminal to restore when a signal ends the program. Only one remote exists at a time. */
int g_Terminal = -1;
termios g_TerminalBefore = {};

extern "C" void RestoreTerminal(int signal)
{
    tcsetattr(g_Terminal, TCSANOW, &g_TerminalBefore);
    raise(signal); // SA_RESETHAND removed the handler, so the default action ends the program
}

/** Makes a terminal deliver single keys without echo, and restores its settings. */
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
        struct sigaction restore = {};
        restore.sa_handler = RestoreTerminal;
        restore.sa_flags = static_cast<int>(SA_RESETHAND);
        for (std::size_t i = 0; i < TerminatingSignals.size(); ++i) {
            sigaction(TerminatingSignals[i], nullptr, &m_Actions[i]);
            if (m_Actions[i].sa_handler == SIG_DFL) {
                sigaction(TerminatingSignals[i], &restore, nullptr);
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
        for (std::size_t i = 0; i < TerminatingSignals.size(); ++i) {
            sigaction(TerminatingSignals[i], &m_Actions[i], nullptr);
        }
    }

    SingleKeys(const SingleKeys&) = delete;
    SingleKeys& operator=(const SingleKeys&) = delete;

private:
    int m_Terminal;
    termios m_Before = {};
    std::array<struct sigaction, TerminatingSignals.size()> m_Actions = {};
    bool m_Changed;
};

/** Milliseconds until the next change without an operation, for poll(). */
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

Outcome Perform(DeskParts& desk, char key)
{
    const auto found =
        std::find_if(RemoteKeys().begin(), RemoteKeys().end(),
                     [key](const RemoteKey& candidate) { return candidate.key == key; });
    if (found != RemoteKeys().end()) {
        return found->perform(desk);
    }
    return key == HelpKey ? Outcome::Done()
                          : Outcome::Refused("no key '" + Printable({&key, 1}) + "'; " + HelpKey +
                                             " lists the keys");
}

} // namespace

const std::vector<RemoteKey>& RemoteKeys()
{
    static const std::vector<RemoteKey> keys = {
        {' ', "pause/continue", PauseOrContinue},
        {'x', "stop/play", PlayOrStop},
        {'.', "step", [](DeskParts& d) { return PerformCommand(d, "step"); }},
        {'f', "faster", [](DeskParts& d) { return Faster(d, bd::PlayDirectionForward); }},
        {'r', "faster backward", [](DeskParts& d) { return Faster(d, bd::PlayDirectionBackward); }},
        {'d', "slower", [](DeskParts& d) { return Slower(d, bd::PlayDirectionForward); }},
        {'v', "slower backward", [](DeskParts& d) { return Slower(d, bd::PlayDirectionBackward); }},
        {'w', "normal speed", [](DeskParts& d) { return PerformCommand(d, "forward"); }},
        {'n', "next chapter", [](DeskParts& d) { return PerformCommand(d, "chapter next"); }},
        {'p', "previous chapter",
         [](DeskParts& d) { return PerformCommand(d, "chapter previous"); }},
        {'h', "back 10 s", SeekBackward},
        {'l', "ahead 10 s", SeekForward},
        {'b', "A-B repeat", NextStepOfABRepeat},
        {'o', "leave a still", [](DeskParts& d) { return PerformCommand(d, "still off"); }},
        {'a', "next audio", [](DeskParts& d) { return PerformCommand(d, "audio next"); }},
        {'s', "next subtitle", [](DeskParts& d) { return PerformCommand(d, "subtitle next"); }},
        {'u', "subtitles on/off", ShowOrHideSubtitles},
        {'i', "pip on/off", ShowOrHidePictureInPicture},
        {'g', "next angle", [](DeskParts& d) { return PerformCommand(d, "angle next"); }},
        {'m', "open menu", [](DeskParts& d) { return PerformCommand(d, "menu on"); }},
        {'c', "close menu", [](DeskParts& d) { return PerformCommand(d, "menu off"); }},
        {'k', "button above", [](DeskParts& d) { return PerformCommand(d, "button previous"); }},
        {'j', "button below", [](DeskParts& d) { return PerformCommand(d, "button next"); }},
        {'e', "activate button", [](DeskParts& d) { return PerformCommand(d, "button activate"); }},
        {'z', "standby", [](DeskParts& d) { return PerformCommand(d, "standby"); }},
        {'Z', "wake up", [](DeskParts& d) { return PerformCommand(d, "wake"); }},
    };
    return keys;
}

std::string RemoteHelp()
{
    constexpr std::size_t keysPerLine = 4;
    constexpr std::size_t width = 22;

    std::ostringstream help;
    std::size_t column = 0;
    for (const RemoteKey& key : RemoteKeys()) {
        const std::string name = key.key == ' ' ? "space" : std::string(1, key.key);
        std::string entry = name + " " + key.help;
        entry.resize(std::max(entry.size() + 1, width), ' ');
        help << entry;
        if (++column % keysPerLine == 0) {
            help << '\n';
        }
    }
    help << (column % keysPerLine == 0 ? "" : "\n") << HelpKey << " list the keys       " << QuitKey
         << " or Ctrl-C quit\n";
    return help.str();
}

void PlayByRemote(DeskParts& desk, int keys, const RemoteHooks& hooks)
{
    const SingleKeys singleKeys(keys);
    const Clock::time_point start = Clock::now();
    desk.Navigator().Play();
    while (desk.Navigator().CurrentStatus() != Status::Finished) {
        if (hooks.beforeWaiting) {
            hooks.beforeWaiting();
        }
        pollfd input = {keys, POLLIN, 0};
        const int ready = poll(&input, 1, TimeoutOf(desk.Navigator()));
        if (hooks.afterWaiting) {
            hooks.afterWaiting();
        }
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
        if (key == '\n' || key == '\r') {
            continue;
        }
        if (hooks.onKey) {
            hooks.onKey(key);
        }
        const Outcome outcome = Perform(desk, key);
        if (!outcome.IsDone() && hooks.onRefused) {
            hooks.onRefused(outcome.Reason());
        }
    }
}

} // namespace deskplayer
