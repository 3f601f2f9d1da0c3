#include "session/remote.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <pty.h>
#include <termios.h>
#include <unistd.h>

#include <csignal>
#include <cstring>
#include <functional>
#include <set>
#include <sstream>

#include "../testdesk.h"
#include "text/printable.h"

namespace deskplayer
{

namespace
{

constexpr char ControlC = '\x03';

/** An item of an hour, so that playback does not end, with chapters every ten minutes. */
PlayList LongPlayList()
{
    return ListOf({RichItem(3600), RichItem(10)}, {Entry(0, Ticks(0)), Entry(0, 600 * Second)});
}

/** A pipe with keys to read. */
class Keys
{
public:
    explicit Keys(const std::string& keys)
    {
        EXPECT_EQ(pipe(m_Ends), 0);
        EXPECT_EQ(write(m_Ends[1], keys.data(), keys.size()), static_cast<ssize_t>(keys.size()));
    }

    ~Keys()
    {
        close(m_Ends[0]);
        End();
    }

    Keys(const Keys&) = delete;
    Keys& operator=(const Keys&) = delete;

    /** Ends the input. */
    void End()
    {
        if (m_Ends[1] >= 0) {
            close(m_Ends[1]);
        }
        m_Ends[1] = -1;
    }

    int Descriptor() const { return m_Ends[0]; }

