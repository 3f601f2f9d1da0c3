// How fast the desk player sends events through a session on the virtual clock: from the navigator
// through the queue to the delivering thread and every listener, and back.
//
// The sessions play from start to end with a chapter every five minutes, log lines off. The ratios
// say how the cost of a session grows with its length and with the number of listeners; the times
// of different runs are not to be compared.

#include <benchmark/benchmark.h>

#include <cstdint>
#include <cstdio>
#include <map>
#include <memory>
#include <vector>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "kevro_linux.h"
#include "navigator/eventdelivery.h"
#include "navigator/simulatednavigator.h"
#include "navigator/virtualclock.h"
#include "session/session.h"

namespace
{

constexpr std::uint32_t TicksPerMinute = 60 * 45000;
constexpr std::uint32_t ClipStart = 10 * TicksPerMinute;

deskplayer::LoadedPlayList PlayListOf(std::uint32_t minutes)
{
    deskplayer::PlayList list;
    deskplayer::PlayItem item;
    item.inTime = ClipStart;
    item.outTime = ClipStart + minutes * TicksPerMinute;
    item.streams.primaryVideo.resize(1);
    item.streams.primaryAudio.resize(3);
    list.playItems = {item};
    for (std::uint32_t minute = 0; minute < minutes; minute += 5) {
        deskplayer::Mark mark;
        mark.type = deskplayer::MarkTypeEntry;
        mark.time = ClipStart + minute * TicksPerMinute;
        list.marks.push_back(mark);
    }
    return deskplayer::LayOut(1, list);
}

/** Counts the callbacks that come every second, nearly all there are. */
class CountingListener : public bdmv::NavigatorListenerAdapter
{
public:
    void CurrentTimePosition(const bd::TimePosition& /*position*/) override { ++count; }

    std::uint64_t count = 0;
};

void PlaySession(benchmark::State& state)
{
    const auto minutes = static_cast<std::uint32_t>(state.range(0));
    const auto listeners = static_cast<std::size_t>(state.range(1));
    std::uint64_t events = 0;
    for (auto _ : state) {
        std::vector<CountingListener> counting(listeners);
        deskplayer::VirtualClock clock;
        deskplayer::ResumeDataKeeper keeper;
        deskplayer::EventDelivery delivery;
        deskplayer::SimulatedNavigator navigator(PlayListOf(minutes), clock, delivery);
        for (CountingListener& listener : counting) {
            delivery.Listeners().AddListener(&listener);
        }
        deskplayer::Desk desk{navigator, keeper};
        deskplayer::PlayFromStartToEnd(desk, clock, {});
        events += counting.front().count;
    }
    state.counters["events/s"] =
        benchmark::Counter(static_cast<double>(events), benchmark::Counter::kIsRate);
}

BENCHMARK(PlaySession)
    ->ArgNames({"minutes", "listeners"})
    ->Args({30, 1})
    ->Args({60, 1})
    ->Args({120, 1})
    ->Args({240, 1})
    ->Args({120, 8})
    ->Args({120, 64})
    ->Args({120, 1024})
    ->UseRealTime()
    ->Unit(benchmark::kMillisecond);

/** Prints, after the table, each session beside the two hours with one listener. */
class RatioReporter : public benchmark::ConsoleReporter
{
public:
    void ReportRuns(const std::vector<Run>& runs) override
    {
        ConsoleReporter::ReportRuns(runs);
        for (const Run& run : runs) {
            if (run.run_type == Run::RT_Iteration) {
                m_Times[run.run_name.args] = run.GetAdjustedRealTime();
            }
        }
    }

    void Finalize() override
    {
        const double twoHours = m_Times["minutes:120/listeners:1"];
        std::printf("\nBeside two hours with one listener:\n");
        for (const auto& [session, time] : m_Times) {
            std::printf("  %-32s %7.2f times\n", session.c_str(), time / twoHours);
        }
    }

private:
    std::map<std::string, double> m_Times;
};

} // namespace

int main(int argc, char** argv)
{
    KEVRO_Log_Configure("", nullptr, 0);
    benchmark::Initialize(&argc, argv);
    RatioReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    return 0;
}
