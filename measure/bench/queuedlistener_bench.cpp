// What it costs the delivering thread when a client is behind a QueuedListener or a CallbackWatch,
// compared with the client itself in the list.

#include <benchmark/benchmark.h>

#include <chrono>
#include <condition_variable>
#include <cstdio>
#include <ctime>
#include <mutex>
#include <string>
#include <thread>

#include "bd/eventlistenerlist.h"
#include "clientkit/callbackwatch.h"
#include "clientkit/queuedlistener.h"
#include "kevro_linux.h"
#include "listener.h"
#include "parkedthread.h"
#include "report.h"

namespace
{

using bdmv::INavigatorListener;

struct Shape {
    const char* name;
    void (*deliver)(bd::EventListenerList<INavigatorListener>& list);
};

constexpr Shape Shapes[] = {
    {"no arguments",
     [](bd::EventListenerList<INavigatorListener>& list) {
         bd::EventListenerList_FireParam0(list, &INavigatorListener::PlayStarted);
     }},
    {"a position",
     [](bd::EventListenerList<INavigatorListener>& list) {
         bd::EventListenerList_FireParam1(list, &INavigatorListener::CurrentTimePosition,
                                          bench::Position);
     }},
    {"AudioInfoType",
     [](bd::EventListenerList<INavigatorListener>& list) {
         bd::EventListenerList_FireParam2(list, &INavigatorListener::AudioInfoChanged, true,
                                          bench::AudioInfo);
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
    bd::EventListenerList<INavigatorListener> m_List;
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

void DeliverPlain(benchmark::State& state, const Shape& shape)
{
    DeliverToOne(state, bench::Listeners()[0], shape);
}

void DeliverWatched(benchmark::State& state, const Shape& shape)
{
    bdmv::CallbackWatch watch(bench::Listeners()[0], "client", std::chrono::hours(1));
    DeliverToOne(state, watch, shape);
}

void DeliverAtOnce(benchmark::State& state, const Shape& shape)
{
    bdmv::QueuedListener queued(bench::Listeners()[0]);
    DeliverToOne(state, queued, shape);
}

void DeliverSleeping(benchmark::State& state, const Shape& shape)
{
    SleepingClient client;
    bdmv::QueuedListener queued(client);
    DeliverToOne(state, queued, shape);
}

void DeliverFull(benchmark::State& state, const Shape& shape)
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
void DeliverRoom(benchmark::State& state, const Shape& shape)
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
    bdmv::QueuedListener queued(bench::Listeners()[0]);
    List list(queued);
    for (auto _ : state) {
        WaitUntilIdle(queued);
        std::this_thread::sleep_for(std::chrono::microseconds(50));
        const double begin = ThreadSeconds();
        list.Deliver(shape);
        state.SetIterationTime(ThreadSeconds() - begin);
    }
}

struct Subject {
    const char* name;
    void (*run)(benchmark::State& state, const Shape& shape);
    bool measuresItself; ///< in processor time of the thread, as the benchmark does for the others
};

constexpr Subject Plain = {"plain listener", DeliverPlain, false};
constexpr Subject Subjects[] = {
    Plain,
    {"CallbackWatch", DeliverWatched, false},
    {"QueuedListener, client busy, places free", DeliverRoom, true},
    {"QueuedListener, client busy, all places taken", DeliverFull, false},
    {"QueuedListener, client sleeps 100 ms each time", DeliverSleeping, false},
    {"QueuedListener, client returns at once", DeliverAtOnce, false},
    {"QueuedListener, thread blocked and woken", DeliverWaking, true},
};

std::string RowOf(const Subject& subject, const Shape& shape)
{
    return std::string(subject.name) + "/" + shape.name;
}

void Register(const Subject& subject, const Shape& shape)
{
    benchmark::internal::Benchmark* const row = benchmark::RegisterBenchmark(
        RowOf(subject, shape).c_str(),
        [subject, shape](benchmark::State& state) { subject.run(state, shape); });
    if (subject.measuresItself) {
        row->UseManualTime();
    }
}

double TimeOf(const bench::Report& report, const Subject& subject, const Shape& shape)
{
    const bench::Row row = report[RowOf(subject, shape)];
    return subject.measuresItself ? row.wall : row.cpu;
}

void PrintTable(const bench::Report& report)
{
    std::printf("\nDelivery to one client: ns, × plain listener\n  %-48s", "");
    for (const Shape& shape : Shapes) {
        std::printf("%20s", shape.name);
    }
    std::printf("\n");
    for (const Subject& subject : Subjects) {
        std::printf("  %-48s", subject.name);
        for (const Shape& shape : Shapes) {
            const double time = TimeOf(report, subject, shape);
            bench::PrintNumber(12, 1, time);
            bench::PrintNumber(8, 2, time / TimeOf(report, Plain, shape));
        }
        std::printf("\n");
    }
}

} // namespace

int main(int argc, char** argv)
{
    const bench::ParkedThread parked;
    KEVRO_Log_Configure("", nullptr, 0);
    for (const Subject& subject : Subjects) {
        for (const Shape& shape : Shapes) {
            Register(subject, shape);
        }
    }
    bench::Report report;
    if (!bench::RunBenchmarks(report, argc, argv)) {
        return 2;
    }
    PrintTable(report);
    return 0;
}
