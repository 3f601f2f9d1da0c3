/**
 * @file
 * A disc of its own for every test, a copy of one of tests/discs, to be changed.
 */
#ifndef TESTS_DESKPLAYER_LISTING_SCRATCHDISC_H
#define TESTS_DESKPLAYER_LISTING_SCRATCHDISC_H

#include <filesystem>
#include <string>

#include "disc/disc.h"

namespace deskplayer
{

/** Lies in the folder for temporary files, and leaves nothing there. */
class ScratchDisc
{
public:
    /** @param original name of a disc in tests/discs */
    explicit ScratchDisc(const std::string& original);
    ~ScratchDisc();
    ScratchDisc(const ScratchDisc&) = delete;
    ScratchDisc& operator=(const ScratchDisc&) = delete;

    /** Replaces or adds a file, "PLAYLIST/00000.mpls". */
    void Write(const std::string& name, const Bytes& content) const;

    void Remove(const std::string& name) const;

    Disc Read() const { return Disc(m_Folder); }

private:
    std::filesystem::path m_Folder;
};

} // namespace deskplayer

#endif