    /** The number of unread keys. */
    std::size_t Left() const
    {
        fcntl(m_Ends[0], F_SETFL, O_NONBLOCK);
        char rest[100];
        const ssize_t size = read(m_Ends[0], rest, sizeof rest);
        return size > 0 ? static_cast<std::size_t>(size) : 0;
    }

private:
    int m_Ends[2] = {-1, -1};
};

/** Callbacks without their times, which depend on the wall clock. */
std::string WithoutTimes(const std::string& received)
{
    std::istringstream lines(received);
    std::string callbacks;
    for (std::string line; std::getline(lines, line);) {
        callbacks += line.substr(line.find(' ') + 1) + "\n";
    }
    return callbacks;
}

/** Presses keys one after the other. @return the refusals, one per line */
std::string Press(TestDesk& desk, const std::string& pressed)
{
    std::string refusals;
    Keys keys(pressed);
    keys.End();
    RemoteHooks hooks;
    hooks.onRefused = [&refusals](const std::string& reason) { refusals += reason + "\n"; };
    PlayByRemote(desk.desk, keys.Descriptor(), hooks);
    return refusals;
}

/** The callbacks of keys that are pressed after others, and the refusals. */
std::string CallbacksOfKeys(TestDesk& desk, const std::string& before, const std::string& keys)
{
    Press(desk, before);
    desk.Take();
    const std::string refusals = Press(desk, keys);
    return WithoutTimes(desk.TakeWithoutPositions()) + refusals;
}

struct KeyExample {
    const char* before; ///< keys pressed as preparation
    char key;
    const char* received;
};

TEST(Remote, PerformsTheActionOfEveryKey)
{
    const KeyExample examples[] = {
        {"", ' ', "Paused()\n"},
        {" ", ' ', "Continued(PlayDirectionForward, PlaySpeedNormal)\n"},
        {"", 'x', "Stopped()\n"},
        {" ", '.', nullptr}, // reports a position that depends on the wall clock
        {"", 'f',
         "PlayMode(PlayDirectionForward, "
         "PlaySpeedFast1)\nPictureInPictureUnavailable()\nSecondaryAudioUnavailable()\n"},
        {"f", 'f', "PlayMode(PlayDirectionForward, PlaySpeedFast2)\n"},
        {"nf", 'r', "PlayMode(PlayDirectionBackward, PlaySpeedFast1)\n"},
        {"nr", 'r', "PlayMode(PlayDirectionBackward, PlaySpeedFast2)\n"},
        {"f", 'w',
         "PlayMode(PlayDirectionForward, "
         "PlaySpeedNormal)\nPictureInPictureAvailable()\nSecondaryAudioAvailable()\n"},
        {"", 'd',
         "PlayMode(PlayDirectionForward, "
         "PlaySpeedSlow1)\nPictureInPictureUnavailable()\nSecondaryAudioUnavailable()\n"},
        {"d", 'd', "PlayMode(PlayDirectionForward, PlaySpeedSlow2)\n"},
        {"f", 'd', "PlayMode(PlayDirectionForward, PlaySpeedSlow1)\n"},
        {"nd", 'v', "PlayMode(PlayDirectionBackward, PlaySpeedSlow1)\n"},
        {"nv", 'v', "PlayMode(PlayDirectionBackward, PlaySpeedSlow2)\n"},
        {"", 'h', "JumpOccurred()\nMarkInfo(7, 0, 0)\n"},
        {"", 'l', nullptr}, // reports a position that depends on the wall clock
        {"", 'b', nullptr}, // likewise
        {"", 'u', "PresentationGraphicsDisplay(false)\n"},
        {"u", 'u', "PresentationGraphicsDisplay(true)\n"},
        {"", 'i', "SecondaryVideoDisplay(1, true)\n"},
        {"i", 'i', "SecondaryVideoDisplay(1, false)\n"},
        {"", 'n', "JumpOccurred()\nMarkInfo(7, 1, 27000000)\nChapterNumber(2)\n"},
        {"n", 'p', "JumpOccurred()\nMarkInfo(7, 0, 0)\nChapterNumber(1)\n"},
        {"", 'o', "not in a still, but playing\n"},
        {"", 'a',
         "AudioInfo(2)\nAudioInfoChanged(true, (AudioFormatPcm, AudioSampleRateUnknown, "
         "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 4353, 0))\n"},
        {"", 's', "PresentationGraphicsInfo(2, true)\n"},
        {"", 'g', "AngleInfo(2)\n"},
        {"", 'm', "InteractiveGraphicsActive()\nInteractiveGraphicsVisible()\n"},
        {"m", 'c', "InteractiveGraphicsInvisible()\nInteractiveGraphicsInactive()\n"},
        {"m", 'k', "no button 0; buttons are numbered 1 to 2\n"},
        {"mj", 'j', "no button 3; buttons are numbered 1 to 2\n"},
        {"mj", 'e',
         "ButtonActivationBusy()\nExecuteButton(1, 2, program shared by 2)\n"
         "ButtonActivationDone()\nInteractiveGraphicsInvisible()\nInteractiveGraphicsInactive()\n"
         "JumpOccurred()\nMarkInfo(7, 1, 27000000)\nChapterNumber(2)\n"},
        {"", 'z', nullptr}, // reports a position that depends on the wall clock
        {"", 'Z', "not in standby, but playing\n"},
    };
    std::set<char> keys;
    for (const KeyExample& example : examples) {
        SCOPED_TRACE(example.key);
        keys.insert(example.key);
        if (example.received != nullptr) {
            TestDesk desk(LongPlayList());
            EXPECT_EQ(CallbacksOfKeys(desk, example.before, {example.key}), example.received);
        }
    }
    for (const RemoteKey& key : RemoteKeys()) {
        EXPECT_EQ(keys.count(key.key), 1) << key.key << " has no example";
    }
    EXPECT_EQ(keys.size(), RemoteKeys().size());
}

TEST(Remote, StepsWhilePaused)
{
    TestDesk desk(LongPlayList());

    const std::string received = CallbacksOfKeys(desk, " ", ".");

    EXPECT_EQ(received.rfind("Stepped(", 0), 0) << received;
}

TEST(Remote, PlaysAgainAfterAStop)
{
    TestDesk desk(LongPlayList());

    const std::string received = CallbacksOfKeys(desk, "", "xx");

    EXPECT_EQ(received.rfind("Stopped()\nPlayStarted()\n", 0), 0) << received;
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Playing);
}

TEST(Remote, GoesToStandbyAndWakesUp)
{
    TestDesk inStandby(LongPlayList());
    CallbacksOfKeys(inStandby, "", "z");
    EXPECT_EQ(inStandby.navigator.CurrentStatus(), Status::Standby);

    TestDesk awakened(LongPlayList());
    CallbacksOfKeys(awakened, "n", "zZ");
    EXPECT_EQ(awakened.navigator.CurrentStatus(), Status::Playing);
    EXPECT_GE(Ticks(awakened.navigator.Context().GetCurrentTimePosition()), 600 * Second);
}

TEST(Remote, PlaysNoFasterThanTheFastest)
{
    TestDesk desk(LongPlayList());

    CallbacksOfKeys(desk, " ", std::string(20, 'f'));
    EXPECT_EQ(desk.navigator.Context().GetPlayMode(),
              bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedFast12));
}

