/**
 * @file
 * Counts the program's heap allocations, and makes them fail.
 *
 * @code
 * #include "testkit/allocationcounter.h"
 * #include "testkit/operatornew.h"   // in one source of the program
 *
 * const std::size_t before = bdmvtest::CountAllocations();
 * event.Dispatch(listeners);
 * EXPECT_EQ(bdmvtest::CountAllocations(), before);
 * @endcode
 *
 * Exactly one source of the program includes testkit/operatornew.h, which counts. A program without
 * it, or with two of them, does not link.
 */
#ifndef TESTKIT_ALLOCATIONCOUNTER_H
#define TESTKIT_ALLOCATIONCOUNTER_H

#include <cstddef>

namespace bdmvtest
{

/** The number of calls of the global operator new, in any form, by the calling thread so far. */
std::size_t CountAllocations();

/** The blocks that the calling thread has allocated, less those that it has freed. */
long CountLiveBlocks();

/**
 * Makes an allocation of the calling thread fail: with std::bad_alloc, or with a null pointer if it
 * is one with std::nothrow.
 *
 * @param countdown the number of allocations that still succeed first; negative for no failure
 */
void FailAllocationAfter(long countdown);

} // namespace bdmvtest

#endif
