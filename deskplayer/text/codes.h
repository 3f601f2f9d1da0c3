/**
 * @file
 * Tables of codes and their meanings.
 */
#ifndef DESKPLAYER_TEXT_CODES_H
#define DESKPLAYER_TEXT_CODES_H

#include <algorithm>
#include <cstdint>
#include <iterator>

namespace deskplayer
{

/** A code used on discs and its name. */
struct CodeName {
    std::uint8_t code;
    const char* name;
};

/**
 * The entry of a table whose member `code` equals @p code; null if there is none.
 *
 * @param table an array; the returned pointer points into it
 */
template <typename Table, typename Code> auto FindCode(const Table& table, const Code& code)
{
    const auto entry =
        std::find_if(std::begin(table), std::end(table),
                     [&code](const auto& candidate) { return candidate.code == code; });
    return entry == std::end(table) ? nullptr : &*entry;
}

} // namespace deskplayer

#endif
