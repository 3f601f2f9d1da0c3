/**
 * @file
 * Makes the bytes of valid and invalid metadata files.
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

/** @p body, preceded by its length in one, two or four bytes. */
Bytes Part8(const Bytes& body);
Bytes Part16(const Bytes& body);
Bytes Part32(const Bytes& body);

/** Overwrites @p bytes at @p offset with @p replacement. */
void Overwrite(Bytes& bytes, std::size_t offset, const Bytes& replacement);

/** A stream entry of type 1. */
Bytes StreamEntry(unsigned pid);

/** Stream attributes: coding type and the four bytes after it. */
Bytes StreamAttributesBytes(unsigned codingType, const Bytes& details);

/** The entry and attributes of an audio stream without a language. */
Bytes AudioStream(unsigned pid);

/** A stream table. @p counts are the eight counts in file order. */
Bytes StreamTableBytes(const Bytes& counts, const Bytes& streams);

/** The fields of a play item; by default an ordinary one of ten ticks without streams. */
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
    Bytes trailing = {}; ///< further bytes at the end of its body

    Bytes Make() const;
};

/** The fields of a sub play item. */
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

/** The fields of a play list; by default without play items and marks. */
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

/** A play list of one play item with a stream table as StreamTableBytes() makes it. */
PlayListBytes WithStreams(const Bytes& counts, const Bytes& streams);

/**
 * The densest possible play list, whose values take the most memory: streams of four bytes, in as
 * many items as fit into the largest file that is read.
 */
PlayListBytes DensePlayList();

/** A program of clip information with @p count streams. */
Bytes ProgramBytes(unsigned count, const Bytes& streams);

/** Clip information with @p count programs and otherwise minimal content. */
Bytes ClipInfoOf(unsigned count, const Bytes& programs);

} // namespace deskplayer

#endif
