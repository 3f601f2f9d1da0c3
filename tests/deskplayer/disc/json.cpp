#include "json.h"

#include <cinttypes>
#include <cstdio>

#include "disc/codes.h"
#include "disc/timeline.h"

namespace deskplayer
{

namespace
{

using nlohmann::json;

template <typename Value> json OrNull(const std::optional<Value>& value)
{
    return value ? json(*value) : json(nullptr);
}

json OrNull(const std::optional<Ticks>& time)
{
    return time ? json(time->count()) : json(nullptr);
}

json HexDigits(std::uint64_t mask)
{
    char digits[17];
    std::snprintf(digits, sizeof(digits), "%016" PRIx64, mask);
    return digits;
}

json ToJson(const IndexObject& object, bool isTitle)
{
    json result{{"object_type", object.objectType}, {"playback_type", object.playbackType}};
    if (object.objectType == ObjectTypeMovieObject) {
        result["movie_object"] = object.movieObject;
    } else if (object.objectType == ObjectTypeJavaObject) {
        result["bdj_object"] = object.javaObject;
    }
    if (isTitle) {
        result["access_type"] = object.accessType;
    }
    return result;
}

void AddAttributes(const StreamAttributes& attributes, json& result)
{
    result["coding_type"] = attributes.codingType;
    const StreamKind kind = KindOfStream(attributes.codingType);
    if (kind == StreamKindVideo) {
        result["video_format"] = attributes.videoFormat;
        result["frame_rate"] = attributes.frameRate;
        if (attributes.codingType == CodingTypeH265) {
            result["dynamic_range"] = attributes.dynamicRange;
            result["colour_space"] = attributes.colourSpace;
            result["hdr_flags"] = attributes.hdrFlag << 1 | int(attributes.dynamicMetadata);
        }
        return;
    }
    if (kind == StreamKindAudio) {
        result["audio_presentation"] = attributes.audioPresentation;
        result["sample_rate"] = attributes.sampleRate;
    } else if (kind == StreamKindTextSubtitle) {
        result["character_code"] = attributes.characterCode;
    }
    if (kind != StreamKindUnknown) {
        result["language"] = attributes.language;
    }
}

json ToJson(const ProgramStream& stream)
{
    json result{{"pid", stream.pid}};
    AddAttributes(stream.attributes, result);
    if (KindOfStream(stream.attributes.codingType) == StreamKindVideo) {
        result["aspect"] = stream.aspectRatio;
        result["cc_flag"] = int(stream.captionFlag);
    }
    return result;
}

json ToJson(const AtcSequence& sequence)
{
    json stcSequences = json::array();
    for (const StcSequence& stc : sequence.stcSequences) {
        stcSequences.push_back({{"pcr_pid", stc.pcrPid},
                                {"spn_start", stc.firstPacket},
                                {"start", stc.presentationStart},
                                {"end", stc.presentationEnd}});
    }
    return {{"spn_start", sequence.firstPacket},
            {"stc_offset", sequence.firstStcSequence},
            {"stc", stcSequences}};
}

json ToJson(const Program& program)
{
    json streams = json::array();
    for (const ProgramStream& stream : program.streams) {
        streams.push_back(ToJson(stream));
    }
    return {{"spn_start", program.firstPacket},
            {"pmt_pid", program.programMapPid},
            {"streams", streams}};
}

json ToJson(const ClipReference& clip)
{
    return {{"clip", clip.name}, {"codec", clip.codec}, {"stc_id", clip.stcSequence}};
}

json AllClips(const ClipReference& first, const std::vector<ClipReference>& further)
{
    json clips = json::array({ToJson(first)});
    for (const ClipReference& clip : further) {
        clips.push_back(ToJson(clip));
    }
    return clips;
}

json ToJson(const Stream& stream, const std::function<json()>& aspectRatio)
{
    json result{{"entry_type", stream.entryType}, {"pid", stream.pid}};
    if (stream.entryType >= EntryTypeSubPath) {
        result["sub_path"] = stream.subPath;
    }
    if (stream.entryType == EntryTypeSubPath) {
        result["sub_clip"] = stream.subClip;
    }
    AddAttributes(stream.attributes, result);
    if (KindOfStream(stream.attributes.codingType) == StreamKindVideo) {
        result["aspect"] = aspectRatio();
    }
    return result;
}

json ToJson(const StreamTable& table, std::size_t playItem, const AspectRatioLookup& aspectRatio)
{
    const auto all = [&](const std::vector<Stream>& streams) {
        json result = json::array();
        for (const Stream& stream : streams) {
            result.push_back(ToJson(stream, [&] { return OrNull(aspectRatio(playItem, stream)); }));
        }
        return result;
    };
    json result{{"video", all(table.primaryVideo)},
                {"audio", all(table.primaryAudio)},
                {"pg", all(table.pg)},
                {"ig", all(table.ig)},
                {"secondary_audio", all(table.secondaryAudio)},
                {"secondary_video", all(table.secondaryVideo)},
                {"pip_pg", all(table.pipPg)},
                {"dv", all(table.enhancementVideo)}};
    for (std::size_t number = 0; number < table.secondaryAudio.size(); ++number) {
        result["secondary_audio"][number]["primary_audio_refs"] =
            table.secondaryAudio[number].primaryAudioReferences;
    }
    for (std::size_t number = 0; number < table.secondaryVideo.size(); ++number) {
        json& stream = result["secondary_video"][number];
        stream["secondary_audio_refs"] = table.secondaryVideo[number].secondaryAudioReferences;
        stream["pip_pg_refs"] = table.secondaryVideo[number].pipPgReferences;
    }
    return result;
}

json ToJson(const PlayItem& item)
{
    json result = ToJson(item.clip);
    result["connection_condition"] = item.connectionCondition;
    result["in"] = item.inTime;
    result["out"] = item.outTime;
    result["uo_mask"] = HexDigits(item.uoMask);
    result["random_access"] = int(item.randomAccessFlag);
    result["still_mode"] = item.stillMode;
    result["still_time"] = item.stillTime;
    result["multi_angle"] = item.multiAngle;
    result["angles"] = AllClips(item.clip, item.furtherAngles);
    if (item.multiAngle) {
        result["different_audios"] = item.differentAudios;
        result["seamless_angle_change"] = item.seamlessAngleChange;
    }
    return result;
}

json ToJson(const SubPath& path)
{
    json items = json::array();
    for (const SubPlayItem& item : path.items) {
        json result = ToJson(item.clip);
        result["connection_condition"] = item.connectionCondition;
        result["in"] = item.inTime;
        result["out"] = item.outTime;
        result["sync_item"] = item.syncPlayItem;
        result["sync_pts"] = item.syncTime;
        result["clips"] = AllClips(item.clip, item.furtherClips);
        items.push_back(result);
    }
    return {{"type", path.type}, {"repeat", path.repeat}, {"items", items}};
}

} // namespace

json ToJson(const Index& index)
{
    json titles = json::array();
    for (const IndexObject& title : index.titles) {
        titles.push_back(ToJson(title, true));
    }
    return {{"version", index.version},
            {"initial_output_mode", int(index.stereoscopicOutputPreferred)},
            {"ss_content", int(index.stereoscopicContent)},
            {"video_format", index.videoFormat},
            {"frame_rate", index.frameRate},
            {"first_playback", ToJson(index.firstPlayback, false)},
            {"top_menu", ToJson(index.topMenu, false)},
            {"titles", titles}};
}

json ToJson(const MovieObjects& movieObjects)
{
    json objects = json::array();
    for (const MovieObject& object : movieObjects.objects) {
        objects.push_back(object.commandCount);
    }
    return {{"version", movieObjects.version}, {"objects", objects}};
}

json ToJson(const ClipInfo& clipInfo)
{
    json atcSequences = json::array();
    for (const AtcSequence& sequence : clipInfo.atcSequences) {
        atcSequences.push_back(ToJson(sequence));
    }
    json programs = json::array();
    for (const Program& program : clipInfo.programs) {
        programs.push_back(ToJson(program));
    }
    return {{"version", clipInfo.version},
            {"clip_stream_type", clipInfo.clipStreamType},
            {"application_type", clipInfo.applicationType},
            {"atc_delta", int(clipInfo.arrivalTimeOffsets)},
            {"ts_recording_rate", clipInfo.greatestDataRate},
            {"source_packets", clipInfo.packets},
            {"atc", atcSequences},
            {"duration", Duration(clipInfo).count()},
            {"programs", programs}};
}

json ToJson(const PlayList& playList, const AspectRatioLookup& aspectRatio)
{
    const TimeLine timeLine = BuildTimeLine(playList);
    json items = json::array();
    for (std::size_t number = 0; number < playList.playItems.size(); ++number) {
        json item = ToJson(playList.playItems[number]);
        item["streams"] = ToJson(playList.playItems[number].streams, number, aspectRatio);
        item["start"] = timeLine.itemStarts[number].count();
        items.push_back(item);
    }
    json subPaths = json::array();
    for (const SubPath& path : playList.subPaths) {
        subPaths.push_back(ToJson(path));
    }
    json marks = json::array();
    for (std::size_t number = 0; number < playList.marks.size(); ++number) {
        const Mark& mark = playList.marks[number];
        marks.push_back({{"type", mark.type},
                         {"item", mark.playItem},
                         {"time", mark.time},
                         {"es_pid", mark.pid},
                         {"duration", mark.duration},
                         {"position", OrNull(timeLine.markPositions[number])}});
    }
    json extension = json::array();
    for (const ExtensionBlock& block : playList.extensionBlocks) {
        extension.push_back({{"id", {block.kind, block.subKind}},
                             {"offset", block.offset},
                             {"length", block.size}});
    }
    const ApplicationInfo& info = playList.applicationInfo;
    return {{"version", playList.version},
            {"playback_type", info.playbackType},
            {"playback_count", info.playbackCount},
            {"uo_mask", HexDigits(info.uoMask)},
            {"random_access", int(info.randomAccessFlag)},
            {"audio_mix", int(info.audioMixing)},
            {"lossless_bypass", int(info.losslessBypass)},
            {"mvc_base_view_r", int(info.baseViewIsRightEye)},
            {"items", items},
            {"sub_paths", subPaths},
            {"duration", timeLine.duration.count()},
            {"marks", marks},
            {"extension", extension}};
}

} // namespace deskplayer
