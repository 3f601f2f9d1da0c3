/**
 * @file
 * PLAYLIST/nnnnn.mpls: the sequence of play items, each a part of a clip, and their streams.
 *
 * Times are in 45 kHz ticks. IN, OUT and mark times are positions on the time line of the clip;
 * disc/timeline.h maps them to the time line of the play list.
 */
#ifndef DESKPLAYER_DISC_PLAYLIST_H
#define DESKPLAYER_DISC_PLAYLIST_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "disc/bytereader.h"
#include "disc/streamattributes.h"

namespace deskplayer
{

constexpr std::uint8_t PlaybackTypeInSequence = 1;
constexpr std::uint8_t PlaybackTypeRandom = 2;
constexpr std::uint8_t PlaybackTypeShuffle = 3;

struct ApplicationInfo {
    std::uint8_t playbackType = 0;
    std::uint16_t playbackCount = 0; ///< 0 unless the playback type is random or shuffle
    std::uint64_t uoMask = 0;        ///< as in the file; the first operation is the highest bit
    bool randomAccessFlag = false;   ///< jumping into the play list is not permitted
    bool audioMixing = false;        ///< audio mixing is allowed
    bool losslessBypass = false;     ///< lossless audio may bypass the mixer
    bool baseViewIsRightEye = false;
};

/** A clip and the STC sequence that times refer to. */
struct ClipReference {
    std::string name;  ///< five digits: CLIPINF/nnnnn.clpi, STREAM/nnnnn.m2ts
    std::string codec; ///< "M2TS", rarely "FMTS"
    std::uint8_t stcSequence = 0;
    std::uint32_t offset = 0; ///< of the name, from the start of the file
};

constexpr std::uint8_t EntryTypePlayItem = 1;         ///< in the clip of the play item
constexpr std::uint8_t EntryTypeSubPath = 2;          ///< in another clip, named by a sub path
constexpr std::uint8_t EntryTypePlayItemSubPath3 = 3; ///< in the play item's clip, for a sub path
constexpr std::uint8_t EntryTypePlayItemSubPath4 = 4; ///< the same

/** A stream of a play item: its source, its attributes, and the streams it can be combined with. */
struct Stream {
    std::uint8_t entryType = 0;
    std::uint16_t pid = 0;    ///< 0 if the entry type is reserved
    std::uint8_t subPath = 0; ///< entry types 2 to 4: number of the sub path, from 0
    std::uint8_t subClip = 0; ///< entry type 2: number of the clip in the sub play item, from 0
    std::uint32_t offset = 0; ///< of the entry type, from the start of the file
    StreamAttributes attributes;
    std::vector<std::uint8_t> primaryAudioReferences;   ///< of secondary audio; from 0
    std::vector<std::uint8_t> secondaryAudioReferences; ///< of secondary video; from 0
    std::vector<std::uint8_t> pipPgReferences;          ///< of secondary video; from 0
};

/** Streams by kind, in file order. The first stream of each kind is number 1 to the user. */
struct StreamTable {
    std::vector<Stream> primaryVideo;
    std::vector<Stream> primaryAudio;
    std::vector<Stream> pg;    ///< PG and text subtitles
    std::vector<Stream> pipPg; ///< PG and text subtitles for picture-in-picture
    std::vector<Stream> ig;
    std::vector<Stream> secondaryAudio;
    std::vector<Stream> secondaryVideo;
    std::vector<Stream> enhancementVideo; ///< version 0300 only
};

constexpr std::uint8_t StillModeNone = 0;
constexpr std::uint8_t StillModeTimed = 1;
constexpr std::uint8_t StillModeEndless = 2;

struct PlayItem {
    ClipReference clip; ///< of angle 1
    std::uint8_t connectionCondition = 0;
    std::uint32_t inTime = 0;
    std::uint32_t outTime = 0;     ///< not before inTime; applies to all angles, like inTime
    std::uint64_t uoMask = 0;      ///< as in the file; in addition to the one of the play list
    bool randomAccessFlag = false; ///< jumping into the play item is not permitted
    std::uint8_t stillMode = 0;
    std::uint16_t stillTime = 0; ///< seconds; 0 unless the still mode is StillModeTimed
    bool multiAngle = false;     ///< an angle table exists
    bool differentAudios = false;
    bool seamlessAngleChange = false;
    std::vector<ClipReference> furtherAngles; ///< angles 2 and up
    StreamTable streams;
};

/** The number of angles; 1 without an angle table. */
inline std::size_t NumberOfAngles(const PlayItem& item)
{
    return 1 + item.furtherAngles.size();
}

struct SubPlayItem {
    ClipReference clip;
    std::uint8_t connectionCondition = 0;
    std::uint32_t inTime = 0;
    std::uint32_t outTime = 0;               ///< not before inTime
    std::uint16_t syncPlayItem = 0;          ///< from 0; there may be no such play item
    std::uint32_t syncTime = 0;              ///< on the clip of that play item
    std::vector<ClipReference> furtherClips; ///< clips 1 and up, since clips are numbered from 0
};

struct SubPath {
    std::uint8_t type = 0;
    bool repeat = false;
    std::vector<SubPlayItem> items;
};

constexpr std::uint8_t MarkTypeEntry = 1; ///< a chapter starts
constexpr std::uint8_t MarkTypeLink = 2;
constexpr std::uint16_t MarkForAllStreams = 0xFFFF;

struct Mark {
    std::uint8_t type = 0;
    std::uint16_t playItem = 0; ///< from 0; there may be no such play item
    std::uint32_t time = 0;     ///< on the clip of that play item, not always between IN and OUT
    std::uint16_t pid = 0;      ///< PID of its stream, or MarkForAllStreams
    std::uint32_t duration = 0;
    std::uint32_t offset = 0; ///< from the start of the file
};

/** A block of the extension data. Its bytes are not read, so it may lie outside the file. */
struct ExtensionBlock {
    std::uint16_t kind = 0;    ///< first half of the block kind
    std::uint16_t subKind = 0; ///< second half of the block kind
    std::uint32_t offset = 0;  ///< from the start of the extension data
    std::uint32_t size = 0;
};

struct PlayList {
    std::string version;
    ApplicationInfo applicationInfo;
    std::vector<PlayItem> playItems; ///< may be empty
    std::vector<SubPath> subPaths;
    std::vector<Mark> marks;
    std::vector<ExtensionBlock> extensionBlocks;
};

/**
 * Reads a play list.
 *
 * Contradictions are refused, because nothing after them can be trusted: a wrong type or an unknown
 * version, an address outside the file or in its header, a structure that is longer than the
 * enclosing one or shorter than its declared content, a clip name that is not five digits, OUT
 * before IN.
 *
 * Anomalies that a player can tolerate are kept: reserved codes, marks outside their play item,
 * marks and streams that refer to missing play items, sub paths or streams. Padding, and anything
 * after the known content of a structure, is skipped. Sections may overlap; each is read
 * independently.
 *
 * Time and memory are linear in the number of bytes, whatever they declare.
 *
 * @param fileName for messages
 * @throw FormatError see above
 */
PlayList ParsePlayList(const Bytes& bytes, const std::string& fileName);

/**
 * The clip that carries a stream of a play item, at angle 1.
 *
 * Entry type 2 does not specify the sub play item. It is the first one that starts in this play
 * item, or the only one of the sub path.
 *
 * @param playItem from 0
 * @return the name of the clip; nothing if the entry type is reserved or refers to a missing part
 */
std::optional<std::string> ClipOfStream(const PlayList& playList, std::size_t playItem,
                                        const Stream& stream);

} // namespace deskplayer

#endif
