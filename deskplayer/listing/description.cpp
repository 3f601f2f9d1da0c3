#include "listing/description.h"

#include <cinttypes>
#include <cstdio>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "disc/aspectratios.h"
#include "disc/codes.h"
#include "disc/timeline.h"
#include "listing/codenames.h"
#include "listing/faults.h"
#include "text/names.h"
#include "text/printable.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

/** A named value and its meaning. */
struct Field {
    std::string name;
    std::string value;
    std::string meaning = {};
};

using Fields = std::vector<Field>;

std::string Hex(std::uint64_t value, int digits)
{
    char text[24];
    std::snprintf(text, sizeof text, "%0*" PRIX64, digits, value);
    return text;
}

std::string Digits(std::uint32_t playList)
{
    char text[16];
    std::snprintf(text, sizeof text, "%05" PRIu32, playList);
    return text;
}

Field Number(const char* name, std::uint64_t value)
{
    return {name, std::to_string(value)};
}

Field YesNo(const char* name, bool value)
{
    return {name, value ? "yes" : "no"};
}

Field Time(const char* name, Ticks time)
{
    return {name, std::to_string(time.count()), TimeText(time)};
}

/** @param ticks as in the file */
Field Time(const char* name, std::uint32_t ticks)
{
    return Time(name, Ticks(ticks));
}

/** @param meaning may repeat the code, as codes.h does for reserved ones */
Field Code(const char* name, std::uint8_t code, const std::string& meaning)
{
    return {name, std::to_string(code), WithoutCode(meaning)};
}

Field Language(const std::string& language)
{
    return {"language", language.empty() ? "none" : Printable(language), LanguageName(language)};
}

/** The operations are those in the file, regardless of a debug override. */
Field UOMask(std::uint64_t mask)
{
    std::string forbidden;
    for (int bit = 0; bit < 64; ++bit) {
        if ((mask >> (63 - bit) & 1) != 0) {
            forbidden += forbidden.empty() ? "forbids " : ", ";
            forbidden += NameOrNumber(static_cast<bd::UserOperationMaskDef>(bit));
        }
    }
    return {"mask", Hex(mask, 16), forbidden.empty() ? "forbids nothing" : forbidden};
}

/** References to streams are numbered from 0, labels from 1. */
Field References(const char* name, const std::vector<std::uint8_t>& references)
{
    std::string numbers;
    for (const std::uint8_t reference : references) {
        numbers += (numbers.empty() ? "" : " ") + std::to_string(reference + 1);
    }
    return {name, numbers.empty() ? "none" : numbers};
}

Fields ClipFields(const ClipReference& clip)
{
    return {{"clip", clip.name},
            {"codec", Printable(clip.codec)},
            Number("STC sequence", clip.stcSequence)};
}

Field ConnectionCondition(std::uint8_t code)
{
    return Code("connection condition", code, ConnectionConditionName(code));
}

Fields VideoFields(const StreamAttributes& attributes, const AspectRatio& aspectRatio)
{
    Fields fields = {
        Code("format", attributes.videoFormat, VideoFormatName(attributes.videoFormat)),
        Code("rate", attributes.frameRate, FrameRateName(attributes.frameRate)),
    };
    if (aspectRatio.code) {
        fields.push_back(Code("aspect", *aspectRatio.code, AspectRatioName(*aspectRatio.code)));
    } else {
        fields.push_back({"aspect", "none", aspectRatio.reason});
    }
    if (attributes.codingType == CodingTypeH265) {
        fields.push_back(Code("dynamic range", attributes.dynamicRange,
                              DynamicRangeName(attributes.dynamicRange)));
        fields.push_back(
            Code("colour space", attributes.colourSpace, ColourSpaceName(attributes.colourSpace)));
        fields.push_back(YesNo("HDR flag", attributes.hdrFlag));
        fields.push_back(YesNo("dynamic metadata", attributes.dynamicMetadata));
    }
    return fields;
}

Fields FieldsOtherThanVideo(const StreamAttributes& attributes)
{
    switch (KindOfStream(attributes.codingType)) {
    case StreamKindAudio:
        return {Code("presentation", attributes.audioPresentation,
                     AudioPresentationName(attributes.audioPresentation)),
                Code("sample rate", attributes.sampleRate, SampleRateName(attributes.sampleRate)),
                Language(attributes.language)};
    case StreamKindGraphics:
        return {Language(attributes.language)};
    case StreamKindTextSubtitle:
        return {Code("character code", attributes.characterCode,
                     CharacterCodeName(attributes.characterCode)),
                Language(attributes.language)};
    default:
        return {};
    }
}

