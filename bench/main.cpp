// Delivery, events, threads and log lines in one run, so that their times may be compared. Takes the
// arguments of Google Benchmark; those given here come first, so any of them can be overruled.

#include <condition_variable>
#include <mutex>
#include <thread>
#include <vector>

#include <benchmark/benchmark.h>

#include "benchmarks.h"
#include "kevro_linux.h"
#include "report.h"

namespace bench
{

namespace
{

/**
 * A thread that does nothing. A process that never had a second thread locks several times cheaper,
 * and no player is such a process.
 */
class ParkedThread
{
public:
    ParkedThread()
        : m_Thread([this] {
              std::unique_lock<std::mutex> lock(m_Mutex);
              m_Changed.wait(lock, [this] { return m_Over; });
          })
    {
    }

    ~ParkedThread()
    {
        {
            const std::lock_guard<std::mutex> lock(m_Mutex);
            m_Over = true;
        }
        m_Changed.notify_one();
        m_Thread.join();
    }

    ParkedThread(const ParkedThread&) = delete;
    ParkedThread& operator=(const ParkedThread&) = delete;

private:
    std::mutex m_Mutex;
    std::condition_variable m_Changed;
    bool m_Over = false;
    std::thread m_Thread;
};

} // namespace

} // namespace bench

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
