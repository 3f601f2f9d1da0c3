#include "check/playlistcheck.h"

#include <cstdio>
#include <utility>
#include <vector>

#include "text/printable.h"

namespace deskplayer
{

namespace
{

/** Offsets of fields from the name of the clip, which is in the same structure. */
struct ClipFields {
    std::size_t stcSequence;
    std::size_t inTime;
    std::size_t outTime;
};

constexpr ClipFields PlayItemFields = {11, 12, 16};
constexpr ClipFields SubPlayItemFields = {13, 14, 18};
constexpr std::size_t StcSequenceInTable = 9; ///< in an angle or clip table
constexpr std::size_t SyncPlayItem = 22;
constexpr std::size_t SyncTime = 24;

// Offsets from the start of a mark.
constexpr std::size_t PlayItemOfMark = 2;
constexpr std::size_t TimeOfMark = 4;

// Offsets from the entry type of a stream.
constexpr std::size_t SubPathOfStream = 1;
constexpr std::size_t SubClipOfStream = 2;

std::size_t OffsetOfPid(const Stream& stream)
{
    switch (stream.entryType) {
    case EntryTypePlayItem:
        return 1;
    case EntryTypeSubPath:
        return 3;
    default:
        return 2;
    }
}

std::string Hex(unsigned value, int digits)
{
    char text[16];
    std::snprintf(text, sizeof text, "0x%0*X", digits, value);
    return text;
}

std::string Between(std::uint32_t first, std::uint32_t last)
{
    return "from " + std::to_string(first) + " to " + std::to_string(last);
}

/** "below 3", or that there is nothing to refer to. */
std::string Below(std::size_t count, const char* things)
{
    return count == 0 ? std::string("no reference, as there are no ") + things
                      : "below " + std::to_string(count) + ", the number of " + things;
}

class PlayListCheck
{
public:
    PlayListCheck(const PlayList& playList, const std::string& file, const Clips& clips,
                  const FaultHandler& onFault)
        : m_rPlayList(playList), m_rFile(file), m_rClips(clips), m_rOnFault(onFault)
    {
    }

    void Run()
    {
        for (std::size_t number = 0; number < m_rPlayList.playItems.size(); ++number) {
            CheckPlayItem(number);
        }
        for (const SubPath& path : m_rPlayList.subPaths) {
            for (const SubPlayItem& item : path.items) {
                CheckSubPlayItem(item);
            }
        }
        for (std::size_t number = 0; number < m_rPlayList.marks.size(); ++number) {
            CheckMark(number, m_rPlayList.marks[number]);
        }
    }

private:
    void Report(std::size_t offset, std::string found, std::string expected)
    {
        m_rOnFault({m_rFile, offset, std::move(found), std::move(expected)});
    }

    /** @return the contents of the clip; null if they are not known */
    const ClipContents* FindClip(const ClipReference& reference)
    {
        const auto clip = m_rClips.find(reference.name);
        if (clip == m_rClips.end()) {
            Report(reference.offset, "clip name is \"" + Printable(reference.name) + "\"",
                   "a clip with clip information, CLIPINF/" + Printable(reference.name) + ".clpi");
            return nullptr;
        }
        return clip->second ? &*clip->second : nullptr;
    }

    /** @return null if it is not known */
    const StcSequence* FindSequence(const ClipReference& reference, std::size_t offsetOfSequence)
    {
        const ClipContents* const clip = FindClip(reference);
        if (clip == nullptr) {
            return nullptr;
        }
        const StcSequence* const sequence = clip->FindSequence(reference.stcSequence);
        if (sequence == nullptr) {
            Report(reference.offset + offsetOfSequence,
                   "STC sequence is " + std::to_string(reference.stcSequence),
                   "one that clip " + reference.name + " has");
        }
        return sequence;
    }

    void CheckTimes(const ClipReference& clip, const ClipFields& fields, std::uint32_t inTime,
                    std::uint32_t outTime)
    {
        const StcSequence* const sequence = FindSequence(clip, fields.stcSequence);
        if (sequence == nullptr) {
            return;
        }
        const std::uint32_t start = sequence->presentationStart;
        const std::uint32_t end = sequence->presentationEnd;
        const std::string expected = Between(start, end) + ", the times of clip " + clip.name;
        if (inTime < start || inTime > end) {
            Report(clip.offset + fields.inTime, "IN time is " + std::to_string(inTime), expected);
        }
        if (outTime < start || outTime > end) {
            Report(clip.offset + fields.outTime, "OUT time is " + std::to_string(outTime),
                   expected);
        }
    }

