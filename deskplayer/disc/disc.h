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
 * Greatest file that is read, in bytes. Metadata files are far smaller. Values take about five
 * times the memory of the bytes they were read from, those of a file made for the purpose some
 * thirty.
 */
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
 * LargestFile or cannot be read, and FormatError if its content is wrong; both are DiscErrors. The
 * copies in BDMV/BACKUP are not used: a damaged disc is reported, not papered over.
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

    /**
     * Aspect ratio of a video stream, from the clip information of the clip that carries it.
     *
     * @param playItem from 0; @p stream is one of its streams
     * @return nothing if it is not known: there is no such clip information or no such video stream
     *         in it. Clip information that is there but cannot be read is an error.
     */
    std::optional<std::uint8_t> AspectRatio(const PlayList& playList, std::size_t playItem,
                                            const Stream& stream) const;

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
    Value Read(const std::string& name, Value (*parse)(const Bytes&, const std::string&)) const;

    std::filesystem::path m_Bdmv;
};

} // namespace deskplayer

#endif
