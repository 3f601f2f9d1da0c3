/**
 * @file
 * Replaces all forms of the global operator new and operator delete in the whole program, for the
 * functions of testkit/allocationcounter.h.
 *
 * Include it in exactly one source of a program: its definitions are neither inline nor weak,
 * because the operators of a sanitizer's run-time library would take precedence over weak ones, and
 * the counts would stay 0 without notice.
 */
#ifndef TESTKIT_OPERATORNEW_H
#define TESTKIT_OPERATORNEW_H

#include <algorithm>
#include <cstdlib>
#include <new>

#include "testkit/allocationcounter.h"

namespace bdmvtest
{

/** The allocations of the calling thread. */
struct ThreadHeap {
    static inline thread_local std::size_t allocations = 0; ///< so far, failed ones included
    static inline thread_local long liveBlocks = 0;         ///< allocated less freed
    static inline thread_local long failureCountdown =
        -1; ///< allocations until one fails; negative for never

    /** A block for any type of fundamental alignment; null if the allocation fails. */
    static void* TryAllocate(std::size_t size)
    {
        return IsToFail() ? nullptr : Counted(std::malloc(size == 0 ? 1 : size));
    }

    /** A block with an alignment; null if the allocation fails. */
    static void* TryAllocate(std::size_t size, std::align_val_t alignment)
    {
        void* block = nullptr;
        const bool allocated =
            !IsToFail() &&
            posix_memalign(&block, std::max(static_cast<std::size_t>(alignment), sizeof(void*)),
                           size == 0 ? 1 : size) == 0;
        return allocated ? Counted(block) : nullptr;
    }

    /** TryAllocate() with the same arguments, but a failure throws std::bad_alloc. */
    template <typename... Arguments> static void* Allocate(Arguments... arguments)
    {
        void* const block = TryAllocate(arguments...);
        if (block == nullptr) {
            throw std::bad_alloc();
        }
        return block;
    }

    /** Frees what one of the above returned; null is ignored. */
    static void Free(void* block)
    {
        liveBlocks -= block != nullptr ? 1 : 0;
        std::free(block);
    }

private:
    static bool IsToFail()
    {
        ++allocations;
        return failureCountdown >= 0 && failureCountdown-- == 0;
    }

    static void* Counted(void* block)
    {
        liveBlocks += block != nullptr ? 1 : 0;
        return block;
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

// Every form is replaced: a sanitizer's run-time library has all of them, and its memory must not
// reach the operator delete of this file, nor the reverse.
/// @cond described at the top of this file

void* operator new(std::size_t size)
{
    return bdmvtest::ThreadHeap::Allocate(size);
}

void* operator new(std::size_t size, const std::nothrow_t& /*tag*/) noexcept
{
    return bdmvtest::ThreadHeap::TryAllocate(size);
}

void* operator new(std::size_t size, std::align_val_t alignment)
{
    return bdmvtest::ThreadHeap::Allocate(size, alignment);
}

void* operator new(std::size_t size, std::align_val_t alignment,
                   const std::nothrow_t& /*tag*/) noexcept
{
    return bdmvtest::ThreadHeap::TryAllocate(size, alignment);
}

void* operator new[](std::size_t size)
{
    return bdmvtest::ThreadHeap::Allocate(size);
}

void* operator new[](std::size_t size, const std::nothrow_t& /*tag*/) noexcept
{
    return bdmvtest::ThreadHeap::TryAllocate(size);
}

void* operator new[](std::size_t size, std::align_val_t alignment)
{
    return bdmvtest::ThreadHeap::Allocate(size, alignment);
}

void* operator new[](std::size_t size, std::align_val_t alignment,
                     const std::nothrow_t& /*tag*/) noexcept
{
    return bdmvtest::ThreadHeap::TryAllocate(size, alignment);
}

void operator delete(void* block) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

void operator delete(void* block, std::size_t /*size*/) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

void operator delete(void* block, const std::nothrow_t& /*tag*/) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

void operator delete(void* block, std::align_val_t /*alignment*/) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

void operator delete(void* block, std::size_t /*size*/, std::align_val_t /*alignment*/) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

void operator delete(void* block, std::align_val_t /*alignment*/,
                     const std::nothrow_t& /*tag*/) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

void operator delete[](void* block) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

void operator delete[](void* block, std::size_t /*size*/) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

void operator delete[](void* block, const std::nothrow_t& /*tag*/) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

void operator delete[](void* block, std::align_val_t /*alignment*/) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

void operator delete[](void* block, std::size_t /*size*/, std::align_val_t /*alignment*/) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

void operator delete[](void* block, std::align_val_t /*alignment*/,
                       const std::nothrow_t& /*tag*/) noexcept
{
    bdmvtest::ThreadHeap::Free(block);
}

/// @endcond

#endif
