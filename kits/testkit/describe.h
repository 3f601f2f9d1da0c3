/**
 * @file
 * Values and calls as they appear in a journal.
 */
#ifndef TESTKIT_DESCRIBE_H
#define TESTKIT_DESCRIBE_H

#include <string>
#include <string_view>

#include "bd/types.h"
#include "database/iprogramdata.h"
#include "database/uomasktable.h"
#include "testkit/enumerators.h"

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

inline std::string Describe(bool value);
inline std::string Describe(const bd::PlayMode& mode);
inline std::string Describe(const bd::Trigger& trigger);
inline std::string Describe(const bd::ZoomRectangleDef& rectangle);
inline std::string Describe(const bd::ZOOM_PARAM_Def& zoom);
inline std::string Describe(const bd::AudioInfoType& info);
inline std::string Describe(const bd::DataBlockDef& block);

/** The mask in its reported form. */
inline std::string Describe(const bdmv::UOMaskTable& mask);

/** The number of RefPtr objects that share the program, or that there is none. */
inline std::string Describe(const bdmv::IProgramData::RefPtr& program);

/** The bytes of a block and its size, in decimal. */
inline std::string DescribeBytes(const void* data, bd::UInt32 size);

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

inline std::string Describe(bool value)
{
    return value ? "true" : "false";
}

inline std::string Describe(const bd::PlayMode& mode)
{
    return "(" + DescribeAll(mode.Direction(), mode.Speed()) + ")";
}

inline std::string Describe(const bd::Trigger& trigger)
{
    return "(" + DescribeAll(trigger.triggerType) + ")";
}

inline std::string Describe(const bd::ZoomRectangleDef& rectangle)
{
    return "(" + DescribeAll(rectangle.X, rectangle.Y, rectangle.Width, rectangle.Height) + ")";
}

inline std::string Describe(const bd::ZOOM_PARAM_Def& zoom)
{
    return "(" + DescribeAll(zoom.rClipRectangle, zoom.rDestRectangle, zoom.u4Delay) + ")";
}

inline std::string Describe(const bd::AudioInfoType& info)
{
    return "(" +
           DescribeAll(info.format, info.sampleRate, info.bitsPerSampling, info.channels, info.pid,
                       info.u4AudChannelLayout) +
           ")";
}

inline std::string Describe(const bdmv::UOMaskTable& mask)
{
    return Describe(mask.GetUOMaskTable());
}

inline std::string DescribeBytes(const void* data, bd::UInt32 size)
{
    std::string text = data == nullptr ? "null" : "bytes";
    for (bd::UInt32 i = 0; data != nullptr && i < size; ++i) {
        text += " " + Describe(static_cast<const bd::UInt8*>(data)[i]);
    }
    return text + ", " + Describe(size);
}

inline std::string Describe(const bd::DataBlockDef& block)
{
    return "(" + DescribeBytes(block.pData, block.size) + ")";
}

inline std::string Describe(const bdmv::IProgramData::RefPtr& program)
{
    return program ? "program shared by " + Describe(program.GetCount()) : "no program";
}

} // namespace bdmvtest

#endif
