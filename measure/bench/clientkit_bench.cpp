// What a delivery costs through the listeners of the client kit, each registered alone in a list.

#include <memory>

#include <benchmark/benchmark.h>

#include "bdmvnavigator/inavigatorevent.h"
#include "benchmarks.h"
#include "clientkit/listenerrelay.h"
#include "clientkit/playbackstatus.h"
#include "listener.h"

namespace bench
{

namespace
{

/** A list with one listener. */
struct Registered {
    explicit Registered(std::shared_ptr<bdmv::INavigatorListener> theListener)
        : listener(std::move(theListener))
    {
        list.AddListener(listener.get());
    }

    std::shared_ptr<bdmv::INavigatorListener> listener;
    bdmv::INavigatorEvent::Listeners list;
};

void RegisterListener(const char* name, std::shared_ptr<bdmv::INavigatorListener> listener)
{
    const auto registered = std::make_shared<Registered>(std::move(listener));
    const auto row = [&](const char* callback, auto deliver) {
        benchmark::RegisterBenchmark(ClientKitRow(callback, name).c_str(),
                                     [registered, deliver](benchmark::State& state) {
                                         for (auto _ : state) {
                                             deliver(registered->list);
                                         }
                                     });
    };
    typedef bdmv::INavigatorEvent::Listeners List;
    row(NoArguments, [](List& list) {
        bd::EventListenerList_FireParam0(list, &bdmv::INavigatorListener::PlayStarted);
    });
    row(ByReference, [](List& list) {
        bd::EventListenerList_FireParam1(list, &bdmv::INavigatorListener::CurrentTimePosition,
                                         Position);
    });
    row(ByValue, [](List& list) {
        bd::EventListenerList_FireParam2(list, &bdmv::INavigatorListener::AudioInfoChanged, true,
                                         AudioInfo);
    });
}

} // namespace

void RegisterClientKit()
{
    CountingListener& client = Listeners()[0];
    const auto relay = std::make_shared<bdmv::ListenerRelay>();
    relay->Join(client);

    RegisterListener(PlainName, {std::shared_ptr<void>(), &client});
    RegisterListener(StatusName, std::make_shared<bdmv::StatusListener>());
    RegisterListener(RelayName, relay);
}

} // namespace bench
