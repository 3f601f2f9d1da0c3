/**
 * @file
 * Configures the log of the port for a row.
 */
#ifndef BENCH_LOGGING_H
#define BENCH_LOGGING_H

#include <chrono>
#include <cstddef>
#include <memory>
#include <mutex>
#include <thread>

#include <spdlog/sinks/base_sink.h>

#include "kevro_linux.h"
#include "logchannel.h"

namespace bench
{

/** Lines that may wait in a queue. */
constexpr std::size_t QueueLines = 100;

/** A sink that drops its lines at once. */
constexpr std::chrono::microseconds Null{0};

/** A sink as slow as a terminal or flash memory, so the queue's thread is always busy. */
constexpr std::chrono::microseconds Slow{100};

/** Drops each line after a delay. */
class DroppingSink final : public spdlog::sinks::base_sink<std::mutex>
{
public:
    explicit DroppingSink(std::chrono::microseconds time) : m_Time(time) {}

protected:
    void sink_it_(const spdlog::details::log_msg& /*message*/) override
    {
        if (m_Time != Null) {
            std::this_thread::sleep_for(m_Time);
        }
    }

    void flush_() override {}

private:
    std::chrono::microseconds m_Time;
};

/** While it lives, all lines are on and go to a sink that drops them. */
class LoggingOn
{
public:
    /** @param queueLines lines that may wait for the sink; 0 for no queue */
    LoggingOn(std::chrono::microseconds sinkTime, std::size_t queueLines)
    {
        kevro::TheLogChannel().Exchange({std::make_unique<DroppingSink>(sinkTime), queueLines});
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
