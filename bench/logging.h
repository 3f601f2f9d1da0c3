/**
 * @file
 * Switches the log of the port for a row.
 */
#ifndef BENCH_LOGGING_H
#define BENCH_LOGGING_H

#include <cstddef>
#include <memory>

#include <spdlog/sinks/null_sink.h>

#include "kevro_linux.h"
#include "logchannel.h"

namespace bench
{

/** Lines that may wait in a queue. */
constexpr std::size_t QueueLines = 1024;

/** As long as it lives, all lines are on and go into a sink that drops them. */
class LoggingOn
{
public:
    /** @param queueLines lines that may wait for the sink; 0 for no queue */
    explicit LoggingOn(std::size_t queueLines)
    {
        kevro::TheLogChannel().Exchange(std::make_unique<kevro::Output>(
            std::make_unique<spdlog::sinks::null_sink_mt>(), queueLines));
        KEVRO_Log_Configure("*=*+hifreq", nullptr, 0);
    }

    ~LoggingOn()
    {
        KEVRO_Log_Configure("", nullptr, 0);
        KEVRO_Log_Flush();
    }

    LoggingOn(const LoggingOn&) = delete;
    LoggingOn& operator=(const LoggingOn&) = delete;
};

} // namespace bench

#endif
