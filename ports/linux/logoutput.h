/**
 * @file
 * A configured sink with its queue, and the account of what became of every line.
 */
#ifndef KEVRO_LOGOUTPUT_H
#define KEVRO_LOGOUTPUT_H

#include <condition_variable>
#include <cstddef>
#include <memory>
#include <mutex>
#include <string_view>

#include <spdlog/async_logger.h>
#include <spdlog/details/thread_pool.h>
#include <spdlog/sinks/sink.h>

#include "kevro/kevro_types.h"

namespace kevro
{

/**
 * Takes finished lines and hands them to a destination, directly or through a bounded queue.
 *
 * It stands between spdlog's logger and the destination as a sink of its own: there it counts
 * what went through, keeps exceptions from the logger, and writes a line where others were lost.
 * All operations may be called from several threads at once.
 */
class Output final : private spdlog::sinks::sink
{
public:
    /** @param queueLines lines that may wait for the destination; 0 writes each directly */
    Output(std::unique_ptr<spdlog::sinks::sink> destination, std::size_t queueLines);

    /** Drain() first. No thread may write any more. */
    ~Output() override = default;

    Output(const Output&) = delete;
    Output& operator=(const Output&) = delete;

    /** Writes or queues a line. With a queue it never waits for the destination. */
    void Write(spdlog::level::level_enum level, std::string_view line) noexcept;

    /** Waits until each line given to Write() before is written or lost. */
    void Drain() noexcept;

    /** Counts a line that was lost on its way here. */
    void AddLost() noexcept;

    /** How many lines were lost. */
    KEVRO_UInt64 CountLost() const noexcept;

private:
    void log(const spdlog::details::log_msg& message) override;
    void flush() override;
    void set_pattern(const std::string& pattern) override;
    void set_formatter(std::unique_ptr<spdlog::formatter> formatter) override;

    bool TryWrite(const spdlog::details::log_msg& message) noexcept;
    void ReportLost() noexcept;
    void Account(bool written) noexcept;
    bool IsCaughtUp() const noexcept;
    KEVRO_UInt64 CountOverrun() const noexcept;

    const std::unique_ptr<spdlog::sinks::sink> m_Destination;
    std::mutex m_WriteMutex;         ///< held while the destination takes a line
    KEVRO_UInt64 m_ReportedLost = 0; ///< under m_WriteMutex

    mutable std::mutex m_CountMutex; ///< never held while anything is written
    std::condition_variable m_Progress;
    KEVRO_UInt64 m_Accepted = 0; ///< given to Write()
    KEVRO_UInt64 m_Done = 0;     ///< written or refused; not those the queue dropped
    KEVRO_UInt64 m_Refused = 0;

    std::shared_ptr<spdlog::logger> m_Logger;
    // Last, so that the queue's thread ends before anything it uses goes.
    std::shared_ptr<spdlog::details::thread_pool> m_Queue;
};

} // namespace kevro

#endif
