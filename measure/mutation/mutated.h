/**
 * @file
 * What a changed argument becomes: another value of its type. Added to every changed file.
 */
#ifndef MUTATION_MUTATED_H
#define MUTATION_MUTATED_H

#include <type_traits>

namespace mutation
{

constexpr bool Mutated(bool value)
{
    return !value;
}

template <typename T>
constexpr typename std::enable_if<std::is_arithmetic<T>::value || std::is_enum<T>::value, T>::type
Mutated(T value)
{
    return static_cast<T>(static_cast<long long>(value) + 1);
}

constexpr const char* Mutated(const char*)
{
    return "MUTATED";
}

/** Null, so that any use crashes at once; for a null pointer, another address. */
template <typename T> T* Mutated(T* pointer)
{
    return pointer == nullptr ? reinterpret_cast<T*>(alignof(void*)) : nullptr;
}

template <typename T>
typename std::enable_if<std::is_class<T>::value, T>::type Mutated(const T& /*value*/)
{
    return T();
}

} // namespace mutation

#endif
