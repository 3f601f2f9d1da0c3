#include <gtest/gtest.h>

#include "bytewriter.h"
#include "disc/clipinfo.h"
#include "disc/codes.h"
#include "disc/errors.h"
#include "expectederror.h"

namespace deskplayer
{

namespace
{

const std::string FileName = "BDMV/CLIPINF/00001.clpi";

struct ClipInfoBytes {
    Bytes clipInfo = Part32(Zeros(144));
    Bytes sequenceInfo = Part32(Zeros(2));
    Bytes programInfo = Part32(Zeros(2));

    Bytes Make() const
    {
        const auto sequenceAt = std::uint32_t(40 + clipInfo.size());
        const auto programAt = std::uint32_t(sequenceAt + sequenceInfo.size());
        return Join({Ascii("HDMV0200"), U32(sequenceAt), U32(programAt), Zeros(24), clipInfo,
                     sequenceInfo, programInfo});
    }
};

Bytes StcBytes(unsigned pid, std::uint32_t packet, std::uint32_t start, std::uint32_t end)
{
    return Join({U16(pid), U32(packet), U32(start), U32(end)});
}

ClipInfo WithSequences(const Bytes& sequences)
{
    ClipInfoBytes bytes;
    bytes.sequenceInfo = Part32(Join({Zeros(1), sequences}));
    return ParseClipInfo(bytes.Make(), FileName);
}

ClipInfo WithPrograms(const Bytes& programs)
{
    ClipInfoBytes bytes;
    bytes.programInfo = Part32(Join({Zeros(1), programs}));
    return ParseClipInfo(bytes.Make(), FileName);
}

/** A clip with one program of one stream. */
ClipInfo WithStream(const Bytes& codingInfo)
{
    return WithPrograms(Join({U8(1), U32(0), U16(0x100), U8(1), U8(0), U16(0x1011), codingInfo}));
}

StreamAttributes AttributesOf(const Bytes& codingInfo)
{
    return WithStream(codingInfo).programs.at(0).streams.at(0).attributes;
}

TEST(ParseClipInfo, ReadsTheArrivalTimeOffsetFlagNextToPadding)
{
    ClipInfoBytes bytes;
    bytes.clipInfo = Part32(Join({U16(0xFFFF), U8(2), U8(3), U32(1), U32(4), U32(5)}));
    ClipInfo clipInfo = ParseClipInfo(bytes.Make(), FileName);
    EXPECT_EQ(clipInfo.clipStreamType, 2u);
    EXPECT_EQ(clipInfo.applicationType, 3u);
    EXPECT_TRUE(clipInfo.arrivalTimeOffsets);
    EXPECT_EQ(clipInfo.greatestDataRate, 4u);
    EXPECT_EQ(clipInfo.packets, 5u);

    bytes.clipInfo = Part32(Join({U16(0), U8(1), U8(1), U32(0xFFFFFFFE), U32(4), U32(5)}));
    clipInfo = ParseClipInfo(bytes.Make(), FileName);
    EXPECT_FALSE(clipInfo.arrivalTimeOffsets);
}

TEST(ParseClipInfo, ReadsSeveralSequences)
{
    const ClipInfo clipInfo =
        WithSequences(Join({U8(2), U32(10), U8(2), U8(0), StcBytes(1, 2, 3, 13),
                            StcBytes(4, 5, 6, 26), U32(20), U8(1), U8(2), StcBytes(7, 8, 9, 39)}));
    ASSERT_EQ(clipInfo.atcSequences.size(), 2u);
    ASSERT_EQ(clipInfo.atcSequences[0].stcSequences.size(), 2u);
    EXPECT_EQ(clipInfo.atcSequences[0].firstPacket, 10u);
    EXPECT_EQ(clipInfo.atcSequences[0].stcSequences[1].pcrPid, 4u);
    EXPECT_EQ(clipInfo.atcSequences[0].stcSequences[1].firstPacket, 5u);
    EXPECT_EQ(clipInfo.atcSequences[0].stcSequences[1].presentationStart, 6u);
    EXPECT_EQ(clipInfo.atcSequences[0].stcSequences[1].presentationEnd, 26u);
    EXPECT_EQ(clipInfo.atcSequences[1].firstStcSequence, 2u);
    ASSERT_EQ(clipInfo.atcSequences[1].stcSequences.size(), 1u);
}

TEST(ParseClipInfo, RefusesAnStcSequenceThatEndsBeforeItStarts)
{
    EXPECT_EQ(FormatErrorOf([] {
                  WithSequences(Join({U8(1), U32(0), U8(1), U8(0), StcBytes(0, 0, 10, 9)}));
              }),
              "BDMV/CLIPINF/00001.clpi: offset 210: presentation end time is 9, but expected at "
              "least the start time 10");
}

TEST(ParseClipInfo, RefusesMoreSequencesThanFollow)
{
    EXPECT_EQ(FormatErrorOf([] {
                  WithSequences(Join({U8(2), Zeros(11)}));
              }),
              "BDMV/CLIPINF/00001.clpi: offset 193: number of ATC sequences is 2, but expected at "
              "most 1 in the 11 bytes left in sequence info");
    EXPECT_EQ(FormatErrorOf([] {
                  WithSequences(Join({U8(1), U32(0), U8(2), U8(0), Zeros(26)}));
              }),
              "BDMV/CLIPINF/00001.clpi: offset 198: number of STC sequences is 2, but expected at "
              "most 1 in the 27 bytes left in sequence info");
}

TEST(ParseClipInfo, ReadsSeveralPrograms)
{
    const Bytes stream = Join({U16(0x1100), Part8(Join({U8(0x81), Zeros(20)}))});
    const ClipInfo clipInfo = WithPrograms(Join({U8(2), U32(1), U16(2), U8(1), U8(9), stream,
                                                 U32(3), U16(4), U8(2), U8(9), stream, stream}));
    ASSERT_EQ(clipInfo.programs.size(), 2u);
    EXPECT_EQ(clipInfo.programs[0].firstPacket, 1u);
    EXPECT_EQ(clipInfo.programs[0].programMapPid, 2u);
    EXPECT_EQ(clipInfo.programs[0].streams.size(), 1u);
    EXPECT_EQ(clipInfo.programs[1].streams.size(), 2u);
}

TEST(ParseClipInfo, RefusesMoreProgramsThanFollow)
{
    EXPECT_EQ(FormatErrorOf([] {
                  WithPrograms(Join({U8(2), Zeros(15)}));
              }),
              "BDMV/CLIPINF/00001.clpi: offset 199: number of programs is 2, but expected at most "
              "1 in the 15 bytes left in program info");
}

TEST(ParseClipInfo, RefusesMoreStreamsThanFollow)
{
    EXPECT_EQ(FormatErrorOf([] {
                  WithPrograms(Join({U8(1), Zeros(6), U8(2), Zeros(7)}));
              }),
              "BDMV/CLIPINF/00001.clpi: offset 206: number of streams is 2, but expected at most 1 "
              "in the 7 bytes left in program info");
}

TEST(ParseClipInfo, RefusesCodingInfoThatLacksTheAspectRatio)
{
    EXPECT_EQ(FormatErrorOf([] {
                  WithStream(Part8({0x1B, 0x61}));
              }),
              "BDMV/CLIPINF/00001.clpi: offset 213: coding info of stream 0 has 0 bytes left, but "
              "expected 1 byte for aspect ratio");
}

TEST(ParseClipInfo, ReadsVideoNextToPadding)
{
    const ClipInfo clipInfo = WithStream(Part8(Join({{0x1B, 0x64, 0x3D, 0xFF, 0xFF}})));
    const ProgramStream& stream = clipInfo.programs.at(0).streams.at(0);
    EXPECT_EQ(stream.pid, 0x1011u);
    EXPECT_EQ(stream.attributes.codingType, 0x1Bu);
    EXPECT_EQ(stream.attributes.videoFormat, 6u);
    EXPECT_EQ(stream.attributes.frameRate, 4u);
    EXPECT_EQ(stream.aspectRatio, 3u);
    EXPECT_FALSE(stream.captionFlag);
    EXPECT_FALSE(stream.attributes.hdrFlag);
    EXPECT_EQ(stream.attributes.dynamicRange, 0u);
    EXPECT_FALSE(stream.attributes.dynamicMetadata);
}

TEST(ParseClipInfo, ReadsTheCaptionFlag)
{
    EXPECT_TRUE(WithStream(Part8({0x1B, 0x64, 0x32})).programs.at(0).streams.at(0).captionFlag);
}

TEST(ParseClipInfo, ReadsTheDynamicRangeOfH265)
{
    StreamAttributes attributes = AttributesOf(Part8({0x24, 0x81, 0x31, 0x12, 0x7F}));
    EXPECT_TRUE(attributes.hdrFlag);
    EXPECT_EQ(attributes.dynamicRange, 1u);
    EXPECT_EQ(attributes.colourSpace, 2u);
    EXPECT_FALSE(attributes.dynamicMetadata);

    attributes = AttributesOf(Part8({0x24, 0x81, 0x3E, 0x12, 0x80}));
    EXPECT_FALSE(attributes.hdrFlag);
    EXPECT_TRUE(attributes.dynamicMetadata);
}

TEST(ParseClipInfo, ReadsAudioGraphicsAndTextSubtitles)
{
    const StreamAttributes audio = AttributesOf(Part8(Join({{0x81, 0x6C}, Ascii("eng")})));
    EXPECT_EQ(audio.audioPresentation, 6u);
    EXPECT_EQ(audio.sampleRate, 12u);
    EXPECT_EQ(audio.language, "eng");
    EXPECT_EQ(AttributesOf(Part8(Join({{0x91}, Ascii("fra")}))).language, "fra");
    const StreamAttributes text = AttributesOf(Part8(Join({{0x92, 0x07}, Ascii("zho")})));
    EXPECT_EQ(text.characterCode, 7u);
    EXPECT_EQ(text.language, "zho");
}

TEST(ParseClipInfo, KeepsAStreamOfUnknownCodingType)
{
    EXPECT_EQ(AttributesOf(Part8({0x7F})).codingType, 0x7Fu);
}

TEST(ParseClipInfo, RefusesAnAddressPastTheEnd)
{
    Bytes bytes = ClipInfoBytes().Make();
    Overwrite(bytes, 12, U32(0xFFFFFFFF));
    EXPECT_EQ(FormatErrorOf([&] { ParseClipInfo(bytes, FileName); }),
              "BDMV/CLIPINF/00001.clpi: offset 12: program info has address 4294967295, but "
              "expected at least 40 and at most 200, the end of the file");
}

TEST(ClipDuration, IsTheSumOverAllStcSequencesInSixtyFourBits)
{
    const ClipInfo clipInfo = WithSequences(
        Join({U8(2), U32(0), U8(2), U8(0), StcBytes(0, 0, 0, 0xFFFFFFFF), StcBytes(0, 0, 5, 7),
              U32(0), U8(1), U8(2), StcBytes(0, 0, 0, 0xFFFFFFFF)}));
    EXPECT_EQ(Duration(clipInfo), Ticks(2u * 0xFFFFFFFFull + 2u));
}

TEST(AspectRatiosOf, AreThoseOfTheVideoStreamsOfAllProgramsSortedByPid)
{
    const auto video = [](unsigned pid, unsigned ratio) {
        return Join({U16(pid), Part8({0x1B, 0x61, static_cast<std::uint8_t>(ratio << 4)})});
    };
    const Bytes audio = Join({U16(3), Part8(Join({U8(0x81), Zeros(4)}))});
    const ClipInfo clipInfo =
        WithPrograms(Join({U8(2), Zeros(6), U8(2), U8(0), video(4, 3), audio, Zeros(6), U8(2),
                           U8(0), video(1, 2), video(4, 2)}));
    const std::vector<std::pair<std::uint16_t, std::uint8_t>> expected = {{1, 2}, {4, 3}};
    EXPECT_EQ(AspectRatiosOf(clipInfo), expected) << "the first of two with the same PID";
}

} // namespace

} // namespace deskplayer
