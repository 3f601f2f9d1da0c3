#include "report.h"

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <limits>

namespace bench
{

namespace
{

double Median(std::vector<double> values)
{
    if (values.empty()) {
        return std::numeric_limits<double>::quiet_NaN();
    }
    const auto middle = values.begin() + static_cast<std::ptrdiff_t>(values.size() / 2);
    std::nth_element(values.begin(), middle, values.end());
    return *middle;
}

} // namespace

double Row::Counter(const std::string& name) const
{
    const auto found = counters.find(name);
    return found == counters.end() ? std::numeric_limits<double>::quiet_NaN() : found->second;
}

void Report::ReportRuns(const std::vector<Run>& runs)
{
    for (const Run& run : runs) {
        if (run.run_type == Run::RT_Iteration) {
            m_Runs[run.run_name.function_name].push_back(run);
        }
    }
}

Row Report::operator[](const std::string& name) const
{
    std::vector<double> cpu;
    std::vector<double> wall;
    std::map<std::string, std::vector<double>> counters;
    const auto found = m_Runs.find(name);
    if (found != m_Runs.end()) {
        for (const Run& run : found->second) {
            cpu.push_back(run.GetAdjustedCPUTime());
            wall.push_back(run.GetAdjustedRealTime());
            for (const auto& [counter, value] : run.counters) {
                counters[counter].push_back(value);
            }
        }
    }
    Row row{Median(cpu), Median(wall), {}};
    for (const auto& [counter, values] : counters) {
        row.counters[counter] = Median(values);
    }
    return row;
}

double Report::Largest(const std::string& name, const std::string& counter) const
{
    double largest = std::numeric_limits<double>::quiet_NaN();
    const auto found = m_Runs.find(name);
    if (found != m_Runs.end()) {
        for (const Run& run : found->second) {
            const auto value = run.counters.find(counter);
            if (value != run.counters.end()) {
                largest = std::fmax(largest, value->second);
            }
        }
    }
    return largest;
}

bool RunBenchmarks(Report& report, int argc, char** argv)
{
    char repetitions[] = "--benchmark_repetitions=15";
    char interleaving[] = "--benchmark_enable_random_interleaving=true";
    char minTime[] = "--benchmark_min_time=0.03";
    std::vector<char*> arguments(argv, argv + argc);
    arguments.insert(arguments.begin() + 1, {repetitions, interleaving, minTime});
    int count = static_cast<int>(arguments.size());
    benchmark::Initialize(&count, arguments.data());
    if (benchmark::ReportUnrecognizedArguments(count, arguments.data())) {
        return false;
    }
    benchmark::RunSpecifiedBenchmarks(&report);
    return true;
}

void PrintNumber(int width, int decimals, double value)
{
    if (std::isnan(value)) {
        std::printf("%*s", width, "-");
    } else {
        std::printf("%*.*f", width, decimals, value);
    }
}

} // namespace bench
