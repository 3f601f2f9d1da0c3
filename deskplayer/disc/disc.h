/**
 * @file
 * The metadata files of a disc that lies in a folder.
 *
 * @code
 * const Disc disc("/media/disc");
 * const PlayList playList = disc.ReadPlayList(800); // BDMV/PLAYLIST/00800.mpls
 * @endcode
 */
#ifndef DESKPLAYER_DISC_DISC_H
#define DESKPLAYER_DISC_DISC_H

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <vector>

#include "disc/clipinfo.h"
#include "disc/errors.h"
#include "disc/index.h"
#include "disc/movieobject.h"
#include "disc/playlist.h"

namespace deskplayer
{

/**
 * Greatest play list that is read, in bytes; real ones have a tenth of that. The values of one that
 * was made for the purpose take almost forty times the memory of its bytes.
 */
constexpr std::uintmax_t LargestPlayListFile = std::uintmax_t{1024} * 1024;

/** The same of any other file, whose values do not grow as much. */
constexpr std::uintmax_t LargestFile = std::uintmax_t{4} * 1024 * 1024;

/** The play list of a disc that plays longest, most likely the main movie. */
struct LongestPlayList {
    std::uint32_t number = 0;
    PlayList playList;
    std::vector<std::string> unreadable; ///< one line for each play list that was left out
};

/**
 * Reads the files of one disc, each time anew. Holds nothing but the path of the folder.
 *
 * All operations throw FileError if a file is missing, is not a regular file, is larger than
 * LargestPlayListFile or LargestFile or cannot be read, and FormatError if its content is wrong;
 * both are DiscErrors. The copies in BDMV/BACKUP are not used: a damaged disc is reported, not
 * papered over.
 */
class Disc
{
public:
    /**
     * @param folder holds the folder BDMV, or is that folder
     * @throw FileError neither is so
     */
    explicit Disc(const std::filesystem::path& folder);

    /** Numbers of the files PLAYLIST/nnnnn.mpls, in ascending order. */
    std::vector<std::uint32_t> PlayListNumbers() const;

    PlayList ReadPlayList(std::uint32_t number) const;

    /** @param clip five digits, as in ClipReference::name */
    ClipInfo ReadClipInfo(const std::string& clip) const;

    Index ReadIndex() const;
    MovieObjects ReadMovieObjects() const;

    /** Whether there is clip information, be it readable or not. */
    bool HasClipInfo(const std::string& clip) const;

    /**
     * Reads all play lists and chooses the longest, of several the one with the lowest number.
     *
     * Those that cannot be read are left out, and said to be in the result.
     *
     * @throw FileError there is no play list, or none that can be read
     */
    LongestPlayList FindLongestPlayList() const;

private:
    template <typename Value>
    Value Read(const std::string& name, std::uintmax_t largest,
               Value (*parse)(const Bytes&, const std::string&)) const;

    std::filesystem::path m_Bdmv;
};

} // namespace deskplayer

#endif
