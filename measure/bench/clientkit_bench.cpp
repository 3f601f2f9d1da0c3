// What a delivery costs through the listeners of the client kit, each registered alone in a list.

#include <chrono>
#include <cstdint>
#include <memory>

#include <benchmark/benchmark.h>

#include "bdmvnavigator/inavigatorevent.h"
#include "benchmarks.h"
#include "clientkit/blackbox.h"
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

std::uint64_t TicksAtOnce()
{
    static std::uint64_t ticks = 0;
    return ++ticks;
}

std::uint64_t TicksOfTheSystem()
{
    const std::chrono::nanoseconds now = std::chrono::steady_clock::now().time_since_epoch();
    return static_cast<std::uint64_t>(now.count()) * 9 / 200000;
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
    RegisterListener(BoxName, std::make_shared<bdmv::BlackBox>(1000, TicksAtOnce));
    RegisterListener(BoxWithClockName, std::make_shared<bdmv::BlackBox>(1000, TicksOfTheSystem));
}

} // namespace bench
