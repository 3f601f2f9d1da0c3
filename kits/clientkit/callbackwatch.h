/**
 * @file
 * A listener that measures the callbacks of the client that it wraps.
 *
 * @code
 * bdmv::CallbackWatch watch(userInterface, "user interface", std::chrono::milliseconds(5));
 * listeners.AddListener(&watch); // instead of the user interface itself
 * ...
 * // In the log: Slow callback - listener: user interface, callback: PlayItem, time: 7210 us
 *
 * const bdmv::CallbackWatch::Statistics statistics = watch.Get(bdmv::CallbackPlayItem);
 * if (statistics.count > 0) {
 *     Show(statistics.longest, statistics.total / statistics.count);
 * }
 * @endcode
 *
 * Lifetime. The client outlives the watch. Remove the watch from every list before destroying it.
 *
 * Threads. Callbacks may come on several threads at once, and statistics may be read on any thread
 * while they do, also inside a callback. No lock is held while the client or the log is called.
 *
 * Cost. A callback costs two readings of the steady clock and a lock. Nothing allocates after
 * construction. The object has about 13 KiB: keep it off small stacks.
 *
 * Pitfall. The times are elapsed times: they include the time in which the thread waited for a
 * processor. Between the client and a QueuedListener, the watch measures the client. Between the
 * QueuedListener and the list, it measures the queue.
 */
#ifndef CLIENTKIT_CALLBACKWATCH_H
#define CLIENTKIT_CALLBACKWATCH_H

#include <chrono>
#include <cstdint>
#include <string>

#include "clientkit/callback.h"
#include "clientkit/callbacktimes.h"

namespace bdmv
{

/**
 * Passes every callback on to its client and measures how long the client takes.
 *
 * A callback that takes longer than the budget is reported as a log line of CompIdBdmvNavigator at
 * Warning, unless the same callback was reported within the last second.
 *
 * An exception of the client leaves the callback as it would without the watch; the time until it
 * was thrown counts. A program that the client resets in ExecuteButton() stays with the caller.
 */
class CallbackWatch : public CallbackListener
{
public:
    /** How long a callback took so far. Fractions of microseconds are cut off. */
    struct Statistics {
        std::uint64_t count;               ///< how often it was called
        std::chrono::microseconds longest; ///< the longest call
        std::chrono::microseconds total;   ///< all calls together
        /**
         * How many took how long: place 0 is less than a microsecond, place n is 2^(n-1) or more
         * and less than 2^n microseconds, the last place is everything longer.
         */
        std::uint64_t histogram[TimePlaces];
    };

    /**
     * @param client receives the callbacks
     * @param name   the client's name in the log; copied, not null
     * @param budget the longest time that is not slow
     */
    CallbackWatch(INavigatorListener& client, const char* name, std::chrono::microseconds budget);

    CallbackWatch(const CallbackWatch&) = delete;
    CallbackWatch& operator=(const CallbackWatch&) = delete;

    /** The statistics of a callback; all zero for a value that is no callback. Any thread. */
    Statistics Get(CallbackId id) const;

private:
    void OnCallback(const Callback& callback) override;
    void Count(CallbackId id, CallbackTimes::Time begin);

    INavigatorListener& m_rClient;
    const std::string m_Name;
    CallbackTimes m_Times;
};

} // namespace bdmv

#endif