TEST(Remote, PlaysFasterBackwardStepByStep)
{
    TestDesk desk(LongPlayList());

    CallbacksOfKeys(desk, " ", "frr");
    EXPECT_EQ(desk.navigator.Context().GetPlayMode(),
              bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast2));
}

TEST(Remote, LeavesAStill)
{
    TestDesk desk(ListOf({WithEndlessStill(ItemOfTicks(Ticks(1)))}));
    class Presser : public bdmv::NavigatorListenerAdapter
    {
    public:
        void StillOn() override { onStill(); }
        std::function<void()> onStill;
    } presser;
    desk.desk.Listeners().AddListener(&presser);
    int ends[2];
    ASSERT_EQ(pipe(ends), 0);
    presser.onStill = [&ends] { EXPECT_EQ(write(ends[1], "o", 1), 1); };

    RemoteHooks hooks;
    hooks.onRefused = [](const std::string& reason) { ADD_FAILURE() << reason; };
    PlayByRemote(desk.desk, ends[0], hooks);

    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Finished);
    close(ends[0]);
    close(ends[1]);
    desk.desk.Listeners().RemoveListener(&presser);
}

TEST(Remote, EndsWithQAndReadsNoFurther)
{
    TestDesk desk(LongPlayList());
    Keys keys(" q  x");

    PlayByRemote(desk.desk, keys.Descriptor(), {});

    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Paused);
    EXPECT_EQ(keys.Left(), 3);
}

TEST(Remote, EndsAtTheEndOfTheInput)
{
    TestDesk desk(LongPlayList());
    Keys keys(" ");
    keys.End();

    PlayByRemote(desk.desk, keys.Descriptor(), {});

    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Paused);
}

TEST(Remote, EndsWithoutAnInput)
{
    TestDesk desk(LongPlayList());

    PlayByRemote(desk.desk, 1000000, {});

    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Playing);
}

TEST(Remote, EndsAtTheEndOfPlayback)
{
    TestDesk desk(ListOf({ItemOfTicks(Second / 10)}));
    Keys keys("");

    PlayByRemote(desk.desk, keys.Descriptor(), {});

    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Finished);
    EXPECT_GE(desk.clock.Now(), Second / 10) << "on the wall clock";
}

TEST(Remote, SeeksTenSecondsBackAndAhead)
{
    TestDesk desk(LongPlayList());
    PlaybackContext& context = desk.navigator.Context();

    CallbacksOfKeys(desk, " ", "lll");
    EXPECT_GE(Ticks(context.GetCurrentTimePosition()), 30 * Second);
    EXPECT_LT(Ticks(context.GetCurrentTimePosition()), 60 * Second);

    TestDesk again(LongPlayList());
    CallbacksOfKeys(again, "n", "h");
    EXPECT_GE(Ticks(again.navigator.Context().GetCurrentTimePosition()), 590 * Second);
    EXPECT_LT(Ticks(again.navigator.Context().GetCurrentTimePosition()), 600 * Second);
}

TEST(Remote, SetsAThenBAndThenEndsTheRepeat)
{
    TestDesk desk(LongPlayList());
    PlaybackContext& context = desk.navigator.Context();

    Press(desk, "b");
    EXPECT_EQ(context.GetCurrentABRepeatState(), bd::TRIGGER_A);

    TestDesk both(LongPlayList());
    Press(both, "blb");
    EXPECT_EQ(both.navigator.Context().GetCurrentABRepeatState(), bd::TRIGGER_B);

    TestDesk ended(LongPlayList());
    Press(ended, "blbb");
    EXPECT_EQ(ended.navigator.Context().GetCurrentABRepeatState(), bd::TRIGGER_AB_NONE);
}

TEST(Remote, PlaysNoSlowerThanTheSlowest)
{
    TestDesk desk(LongPlayList());

    CallbacksOfKeys(desk, " ", std::string(20, 'd'));
    EXPECT_EQ(desk.navigator.Context().GetPlayMode(),
              bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedSlow5));
}

TEST(Remote, RefusesEveryUnknownKey)
{
    std::string refusals;
    std::string others;
    for (int key = 0; key < 256; ++key) {
        const auto character = static_cast<char>(key);
        const auto& known = RemoteKeys();
        if (std::string("q?\r\n").find(character) == std::string::npos && character != ControlC &&
            std::none_of(known.begin(), known.end(), [character](const RemoteKey& remoteKey) {
                return remoteKey.key == character;
            })) {
            others += character;
            refusals += "no key '" + Printable({&character, 1}) + "'; ? lists the keys\n";
        }
    }
    TestDesk desk(LongPlayList());

    EXPECT_EQ(CallbacksOfKeys(desk, "", others), refusals);
}

