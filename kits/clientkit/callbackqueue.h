/**
 * @file
 * What waits for the client of a QueuedListener: which callbacks stay, which merge, which are lost,
 * and what the client receives instead. Has no lock and no thread.
 */
#ifndef CLIENTKIT_CALLBACKQUEUE_H
#define CLIENTKIT_CALLBACKQUEUE_H

#include <cstddef>
#include <vector>

#include "clientkit/blockbuffer.h"
#include "clientkit/callback.h"
#include "clientkit/playbackstatus.h"
#include "clientkit/queuedlistener.h"

namespace bdmv
{

/**
 * The queue. First in, first out, in up to four parts:
 *
 *     before a loss | lost after all | the resync | after the loss
 *
 * Without a loss there is only the first part. A loss ends the part that was last: at first that is
 * the first one, and the resync is placed after it. A further loss before that resync was taken
 * makes everything after it lost as well, and the resync moves to the end. So there is at most one
 * resync, and its status is that at the last loss.
 *
 * What is lost after all is discarded by the thread that takes, so that programs are released
 * there.
 *
 * For one thread at a time. Nothing allocates after construction.
 */
class CallbackQueue
{
public:
    /** What Take() took. */
    enum Step {
        StepNone,    ///< there is nothing
        StepDeliver, ///< a callback for the client
        StepDiscard, ///< a callback that is lost
        StepResync   ///< a status for the client
    };

    /** @throw std::invalid_argument no places */
    explicit CallbackQueue(const QueuedListener::Options& options);

    CallbackQueue(const CallbackQueue&) = delete;
    CallbackQueue& operator=(const CallbackQueue&) = delete;

    /** Receives a callback: it waits, merges or is lost. Copies what it borrows. */
    void Put(const Callback& callback);

    /** Receives a callback that is lost because the queue is closed. */
    void Refuse();

    /** Makes everything that waits lost, and cancels a resync, also the one that was taken. */
    void LoseAll();

    bool IsEmpty() const { return m_Waiting == 0 && m_LostLater == 0 && !m_Resync; }

    /**
     * Takes what is next.
     *
     * @param callback receives the callback of StepDeliver and StepDiscard; its block is valid
     * until Finish()
     * @param status   receives the status of StepResync
     */
    Step Take(Callback& callback, PlaybackStatus& status);

    /** Counts what was taken last as delivered, and frees its block. */
    void Finish();

    const QueuedListener::Counters& GetCounters() const { return m_Counters; }

private:
    struct Block {
        const void* data; ///< null for none
        bd::UInt32 size;
    };

    std::size_t Used() const { return m_Waiting + m_LostLater + m_AfterResync; }

    /** The number of callbacks in the part to which new ones are added. */
    std::size_t& NewestPart() { return m_Resync ? m_AfterResync : m_Waiting; }

    /** The place of a callback, counted from the oldest; at most as many as there are places. */
    std::size_t PlaceAt(std::size_t index) const;

    Step NextStep() const;
    void TakeOldest(Callback& callback);
    bool Merge(const Callback& callback);
    bool Append(const Callback& callback);
    bool AppendStandby(const callbacks::SystemSuspended& standby, Callback& place);
    void Lose();

    std::vector<Callback> m_Places;
    std::size_t m_First;       ///< place of the oldest callback
    std::size_t m_Waiting;     ///< callbacks before the loss; all, if there is no resync
    std::size_t m_LostLater;   ///< callbacks that are lost after all
    bool m_Resync;             ///< whether a resync is due, after these
    std::size_t m_AfterResync; ///< callbacks after the resync
    PlaybackStatus m_Status;   ///< of everything received
    PlaybackStatus
        m_ResyncStatus; ///< of everything up to the last loss, if a callback waits after it
    BlockBuffer m_Blocks;
    Step m_Taken;
    callbacks::SystemSuspended m_TakenBlock; ///< what Finish() frees; null for nothing
    QueuedListener::Counters m_Counters;
};

} // namespace bdmv

#endif
