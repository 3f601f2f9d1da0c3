#include <gtest/gtest.h>

#include "bytewriter.h"
#include "disc/errors.h"
#include "disc/playlist.h"
#include "expectederror.h"
#include "text/printable.h"

namespace deskplayer
{

namespace
{

const std::string FileName = "BDMV/PLAYLIST/00000.mpls";

// Offsets in the files that PlayListBytes makes.
constexpr std::size_t SectionOffset = 58;
constexpr std::size_t FirstItemOffset = SectionOffset + 10;

PlayList Parse(const PlayListBytes& bytes)
{
    return ParsePlayList(bytes.Make(), FileName);
}

PlayItem ParseItem(const PlayItemBytes& item)
{
    return Parse(WithItem(item)).playItems.at(0);
}

/** The only stream of a play item, listed as audio. */
Stream ParseStream(const Bytes& entry, const Bytes& attributes)
{
    return Parse(WithStreams({0, 1, 0, 0, 0, 0, 0, 0}, Join({entry, attributes})))
        .playItems.at(0)
        .streams.primaryAudio.at(0);
}

StreamAttributes ParseAttributes(unsigned codingType, const Bytes& details)
{
    return ParseStream(StreamEntry(1), StreamAttributesBytes(codingType, details)).attributes;
}

SubPlayItem ParseSubPlayItem(const SubPlayItemBytes& item)
{
    PlayListBytes playList;
    playList.subPathCount = 1;
    playList.subPaths = SubPathBytes(5, 0, 1, item.Make());
    return Parse(playList).subPaths.at(0).items.at(0);
}

std::string ErrorOf(const PlayListBytes& bytes)
{
    return FormatErrorOf([&] { Parse(bytes); });
}

std::string ErrorOf(const PlayItemBytes& item)
{
    return ErrorOf(WithItem(item));
}

std::vector<std::uint16_t> PidsOf(const std::vector<Stream>& streams)
{
    std::vector<std::uint16_t> pids;
    pids.reserve(streams.size());
    for (const Stream& stream : streams) {
        pids.push_back(stream.pid);
    }
    return pids;
}

using Pids = std::vector<std::uint16_t>;

TEST(ParsePlayList, AcceptsAPlayListWithoutPlayItems)
{
    const PlayList playList = Parse(PlayListBytes());
    EXPECT_TRUE(playList.playItems.empty());
    EXPECT_TRUE(playList.subPaths.empty());
    EXPECT_TRUE(playList.marks.empty());
    EXPECT_TRUE(playList.extensionBlocks.empty());
}

TEST(ParsePlayList, AcceptsEveryKnownVersion)
{
    for (const char* const version : {"0100", "0200", "0240", "0300"}) {
        PlayListBytes bytes;
        bytes.version = version;
        EXPECT_EQ(Parse(bytes).version, version);
    }
}

TEST(ParsePlayList, RefusesAnUnknownVersion)
{
    PlayListBytes bytes;
    bytes.version = "02\n0";
    EXPECT_EQ(ErrorOf(bytes), "BDMV/PLAYLIST/00000.mpls: offset 4: version is \"02\\x0A0\", but "
                              "expected \"0100\", \"0200\", \"0240\" or \"0300\"");
}

TEST(ParsePlayList, RefusesAnotherType)
{
    Bytes bytes = PlayListBytes().Make();
    Overwrite(bytes, 0, Ascii("MPL\x1B"));
    EXPECT_EQ(FormatErrorOf([&] { ParsePlayList(bytes, FileName); }),
              "BDMV/PLAYLIST/00000.mpls: offset 0: type indicator is \"MPL\\x1B\", but expected "
              "\"MPLS\"");
}

TEST(ParsePlayList, RefusesAnEmptyFile)
{
    EXPECT_EQ(FormatErrorOf([] { ParsePlayList({}, FileName); }),
              "BDMV/PLAYLIST/00000.mpls: offset 0: file has 0 bytes left, but expected 4 bytes for "
              "type indicator");
}

TEST(ParsePlayList, RefusesAddressesInTheHeaderOrPastTheEnd)
{
    for (const unsigned field : {8u, 12u, 16u}) {
        for (const std::uint32_t address : {1u, 39u, 1000u, 0x80000000u, 0xFFFFFFFFu}) {
            Bytes bytes = PlayListBytes().Make();
            Overwrite(bytes, field, U32(address));
            EXPECT_THROW(ParsePlayList(bytes, FileName), FormatError) << field << ' ' << address;
        }
    }
}

TEST(ParsePlayList, NamesTheInvalidAddress)
{
    Bytes bytes = PlayListBytes().Make();
    Overwrite(bytes, 12, U32(3));
    EXPECT_EQ(FormatErrorOf([&] { ParsePlayList(bytes, FileName); }),
              "BDMV/PLAYLIST/00000.mpls: offset 12: mark section has address 3, but expected at "
              "least 40 and at most 72, the end of the file");
}

TEST(ParsePlayList, ReadsSectionsInAnyOrderAndWithGaps)
{
    const Bytes section =
        Part32(Join({Zeros(2), U16(1), U16(0), PlayItemBytes().Make(), Repeat(7, {0xEE})}));
    const Bytes marks = Part32(Join({U16(1), MarkBytes(2, 0, 1005)}));
    const Bytes gap = Repeat(9, {0xEE});
    const auto marksAt = std::uint32_t(58 + gap.size());
    const auto sectionAt = std::uint32_t(marksAt + marks.size() + gap.size());
    const Bytes bytes = Join({Ascii("MPLS0200"), U32(sectionAt), U32(marksAt), U32(0), Zeros(20),
                              Part32(Zeros(14)), gap, marks, gap, section, gap});
    const PlayList playList = ParsePlayList(bytes, FileName);
    ASSERT_EQ(playList.playItems.size(), 1u);
    EXPECT_EQ(playList.playItems[0].clip.name, "00001");
    ASSERT_EQ(playList.marks.size(), 1u);
    EXPECT_EQ(playList.marks[0].time, 1005u);
}

TEST(ParsePlayList, ReadsEachFlagOfTheApplicationInfoNextToPadding)
{
    const auto parse = [](unsigned flags) {
        PlayListBytes bytes;
        bytes.applicationInfo = Part32(Join({U8(0xFF), U8(1), U16(0), U64(1), U16(flags)}));
        return Parse(bytes).applicationInfo;
    };
    EXPECT_TRUE(parse(0x8000).randomAccessFlag);
    EXPECT_FALSE(parse(0x7FFF).randomAccessFlag);
    EXPECT_TRUE(parse(0x4000).audioMixing);
    EXPECT_FALSE(parse(0xBFFF).audioMixing);
    EXPECT_TRUE(parse(0x2000).losslessBypass);
    EXPECT_FALSE(parse(0xDFFF).losslessBypass);
    EXPECT_TRUE(parse(0x1000).baseViewIsRightEye);
    EXPECT_FALSE(parse(0xEFFF).baseViewIsRightEye);
    EXPECT_EQ(parse(0).playbackType, PlaybackTypeInSequence);
    EXPECT_EQ(parse(0).uoMask, 1u);
}

TEST(ParsePlayList, ReadsThePlaybackCountOnlyOfRandomAndShuffle)
{
    const auto countWith = [](unsigned playbackType) {
        PlayListBytes bytes;
        bytes.applicationInfo = Part32(Join({U8(0), U8(playbackType), U16(1234), Zeros(10)}));
        return Parse(bytes).applicationInfo.playbackCount;
    };
    EXPECT_EQ(countWith(PlaybackTypeInSequence), 0u);
    EXPECT_EQ(countWith(PlaybackTypeRandom), 1234u);
    EXPECT_EQ(countWith(PlaybackTypeShuffle), 1234u);
}

TEST(ParsePlayList, ReadsAPlayItemNextToPadding)
{
    PlayItemBytes bytes;
    bytes.clip = "98765";
    bytes.angleAndConnection = 0xFFE6;
    bytes.stcSequence = 3;
    bytes.inTime = 0x80000000;
    bytes.outTime = 0xFFFFFFFF;
    bytes.uoMask = 0x8000000000000001;
    bytes.randomAccess = 0x80;
    bytes.stillMode = StillModeTimed;
    bytes.stillTime = 500;
    const PlayItem item = ParseItem(bytes);
    EXPECT_EQ(item.clip.name, "98765");
    EXPECT_EQ(item.clip.codec, "M2TS");
    EXPECT_EQ(item.clip.stcSequence, 3u);
    EXPECT_FALSE(item.multiAngle);
    EXPECT_EQ(item.connectionCondition, 6u);
    EXPECT_EQ(item.inTime, 0x80000000u);
    EXPECT_EQ(item.outTime, 0xFFFFFFFFu);
    EXPECT_EQ(item.uoMask, 0x8000000000000001u);
    EXPECT_TRUE(item.randomAccessFlag);
    EXPECT_EQ(item.stillMode, StillModeTimed);
    EXPECT_EQ(item.stillTime, 500u);
    EXPECT_TRUE(item.furtherAngles.empty());
}

TEST(ParsePlayList, IgnoresPaddingNextToTheRandomAccessFlagOfAPlayItem)
{
    PlayItemBytes bytes;
    bytes.randomAccess = 0x7F;
    EXPECT_FALSE(ParseItem(bytes).randomAccessFlag);
}

TEST(ParsePlayList, HasNoStillTimeUnlessTheStillIsTimed)
{
    PlayItemBytes bytes;
    bytes.stillTime = 500;
    bytes.stillMode = StillModeNone;
    EXPECT_EQ(ParseItem(bytes).stillTime, 0u);
    bytes.stillMode = StillModeEndless;
    EXPECT_EQ(ParseItem(bytes).stillTime, 0u);
}

TEST(ParsePlayList, AcceptsAPlayItemThatEndsWhereItStarts)
{
    PlayItemBytes bytes;
    bytes.outTime = bytes.inTime;
    EXPECT_EQ(ParseItem(bytes).outTime, bytes.inTime);
}

TEST(ParsePlayList, RefusesOutBeforeIn)
{
    PlayItemBytes bytes;
    bytes.outTime = bytes.inTime - 1;
    EXPECT_EQ(ErrorOf(bytes), "BDMV/PLAYLIST/00000.mpls: offset 86: OUT time is 999, but expected "
                              "at least the IN time 1000");
}

TEST(ParsePlayList, RefusesClipNamesThatAreNotFiveDigits)
{
    const std::string tooShort("0000\0", 5);
    for (const std::string& clip :
         std::vector<std::string>{"../..", "0000a", " 0000", "0000/", tooShort}) {
        PlayItemBytes item;
        item.clip = clip;
        EXPECT_THROW(ParseItem(item), FormatError) << Printable(clip);
        SubPlayItemBytes subItem;
        subItem.clip = clip;
        EXPECT_THROW(ParseSubPlayItem(subItem), FormatError) << Printable(clip);
    }
}

TEST(ParsePlayList, ShowsARefusedClipNameInPrintableForm)
{
    PlayItemBytes bytes;
    bytes.clip = "\x1B[2J\n";
    EXPECT_EQ(ErrorOf(bytes), "BDMV/PLAYLIST/00000.mpls: offset 70: clip name is "
                              "\"\\x1B[2J\\x0A\", but expected five digits");
}

TEST(ParsePlayList, SkipsUnknownContentAtTheEndOfAPlayItem)
{
    PlayItemBytes bytes;
    bytes.trailing = Repeat(100, {0xEE});
    PlayListBytes playList;
    playList.itemCount = 2;
    playList.items = Join({bytes.Make(), PlayItemBytes().Make()});
    EXPECT_EQ(Parse(playList).playItems.at(1).clip.name, "00001");
}

TEST(ParsePlayList, ReadsAnAngleTableAndTheStreamsAfterIt)
{
    PlayItemBytes bytes;
    bytes.angleAndConnection = 0x0015;
    bytes.angleTable =
        Join({U8(3), U8(0xFE), FurtherClip("00002", "FMTS", 1), FurtherClip("00003", "M2TS", 2)});
    bytes.streamTable = StreamTableBytes({0, 1, 0, 0, 0, 0, 0, 0}, AudioStream(0x1100));
    PlayItem item = ParseItem(bytes);
    EXPECT_TRUE(item.multiAngle);
    EXPECT_EQ(item.connectionCondition, 5u);
    EXPECT_TRUE(item.differentAudios);
    EXPECT_FALSE(item.seamlessAngleChange);
    ASSERT_EQ(item.furtherAngles.size(), 2u);
    EXPECT_EQ(item.furtherAngles[0].name, "00002");
    EXPECT_EQ(item.furtherAngles[0].codec, "FMTS");
    EXPECT_EQ(item.furtherAngles[0].stcSequence, 1u);
    EXPECT_EQ(item.furtherAngles[1].name, "00003");
    EXPECT_EQ(PidsOf(item.streams.primaryAudio), Pids{0x1100});

    bytes.angleTable = Join({U8(1), U8(0xFD)});
    item = ParseItem(bytes);
    EXPECT_FALSE(item.differentAudios);
    EXPECT_TRUE(item.seamlessAngleChange);
}

TEST(ParsePlayList, TreatsAnAngleCountOfZeroOrOneAsNoFurtherAngles)
{
    for (const unsigned count : {0u, 1u}) {
        PlayItemBytes bytes;
        bytes.angleAndConnection = 0x0011;
        bytes.angleTable = Join({U8(count), U8(0)});
        const PlayItem item = ParseItem(bytes);
        EXPECT_TRUE(item.multiAngle);
        EXPECT_TRUE(item.furtherAngles.empty());
    }
}

TEST(ParsePlayList, RefusesAnAngleThatIsNotAClip)
{
    PlayItemBytes bytes;
    bytes.angleAndConnection = 0x0011;
    bytes.angleTable = Join({U8(2), U8(0), FurtherClip("x0002", "M2TS", 0)});
    EXPECT_EQ(ErrorOf(bytes), "BDMV/PLAYLIST/00000.mpls: offset 104: clip name is \"x0002\", but "
                              "expected five digits");
}

TEST(ParsePlayList, RefusesMoreAnglesThanFollow)
{
    PlayItemBytes bytes;
    bytes.angleAndConnection = 0x0011;
    bytes.angleTable = Join({U8(255), U8(0), Repeat(253, FurtherClip("00002", "M2TS", 0))});
    bytes.streamTable = {};
    EXPECT_THROW(ParseItem(bytes), FormatError);
}

TEST(ParsePlayList, ReadsTheKindsOfStreamsInFileOrder)
{
    // The order of the counts differs from that of the streams.
    const Bytes counts{1, 2, 3, 4, 5, 6, 7, 8};
    Bytes streams;
    unsigned pid = 0;
    const auto add = [&](unsigned count, const Bytes& references) {
        for (; count > 0; --count) {
            streams = Join({streams, AudioStream(++pid), references});
        }
    };
    add(1, {});       // primary video
    add(2, {});       // primary audio
    add(3, {});       // PG
    add(7, {});       // PG of picture-in-picture
    add(4, {});       // IG
    add(5, Zeros(2)); // secondary audio
    add(6, Zeros(4)); // secondary video
    add(8, {});       // enhancement layer
    PlayListBytes bytes = WithStreams(counts, streams);
    bytes.version = "0300";
    const StreamTable table = Parse(bytes).playItems.at(0).streams;
    EXPECT_EQ(PidsOf(table.primaryVideo), (Pids{1}));
    EXPECT_EQ(PidsOf(table.primaryAudio), (Pids{2, 3}));
    EXPECT_EQ(PidsOf(table.pg), (Pids{4, 5, 6}));
    EXPECT_EQ(PidsOf(table.pipPg), (Pids{7, 8, 9, 10, 11, 12, 13}));
    EXPECT_EQ(PidsOf(table.ig), (Pids{14, 15, 16, 17}));
    EXPECT_EQ(PidsOf(table.secondaryAudio), (Pids{18, 19, 20, 21, 22}));
    EXPECT_EQ(PidsOf(table.secondaryVideo), (Pids{23, 24, 25, 26, 27, 28}));
    EXPECT_EQ(PidsOf(table.enhancementVideo), (Pids{29, 30, 31, 32, 33, 34, 35, 36}));
}

TEST(ParsePlayList, TreatsTheEighthStreamCountAsPaddingBeforeVersion0300)
{
    for (const char* const version : {"0100", "0200", "0240"}) {
        PlayListBytes bytes = WithStreams({0, 0, 0, 0, 0, 0, 0, 255}, AudioStream(1));
        bytes.version = version;
        EXPECT_TRUE(Parse(bytes).playItems.at(0).streams.enhancementVideo.empty()) << version;
    }
}

TEST(ParsePlayList, RefusesMoreStreamsThanFollow)
{
    for (std::size_t kind = 0; kind < 8; ++kind) {
        Bytes counts = Zeros(8);
        counts[kind] = 8; // as many bytes are left, but not as many streams
        PlayListBytes bytes = WithStreams(counts, AudioStream(1));
        bytes.version = "0300";
        EXPECT_NE(ErrorOf(bytes).find("streams is 8, but expected at most"), std::string::npos)
            << kind;
    }
}

TEST(ParsePlayList, NamesTheTruncatedStream)
{
    const Bytes entry = Part8({EntryTypePlayItem, 0x11});
    const Bytes streams = Join({AudioStream(0x1100), entry, StreamAttributesBytes(0x81, Zeros(4))});
    EXPECT_EQ(ErrorOf(WithStreams({0, 2, 0, 0, 0, 0, 0, 0}, streams)),
              "BDMV/PLAYLIST/00000.mpls: offset 136: primary audio stream 1 has 1 byte left, but "
              "expected 2 bytes for PID");
}

TEST(ParsePlayList, ReadsAnEntryOfTypeOne)
{
    const Stream stream = ParseStream(Part8(Join({{1, 0x12, 0x34}, Repeat(6, {0xFF})})),
                                      StreamAttributesBytes(0x81, Zeros(4)));
    EXPECT_EQ(stream.entryType, EntryTypePlayItem);
    EXPECT_EQ(stream.pid, 0x1234u);
    EXPECT_EQ(stream.subPath, 0u);
    EXPECT_EQ(stream.subClip, 0u);
}

TEST(ParsePlayList, ReadsAnEntryOfTypeTwo)
{
    const Stream stream = ParseStream(Part8(Join({{2, 7, 8, 0x12, 0x34}, Repeat(4, {0xFF})})),
                                      StreamAttributesBytes(0x81, Zeros(4)));
    EXPECT_EQ(stream.entryType, EntryTypeSubPath);
    EXPECT_EQ(stream.pid, 0x1234u);
    EXPECT_EQ(stream.subPath, 7u);
    EXPECT_EQ(stream.subClip, 8u);
}

TEST(ParsePlayList, ReadsEntriesOfTypesThreeAndFour)
{
    for (const std::uint8_t entryType : {std::uint8_t{3}, std::uint8_t{4}}) {
        const Stream stream =
            ParseStream(Part8(Join({{entryType, 7, 0x12, 0x34}, Repeat(5, {0xFF})})),
                        StreamAttributesBytes(0x81, Zeros(4)));
        EXPECT_EQ(stream.entryType, entryType);
        EXPECT_EQ(stream.pid, 0x1234u);
        EXPECT_EQ(stream.subPath, 7u);
        EXPECT_EQ(stream.subClip, 0u);
    }
}

TEST(ParsePlayList, KeepsAStreamOfReservedEntryType)
{
    const Stream stream =
        ParseStream(Part8({5, 0xFF, 0xFF}), StreamAttributesBytes(0x80, Zeros(4)));
    EXPECT_EQ(stream.entryType, 5u);
    EXPECT_EQ(stream.pid, 0u);
    EXPECT_EQ(stream.attributes.codingType, 0x80u);
}

TEST(ParsePlayList, ReadsVideoAttributesNextToPadding)
{
    const StreamAttributes attributes = ParseAttributes(0x1B, {0x64, 0xFF, 0xFF, 0xFF});
    EXPECT_EQ(attributes.videoFormat, 6u);
    EXPECT_EQ(attributes.frameRate, 4u);
    EXPECT_EQ(attributes.dynamicRange, 0u);
    EXPECT_FALSE(attributes.dynamicMetadata);
}

TEST(ParsePlayList, ReadsTheDynamicRangeOfH265)
{
    StreamAttributes attributes = ParseAttributes(0x24, {0x81, 0x12, 0xBF, 0xFF});
    EXPECT_EQ(attributes.videoFormat, 8u);
    EXPECT_EQ(attributes.dynamicRange, 1u);
    EXPECT_EQ(attributes.colourSpace, 2u);
    EXPECT_TRUE(attributes.hdrFlag);
    EXPECT_FALSE(attributes.dynamicMetadata);

    attributes = ParseAttributes(0x24, {0x81, 0x12, 0x7F, 0xFF});
    EXPECT_FALSE(attributes.hdrFlag);
    EXPECT_TRUE(attributes.dynamicMetadata);
}

TEST(ParsePlayList, ReadsAudioAttributes)
{
    const StreamAttributes attributes = ParseAttributes(0x83, Join({{0xCE}, Ascii("jpn")}));
    EXPECT_EQ(attributes.audioPresentation, 12u);
    EXPECT_EQ(attributes.sampleRate, 14u);
    EXPECT_EQ(attributes.language, "jpn");
}

TEST(ParsePlayList, ReadsGraphicsAttributes)
{
    EXPECT_EQ(ParseAttributes(0x90, Join({Ascii("spa"), {0xFF}})).language, "spa");
    EXPECT_EQ(ParseAttributes(0x91, Join({Ascii("ita"), {0xFF}})).language, "ita");
}

TEST(ParsePlayList, ReadsTextSubtitleAttributes)
{
    const StreamAttributes attributes = ParseAttributes(0x92, Join({{3}, Ascii("jpn")}));
    EXPECT_EQ(attributes.characterCode, 3u);
    EXPECT_EQ(attributes.language, "jpn");
}

TEST(ParsePlayList, KeepsAStreamOfUnknownCodingType)
{
    const StreamAttributes attributes = ParseAttributes(0x7F, {0x64, 0x12, 0xFF, 0xFF});
    EXPECT_EQ(attributes.codingType, 0x7Fu);
    EXPECT_EQ(attributes.videoFormat, 0u);
    EXPECT_EQ(attributes.language, "");
}

TEST(ParsePlayList, ReadsReferenceListsOfOddAndEvenLength)
{
    const Bytes stream = AudioStream(1);
    const Bytes odd{3, 0xFF, 0, 1, 2, 0xFF};
    const Bytes even{2, 0xFF, 4, 5};
    const Bytes streams = Join({stream, odd, stream, even, stream, even, odd});
    const StreamTable table =
        Parse(WithStreams({0, 0, 0, 0, 2, 1, 0, 0}, streams)).playItems.at(0).streams;
    using References = std::vector<std::uint8_t>;
    ASSERT_EQ(table.secondaryAudio.size(), 2u);
    EXPECT_EQ(table.secondaryAudio[0].primaryAudioReferences, (References{0, 1, 2}));
    EXPECT_EQ(table.secondaryAudio[1].primaryAudioReferences, (References{4, 5}));
    ASSERT_EQ(table.secondaryVideo.size(), 1u);
    EXPECT_EQ(table.secondaryVideo[0].secondaryAudioReferences, (References{4, 5}));
    EXPECT_EQ(table.secondaryVideo[0].pipPgReferences, (References{0, 1, 2}));
    EXPECT_TRUE(table.secondaryVideo[0].primaryAudioReferences.empty());
}

TEST(ParsePlayList, RefusesMoreReferencesThanFollow)
{
    EXPECT_EQ(ErrorOf(WithStreams({0, 0, 0, 0, 1, 0, 0, 0}, Join({AudioStream(1), {200, 0, 1}}))),
              "BDMV/PLAYLIST/00000.mpls: offset 134: number of references is 200, but expected at "
              "most 2 in the 2 bytes left in stream table");
}

TEST(ParsePlayList, RefusesAStreamTableLongerThanItsPlayItem)
{
    PlayItemBytes bytes;
    bytes.streamTable = Join({U16(15), Zeros(14)});
    EXPECT_EQ(ErrorOf(bytes), "BDMV/PLAYLIST/00000.mpls: offset 102: stream table has length 15, "
                              "but expected at most the 14 bytes left in play item 0");
}

TEST(ParsePlayList, RefusesAPlayItemLongerThanTheSection)
{
    Bytes bytes = WithItem(PlayItemBytes()).Make();
    Overwrite(bytes, FirstItemOffset, U16(65535));
    EXPECT_EQ(FormatErrorOf([&] { ParsePlayList(bytes, FileName); }),
              "BDMV/PLAYLIST/00000.mpls: offset 68: play item 0 has length 65535, but expected at "
              "most the 48 bytes left in play list section");
}

TEST(ParsePlayList, RefusesMorePlayItemsThanFollow)
{
    PlayListBytes bytes = WithItem(PlayItemBytes());
    bytes.itemCount = 65535;
    EXPECT_EQ(ErrorOf(bytes), "BDMV/PLAYLIST/00000.mpls: offset 64: number of play items is 65535, "
                              "but expected at most 1 in the 52 bytes left in play list section");
}

TEST(ParsePlayList, RefusesMoreSubPathsThanFollow)
{
    PlayListBytes bytes = WithItem(PlayItemBytes());
    bytes.subPathCount = 1;
    EXPECT_EQ(ErrorOf(bytes), "BDMV/PLAYLIST/00000.mpls: offset 118: play list section has 0 bytes "
                              "left, but expected 4 bytes for length");
    bytes.subPathCount = 65535;
    EXPECT_EQ(ErrorOf(bytes), "BDMV/PLAYLIST/00000.mpls: offset 66: number of sub paths is 65535, "
                              "but expected at most 5 in the 50 bytes left in play list section");
}

TEST(ParsePlayList, IgnoresSubPathsBeyondTheCount)
{
    PlayListBytes bytes = WithItem(PlayItemBytes());
    bytes.subPathCount = 1;
    bytes.subPaths = Join({SubPathBytes(5, 0, 0, {}), SubPathBytes(6, 0, 0, {})});
    const PlayList playList = Parse(bytes);
    ASSERT_EQ(playList.subPaths.size(), 1u);
    EXPECT_EQ(playList.subPaths[0].type, 5u);
}

TEST(ParsePlayList, ReadsTheRepeatFlagOfASubPathNextToPadding)
{
    PlayListBytes bytes;
    bytes.subPathCount = 2;
    bytes.subPaths = Join({SubPathBytes(3, 0x0001, 0, {}), SubPathBytes(4, 0xFFFE, 0, {})});
    const PlayList playList = Parse(bytes);
    EXPECT_TRUE(playList.subPaths.at(0).repeat);
    EXPECT_FALSE(playList.subPaths.at(1).repeat);
}

TEST(ParsePlayList, ReadsASubPlayItemNextToPadding)
{
    SubPlayItemBytes bytes;
    bytes.clip = "00077";
    bytes.connectionAndClips = 0xFFFFFFE0 | 5 << 1;
    bytes.stcSequence = 2;
    bytes.inTime = 11;
    bytes.outTime = 22;
    bytes.syncPlayItem = 333;
    bytes.syncTime = 44;
    const SubPlayItem item = ParseSubPlayItem(bytes);
    EXPECT_EQ(item.clip.name, "00077");
    EXPECT_EQ(item.clip.codec, "M2TS");
    EXPECT_EQ(item.clip.stcSequence, 2u);
    EXPECT_EQ(item.connectionCondition, 5u);
    EXPECT_EQ(item.inTime, 11u);
    EXPECT_EQ(item.outTime, 22u);
    EXPECT_EQ(item.syncPlayItem, 333u) << "kept, although there is no such play item";
    EXPECT_EQ(item.syncTime, 44u);
    EXPECT_TRUE(item.furtherClips.empty());
}

TEST(ParsePlayList, ReadsASubPlayItemOfSeveralClips)
{
    SubPlayItemBytes bytes;
    bytes.connectionAndClips = 1 << 1 | 1;
    bytes.clipTable =
        Join({U8(3), U8(0xFF), FurtherClip("00008", "M2TS", 1), FurtherClip("00009", "FMTS", 2)});
    const SubPlayItem item = ParseSubPlayItem(bytes);
    EXPECT_EQ(item.connectionCondition, 1u);
    ASSERT_EQ(item.furtherClips.size(), 2u);
    EXPECT_EQ(item.furtherClips[0].name, "00008");
    EXPECT_EQ(item.furtherClips[1].codec, "FMTS");
    EXPECT_EQ(item.furtherClips[1].stcSequence, 2u);
}

TEST(ParsePlayList, RefusesASubPlayItemThatEndsBeforeItStarts)
{
    SubPlayItemBytes bytes;
    bytes.outTime = bytes.inTime - 1;
    EXPECT_THROW(ParseSubPlayItem(bytes), FormatError);
}

TEST(ParsePlayList, RefusesMoreSubPlayItemsThanFollow)
{
    PlayListBytes bytes;
    bytes.subPathCount = 1;
    bytes.subPaths = SubPathBytes(5, 0, 2, SubPlayItemBytes().Make());
    EXPECT_EQ(ErrorOf(bytes), "BDMV/PLAYLIST/00000.mpls: offset 77: number of sub play items is 2, "
                              "but expected at most 1 in the 30 bytes left in sub path 0");
}

TEST(ParsePlayList, ReadsMarks)
{
    PlayListBytes bytes = WithItem(PlayItemBytes());
    bytes.marks = Part32(Join({U16(2), MarkBytes(1, 0, 1000), U8(0xFF), U8(2), U16(500), U32(1001),
                               U16(0x1011), U32(45000)}));
    const PlayList playList = Parse(bytes);
    ASSERT_EQ(playList.marks.size(), 2u);
    EXPECT_EQ(playList.marks[0].type, MarkTypeEntry);
    EXPECT_EQ(playList.marks[0].pid, MarkForAllStreams);
    EXPECT_EQ(playList.marks[1].type, MarkTypeLink);
    EXPECT_EQ(playList.marks[1].playItem, 500u) << "kept, although there is no such play item";
    EXPECT_EQ(playList.marks[1].time, 1001u);
    EXPECT_EQ(playList.marks[1].pid, 0x1011u);
    EXPECT_EQ(playList.marks[1].duration, 45000u);
}

TEST(ParsePlayList, TreatsAMarkSectionOfLengthZeroAsNoMarks)
{
    PlayListBytes bytes;
    bytes.marks = Join({U32(0), U16(7)});
    EXPECT_TRUE(Parse(bytes).marks.empty());
}

TEST(ParsePlayList, RefusesMoreMarksThanFollow)
{
    PlayListBytes bytes;
    bytes.marks = Part32(Join({U16(65535), MarkBytes(1, 0, 0)}));
    EXPECT_EQ(ErrorOf(bytes), "BDMV/PLAYLIST/00000.mpls: offset 72: number of marks is 65535, but "
                              "expected at most 1 in the 14 bytes left in mark section");
}

TEST(ParsePlayList, ReadsTheDirectoryOfTheExtensionData)
{
    PlayListBytes bytes;
    bytes.extension = Part32(Join({U32(36), Zeros(3), U8(2), U16(1), U16(2), U32(36), U32(4),
                                   U16(3), U16(5), U32(0xFFFFFFFF), U32(0xFFFFFFFF)}));
    const PlayList playList = Parse(bytes);
    ASSERT_EQ(playList.extensionBlocks.size(), 2u);
    EXPECT_EQ(playList.extensionBlocks[0].kind, 1u);
    EXPECT_EQ(playList.extensionBlocks[0].subKind, 2u);
    EXPECT_EQ(playList.extensionBlocks[0].offset, 36u);
    EXPECT_EQ(playList.extensionBlocks[0].size, 4u);
    EXPECT_EQ(playList.extensionBlocks[1].size, 0xFFFFFFFFu) << "kept, because it is not read";
}

TEST(ParsePlayList, TreatsExtensionDataOfLengthZeroAsAnEmptyDirectory)
{
    PlayListBytes bytes;
    bytes.extension = Join({U32(0), Repeat(20, {1})});
    EXPECT_TRUE(Parse(bytes).extensionBlocks.empty());
}

TEST(ParsePlayList, RefusesMoreExtensionBlocksThanFollow)
{
    PlayListBytes bytes;
    bytes.extension = Part32(Join({Zeros(7), U8(2), Zeros(23)}));
    EXPECT_THROW(Parse(bytes), FormatError);
}

/** A play list with streams from every possible source. */
class ClipLookup : public testing::Test
{
protected:
    ClipLookup()
    {
        m_PlayList.playItems.resize(2);
        m_PlayList.playItems[0].clip.name = "00000";
        m_PlayList.playItems[1].clip.name = "00001";
        m_PlayList.subPaths.resize(2);
        m_PlayList.subPaths[0].items = {SubItem("00010", 1, {}), SubItem("00011", 1, {})};
        m_PlayList.subPaths[1].items = {SubItem("00020", 0, {"00021", "00022"})};
    }