TEST(Remote, IgnoresLineEndsAndTheKeyForHelp)
{
    TestDesk desk(LongPlayList());

    EXPECT_EQ(CallbacksOfKeys(desk, "", "\r\n?"), "");
}

TEST(Remote, ReportsEveryKeyBeforeItsOperation)
{
    TestDesk desk(LongPlayList());
    Keys keys(" ?y\nq");
    std::string pressed;
    RemoteHooks hooks;
    hooks.onKey = [&](char key) {
        pressed += key;
        if (key == ' ') {
            EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Playing);
        }
    };

    PlayByRemote(desk.desk, keys.Descriptor(), hooks);

    EXPECT_EQ(pressed, " ?y");
}

TEST(Remote, CallsAfterEveryWaitBeforeTimePasses)
{
    TestDesk desk(ListOf({ItemOfTicks(Second / 10)}));
    Keys keys("");
    std::string calls;
    RemoteHooks hooks;
    hooks.beforeWaiting = [&] { calls += "before "; };
    hooks.afterWaiting = [&] {
        calls += "after ";
        EXPECT_NE(desk.navigator.CurrentStatus(), Status::Finished);
    };

    PlayByRemote(desk.desk, keys.Descriptor(), hooks);

    EXPECT_EQ(calls.rfind("before after ", 0), 0U) << calls;
    EXPECT_EQ(calls.substr(calls.size() - 13), "before after ");
}

TEST(Remote, CallsBeforeEveryWaitAfterTheCallbacks)
{
    TestDesk desk(LongPlayList());
    Keys keys(" q");
    std::vector<Status> statuses;
    RemoteHooks hooks;
    hooks.beforeWaiting = [&] { statuses.push_back(desk.navigator.CurrentStatus()); };

    PlayByRemote(desk.desk, keys.Descriptor(), hooks);

    EXPECT_EQ(statuses, (std::vector<Status>{Status::Playing, Status::Paused}));
}

TEST(Remote, ExplainsEveryKey)
{
    const std::string help = RemoteHelp();
    std::set<char> keys = {'q', '?'};
    for (const RemoteKey& key : RemoteKeys()) {
        EXPECT_TRUE(keys.insert(key.key).second) << key.key << " occurs twice";
        const std::string name = key.key == ' ' ? "space" : std::string(1, key.key);
        EXPECT_NE((" " + help).find(name + " " + key.help), std::string::npos) << key.help;
    }
    EXPECT_NE(help.find("? list the keys "), std::string::npos);
    EXPECT_NE(help.find("q or Ctrl-C quit\n"), std::string::npos);
}

/** A pseudo-terminal controlled by the test. */
class Terminal
{
public:
    Terminal() { EXPECT_EQ(openpty(&m_Test, &m_Program, nullptr, nullptr, nullptr), 0); }

    ~Terminal()
    {
        close(m_Test);
        close(m_Program);
    }

    Terminal(const Terminal&) = delete;
    Terminal& operator=(const Terminal&) = delete;

    int Descriptor() const { return m_Program; }

    termios Settings() const
    {
        termios settings = {};
        EXPECT_EQ(tcgetattr(m_Program, &settings), 0);
        return settings;
    }

    void Press(const std::string& keys) const
    {
        EXPECT_EQ(write(m_Test, keys.data(), keys.size()), static_cast<ssize_t>(keys.size()));
    }

    /** The output shown. */
    std::string Screen() const
    {
        fcntl(m_Test, F_SETFL, O_NONBLOCK);
        char shown[100];
        const ssize_t size = read(m_Test, shown, sizeof shown);
        return size > 0 ? std::string(shown, static_cast<std::size_t>(size)) : "";
    }

private:
    int m_Test = -1;
    int m_Program = -1;
};

bool SameSettings(const termios& left, const termios& right)
{
    return left.c_iflag == right.c_iflag && left.c_oflag == right.c_oflag &&
           left.c_cflag == right.c_cflag && left.c_lflag == right.c_lflag &&
           std::memcmp(left.c_cc, right.c_cc, sizeof left.c_cc) == 0;
}

