#include "listing/listing.h"

#include <algorithm>
#include <ctime>
#include <fstream>
#include <functional>
#include <regex>
#include <sstream>

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

#include "../disc/bytewriter.h"
#include "../disc/testdiscs.h"
#include "disc/codes.h"
#include "discardingbuffer.h"
#include "scratchdisc.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

using nlohmann::json;

using Lines = std::vector<std::string>;

std::string ListingOf(const Disc& disc)
{
    std::ostringstream output;
    ListPlayLists(output, disc, disc.PlayListNumbers());
    return output.str();
}

/** The row of play list 0 with @p bytes. */
Lines RowsOf(const Bytes& bytes)
{
    const ScratchDisc scratch("pip");
    scratch.Write("PLAYLIST/00000.mpls", bytes);
    std::istringstream listing(ListingOf(scratch.Read()));
    Lines lines;
    for (std::string line; std::getline(listing, line);) {
        lines.push_back(line);
    }
    const auto headings = std::find_if(lines.begin(), lines.end(), [](const std::string& line) {
        return line.rfind("Number", 0) == 0;
    });
    return Lines(headings + 1, lines.end());
}

Bytes WithSubtitles(const Lines& languages)
{
    Bytes streams;
    for (const std::string& language : languages) {
        streams = Join({streams, StreamEntry(0x1200),
                        StreamAttributesBytes(0x90, Join({Ascii(language), U8(0)}))});
    }
    const auto count = static_cast<std::uint8_t>(languages.size());
    return WithStreams({0, 0, count, 0, 0, 0, 0, 0}, streams).Make();
}

/** The values of an index, parsed from its lines. */
class ListedIndex
{
public:
    explicit ListedIndex(const std::string& listing)
    {
        std::istringstream lines(listing);
        for (std::string line; std::getline(lines, line) && !line.empty();) {
            m_Lines.push_back(line);
        }
    }

    json ToJson() const
    {
        const std::string index = m_Lines.at(0);
        json result{{"version", Match(index, "^Index {11}version (\\d+),")},
                    {"initial_output_mode",
                     int(index.find(", stereoscopic output preferred") != std::string::npos)},
                    {"ss_content", int(index.find(", stereoscopic content") != std::string::npos)},
                    {"video_format", 0},
                    {"frame_rate", 0},
                    {"titles", json::array()}};
        for (std::uint8_t code = 1; code < 16; ++code) {
            if (index.find(", " + VideoFormatName(code) + ",") != std::string::npos) {
                result["video_format"] = code;
            }
            if (index.find(", " + FrameRateName(code) + ",") != std::string::npos) {
                result["frame_rate"] = code;
            }
        }
        result["first_playback"] = ObjectOf(1, "First playback");
        result["top_menu"] = ObjectOf(2, "Top menu");
        for (std::size_t line = 3; line < m_Lines.size(); ++line) {
            json title = ObjectOf(line, "Title " + std::to_string(line - 2));
            title["access_type"] = AccessOf(m_Lines[line]);
            result["titles"].push_back(title);
        }
        EXPECT_EQ(Match(index, ", (\\d+) titles?$"), std::to_string(result["titles"].size()));
        return result;
    }

private:
    static std::string Match(const std::string& text, const std::string& pattern)
    {
        std::smatch match;
        return std::regex_search(text, match, std::regex(pattern)) ? match.str(1) : "";
    }

    json ObjectOf(std::size_t number, std::string label) const
    {
        const std::string& line = m_Lines.at(number);
        label.resize(16, ' ');
        EXPECT_EQ(line.substr(0, 16), label);
        json object;
        const bool java = line.compare(16, 5, "Java ") == 0;
        object["object_type"] = java ? 2 : 1;
        if (java) {
            object["bdj_object"] = Match(line, "Java object (\\S{5}),");
        } else {
            object["movie_object"] = std::stoi(Match(line, "movie object (\\d+),"));
        }
        const std::string playback = Match(line, "object \\S+, (\\w+)");
        EXPECT_TRUE(playback == "movie" || playback == "interactive");
        object["playback_type"] = (java ? 2 : 0) + (playback == "interactive" ? 1 : 0);
        return object;
    }

