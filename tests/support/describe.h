/**
 * @file
 * Values and calls as they appear in a journal.
 */
#ifndef SUPPORT_DESCRIBE_H
#define SUPPORT_DESCRIBE_H

#include <string>
#include <string_view>

#include "bd/types.h"
#include "database/iprogramdata.h"
#include "database/uomasktable.h"
#include "support/enumerators.h"

namespace bdmvtest
{

/**
 * Enumerators of the library by name; integers, and values that no enumerator has, in decimal.
 */
template <typename Value> std::string Describe(Value value)
{
    if constexpr (IsFixedEnumeration<Value>) {
        const std::string_view name = EnumeratorName(value);
        if (!name.empty()) {
            return std::string(name);
        }
    }
    return std::to_string(+value);
}

std::string Describe(bool value);
std::string Describe(const bd::PlayMode& mode);
std::string Describe(const bd::Trigger& trigger);
std::string Describe(const bd::ZoomRectangleDef& rectangle);
std::string Describe(const bd::ZOOM_PARAM_Def& zoom);
std::string Describe(const bd::AudioInfoType& info);
std::string Describe(const bd::DataBlockDef& block);

/** The mask in its reported form. */
std::string Describe(const bdmv::UOMaskTable& mask);

/** The number of RefPtr objects that share the program, or that there is none. */
std::string Describe(const bdmv::IProgramData::RefPtr& program);

/** The bytes of a block and its size, in decimal. */
std::string DescribeBytes(const void* data, bd::UInt32 size);

/** The values, separated by commas. */
template <typename... Values> std::string DescribeAll(const Values&... values)
{
    std::string text;
    ((text += (text.empty() ? "" : ", ") + Describe(values)), ...);
    return text;
}

/** A call: its name and its arguments. */
template <typename... Arguments>
std::string DescribeCall(const std::string& name, const Arguments&... arguments)
{
    return name + "(" + DescribeAll(arguments...) + ")";
}

} // namespace bdmvtest

#endif
