/**
 * @file
 * Takes big-endian fields out of a file, one after the other, and never leaves its bytes.
 *
 * This is the only code that touches the bytes of a file. Every operation that needs bytes which
 * are not there throws FormatError; a field that was read is behind the reader.
 *
 * Structures that announce their own length are read through a reader of their own. It ends where
 * the structure ends, while the reader around it already stands behind the structure, so it does
 * not matter how much of a structure is understood.
 *
 * @code
 * ByteReader item = section.TakePart16({"play item", 3});
 * const std::uint32_t inTime = item.UInt32("IN time");
 * @endcode
 */
#ifndef DESKPLAYER_DISC_BYTEREADER_H
#define DESKPLAYER_DISC_BYTEREADER_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace deskplayer
{

/** The content of a file. */
using Bytes = std::vector<std::uint8_t>;

/** What a stretch of a file is called in messages: "play list section", or "play item 3". */
struct PartName {
    const char* kind;
    std::optional<std::size_t> number = std::nullopt;

    std::string ToString() const;
};

/**
 * Reads a stretch of a file from front to back.
 *
 * Refers to the bytes and to the file name it was made with, and so do the readers it hands out;
 * both must outlive them. The names of fields are for messages.
 */
class ByteReader
{
public:
    /** Reads all of @p bytes. */
    ByteReader(const Bytes& bytes, const std::string& fileName);

    std::uint8_t UInt8(const char* field);
    std::uint16_t UInt16(const char* field);
    std::uint32_t UInt32(const char* field);
    std::uint64_t UInt64(const char* field);

    /** A text field of @p size bytes, without the NUL bytes at its end. The bytes can be any. */
    std::string Text(std::size_t size, const char* field);

    /** Passes over @p size bytes. */
    void Skip(std::size_t size, const char* field);

    /** Reads a length of one byte and hands out a reader of the bytes it counts. */
    ByteReader TakePart8(PartName name);

    /** Reads a length of two bytes and hands out a reader of the bytes it counts. */
    ByteReader TakePart16(PartName name);

    /** Reads a length of four bytes and hands out a reader of the bytes it counts. */
    ByteReader TakePart32(PartName name);

    /**
     * Reads an address and hands out a reader of what is there: a length of four bytes and the
     * bytes it counts. The reader itself goes on behind the address.
     *
     * @param lowest first byte of the file the address may name
     */
    ByteReader PartAtAddress(std::size_t lowest, PartName name);

    /** The same, but an address of 0 says that there is no such part. */
    std::optional<ByteReader> OptionalPartAtAddress(std::size_t lowest, PartName name);

    /**
     * Reads a number of entries, in one byte. As many can really follow, so it is safe to reserve
     * memory for them.
     *
     * @param smallestEntry bytes that an entry has at least
     */
    std::uint8_t Count8(std::size_t smallestEntry, const char* field);

    /** The same for a number in two bytes. */
    std::uint16_t Count16(std::size_t smallestEntry, const char* field);

    /** Counts from the start of the file. */
    std::size_t Offset() const { return m_Offset; }

    std::size_t BytesLeft() const { return m_End - m_Offset; }

    /** Reports the field at @p offset. */
    [[noreturn]] void Fail(std::size_t offset, const std::string& found,
                           const std::string& expected) const;

private:
    ByteReader(const ByteReader& whole, std::size_t begin, std::size_t end, PartName name);

    std::uint64_t Number(std::size_t size, const char* field);
    std::uint64_t Count(std::size_t size, std::size_t smallestEntry, const char* field);
    void Need(std::size_t size, const char* field) const;
    ByteReader TakePart(std::size_t sizeOfLength, PartName name);
    ByteReader PartAt(std::uint32_t address, std::size_t lowest, PartName name) const;

    const Bytes& m_rBytes;
    const std::string& m_rFileName;
    std::size_t m_Offset;
    std::size_t m_End;
    PartName m_Name;
};

} // namespace deskplayer

#endif