    static int AccessOf(const std::string& line)
    {
        const std::string type = Match(line, ", title search forbidden \\(access type (\\d)\\)$");
        if (!type.empty()) {
            return std::stoi(type);
        }
        const std::string access = Match(line, ", title search (\\w+)$");
        EXPECT_TRUE(access == "permitted" || access == "forbidden");
        return access == "forbidden" ? 1 : 0;
    }

    Lines m_Lines;
};

void ForEveryDisc(const std::function<void(const Disc&, const json&)>& visit)
{
    std::size_t count = 0;
    for (const auto& discs : {TestDiscs(), FurtherDiscs()}) {
        for (const auto& folder : discs) {
            SCOPED_TRACE(folder.string());
            json expected;
            std::ifstream(folder / "expected.json") >> expected;
            visit(Disc(folder), expected);
            ++count;
        }
    }
    EXPECT_GE(count, 15u);
}

TEST(ListPlayLists, ShowsTheIndexOfEveryDisc)
{
    ForEveryDisc([](const Disc& disc, const json& expected) {
        const json index = ListedIndex(ListingOf(disc)).ToJson();
        EXPECT_EQ(json::diff(index, expected.at("index")).dump(1), "[]");
    });
}

std::string VideoLine(const std::string& label, const json& stream)
{
    std::string line = label + ": " + CodingTypeName(stream.at("coding_type")) + ", " +
                       VideoFormatName(stream.at("video_format")) + ", " +
                       FrameRateName(stream.at("frame_rate"));
    if (stream.contains("dynamic_range")) {
        line += ", " + DynamicRangeName(stream.at("dynamic_range")) + " dynamic range";
    }
    return line + ", " +
           (stream.at("aspect").is_null() ? "aspect ratio unknown"
                                          : AspectRatioName(stream.at("aspect")));
}

std::string AudioLine(const std::string& label, const json& stream)
{
    return label + ": " + LanguageName(stream.at("language")) + ": " +
           CodingTypeName(stream.at("coding_type")) + ", " +
           AudioPresentationName(stream.at("audio_presentation")) + ", " +
           SampleRateName(stream.at("sample_rate"));
}

void AddLanguageLine(Lines& lines, const std::string& label, const json& streams)
{
    std::string line;
    for (const json& stream : streams) {
        line += (line.empty() ? label + ": " : ", ") + LanguageName(stream.at("language"));
    }
    if (!line.empty()) {
        lines.push_back(line);
    }
}

/** The lines of a play list without the one about other streams, which has its own tests. */
Lines ExpectedStreams(const json& streams)
{
    Lines lines;
    for (const json& stream : streams.at("video")) {
        lines.push_back(VideoLine("video", stream));
    }
    for (const json& stream : streams.at("dv")) {
        lines.push_back(VideoLine("enhancement video", stream));
    }
    for (const json& stream : streams.at("audio")) {
        lines.push_back(AudioLine("audio", stream));
    }
    AddLanguageLine(lines, "subtitles", streams.at("pg"));
    AddLanguageLine(lines, "menus", streams.at("ig"));
    for (const json& stream : streams.at("secondary_video")) {
        lines.push_back(VideoLine("secondary video", stream));
    }
    for (const json& stream : streams.at("secondary_audio")) {
        lines.push_back(AudioLine("secondary audio", stream));
    }
    AddLanguageLine(lines, "picture-in-picture subtitles", streams.at("pip_pg"));
    return lines;
}

