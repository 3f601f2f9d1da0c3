#include "disc/playlist.h"

#include <algorithm>

#include "disc/codes.h"
#include "disc/errors.h"
#include "disc/fields.h"
#include "text/printable.h"

namespace deskplayer
{

namespace
{

constexpr std::size_t SmallestPlayItem = 50;
constexpr std::size_t SmallestStream = 4;
constexpr std::size_t SmallestSubPath = 10;
constexpr std::size_t SmallestSubPlayItem = 30;
constexpr std::size_t MarkSize = 14;
constexpr std::size_t ExtensionEntrySize = 12;

/** Files are far smaller than what 32 bits can address. */
std::uint32_t OffsetOf(const ByteReader& reader)
{
    return static_cast<std::uint32_t>(reader.Offset());
}

std::string ReadClipName(ByteReader& reader)
{
    const std::size_t offset = reader.Offset();
    std::string name = reader.Text(5, "clip name");
    // Compared as characters: isdigit() would depend on the locale.
    if (name.size() != 5 || name.find_first_not_of("0123456789") != std::string::npos) {
        reader.Fail(offset, "clip name is \"" + Printable(name) + "\"", "five digits");
    }
    return name;
}

/** Reads clip, codec and STC sequence from a table of further angles or clips. */
ClipReference ReadClipReference(ByteReader& reader)
{
    ClipReference reference;
    reference.offset = OffsetOf(reader);
    reference.name = ReadClipName(reader);
    reference.codec = reader.Text(4, "codec");
    reference.stcSequence = reader.UInt8("STC sequence");
    return reference;
}

/** @param count includes the clip before the table */
std::vector<ClipReference> ReadFurtherClips(ByteReader& reader, std::uint8_t count)
{
    std::vector<ClipReference> references;
    for (int further = 1; further < count; ++further) {
        references.push_back(ReadClipReference(reader));
    }
    return references;
}

std::uint32_t ReadOutTime(ByteReader& reader, std::uint32_t inTime)
{
    const std::size_t offset = reader.Offset();
    const std::uint32_t outTime = reader.UInt32("OUT time");
    if (outTime < inTime) {
        reader.Fail(offset, "OUT time is " + std::to_string(outTime),
                    "at least the IN time " + std::to_string(inTime));
    }
    return outTime;
}

void ReadStreamEntry(ByteReader entry, Stream& stream)
{
    stream.offset = OffsetOf(entry);
    stream.entryType = entry.UInt8("entry type");
    switch (stream.entryType) {
    case EntryTypePlayItem:
        break;
    case EntryTypeSubPath:
        stream.subPath = entry.UInt8("number of the sub path");
        stream.subClip = entry.UInt8("number of the clip");
        break;
    case EntryTypePlayItemSubPath3:
    case EntryTypePlayItemSubPath4:
        stream.subPath = entry.UInt8("number of the sub path");
        break;
    default:
        return;
    }
    stream.pid = entry.UInt16("PID");
}

StreamAttributes ReadStreamAttributes(ByteReader reader)
{
    StreamAttributes attributes;
    attributes.codingType = reader.UInt8("coding type");
    if (KindOfStream(attributes.codingType) != StreamKindVideo) {
        ReadAttributesOtherThanVideo(reader, attributes);
        return attributes;
    }
    ReadVideoFormat(reader, attributes);
    if (attributes.codingType == CodingTypeH265) {
        ReadDynamicRange(reader, attributes);
        const std::uint8_t flags = reader.UInt8("dynamic metadata flag");
        attributes.hdrFlag = Bit(flags, 0);
        attributes.dynamicMetadata = Bit(flags, 1);
    }
    return attributes;
}

std::vector<std::uint8_t> ReadReferences(ByteReader& table)
{
    std::vector<std::uint8_t> references(table.Count8(1, "number of references"));
    table.Skip(1, "padding");
    for (std::uint8_t& reference : references) {
        reference = table.UInt8("reference");
    }
    table.Skip(references.size() % 2, "padding");
    return references;
}

using ReferenceList = std::vector<std::uint8_t> Stream::*;

/** @param referenceLists the lists of references after each stream of this kind */
std::vector<Stream> ReadStreams(ByteReader& table, std::size_t count, const char* name,
                                const std::vector<ReferenceList>& referenceLists = {})
{
    std::vector<Stream> streams(count);
    for (std::size_t number = 0; number < count; ++number) {
        Stream& stream = streams[number];
        ReadStreamEntry(table.TakePart8({name, number}), stream);
        stream.attributes = ReadStreamAttributes(table.TakePart8({name, number}));
        for (const ReferenceList list : referenceLists) {
            stream.*list = ReadReferences(table);
        }
    }
    return streams;
}

StreamTable ReadStreamTable(ByteReader table, bool hasEnhancementVideo)
{
    table.Skip(2, "padding");
    const std::uint8_t primaryVideo =
        table.Count8(SmallestStream, "number of primary video streams");
    const std::uint8_t primaryAudio =
        table.Count8(SmallestStream, "number of primary audio streams");
    const std::uint8_t pg = table.Count8(SmallestStream, "number of PG streams");
    const std::uint8_t ig = table.Count8(SmallestStream, "number of IG streams");
    const std::uint8_t secondaryAudio =
        table.Count8(SmallestStream, "number of secondary audio streams");
    const std::uint8_t secondaryVideo =
        table.Count8(SmallestStream, "number of secondary video streams");
    const std::uint8_t pipPg =
        table.Count8(SmallestStream, "number of picture-in-picture PG streams");
    std::uint8_t enhancementVideo = 0;
    if (hasEnhancementVideo) {
        enhancementVideo =
            table.Count8(SmallestStream, "number of enhancement layer video streams");
    } else {
        table.Skip(1, "padding");
    }
    table.Skip(4, "padding");

    // The order of the streams differs from the order of their counts.
    StreamTable streams;
    streams.primaryVideo = ReadStreams(table, primaryVideo, "primary video stream");
    streams.primaryAudio = ReadStreams(table, primaryAudio, "primary audio stream");
    streams.pg = ReadStreams(table, pg, "PG stream");
    streams.pipPg = ReadStreams(table, pipPg, "picture-in-picture PG stream");
    streams.ig = ReadStreams(table, ig, "IG stream");
    streams.secondaryAudio = ReadStreams(table, secondaryAudio, "secondary audio stream",
                                         {&Stream::primaryAudioReferences});
    streams.secondaryVideo =
        ReadStreams(table, secondaryVideo, "secondary video stream",
                    {&Stream::secondaryAudioReferences, &Stream::pipPgReferences});
    streams.enhancementVideo =
        ReadStreams(table, enhancementVideo, "enhancement layer video stream");
    return streams;
}

PlayItem ReadPlayItem(ByteReader body, bool hasEnhancementVideo)
{
    PlayItem item;
    item.clip.offset = OffsetOf(body);
    item.clip.name = ReadClipName(body);
    item.clip.codec = body.Text(4, "codec");
    const std::uint16_t angleAndConnection = body.UInt16("connection condition");
    item.multiAngle = Bit(angleAndConnection, 11);
    item.connectionCondition = angleAndConnection & 0xF;
    item.clip.stcSequence = body.UInt8("STC sequence");
    item.inTime = body.UInt32("IN time");
    item.outTime = ReadOutTime(body, item.inTime);
    item.uoMask = body.UInt64("UO mask");
    item.randomAccessFlag = Bit(body.UInt8("random access flag"), 0);
    item.stillMode = body.UInt8("still mode");
    const std::uint16_t stillTime = body.UInt16("still time");
    if (item.stillMode == StillModeTimed) {
        item.stillTime = stillTime;
    }
    if (item.multiAngle) {
        const std::uint8_t count = body.UInt8("number of angles");
        const std::uint8_t flags = body.UInt8("angle flags");
        item.differentAudios = Bit(flags, 6);
        item.seamlessAngleChange = Bit(flags, 7);
        item.furtherAngles = ReadFurtherClips(body, count);
    }
    item.streams = ReadStreamTable(body.TakePart16({"stream table"}), hasEnhancementVideo);
    return item;
}

SubPlayItem ReadSubPlayItem(ByteReader body)
{
    SubPlayItem item;
    item.clip.offset = OffsetOf(body);
    item.clip.name = ReadClipName(body);
    item.clip.codec = body.Text(4, "codec");
    const std::uint32_t connectionAndClips = body.UInt32("connection condition");
    item.connectionCondition = connectionAndClips >> 1 & 0xF;
    item.clip.stcSequence = body.UInt8("STC sequence");
    item.inTime = body.UInt32("IN time");
    item.outTime = ReadOutTime(body, item.inTime);
    item.syncPlayItem = body.UInt16("sync play item");
    item.syncTime = body.UInt32("sync time on the play item");
    if (Bit(connectionAndClips, 31)) {
        const std::uint8_t count = body.UInt8("number of clips");
        body.Skip(1, "padding");
        item.furtherClips = ReadFurtherClips(body, count);
    }
    return item;
}

SubPath ReadSubPath(ByteReader body)
{
    SubPath path;
    body.Skip(1, "padding");
    path.type = body.UInt8("sub path type");
    path.repeat = Bit(body.UInt16("repeat flag"), 15);
    body.Skip(1, "padding");
    path.items.resize(body.Count8(SmallestSubPlayItem, "number of sub play items"));
    for (std::size_t number = 0; number < path.items.size(); ++number) {
        path.items[number] = ReadSubPlayItem(body.TakePart16({"sub play item", number}));
    }
    return path;
}

ApplicationInfo ReadApplicationInfo(ByteReader body)
{
    ApplicationInfo info;
    body.Skip(1, "padding");
    info.playbackType = body.UInt8("playback type");
    const std::uint16_t playbackCount = body.UInt16("playback count");
    if (info.playbackType == PlaybackTypeRandom || info.playbackType == PlaybackTypeShuffle) {
        info.playbackCount = playbackCount;
    }
    info.uoMask = body.UInt64("UO mask");
    const std::uint16_t flags = body.UInt16("play list flags");
    info.randomAccessFlag = Bit(flags, 0);
    info.audioMixing = Bit(flags, 1);
    info.losslessBypass = Bit(flags, 2);
    info.baseViewIsRightEye = Bit(flags, 3);
    return info;
}

void ReadPlayListSection(ByteReader section, PlayList& playList)
{
    section.Skip(2, "padding");
    playList.playItems.resize(section.Count16(SmallestPlayItem, "number of play items"));
    playList.subPaths.resize(section.Count16(SmallestSubPath, "number of sub paths"));
    const bool hasEnhancementVideo = playList.version == "0300"; // padding in other versions
    for (std::size_t number = 0; number < playList.playItems.size(); ++number) {
        playList.playItems[number] =
            ReadPlayItem(section.TakePart16({"play item", number}), hasEnhancementVideo);
    }
    for (std::size_t number = 0; number < playList.subPaths.size(); ++number) {
        playList.subPaths[number] = ReadSubPath(section.TakePart32({"sub path", number}));
    }
}

std::vector<Mark> ReadMarks(ByteReader section)
{
    if (section.BytesLeft() == 0) {
        return {};
    }
    std::vector<Mark> marks(section.Count16(MarkSize, "number of marks"));
    for (Mark& mark : marks) {
        mark.offset = OffsetOf(section);
        section.Skip(1, "padding");
        mark.type = section.UInt8("mark type");
        mark.playItem = section.UInt16("play item of the mark");
        mark.time = section.UInt32("time of the mark");
        mark.pid = section.UInt16("PID of the mark");
        mark.duration = section.UInt32("duration of the mark");
    }
    return marks;
}

std::vector<ExtensionBlock> ReadExtensionDirectory(ByteReader directory)
{
    if (directory.BytesLeft() == 0) {
        return {};
    }
    directory.Skip(4, "start of the data");
    directory.Skip(3, "padding");
    std::vector<ExtensionBlock> blocks(
        directory.Count8(ExtensionEntrySize, "number of extension blocks"));
    for (ExtensionBlock& block : blocks) {
        block.kind = directory.UInt16("first half of the block kind");
        block.subKind = directory.UInt16("second half of the block kind");
        block.offset = directory.UInt32("start of the block");
        block.size = directory.UInt32("size of the block");
    }
    return blocks;
}

} // namespace

PlayList ParsePlayList(const Bytes& bytes, const std::string& fileName)
{
    ByteReader file(bytes, fileName);
    PlayList playList;
    playList.version = ReadTypeAndVersion(file, "MPLS");
    const ByteReader section = file.PartAtAddress(FileHeaderSize, {"play list section"});
    const ByteReader marks = file.PartAtAddress(FileHeaderSize, {"mark section"});
    const std::optional<ByteReader> extension =
        file.OptionalPartAtAddress(FileHeaderSize, {"extension data"});
    file.Skip(FileHeaderSize - file.Offset(), "header");

    playList.applicationInfo = ReadApplicationInfo(file.TakePart32({"application info"}));
    ReadPlayListSection(section, playList);
    playList.marks = ReadMarks(marks);
    if (extension) {
        playList.extensionBlocks = ReadExtensionDirectory(*extension);
    }
    return playList;
}

std::optional<std::string> ClipOfStream(const PlayList& playList, std::size_t playItem,
                                        const Stream& stream)
{
    switch (stream.entryType) {
    case EntryTypePlayItem:
    case EntryTypePlayItemSubPath3:
    case EntryTypePlayItemSubPath4:
        if (playItem < playList.playItems.size()) {
            return playList.playItems[playItem].clip.name;
        }
        return std::nullopt;
    case EntryTypeSubPath:
        break;
    default:
        return std::nullopt;
    }

    if (stream.subPath >= playList.subPaths.size()) {
        return std::nullopt;
    }
    const std::vector<SubPlayItem>& items = playList.subPaths[stream.subPath].items;
    const auto item = items.size() == 1
                          ? items.begin()
                          : std::find_if(items.begin(), items.end(), [&](const SubPlayItem& each) {
                                return each.syncPlayItem == playItem;
                            });
    if (item == items.end()) {
        return std::nullopt;
    }
    if (stream.subClip == 0) {
        return item->clip.name;
    }
    if (stream.subClip <= item->furtherClips.size()) {
        return item->furtherClips[stream.subClip - 1].name;
    }
    return std::nullopt;
}

} // namespace deskplayer
