/**
 * @file
 * Recordings as input of the program.
 */
#ifndef DESKPLAYER_PROGRAM_RECORDINGFILE_H
#define DESKPLAYER_PROGRAM_RECORDINGFILE_H

#include <fstream>
#include <iostream>
#include <istream>
#include <string>

#include "deskplayer/errors.h"
#include "text/printable.h"

namespace deskplayer
{

/** The name of standard input on the command line. */
constexpr const char* StandardInput = "-";

/** The name of an input as people know it. */
inline std::string InputName(const std::string& file)
{
    return file == StandardInput ? "standard input" : file;
}

/** A recording that is open: a file, or standard input. */
class RecordingFile
{
public:
    /** @throw RecordingError it cannot be opened */
    explicit RecordingFile(const std::string& file) : m_Name(InputName(file))
    {
        if (file == StandardInput) {
            return;
        }
        m_File.open(file);
        if (!m_File) {
            throw RecordingError(Printable(file) + ": cannot open recording");
        }
    }

    RecordingFile(const RecordingFile&) = delete;
    RecordingFile& operator=(const RecordingFile&) = delete;

    /** The name for people. */
    const std::string& Name() const { return m_Name; }

    std::istream& Stream() { return m_File.is_open() ? m_File : std::cin; }

private:
    const std::string m_Name;
    std::ifstream m_File;
};

} // namespace deskplayer

#endif