/** The complete row of a play list in the listing. */
std::string ExpectedRows(const std::string& number, const json& playList)
{
    std::size_t chapters = 0;
    for (const json& mark : playList.at("marks")) {
        chapters += mark.at("type") == 1 && !mark.at("position").is_null();
    }
    std::size_t angles = 0;
    json longest;
    std::uint64_t duration = 0;
    for (const json& item : playList.at("items")) {
        angles = std::max(angles, item.at("angles").size());
        const std::uint64_t itemDuration =
            item.at("out").get<std::uint64_t>() - item.at("in").get<std::uint64_t>();
        if (longest.is_null() || itemDuration > duration) {
            longest = item;
            duration = itemDuration;
        }
    }
    std::ostringstream rows;
    rows << number << "   " << TimeText(Ticks(playList.at("duration").get<Ticks::rep>()));
    rows.width(7);
    rows << playList.at("items").size();
    rows.width(10);
    rows << chapters;
    rows.width(8);
    rows << angles;
    std::string separator = "  ";
    for (const std::string& line : ExpectedStreams(longest.at("streams"))) {
        rows << separator << line;
        separator = "\n" + std::string(47, ' ');
    }
    return rows.str() + "\n";
}

TEST(ListPlayLists, ShowsEveryPlayListOfEveryDisc)
{
    ForEveryDisc([](const Disc& disc, const json& expected) {
        std::string rows = "Number  Duration      Items  Chapters  Angles  Streams\n";
        for (const auto& [number, playList] : expected.at("play_lists").items()) {
            rows += ExpectedRows(number, playList);
        }
        const std::string listing = std::regex_replace(
            ListingOf(disc), std::regex(" *other streams in .* play items\n"), "");
        const std::size_t begin = listing.find("\n\n") + 2;
        EXPECT_EQ(listing.substr(begin), rows);
    });
}

TEST(ListPlayLists, IsATable)
{
    const ScratchDisc scratch("titles");
    for (const char* const number : {"00000", "00001", "00002"}) {
        scratch.Remove("PLAYLIST/" + std::string(number) + ".mpls");
    }
    EXPECT_EQ(ListingOf(scratch.Read()), R"(Index           version 0200, 5 titles
First playback  movie object 6, interactive
Top menu        movie object 5, interactive
Title 1         movie object 0, movie, title search permitted
Title 2         movie object 1, movie, title search permitted
Title 3         movie object 2, movie, title search permitted
Title 4         movie object 3, movie, title search permitted
Title 5         movie object 4, movie, title search permitted

Number  Duration      Items  Chapters  Angles  Streams
00003   00:00:10.010      1         1       1  video: MPEG-2 video, 1080i, 29.97 Hz, 16:9
                                               audio: Japanese: LPCM audio, stereo, 48 kHz
00800   00:00:24.000      4         3       1  video: H.264 video, 1080p, 24 Hz, 16:9
                                               audio: English: AC-3 audio, multichannel, 48 kHz
)");
}

TEST(ListPlayLists, CountsPlayItemsWithOtherStreamsThanTheLongest)
{
    PlayItemBytes shorter;
    PlayItemBytes alike;
    alike.streamTable = StreamTableBytes({0, 1, 0, 0, 0, 0, 0, 0}, AudioStream(0x1100));
    PlayItemBytes longest = alike;
    longest.outTime = longest.inTime + 100;
    PlayListBytes playList;
    playList.itemCount = 3;
    playList.items = Join({shorter.Make(), longest.Make(), alike.Make()});

    const Lines rows = RowsOf(playList.Make());

    ASSERT_EQ(rows.size(), 2u);
    EXPECT_EQ(rows[0].substr(47), "audio: no language: AC-3 audio, reserved (0), reserved (0)");
    EXPECT_EQ(rows[1], std::string(47, ' ') + "other streams in 1 of 3 play items");
}

TEST(ListPlayLists, IgnoresDifferencesInPidsOnly)
{
    PlayItemBytes item;
    item.streamTable = StreamTableBytes({0, 1, 0, 0, 0, 0, 0, 0}, AudioStream(0x1100));
    PlayItemBytes other;
    other.streamTable = StreamTableBytes({0, 1, 0, 0, 0, 0, 0, 0}, AudioStream(0x1101));
    PlayListBytes playList;
    playList.itemCount = 2;
    playList.items = Join({item.Make(), other.Make()});
    EXPECT_EQ(RowsOf(playList.Make()).size(), 1u);
}