    static SubPlayItem SubItem(const std::string& clip, std::uint16_t playItem,
                               const std::vector<std::string>& furtherClips)
    {
        SubPlayItem item;
        item.clip.name = clip;
        item.syncPlayItem = playItem;
        for (const std::string& name : furtherClips) {
            item.furtherClips.push_back({name, "M2TS", 0});
        }
        return item;
    }

    std::optional<std::string> Clip(std::size_t playItem, std::uint8_t entryType,
                                    std::uint8_t subPath = 0, std::uint8_t subClip = 0) const
    {
        Stream stream;
        stream.entryType = entryType;
        stream.subPath = subPath;
        stream.subClip = subClip;
        return ClipOfStream(m_PlayList, playItem, stream);
    }

    PlayList m_PlayList;
};

TEST_F(ClipLookup, IsTheClipOfThePlayItemForTypesOneThreeAndFour)
{
    EXPECT_EQ(Clip(0, EntryTypePlayItem), "00000");
    EXPECT_EQ(Clip(1, EntryTypePlayItemSubPath3), "00001");
    EXPECT_EQ(Clip(1, EntryTypePlayItemSubPath4), "00001");
}

TEST_F(ClipLookup, IsTheClipOfTheFirstSubPlayItemThatStartsInThePlayItem)
{
    EXPECT_EQ(Clip(1, EntryTypeSubPath), "00010");
}

TEST_F(ClipLookup, IsTheClipOfTheOnlySubPlayItemWhereverItStarts)
{
    EXPECT_EQ(Clip(1, EntryTypeSubPath, 1), "00020");
}

TEST_F(ClipLookup, IsTheClipOfTheSubPlayItemThatTheStreamNames)
{
    EXPECT_EQ(Clip(0, EntryTypeSubPath, 1, 1), "00021");
    EXPECT_EQ(Clip(0, EntryTypeSubPath, 1, 2), "00022");
}

TEST_F(ClipLookup, IsNothingIfTheReferenceIsInvalid)
{
    EXPECT_EQ(Clip(2, EntryTypePlayItem), std::nullopt) << "no such play item";
    EXPECT_EQ(Clip(0, EntryTypeSubPath), std::nullopt) << "none of the sub play items starts there";
    EXPECT_EQ(Clip(0, EntryTypeSubPath, 2), std::nullopt) << "no such sub path";
    EXPECT_EQ(Clip(0, EntryTypeSubPath, 1, 3), std::nullopt) << "no such clip";
    EXPECT_EQ(Clip(0, 5), std::nullopt) << "reserved entry type";
}

} // namespace

} // namespace deskplayer
