/**
 * @file
 * A copy of a disc in tests/discs that a test can change.
 */
#ifndef TESTS_DESKPLAYER_LISTING_SCRATCHDISC_H
#define TESTS_DESKPLAYER_LISTING_SCRATCHDISC_H

#include <filesystem>
#include <string>

#include "disc/disc.h"

namespace deskplayer
{

/** A temporary folder, deleted by the destructor. */
class ScratchDisc
{
public:
    /** @param original name of a disc in tests/discs */
    explicit ScratchDisc(const std::string& original);
    ~ScratchDisc();
    ScratchDisc(const ScratchDisc&) = delete;
    ScratchDisc& operator=(const ScratchDisc&) = delete;

    /** Replaces or adds a file, such as "PLAYLIST/00000.mpls". */
    void Write(const std::string& name, const Bytes& content) const;

    void Remove(const std::string& name) const;

    Disc Read() const { return Disc(m_Folder); }

private:
    std::filesystem::path m_Folder;
};

} // namespace deskplayer

#endif
