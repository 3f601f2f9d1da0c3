// Counts instructions: runs each piece of work a thousand times while callgrind collects, then
// makes it write the count under the name of the work. scripts/instructions reads the counts.

#include <cstdio>
#include <utility>

#include <valgrind/callgrind.h>

#include "bdmvnavigator/navigatorevent.h"
#include "benchmarks.h"
#include "context.h"
#include "kevro_linux.h"
#include "navigatorkit/eventqueue.h"
#include "parkedthread.h"
#include "subjects.h"

namespace
{

constexpr int Rounds = 1000;

/** The first rounds resolve symbols and fill the caches of the heap; they are not counted. */
template <typename Work> void Count(const char* name, Work work)
{
    for (int round = 0; round < Rounds; ++round) {
        work();
    }
    CALLGRIND_TOGGLE_COLLECT;
    for (int round = 0; round < Rounds; ++round) {
        work();
    }
    CALLGRIND_TOGGLE_COLLECT;
    CALLGRIND_DUMP_STATS_AT(name);
}

template <typename Subject> void CountDelivery(const char* toOne, const char* toEight)
{
    Subject subject;
    int added = 0;
    for (const auto& [count, name] : {std::pair{1, toOne}, std::pair{8, toEight}}) {
        for (; added < count; ++added) {
            subject.Add(bench::Listeners()[added]);
        }
        Count(name, [&] { subject.PlayStarted(); });
    }
}

template <typename Event> void CountEvent(const char* name)
{
    bench::Context context;
    bdmv::INavigatorEvent::Listeners listeners;
    listeners.AddListener(&bench::Listeners()[0]);
    Count(name, [&] {
        bdmv::INavigatorEvent* const event = new Event(context);
        event->Dispatch(listeners);
        delete event;
    });
}

/** An event through a queue, on one thread. */
void CountQueue()
{
    bench::Context context;
    bdmv::INavigatorEvent::Listeners listeners;
    listeners.AddListener(&bench::Listeners()[0]);
    bdmv::EventQueue queue(2 * Rounds);
    const auto post = [&] { queue.Post<bdmv::PlayStartedEvent>(context); };
    const auto dispatch = [&] { queue.DispatchNext(listeners); };
    // A queue is busier than in its first minute: the counted events are not the most at once.
    for (int i = 0; i < 2 * Rounds; ++i) {
        post();
    }
    for (int i = 0; i < 2 * Rounds; ++i) {
        dispatch();
    }
    Count("queue/post", post);
    Count("queue/dispatch", dispatch);
}

} // namespace

int main()
{
    if (RUNNING_ON_VALGRIND == 0) {
        std::fputs("instructions: run this under callgrind, see scripts/instructions\n", stderr);
        return 2;
    }
    const bench::ParkedThread parked;
    KEVRO_Log_Configure("", nullptr, 0);
    CountDelivery<bench::Floor>("floor/1", "floor/8");
    CountDelivery<bench::Library>("delivery/1", "delivery/8");
    CountEvent<bdmv::PlayStartedEvent>("PlayStartedEvent");
    CountEvent<bdmv::CurrentTimePositionEvent>("CurrentTimePositionEvent");
    CountEvent<bdmv::PlayItemEvent>("PlayItemEvent");
    CountQueue();
    return 0;
}
