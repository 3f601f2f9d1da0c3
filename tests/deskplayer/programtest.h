/**
 * @file
 * Shared by the tests of the program: sample disc, sessions, scratch folders and discs, and
 * operations on lines.
 */
#ifndef TESTS_DESKPLAYER_PROGRAMTEST_H
#define TESTS_DESKPLAYER_PROGRAMTEST_H

#include <gtest/gtest.h>

#include <cstdint>
#include <filesystem>
#include <ios>
#include <string>
#include <vector>

#include "program.h"

namespace fs = std::filesystem;

extern const std::string SampleDisc;
extern const std::string AllEvents;
extern const std::string Evening;

/** A line of a log, as the Linux port writes it. */
extern const std::string PausedLogLine;

std::vector<std::string> LinesOf(const std::string& text);

/** The last line of @p text; empty if there is none. */
std::string LastLine(const std::string& text);

/** The lines of @p text that do not contain @p pattern. */
std::string Without(const std::string& pattern, const std::string& text);

std::string ReadContents(const fs::path& path);

/** Expects a message of one line, no output, and exit status 2. */
void ExpectUsageError(const std::vector<std::string>& arguments, const std::string& message);

/** Sets a file's size without writing data, so it may exceed what a test may write. */
void ResizeSparsely(const fs::path& file, std::uintmax_t size);

/** A folder for the files of a test. */
class ScratchFolder : public testing::Test
{
protected:
    ScratchFolder();
    ~ScratchFolder() override;

    /** @return the path of the file */
    std::string WriteFile(const std::string& name, const std::string& content) const;

    const fs::path folder;
};

/** A copy of the sample disc for each test to change. */
class ScratchDisc : public ScratchFolder
{
protected:
    ScratchDisc();

    /** Overwrites bytes of the play list. */
    void Patch(std::streamoff offset, const std::string& bytes) const;

    /** Replaces the film with the trailer, shortened or extended to @p 45 kHz ticks. */
    void MakeShort(std::uint32_t ticks) const;

    /** Expects a message of one line, no output, and exit status 3. */
    void ExpectRefused(const std::string& message,
                       const std::vector<std::string>& furtherArguments = {}) const;

    const fs::path disc = folder / "disc";
    const fs::path playList = disc / "BDMV/PLAYLIST/00001.mpls";
};

#endif
