#include "disc/codes.h"

#include "text/codes.h"
#include "text/printable.h"

namespace deskplayer
{

namespace
{

struct CodingType {
    std::uint8_t code;
    StreamKind kind;
    const char* name;
};

struct Language {
    const char* code;
    const char* name;
};

const CodingType g_CodingTypes[] = {
    {0x01, StreamKindVideo, "MPEG-1 video"},
    {0x02, StreamKindVideo, "MPEG-2 video"},
    {0x1B, StreamKindVideo, "H.264 video"},
    {0x20, StreamKindVideo, "H.264 video, dependent view"},
    {CodingTypeH265, StreamKindVideo, "H.265 video"},
    {0xEA, StreamKindVideo, "VC-1 video"},
    {0x03, StreamKindAudio, "MPEG-1 audio"},
    {0x04, StreamKindAudio, "MPEG-2 audio"},
    {0x80, StreamKindAudio, "LPCM audio"},
    {0x81, StreamKindAudio, "AC-3 audio"},
    {0x82, StreamKindAudio, "DTS audio"},
    {0x83, StreamKindAudio, "TrueHD audio"},
    {0x84, StreamKindAudio, "E-AC-3 audio"},
    {0x85, StreamKindAudio, "DTS-HD high resolution audio"},
    {0x86, StreamKindAudio, "DTS-HD master audio"},
    {0xA1, StreamKindAudio, "E-AC-3 audio, secondary"},
    {0xA2, StreamKindAudio, "DTS-HD audio, secondary"},
    {0x90, StreamKindGraphics, "presentation graphics"},
    {0x91, StreamKindGraphics, "interactive graphics"},
    {0x92, StreamKindTextSubtitle, "text subtitle"},
};

const CodeName g_VideoFormats[] = {
    {1, "480i"}, {2, "576i"},  {3, "480p"}, {4, "1080i"},
    {5, "720p"}, {6, "1080p"}, {7, "576p"}, {8, "2160p"},
};

const CodeName g_FrameRates[] = {
    {1, "23.976 Hz"}, {2, "24 Hz"}, {3, "25 Hz"}, {4, "29.97 Hz"}, {6, "50 Hz"}, {7, "59.94 Hz"},
};

const CodeName g_AspectRatios[] = {{2, "4:3"}, {3, "16:9"}};

const CodeName g_DynamicRanges[] = {{0, "standard"}, {1, "high"}, {2, "two-layer high"}};

const CodeName g_ColourSpaces[] = {{0, "not stated"}, {1, "BT.709"}, {2, "BT.2020"}};

const CodeName g_AudioPresentations[] = {
    {1, "mono"},
    {3, "stereo"},
    {6, "multichannel"},
    {12, "stereo with multichannel extension"},
};

const CodeName g_SampleRates[] = {
    {1, "48 kHz"},
    {4, "96 kHz"},
    {5, "192 kHz"},
    {12, "48 kHz with 192 kHz extension"},
    {14, "48 kHz with 96 kHz extension"},
};

const CodeName g_CharacterCodes[] = {
    {1, "UTF-8"},   {2, "UTF-16"}, {3, "Shift-JIS"}, {4, "EUC-KR"},
    {5, "GB18030"}, {6, "GB2312"}, {7, "Big5"},
};

const CodeName g_SubPathTypes[] = {
    {2, "audio of a slide show"},
    {3, "interactive graphics menu"},
    {4, "text subtitles"},
    {5, "synchronous streams of another clip"},
    {6, "asynchronous picture-in-picture of another clip"},
    {7, "picture-in-picture of the same clip"},
    {8, "stereoscopic video"},
    {9, "stereoscopic menu"},
    {10, "enhancement layer video"},
};

// Where ISO 639-2 has two codes for a language, discs use either.
const Language g_Languages[] = {
    {"ara", "Arabic"},     {"bul", "Bulgarian"},  {"cat", "Catalan"},   {"ces", "Czech"},
    {"chi", "Chinese"},    {"cze", "Czech"},      {"dan", "Danish"},    {"deu", "German"},
    {"dut", "Dutch"},      {"ell", "Greek"},      {"eng", "English"},   {"est", "Estonian"},
    {"fas", "Persian"},    {"fin", "Finnish"},    {"fra", "French"},    {"fre", "French"},
    {"ger", "German"},     {"gre", "Greek"},      {"heb", "Hebrew"},    {"hin", "Hindi"},
    {"hrv", "Croatian"},   {"hun", "Hungarian"},  {"ice", "Icelandic"}, {"ind", "Indonesian"},
    {"isl", "Icelandic"},  {"ita", "Italian"},    {"jpn", "Japanese"},  {"kor", "Korean"},
    {"lav", "Latvian"},    {"lit", "Lithuanian"}, {"may", "Malay"},     {"msa", "Malay"},
    {"nld", "Dutch"},      {"nor", "Norwegian"},  {"per", "Persian"},   {"pol", "Polish"},
    {"por", "Portuguese"}, {"ron", "Romanian"},   {"rum", "Romanian"},  {"rus", "Russian"},
    {"slk", "Slovak"},     {"slo", "Slovak"},     {"slv", "Slovenian"}, {"spa", "Spanish"},
    {"srp", "Serbian"},    {"swe", "Swedish"},    {"tam", "Tamil"},     {"tel", "Telugu"},
    {"tha", "Thai"},       {"tur", "Turkish"},    {"ukr", "Ukrainian"}, {"und", "undetermined"},
    {"vie", "Vietnamese"}, {"zho", "Chinese"},
};

template <typename Table> std::string NameOf(const Table& table, std::uint8_t code)
{
    const auto* const entry = FindCode(table, code);
    return entry ? entry->name : "reserved (" + std::to_string(code) + ")";
}

} // namespace

StreamKind KindOfStream(std::uint8_t codingType)
{
    const CodingType* const entry = FindCode(g_CodingTypes, codingType);
    return entry ? entry->kind : StreamKindUnknown;
}

std::string CodingTypeName(std::uint8_t codingType)
{
    return NameOf(g_CodingTypes, codingType);
}

std::string VideoFormatName(std::uint8_t videoFormat)
{
    return NameOf(g_VideoFormats, videoFormat);
}

std::string FrameRateName(std::uint8_t frameRate)
{
    return NameOf(g_FrameRates, frameRate);
}

std::string AspectRatioName(std::uint8_t aspectRatio)
{
    return NameOf(g_AspectRatios, aspectRatio);
}

std::string DynamicRangeName(std::uint8_t dynamicRange)
{
    return NameOf(g_DynamicRanges, dynamicRange);
}

std::string ColourSpaceName(std::uint8_t colourSpace)
{
    return NameOf(g_ColourSpaces, colourSpace);
}

std::string AudioPresentationName(std::uint8_t code)
{
    return NameOf(g_AudioPresentations, code);
}

std::string SampleRateName(std::uint8_t sampleRate)
{
    return NameOf(g_SampleRates, sampleRate);
}

std::string CharacterCodeName(std::uint8_t characterCode)
{
    return NameOf(g_CharacterCodes, characterCode);
}

std::string SubPathTypeName(std::uint8_t subPathType)
{
    return NameOf(g_SubPathTypes, subPathType);
}

std::string LanguageName(const std::string& language)
{
    if (language.empty()) {
        return "no language";
    }
    const Language* const entry = FindCode(g_Languages, language);
    return entry ? entry->name : Printable(language);
}

} // namespace deskplayer
