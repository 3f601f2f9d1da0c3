/**
 * @file
 * The errors of the disc reader.
 */
#ifndef DESKPLAYER_DISC_ERRORS_H
#define DESKPLAYER_DISC_ERRORS_H

#include <cstddef>
#include <string>

#include "deskplayer/errors.h"

namespace deskplayer
{

/** A file or folder is missing or cannot be read. */
class FileError : public DiscError
{
public:
    /**
     * @param path as it appears in the message
     * @param problem what was found at @p path, and what was expected
     */
    FileError(const std::string& path, const std::string& problem);

    /** The same, but what was found and what was expected can be told apart. */
    FileError(const std::string& path, const std::string& found, const std::string& expected);

    const std::string& Path() const { return m_Path; }
    const std::string& Found() const { return m_Found; }
    const std::string& Expected() const { return m_Expected; } ///< empty if part of Found()

private:
    std::string m_Path;
    std::string m_Found;
    std::string m_Expected;
};

/** A file does not exist. */
class MissingFileError : public FileError
{
public:
    using FileError::FileError;
};

/** The contents of a file violate the format or contradict each other. */
class FormatError : public DiscError
{
public:
    /**
     * @param fileName as it appears in the message
     * @param offset of the invalid field, in bytes from the start of the file
     * @param found what was found, such as "play item 0 has length 65535"
     * @param expected what is valid there, such as "at most 120"
     */
    FormatError(const std::string& fileName, std::size_t offset, const std::string& found,
                const std::string& expected);

    const std::string& FileName() const { return m_FileName; }
    std::size_t Offset() const { return m_Offset; }
    const std::string& Found() const { return m_Found; }
    const std::string& Expected() const { return m_Expected; }

private:
    std::string m_FileName;
    std::size_t m_Offset;
    std::string m_Found;
    std::string m_Expected;
};

} // namespace deskplayer

#endif
