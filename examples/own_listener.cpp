// A client's listener on the desk player: a front panel that shows the state of playback, driven by
// a disc's play list and a session. Link it with bdmvnavigator::deskplayer.

#include <iostream>
#include <string>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "deskplayer/desk.h"
#include "deskplayer/session.h"

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

} // namespace

int main(int argc, char** argv)
{
    if (argc != 2 && argc != 3) {
        std::cerr << "usage: own_listener DISC [SESSION]\n";
        return 2;
    }
    try {
        deskplayer::Desk desk(argv[1]);
        const auto session =
            argc == 3 ? deskplayer::ReadSessionFile(argv[2]) : deskplayer::Session(Evening);

        FrontPanel frontPanel;
        desk.Listeners().AddListener(&frontPanel);
        const deskplayer::SessionReport report = deskplayer::PlaySession(desk, session);
        desk.Listeners().RemoveListener(&frontPanel);
        for (const std::string& line : report.unmet) {
            std::cerr << "own_listener: " << line << '\n';
        }
        return report.unmet.empty() ? 0 : 4;
    } catch (const deskplayer::DiscError& error) {
        std::cerr << "own_listener: " << error.what() << '\n';
        return 3;
    } catch (const deskplayer::SessionError& error) {
        std::cerr << "own_listener: " << error.what() << '\n';
        return 2;
    }
}
