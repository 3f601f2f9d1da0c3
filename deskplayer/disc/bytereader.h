/**
 * @file
 * Reads big-endian fields from a file in sequence, with bounds checks.
 *
 * This is the only code that accesses the bytes of a file. Every operation advances the reader past
 * the field, and throws FormatError if bytes are missing.
 *
 * Structures with a length field have a separate reader. It ends where the structure ends, and the
 * outer reader is already past the structure, so unknown content at its end is skipped.
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

/** The contents of a file. */
using Bytes = std::vector<std::uint8_t>;

/** The name of a part of a file in messages: "play list section", or "play item 3". */
struct PartName {
    const char* kind;
    std::optional<std::size_t> number = std::nullopt;

    std::string ToString() const;
};

/**
 * Reads a part of a file from front to back.
 *
 * It and the readers it returns refer to the bytes and the file name given to the constructor,
 * which must outlive them. The names of fields are for messages.
 */
class ByteReader
{
public:
    /** A reader of all of @p bytes. */
    ByteReader(const Bytes& bytes, const std::string& fileName);

    std::uint8_t UInt8(const char* field);
    std::uint16_t UInt16(const char* field);
    std::uint32_t UInt32(const char* field);
    std::uint64_t UInt64(const char* field);

    /** Reads text of @p size bytes, without trailing NUL bytes. It may contain any bytes. */
    std::string Text(std::size_t size, const char* field);

    /** Skips @p size bytes. */
    void Skip(std::size_t size, const char* field);

    /** Reads a one-byte length and returns a reader of that many bytes. */
    ByteReader TakePart8(PartName name);

    /** Reads a two-byte length and returns a reader of that many bytes. */
    ByteReader TakePart16(PartName name);

    /** Reads a four-byte length and returns a reader of that many bytes. */
    ByteReader TakePart32(PartName name);

    /**
     * Reads an address. At the address, reads a four-byte length and returns a reader of that many
     * bytes. This reader continues after the address.
     *
     * @param lowest the lowest valid address
     */
    ByteReader PartAtAddress(std::size_t lowest, PartName name);

    /** The same, but an address of 0 means that the part is missing. */
    std::optional<ByteReader> OptionalPartAtAddress(std::size_t lowest, PartName name);

    /**
     * Reads a one-byte number of entries. Checks that the bytes left have room for them, so it is
     * safe to reserve memory for them.
     *
     * @param smallestEntry minimum size of an entry, in bytes
     */
    std::uint8_t Count8(std::size_t smallestEntry, const char* field);

    /** The same for a two-byte number. */
    std::uint16_t Count16(std::size_t smallestEntry, const char* field);

    /** In bytes from the start of the file. */
    std::size_t Offset() const { return m_Offset; }

    std::size_t BytesLeft() const { return m_End - m_Offset; }

    /** Throws FormatError for the field at @p offset. */
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
