#include "disc/bytereader.h"

#include "disc/errors.h"

namespace deskplayer
{

namespace
{

std::string CountOfBytes(std::size_t count)
{
    return std::to_string(count) + (count == 1 ? " byte" : " bytes");
}

} // namespace

std::string PartName::ToString() const
{
    return number ? std::string(kind) + " " + std::to_string(*number) : kind;
}

ByteReader::ByteReader(const Bytes& bytes, const std::string& fileName)
    : m_rBytes(bytes), m_rFileName(fileName), m_Offset(0), m_End(bytes.size()), m_Name{"file"}
{
}

ByteReader::ByteReader(const ByteReader& whole, std::size_t begin, std::size_t end, PartName name)
    : m_rBytes(whole.m_rBytes), m_rFileName(whole.m_rFileName), m_Offset(begin), m_End(end),
      m_Name(name)
{
}

std::uint8_t ByteReader::UInt8(const char* field)
{
    return static_cast<std::uint8_t>(Number(1, field));
}

std::uint16_t ByteReader::UInt16(const char* field)
{
    return static_cast<std::uint16_t>(Number(2, field));
}

std::uint32_t ByteReader::UInt32(const char* field)
{
    return static_cast<std::uint32_t>(Number(4, field));
}

std::uint64_t ByteReader::UInt64(const char* field)
{
    return Number(8, field);
}

std::string ByteReader::Text(std::size_t size, const char* field)
{
    Need(size, field);
    std::string text;
    for (; size > 0; --size) {
        text += static_cast<char>(m_rBytes[m_Offset++]);
    }
    text.resize(text.find_last_not_of('\0') + 1);
    return text;
}

void ByteReader::Skip(std::size_t size, const char* field)
{
    Need(size, field);
    m_Offset += size;
}

ByteReader ByteReader::TakePart8(PartName name)
{
    return TakePart(1, name);
}

ByteReader ByteReader::TakePart16(PartName name)
{
    return TakePart(2, name);
}

ByteReader ByteReader::TakePart32(PartName name)
{
    return TakePart(4, name);
}

ByteReader ByteReader::PartAtAddress(std::size_t lowest, PartName name)
{
    const std::uint32_t address = UInt32("address");
    return PartAt(address, lowest, name);
}

std::optional<ByteReader> ByteReader::OptionalPartAtAddress(std::size_t lowest, PartName name)
{
    const std::uint32_t address = UInt32("address");
    if (address == 0) {
        return std::nullopt;
    }
    return PartAt(address, lowest, name);
}

std::uint8_t ByteReader::Count8(std::size_t smallestEntry, const char* field)
{
    return static_cast<std::uint8_t>(Count(1, smallestEntry, field));
}

std::uint16_t ByteReader::Count16(std::size_t smallestEntry, const char* field)
{
    return static_cast<std::uint16_t>(Count(2, smallestEntry, field));
}

void ByteReader::Fail(std::size_t offset, const std::string& found,
                      const std::string& expected) const
{
    throw FormatError(m_rFileName, offset, found, expected);
}

std::uint64_t ByteReader::Number(std::size_t size, const char* field)
{
    Need(size, field);
    std::uint64_t number = 0;
    for (; size > 0; --size) {
        number = number << 8 | m_rBytes[m_Offset++];
    }
    return number;
}

std::uint64_t ByteReader::Count(std::size_t size, std::size_t smallestEntry, const char* field)
{
    const std::size_t offset = m_Offset;
    const std::uint64_t count = Number(size, field);
    const std::size_t most = BytesLeft() / smallestEntry;
    if (count > most) {
        Fail(offset, std::string(field) + " is " + std::to_string(count),
             "at most " + std::to_string(most) + " in the " + CountOfBytes(BytesLeft()) +
                 " left in " + m_Name.ToString());
    }
    return count;
}

void ByteReader::Need(std::size_t size, const char* field) const
{
    if (size > BytesLeft()) {
        Fail(m_Offset, m_Name.ToString() + " has " + CountOfBytes(BytesLeft()) + " left",
             CountOfBytes(size) + " for " + field);
    }
}

ByteReader ByteReader::TakePart(std::size_t sizeOfLength, PartName name)
{
    const std::size_t offset = m_Offset;
    const std::uint64_t length = Number(sizeOfLength, "length");
    if (length > BytesLeft()) {
        Fail(offset, name.ToString() + " has length " + std::to_string(length),
             "at most the " + CountOfBytes(BytesLeft()) + " left in " + m_Name.ToString());
    }
    const std::size_t begin = m_Offset;
    m_Offset += static_cast<std::size_t>(length);
    return ByteReader(*this, begin, m_Offset, name);
}

ByteReader ByteReader::PartAt(std::uint32_t address, std::size_t lowest, PartName name) const
{
    if (address < lowest || address > m_rBytes.size()) {
        Fail(m_Offset - sizeof(address),
             name.ToString() + " has address " + std::to_string(address),
             "at least " + std::to_string(lowest) + " and at most " +
                 std::to_string(m_rBytes.size()) + ", the end of the file");
    }
    ByteReader rest(*this, address, m_rBytes.size(), {"file"});
    return rest.TakePart32(name);
}

} // namespace deskplayer
