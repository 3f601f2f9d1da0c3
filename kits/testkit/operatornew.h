/**
 * @file
 * Replaces the global operator new and operator delete of the whole program, for the functions of
 * testkit/allocationcounter.h.
 *
 * Include it in exactly one source of a program: its definitions are neither inline nor weak,
 * because the operators of a sanitizer's run-time library would take precedence over weak ones, and
 * the counts would stay 0 without notice.
 */
#ifndef TESTKIT_OPERATORNEW_H
#define TESTKIT_OPERATORNEW_H

#include <cstdlib>
#include <new>

#include "testkit/allocationcounter.h"

namespace bdmvtest
{

/** The allocations of the calling thread. */
struct ThreadHeap {
    static inline thread_local std::size_t allocations = 0;
    static inline thread_local long liveBlocks = 0;
    static inline thread_local long failureCountdown = -1;

    static void* Allocate(std::size_t size)
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

    static void Free(void* block)
    {
        if (block != nullptr) {
            --liveBlocks;
            std::free(block);
        }
    }
};

std::size_t CountAllocations()
{
    return ThreadHeap::allocations;
}

long CountLiveBlocks()
{
    return ThreadHeap::liveBlocks;
}

void FailAllocationAfter(long countdown)
{
    ThreadHeap::failureCountdown = countdown;
}

} // namespace bdmvtest

void* operator new(std::size_t size)
{
    return bdmvtest::ThreadHeap::Allocate(size);
}

void* operator new[](std::size_t size)
{
    return bdmvtest::ThreadHeap::Allocate(size);
}

void operator delete(void* block) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

void operator delete[](void* block) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

void operator delete(void* block, std::size_t) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

void operator delete[](void* block, std::size_t) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

#endif
