/**
 * @file
 * A configured sink with its queue, and the counts of lines accepted, written and lost.
 */
#ifndef KEVRO_LOGOUTPUT_H
#define KEVRO_LOGOUTPUT_H

#include <condition_variable>
#include <cstddef>
#include <memory>
#include <mutex>
#include <string>
#include <string_view>

#include <spdlog/async_logger.h>
#include <spdlog/details/thread_pool.h>
#include <spdlog/sinks/sink.h>

#include "logline.h"

namespace kevro
{

/**
 * Takes lines and passes them to a destination, directly or through spdlog's bounded queue.
 *
 * It is itself the spdlog sink between the queue and the destination. There it counts lines, keeps
 * exceptions from spdlog, and reports lost lines. It also composes lines there, so that a writer
 * only copies the text.
 *
 * Shares its owner's mutex, so choosing an output and writing to it take one lock. All operations
 * may be called from several threads at once.
 */
class Output final : private spdlog::sinks::sink
{
public:
    /** Holds the mutex before and after a call; a slow operation releases it in between. */
    using Lock = std::unique_lock<std::mutex>;

    /**
     * @param mutex      guards the counts; must outlive the output
     * @param queueLines lines that may wait for the destination; 0 writes each directly
     */
    Output(std::mutex& mutex, std::unique_ptr<spdlog::sinks::sink> destination,
           std::size_t queueLines);

    /** Call Drain() first. No thread may write any more, and the mutex must be free. */
    ~Output() override = default;

    Output(const Output&) = delete;
    Output& operator=(const Output&) = delete;

    /** Writes or queues a line. With a queue it never waits for the destination. */
    void Write(Lock& lock, const LogLine& line) noexcept;

    /** Waits until every line passed to Write() so far is written or lost. */
    void Drain(Lock& lock) noexcept;

    /** Counts a line that was lost before it reached the output. */
    void AddLost(const Lock& lock) noexcept;

    /** The number of lost lines. */
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
    void ReportFailure(std::string_view reason) noexcept;
    void ReportLost(KEVRO_UInt64 lost) noexcept;
    void MarkDone(const Lock& lock, KEVRO_UInt64 done, bool written) noexcept;

    const std::unique_ptr<spdlog::sinks::sink> m_Destination;
    std::mutex m_WriteMutex;         ///< held while the destination writes a line
    KEVRO_UInt64 m_ReportedLost = 0; ///< guarded by m_WriteMutex
    bool m_FailureReported = false;  ///< guarded by m_WriteMutex

    std::mutex& m_rMutex; ///< never held while a line is written
    std::condition_variable m_Progress;
    KEVRO_UInt64 m_Accepted = 0; ///< lines queued, being written or done
    KEVRO_UInt64 m_Done = 0;     ///< lines written or lost; with a queue, the number of the last
    KEVRO_UInt64 m_Refused = 0;  ///< lines lost, but not by the queue

    std::shared_ptr<spdlog::async_logger>
        m_Logger; ///< writes queued lines here; null without a queue
    // Last, so that the queue's thread ends before anything it uses is destroyed.
    std::shared_ptr<spdlog::details::thread_pool> m_Queue; ///< null without a queue
};

} // namespace kevro

#endif
