// Clients that join at every callback of sessions of the desk player.

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>
#include <string>
#include <utility>

#include "disc/disc.h"
#include "joiningclient.h"
#include "navigator/deskparts.h"
#include "session/commands.h"
#include "session/session.h"
#include "testkit/fakeplatform.h"

namespace
{

/** Makes a client join after every callback. Register it after the relay. */
class Usher : public bdmv::CallbackListener
{
public:
    explicit Usher(bdmvtest::ClientsOfEveryPrefix& clients) : m_rClients(clients) {}

protected:
    void OnCallback(const bdmv::Callback&) override { m_rClients.JoinLate(); }

private:
    bdmvtest::ClientsOfEveryPrefix& m_rClients;
};

const deskplayer::LoadedPlayList& SamplePlayList()
{
    static const deskplayer::LoadedPlayList playList = [] {
        const deskplayer::Disc disc(BDMVNAVIGATOR_SAMPLE_DISC);
        deskplayer::LongestPlayList longest = disc.FindLongestPlayList();
        return deskplayer::LoadPlayList(disc, longest.number, std::move(longest.playList));
    }();
    return playList;
}

/** @return the number of callbacks */
std::size_t PlayAndJoin(const std::string& session)
{
    deskplayer::DeskParts desk(SamplePlayList());
    bdmv::ListenerRelay relay;
    bdmvtest::ClientsOfEveryPrefix clients(relay);
    Usher usher(clients);
    desk.Listeners().AddListener(&relay);
    desk.Listeners().AddListener(&usher);
    deskplayer::PlaySession(
        deskplayer::ParseScript(session, "session", deskplayer::CommandSyntaxes()), desk, {});
    clients.ExpectTheSame();
    desk.Listeners().RemoveListener(&usher);
    desk.Listeners().RemoveListener(&relay);
    return clients.Count();
}

std::string ReadFile(const std::filesystem::path& path)
{
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
}

TEST(JoiningSession, EqualsJoiningAtTheStartForEveryPrefixOfTheSampleSessions)
{
    int sessions = 0;
    for (const auto& entry : std::filesystem::directory_iterator(BDMVNAVIGATOR_SESSIONS)) {
        SCOPED_TRACE(entry.path());
        EXPECT_GT(PlayAndJoin(ReadFile(entry.path())), 100U);
        ++sessions;
    }
    EXPECT_GE(sessions, 2);
}

/** A session of any commands with any times and small numbers. */
std::string RandomSession(unsigned seed)
{
    std::mt19937 random(seed);
    const std::vector<deskplayer::Command>& commands = deskplayer::Commands();
    std::string session = "play\n";
    for (int line = 0; line < 30; ++line) {
        std::string command(commands[random() % commands.size()].syntax.pattern);
        for (const std::string placeholder : {"NUMBER", "TIME"}) {
            for (std::size_t at; (at = command.find(placeholder)) != std::string::npos;) {
                command.replace(at, placeholder.size(), std::to_string(random() % 5));
            }
        }
        session += "after " + std::to_string(random() % 5000) + "ms " + command + "\n";
    }
    return session + "after 1s wake\nresume\ncontinue\nforward\nstill off\nrepeat off\n";
}

TEST(JoiningSession, EqualsJoiningAtTheStartForEveryPrefixOfRandomSessions)
{
    for (unsigned seed = 0; seed < 10; ++seed) {
        const std::string session = RandomSession(seed);
        SCOPED_TRACE(session);
        EXPECT_GT(PlayAndJoin(session), 0U);
    }
}

} // namespace
