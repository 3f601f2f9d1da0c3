/**
 * @file
 * Counts what the program takes from the heap.
 *
 * Linking it replaces the global operator new and operator delete of the whole program.
 */
#ifndef SUPPORT_ALLOCATIONCOUNTER_H
#define SUPPORT_ALLOCATIONCOUNTER_H

#include <cstddef>

namespace bdmvtest
{

/** How often the calling thread has called the global operator new so far. */
std::size_t CountAllocations();

/** How many of the blocks the calling thread allocated or freed are still there. */
long CountLiveBlocks();

/**
 * Makes an allocation of the calling thread fail with std::bad_alloc.
 *
 * @param countdown how many allocations still succeed before; a negative value ends it
 */
void FailAllocationAfter(long countdown);

} // namespace bdmvtest

#endif