TEST(ListPlayLists, ShowsStreamsOfEveryKind)
{
    const auto audio = [](const std::string& language) {
        return Join(
            {StreamEntry(1), StreamAttributesBytes(0x81, Join({U8(0x31), Ascii(language)}))});
    };
    const auto graphics = [](const std::string& language) {
        return Join({StreamEntry(1), StreamAttributesBytes(0x90, Join({Ascii(language), U8(0)}))});
    };
    const auto video = [](unsigned format) {
        return Join({StreamEntry(1),
                     StreamAttributesBytes(0x1B, {std::uint8_t(format << 4 | 1), 0, 0, 0})});
    };
    PlayListBytes playList =
        WithStreams({1, 1, 1, 1, 1, 1, 1, 1},
                    Join({video(6), audio("eng"), graphics("fra"), graphics("deu"), graphics("spa"),
                          audio("ita"), Zeros(2), video(3), Zeros(4), video(8)}));
    playList.version = "0300";
    const Lines rows = RowsOf(playList.Make());

    const Lines expected = {
        "video: H.264 video, 1080p, 23.976 Hz, aspect ratio unknown",
        "enhancement video: H.264 video, 2160p, 23.976 Hz, aspect ratio unknown",
        "audio: English: AC-3 audio, stereo, 48 kHz",
        "subtitles: French",
        "menus: Spanish",
        "secondary video: H.264 video, 480p, 23.976 Hz, aspect ratio unknown",
        "secondary audio: Italian: AC-3 audio, stereo, 48 kHz",
        "picture-in-picture subtitles: German",
    };
    ASSERT_EQ(rows.size(), expected.size());
    for (std::size_t line = 0; line < rows.size(); ++line) {
        EXPECT_EQ(rows[line].substr(47), expected[line]);
    }
}

TEST(ListPlayLists, BreaksLongListsOfLanguages)
{
    const Lines rows =
        RowsOf(WithSubtitles({"eng", "fra", "deu", "spa", "ita", "jpn", "dut", "swe"}));
    ASSERT_EQ(rows.size(), 2u);
    EXPECT_EQ(rows[0].substr(47), "subtitles: English, French, German, Spanish, Italian,");
    EXPECT_EQ(rows[1], std::string(58, ' ') + "Japanese, Dutch, Swedish");
}

TEST(ListPlayLists, BreaksALineBeforeItBecomesTooLong)
{
    const Lines rows = RowsOf(WithSubtitles({"eng", "fra", "deu", "spa", "est", "ita"}));
    ASSERT_EQ(rows.size(), 2u);
    EXPECT_EQ(rows[0].substr(47), "subtitles: English, French, German, Spanish,");
}

TEST(ListPlayLists, ShowsAStreamThatIsLongerThanALine)
{
    const Bytes stream = Join({StreamEntry(0x1200), StreamAttributesBytes(0x20, {0x61, 0, 0, 0})});
    const Lines rows = RowsOf(WithStreams({0, 0, 1, 0, 0, 0, 0, 0}, stream).Make());
    ASSERT_EQ(rows.size(), 1u);
    EXPECT_EQ(rows[0].substr(47), "subtitles: H.264 video, dependent view, 1080p, 23.976 Hz");
}

TEST(ListPlayLists, ShowsAPlayListWithoutPlayItems)
{
    EXPECT_EQ(RowsOf(PlayListBytes().Make()),
              Lines{"00000   00:00:00.000      0         0       0"});
}

TEST(ListPlayLists, ReportsAnUnknownAspectRatio)
{
    const Bytes video = Join({StreamEntry(0x1011), StreamAttributesBytes(0x1B, {0x61, 0, 0, 0})});
    const Lines rows = RowsOf(WithStreams({1, 0, 0, 0, 0, 0, 0, 0}, video).Make());
    EXPECT_EQ(rows.at(0).substr(47), "video: H.264 video, 1080p, 23.976 Hz, aspect ratio unknown");
}

