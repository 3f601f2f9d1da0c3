// A client's listener on the desk player: a front panel that shows the state of playback, driven by
// a disc's play list and a session. Link it with bdmvnavigator::deskplayer.

#include <fstream>
#include <iostream>
#include <iterator>
#include <string>
#include <utility>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "disc/disc.h"
#include "navigator/desk.h"
#include "session/session.h"

namespace
{

class FrontPanel : public bdmv::NavigatorListenerAdapter
{
public:
    void PlayStarted() override { std::cout << "> PLAY\n"; }
    void Paused() override { std::cout << "> PAUSE\n"; }
    void Continued(bd::PlayDirectionDef, bd::PlaySpeedDef) override { std::cout << "> PLAY\n"; }
    void SystemSuspended(const void*, bd::UInt32) override { std::cout << "> GOOD NIGHT\n"; }
    void SystemResumed(bool playing) override { std::cout << (playing ? "> PLAY\n" : "> PAUSE\n"); }
    void SystemResumeFailed() override { std::cout << "> STOP\n"; }
    void Finished(FinishedReason) override { std::cout << "> STOP\n"; }

    void ChapterNumber(const bd::ChapterNumberDef& chapter) override
    {
        std::cout << "> CHAPTER " << chapter << '\n';
    }
};

const char* const Evening = "play\n"
                            "at 00:20 pause\n"
                            "after 5s continue\n"
                            "after 10s chapter next\n"
                            "at 05:00 still off\n";

std::string ReadFile(const char* fileName)
{
    std::ifstream file(fileName, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
}

} // namespace

int main(int argc, char** argv)
{
    if (argc != 2 && argc != 3) {
        std::cerr << "usage: own_listener DISC [SESSION]\n";
        return 2;
    }
    try {
        const std::string session = argc == 3 ? ReadFile(argv[2]) : Evening;
        const deskplayer::Disc disc(argv[1]);
        deskplayer::LongestPlayList longest = disc.FindLongestPlayList();
        deskplayer::Desk desk(
            deskplayer::LoadPlayList(disc, longest.number, std::move(longest.playList)));

        FrontPanel frontPanel;
        desk.Listeners().AddListener(&frontPanel);
        deskplayer::PlaySession(
            deskplayer::ParseScript(session, "session", deskplayer::CommandSyntaxes()), desk, {});
        desk.Listeners().RemoveListener(&frontPanel);
    } catch (const deskplayer::DiscError& error) {
        std::cerr << "own_listener: " << error.what() << '\n';
        return 3;
    } catch (const deskplayer::ScriptError& error) {
        std::cerr << "own_listener: " << error.what() << '\n';
        return 2;
    }
    return 0;
}
