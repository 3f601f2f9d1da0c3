// bdmv-deskplayer: plays a play list of a disc without its streams and prints what a navigator's
// listeners are told.

#include <CLI/CLI.hpp>

#include <array>
#include <cstdio>
#include <iostream>
#include <optional>
#include <string>

#include "disc/disc.h"
#include "kevro_linux.h"
#include "navigator/eventdelivery.h"
#include "navigator/simulatednavigator.h"
#include "navigator/virtualclock.h"
#include "output/consolelistener.h"
#include "session/builtinsession.h"

namespace
{

// Exit statuses.
constexpr int ExitOk = 0;
constexpr int ExitOutput = 1;
constexpr int ExitUsage = 2;
constexpr int ExitDisc = 3;

struct Options {
    std::string disc;
    std::optional<std::uint32_t> playList;
    std::optional<std::string> log;
};

void Complain(const std::string& message)
{
    std::cerr << "bdmv-deskplayer: " << message << '\n';
}

deskplayer::LoadedPlayList Load(const Options& options)
{
    const deskplayer::Disc disc(options.disc);
    if (options.playList) {
        return deskplayer::LoadPlayList(disc, *options.playList,
                                        disc.ReadPlayList(*options.playList));
    }
    deskplayer::LongestPlayList longest = disc.FindLongestPlayList();
    for (const std::string& line : longest.unreadable) {
        Complain("left out: " + line);
    }
    return deskplayer::LoadPlayList(disc, longest.number, std::move(longest.playList));
}

void Play(deskplayer::LoadedPlayList playList)
{
    const std::uint64_t duration = playList.timeLine.duration;
    deskplayer::VirtualClock clock;
    deskplayer::ConsoleListener console(std::cout, clock);
    deskplayer::EventDelivery delivery;
    deskplayer::SimulatedNavigator navigator(std::move(playList), clock, delivery);
    delivery.Listeners().AddListener(&console);
    deskplayer::PlayBuiltInSession(navigator, duration);
}

} // namespace

int main(int argc, char** argv)
{
    Options options;
    CLI::App app("Plays a play list of a Blu-ray disc without its streams, on a virtual clock, and "
                 "prints every callback that a listener of the navigator gets: the time, the "
                 "callback, its arguments.");
    app.add_option("DISC", options.disc, "folder that holds BDMV/, or that folder itself")
        ->required();
    app.add_option("--playlist", options.playList,
                   "number of the play list; the longest one when it is not given")
        ->check(CLI::Range(0, 99999));
    app.add_option("--log", options.log,
                   "log lines to write to standard error, such as BdmvNavigator=Event");
    app.footer(
        "Exit status: 0 played to the end, 1 the output could not be written, 2 wrong usage,\n"
        "3 the disc cannot be read.");
    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        return app.exit(error) == 0 ? ExitOk : ExitUsage;
    }
    std::array<char, 300> message{};
    if (options.log && !KEVRO_Log_Configure(options.log->c_str(), message.data(), message.size())) {
        Complain(std::string("--log: ") + message.data());
        return ExitUsage;
    }

    try {
        Play(Load(options));
    } catch (const deskplayer::DiscError& error) {
        Complain(error.what());
        return ExitDisc;
    }
    if (!std::cout.flush()) {
        Complain("standard output could not be written");
        return ExitOutput;
    }
    return ExitOk;
}