TEST(ListPlayLists, LooksUpAnAspectRatioInTheClipOfThePlayItem)
{
    PlayItemBytes item;
    item.clip = "00009";
    PlayItemBytes longest;
    longest.clip = "00000";
    longest.outTime = longest.inTime + 100;
    longest.streamTable =
        StreamTableBytes({1, 0, 0, 0, 0, 0, 0, 0},
                         Join({StreamEntry(0x1011), StreamAttributesBytes(0x1B, {0x61, 0, 0, 0})}));
    PlayListBytes playList;
    playList.itemCount = 2;
    playList.items = Join({item.Make(), longest.Make()});
    EXPECT_EQ(RowsOf(playList.Make()).at(0).substr(47),
              "video: H.264 video, 1080p, 23.976 Hz, 16:9");
}

TEST(ListPlayLists, CountsUnreadablePlayListsAndGivesTheReasons)
{
    const ScratchDisc scratch("pip");
    scratch.Write("PLAYLIST/00001.mpls", Ascii("INDX"));
    scratch.Write("PLAYLIST/00002.mpls", PlayListBytes().Make());
    scratch.Write("PLAYLIST/00003.mpls", {});
    std::ostringstream output;

    EXPECT_EQ(ListPlayLists(output, scratch.Read(), {0, 1, 2, 3}), 2u);

    const std::string listing = output.str();
    EXPECT_TRUE(std::regex_search(
        listing, std::regex("\n00001   BDMV/PLAYLIST/00001\\.mpls: offset 0: [^\n]+\n00002   00:")))
        << listing;
    EXPECT_TRUE(std::regex_search(
        listing, std::regex("\n00003   BDMV/PLAYLIST/00003\\.mpls: offset 0: [^\n]+\n$")))
        << listing;
}

TEST(ListPlayLists, HasNoFaultsIfEverythingCanBeRead)
{
    const Disc disc(TestDisc("titles"));
    std::ostringstream output;
    EXPECT_EQ(ListPlayLists(output, disc, disc.PlayListNumbers()), 0u);
}

/** Lists play list 0 and returns the faults. */
std::vector<std::string> FaultsOf(const ScratchDisc& scratch)
{
    std::vector<std::string> faults;
    std::ostringstream output;
    const std::size_t count =
        ListPlayLists(output, scratch.Read(), {0},
                      [&](const std::string& message) { faults.push_back(message); });
    EXPECT_EQ(count, faults.size());
    return faults;
}

TEST(ListPlayLists, ReportsAMissingIndexAsAFault)
{
    const ScratchDisc scratch("pip");
    scratch.Remove("index.bdmv");
    const std::vector<std::string> faults = FaultsOf(scratch);
    ASSERT_EQ(faults.size(), 1u);
    EXPECT_NE(faults[0].find("index.bdmv: "), std::string::npos);
}

TEST(ListPlayLists, ReportsAnUnreadablePlayListAsAFault)
{
    const ScratchDisc scratch("pip");
    scratch.Write("PLAYLIST/00000.mpls", Ascii("INDX"));
    const std::vector<std::string> faults = FaultsOf(scratch);
    ASSERT_EQ(faults.size(), 1u);
    EXPECT_EQ(faults[0].rfind("BDMV/PLAYLIST/00000.mpls: offset 0: ", 0), 0u);
}

TEST(ListPlayLists, ReportsMissingAndDamagedClipInformationAsAFault)
{
    const ScratchDisc scratch("pip");
    scratch.Write("CLIPINF/00000.clpi", Ascii("HDMV"));
    std::vector<std::string> faults = FaultsOf(scratch);
    ASSERT_EQ(faults.size(), 1u);
    EXPECT_EQ(faults[0].rfind("BDMV/CLIPINF/00000.clpi: offset 4: ", 0), 0u);

    scratch.Remove("CLIPINF/00000.clpi");
    faults = FaultsOf(scratch);
    ASSERT_EQ(faults.size(), 1u);
    EXPECT_NE(faults[0].find("00000.clpi: No such file or directory"), std::string::npos);
}

