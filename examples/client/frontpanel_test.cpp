// Plays the sample disc for the front panel and compares what it shows with what is playing. The
// disc's film ends with a still of five seconds, after which an end card plays for a second.

#include <cstring>
#include <iostream>

#include "deskplayer/desk.h"
#include "deskplayer/session.h"
#include "frontpanel.h"
#include "testkit/fakeplatform.h" // the platform interface

namespace
{

/** What the viewer does next, the callback that results, and what the panel then shows. */
struct Moment {
    const char* session;
    const char* callback;
    const char* text;
};

const Moment Moments[] = {{"play\nafter 10s expect PlayStarted\n", "PlayStarted", "PLAY"},
                          {"pause\nexpect Paused\n", "Paused", "PAUSE"},
                          {"after 1h continue\nexpect Continued\n", "Continued", "PLAY"},
                          {"after 02:44 expect StillOn\n", "StillOn", "STILL"},
                          {"after 4.5s expect StillOff\n", "StillOff", "PLAY"},
                          {"stop\nexpect Stopped\n", "Stopped", "STOP"}};

} // namespace

int main(int argc, char** argv)
{
    deskplayer::Desk desk(argc > 1 ? argv[1] : ".");
    FrontPanel panel;
    desk.Listeners().AddListener(&panel);
    deskplayer::SessionOptions options;
    options.playOn = false; // look at the panel after the last step
    for (const Moment& moment : Moments) {
        const auto report =
            deskplayer::PlaySession(desk, deskplayer::Session(moment.session), options);
        if (!report.unmet.empty() || std::strcmp(panel.Text(), moment.text) != 0) {
            std::cerr << "after " << moment.callback << ": expected " << moment.text
                      << ", but the panel shows " << panel.Text() << '\n';
            for (const std::string& line : report.unmet) {
                std::cerr << line << '\n';
            }
            return 1;
        }
    }
    return 0;
}
