/**
 * @file
 * Makes the bytes of metadata files, right ones and wrong ones.
 */
#ifndef TESTS_DESKPLAYER_DISC_BYTEWRITER_H
#define TESTS_DESKPLAYER_DISC_BYTEWRITER_H

#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <string>

#include "disc/bytereader.h"

namespace deskplayer
{

Bytes U8(unsigned value);
Bytes U16(unsigned value);
Bytes U32(std::uint32_t value);
Bytes U64(std::uint64_t value);
Bytes Ascii(const std::string& text);
Bytes Zeros(std::size_t count);

Bytes Join(std::initializer_list<Bytes> pieces);
Bytes Repeat(std::size_t count, const Bytes& piece);

/** @p body behind its length in one, two or four bytes. */
Bytes Part8(const Bytes& body);
Bytes Part16(const Bytes& body);
Bytes Part32(const Bytes& body);

/** Puts @p replacement over the bytes of @p bytes at @p offset. */
void Overwrite(Bytes& bytes, std::size_t offset, const Bytes& replacement);

/** A stream entry of type 1. */
Bytes StreamEntry(unsigned pid);

/** Stream attributes: coding type and the four bytes behind it. */
Bytes StreamAttributesBytes(unsigned codingType, const Bytes& details);

/** An audio stream without language, entry and attributes. */
Bytes AudioStream(unsigned pid);

/** A stream table of @p counts, which are those of the file's layout, eight of them. */
Bytes StreamTableBytes(const Bytes& counts, const Bytes& streams);

/** What a play item is made of; by default an ordinary one of ten ticks without streams. */
struct PlayItemBytes {
    std::string clip = "00001";
    unsigned angleAndConnection = 1;
    unsigned stcSequence = 0;
    std::uint32_t inTime = 1000;
    std::uint32_t outTime = 1010;
    std::uint64_t uoMask = 0;
    unsigned randomAccess = 0;
    unsigned stillMode = 0;
    unsigned stillTime = 0;
    Bytes angleTable = {};
    Bytes streamTable = StreamTableBytes(Zeros(8), {});
    Bytes behind = {}; ///< further bytes at the end of its body

    Bytes Make() const;
};

/** What a sub play item is made of. */
struct SubPlayItemBytes {
    std::string clip = "00002";
    std::uint32_t connectionAndClips = 1 << 1;
    unsigned stcSequence = 0;
    std::uint32_t inTime = 2000;
    std::uint32_t outTime = 2020;
    unsigned syncPlayItem = 0;
    std::uint32_t syncTime = 1000;
    Bytes clipTable = {};

    Bytes Make() const;
};

/** A sub path of @p count items. */
Bytes SubPathBytes(unsigned type, unsigned flags, unsigned count, const Bytes& items);

Bytes MarkBytes(unsigned type, unsigned playItem, std::uint32_t time);

/** An entry of an angle or clip table. */
Bytes FurtherClip(const std::string& clip, const std::string& codec, unsigned stcSequence);

/** What a play list is made of; by default one without play items and marks. */
struct PlayListBytes {
    std::string version = "0200";
    Bytes applicationInfo = Part32(Zeros(14));
    unsigned itemCount = 0;
    Bytes items = {};
    unsigned subPathCount = 0;
    Bytes subPaths = {};
    Bytes marks = U32(0); ///< the whole section
    Bytes extension = {}; ///< the whole extension data; none if empty

    Bytes Make() const;
};

/** A play list of one play item. */
PlayListBytes WithItem(const PlayItemBytes& item);

/** A play list of one play item with the streams of @p streamTable. */
PlayListBytes WithStreams(const Bytes& counts, const Bytes& streams);

/**
 * The densest play list there can be, whose values take the most memory: streams of four bytes, in
 * as many items as fit into the greatest file that is read.
 */
PlayListBytes DensePlayList();

/** A program of clip information with @p count streams. */
Bytes ProgramBytes(unsigned count, const Bytes& streams);

/** Clip information with @p count programs, and with nothing else of interest. */
Bytes ClipInfoOf(unsigned count, const Bytes& programs);

} // namespace deskplayer

#endif
