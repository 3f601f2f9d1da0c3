#include "support/describe.h"

namespace bdmvtest
{

std::string Describe(bool value)
{
    return value ? "true" : "false";
}

std::string Describe(const bd::PlayMode& mode)
{
    return "(" + DescribeAll(mode.Direction(), mode.Speed()) + ")";
}

std::string Describe(const bd::Trigger& trigger)
{
    return "(" + DescribeAll(trigger.triggerType) + ")";
}

std::string Describe(const bd::ZoomRectangleDef& rectangle)
{
    return "(" + DescribeAll(rectangle.X, rectangle.Y, rectangle.Width, rectangle.Height) + ")";
}

std::string Describe(const bd::ZOOM_PARAM_Def& zoom)
{
    return "(" + DescribeAll(zoom.rClipRectangle, zoom.rDestRectangle, zoom.u4Delay) + ")";
}

std::string Describe(const bd::AudioInfoType& info)
{
    return "(" +
           DescribeAll(info.format, info.sampleRate, info.bitsPerSampling, info.channels, info.pid,
                       info.u4AudChannelLayout) +
           ")";
}

std::string Describe(const bdmv::UOMaskTable& mask)
{
    return Describe(mask.GetUOMaskTable());
}

std::string DescribeBytes(const void* data, bd::UInt32 size)
{
    std::string text = data == nullptr ? "null" : "bytes";
    for (bd::UInt32 i = 0; data != nullptr && i < size; ++i) {
        text += " " + Describe(static_cast<const bd::UInt8*>(data)[i]);
    }
    return text + ", " + Describe(size);
}

std::string Describe(const bd::DataBlockDef& block)
{
    return "(" + DescribeBytes(block.pData, block.size) + ")";
}

std::string Describe(const bdmv::IProgramData::RefPtr& program)
{
    return program ? "program shared by " + Describe(program.GetCount()) : "no program";
}

} // namespace bdmvtest
