/**
 * @file
 * Collects what was measured and prints it as tables, with ratios and goals.
 */
#ifndef BENCH_REPORT_H
#define BENCH_REPORT_H

#include <map>
#include <string>
#include <vector>

#include <benchmark/benchmark.h>

namespace bench
{

/** The medians of a row over its repetitions; not a number for what was not measured. */
struct Row {
    double cpu;  ///< nanoseconds of the processor for each iteration of the calling thread
    double wall; ///< nanoseconds passed for each iteration of all threads
    std::map<std::string, double> counters;
};

/** Keeps the repetitions of every row instead of printing them. */
class Report : public benchmark::BenchmarkReporter
{
public:
    bool ReportContext(const Context& /*context*/) override { return true; }
    void ReportRuns(const std::vector<Run>& runs) override;

    Row operator[](const std::string& name) const;

private:
    std::map<std::string, std::vector<Run>> m_Runs;
};

/** Prints all tables, then which goals are met. */
void PrintTables(const Report& report);

} // namespace bench

#endif
