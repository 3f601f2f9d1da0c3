/**
 * @file
 * The places of virtual operations in the virtual table, in every ABI that follows the Itanium C++
 * ABI.
 */
#ifndef TESTS_BDMV_BDMVNAVIGATOR_VIRTUALSLOT_H
#define TESTS_BDMV_BDMVNAVIGATOR_VIRTUALSLOT_H

#include <cstdint>
#include <cstring>

namespace bdmvtest
{

inline constexpr long DestructorSlots = 2; ///< come first
inline constexpr long NotVirtual = -1;

// Where the lowest bit of a function's address is in use, the adjustment of the object is doubled
// and its lowest bit marks a virtual function.
#if defined(__arm__) || defined(__aarch64__) || defined(__mips__)
inline constexpr bool MarkIsInAdjustment = true;
#else
inline constexpr bool MarkIsInAdjustment = false;
#endif

/**
 * The slot of a virtual member function in the virtual table, from 0: the one that a call by name
 * uses.
 */
template <typename Function> long SlotOf(Function function)
{
    struct {
        std::intptr_t pointer; // to the function; for a virtual one its offset in the table
        std::intptr_t adjustment;
    } parts;
    static_assert(sizeof(parts) == sizeof(function), "a pointer to member of the Itanium C++ ABI");
    std::memcpy(&parts, &function, sizeof(parts));

    const std::intptr_t size = sizeof(void*);
    if (MarkIsInAdjustment) {
        return (parts.adjustment & 1) != 0 ? parts.pointer / size : NotVirtual;
    }
    return (parts.pointer & 1) != 0 ? (parts.pointer - 1) / size : NotVirtual;
}

} // namespace bdmvtest

#endif
