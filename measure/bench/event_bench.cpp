// Whole events to one listener, where the overhead over the delivery is largest.

#include <chrono>
#include <memory>
#include <string>

#include <benchmark/benchmark.h>

#include "bdmvnavigator/navigatorevent.h"
#include "benchmarks.h"
#include "context.h"
#include "logging.h"
#include "testkit/allocationcounter.h"
#include "testkit/operatornew.h"

namespace bench
{

namespace
{

using List = bdmv::INavigatorEvent::Listeners;

struct Stage {
    Stage() { listeners.AddListener(&Listeners()[0]); }

    Context context;
    List listeners;
};

Stage& TheStage()
{
    static Stage stage;
    return stage;
}

template <typename Event> void Whole(benchmark::State& state)
{
    Stage& stage = TheStage();
    for (auto _ : state) {
        bdmv::INavigatorEvent* event = new Event(stage.context);
        benchmark::DoNotOptimize(event);
        event->Dispatch(stage.listeners);
        delete event;
    }
}

template <typename Event> void Dispatch(benchmark::State& state)
{
    Stage& stage = TheStage();
    const std::unique_ptr<bdmv::INavigatorEvent> made(new Event(stage.context));
    bdmv::INavigatorEvent* event = made.get();
    const std::size_t before = bdmvtest::CountAllocations();
    for (auto _ : state) {
        benchmark::DoNotOptimize(event);
        event->Dispatch(stage.listeners);
    }
    // The total, not an average: one allocation in a million dispatches is one too many.
    state.counters[AllocationsCounter] = static_cast<double>(bdmvtest::CountAllocations() - before);
}

auto WithLog(void (*function)(benchmark::State&), std::chrono::microseconds sinkTime,
             std::size_t queueLines)
{
    return [=](benchmark::State& state) {
        const LoggingOn logging(sinkTime, queueLines);
        function(state);
    };
}

/** Registers the rows of an event; @p deliver does its work by hand, without a log line. */
template <typename Event>
void RegisterEvent(const std::string& name, void (*deliver)(bdmv::IPlaybackContext&, List&))
{
    const auto row = [&](const std::string& what, auto function) {
        benchmark::RegisterBenchmark(EventRow(name, what).c_str(), function);
    };
    row(Delivery, [deliver](benchmark::State& state) {
        Stage& stage = TheStage();
        for (auto _ : state) {
            deliver(stage.context, stage.listeners);
        }
    });
    row(DispatchOff, Dispatch<Event>);
    row(DispatchNull, WithLog(Dispatch<Event>, Null, 0));
    row(DispatchQueue, WithLog(Dispatch<Event>, Slow, QueueLines));
    row(WholeOff, Whole<Event>);
    row(WholeNull, WithLog(Whole<Event>, Null, 0));
    row(WholeQueue, WithLog(Whole<Event>, Slow, QueueLines));
}

void DeliverPlayStarted(bdmv::IPlaybackContext& /*context*/, List& listeners)
{
    bd::EventListenerList_FireParam0(listeners, &bdmv::INavigatorListener::PlayStarted);
}

void DeliverCurrentTimePosition(bdmv::IPlaybackContext& context, List& listeners)
{
    const bd::TimePosition position = context.GetCurrentTimePosition();
    bd::EventListenerList_FireParam1(listeners, &bdmv::INavigatorListener::CurrentTimePosition,
                                     position);
}

void DeliverPlayItem(bdmv::IPlaybackContext& context, List& listeners)
{
    const bd::PlayListIdDef playListId = context.GetPlayListId();
    const bd::PlayItemIdDef playItemId = context.GetPlayItemId();
    bd::VideoFormatType videoFormat = bd::VideoFormatTypeNoInfo;
    bd::VideoAspectRatioType aspectRatio = bd::VideoAspectRatioTypeNoInfo;
    context.GetVideoAttributes(videoFormat, aspectRatio);
    bd::EventListenerList_FireParam4(listeners, &bdmv::INavigatorListener::PlayItem, playListId,
                                     playItemId, videoFormat, aspectRatio);
    bool secondaryVideo = false;
    bool secondaryAudio = false;
    bool previousVideo = false;
    bool previousAudio = false;
    context.IsAsyncPipInCurrentPlayItem(secondaryVideo, secondaryAudio, previousVideo,
                                        previousAudio);
}

} // namespace

void RegisterEvents()
{
    RegisterEvent<bdmv::PlayStartedEvent>("PlayStartedEvent", DeliverPlayStarted);
    RegisterEvent<bdmv::CurrentTimePositionEvent>("CurrentTimePositionEvent",
                                                  DeliverCurrentTimePosition);
    RegisterEvent<bdmv::PlayItemEvent>("PlayItemEvent", DeliverPlayItem);
}

} // namespace bench
