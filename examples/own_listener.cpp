// A client's own listener on the desk: a front panel that shows what playback does, driven by a
// real disc's play list and a session of its own. Compile it against bdmvnavigator::deskplayer.

#include <iostream>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "disc/disc.h"
#include "navigator/eventdelivery.h"
#include "navigator/simulatednavigator.h"
#include "navigator/virtualclock.h"
#include "session/session.h"

namespace
{

class FrontPanel : public bdmv::NavigatorListenerAdapter
{
public:
    void PlayStarted() override { std::cout << "> PLAY\n"; }
    void Paused() override { std::cout << "> PAUSE\n"; }
    void Continued(bd::PlayDirectionDef, bd::PlaySpeedDef) override { std::cout << "> PLAY\n"; }
    void Finished(FinishedReason) override { std::cout << "> STOP\n"; }

    void ChapterNumber(const bd::ChapterNumberDef& chapter) override
    {
        std::cout << "> CHAPTER " << chapter << '\n';
    }
};

} // namespace

int main(int argc, char** argv)
{
    if (argc != 2) {
        std::cerr << "usage: own_listener DISC\n";
        return 2;
    }
    try {
        const deskplayer::Disc disc(argv[1]);
        deskplayer::LongestPlayList longest = disc.FindLongestPlayList();

        deskplayer::VirtualClock clock;
        deskplayer::EventDelivery delivery;
        deskplayer::SimulatedNavigator navigator(
            deskplayer::LoadPlayList(disc, longest.number, std::move(longest.playList)), clock,
            delivery);
        deskplayer::ResumeDataKeeper keeper;
        deskplayer::Desk desk{navigator, keeper};

        FrontPanel frontPanel;
        delivery.Listeners().AddListener(&frontPanel);

        const char* const session = "play\n"
                                    "at 00:20 pause\n"
                                    "after 5s continue\n"
                                    "after 10s chapter next\n"
                                    "at 05:00 still off\n";
        deskplayer::PlaySession(
            deskplayer::ParseScript(session, "session", deskplayer::CommandSyntaxes()), desk, clock,
            {});
    } catch (const deskplayer::DiscError& error) {
        std::cerr << "own_listener: " << error.what() << '\n';
        return 3;
    }
    return 0;
}
