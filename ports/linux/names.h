/**
 * @file
 * The names of components and levels, as used in log lines and configuration texts.
 */
#ifndef KEVRO_NAMES_H
#define KEVRO_NAMES_H

#include <cstddef>
#include <string_view>

#include "kevro/kevro_types.h"

namespace kevro
{

/** A list of names and their numbers. */
class Names
{
public:
    struct Entry {
        KEVRO_UInt32 number;
        const char* name;
    };

    template <std::size_t Count>
    constexpr explicit Names(const Entry (&entries)[Count]) : m_pEntries(entries), m_Count(Count)
    {
    }

    const Entry* begin() const { return m_pEntries; }
    const Entry* end() const { return m_pEntries + m_Count; }

    /** The entry with this number, or null. */
    const Entry* Find(KEVRO_UInt32 number) const;

    /** The entry with this name, or null. */
    const Entry* Find(std::string_view name) const;

    /** The entry that @p word may be a misspelling of, or null. */
    const Entry* FindSimilar(std::string_view word) const;

private:
    const Entry* m_pEntries;
    std::size_t m_Count;
};

extern const Names Components;
extern const Names Levels;

} // namespace kevro

#endif
