/**
 * @file
 * What outputs show of the arguments of a callback.
 */
#ifndef DESKPLAYER_OUTPUT_ARGUMENTS_H
#define DESKPLAYER_OUTPUT_ARGUMENTS_H

#include <cstddef>
#include <cstdint>
#include <string>
#include <type_traits>
#include <vector>

#include "clientkit/callback.h"
#include "output/record.h"
#include "text/names.h"

namespace deskplayer
{

/** A position on the time line of the play list, in 45 kHz ticks; or bd::TimePositionNone. */
struct Position {
    bd::TimePosition ticks;
};

/** Numbers; enumerators by name. */
template <typename Value> auto Shown(const Value& value)
{
    if constexpr (std::is_enum_v<Value>) {
        return NameOrNumber(value);
    } else {
        return std::uint64_t{value};
    }
}

inline bool Shown(bool value)
{
    return value;
}

inline Position Shown(bd::TimePosition ticks)
{
    return {ticks};
}

inline const bd::ZoomRectangleDef& Shown(const bd::ZoomRectangleDef& rectangle)
{
    return rectangle;
}

/** The operations that are forbidden at this time: a debug override may change them. */
inline std::vector<std::string> Shown(const bdmv::UOMaskTable& mask)
{
    return NamesOf(mask);
}

inline std::string Shown(const bdmv::Bytes& bytes)
{
    return HexOf(bytes);
}

/** The number of commands. */
inline std::uint64_t Shown(const bdmv::IProgramData::RefPtr& program)
{
    return program ? program->GetNumberOfNavigationCommands() : 0;
}

/** What a record knows of an argument: all of it. */
template <typename Value> const Value& Known(const CallbackRecord& /*record*/, const Value& value)
{
    return value;
}

/** A block may be known only in part. */
inline bdmv::Bytes Known(const CallbackRecord& record, const bdmv::Bytes& block)
{
    return {block.data, record.knownBytes.value_or(block.size)};
}

/**
 * Calls @p visitor with the name and the value of each argument that is not absent, in order.
 *
 * @param visitor as for bdmv::Callback::VisitArguments()
 */
template <typename Visitor>
void VisitPresentArguments(const CallbackRecord& record, Visitor&& visitor)
{
    std::size_t position = 0;
    record.callback.VisitArguments([&](const char* name, const auto& value) {
        if (!record.absent[position++]) {
            visitor(name, Known(record, value));
        }
    });
}

/**
 * Calls @p visitor with the name of each argument that is not absent and what is shown of it, in
 * order.
 *
 * @param visitor callable with a `const char*` and each of: `bool`, `std::uint64_t`, Position,
 *        `std::string`, `std::vector<std::string>`, bd::ZoomRectangleDef
 */
template <typename Visitor>
void VisitShownArguments(const CallbackRecord& record, const Visitor& visitor)
{
    VisitPresentArguments(
        record, [&visitor](const char* name, const auto& value) { visitor(name, Shown(value)); });
}

} // namespace deskplayer

#endif
