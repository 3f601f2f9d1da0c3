/**
 * @file
 * The discs the tests read: those in tests/discs, and those in the folder that the environment
 * variable BDMVNAVIGATOR_DISCS names, if it does.
 */
#ifndef TESTS_DESKPLAYER_DISC_TESTDISCS_H
#define TESTS_DESKPLAYER_DISC_TESTDISCS_H

#include <filesystem>
#include <string>
#include <vector>

#include "disc/bytereader.h"

namespace deskplayer
{

/** Folders of the discs in tests/discs, each with BDMV and expected.json in it. */
std::vector<std::filesystem::path> TestDiscs();

/** Folders of the discs in the folder that BDMVNAVIGATOR_DISCS names; none if it is not set. */
std::vector<std::filesystem::path> FurtherDiscs();

/** The folder of the disc @p name of tests/discs. */
std::filesystem::path TestDisc(const std::string& name);

/** All files with @p extension in @p folder and below, in order. */
std::vector<std::filesystem::path> FilesBelow(const std::filesystem::path& folder,
                                              const std::string& extension);

Bytes ContentOf(const std::filesystem::path& path);

/** Makes the file, or writes it anew. */
void WriteBytes(const std::filesystem::path& path, const Bytes& bytes);

} // namespace deskplayer

#endif
