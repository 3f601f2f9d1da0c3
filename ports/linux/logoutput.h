/**
 * @file
 * A configured sink with its queue, and the counts of lines accepted, written and lost.
 */
#ifndef KEVRO_LOGOUTPUT_H
#define KEVRO_LOGOUTPUT_H

#include <condition_variable>
#include <cstdarg>
#include <cstddef>
#include <memory>
#include <mutex>
#include <string_view>
#include <thread>

#include <spdlog/sinks/sink.h>

#include "bd/macros.h"
#include "logline.h"
#include "logqueue.h"

namespace kevro
{

/**
 * Takes lines and passes them to a destination, directly or through a bounded queue with a thread.
 *
 * A writer only formats the text of a queued line, in its place in the queue. The queue's thread
 * composes the line, writes it and reports lost lines.
 *
 * Shares its owner's mutex, so choosing an output and writing to it take one lock. All operations
 * may be called from several threads at once.
 */
class Output
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
    ~Output();

    Output(const Output&) = delete;
    Output& operator=(const Output&) = delete;

    /**
     * Writes or queues a line of which @p format and @p args make the text. With a queue it never
     * waits for the destination.
     */
    BD_PRINTF_FORMAT(4, 0)
    void Write(Lock& lock, const LineHead& head, const char* format, va_list args) noexcept;

    /** Waits until every line passed to Write() so far is written or lost. */
    void Drain(Lock& lock) noexcept;

    /** The number of lost lines. */
    KEVRO_UInt64 CountLost(const Lock& /*lock*/) const noexcept { return m_Lost; }

private:
    BD_PRINTF_FORMAT(4, 0)
    void WriteDirectly(Lock& lock, const LineHead& head, const char* format, va_list args) noexcept;
    BD_PRINTF_FORMAT(4, 0)
    void Queue(const Lock& lock, const LineHead& head, const char* format, va_list args) noexcept;
    void Rest(Lock& lock) noexcept;
    void WriteQueuedLines(std::unique_ptr<QueuedLine> pLine) noexcept;
    bool WriteToDestination(const LineHead& head, std::string_view text,
                            KEVRO_UInt64 lost) noexcept;
    bool TryWrite(const LineHead& head, std::string_view text) noexcept;
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
    KEVRO_UInt64 m_Lost = 0;

    std::unique_ptr<LogQueue> m_Queue; ///< null without a queue
    bool m_IsClosing = false;          ///< ends the queue's thread once its lines are written
    bool m_IsResting = false;          ///< the queue's thread is in Rest()
    std::condition_variable m_Arrived; ///< a line in the queue, or its end
    std::thread m_Thread;              ///< writes queued lines
};

} // namespace kevro

#endif
