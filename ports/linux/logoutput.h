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
#include <string>

#include <spdlog/async_logger.h>
#include <spdlog/details/thread_pool.h>
#include <spdlog/sinks/sink.h>

#include "logline.h"

namespace kevro
{

/**
 * Takes lines and hands them to a destination, directly or through spdlog's bounded queue.
 *
 * Behind the queue it stands before the destination as a sink of its own: there it composes the
 * line, so that a writer does no more than copy its text, counts what went through, keeps
 * exceptions from spdlog, and writes a line where others were lost.
 *
 * Its mutex is its owner's: who picks an output and gives it a line locks once for both. All
 * operations may be called from several threads at once.
 */
class Output final : private spdlog::sinks::sink
{
public:
    /** Holds the mutex, before and after; an operation that takes its time lets it go meanwhile. */
    using Lock = std::unique_lock<std::mutex>;

    /**
     * @param mutex      guards the account; outlives the output
     * @param queueLines lines that may wait for the destination; 0 writes each directly
     */
    Output(std::mutex& mutex, std::unique_ptr<spdlog::sinks::sink> destination,
           std::size_t queueLines);

    /** Drain() first. No thread may write any more, and the mutex is free. */
    ~Output() override = default;

    Output(const Output&) = delete;
    Output& operator=(const Output&) = delete;

    /** Writes or queues a line. With a queue it never waits for the destination. */
    void Write(Lock& lock, const LogLine& line) noexcept;

    /** Waits until each line given to Write() before is written or lost. */
    void Drain(Lock& lock) noexcept;

    /** Counts a line that was lost on its way here. */
    void AddLost(const Lock& lock) noexcept;

    /** How many lines were lost. */
    KEVRO_UInt64 CountLost(const Lock& lock) const noexcept;

private:
    void log(const spdlog::details::log_msg& message) override;
    void flush() override;
    void set_pattern(const std::string& pattern) override;
    void set_formatter(std::unique_ptr<spdlog::formatter> formatter) override;

    void WriteDirectly(Lock& lock, const LogLine& line) noexcept;
    void Queue(const Lock& lock, const LogLine& line);
    bool WriteToDestination(const LogLine& line, KEVRO_UInt64 lost) noexcept;
    bool TryWrite(const LogLine& line) noexcept;
    void ReportLost(KEVRO_UInt64 lost) noexcept;
    void Account(const Lock& lock, KEVRO_UInt64 done, bool written) noexcept;

    const std::unique_ptr<spdlog::sinks::sink> m_Destination;
    std::mutex m_WriteMutex;         ///< held while the destination takes a line
    KEVRO_UInt64 m_ReportedLost = 0; ///< under m_WriteMutex

    std::mutex& m_rMutex; ///< never held while anything is written
    std::condition_variable m_Progress;
    KEVRO_UInt64 m_Accepted = 0; ///< on their way to the destination, or done
    KEVRO_UInt64 m_Done = 0;     ///< written or lost; of queued lines the number of the last one
    KEVRO_UInt64 m_Refused = 0;  ///< lost, but not by the queue

    std::shared_ptr<spdlog::async_logger> m_Logger; ///< null, or what leads from the queue here
    // Last, so that the queue's thread ends before anything it uses goes.
    std::shared_ptr<spdlog::details::thread_pool> m_Queue; ///< null without a queue
};

} // namespace kevro

#endif
