#include "listing/listingjson.h"

#include <algorithm>
#include <fstream>
#include <iterator>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include "../disc/bytewriter.h"
#include "../disc/testdiscs.h"
#include "scratchdisc.h"

namespace deskplayer
{

namespace
{

using nlohmann::json;

std::vector<json> ObjectsIn(const std::string& lines)
{
    std::vector<json> objects;
    std::istringstream stream(lines);
    for (std::string line; std::getline(stream, line);) {
        objects.push_back(json::parse(line));
    }
    return objects;
}

std::vector<json> DescriptionOf(const Disc& disc, std::uint32_t number)
{
    std::ostringstream output;
    DescribePlayListAsJson(output, disc, number, disc.ReadPlayList(number));
    return ObjectsIn(output.str());
}

std::vector<json> ListingOf(const Disc& disc)
{
    std::ostringstream output;
    ListPlayListsAsJson(output, disc, disc.PlayListNumbers());
    return ObjectsIn(output.str());
}

/** The objects of one kind of part, in order. */
std::vector<json> Parts(const std::vector<json>& objects, const std::string& part)
{
    std::vector<json> parts;
    std::copy_if(objects.begin(), objects.end(), std::back_inserter(parts),
                 [&](const json& object) { return object.at("part") == part; });
    return parts;
}

/** Copies a member under the name that expected.json has for it; reduces it to the raw value. */
void Rename(const json& from, const char* name, json& to, const char* expectedName)
{
    const auto member = from.find(name);
    if (member == from.end()) {
        return;
    }
    json value = *member;
    if (value.is_object()) {
        for (const char* const raw : {"code", "ticks", "mask"}) {
            if (value.contains(raw)) {
                value = json(value.at(raw));
                break;
            }
        }
    }
    to[expectedName] = value;
}

using Names = std::vector<std::pair<const char*, const char*>>;

json Renamed(const json& from, const Names& names)
{
    json to = json::object();
    for (const auto& [name, expectedName] : names) {
        Rename(from, name, to, expectedName);
    }
    return to;
}

json ToClip(const json& clip)
{
    return Renamed(clip, {{"name", "clip"}, {"codec", "codec"}, {"stcSequence", "stc_id"}});
}

template <typename Convert> json ToList(const json& from, const Convert& convert)
{
    json list = json::array();
    for (const json& element : from) {
        list.push_back(convert(element));
    }
    return list;
}

json ToReferences(const json& numbers)
{
    return ToList(numbers, [](const json& number) { return number.get<int>() - 1; });
}

json ToStream(const json& stream)
{
    json result = Renamed(stream, {{"entryType", "entry_type"},
                                   {"pid", "pid"},
                                   {"subPath", "sub_path"},
                                   {"subClip", "sub_clip"},
                                   {"codingType", "coding_type"},
                                   {"videoFormat", "video_format"},
                                   {"frameRate", "frame_rate"},
                                   {"aspectRatio", "aspect"},
                                   {"dynamicRange", "dynamic_range"},
                                   {"colourSpace", "colour_space"},
                                   {"audioPresentation", "audio_presentation"},
                                   {"sampleRate", "sample_rate"},
                                   {"characterCode", "character_code"},
                                   {"language", "language"}});
    if (stream.contains("hdrFlag")) {
        result["hdr_flags"] =
            stream.at("hdrFlag").get<bool>() << 1 | int(stream.at("dynamicMetadata").get<bool>());
    }
    const Names references = {{"primaryAudioReferences", "primary_audio_refs"},
                              {"secondaryAudioReferences", "secondary_audio_refs"},
                              {"pipSubtitleReferences", "pip_pg_refs"}};
    for (const auto& [name, expectedName] : references) {
        if (stream.contains(name)) {
            result[expectedName] = ToReferences(stream.at(name));
        }
    }
    return result;
}

json ToStreams(const json& streams)
{
    const Names kinds = {{"primaryVideo", "video"},
                         {"primaryAudio", "audio"},
                         {"subtitles", "pg"},
                         {"menus", "ig"},
                         {"secondaryAudio", "secondary_audio"},
                         {"secondaryVideo", "secondary_video"},
                         {"pipSubtitles", "pip_pg"},
                         {"enhancementVideo", "dv"}};
    json result;
    for (const auto& [name, expectedName] : kinds) {
        result[expectedName] = ToList(streams.at(name), ToStream);
    }
    return result;
}

json LowerCase(json text)
{
    std::string letters = text;
    for (char& letter : letters) {
        letter = letter >= 'A' && letter <= 'F' ? char(letter - 'A' + 'a') : letter;
    }
    return letters;
}

json ToItem(const json& item)
{
    json result = Renamed(item, {{"connectionCondition", "connection_condition"},
                                 {"in", "in"},
                                 {"out", "out"},
                                 {"start", "start"},
                                 {"stillMode", "still_mode"},
                                 {"stillSeconds", "still_time"},
                                 {"multiAngle", "multi_angle"},
                                 {"differentAudios", "different_audios"},
                                 {"seamlessAngleChange", "seamless_angle_change"}});
    result.update(ToClip(item.at("clip")));
    result["random_access"] = int(item.at("randomAccessFlag").get<bool>());
    result["uo_mask"] = LowerCase(item.at("userOperations").at("mask"));
    result["angles"] = ToList(item.at("angles"), ToClip);
    result["streams"] = ToStreams(item.at("streams"));
    return result;
}

json ToSubPath(const json& path)
{
    json result = Renamed(path, {{"type", "type"}, {"repeat", "repeat"}});
    result["items"] = ToList(path.at("items"), [](const json& item) {
        json subItem = Renamed(item, {{"connectionCondition", "connection_condition"},
                                      {"in", "in"},
                                      {"out", "out"},
                                      {"syncPlayItem", "sync_item"},
                                      {"syncTime", "sync_pts"}});
        subItem.update(ToClip(item.at("clips").at(0)));
        subItem["clips"] = ToList(item.at("clips"), ToClip);
        return subItem;
    });
    return result;
}

/** The play list that a description describes, in the form of expected.json. */
json ToPlayList(const std::vector<json>& description)
{
    const json& playList = description.at(0);
    json result = Renamed(playList, {{"version", "version"},
                                     {"playbackType", "playback_type"},
                                     {"playbackCount", "playback_count"},
                                     {"duration", "duration"}});
    result["uo_mask"] = LowerCase(playList.at("userOperations").at("mask"));
    result["random_access"] = int(playList.at("randomAccessFlag").get<bool>());
    result["audio_mix"] = int(playList.at("audioMixing").get<bool>());
    result["lossless_bypass"] = int(playList.at("losslessBypass").get<bool>());
    result["mvc_base_view_r"] = int(playList.at("baseViewIsRightEye").get<bool>());
    result["items"] = ToList(Parts(description, "playItem"), ToItem);
    result["sub_paths"] = ToList(Parts(description, "subPath"), ToSubPath);
    result["marks"] = ToList(Parts(description, "mark"), [](const json& mark) {
        return Renamed(mark, {{"type", "type"},
                              {"playItem", "item"},
                              {"time", "time"},
                              {"pid", "es_pid"},
                              {"duration", "duration"},
                              {"position", "position"}});
    });
    result["extension"] = ToList(Parts(description, "extensionBlock"), [](const json& block) {
        return json{{"id", {block.at("kind"), block.at("subKind")}},
                    {"offset", block.at("offset")},
                    {"length", block.at("size")}};
    });
    return result;
}

json ToObject(const json& object)
{
    return Renamed(object, {{"objectType", "object_type"},
                            {"playbackType", "playback_type"},
                            {"accessType", "access_type"},
                            {"movieObject", "movie_object"},
                            {"javaObject", "bdj_object"}});
}

/** The index that a listing shows, in the form of expected.json. */
json ToIndex(const std::vector<json>& listing)
{
    const json& index = listing.at(0);
    json result = Renamed(
        index,
        {{"version", "version"}, {"videoFormat", "video_format"}, {"frameRate", "frame_rate"}});
    result["initial_output_mode"] = int(index.at("stereoscopicOutputPreferred").get<bool>());
    result["ss_content"] = int(index.at("stereoscopicContent").get<bool>());
    result["first_playback"] = ToObject(index.at("firstPlayback"));
    result["top_menu"] = ToObject(index.at("topMenu"));
    result["titles"] = ToList(Parts(listing, "title"), ToObject);
    return result;
}

class JsonOfEveryDisc : public testing::TestWithParam<std::filesystem::path>
{
protected:
    JsonOfEveryDisc() : m_Disc(GetParam())
    {
        std::ifstream(GetParam() / "expected.json") >> m_Expected;
    }

