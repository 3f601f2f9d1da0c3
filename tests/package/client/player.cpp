// A client that uses the library and the Linux port. It is valid C++11 to C++23.
#include "bd/logging.h"
#include "bdmvnavigator/inavigatorevent.h"
#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "kevro_linux.h"

struct FrontPanel : bdmv::NavigatorListenerAdapter {
    int pauses = 0;
    void Paused() override { ++pauses; }
};

int main()
{
    char message[200];
    const bool isConfigured = KEVRO_Log_Configure("Test=Info", message, sizeof message);
    bdmv::INavigatorEvent::Listeners listeners;
    FrontPanel panel;
    listeners.AddListener(&panel);
    bd::EventListenerList_FireParam0(listeners, &bdmv::INavigatorListener::Paused);
    listeners.RemoveListener(&panel);
    bd::VargLogger(bd::CompIdTest, KEVRO_Log_LevelInfo, 0).Log("paused %d", panel.pauses);
    return isConfigured && panel.pauses == 1 ? 0 : 1;
}