/** Writes the description of one play list. */
class Description
{
public:
    Description(std::ostream& output, const Disc& disc, std::uint32_t number,
                const PlayList& playList, Faults& faults)
        : m_rOutput(output), m_AspectRatios(disc, faults.OfClips()), m_Number(number),
          m_rPlayList(playList), m_TimeLine(BuildTimeLine(playList))
    {
    }

    void Write()
    {
        WriteApplicationInfo();
        for (std::size_t item = 0; item < m_rPlayList.playItems.size(); ++item) {
            WritePlayItem(item);
        }
        for (std::size_t path = 0; path < m_rPlayList.subPaths.size(); ++path) {
            WriteSubPath(path);
        }
        for (std::size_t mark = 0; mark < m_rPlayList.marks.size(); ++mark) {
            WriteMark(mark);
        }
        for (const Chapter& chapter : m_TimeLine.chapters) {
            Line(1, "chapter " + std::to_string(chapter.number),
                 {Time("start", chapter.start), Time("end", chapter.end),
                  Number("mark", chapter.mark)});
        }
        for (std::size_t number = 0; number < m_rPlayList.extensionBlocks.size(); ++number) {
            const ExtensionBlock& block = m_rPlayList.extensionBlocks[number];
            Line(1, "extension block " + std::to_string(number),
                 {{"kind", std::to_string(block.kind) + "." + std::to_string(block.subKind)},
                  Number("offset", block.offset),
                  Number("size", block.size)});
        }
    }

private:
    void Line(std::size_t depth, const std::string& label, const Fields& fields)
    {
        m_rOutput << std::string(2 * depth, ' ') << label;
        const char* separator = ": ";
        for (const Field& field : fields) {
            m_rOutput << separator << field.name << ' ' << field.value;
            if (!field.meaning.empty() && field.meaning != field.value) {
                m_rOutput << " (" << field.meaning << ')';
            }
            separator = ", ";
        }
        m_rOutput << '\n';
    }

    void WriteApplicationInfo()
    {
        const ApplicationInfo& info = m_rPlayList.applicationInfo;
        Line(0, "play list " + Digits(m_Number),
             {{"version", m_rPlayList.version},
              Code("playback type", info.playbackType, PlaybackTypeName(info.playbackType)),
              Number("playback count", info.playbackCount),
              Time("duration", m_TimeLine.duration)});
        Line(1, "flags",
             {YesNo("random access flag", info.randomAccessFlag),
              YesNo("audio mixing", info.audioMixing),
              YesNo("lossless bypass", info.losslessBypass),
              YesNo("base view is right eye", info.baseViewIsRightEye)});
        Line(1, "user operations", {UOMask(info.uoMask)});
    }

    void WritePlayItem(std::size_t number)
    {
        const PlayItem& item = m_rPlayList.playItems[number];
        Fields clip = ClipFields(item.clip);
        clip.push_back(ConnectionCondition(item.connectionCondition));
        Line(1, "play item " + std::to_string(number), clip);
        Line(2, "time",
             {Time("IN", item.inTime), Time("OUT", item.outTime),
              Time("start", m_TimeLine.itemStarts[number]),
              Time("duration", item.outTime - item.inTime)});
        Line(2, "still",
             {Code("mode", item.stillMode, StillModeName(item.stillMode)),
              Number("seconds", item.stillTime)});
        Line(2, "flags", {YesNo("random access flag", item.randomAccessFlag)});
        Line(2, "user operations", {UOMask(item.uoMask)});
        if (item.multiAngle) {
            Line(2, "angles",
                 {Number("count", NumberOfAngles(item)),
                  YesNo("different audios", item.differentAudios),
                  YesNo("seamless change", item.seamlessAngleChange)});
        }
        for (std::size_t angle = 0; angle < item.furtherAngles.size(); ++angle) {
            Line(2, "angle " + std::to_string(angle + 2), ClipFields(item.furtherAngles[angle]));
        }

        const StreamTable& streams = item.streams;
        WriteStreams("primary video ", number, streams.primaryVideo);
        WriteStreams("primary audio ", number, streams.primaryAudio);
        WriteStreams("subtitles ", number, streams.pg);
        WriteStreams("picture-in-picture subtitles ", number, streams.pipPg);
        WriteStreams("menu ", number, streams.ig);
        WriteStreams("secondary audio ", number, streams.secondaryAudio, [](const Stream& stream) {
            return Fields{References("primary audio", stream.primaryAudioReferences)};
        });
        WriteStreams("secondary video ", number, streams.secondaryVideo, [](const Stream& stream) {
            return Fields{
                References("secondary audio", stream.secondaryAudioReferences),
                References("picture-in-picture subtitles", stream.pipPgReferences),
            };
        });
        WriteStreams("enhancement video ", number, streams.enhancementVideo);
    }

