// What a delivery costs through a QueuedListener, whatever its client does, and a CallbackWatch,
// each registered alone in a list.

#include <chrono>
#include <condition_variable>
#include <ctime>
#include <mutex>
#include <thread>

#include <benchmark/benchmark.h>

#include "bdmvnavigator/inavigatorevent.h"
#include "benchmarks.h"
#include "clientkit/callbackwatch.h"
#include "clientkit/queuedlistener.h"
#include "listener.h"

namespace bench
{

namespace
{

using bdmv::INavigatorListener;
typedef bdmv::INavigatorEvent::Listeners ListenerList;

struct Shape {
    const char* callback;
    void (*deliver)(ListenerList& list);
};

constexpr Shape Shapes[] = {
    {NoArguments,
     [](ListenerList& list) {
         bd::EventListenerList_FireParam0(list, &INavigatorListener::PlayStarted);
     }},
    {ByReference,
     [](ListenerList& list) {
         bd::EventListenerList_FireParam1(list, &INavigatorListener::CurrentTimePosition, Position);
     }},
    {ByValue,
     [](ListenerList& list) {
         bd::EventListenerList_FireParam2(list, &INavigatorListener::AudioInfoChanged, true,
                                          AudioInfo);
     }},
};

/** A list with one listener. */
class List
{
public:
    explicit List(INavigatorListener& listener) : m_rListener(listener)
    {
        m_List.AddListener(&listener);
    }

    ~List() { m_List.RemoveListener(&m_rListener); }

    List(const List&) = delete;
    List& operator=(const List&) = delete;

    void Deliver(const Shape& shape) { shape.deliver(m_List); }

private:
    ListenerList m_List;
    INavigatorListener& m_rListener;
};

/** A client that stays in its callbacks while it is held. */
class HeldClient : public bdmv::CallbackListener
{
public:
    void Hold()
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        m_Held = true;
        m_Arrived = false;
    }

    void WaitForArrival()
    {
        std::unique_lock<std::mutex> lock(m_Mutex);
        m_Changed.wait(lock, [this] { return m_Arrived; });
    }

    void Release()
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        m_Held = false;
        m_Changed.notify_all();
    }

private:
    void OnCallback(const bdmv::Callback& /*callback*/) override
    {
        std::unique_lock<std::mutex> lock(m_Mutex);
        m_Arrived = true;
        m_Changed.notify_all();
        m_Changed.wait(lock, [this] { return !m_Held; });
    }

    std::mutex m_Mutex;
    std::condition_variable m_Changed;
    bool m_Held = false;
    bool m_Arrived = false;
};

class SleepingClient : public bdmv::CallbackListener
{
    void OnCallback(const bdmv::Callback& /*callback*/) override
    {
        std::this_thread::sleep_for(std::chrono::milliseconds(100));
    }
};

void WaitUntilIdle(const bdmv::QueuedListener& queued)
{
    for (;;) {
        const bdmv::QueuedListener::Counters counters = queued.GetCounters();
        if (counters.received == counters.delivered + counters.merged + counters.lost) {
            return;
        }
        std::this_thread::yield();
    }
}

void DeliverToOne(benchmark::State& state, INavigatorListener& listener, const Shape& shape)
{
    List list(listener);
    for (auto _ : state) {
        list.Deliver(shape);
    }
}

void DeliverWatched(benchmark::State& state, const Shape& shape)
{
    bdmv::CallbackWatch watch(Listeners()[0], "client", std::chrono::hours(1));
    DeliverToOne(state, watch, shape);
}

void DeliverAtOnce(benchmark::State& state, const Shape& shape)
{
    bdmv::QueuedListener queued(Listeners()[0]);
    DeliverToOne(state, queued, shape);
}

void DeliverSleeping(benchmark::State& state, const Shape& shape)
{
    SleepingClient client;
    bdmv::QueuedListener queued(client);
    DeliverToOne(state, queued, shape);
}

void DeliverTaken(benchmark::State& state, const Shape& shape)
{
    HeldClient client;
    bdmv::QueuedListener queued(client);
    client.Hold();
    queued.Stopped();
    client.WaitForArrival();
    for (std::size_t i = 0; i < bdmv::QueuedListener::Options().places; ++i) {
        queued.Stopped();
    }
    DeliverToOne(state, queued, shape);
    client.Release();
}

/** Processor time of the calling thread, in seconds. Reading it takes a system call. */
double ThreadSeconds()
{
    timespec time = {};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_nsec) / 1e9;
}

/** Fills the places, then waits until the client has emptied them, outside the measured time. */
void DeliverFree(benchmark::State& state, const Shape& shape)
{
    constexpr int Batch = 256;
    HeldClient client;
    bdmv::QueuedListener queued(client);
    List list(queued);
    while (state.KeepRunningBatch(Batch)) {
        client.Hold();
        queued.Stopped();
        client.WaitForArrival();
        const double begin = ThreadSeconds();
        for (int i = 0; i < Batch; ++i) {
            list.Deliver(shape);
        }
        state.SetIterationTime(ThreadSeconds() - begin);
        client.Release();
        WaitUntilIdle(queued);
    }
}

/** Delivers when the client's thread is blocked, as between most callbacks of a real session. */
void DeliverWaking(benchmark::State& state, const Shape& shape)
{
    bdmv::QueuedListener queued(Listeners()[0]);
    List list(queued);
    for (auto _ : state) {
        WaitUntilIdle(queued);
        std::this_thread::sleep_for(std::chrono::microseconds(50));
        const double begin = ThreadSeconds();
        list.Deliver(shape);
        state.SetIterationTime(ThreadSeconds() - begin);
    }
}

typedef void (*Run)(benchmark::State& state, const Shape& shape);

/** A row for each shape. */
void Register(const char* name, Run run)
{
    for (const Shape& shape : Shapes) {
        benchmark::RegisterBenchmark(ClientKitRow(shape.callback, name).c_str(),
                                     [run, &shape](benchmark::State& state) { run(state, shape); });
    }
}

/** The same for a benchmark that measures the processor time itself. */
void RegisterManual(const char* name, Run run)
{
    for (const Shape& shape : Shapes) {
        benchmark::RegisterBenchmark(ClientKitRow(shape.callback, name).c_str(),
                                     [run, &shape](benchmark::State& state) { run(state, shape); })
            ->UseManualTime();
    }
}

} // namespace

void RegisterQueuedListener()
{
    Register(WatchName, DeliverWatched);
    RegisterManual(QueueFreeName, DeliverFree);
    Register(QueueTakenName, DeliverTaken);
    Register(QueueSleepingName, DeliverSleeping);
    Register(QueueAtOnceName, DeliverAtOnce);
    RegisterManual(QueueWakingName, DeliverWaking);
}

} // namespace bench