    void CheckPlayItem(std::size_t number)
    {
        const PlayItem& item = m_rPlayList.playItems[number];
        CheckTimes(item.clip, PlayItemFields, item.inTime, item.outTime);
        for (const ClipReference& angle : item.furtherAngles) {
            FindSequence(angle, StcSequenceInTable);
        }
        const StreamTable& table = item.streams;
        for (const std::vector<Stream>* const streams :
             {&table.primaryVideo, &table.primaryAudio, &table.pg, &table.pipPg, &table.ig,
              &table.secondaryAudio, &table.secondaryVideo, &table.enhancementVideo}) {
            for (const Stream& stream : *streams) {
                CheckStream(number, stream);
                CheckReferences(stream, stream.primaryAudioReferences, table.primaryAudio.size(),
                                "primary audio streams");
                CheckReferences(stream, stream.secondaryAudioReferences,
                                table.secondaryAudio.size(), "secondary audio streams");
                CheckReferences(stream, stream.pipPgReferences, table.pipPg.size(),
                                "picture-in-picture PG streams");
            }
        }
    }

    void CheckReferences(const Stream& stream, const std::vector<std::uint8_t>& references,
                         std::size_t count, const char* things)
    {
        for (const std::uint8_t reference : references) {
            if (reference >= count) {
                Report(stream.offset,
                       "stream " + Hex(stream.pid, 4) + " refers to number " +
                           std::to_string(reference),
                       Below(count, things));
            }
        }
    }

    void CheckStream(std::size_t playItem, const Stream& stream)
    {
        if (stream.entryType < EntryTypePlayItem || stream.entryType > EntryTypePlayItemSubPath4) {
            Report(stream.offset, "entry type is " + std::to_string(stream.entryType), "1 to 4");
            return;
        }
        if (stream.entryType != EntryTypePlayItem &&
            stream.subPath >= m_rPlayList.subPaths.size()) {
            Report(stream.offset + SubPathOfStream,
                   "sub path of the stream is " + std::to_string(stream.subPath),
                   Below(m_rPlayList.subPaths.size(), "sub paths"));
            return;
        }
        const std::optional<std::string> name = ClipOfStream(m_rPlayList, playItem, stream);
        if (!name) {
            Report(stream.offset + SubClipOfStream,
                   "clip of the stream is " + std::to_string(stream.subClip),
                   "a clip of sub path " + std::to_string(stream.subPath) + " in play item " +
                       std::to_string(playItem));
            return;
        }
        const auto clip = m_rClips.find(*name);
        if (clip == m_rClips.end() || !clip->second) {
            return; // reported where the clip is named
        }
        const std::optional<std::uint8_t> codingType = clip->second->FindCodingType(stream.pid);
        if (!codingType) {
            Report(stream.offset + OffsetOfPid(stream), "PID is " + Hex(stream.pid, 4),
                   "one of the streams of clip " + *name);
        } else if (*codingType != stream.attributes.codingType) {
            Report(stream.offset,
                   "stream " + Hex(stream.pid, 4) + " has coding type " +
                       Hex(stream.attributes.codingType, 2),
                   Hex(*codingType, 2) + ", as in clip " + *name);
        }
    }

    /** @return null, after a report, if there is no such play item */
    const PlayItem* FindPlayItem(std::size_t offset, const std::string& what, std::uint16_t number)
    {
        const std::vector<PlayItem>& items = m_rPlayList.playItems;
        if (number < items.size()) {
            return &items[number];
        }
        Report(offset, what + " is " + std::to_string(number), Below(items.size(), "play items"));
        return nullptr;
    }

    void CheckWithin(const PlayItem& item, std::size_t offset, const std::string& what,
                     std::uint32_t time)
    {
        if (time < item.inTime || time > item.outTime) {
            Report(offset, what + " is " + std::to_string(time),
                   Between(item.inTime, item.outTime) + ", the times of its play item");
        }
    }

    void CheckSubPlayItem(const SubPlayItem& item)
    {
        CheckTimes(item.clip, SubPlayItemFields, item.inTime, item.outTime);
        for (const ClipReference& clip : item.furtherClips) {
            FindSequence(clip, StcSequenceInTable);
        }
        if (const PlayItem* const playItem = FindPlayItem(item.clip.offset + SyncPlayItem,
                                                          "sync play item", item.syncPlayItem)) {
            CheckWithin(*playItem, item.clip.offset + SyncTime, "sync time", item.syncTime);
        }
    }

    void CheckMark(std::size_t number, const Mark& mark)
    {
        const std::string name = " of mark " + std::to_string(number);
        if (const PlayItem* const item =
                FindPlayItem(mark.offset + PlayItemOfMark, "play item" + name, mark.playItem)) {
            CheckWithin(*item, mark.offset + TimeOfMark, "time" + name, mark.time);
        }
    }

    const PlayList& m_rPlayList;
    const std::string& m_rFile;
    const Clips& m_rClips;
    const FaultHandler& m_rOnFault;
};

} // namespace

void CheckPlayList(const PlayList& playList, const std::string& file, const Clips& clips,
                   const FaultHandler& onFault)
{
    PlayListCheck(playList, file, clips, onFault).Run();
}

} // namespace deskplayer