    void WriteStreams(const std::string& label, std::size_t playItem,
                      const std::vector<Stream>& streams,
                      Fields (*references)(const Stream& stream) = nullptr)
    {
        std::size_t number = 0;
        for (const Stream& stream : streams) {
            Fields fields = StreamFields(playItem, stream);
            if (references) {
                for (Field& reference : references(stream)) {
                    fields.push_back(std::move(reference));
                }
            }
            Line(2, label + std::to_string(++number), fields);
        }
    }

    Fields StreamFields(std::size_t playItem, const Stream& stream)
    {
        Fields fields = {
            Code("entry type", stream.entryType, EntryTypeName(stream.entryType)),
            {"PID", "0x" + Hex(stream.pid, 4)},
        };
        if (stream.entryType == EntryTypeSubPath || stream.entryType == EntryTypePlayItemSubPath3 ||
            stream.entryType == EntryTypePlayItemSubPath4) {
            fields.push_back(Number("sub path", stream.subPath));
        }
        if (stream.entryType == EntryTypeSubPath) {
            fields.push_back(Number("clip", stream.subClip));
        }
        const StreamAttributes& attributes = stream.attributes;
        Field coding =
            Code("coding type", attributes.codingType, CodingTypeName(attributes.codingType));
        coding.value = "0x" + Hex(attributes.codingType, 2);
        fields.push_back(std::move(coding));
        const Fields rest =
            KindOfStream(attributes.codingType) == StreamKindVideo
                ? VideoFields(attributes, m_AspectRatios.Find(m_rPlayList, playItem, stream))
                : FieldsOtherThanVideo(attributes);
        fields.insert(fields.end(), rest.begin(), rest.end());
        return fields;
    }

    void WriteSubPath(std::size_t number)
    {
        const SubPath& path = m_rPlayList.subPaths[number];
        Line(1, "sub path " + std::to_string(number),
             {Code("type", path.type, SubPathTypeName(path.type)), YesNo("repeat", path.repeat)});
        for (std::size_t index = 0; index < path.items.size(); ++index) {
            const SubPlayItem& item = path.items[index];
            Fields clip = ClipFields(item.clip);
            clip.push_back(ConnectionCondition(item.connectionCondition));
            Line(2, "sub play item " + std::to_string(index), clip);
            Line(3, "time",
                 {Time("IN", item.inTime), Time("OUT", item.outTime),
                  Time("duration", item.outTime - item.inTime)});
            Line(3, "starts", {Number("play item", item.syncPlayItem), Time("at", item.syncTime)});
            for (std::size_t further = 0; further < item.furtherClips.size(); ++further) {
                Line(3, "clip " + std::to_string(further + 1),
                     ClipFields(item.furtherClips[further]));
            }
        }
    }

    void WriteMark(std::size_t number)
    {
        const Mark& mark = m_rPlayList.marks[number];
        const std::optional<Ticks> position = m_TimeLine.markPositions[number];
        Line(1, "mark " + std::to_string(number),
             {Code("type", mark.type, MarkTypeName(mark.type)),
              Number("play item", mark.playItem),
              Time("time", mark.time),
              {"PID", "0x" + Hex(mark.pid, 4), mark.pid == MarkForAllStreams ? "all streams" : ""},
              Time("duration", mark.duration),
              position ? Time("position", *position)
                       : Field{"position", "none", "not within the play item"}});
    }

    std::ostream& m_rOutput;
    AspectRatios m_AspectRatios;
    std::uint32_t m_Number;
    const PlayList& m_rPlayList;
    TimeLine m_TimeLine;
};

} // namespace

std::size_t DescribePlayList(std::ostream& output, const Disc& disc, std::uint32_t number,
                             const PlayList& playList, const MessageHandler& onFault)
{
    Faults faults(onFault);
    Description(output, disc, number, playList, faults).Write();
    return faults.Count();
}

} // namespace deskplayer
