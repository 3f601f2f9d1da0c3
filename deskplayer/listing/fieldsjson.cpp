#include "listing/fieldsjson.h"

#include <cinttypes>
#include <cstdio>
#include <vector>

#include "disc/codes.h"
#include "listing/codenames.h"
#include "text/names.h"
#include "text/printable.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

using nlohmann::ordered_json;

ordered_json LanguageJson(const std::string& language)
{
    return {{"code", Printable(language)}, {"name", LanguageName(language)}};
}

/** Streams are numbered from 0 in references, but from 1 for viewers and in all other members. */
ordered_json ReferencesJson(const std::vector<std::uint8_t>& references)
{
    ordered_json numbers = ordered_json::array();
    for (const std::uint8_t reference : references) {
        numbers.push_back(reference + 1);
    }
    return numbers;
}

void AddVideo(ordered_json& json, const StreamAttributes& attributes, const AspectRatio& ratio)
{
    json["videoFormat"] = CodeJson(attributes.videoFormat, VideoFormatName(attributes.videoFormat));
    json["frameRate"] = CodeJson(attributes.frameRate, FrameRateName(attributes.frameRate));
    if (ratio.code) {
        json["aspectRatio"] = CodeJson(*ratio.code, AspectRatioName(*ratio.code));
    } else {
        json["aspectRatio"] = nullptr;
        json["aspectRatioReason"] = ratio.reason;
    }
    if (attributes.codingType == CodingTypeH265) {
        json["dynamicRange"] =
            CodeJson(attributes.dynamicRange, DynamicRangeName(attributes.dynamicRange));
        json["colourSpace"] =
            CodeJson(attributes.colourSpace, ColourSpaceName(attributes.colourSpace));
        json["hdrFlag"] = attributes.hdrFlag;
        json["dynamicMetadata"] = attributes.dynamicMetadata;
    }
}

void AddOtherThanVideo(ordered_json& json, const StreamAttributes& attributes)
{
    switch (KindOfStream(attributes.codingType)) {
    case StreamKindAudio:
        json["audioPresentation"] = CodeJson(attributes.audioPresentation,
                                             AudioPresentationName(attributes.audioPresentation));
        json["sampleRate"] = CodeJson(attributes.sampleRate, SampleRateName(attributes.sampleRate));
        break;
    case StreamKindGraphics:
        break;
    case StreamKindTextSubtitle:
        json["characterCode"] =
            CodeJson(attributes.characterCode, CharacterCodeName(attributes.characterCode));
        break;
    default:
        return;
    }
    json["language"] = LanguageJson(attributes.language);
}

} // namespace

ordered_json CodeJson(std::uint8_t code, const std::string& name)
{
    return {{"code", code}, {"name", WithoutCode(name)}};
}

ordered_json TimeJson(Ticks time)
{
    return {{"ticks", time.count()}, {"time", TimeText(time)}};
}

ordered_json TimeJson(std::uint32_t ticks)
{
    return TimeJson(Ticks(ticks));
}

ordered_json UOMaskJson(std::uint64_t mask)
{
    char digits[20];
    std::snprintf(digits, sizeof digits, "%016" PRIX64, mask);
    ordered_json forbidden = ordered_json::array();
    for (int bit = 0; bit < 64; ++bit) {
        if ((mask >> (63 - bit) & 1) != 0) {
            forbidden.push_back(NameOrNumber(static_cast<bd::UserOperationMaskDef>(bit)));
        }
    }
    return {{"mask", digits}, {"forbidden", forbidden}};
}

ordered_json ClipJson(const ClipReference& clip)
{
    return {
        {"name", clip.name}, {"codec", Printable(clip.codec)}, {"stcSequence", clip.stcSequence}};
}

ordered_json StreamsJson(const PlayList& playList, std::size_t playItem, AspectRatios& aspectRatios)
{
    const auto streamsOf = [&](const std::vector<Stream>& streams) {
        ordered_json result = ordered_json::array();
        for (const Stream& stream : streams) {
            ordered_json json = {
                {"number", result.size() + 1},
                {"entryType", CodeJson(stream.entryType, EntryTypeName(stream.entryType))},
                {"pid", stream.pid}};
            if (stream.entryType >= EntryTypeSubPath &&
                stream.entryType <= EntryTypePlayItemSubPath4) {
                json["subPath"] = stream.subPath;
            }
            if (stream.entryType == EntryTypeSubPath) {
                json["subClip"] = stream.subClip;
            }
            const StreamAttributes& attributes = stream.attributes;
            json["codingType"] =
                CodeJson(attributes.codingType, CodingTypeName(attributes.codingType));
            if (KindOfStream(attributes.codingType) == StreamKindVideo) {
                AddVideo(json, attributes, aspectRatios.Find(playList, playItem, stream));
            } else {
                AddOtherThanVideo(json, attributes);
            }
            result.push_back(std::move(json));
        }
        return result;
    };
    const StreamTable& table = playList.playItems[playItem].streams;
    ordered_json json = {{"primaryVideo", streamsOf(table.primaryVideo)},
                         {"primaryAudio", streamsOf(table.primaryAudio)},
                         {"subtitles", streamsOf(table.pg)},
                         {"pipSubtitles", streamsOf(table.pipPg)},
                         {"menus", streamsOf(table.ig)},
                         {"secondaryAudio", streamsOf(table.secondaryAudio)},
                         {"secondaryVideo", streamsOf(table.secondaryVideo)},
                         {"enhancementVideo", streamsOf(table.enhancementVideo)}};
    for (std::size_t index = 0; index < table.secondaryAudio.size(); ++index) {
        json["secondaryAudio"][index]["primaryAudioReferences"] =
            ReferencesJson(table.secondaryAudio[index].primaryAudioReferences);
    }
    for (std::size_t index = 0; index < table.secondaryVideo.size(); ++index) {
        ordered_json& stream = json["secondaryVideo"][index];
        stream["secondaryAudioReferences"] =
            ReferencesJson(table.secondaryVideo[index].secondaryAudioReferences);
        stream["pipSubtitleReferences"] =
            ReferencesJson(table.secondaryVideo[index].pipPgReferences);
    }
    return json;
}

} // namespace deskplayer
