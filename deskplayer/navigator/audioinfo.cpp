#include "navigator/audioinfo.h"

namespace deskplayer
{

namespace
{

bd::AudioFormatType FormatOf(std::uint8_t codingType)
{
    switch (codingType) {
    case 0x03:
    case 0x04:
        return bd::AudioFormatMpeg;
    case 0x80:
        return bd::AudioFormatPcm;
    case 0x81:
        return bd::AudioFormatAc3;
    case 0x82:
        return bd::AudioFormatDts;
    case 0x83:
        return bd::AudioFormatLossless;
    case 0x84:
        return bd::AudioFormatEac3;
    case 0x85:
        return bd::AudioFormatDtshdPriNoXll;
    case 0x86:
        return bd::AudioFormatDtshdPriXll;
    case 0xA1:
        return bd::AudioFormatEac3Sec;
    case 0xA2:
        return bd::AudioFormatDtshdSec;
    default:
        return bd::AudioFormatUnknown;
    }
}

bd::AudioSampleRateType SampleRateOf(std::uint8_t code)
{
    switch (code) {
    case 1:
        return bd::AudioSampleRate_48000;
    case 4:
    case 14:
        return bd::AudioSampleRate_96000;
    case 5:
    case 12:
        return bd::AudioSampleRate_192000;
    default:
        return bd::AudioSampleRateUnknown;
    }
}

bd::AudioChannelType ChannelsOf(std::uint8_t presentation)
{
    switch (presentation) {
    case 1:
        return bd::AudioChannelTypeMono;
    case 3:
        return bd::AudioChannelTypeStereo;
    case 6:
    case 12:
        return bd::AudioChannelTypeMultiCh;
    default:
        return bd::AudioChannelTypeUnknown;
    }
}

} // namespace

bd::AudioInfoType AudioInfoOf(const Stream& stream)
{
    bd::AudioInfoType info;
    info.format = FormatOf(stream.attributes.codingType);
    info.sampleRate = SampleRateOf(stream.attributes.sampleRate);
    info.channels = ChannelsOf(stream.attributes.audioPresentation);
    info.pid = stream.pid;
    return info;
}

} // namespace deskplayer
