#include "bytewriter.h"

#include <algorithm>

#include "disc/disc.h"

namespace deskplayer
{

namespace
{

Bytes BigEndian(std::size_t size, std::uint64_t value)
{
    Bytes bytes(size);
    for (std::size_t index = size; index > 0; --index) {
        bytes[index - 1] = static_cast<std::uint8_t>(value);
        value >>= 8;
    }
    return bytes;
}

Bytes Part(std::size_t sizeOfLength, const Bytes& body)
{
    return Join({BigEndian(sizeOfLength, body.size()), body});
}

} // namespace

Bytes U8(unsigned value)
{
    return BigEndian(1, value);
}
Bytes U16(unsigned value)
{
    return BigEndian(2, value);
}
Bytes U32(std::uint32_t value)
{
    return BigEndian(4, value);
}
Bytes U64(std::uint64_t value)
{
    return BigEndian(8, value);
}
Bytes Ascii(const std::string& text)
{
    return Bytes(text.begin(), text.end());
}
Bytes Zeros(std::size_t count)
{
    return Bytes(count);
}

Bytes Join(std::initializer_list<Bytes> pieces)
{
    Bytes bytes;
    for (const Bytes& piece : pieces) {
        bytes.insert(bytes.end(), piece.begin(), piece.end());
    }
    return bytes;
}

Bytes Repeat(std::size_t count, const Bytes& piece)
{
    Bytes bytes;
    for (; count > 0; --count) {
        bytes.insert(bytes.end(), piece.begin(), piece.end());
    }
    return bytes;
}

Bytes Part8(const Bytes& body)
{
    return Part(1, body);
}
Bytes Part16(const Bytes& body)
{
    return Part(2, body);
}
Bytes Part32(const Bytes& body)
{
    return Part(4, body);
}

void Overwrite(Bytes& bytes, std::size_t offset, const Bytes& replacement)
{
    std::copy(replacement.begin(), replacement.end(), bytes.begin() + std::ptrdiff_t(offset));
}

Bytes StreamEntry(unsigned pid)
{
    return Part8(Join({U8(1), U16(pid), Zeros(6)}));
}

Bytes StreamAttributesBytes(unsigned codingType, const Bytes& details)
{
    return Part8(Join({U8(codingType), details}));
}

Bytes AudioStream(unsigned pid)
{
    return Join({StreamEntry(pid), StreamAttributesBytes(0x81, Zeros(4))});
}

Bytes StreamTableBytes(const Bytes& counts, const Bytes& streams)
{
    return Part16(Join({Zeros(2), counts, Zeros(4), streams}));
}

Bytes PlayItemBytes::Make() const
{
    return Part16(Join({Ascii(clip), Ascii("M2TS"), U16(angleAndConnection), U8(stcSequence),
                        U32(inTime), U32(outTime), U64(uoMask), U8(randomAccess), U8(stillMode),
                        U16(stillTime), angleTable, streamTable, trailing}));
}

Bytes SubPlayItemBytes::Make() const
{
    return Part16(Join({Ascii(clip), Ascii("M2TS"), U32(connectionAndClips), U8(stcSequence),
                        U32(inTime), U32(outTime), U16(syncPlayItem), U32(syncTime), clipTable}));
}

Bytes SubPathBytes(unsigned type, unsigned flags, unsigned count, const Bytes& items)
{
    return Part32(Join({Zeros(1), U8(type), U16(flags), Zeros(1), U8(count), items}));
}

Bytes MarkBytes(unsigned type, unsigned playItem, std::uint32_t time)
{
    return Join({Zeros(1), U8(type), U16(playItem), U32(time), U16(0xFFFF), U32(0)});
}

Bytes FurtherClip(const std::string& clip, const std::string& codec, unsigned stcSequence)
{
    return Join({Ascii(clip), Ascii(codec), U8(stcSequence)});
}

Bytes PlayListBytes::Make() const
{
    const Bytes section =
        Part32(Join({Zeros(2), U16(itemCount), U16(subPathCount), items, subPaths}));
    const auto sectionAt = std::uint32_t(40 + applicationInfo.size());
    const auto marksAt = std::uint32_t(sectionAt + section.size());
    const auto extensionAt = extension.empty() ? 0 : std::uint32_t(marksAt + marks.size());
    return Join({Ascii("MPLS"), Ascii(version), U32(sectionAt), U32(marksAt), U32(extensionAt),
                 Zeros(20), applicationInfo, section, marks, extension});
}

PlayListBytes WithItem(const PlayItemBytes& item)
{
    PlayListBytes playList;
    playList.itemCount = 1;
    playList.items = item.Make();
    return playList;
}

PlayListBytes WithStreams(const Bytes& counts, const Bytes& streams)
{
    PlayItemBytes item;
    item.streamTable = StreamTableBytes(counts, streams);
    return WithItem(item);
}

PlayListBytes DensePlayList()
{
    const Bytes smallestStream{1, 9, 1, 0x7F};
    PlayItemBytes item;
    item.streamTable = StreamTableBytes(Join({Repeat(4, {0xFF}), Zeros(2), {0xFF, 0}}),
                                        Repeat(std::size_t{5} * 255, smallestStream));
    PlayListBytes playList;
    playList.itemCount = unsigned(LargestPlayListFile / item.Make().size());
    playList.items = Repeat(playList.itemCount, item.Make());
    return playList;
}

Bytes ClipInfoOf(unsigned count, const Bytes& programs)
{
    const Bytes clipInfo = Part32(Zeros(144));
    const Bytes sequences = Part32(Zeros(2));
    const auto sequencesAt = std::uint32_t(40 + clipInfo.size());
    const auto programsAt = std::uint32_t(sequencesAt + sequences.size());
    return Join({Ascii("HDMV0200"), U32(sequencesAt), U32(programsAt), Zeros(24), clipInfo,
                 sequences, Part32(Join({U8(0), U8(count), programs}))});
}

Bytes ProgramBytes(unsigned count, const Bytes& streams)
{
    return Join({U32(0), U16(0x100), U8(count), U8(0), streams});
}

} // namespace deskplayer
