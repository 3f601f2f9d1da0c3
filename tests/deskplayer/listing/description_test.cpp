#include "listing/description.h"

#include <ctime>
#include <fstream>
#include <sstream>

#include <gtest/gtest.h>

#include "../disc/bytewriter.h"
#include "../disc/json.h"
#include "../disc/testdiscs.h"
#include "disc/aspectratios.h"
#include "discardingbuffer.h"
#include "readdescription.h"
#include "scratchdisc.h"

namespace deskplayer
{

namespace
{

using nlohmann::json;

std::string DescriptionOf(const Disc& disc, std::uint32_t number)
{
    std::ostringstream output;
    DescribePlayList(output, disc, number, disc.ReadPlayList(number));
    return output.str();
}

/** The description of a play list with @p bytes on the disc "pip". */
std::string DescriptionOf(const Bytes& bytes)
{
    const ScratchDisc scratch("pip");
    scratch.Write("PLAYLIST/00000.mpls", bytes);
    return DescriptionOf(scratch.Read(), 0);
}

std::string DescriptionOf(const PlayListBytes& bytes)
{
    return DescriptionOf(bytes.Make());
}

/** The chapters that follow from the marks of an expected play list. */
json ExpectedChapters(const json& playList)
{
    json chapters = json::array();
    std::size_t number = 0;
    const json& marks = playList.at("marks");
    for (std::size_t mark = 0; mark < marks.size(); ++mark) {
        if (marks[mark].at("type") != 1) {
            continue;
        }
        ++number;
        const json& start = marks[mark].at("position");
        if (start.is_null()) {
            continue;
        }
        if (!chapters.empty()) {
            chapters.back()["end"] = std::max(chapters.back()["start"], start);
        }
        chapters.push_back({{"number", number},
                            {"start", start},
                            {"end", playList.at("duration")},
                            {"mark", mark}});
    }
    return chapters;
}

TEST(DescribePlayList, ShowsEveryValueOfEveryPlayList)
{
    std::size_t playLists = 0;
    for (const auto& discs : {TestDiscs(), FurtherDiscs()}) {
        for (const auto& folder : discs) {
            json expected;
            std::ifstream(folder / "expected.json") >> expected;
            for (auto& [number, playList] : expected.at("play_lists").items()) {
                SCOPED_TRACE(folder.string() + " " + number);
                playList["chapters"] = ExpectedChapters(playList);
                const std::string text =
                    DescriptionOf(Disc(folder), std::uint32_t(std::stoul(number)));
                EXPECT_EQ(text.rfind("play list " + number + ": ", 0), 0u);
                EXPECT_EQ(json::diff(ReadDescription(text), playList).dump(1), "[]");
                ++playLists;
            }
        }
    }
    EXPECT_GE(playLists, 23u);
}

/** Descriptions omit the sub path of a stream with a reserved entry type. */
void RemoveSubPathsOfReservedEntryTypes(json& playList)
{
    for (json& item : playList.at("items")) {
        for (json& kind : item.at("streams")) {
            for (json& stream : kind) {
                if (stream.at("entry_type") > EntryTypePlayItemSubPath4) {
                    stream.erase("sub_path");
                }
            }
        }
    }
}

/** A play list with two of everything, including kinds that are rare on discs. */
Bytes RichPlayList()
{
    const Bytes counts{2, 1, 3, 1, 1, 1, 1, 1};
    const Bytes entryOfSubPath = Part8(Join({U8(2), U8(0), U8(1), U16(0x1B00), Zeros(4)}));
    const auto entryInClip = [](unsigned type, unsigned pid) {
        return Part8(Join({U8(type), U8(0), U16(pid), Zeros(5)}));
    };
    const Bytes streams = Join({
        StreamEntry(0x1011),
        StreamAttributesBytes(0x1B, {0x61, 0, 0, 0}), // video
        StreamEntry(0x1015),
        StreamAttributesBytes(0x24, {0x81, 0x12, 0x40, 0}), // video
        StreamEntry(0x1100),
        StreamAttributesBytes(0x81, Join({U8(0x61), Ascii("eng")})),
        StreamEntry(0x1200),
        StreamAttributesBytes(0x90, Join({Ascii("fra"), U8(0)})),
        StreamEntry(0x1800),
        StreamAttributesBytes(0x92, Join({U8(1), Ascii("deu")})),
        StreamEntry(0x1801),
        StreamAttributesBytes(0x55, Zeros(4)), // reserved
        StreamEntry(0x1201),
        StreamAttributesBytes(0x90, Join({Ascii("ita"), U8(0)})),
        StreamEntry(0x1400),
        StreamAttributesBytes(0x91, Join({Ascii("spa"), U8(0)})),
        entryInClip(3, 0x1A00),
        StreamAttributesBytes(0xA1, Join({U8(0x31), Ascii("jpn")})),
        U8(1),
        U8(0),
        U8(0),
        U8(0), // primary audio
        entryOfSubPath,
        StreamAttributesBytes(0x1B, {0x31, 0, 0, 0}),
        U8(2),
        U8(0),
        U8(0),
        U8(4), // secondary audio
        U8(1),
        U8(0),
        U8(2),
        U8(0), // subtitles
        entryInClip(4, 0x1016),
        StreamAttributesBytes(0x24, {0x81, 0x21, 0x80, 0}),
    });

    PlayItemBytes first;
    first.clip = "00000";
    first.angleAndConnection = 0x16;
    first.stcSequence = 3;
    first.uoMask = 0x2000000040000001;
    first.randomAccess = 0x80;
    first.stillMode = StillModeTimed;
    first.stillTime = 12;
    first.angleTable =
        Join({U8(3), U8(2), FurtherClip("00003", "M2TS", 1), FurtherClip("00004", "FMTS", 2)});
    first.streamTable = StreamTableBytes(counts, streams);
    PlayItemBytes second;
    second.inTime = 90000;
    second.outTime = 180000;
    second.angleAndConnection = 0x11;
    second.angleTable = {1, 1};

    SubPlayItemBytes subItem;
    subItem.connectionAndClips = 5 << 1 | 1;
    subItem.stcSequence = 4;
    subItem.clipTable = Join({U8(2), U8(0), FurtherClip("00000", "M2TS", 7)});
    SubPlayItemBytes laterSubItem;
    laterSubItem.syncPlayItem = 1;

    PlayListBytes playList;
    playList.version = "0300";
    playList.applicationInfo = Part32(
        Join({U8(0), U8(PlaybackTypeRandom), U16(258), U64(0x3C00000000000000), U16(0x5000)}));
    playList.itemCount = 2;
    playList.items = Join({first.Make(), second.Make()});
    playList.subPathCount = 2;
    playList.subPaths = Join({SubPathBytes(6, 1, 2, Join({subItem.Make(), laterSubItem.Make()})),
                              SubPathBytes(4, 0, 0, {})});
    playList.marks =
        Part32(Join({U16(3), MarkBytes(MarkTypeEntry, 0, 1004), MarkBytes(MarkTypeLink, 7, 1000),
                     Join({U8(0), U8(MarkTypeEntry), U16(1), U32(90045), U16(0x1011), U32(450)})}));
    playList.extension = Part32(Join({U32(36), Zeros(3), U8(2), U16(1), U16(2), U32(36), U32(4),
                                      U16(3), U16(5), U32(0xFFFFFFFF), U32(1)}));
    return playList.Make();
}

TEST(DescribePlayList, ShowsAChangeOfAnyByte)
{
    const ScratchDisc scratch("pip");
    const Disc disc = scratch.Read();
    AspectRatios ratios(disc);
    std::size_t compared = 0;
    Bytes bytes = RichPlayList();
    for (std::uint8_t& byte : bytes) {
        const std::uint8_t original = byte;
        for (const int flipped : {0x01, 0x80}) {
            byte = static_cast<std::uint8_t>(original ^ flipped);
            scratch.Write("PLAYLIST/00000.mpls", bytes);
            PlayList playList;
            try {
                playList = disc.ReadPlayList(0);
            } catch (const FormatError&) {
                continue;
            }
            json expected = ToJson(playList, [&](std::size_t playItem, const Stream& stream) {
                return ratios.Find(playList, playItem, stream).code;
            });
            expected["chapters"] = ExpectedChapters(expected);
            RemoveSubPathsOfReservedEntryTypes(expected);
            const std::string text = DescriptionOf(disc, 0);
            ASSERT_TRUE(ReadDescription(text) == expected) << text;
            ++compared;
        }
        byte = original;
    }
    EXPECT_GT(compared, 800u);
}

TEST(DescribePlayList, ExplainsTheValues)
{
    EXPECT_EQ(
        DescriptionOf(RichPlayList()),
        R"(play list 00000: version 0300, playback type 2 (random; played in sequence), playback count 258, duration 90010 (00:00:02.000)
  flags: random access flag no, audio mixing yes, lossless bypass no, base view is right eye yes
  user operations: mask 3C00000000000000 (forbids ChapterSearch, TimeSearch, SkipToNextPoint, SkipBackToPreviousPoint)
  play item 0: clip 00000, codec M2TS, STC sequence 3, connection condition 6 (seamless, on the same time line)
    time: IN 1000 (00:00:00.022), OUT 1010 (00:00:00.022), start 0 (00:00:00.000), duration 10 (00:00:00.000)
    still: mode 1 (timed), seconds 12
    flags: random access flag yes
    user operations: mask 2000000040000001 (forbids ChapterSearch, PiPPGTextSTStreamNumberChange, 63)
    angles: count 3, different audios yes, seamless change no
    angle 2: clip 00003, codec M2TS, STC sequence 1
    angle 3: clip 00004, codec FMTS, STC sequence 2
    primary video 1: entry type 1 (play item), PID 0x1011, coding type 0x1B (H.264 video), format 6 (1080p), rate 1 (23.976 Hz), aspect 3 (16:9)
    primary video 2: entry type 1 (play item), PID 0x1015, coding type 0x24 (H.265 video), format 8 (2160p), rate 1 (23.976 Hz), aspect none (not in the clip information), dynamic range 1 (high), colour space 2 (BT.2020), HDR flag no, dynamic metadata yes
    primary audio 1: entry type 1 (play item), PID 0x1100, coding type 0x81 (AC-3 audio), presentation 6 (multichannel), sample rate 1 (48 kHz), language eng (English)
    subtitles 1: entry type 1 (play item), PID 0x1200, coding type 0x90 (presentation graphics), language fra (French)
    subtitles 2: entry type 1 (play item), PID 0x1800, coding type 0x92 (text subtitle), character code 1 (UTF-8), language deu (German)
    subtitles 3: entry type 1 (play item), PID 0x1801, coding type 0x55 (reserved)
    picture-in-picture subtitles 1: entry type 1 (play item), PID 0x1201, coding type 0x90 (presentation graphics), language ita (Italian)
    menu 1: entry type 1 (play item), PID 0x1400, coding type 0x91 (interactive graphics), language spa (Spanish)
    secondary audio 1: entry type 3 (play item, for a sub path), PID 0x1A00, sub path 0, coding type 0xA1 (E-AC-3 audio, secondary), presentation 3 (stereo), sample rate 1 (48 kHz), language jpn (Japanese), primary audio 1
    secondary video 1: entry type 2 (sub path), PID 0x1B00, sub path 0, clip 1, coding type 0x1B (H.264 video), format 3 (480p), rate 1 (23.976 Hz), aspect 2 (4:3), secondary audio 1 5, picture-in-picture subtitles 3
    enhancement video 1: entry type 4 (play item, for a sub path), PID 0x1016, sub path 0, coding type 0x24 (H.265 video), format 8 (2160p), rate 1 (23.976 Hz), aspect none (not in the clip information), dynamic range 2 (two-layer high), colour space 1 (BT.709), HDR flag yes, dynamic metadata no
  play item 1: clip 00001, codec M2TS, STC sequence 0, connection condition 1 (not seamless)
    time: IN 90000 (00:00:02.000), OUT 180000 (00:00:04.000), start 10 (00:00:00.000), duration 90000 (00:00:02.000)
    still: mode 0 (none), seconds 0
    flags: random access flag no
    user operations: mask 0000000000000000 (forbids nothing)
    angles: count 1, different audios no, seamless change yes
  sub path 0: type 6 (asynchronous picture-in-picture of another clip), repeat yes
    sub play item 0: clip 00002, codec M2TS, STC sequence 4, connection condition 5 (seamless)
      time: IN 2000 (00:00:00.044), OUT 2020 (00:00:00.044), duration 20 (00:00:00.000)
      starts: play item 0, at 1000 (00:00:00.022)
      clip 1: clip 00000, codec M2TS, STC sequence 7
    sub play item 1: clip 00002, codec M2TS, STC sequence 0, connection condition 1 (not seamless)
      time: IN 2000 (00:00:00.044), OUT 2020 (00:00:00.044), duration 20 (00:00:00.000)
      starts: play item 1, at 1000 (00:00:00.022)
  sub path 1: type 4 (text subtitles), repeat no
  mark 0: type 1 (entry), play item 0, time 1004 (00:00:00.022), PID 0xFFFF (all streams), duration 0 (00:00:00.000), position 4 (00:00:00.000)
  mark 1: type 2 (link), play item 7, time 1000 (00:00:00.022), PID 0xFFFF (all streams), duration 0 (00:00:00.000), position none (not within the play item)
  mark 2: type 1 (entry), play item 1, time 90045 (00:00:02.001), PID 0x1011, duration 450 (00:00:00.010), position 55 (00:00:00.001)
  chapter 1: start 4 (00:00:00.000), end 55 (00:00:00.001), mark 0
  chapter 2: start 55 (00:00:00.001), end 90010 (00:00:02.000), mark 2
  extension block 0: kind 1.2, offset 36, size 4
  extension block 1: kind 3.5, offset 4294967295, size 1
)");
}

TEST(DescribePlayList, MarksReservedCodes)
{
    PlayItemBytes item;
    item.angleAndConnection = 9;
    item.stillMode = 8;
    item.streamTable = StreamTableBytes(
        {1, 1, 0, 0, 0, 0, 0, 0}, Join({Part8(Join({U8(7), Zeros(8)})),
                                        StreamAttributesBytes(0x1B, Zeros(4)), AudioStream(1)}));
    PlayListBytes playList = WithItem(item);
    playList.marks = Part32(Join({U16(1), MarkBytes(6, 0, 1000)}));
    const std::string text = DescriptionOf(playList);

    for (const char* const value :
         {"playback type 0 (reserved)", "connection condition 9 (reserved)", "mode 8 (reserved)",
          "entry type 7 (reserved), PID 0x0000, coding", "format 0 (reserved), rate 0 (reserved)",
          "presentation 0 (reserved), sample rate 0 (reserved)", "type 6 (reserved), play item"}) {
        EXPECT_NE(text.find(value), std::string::npos) << value << " in\n" << text;
    }
}

TEST(DescribePlayList, IsSafeToPrintForAnyTextOnADisc)
{
    PlayItemBytes item;
    item.angleAndConnection = 0x11;
    item.angleTable = Join({U8(2), U8(0), FurtherClip("00001", "\x1B[2J", 0)});
    item.streamTable = StreamTableBytes(
        {0, 0, 1, 0, 0, 0, 0, 0},
        Join({StreamEntry(0x1200), StreamAttributesBytes(0x90, {'a', '\n', 0x9B, 0})}));
    const std::string text = DescriptionOf(WithItem(item));

    EXPECT_NE(text.find("codec \\x1B[2J, STC"), std::string::npos) << text;
    EXPECT_NE(text.find("language a\\x0A\\x9B\n"), std::string::npos) << text;
}

/** Describes a play list with one stream of the disc "pip". @return its aspect ratio */
std::string AspectOfVideo(const ScratchDisc& scratch, unsigned pid, const std::string& clip)
{
    PlayItemBytes item;
    item.clip = clip;
    item.streamTable =
        StreamTableBytes({1, 0, 0, 0, 0, 0, 0, 0},
                         Join({StreamEntry(pid), StreamAttributesBytes(0x1B, {0x61, 0, 0, 0})}));
    scratch.Write("PLAYLIST/00000.mpls", WithItem(item).Make());
    const std::string text = DescriptionOf(scratch.Read(), 0);
    const std::size_t begin = text.find("aspect ");
    return text.substr(begin, text.find('\n', begin) - begin);
}

TEST(DescribePlayList, GivesTheReasonForAnUnknownAspectRatio)
{
    const ScratchDisc scratch("pip");
    EXPECT_EQ(AspectOfVideo(scratch, 0x1011, "00000"), "aspect 3 (16:9)");
    EXPECT_EQ(AspectOfVideo(scratch, 0x1012, "00000"), "aspect none (not in the clip information)");
    EXPECT_EQ(AspectOfVideo(scratch, 0x1100, "00000"), "aspect none (not in the clip information)")
        << "an audio stream has none";
    EXPECT_NE(AspectOfVideo(scratch, 0x1011, "00009").find("CLIPINF/00009.clpi: "),
              std::string::npos);
    scratch.Write("CLIPINF/00000.clpi", Ascii("HDMV"));
    EXPECT_EQ(AspectOfVideo(scratch, 0x1011, "00000")
                  .rfind("aspect none (BDMV/CLIPINF/00000.clpi: offset 4: ", 0),
              0u);
}

TEST(DescribePlayList, LooksUpAnAspectRatioInTheClipOfThePlayItem)
{
    PlayItemBytes item;
    item.clip = "00009";
    PlayItemBytes withVideo;
    withVideo.clip = "00000";
    withVideo.streamTable =
        StreamTableBytes({1, 0, 0, 0, 0, 0, 0, 0},
                         Join({StreamEntry(0x1011), StreamAttributesBytes(0x1B, {0x61, 0, 0, 0})}));
    PlayListBytes playList;
    playList.itemCount = 2;
    playList.items = Join({item.Make(), withVideo.Make()});
    EXPECT_NE(DescriptionOf(playList).find("aspect 3 (16:9)"), std::string::npos);
}

Bytes VideoOfProgram(unsigned pid, unsigned aspect)
{
    return Join({U16(pid), Part8(Join({U8(0x1B), U8(0x61), U8(aspect << 4), Zeros(18)}))});
}

TEST(DescribePlayList, UsesTheFirstOfTwoVideoStreamsWithTheSamePid)
{
    const ScratchDisc scratch("pip");
    const Bytes videos = Join({VideoOfProgram(0x1011, 2), VideoOfProgram(0x1011, 3)});
    scratch.Write("CLIPINF/00000.clpi", ClipInfoOf(1, ProgramBytes(2, videos)));
    EXPECT_EQ(AspectOfVideo(scratch, 0x1011, "00000"), "aspect 2 (4:3)");
}

/** A play list of almost LargestPlayListFile bytes, filled with play items or marks. */
Bytes GreatPlayList(const Bytes& item, const Bytes& mark)
{
    PlayListBytes playList;
    playList.itemCount = unsigned(std::min<std::size_t>(65535, 1000000 / item.size()));
    playList.items = Repeat(playList.itemCount, item);
    const std::size_t room = LargestPlayListFile - playList.items.size() - 200;
    const auto marks = unsigned(std::min<std::size_t>(65535, room / mark.size()));
    playList.marks = Part32(Join({U16(marks), Repeat(marks, mark)}));
    return playList.Make();
}

TEST(DescribePlayList, WritesTheLargestPlayListsPromptlyAndInSmallPieces)
{
    PlayItemBytes item;
    item.clip = "00000";
    const Bytes itemWithoutStreams = item.Make();
    item.streamTable = StreamTableBytes(
        {255, 0, 0, 0, 0, 0, 0, 0},
        Repeat(255, Join({StreamEntry(0x1011), StreamAttributesBytes(0x1B, {0x61, 0, 0, 0})})));
    const Bytes mark = MarkBytes(MarkTypeEntry, 0, 1000);

    const ScratchDisc scratch("pip");
    Bytes clip = ClipInfoOf(255, Repeat(255, ProgramBytes(255, Repeat(255, VideoOfProgram(1, 3)))));
    clip.resize(LargestFile);
    scratch.Write("CLIPINF/00000.clpi", clip);
    for (const Bytes& playItem : {itemWithoutStreams, item.Make()}) {
        scratch.Write("PLAYLIST/00000.mpls", GreatPlayList(playItem, mark));
        const Disc disc = scratch.Read();
        DiscardingBuffer buffer;
        std::ostream output(&buffer);
        const std::clock_t before = std::clock();
        DescribePlayList(output, disc, 0, disc.ReadPlayList(0));
        EXPECT_LT((std::clock() - before) / CLOCKS_PER_SEC, 30);
        EXPECT_GT(buffer.Size(), 2500000u);
        EXPECT_LT(buffer.LargestWrite(), 1000u);
    }
}

} // namespace

} // namespace deskplayer
