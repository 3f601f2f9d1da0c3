/**
 * @file
 * Runs the benchmarks of a program and collects their results.
 */
#ifndef BENCH_REPORT_H
#define BENCH_REPORT_H

#include <map>
#include <string>
#include <vector>

#include <benchmark/benchmark.h>

namespace bench
{

/**
 * The medians of a row over its repetitions, for one iteration and in the unit of the row; NaN if
 * not measured.
 */
struct Row {
    double cpu;  ///< CPU time of the calling thread
    double wall; ///< elapsed time; with several threads, divided by their number
    std::map<std::string, double> counters;

    double Counter(const std::string& name) const;
};

/** Keeps the repetitions of every row instead of printing them. */
class Report : public benchmark::BenchmarkReporter
{
public:
    bool ReportContext(const Context& /*context*/) override { return true; }
    void ReportRuns(const std::vector<Run>& runs) override;

    Row operator[](const std::string& name) const;

    /** The largest value that a counter had in any repetition; NaN if it was not counted. */
    double Largest(const std::string& name, const std::string& counter) const;

private:
    std::map<std::string, std::vector<Run>> m_Runs;
};

/**
 * Runs all registered benchmarks: 15 repetitions of each row, in random order over all rows.
 *
 * @param argc, argv arguments of Google Benchmark, which override these defaults
 * @return false, and a message on standard error, when an argument is unknown
 */
bool RunBenchmarks(Report& report, int argc, char** argv);

/** Prints a number, or "-" for NaN. */
void PrintNumber(int width, int decimals, double value);

} // namespace bench

#endif
