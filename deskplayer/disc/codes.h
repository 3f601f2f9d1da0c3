/**
 * @file
 * Names of the codes used on discs, for people to read.
 *
 * A code without a name is given as "reserved (7)", so the text is never empty.
 */
#ifndef DESKPLAYER_DISC_CODES_H
#define DESKPLAYER_DISC_CODES_H

#include <cstdint>
#include <string>

namespace deskplayer
{

/** Determines the attributes of a stream. */
enum StreamKind {
    StreamKindUnknown,
    StreamKindVideo,
    StreamKindAudio,
    StreamKindGraphics,
    StreamKindTextSubtitle
};

/** The only coding type with attributes that others of its kind lack. */
constexpr std::uint8_t CodingTypeH265 = 0x24;

/** The kind of a stream with @p codingType; StreamKindUnknown for reserved ones. */
StreamKind KindOfStream(std::uint8_t codingType);

std::string CodingTypeName(std::uint8_t codingType);       ///< "H.264 video"
std::string VideoFormatName(std::uint8_t videoFormat);     ///< "1080p"
std::string FrameRateName(std::uint8_t frameRate);         ///< "29.97 Hz"
std::string AspectRatioName(std::uint8_t aspectRatio);     ///< "16:9"
std::string DynamicRangeName(std::uint8_t dynamicRange);   ///< "high"
std::string ColourSpaceName(std::uint8_t colourSpace);     ///< "BT.2020"
std::string AudioPresentationName(std::uint8_t code);      ///< "stereo"
std::string SampleRateName(std::uint8_t sampleRate);       ///< "48 kHz"
std::string CharacterCodeName(std::uint8_t characterCode); ///< "UTF-8"
std::string SubPathTypeName(std::uint8_t subPathType);     ///< "text subtitles"

/**
 * The English name of a language code of ISO 639-2. The code itself, made printable, if it is not
 * common on discs; "no language" for an empty one.
 */
std::string LanguageName(const std::string& language);

} // namespace deskplayer

#endif
