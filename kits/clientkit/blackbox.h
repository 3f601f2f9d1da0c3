/**
 * @file
 * Keeps the last callbacks in memory, for a report when something has gone wrong.
 *
 * @code
 * // In the player's port.
 * std::atomic<const bdmv::BlackBox*> g_pBlackBox(nullptr);
 *
 * void WriteToReport(void* report, const char* bytes, std::size_t size)
 * {
 *     std::fwrite(bytes, 1, size, static_cast<std::FILE*>(report));
 * }
 *
 * extern "C" void Assert(const char* expression, const char* file, int line)
 * {
 *     std::fprintf(stderr, "%s:%d: %s\n", file, line, expression);
 *     if (const bdmv::BlackBox* const box = g_pBlackBox) {
 *         box->Dump(WriteToReport, stderr);
 *     }
 * }
 *
 * // In the player. The box is never destroyed: a thread may be in Assert() until the process ends.
 * // It is the first listener, so that it has the callback in which another one ends in Assert().
 * bdmv::BlackBox* const box = new bdmv::BlackBox(1000, TicksSinceStart);
 * g_pBlackBox = box;
 * navigatorListeners.AddListener(box);
 * ...
 * navigatorListeners.RemoveListener(box);
 * @endcode
 *
 * Memory. All of it is allocated by the constructor: for each callback less than 64 bytes and
 * those kept of a block.
 *
 * Lifetime. Remove the box from its list before destroying it, and destroy it only when no Dump()
 * can be running: after g_pBlackBox is cleared, a thread in Assert() may still use the pointer that
 * it has read.
 *
 * Re-entrancy. Dump() works inside a callback, inside the function that gives the time and inside
 * the one that writes. A function that writes must not end in Assert() if Assert() dumps: that
 * would never end. Dump() is not for signal handlers: a signal may interrupt the thread that holds
 * the lock of the box.
 *
 * Threads. Several threads may deliver to the box and dump it at once. The lock is held while one
 * record is copied, and never while code of the client runs. A dumping thread that is preempted at
 * that moment delays the delivering thread until it continues.
 */
#ifndef CLIENTKIT_BLACKBOX_H
#define CLIENTKIT_BLACKBOX_H

#include <cstddef>
#include <cstdint>
#include <vector>

#include "bd/threadmutex.h"
#include "clientkit/callback.h"

namespace bdmv
{

/**
 * A listener that records callbacks with their times in a ring: a new one overwrites the oldest.
 *
 * Nothing that callbacks share or lend is kept: of a program the number of its commands, of a block
 * the size and the first bytes.
 */
class BlackBox : public CallbackListener
{
public:
    /**
     * @param callbacks    how many it keeps
     * @param ticks        the session time in 45 kHz ticks. Called once for every callback, on the
     *                     delivering thread; what it throws leaves the callback, which is then not
     *                     recorded
     * @param bytesOfBlock how many bytes it keeps of the block of SystemSuspended()
     * @throw std::invalid_argument @p callbacks is 0, or @p ticks is null
     * @throw std::length_error     more memory than can be addressed
     * @throw std::bad_alloc        not enough memory
     */
    BlackBox(std::size_t callbacks, std::uint64_t (*ticks)(), std::size_t bytesOfBlock = 0);

    BlackBox(const BlackBox&) = delete;
    BlackBox& operator=(const BlackBox&) = delete;

    /**
     * Writes what the box contains when this is called, oldest first, one line of JSON each.
     *
     * Callbacks that are missing are one line of another kind, a gap: in the first line those that
     * were overwritten before the call, further on those that are overwritten while @p write works.
     * docs/outputs.md describes both kinds of lines.
     *
     * A block that is overwritten while its bytes are written ends early, like one that was longer
     * than the box keeps. A mask is written as it is reported at this moment, with ::g_u1Bduopmask.
     *
     * Any thread may call this at any time, except in a signal handler. Allocates nothing. Uses
     * less than 1 KiB of the stack.
     *
     * @param write not null; called on this thread. A line of up to 512 bytes is one call; a call
     *              never has parts of two lines
     * @param user  passed to @p write
     * @throw whatever @p write throws; the rest is then not written
     */
    void Dump(void (*write)(void* user, const char* bytes, std::size_t size), void* user) const;

private:
    struct Record {
        bd::UInt64 ticks;
        Callback callback;   ///< without the program and without the address of the block
        bd::UInt32 size;     ///< of the part of the block that is kept
        bd::UInt16 commands; ///< of the program
    };

    class Line;

    /** The callbacks in the box, numbered from 0 in order of arrival. */
    struct Contents {
        bd::UInt64 oldest;
        bd::UInt64 end;
    };

    void OnCallback(const Callback& callback) override;
    void Keep(const Record& record, const void* block);

    /** Copies the record of callback @p number, or the oldest one if that is overwritten. */
    Contents Fetch(bd::UInt64 number, Record& record) const;

    /** Copies bytes of the block of callback @p number; returns none if that is overwritten. */
    std::size_t FetchBytes(bd::UInt64 number, std::size_t offset, bd::UInt8* bytes,
                           std::size_t size) const;

    // The caller holds the lock.
    bd::UInt64 Oldest() const;
    std::size_t PlaceOf(bd::UInt64 number) const;

    std::uint64_t (*const m_pTicks)();
    const std::size_t m_BytesOfBlock;
    bd::ThreadMutex m_Mutex;         ///< protects all below
    std::vector<Record> m_Records;   ///< the ring
    std::vector<bd::UInt8> m_Blocks; ///< bytes for each record
    std::size_t m_Next;              ///< where the next record goes
    bd::UInt64 m_Received;           ///< all callbacks so far
};

} // namespace bdmv

#endif
