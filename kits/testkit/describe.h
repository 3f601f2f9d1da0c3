/**
 * @file
 * Values and calls as they appear in a journal and in failures of GoogleTest.
 *
 * @code
 * bdmvtest::Describe(bd::PlaySpeedFast2);                   // "PlaySpeedFast2"
 * bdmvtest::DescribeCall("TriggerSet", bd::TRIGGER_B, true); // "TriggerSet(TRIGGER_B, true)"
 *
 * EXPECT_EQ(mode.Speed(), bd::PlaySpeedFast2);              // a failure names both
 * @endcode
 *
 * A program that prints the library's types in GoogleTest's messages includes this header, or one
 * that includes it, in every source that does; else GoogleTest may print numbers in all of them.
 */
#ifndef TESTKIT_DESCRIBE_H
#define TESTKIT_DESCRIBE_H

#include <ostream>
#include <string>
#include <string_view>

#include "bd/types.h"
#include "bdmvnavigator/inavcontrollistener.h"
#include "clientkit/names.h"
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
/** The bytes and their number; "null" for a null pointer. */
inline std::string DescribeBytes(const void* data, bd::UInt32 size);

/** Appends to a list that is separated by commas. */
inline void AppendTo(std::string& list, const std::string& text)
{
    list += (list.empty() ? "" : ", ") + text;
}

/** The values, separated by commas. */
template <typename... Values> std::string DescribeAll(const Values&... values)
{
    std::string list;
    (AppendTo(list, Describe(values)), ...);
    return list;
}

/** A call: its name and its arguments. */
template <typename... Arguments>
std::string DescribeCall(const std::string& name, const Arguments&... arguments)
{
    return name + "(" + DescribeAll(arguments...) + ")";
}

/** "true" or "false". */
inline std::string Describe(bool value)
{
    return value ? "true" : "false";
}

/** Direction and speed. */
inline std::string Describe(const bd::PlayMode& mode)
{
    return "(" + DescribeAll(mode.Direction(), mode.Speed()) + ")";
}

/** The kind of trigger. */
inline std::string Describe(const bd::Trigger& trigger)
{
    return "(" + DescribeAll(trigger.triggerType) + ")";
}

/** Left, top, width, height. */
inline std::string Describe(const bd::ZoomRectangleDef& rectangle)
{
    return "(" + DescribeAll(rectangle.X, rectangle.Y, rectangle.Width, rectangle.Height) + ")";
}

/** Both rectangles and the delay. */
inline std::string Describe(const bd::ZOOM_PARAM_Def& zoom)
{
    return "(" + DescribeAll(zoom.rClipRectangle, zoom.rDestRectangle, zoom.u4Delay) + ")";
}

/** All attributes. */
inline std::string Describe(const bd::AudioInfoType& info)
{
    return "(" +
           DescribeAll(info.format, info.sampleRate, info.bitsPerSampling, info.channels, info.pid,
                       info.u4AudChannelLayout) +
           ")";
}

/** The mask as it is reported, as a number. */
inline std::string Describe(const bdmv::UOMaskTable& mask)
{
    return Describe(mask.GetUOMaskTable());
}

/** The bytes and their number; "null" for a null pointer. */
inline std::string DescribeBytes(const void* data, bd::UInt32 size)
{
    std::string text = data == nullptr ? "null" : "bytes";
    for (bd::UInt32 i = 0; data != nullptr && i < size; ++i) {
        text += " " + Describe(static_cast<const bd::UInt8*>(data)[i]);
    }
    return text + ", " + Describe(size);
}

/** The bytes and their number. */
inline std::string Describe(const bd::DataBlockDef& block)
{
    return "(" + DescribeBytes(block.pData, block.size) + ")";
}

/** How many pointers share the program. */
inline std::string Describe(const bdmv::IProgramData::RefPtr& program)
{
    return program ? "program shared by " + Describe(program.GetCount()) : "no program";
}

/** The operations that a mask forbids, as the mask is reported. */
inline std::string DescribeOperations(const bdmv::UOMaskTable& mask)
{
    std::string operations;
    for (const auto& operation : bdmv::NamesOf<bd::UserOperationMaskDef>()) {
        if (mask.IsSet(operation.code)) {
            AppendTo(operations, operation.name);
        }
    }
    return "{" + operations + "}";
}

} // namespace bdmvtest

// GoogleTest prints with these functions, which need nothing of it.

namespace bdmv
{

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(INavControlListener::FinishedReason reason, std::ostream* stream)
{
    *stream << bdmvtest::Describe(reason);
}

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(const UOMaskTable& mask, std::ostream* stream)
{
    *stream << bdmvtest::DescribeOperations(mask);
}

} // namespace bdmv

namespace bd
{

// Enumerators as a source writes them. These are no templates, because those would compete with the
// one of GoogleTest.

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(PlayDirectionDef direction, std::ostream* stream)
{
    *stream << bdmvtest::Describe(direction);
}

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(PlaySpeedDef speed, std::ostream* stream)
{
    *stream << bdmvtest::Describe(speed);
}

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(TriggerType type, std::ostream* stream)
{
    *stream << bdmvtest::Describe(type);
}

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(VideoFormatType format, std::ostream* stream)
{
    *stream << bdmvtest::Describe(format);
}

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(VideoAspectRatioType aspectRatio, std::ostream* stream)
{
    *stream << bdmvtest::Describe(aspectRatio);
}

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(AudioFormatType format, std::ostream* stream)
{
    *stream << bdmvtest::Describe(format);
}

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(AudioSampleRateType sampleRate, std::ostream* stream)
{
    *stream << bdmvtest::Describe(sampleRate);
}

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(AudioBitsPerSamplingType bitsPerSample, std::ostream* stream)
{
    *stream << bdmvtest::Describe(bitsPerSample);
}

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(AudioChannelType channels, std::ostream* stream)
{
    *stream << bdmvtest::Describe(channels);
}

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(UserOperationMaskDef operation, std::ostream* stream)
{
    *stream << bdmvtest::Describe(operation);
}

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(const AudioInfoType& info, std::ostream* stream)
{
    *stream << bdmvtest::Describe(info);
}

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(const PlayMode& mode, std::ostream* stream)
{
    *stream << bdmvtest::Describe(mode);
}

/** Prints with bdmvtest::Describe(); called by GoogleTest. */
inline void PrintTo(const ZOOM_PARAM_Def& zoom, std::ostream* stream)
{
    *stream << bdmvtest::Describe(zoom);
}

} // namespace bd

#endif
