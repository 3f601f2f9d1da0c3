/**
 * @file
 * The discs that the tests read: those in tests/discs, and those in the folder named by the
 * environment variable BDMVNAVIGATOR_DISCS, if it is set.
 */
#ifndef TESTS_DESKPLAYER_DISC_TESTDISCS_H
#define TESTS_DESKPLAYER_DISC_TESTDISCS_H

#include <filesystem>
#include <string>
#include <vector>

#include "disc/bytereader.h"

namespace deskplayer
{

/** Folders of the discs in tests/discs, each with BDMV and expected.json. */
std::vector<std::filesystem::path> TestDiscs();

/** Folders of the discs in the folder named by BDMVNAVIGATOR_DISCS; none if it is not set. */
std::vector<std::filesystem::path> FurtherDiscs();

/** The folder of the disc @p name of tests/discs. */
std::filesystem::path TestDisc(const std::string& name);

/** All files with @p extension in @p folder and below, in order. */
std::vector<std::filesystem::path> FilesBelow(const std::filesystem::path& folder,
                                              const std::string& extension);

Bytes ReadContents(const std::filesystem::path& path);

/** Creates or replaces the file. */
void WriteBytes(const std::filesystem::path& path, const Bytes& bytes);

} // namespace deskplayer

#endif
