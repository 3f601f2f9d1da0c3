#include "disc/errors.h"

#include "text/printable.h"

namespace deskplayer
{

FileError::FileError(const std::string& path, const std::string& problem)
    : DiscError(Printable(path) + ": " + problem), m_Path(path), m_Found(problem)
{
}

FileError::FileError(const std::string& path, const std::string& found, const std::string& expected)
    : DiscError(Printable(path) + ": " + found + (found.empty() ? "" : ", ") + "expected " +
                expected),
      m_Path(path), m_Found(found), m_Expected(expected)
{
}

FormatError::FormatError(const std::string& fileName, std::size_t offset, const std::string& found,
                         const std::string& expected)
    : DiscError(Printable(fileName) + ": offset " + std::to_string(offset) + ": " + found +
                ", but expected " + expected),
      m_FileName(fileName), m_Offset(offset), m_Found(found), m_Expected(expected)
{
}

} // namespace deskplayer
