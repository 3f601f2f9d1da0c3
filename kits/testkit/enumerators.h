/**
 * @file
 * Names of enumerators, supplied by the compiler, so that no table repeats the declarations.
 *
 * @code
 * bdmvtest::EnumeratorName(bd::PlaySpeedFast2); // "PlaySpeedFast2"
 * @endcode
 */
#ifndef TESTKIT_ENUMERATORS_H
#define TESTKIT_ENUMERATORS_H

#include <cstddef>
#include <string_view>
#include <type_traits>
#include <utility>

namespace bdmvtest
{

/**
 * The constants from 0 as the compiler spells them in the signature of this function, one after the
 * other.
 *
 * g++ and clang++ print an enumerator by its qualified name, and any other value as a cast:
 * "values = {bd::PlaySpeedNormal, (bd::PlaySpeedDef)18}]", clang++ in angle brackets. All constants
 * share one function, because the compiler takes long for one function each.
 */
template <typename Enumeration, Enumeration... values> std::string_view SpellConstants()
{
    const std::string_view signature = __PRETTY_FUNCTION__;
    const std::string_view label = "values = ";
    return signature.substr(signature.find(label) + label.size() + 1);
}

/** SpellConstants() of the numbers of a sequence. */
template <typename Enumeration, std::size_t... values>
std::string_view SpellConstantsFrom0(std::index_sequence<values...>)
{
    return SpellConstants<Enumeration, static_cast<Enumeration>(values)...>();
}

/**
 * Whether a type is an enumeration whose underlying type is fixed: only these have a value for
 * every integer, and only these can be initialised with one in braces.
 */
template <typename Type, typename = void> constexpr bool IsFixedEnumeration = false;
template <typename Type>
constexpr bool IsFixedEnumeration<Type, std::void_t<decltype(Type{0})>> = std::is_enum_v<Type>;

/** The constant at a place in the list that SpellConstants() returns, without its scope; empty
 * where it is a cast.
 */
inline std::string_view NameInList(std::string_view constants, std::size_t place)
{
    for (; place != 0; --place) {
        constants.remove_prefix(constants.find(", ") + 2);
    }
    const std::string_view text = constants.substr(0, constants.find_first_of(",}>"));
    // Without a scope the search finds npos, and npos + 1 is the beginning.
    return text.front() == '(' ? std::string_view() : text.substr(text.rfind(':') + 1);
}

/**
 * The enumerator that has the value, without the scope it is declared in; empty when there is none
 * from 0 to 63. For enumerations whose underlying type is fixed.
 */
template <typename Enumeration> std::string_view EnumeratorName(Enumeration value)
{
    const auto index = static_cast<std::size_t>(value);
    if (index >= 64) {
        return std::string_view();
    }
    return NameInList(SpellConstantsFrom0<Enumeration>(std::make_index_sequence<64>()), index);
}

} // namespace bdmvtest

#endif
