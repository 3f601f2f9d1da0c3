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
#include <thread>
#include <vector>

#include <spdlog/sinks/sink.h>

#include "logline.h"

namespace kevro
{

/**
 * Takes lines and hands them to a destination, directly or through a bounded queue.
 *
 * Its mutex is its owner's: who picks an output and gives it a line locks once for both. A writer
 * to a queue does no more than copy its text; names and escape sequences are left to the queue's
 * thread. All operations may be called from several threads at once.
 */
class Output
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
    ~Output();

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
    struct QueuedLine {
        LogLine line; ///< its text is the one below
        TextBuffer text;
    };

    void Queue(const LogLine& line);
    void WriteQueued() noexcept;
    KEVRO_UInt64 LostToReport() const noexcept;
    bool WriteToDestination(const LogLine& line, KEVRO_UInt64 lost) noexcept;
    bool TryWrite(const LogLine& line) noexcept;
    void ReportLost(KEVRO_UInt64 lost) noexcept;
    void Account(const Lock& lock, bool written) noexcept;

    const std::unique_ptr<spdlog::sinks::sink> m_Destination;
    std::mutex m_WriteMutex;         ///< held while the destination takes a line; before m_rMutex
    KEVRO_UInt64 m_ReportedLost = 0; ///< under m_WriteMutex

    // All the following is guarded by it.
    std::mutex& m_rMutex;
    std::condition_variable m_Progress;
    KEVRO_UInt64 m_Accepted = 0; ///< given to Write()
    KEVRO_UInt64 m_Done = 0;     ///< written, refused by the destination, or dropped by the queue
    KEVRO_UInt64 m_Lost = 0;

    std::vector<QueuedLine> m_Queue; ///< a ring, as long as the queue may be
    std::size_t m_Oldest = 0;        ///< where the line stands that waits longest
    std::size_t m_Waiting = 0;       ///< how many wait
    bool m_Ending = false;
    std::condition_variable m_LineQueued;
    std::thread m_QueueThread;
};

} // namespace kevro

#endif
