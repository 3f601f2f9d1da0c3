#include "listing/listingjson.h"

#include <nlohmann/json.hpp>

#include <optional>

#include "disc/codes.h"
#include "disc/timeline.h"
#include "listing/codenames.h"
#include "listing/faults.h"
#include "listing/fieldsjson.h"
#include "listing/summary.h"
#include "text/printable.h"

namespace deskplayer
{

namespace
{

using nlohmann::ordered_json;

void WriteLine(std::ostream& output, const ordered_json& part)
{
    output << part.dump() << '\n';
}

/** The members of an object of the index. */
ordered_json ObjectJson(const IndexObject& object)
{
    const bool java = object.objectType == ObjectTypeJavaObject;
    const bool known = java || object.objectType == ObjectTypeMovieObject;
    const char* const typeName = java ? "Java object" : known ? "movie object" : "reserved";
    ordered_json json = {{"objectType", CodeJson(object.objectType, typeName)}};
    if (java) {
        json["javaObject"] = Printable(object.javaObject);
    } else if (known) {
        json["movieObject"] = object.movieObject;
    }
    const std::uint8_t movie = java ? 2 : 0; // the next one is interactive
    json["playbackType"] =
        CodeJson(object.playbackType, object.playbackType == movie       ? "movie"
                                      : object.playbackType == movie + 1 ? "interactive"
                                                                         : "reserved");
    return json;
}

void WriteIndex(std::ostream& output, const Disc& disc, Faults& faults)
{
    Index index;
    try {
        index = disc.ReadIndex();
    } catch (const DiscError& error) {
        WriteLine(output, {{"part", "index"}, {"fault", error.what()}});
        faults.Add(error.what());
        return;
    }
    WriteLine(
        output,
        {{"part", "index"},
         {"version", index.version},
         {"videoFormat",
          CodeJson(index.videoFormat,
                   index.videoFormat == 0 ? "not stated" : VideoFormatName(index.videoFormat))},
         {"frameRate",
          CodeJson(index.frameRate,
                   index.frameRate == 0 ? "not stated" : FrameRateName(index.frameRate))},
         {"stereoscopicContent", index.stereoscopicContent},
         {"stereoscopicOutputPreferred", index.stereoscopicOutputPreferred},
         {"firstPlayback", ObjectJson(index.firstPlayback)},
         {"topMenu", ObjectJson(index.topMenu)},
         {"titles", index.titles.size()}});
    std::size_t number = 0;
    for (const IndexObject& title : index.titles) {
        ordered_json json = {{"part", "title"}, {"number", ++number}};
        json.update(ObjectJson(title));
        json["accessType"] =
            CodeJson(title.accessType,
                     title.accessType == 0 ? "title search permitted" : "title search forbidden");
        WriteLine(output, json);
    }
}

ordered_json SummaryJson(std::uint32_t number, const PlayList& playList, AspectRatios& aspectRatios)
{
    const TimeLine timeLine = BuildTimeLine(playList);
    ordered_json json = {{"part", "playList"},
                         {"number", number},
                         {"duration", TimeJson(timeLine.duration)},
                         {"playItems", playList.playItems.size()},
                         {"chapters", timeLine.chapters.size()},
                         {"angles", MostAngles(playList)}};
    if (!playList.playItems.empty()) {
        const std::size_t longest = LongestItem(playList);
        json["longestPlayItem"] = longest;
        json["streams"] = StreamsJson(playList, longest, aspectRatios);
        json["playItemsWithOtherStreams"] = ItemsWithOtherStreams(playList, longest);
    }
    return json;
}

ordered_json PlayListJson(std::uint32_t number, const PlayList& playList, Ticks duration)
{
    const ApplicationInfo& info = playList.applicationInfo;
    return {{"part", "playList"},
            {"number", number},
            {"version", playList.version},
            {"playbackType", CodeJson(info.playbackType, PlaybackTypeName(info.playbackType))},
            {"playbackCount", info.playbackCount},
            {"duration", TimeJson(duration)},
            {"randomAccessFlag", info.randomAccessFlag},
            {"audioMixing", info.audioMixing},
            {"losslessBypass", info.losslessBypass},
            {"baseViewIsRightEye", info.baseViewIsRightEye},
            {"userOperations", UOMaskJson(info.uoMask)}};
}

ordered_json ConnectionJson(std::uint8_t code)
{
    return CodeJson(code, ConnectionConditionName(code));
}

ordered_json ClipsJson(const ClipReference& first, const std::vector<ClipReference>& further)
{
    ordered_json clips = ordered_json::array({ClipJson(first)});
    for (const ClipReference& clip : further) {
        clips.push_back(ClipJson(clip));
    }
    return clips;
}

ordered_json PlayItemJson(std::size_t number, const PlayList& playList, Ticks start,
                          AspectRatios& aspectRatios)
{
    const PlayItem& item = playList.playItems[number];
    ordered_json json = {{"part", "playItem"},
                         {"number", number},
                         {"clip", ClipJson(item.clip)},
                         {"connectionCondition", ConnectionJson(item.connectionCondition)},
                         {"in", TimeJson(item.inTime)},
                         {"out", TimeJson(item.outTime)},
                         {"start", TimeJson(start)},
                         {"duration", TimeJson(item.outTime - item.inTime)},
                         {"stillMode", CodeJson(item.stillMode, StillModeName(item.stillMode))},
                         {"stillSeconds", item.stillTime},
                         {"randomAccessFlag", item.randomAccessFlag},
                         {"userOperations", UOMaskJson(item.uoMask)},
                         {"multiAngle", item.multiAngle},
                         {"angles", ClipsJson(item.clip, item.furtherAngles)}};
    if (item.multiAngle) {
        json["differentAudios"] = item.differentAudios;
        json["seamlessAngleChange"] = item.seamlessAngleChange;
    }
    json["streams"] = StreamsJson(playList, number, aspectRatios);
    return json;
}

ordered_json SubPathJson(std::size_t number, const SubPath& path)
{
    ordered_json items = ordered_json::array();
    for (const SubPlayItem& item : path.items) {
        items.push_back({{"connectionCondition", ConnectionJson(item.connectionCondition)},
                         {"in", TimeJson(item.inTime)},
                         {"out", TimeJson(item.outTime)},
                         {"duration", TimeJson(item.outTime - item.inTime)},
                         {"syncPlayItem", item.syncPlayItem},
                         {"syncTime", TimeJson(item.syncTime)},
                         {"clips", ClipsJson(item.clip, item.furtherClips)}});
    }
    return {{"part", "subPath"},
            {"number", number},
            {"type", CodeJson(path.type, SubPathTypeName(path.type))},
            {"repeat", path.repeat},
            {"items", items}};
}

ordered_json MarkJson(std::size_t number, const Mark& mark, const std::optional<Ticks>& position)
{
    return {{"part", "mark"},
            {"number", number},
            {"type", CodeJson(mark.type, MarkTypeName(mark.type))},
            {"playItem", mark.playItem},
            {"time", TimeJson(mark.time)},
            {"pid", mark.pid},
            {"duration", TimeJson(mark.duration)},
            {"position", position ? TimeJson(*position) : ordered_json()}};
}

} // namespace

std::size_t ListPlayListsAsJson(std::ostream& output, const Disc& disc,
                                const std::vector<std::uint32_t>& numbers,
                                const MessageHandler& onFault)
{
    Faults faults(onFault);
    WriteIndex(output, disc, faults);
    AspectRatios aspectRatios(disc, faults.OfClips());
    for (const std::uint32_t number : numbers) {
        try {
            WriteLine(output, SummaryJson(number, disc.ReadPlayList(number), aspectRatios));
        } catch (const DiscError& error) {
            WriteLine(output, {{"part", "playList"}, {"number", number}, {"fault", error.what()}});
            faults.Add(error.what());
        }
    }
    return faults.Count();
}

std::size_t DescribePlayListAsJson(std::ostream& output, const Disc& disc, std::uint32_t number,
                                   const PlayList& playList, const MessageHandler& onFault)
{
    Faults faults(onFault);
    AspectRatios aspectRatios(disc, faults.OfClips());
    const TimeLine timeLine = BuildTimeLine(playList);
    WriteLine(output, PlayListJson(number, playList, timeLine.duration));
    for (std::size_t item = 0; item < playList.playItems.size(); ++item) {
        WriteLine(output, PlayItemJson(item, playList, timeLine.itemStarts[item], aspectRatios));
    }
    for (std::size_t path = 0; path < playList.subPaths.size(); ++path) {
        WriteLine(output, SubPathJson(path, playList.subPaths[path]));
    }
    for (std::size_t mark = 0; mark < playList.marks.size(); ++mark) {
        WriteLine(output, MarkJson(mark, playList.marks[mark], timeLine.markPositions[mark]));
    }
    for (const Chapter& chapter : timeLine.chapters) {
        WriteLine(output, {{"part", "chapter"},
                           {"number", chapter.number},
                           {"start", TimeJson(chapter.start)},
                           {"end", TimeJson(chapter.end)},
                           {"mark", chapter.mark}});
    }
    for (std::size_t block = 0; block < playList.extensionBlocks.size(); ++block) {
        const ExtensionBlock& extension = playList.extensionBlocks[block];
        WriteLine(output, {{"part", "extensionBlock"},
                           {"number", block},
                           {"kind", extension.kind},
                           {"subKind", extension.subKind},
                           {"offset", extension.offset},
                           {"size", extension.size}});
    }
    return faults.Count();
}

} // namespace deskplayer
