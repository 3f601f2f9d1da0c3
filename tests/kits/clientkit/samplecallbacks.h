/**
 * @file
 * Callbacks for tests of what writes and keeps them.
 */
#ifndef TESTS_KITS_CLIENTKIT_SAMPLECALLBACKS_H
#define TESTS_KITS_CLIENTKIT_SAMPLECALLBACKS_H

#include <vector>

#include "clientkit/callback.h"

namespace bdmvtest
{

/**
 * EveryCallback(), then callbacks whose arguments are extreme: the greatest numbers, values without
 * a name, no position, no program, no block.
 */
std::vector<bdmv::Callback> SampleCallbacks();

/** The time of the next callback, in ticks: the times grow beyond 32 bits. */
constexpr bd::UInt64 NextSampleTime(bd::UInt64 time)
{
    return time + time / 2 + 1117;
}

} // namespace bdmvtest

#endif
