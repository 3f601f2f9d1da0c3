// Reads any bytes as clip information, adds up its duration, and names its streams.

#include <algorithm>

#include "disc/clipinfo.h"
#include "disc/codes.h"
#include "discfile.h"

namespace
{

using namespace deskplayer;

void UseStream(const ProgramStream& stream)
{
    const StreamAttributes& attributes = stream.attributes;
    fuzz::ExpectPrintableLine(AspectRatioName(stream.aspectRatio));
    fuzz::ExpectPrintableLine(CodingTypeName(attributes.codingType));
    fuzz::ExpectPrintableLine(VideoFormatName(attributes.videoFormat));
    fuzz::ExpectPrintableLine(FrameRateName(attributes.frameRate));
    fuzz::ExpectPrintableLine(DynamicRangeName(attributes.dynamicRange));
    fuzz::ExpectPrintableLine(ColourSpaceName(attributes.colourSpace));
    fuzz::ExpectPrintableLine(AudioPresentationName(attributes.audioPresentation));
    fuzz::ExpectPrintableLine(SampleRateName(attributes.sampleRate));
    fuzz::ExpectPrintableLine(CharacterCodeName(attributes.characterCode));
    fuzz::ExpectPrintableLine(LanguageName(attributes.language));
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    return fuzz::OnDiscFile(data, size, [](const Bytes& bytes, const std::string& fileName) {
        const ClipInfo clipInfo = ParseClipInfo(bytes, fileName);
        Duration(clipInfo);
        const auto ratios = AspectRatiosOf(clipInfo);
        fuzz::Expect(std::is_sorted(ratios.begin(), ratios.end()));
        for (const Program& program : clipInfo.programs) {
            for (const ProgramStream& stream : program.streams) {
                UseStream(stream);
            }
        }
    });
}