/** Performs an action once playback has started. */
class AtStart : public bdmv::NavigatorListenerAdapter
{
public:
    explicit AtStart(std::function<void()> action) : m_Action(std::move(action)) {}
    void PlayStarted() override { m_Action(); }

private:
    std::function<void()> m_Action;
};

TEST(RemoteTerminal, DeliversSingleKeysWithoutEcho)
{
    TestDesk desk(LongPlayList());
    const Terminal terminal;
    const termios before = terminal.Settings();
    termios meanwhile = {};
    AtStart presser([&terminal, &meanwhile] {
        meanwhile = terminal.Settings();
        terminal.Press(" q");
    });
    desk.desk.Listeners().AddListener(&presser);

    PlayByRemote(desk.desk, terminal.Descriptor(), {});

    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Paused);
    EXPECT_EQ(meanwhile.c_lflag & (ICANON | ECHO), 0);
    EXPECT_EQ(terminal.Screen(), "");
    EXPECT_NE(before.c_lflag & (ICANON | ECHO), 0) << "the original settings differ";
    EXPECT_TRUE(SameSettings(terminal.Settings(), before));
    desk.desk.Listeners().RemoveListener(&presser);
}

TEST(RemoteTerminal, TreatsControlCAsAKeyThatQuits)
{
    TestDesk desk(LongPlayList());
    const Terminal terminal;
    const termios before = terminal.Settings();
    AtStart presser([&terminal] { terminal.Press({ControlC, ' ', 'q'}); });
    desk.desk.Listeners().AddListener(&presser);

    PlayByRemote(desk.desk, terminal.Descriptor(), {});

    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Playing) << "the key after it was not read";
    EXPECT_TRUE(SameSettings(terminal.Settings(), before));
    desk.desk.Listeners().RemoveListener(&presser);
}

TEST(RemoteTerminal, IsRestoredWhenASignalEndsTheProgram)
{
    const Terminal terminal;
    const termios before = terminal.Settings();
    for (const int signal : {SIGHUP, SIGINT, SIGQUIT, SIGTERM, SIGPIPE}) {
        EXPECT_EXIT(
            {
                TestDesk desk(LongPlayList());
                AtStart ender([signal] { kill(getpid(), signal); });
                desk.desk.Listeners().AddListener(&ender);
                PlayByRemote(desk.desk, terminal.Descriptor(), {});
            },
            testing::KilledBySignal(signal), "");
        EXPECT_TRUE(SameSettings(terminal.Settings(), before)) << signal;
    }
}

TEST(RemoteTerminal, RestoresSignalActions)
{
    struct sigaction ignore = {};
    ignore.sa_handler = SIG_IGN;
    struct sigaction before = {};
    sigaction(SIGHUP, &ignore, &before);
    TestDesk desk(LongPlayList());
    const Terminal terminal;
    AtStart presser([&terminal] {
        raise(SIGHUP);
        terminal.Press("q");
    });
    desk.desk.Listeners().AddListener(&presser);

    PlayByRemote(desk.desk, terminal.Descriptor(), {});

    struct sigaction after = {};
    sigaction(SIGHUP, &before, &after);
    EXPECT_EQ(after.sa_handler, SIG_IGN);
    sigaction(SIGTERM, nullptr, &after);
    EXPECT_EQ(after.sa_handler, SIG_DFL);
    desk.desk.Listeners().RemoveListener(&presser);
}

TEST(RemoteTerminal, IsRestoredWhenPlaybackEnds)
{
    TestDesk desk(ListOf({ItemOfTicks(Ticks(100))}));
    const Terminal terminal;
    const termios before = terminal.Settings();

    PlayByRemote(desk.desk, terminal.Descriptor(), {});

    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Finished);
    EXPECT_TRUE(SameSettings(terminal.Settings(), before));
}

TEST(RemoteTerminal, IsRestoredWhenAListenerThrows)
{
    TestDesk desk(LongPlayList());
    const Terminal terminal;
    const termios before = terminal.Settings();
    AtStart thrower([] { throw std::runtime_error("no"); });
    desk.desk.Listeners().AddListener(&thrower);

    EXPECT_THROW(PlayByRemote(desk.desk, terminal.Descriptor(), {}), std::runtime_error);

    EXPECT_TRUE(SameSettings(terminal.Settings(), before));
    desk.desk.Listeners().RemoveListener(&thrower);
}

} // namespace

} // namespace deskplayer
