// The rate at which the desk player sends events through a session on the virtual clock: from the
// navigator through the queue to the delivering thread and every listener, and back.
//
// The sessions play from start to end with a chapter every five minutes, log lines off. The ratios
// show how the cost of a session grows with its length and with the number of listeners; do not
// compare the times of different runs.

#include <benchmark/benchmark.h>

#include <cstdint>
#include <cstdio>
#include <string>
#include <vector>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "kevro_linux.h"
#include "navigator/deskparts.h"
#include "report.h"
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

/** Counts the position callbacks, one every second, which are nearly all callbacks. */
class CountingListener : public bdmv::NavigatorListenerAdapter
{
public:
    void CurrentTimePosition(const bd::TimePosition& /*position*/) override { ++count; }

    std::uint64_t count = 0;
};

constexpr char EventsCounter[] = "events/s";

void PlaySession(benchmark::State& state, int minutes, int listeners)
{
    std::uint64_t events = 0;
    for (auto _ : state) {
        std::vector<CountingListener> counting(static_cast<std::size_t>(listeners));
        deskplayer::DeskParts desk(PlayListOf(static_cast<std::uint32_t>(minutes)));
        for (CountingListener& listener : counting) {
            desk.Listeners().AddListener(&listener);
        }
        deskplayer::PlayFromStartToEnd(desk, {});
        events += counting.front().count;
    }
    state.counters[EventsCounter] =
        benchmark::Counter(static_cast<double>(events), benchmark::Counter::kIsRate);
}

struct Session {
    int minutes;
    int listeners;

    std::string Row() const
    {
        return "session/" + std::to_string(minutes) + "/" + std::to_string(listeners);
    }
};

constexpr Session TwoHours = {120, 1};
constexpr Session Sessions[] = {{30, 1},  {60, 1},   TwoHours,   {240, 1},
                                {120, 8}, {120, 64}, {120, 1024}};

void PrintTable(const bench::Report& report)
{
    std::printf("\nSessions of the desk player, relative to 2 h, 1 listener\n"
                "  %10s%12s%12s%12s%9s\n",
                "minutes", "listeners", "ms", "events/s", "ratio");
    const double twoHours = report[TwoHours.Row()].wall;
    for (const Session& session : Sessions) {
        const bench::Row row = report[session.Row()];
        std::printf("  %10d%12d", session.minutes, session.listeners);
        bench::PrintNumber(12, 1, row.wall);
        bench::PrintNumber(12, 0, row.Counter(EventsCounter));
        bench::PrintNumber(9, 2, row.wall / twoHours);
        std::printf("\n");
    }
}

} // namespace

int main(int argc, char** argv)
{
    KEVRO_Log_Configure("", nullptr, 0);
    for (const Session& session : Sessions) {
        benchmark::RegisterBenchmark(session.Row().c_str(), PlaySession, session.minutes,
                                     session.listeners)
            ->UseRealTime()
            ->Unit(benchmark::kMillisecond);
    }
    bench::Report report;
    if (!bench::RunBenchmarks(report, argc, argv)) {
        return 2;
    }
    PrintTable(report);
    return 0;
}
