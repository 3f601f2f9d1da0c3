#include "support/allocationcounter.h"

#include <cstdlib>
#include <new>

namespace
{

thread_local std::size_t allocations = 0;
thread_local long liveBlocks = 0;
thread_local long failureCountdown = -1;

void* Allocate(std::size_t size)
{
    ++allocations;
    if (failureCountdown >= 0 && failureCountdown-- == 0) {
        throw std::bad_alloc();
    }
    void* const block = std::malloc(size == 0 ? 1 : size);
    if (block == nullptr) {
        throw std::bad_alloc();
    }
    ++liveBlocks;
    return block;
}

void Free(void* block)
{
    if (block != nullptr) {
        --liveBlocks;
        std::free(block);
    }
}

} // namespace

void* operator new(std::size_t size)
{
    return Allocate(size);
}

void* operator new[](std::size_t size)
{
    return Allocate(size);
}

void operator delete(void* block) noexcept
{
    Free(block);
}

void operator delete[](void* block) noexcept
{
    Free(block);
}

void operator delete(void* block, std::size_t) noexcept
{
    Free(block);
}

void operator delete[](void* block, std::size_t) noexcept
{
    Free(block);
}

namespace bdmvtest
{

std::size_t CountAllocations()
{
    return allocations;
}

long CountLiveBlocks()
{
    return liveBlocks;
}

void FailAllocationAfter(long countdown)
{
    failureCountdown = countdown;
}

} // namespace bdmvtest
