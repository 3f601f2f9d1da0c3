#include "disc/errors.h"

namespace deskplayer
{

FileError::FileError(const std::string& path, const std::string& problem)
    : DiscError(Printable(path) + ": " + problem)
{
}

FormatError::FormatError(const std::string& fileName, std::size_t offset, const std::string& found,
                         const std::string& expected)
    : DiscError(Printable(fileName) + ": offset " + std::to_string(offset) + ": " + found +
                ", but expected " + expected),
      m_FileName(fileName), m_Offset(offset), m_Found(found), m_Expected(expected)
{
}

std::string Printable(const std::string& text)
{
    static const char digits[] = "0123456789ABCDEF";
    std::string printable;
    for (const char character : text) {
        const auto byte = static_cast<unsigned char>(character);
        if (byte >= 0x20 && byte < 0x7F && character != '\\') {
            printable += character;
        } else {
            printable += {'\\', 'x', digits[byte >> 4], digits[byte & 0xF]};
        }
    }
    return printable;
}

} // namespace deskplayer
