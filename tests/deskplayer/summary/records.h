/**
 * @file
 * Recordings for tests of summaries.
 */
#ifndef TESTS_DESKPLAYER_SUMMARY_RECORDS_H
#define TESTS_DESKPLAYER_SUMMARY_RECORDS_H

#include <initializer_list>
#include <string>

#include "summary/recordingsummary.h"

namespace deskplayer
{

namespace callbacks = bdmv::callbacks;

/** The whole number of seconds. */
inline Ticks Seconds(std::uint64_t seconds)
{
    return std::chrono::duration<std::uint64_t>(seconds);
}

inline CallbackRecord At(std::uint64_t seconds, const bdmv::Callback& callback,
                         const ArgumentSet& absent = {})
{
    return {Seconds(seconds), callback, absent};
}

/** A callback that the event of the one before it has sent too. */
inline CallbackRecord ContinuingAt(Ticks time, const bdmv::Callback& callback)
{
    CallbackRecord record{time, callback, {}};
    record.continuesEvent = true;
    return record;
}

inline callbacks::UOMask Forbidding(std::initializer_list<bd::UserOperationMaskDef> operations)
{
    bd::UInt64 field = 0;
    for (const bd::UserOperationMaskDef operation : operations) {
        field |= (bd::UInt64{1} << 63) >> operation;
    }
    return {bdmv::UOMaskTable(field)};
}

} // namespace deskplayer

#endif
