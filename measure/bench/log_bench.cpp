// One log line, the longest of the three measured events', and what a user might choose instead.

#include <chrono>
#include <cstdarg>
#include <cstdio>
#include <memory>
#include <string>

#include <benchmark/benchmark.h>
#include <spdlog/async_logger.h>
#include <spdlog/details/thread_pool.h>

#include "bd/logging.h"
#include "benchmarks.h"
#include "logging.h"

namespace bench
{

namespace
{

constexpr bd::LogTag Tag = {bd::CompIdBdmvNavigator, KEVRO_Log_LevelEvent, 0};

struct Values {
    unsigned long playListId = 800;
    unsigned playItemId = 12;
    int videoFormat = 6;
    int aspectRatio = 3;
};

void WriteLine(const Values& values)
{
    BD_LOG(Tag,
           "Sending PlayItem - playListId: %lu, playItemId: %u, videoFormat %d, aspectRatio %d",
           values.playListId, values.playItemId, values.videoFormat, values.aspectRatio);
}

BD_PRINTF_FORMAT(1, 2) void Format(const char* format, ...)
{
    char line[256];
    va_list args;
    va_start(args, format);
    std::vsnprintf(line, sizeof(line), format, args);
    va_end(args);
    benchmark::DoNotOptimize(line);
}

void FormatLine(const Values& values)
{
    Format("Sending PlayItem - playListId: %lu, playItemId: %u, videoFormat %d, aspectRatio %d",
           values.playListId, values.playItemId, values.videoFormat, values.aspectRatio);
}

void WriteBySpdlog(spdlog::logger& logger, const Values& values)
{
    logger.info("Sending PlayItem - playListId: {}, playItemId: {}, videoFormat {}, aspectRatio {}",
                values.playListId, values.playItemId, values.videoFormat, values.aspectRatio);
}

template <typename Write> void Repeat(benchmark::State& state, Write write)
{
    Values values;
    benchmark::DoNotOptimize(values);
    for (auto _ : state) {
        write(values);
    }
}

void CheckSwitch(benchmark::State& state)
{
    for (auto _ : state) {
        benchmark::DoNotOptimize(KEVRO_Log_IsEnabled(Tag.component, Tag.level, Tag.hiFreq));
    }
}

void Off(benchmark::State& state)
{
    Repeat(state, WriteLine);
}

void On(benchmark::State& state, std::chrono::microseconds sinkTime, std::size_t queueLines)
{
    const LoggingOn logging(sinkTime, queueLines);
    Repeat(state, WriteLine);
}

void Vsnprintf(benchmark::State& state)
{
    Repeat(state, FormatLine);
}

void Spdlog(benchmark::State& state)
{
    spdlog::logger logger("", std::make_shared<DroppingSink>(Null));
    Repeat(state, [&](const Values& values) { WriteBySpdlog(logger, values); });
}

void SpdlogQueue(benchmark::State& state, std::chrono::microseconds sinkTime)
{
    const auto queue = std::make_shared<spdlog::details::thread_pool>(QueueLines, 1);
    const auto logger =
        std::make_shared<spdlog::async_logger>("", std::make_shared<DroppingSink>(sinkTime), queue,
                                               spdlog::async_overflow_policy::overrun_oldest);
    Repeat(state, [&](const Values& values) { WriteBySpdlog(*logger, values); });
}

} // namespace

void RegisterLogLines()
{
    const auto row = [](const std::string& what, auto function) {
        benchmark::RegisterBenchmark(LogRow(what).c_str(), function);
    };
    row(LogSwitch, CheckSwitch);
    row(LogOff, Off);
    row(LogNull, [](benchmark::State& state) { On(state, Null, 0); });
    row(LogQueue, [](benchmark::State& state) { On(state, Slow, QueueLines); });
    row(LogQueueNull, [](benchmark::State& state) { On(state, Null, QueueLines); });
    row(LogVsnprintf, Vsnprintf);
    row(LogSpdlog, Spdlog);
    row(LogSpdlogQueue, [](benchmark::State& state) { SpdlogQueue(state, Slow); });
    row(LogSpdlogQueueNull, [](benchmark::State& state) { SpdlogQueue(state, Null); });
}

} // namespace bench
