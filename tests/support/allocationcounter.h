/**
 * @file
 * Counts the program's heap allocations.
 *
 * Linking it replaces the global operator new and operator delete of the whole program.
 */
#ifndef SUPPORT_ALLOCATIONCOUNTER_H
#define SUPPORT_ALLOCATIONCOUNTER_H

#include <cstddef>

namespace bdmvtest
{

/** The number of calls of the global operator new by the calling thread so far. */
std::size_t CountAllocations();

/** The blocks that the calling thread has allocated, less those that it has freed. */
long CountLiveBlocks();

/**
 * Makes an allocation of the calling thread fail with std::bad_alloc.
 *
 * @param countdown the number of allocations that still succeed first; negative for no failure
 */
void FailAllocationAfter(long countdown);

} // namespace bdmvtest

#endif
