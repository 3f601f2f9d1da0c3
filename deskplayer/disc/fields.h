/**
 * @file
 * Readers for structures that several kinds of files share.
 */
#ifndef DESKPLAYER_DISC_FIELDS_H
#define DESKPLAYER_DISC_FIELDS_H

#include <cstddef>
#include <cstdint>
#include <string>

#include "disc/bytereader.h"
#include "disc/streamattributes.h"

namespace deskplayer
{

/** Size of the header of every file, in bytes; addresses within it are invalid. */
constexpr std::size_t FileHeaderSize = 40;

/**
 * Reads the type indicator and the version at the start of a file.
 *
 * @return the version
 * @throw FormatError the file has another type or an unknown version
 */
std::string ReadTypeAndVersion(ByteReader& reader, const std::string& typeIndicator);

/** Reads video format and frame rate, which share a byte. */
void ReadVideoFormat(ByteReader& reader, StreamAttributes& attributes);

/** Reads dynamic range and colour space, which share a byte. */
void ReadDynamicRange(ByteReader& reader, StreamAttributes& attributes);

/**
 * Reads the attributes of audio, graphics and text subtitles, which have the same layout in all
 * files, unlike those of video. Reads nothing for any other coding type.
 */
void ReadAttributesOtherThanVideo(ByteReader& reader, StreamAttributes& attributes);

/** Bit number @p bit of @p field; the most significant bit is number 0. */
template <typename Field> constexpr bool Bit(Field field, unsigned bit)
{
    return (field >> (8 * sizeof(Field) - 1 - bit) & 1) != 0;
}

constexpr std::uint8_t HighHalf(std::uint8_t byte)
{
    return byte >> 4;
}
constexpr std::uint8_t LowHalf(std::uint8_t byte)
{
    return byte & 0xF;
}

} // namespace deskplayer

#endif