TEST(ListPlayLists, ContinuesWithoutAnIndex)
{
    const ScratchDisc scratch("pip");
    scratch.Remove("index.bdmv");
    EXPECT_TRUE(std::regex_search(
        ListingOf(scratch.Read()),
        std::regex(
            "^Index {11}[^\n]*index\\.bdmv: [^\n]+\n\nNumber [^\n]*\n00000   00:01:00\\.018")));
}

TEST(ListPlayLists, ContinuesAfterAnUnreadableIndex)
{
    const ScratchDisc scratch("pip");
    scratch.Write("index.bdmv", Ascii("MOBJ0200"));
    EXPECT_TRUE(std::regex_search(
        ListingOf(scratch.Read()),
        std::regex("^Index {11}BDMV/index\\.bdmv: offset 0: [^\n]+\n\nNumber [^\n]*\n00000 ")));
}

Bytes IndexObjectBytes(unsigned objectType, unsigned playbackType)
{
    return Join({U8(objectType << 6), Zeros(3), U8(playbackType << 6), Zeros(1), Ascii("ab\x1B"),
                 Zeros(3)});
}

TEST(ListPlayLists, ShowsAnIndexWithAnyValues)
{
    const Bytes info = Part32(Join({U8(0x60), U8(0x59), Zeros(32)}));
    const Bytes titles = Join({IndexObjectBytes(1, 2), IndexObjectBytes(2, 3)});
    const Bytes indexes =
        Part32(Join({IndexObjectBytes(0, 0), IndexObjectBytes(3, 3), U16(2), titles}));
    const ScratchDisc scratch("pip");
    scratch.Write("index.bdmv", Join({Ascii("INDX0200"), U32(std::uint32_t(40 + info.size())),
                                      Zeros(28), info, indexes}));
    const std::string listing = ListingOf(scratch.Read());
    EXPECT_EQ(listing.substr(0, listing.find("\n\n") + 1),
              "Index           version 0200, 720p, reserved (9), stereoscopic content, "
              "stereoscopic output preferred, 2 titles\n"
              "First playback  reserved object type 0, movie\n"
              "Top menu        reserved object type 3, reserved playback type 3\n"
              "Title 1         movie object 24930, reserved playback type 2, "
              "title search permitted\n"
              "Title 2         Java object ab\\x1B, interactive, title search permitted\n");
}

TEST(ListPlayLists, ReportsThatThereAreNoPlayLists)
{
    const ScratchDisc scratch("pip");
    scratch.Remove("PLAYLIST/00000.mpls");
    const std::string listing = ListingOf(scratch.Read());
    EXPECT_EQ(listing.substr(listing.find("\n\n")), "\n\nThere are no play lists.\n");
}

TEST(ListPlayLists, WritesTheLargestPlayListsPromptly)
{
    PlayItemBytes item;
    item.clip = "00000";
    item.streamTable = StreamTableBytes(
        {255, 0, 0, 0, 0, 0, 0, 0},
        Repeat(255, Join({StreamEntry(0x1011), StreamAttributesBytes(0x1B, {0x61, 0, 0, 0})})));
    PlayListBytes playList;
    playList.itemCount = unsigned((LargestPlayListFile - 200) / item.Make().size());
    playList.items = Repeat(playList.itemCount, item.Make());
    const ScratchDisc scratch("pip");
    scratch.Write("PLAYLIST/00000.mpls", playList.Make());

    DiscardingBuffer buffer;
    std::ostream output(&buffer);
    const std::clock_t before = std::clock();
    EXPECT_EQ(ListPlayLists(output, scratch.Read(), {0}), 0u);
    EXPECT_LT((std::clock() - before) / CLOCKS_PER_SEC, 30);
    EXPECT_GT(buffer.Size(), 20000u);
}

} // namespace

} // namespace deskplayer
