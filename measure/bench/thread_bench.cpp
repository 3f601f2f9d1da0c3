// Several threads that fire concurrently, each at eight listeners.

#include <array>
#include <chrono>
#include <fstream>
#include <memory>
#include <string>

#include <benchmark/benchmark.h>

#include "benchmarks.h"
#include "subjects.h"

namespace bench
{

namespace
{

constexpr std::size_t ListenersEach = 8;
constexpr std::size_t MostThreads = 4;

/** A subject with its listeners, on cache lines that no other subject shares. */
template <typename Subject> struct alignas(128) SubjectWithListeners {
    SubjectWithListeners()
    {
        for (CountingListener& listener : listeners) {
            subject.Add(listener);
        }
    }

    std::array<CountingListener, ListenersEach> listeners;
    Subject subject;
};

/** The time the calling thread has been ready to run but not running, in seconds. */
double SecondsWaited()
{
    std::ifstream file("/proc/thread-self/schedstat");
    double running = 0;
    double waiting = 0;
    file >> running >> waiting;
    return waiting / 1e9;
}

template <typename Subject> void RegisterThreads(const std::string& name)
{
    using Subjects = std::array<SubjectWithListeners<Subject>, MostThreads>;
    const auto subjects = std::make_shared<Subjects>();
    for (const int threads : ThreadCounts) {
        for (const bool own : {false, true}) {
            const auto fire = [subjects, own](benchmark::State& state) {
                Subject& subject =
                    (*subjects)[own ? static_cast<std::size_t>(state.thread_index()) : 0].subject;
                const double waited = SecondsWaited();
                const auto begun = std::chrono::steady_clock::now();
                for (auto _ : state) {
                    subject.PlayStarted();
                }
                const std::chrono::duration<double> passed =
                    std::chrono::steady_clock::now() - begun;
                state.counters[WaitedCounter] = benchmark::Counter(
                    (SecondsWaited() - waited) / passed.count(), benchmark::Counter::kAvgThreads);
            };
            benchmark::RegisterBenchmark(ThreadRow(own ? OwnLists : OneList, name, threads).c_str(),
                                         fire)
                ->Threads(threads)
                ->UseRealTime();
        }
    }
}

} // namespace

void RegisterThreads()
{
    RegisterThreads<Floor>(FloorName);
    RegisterThreads<Library>(LibraryName);
}

} // namespace bench
