// Delivery, events, threads and log lines in one run, so that their times may be compared. Takes the
// arguments of Google Benchmark; those given here come first, so any of them can be overruled.

#include <vector>

#include <benchmark/benchmark.h>

#include "benchmarks.h"
#include "kevro_linux.h"
#include "parkedthread.h"
#include "report.h"

int main(int argc, char** argv)
{
    const bench::ParkedThread parked;
    KEVRO_Log_Configure("", nullptr, 0);

    char repetitions[] = "--benchmark_repetitions=15";
    char interleaving[] = "--benchmark_enable_random_interleaving=true";
    char minTime[] = "--benchmark_min_time=0.03";
    std::vector<char*> arguments(argv, argv + argc);
    arguments.insert(arguments.begin() + 1, {repetitions, interleaving, minTime});
    int count = static_cast<int>(arguments.size());
    benchmark::Initialize(&count, arguments.data());
    if (benchmark::ReportUnrecognizedArguments(count, arguments.data())) {
        return 2;
    }

    bench::RegisterDelivery();
    bench::RegisterEvents();
    bench::RegisterThreads();
    bench::RegisterLogLines();

    bench::Report report;
    benchmark::RunSpecifiedBenchmarks(&report);
    bench::PrintTables(report);
    return 0;
}
