/**
 * @file
 * Stream attributes that play lists and clip information files share.
 */
#ifndef DESKPLAYER_DISC_STREAMATTRIBUTES_H
#define DESKPLAYER_DISC_STREAMATTRIBUTES_H

#include <cstdint>
#include <string>

namespace deskplayer
{

/**
 * The attributes of a stream. A field that does not apply to this kind of stream is 0 or empty.
 * Codes are kept as read, including reserved ones; disc/codes.h names them.
 */
struct StreamAttributes {
    std::uint8_t codingType = 0;
    std::uint8_t videoFormat = 0;       ///< video
    std::uint8_t frameRate = 0;         ///< video
    std::uint8_t dynamicRange = 0;      ///< H.265 video
    std::uint8_t colourSpace = 0;       ///< H.265 video
    bool hdrFlag = false;               ///< H.265 video; meaning unknown
    bool dynamicMetadata = false;       ///< H.265 video: dynamic metadata is present
    std::uint8_t audioPresentation = 0; ///< audio
    std::uint8_t sampleRate = 0;        ///< audio
    std::uint8_t characterCode = 0;     ///< text subtitles
    std::string language;               ///< all but video; ISO 639-2 or any other three bytes,
                                        ///< empty if not given
};

} // namespace deskplayer

#endif
