// Delivery, events, threads, log lines, queues and the client kit in one run, so that their times
// are comparable.

#include "benchmarks.h"
#include "kevro_linux.h"
#include "parkedthread.h"
#include "tables.h"

int main(int argc, char** argv)
{
    const bench::ParkedThread parked;
    KEVRO_Log_Configure("", nullptr, 0);

    bench::RegisterDelivery();
    bench::RegisterEvents();
    bench::RegisterThreads();
    bench::RegisterLogLines();
    bench::RegisterQueues();
    bench::RegisterClientKit();
    bench::RegisterQueuedListener();

    bench::Report report;
    if (!bench::RunBenchmarks(report, argc, argv)) {
        return 2;
    }
    bench::PrintTables(report);
    return 0;
}