    Disc m_Disc;
    json m_Expected;
};

std::string NameOfDisc(const testing::TestParamInfo<std::filesystem::path>& info)
{
    std::string name = info.param.filename().string();
    std::replace(name.begin(), name.end(), '-', '_');
    return name;
}

INSTANTIATE_TEST_SUITE_P(Disc, JsonOfEveryDisc, testing::ValuesIn(TestDiscs()), NameOfDisc);
INSTANTIATE_TEST_SUITE_P(FurtherDisc, JsonOfEveryDisc, testing::ValuesIn(FurtherDiscs()),
                         NameOfDisc);

TEST_P(JsonOfEveryDisc, DescribesThePlayLists)
{
    for (const auto& [name, expected] : m_Expected.at("play_lists").items()) {
        const auto number = std::uint32_t(std::stoul(name));
        const json described = ToPlayList(DescriptionOf(m_Disc, number));
        EXPECT_EQ(json::diff(described, expected).dump(1), "[]") << name;
    }
}

TEST_P(JsonOfEveryDisc, ListsTheIndex)
{
    EXPECT_EQ(json::diff(ToIndex(ListingOf(m_Disc)), m_Expected.at("index")).dump(1), "[]");
}

TEST_P(JsonOfEveryDisc, ListsThePlayLists)
{
    const std::vector<json> playLists = Parts(ListingOf(m_Disc), "playList");
    const json& expected = m_Expected.at("play_lists");
    ASSERT_EQ(playLists.size(), expected.size());
    auto listed = playLists.begin();
    for (const auto& [name, playList] : expected.items()) {
        EXPECT_EQ(listed->at("number"), std::stoul(name));
        EXPECT_EQ(listed->at("duration").at("ticks"), playList.at("duration"));
        EXPECT_EQ(listed->at("playItems"), playList.at("items").size());
        if (!playList.at("items").empty()) {
            const json& longest =
                playList.at("items").at(listed->at("longestPlayItem").get<std::size_t>());
            EXPECT_EQ(ToStreams(listed->at("streams")), longest.at("streams"));
        }
        ++listed;
    }
}

TEST(DescribePlayListAsJson, HasNamesBesideNumbers)
{
    const std::vector<json> parts = DescriptionOf(Disc(TestDisc("pip")), 0);
    const json playItem = Parts(parts, "playItem").at(0);
    EXPECT_EQ(playItem.at("connectionCondition"), (json{{"code", 1}, {"name", "not seamless"}}));
    const json& video = playItem.at("streams").at("primaryVideo").at(0);
    EXPECT_EQ(video.at("number"), 1);
    EXPECT_EQ(video.at("aspectRatio"), (json{{"code", 3}, {"name", "16:9"}}));
    EXPECT_EQ(parts.at(0).at("duration").at("time"), "00:01:00.018");
    EXPECT_EQ(parts.at(0).at("userOperations").at("forbidden"), json::array());
}

TEST(DescribePlayListAsJson, HasTheChapters)
{
    const std::vector<json> chapters =
        Parts(DescriptionOf(Disc(TestDisc("chapters")), 0), "chapter");
    ASSERT_GE(chapters.size(), 2u);
    EXPECT_EQ(chapters[0].at("number"), 1);
    EXPECT_EQ(chapters[0].at("end"), chapters[1].at("start"));
}

TEST(DescribePlayListAsJson, IsValidForAnyTextOnADisc)
{
    PlayItemBytes item;
    item.streamTable = StreamTableBytes(
        {0, 1, 0, 0, 0, 0, 0, 0},
        Join({StreamEntry(0x1100), StreamAttributesBytes(0x81, {0x31, 0xFF, '"', 0x1B})}));
    const ScratchDisc scratch("pip");
    scratch.Write("PLAYLIST/00000.mpls", WithItem(item).Make());
    const json playItem = Parts(DescriptionOf(scratch.Read(), 0), "playItem").at(0);
    EXPECT_EQ(playItem.at("streams").at("primaryAudio").at(0).at("language").at("code"),
              "\\xFF\"\\x1B");
}

TEST(DescribePlayListAsJson, GivesTheReasonForAnUnknownAspectRatio)
{
    const ScratchDisc scratch("pip");
    scratch.Remove("CLIPINF/00000.clpi");
    std::vector<std::string> faults;
    std::ostringstream output;
    EXPECT_GE(
        DescribePlayListAsJson(output, scratch.Read(), 0, scratch.Read().ReadPlayList(0),
                               [&](const std::string& message) { faults.push_back(message); }),
        1u);
    const json playItem = Parts(ObjectsIn(output.str()), "playItem").at(0);
    const json& video = playItem.at("streams").at("primaryVideo").at(0);
    EXPECT_TRUE(video.at("aspectRatio").is_null());
    EXPECT_EQ(video.at("aspectRatioReason"), faults.at(0));
}

TEST(ListPlayListsAsJson, HasTheFaults)
{
    const ScratchDisc scratch("pip");
    scratch.Remove("index.bdmv");
    scratch.Write("PLAYLIST/00001.mpls", Ascii("INDX"));
    std::vector<std::string> faults;
    std::ostringstream output;
    EXPECT_EQ(ListPlayListsAsJson(output, scratch.Read(), {0, 1},
                                  [&](const std::string& message) { faults.push_back(message); }),
              2u);
    const std::vector<json> objects = ObjectsIn(output.str());
    ASSERT_EQ(objects.size(), 3u);
    EXPECT_EQ(objects[0], (json{{"part", "index"}, {"fault", faults.at(0)}}));
    EXPECT_EQ(objects[2], (json{{"part", "playList"}, {"number", 1}, {"fault", faults.at(1)}}));
}

} // namespace

} // namespace deskplayer
