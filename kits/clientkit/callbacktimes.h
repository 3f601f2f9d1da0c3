/**
 * @file
 * What CallbackWatch keeps: how long callbacks took, and when a slow one was last reported. It
 * reads no clock.
 */
#ifndef CLIENTKIT_CALLBACKTIMES_H
#define CLIENTKIT_CALLBACKTIMES_H

#include <chrono>
#include <cstddef>

#include "bd/threadmutex.h"
#include "bd/types.h"
#include "clientkit/callbackid.h"

namespace bdmv
{

/** The places of a histogram of times in microseconds. */
constexpr std::size_t TimePlaces = 24;

/** The time of every callback and the rate of reports. All operations may be called on any thread.
 */
class CallbackTimes
{
public:
    typedef std::chrono::steady_clock::duration Duration; ///< of a callback
    typedef std::chrono::steady_clock::time_point Time;   ///< when it began or ended

    /** The times of one callback. */
    struct Record {
        bd::UInt64 count;                 ///< how often it was called
        Duration longest;                 ///< the longest call
        Duration total;                   ///< all calls together
        bd::UInt64 histogram[TimePlaces]; ///< places as in CallbackWatch::Statistics
    };

    /** @param budget the longest time that is not reported; may be the largest value of its type */
    explicit CallbackTimes(std::chrono::microseconds budget);

    CallbackTimes(const CallbackTimes&) = delete;
    CallbackTimes& operator=(const CallbackTimes&) = delete;

    /**
     * Adds a callback.
     *
     * @param id a callback, not Callback__sizeof
     * @return whether to report it: it took longer than the budget, and none of its kind has been
     *         reported within the second before @p end
     */
    bool Add(CallbackId id, Time begin, Time end);

    /** The times of a callback so far; all zero for a value that is no callback. */
    Record Get(CallbackId id) const;

private:
    struct Entry {
        Record record;
        bool reported;
        Time lastReport; ///< if reported
    };

    const Duration m_Budget;
    bd::ThreadMutex m_Mutex; ///< guards m_Entries
    Entry m_Entries[Callback__sizeof];
};

} // namespace bdmv

#endif
