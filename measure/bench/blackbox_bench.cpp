// What recording callbacks in a black box costs: their delivery to a box alone, compared with their
// delivery to a listener that only counts them. The clock of a box is the player's, so one that
// answers at once is compared with one that asks the operating system.

#include <benchmark/benchmark.h>

#include <chrono>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <limits>
#include <string>

#include "bdmvnavigator/inavigatorevent.h"
#include "clientkit/blackbox.h"
#include "kevro_linux.h"
#include "listener.h"
#include "parkedthread.h"
#include "report.h"
#include "testkit/allocationcounter.h"
#include "testkit/operatornew.h"

namespace
{

using List = bdmv::INavigatorEvent::Listeners;

constexpr char Plain[] = "a listener that counts";
constexpr char Box[] = "a black box, clock that answers at once";
constexpr char BoxWithClock[] = "a black box, clock of the system";
constexpr const char* Subjects[] = {Plain, Box, BoxWithClock};

constexpr char NoArguments[] = "no arguments";
constexpr char ByReference[] = "a reference";
constexpr char ByValue[] = "AudioInfoType by value";
constexpr const char* Callbacks[] = {NoArguments, ByReference, ByValue};

constexpr char AllocationsCounter[] = "allocations";
constexpr double Goal = 5;

std::uint64_t g_Ticks = 0;

std::uint64_t TicksAtOnce()
{
    return ++g_Ticks;
}

std::uint64_t TicksOfTheSystem()
{
    const std::chrono::nanoseconds now = std::chrono::steady_clock::now().time_since_epoch();
    return static_cast<std::uint64_t>(now.count()) * 9 / 200000;
}

std::string RowName(const std::string& callback, const std::string& subject)
{
    return "blackbox/" + callback + "/" + subject;
}

template <typename Deliver>
void RegisterRow(const std::string& callback, const std::string& subject,
                 bdmv::INavigatorListener& listener, Deliver deliver)
{
    benchmark::RegisterBenchmark(RowName(callback, subject).c_str(),
                                 [&listener, deliver](benchmark::State& state) {
                                     List list;
                                     list.AddListener(&listener);
                                     const std::size_t before = bdmvtest::CountAllocations();
                                     for (auto _ : state) {
                                         deliver(list);
                                     }
                                     state.counters[AllocationsCounter] =
                                         static_cast<double>(bdmvtest::CountAllocations() - before);
                                 });
}

void RegisterSubject(const std::string& subject, bdmv::INavigatorListener& listener)
{
    RegisterRow(NoArguments, subject, listener, [](List& list) {
        bd::EventListenerList_FireParam0(list, &bdmv::INavigatorListener::PlayStarted);
    });
    RegisterRow(ByReference, subject, listener, [](List& list) {
        bd::EventListenerList_FireParam1(list, &bdmv::INavigatorListener::CurrentTimePosition,
                                         bench::Position);
    });
    RegisterRow(ByValue, subject, listener, [](List& list) {
        bd::EventListenerList_FireParam2(list, &bdmv::INavigatorListener::AudioInfoChanged, true,
                                         bench::AudioInfo);
    });
}

void PrintTable(const bench::Report& report)
{
    std::printf("\nDelivery to one listener: ns, × a listener that counts, allocations\n  %-42s",
                "");
    for (const char* const callback : Callbacks) {
        std::printf("%25s", callback);
    }
    std::printf("\n");
    double worst = std::numeric_limits<double>::quiet_NaN();
    for (const char* const subject : Subjects) {
        std::printf("  %-42s", subject);
        for (const char* const callback : Callbacks) {
            const double time = report[RowName(callback, subject)].cpu;
            const double ratio = time / report[RowName(callback, Plain)].cpu;
            bench::PrintNumber(12, 1, time);
            bench::PrintNumber(7, 2, ratio);
            bench::PrintNumber(6, 0,
                               report.Largest(RowName(callback, subject), AllocationsCounter));
            worst = std::fmax(worst, ratio); // ignores NaN, which means not measured
        }
        std::printf("\n");
    }
    const char* const verdict = std::isnan(worst) ? "not measured"
                                : worst <= Goal   ? "met"
                                                  : "MISSED";
    std::printf("\nGoals\n  %-12s  a black box, × a listener that counts (within %.2f, worst",
                verdict, Goal);
    bench::PrintNumber(5, 2, worst);
    std::printf(")\n");
}

} // namespace

int main(int argc, char** argv)
{
    const bench::ParkedThread parked;
    KEVRO_Log_Configure("", nullptr, 0);
    bdmv::BlackBox box(1000, TicksAtOnce);
    bdmv::BlackBox boxWithClock(1000, TicksOfTheSystem);
    RegisterSubject(Plain, bench::Listeners()[0]);
    RegisterSubject(Box, box);
    RegisterSubject(BoxWithClock, boxWithClock);

    bench::Report report;
    if (!bench::RunBenchmarks(report, argc, argv)) {
        return 2;
    }
    PrintTable(report);
    return 0;
}
