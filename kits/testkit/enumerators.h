/**
 * @file
 * Names of enumerators, supplied by the compiler, so that no table repeats the declarations.
 */
#ifndef TESTKIT_ENUMERATORS_H
#define TESTKIT_ENUMERATORS_H

#include <array>
#include <cstddef>
#include <string_view>
#include <type_traits>
#include <utility>

namespace bdmvtest
{

/**
 * The name of a constant as the compiler spells it in the signature of this function.
 *
 * g++ and clang++ print an enumerator by its qualified name, and any other value as a cast:
 * "value = bd::PlaySpeedNormal;" or "value = (bd::PlaySpeedDef)99]".
 */
template <typename Enumeration, Enumeration value> constexpr std::string_view NameOfConstant()
{
    const std::string_view signature = __PRETTY_FUNCTION__;
    const std::string_view label = "value = ";
    const std::size_t begin = signature.find(label) + label.size();
    const std::string_view text =
        signature.substr(begin, signature.find_first_of(";]", begin) - begin);
    // Without a scope the search finds npos, and npos + 1 is the beginning.
    return text.front() == '(' ? std::string_view() : text.substr(text.rfind(':') + 1);
}

/** The names of the values from 0; empty where no enumerator has the value. */
template <typename Enumeration, std::size_t... values>
constexpr std::array<std::string_view, sizeof...(values)>
NamesOfConstants(std::index_sequence<values...>)
{
    return {NameOfConstant<Enumeration, static_cast<Enumeration>(values)>()...};
}

/**
 * Whether a type is an enumeration whose underlying type is fixed: only these have a value for
 * every integer, and only these can be initialised with one in braces.
 */
template <typename Type, typename = void> constexpr bool IsFixedEnumeration = false;
template <typename Type>
constexpr bool IsFixedEnumeration<Type, std::void_t<decltype(Type{0})>> = std::is_enum_v<Type>;

/**
 * The enumerator that has the value, without the scope it is declared in; empty when there is none
 * from 0 to 63. For enumerations whose underlying type is fixed.
 */
template <typename Enumeration> std::string_view EnumeratorName(Enumeration value)
{
    static constexpr auto names = NamesOfConstants<Enumeration>(std::make_index_sequence<64>());
    const auto index = static_cast<std::size_t>(value);
    return index < names.size() ? names[index] : std::string_view();
}

} // namespace bdmvtest

#endif
