#include "disc/fields.h"

#include "disc/codes.h"
#include "disc/errors.h"
#include "text/printable.h"

namespace deskplayer
{

std::string ReadTypeAndVersion(ByteReader& reader, const std::string& typeIndicator)
{
    const std::size_t offset = reader.Offset();
    const std::string type = reader.Text(4, "type indicator");
    if (type != typeIndicator) {
        reader.Fail(offset, "type indicator is \"" + Printable(type) + "\"",
                    "\"" + typeIndicator + "\"");
    }
    std::string version = reader.Text(4, "version");
    if (version != "0100" && version != "0200" && version != "0240" && version != "0300") {
        reader.Fail(offset + 4, "version is \"" + Printable(version) + "\"",
                    R"("0100", "0200", "0240" or "0300")");
    }
    return version;
}

void ReadVideoFormat(ByteReader& reader, StreamAttributes& attributes)
{
    const std::uint8_t formatAndRate = reader.UInt8("video format and frame rate");
    attributes.videoFormat = HighHalf(formatAndRate);
    attributes.frameRate = LowHalf(formatAndRate);
}

void ReadDynamicRange(ByteReader& reader, StreamAttributes& attributes)
{
    const std::uint8_t rangeAndSpace = reader.UInt8("dynamic range and colour space");
    attributes.dynamicRange = HighHalf(rangeAndSpace);
    attributes.colourSpace = LowHalf(rangeAndSpace);
}

void ReadAttributesOtherThanVideo(ByteReader& reader, StreamAttributes& attributes)
{
    const StreamKind kind = KindOfStream(attributes.codingType);
    if (kind == StreamKindAudio) {
        const std::uint8_t presentationAndRate = reader.UInt8("audio presentation and sample rate");
        attributes.audioPresentation = HighHalf(presentationAndRate);
        attributes.sampleRate = LowHalf(presentationAndRate);
    } else if (kind == StreamKindTextSubtitle) {
        attributes.characterCode = reader.UInt8("character code");
    } else if (kind != StreamKindGraphics) {
        return;
    }
    attributes.language = reader.Text(3, "language");
}

} // namespace deskplayer
