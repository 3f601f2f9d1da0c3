/**
 * @file
 * What a play list and a clip information file both say about a stream.
 */
#ifndef DESKPLAYER_DISC_STREAMATTRIBUTES_H
#define DESKPLAYER_DISC_STREAMATTRIBUTES_H

#include <cstdint>
#include <string>

namespace deskplayer
{

/**
 * What a stream is. A field that this kind of stream does not have is 0 or empty. Codes are passed
 * on as they are read, reserved ones too; disc/codes.h names them.
 */
struct StreamAttributes {
    std::uint8_t codingType = 0;
    std::uint8_t videoFormat = 0;       ///< video
    std::uint8_t frameRate = 0;         ///< video
    std::uint8_t dynamicRange = 0;      ///< H.265 video
    std::uint8_t colourSpace = 0;       ///< H.265 video
    bool hdrFlag = false;               ///< H.265 video; what it means is not known
    bool dynamicMetadata = false;       ///< H.265 video: dynamic metadata is present
    std::uint8_t audioPresentation = 0; ///< audio
    std::uint8_t sampleRate = 0;        ///< audio
    std::uint8_t characterCode = 0;     ///< text subtitles
    std::string language;               ///< all but video; ISO 639-2 or any other three bytes,
                                        ///< empty if not given
};

} // namespace deskplayer

#endif
