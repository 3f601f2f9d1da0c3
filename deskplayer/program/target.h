/**
 * @file
 * Where the program writes.
 */
#ifndef DESKPLAYER_PROGRAM_TARGET_H
#define DESKPLAYER_PROGRAM_TARGET_H

#include <fstream>
#include <iostream>
#include <string>

#include "program/failure.h"

namespace deskplayer
{

/** The output: a file, or standard output. */
class Target
{
public:
    /** @param fileName empty for standard output */
    explicit Target(const std::string& fileName) : m_rFileName(fileName) {}

    /** Discards the contents of an existing file, so call this only after reading all input. */
    std::ostream& Open()
    {
        if (m_rFileName.empty()) {
            return std::cout;
        }
        m_File.open(m_rFileName, std::ios::binary | std::ios::trunc);
        if (!m_File) {
            throw OutputError(m_rFileName + ": cannot be written");
        }
        return m_File;
    }

    /** Flushes the output and throws if anything could not be written. */
    void Finish()
    {
        if (m_rFileName.empty() ? !std::cout.flush() : !m_File.flush()) {
            throw OutputError((m_rFileName.empty() ? "standard output" : m_rFileName) +
                              ": could not be written");
        }
    }

private:
    const std::string& m_rFileName;
    std::ofstream m_File;
};

} // namespace deskplayer

#endif
