// The middleware of a player as a shared library.
#include "bdmvnavigator/navigatorevent.h"
#include "bdmvnavigator/navigatorlisteneradapter.h"

struct Listener : bdmv::NavigatorListenerAdapter {
    int paused = 0;
    void Paused() override { ++paused; }
};

int Pauses()
{
    bdmv::INavigatorEvent::Listeners listeners;
    Listener listener;
    listeners.AddListener(&listener);
    bd::EventListenerList_FireParam0(listeners, &bdmv::INavigatorListener::Paused);
    return listener.paused;
}

// Makes the events part of the middleware.
void DeliverPause(bdmv::IPlaybackContext& context, bdmv::INavigatorEvent::Listeners& listeners)
{
    bdmv::PausedEvent(context).Dispatch(listeners);
}
