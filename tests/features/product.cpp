// A program without run-time type information: it implements a listener and a context, dispatches
// an event of the library, and catches an exception of the library.

#include <cstdio>
#include <memory>
#include <string>
#include <system_error>

#include "bdmvnavigator/navigatorevent.h"
#include "testkit/fakeplatform.h"
#include "testkit/recordinglistener.h"
#include "testkit/scriptableplaybackcontext.h"

#if defined(__cpp_rtti)
#error "compile this with -fno-rtti"
#endif

int main()
{
    bdmvtest::Journal journal;
    bdmvtest::FakePlatform platform(&journal);
    platform.DisableLog();
    bdmvtest::ScriptablePlaybackContext context;
    context.angleNumber = 2;
    bdmvtest::RecordingListener listener(journal, "listener");
    bd::EventListenerList<bdmv::INavigatorListener> listeners;
    listeners.AddListener(&listener);

    std::unique_ptr<bdmv::INavigatorEvent> event(new bdmv::AngleInfoEvent(context));
    event->Dispatch(listeners);
    const std::string delivered = journal.Take();

    listener.onCallback = [&](const std::string&) { listeners.RemoveListener(&listener); };
    bool refused = false;
    event.reset(new bdmv::PausedEvent(context));
    try {
        event->Dispatch(listeners);
    } catch (const std::system_error& error) {
        refused = error.code() == std::errc::resource_deadlock_would_occur;
    }

    std::printf("delivered %s, refused %d\n", delivered.c_str(), refused);
    return delivered.find("listener.AngleInfo(2)\n") != std::string::npos && refused ? 0 : 1;
}
