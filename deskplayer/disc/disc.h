/**
 * @file
 * The metadata files of a disc in a folder.
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
#include <set>
#include <string>
#include <vector>

#include "disc/clipinfo.h"
#include "disc/discfolder.h"
#include "disc/errors.h"
#include "disc/index.h"
#include "disc/movieobject.h"
#include "disc/playlist.h"

namespace deskplayer
{

/**
 * Maximum size of a play list file, in bytes; real ones are a tenth of that. The values read from a
 * malicious one take almost forty times its size in memory.
 */
constexpr std::uintmax_t LargestPlayListFile = std::uintmax_t{1024} * 1024;

/** Maximum size in bytes of any other file, whose values take less memory. */
constexpr std::uintmax_t LargestFile = std::uintmax_t{4} * 1024 * 1024;

/** The longest play list of a disc, most likely the main movie. */
struct LongestPlayList {
    std::uint32_t number = 0;
    PlayList playList;
    std::vector<std::string> skipped; ///< one message for each play list that was skipped
};

/** Whether the copies in BDMV/BACKUP replace files that are missing or damaged. */
enum class BackupCopies { Use, Ignore };

/**
 * Reads the files of one disc, whatever the case of their names. Only the path of the folder and
 * the names of its files are stored. Not for use by several threads at a time.
 *
 * All operations throw MissingFileError if a file is missing, FileError if it is not a regular
 * file, is larger than LargestPlayListFile or LargestFile or cannot be read, and FormatError if its
 * contents are malformed; both are DiscErrors.
 * If a file is missing or damaged, the copy in BDMV/BACKUP is read instead, if that is possible.
 */
class Disc
{
public:
    /**
     * @param folder a BDMV folder or its parent
     * @param onBackupCopy receives the reason, once for each file, why its copy is used
     * @throw FileError @p folder is neither
     */
    explicit Disc(const std::filesystem::path& folder,
                  BackupCopies backupCopies = BackupCopies::Use, MessageHandler onBackupCopy = {});

    /** Numbers of the files PLAYLIST/nnnnn.mpls and of their copies, in ascending order. */
    std::vector<std::uint32_t> PlayListNumbers() const;

    /** Names of the clips CLIPINF/nnnnn.clpi, in ascending order. Copies are not included. */
    std::vector<std::string> ClipNames() const;

    PlayList ReadPlayList(std::uint32_t number) const;

    /** @param clip five digits, as in ClipReference::name */
    ClipInfo ReadClipInfo(const std::string& clip) const;

    Index ReadIndex() const;
    MovieObjects ReadMovieObjects() const;

    /**
     * Reads all play lists and chooses the longest; among equals, the one with the lowest number.
     * Those that cannot be read or last longer than LongestDuration are skipped and reported in
     * the result.
     *
     * @throw FileError there are no play lists, or none can be played
     */
    LongestPlayList FindLongestPlayList() const;

private:
    template <typename Value>
    Value Read(const std::string& name, std::uintmax_t largest,
               Value (*parse)(const Bytes&, const std::string&)) const;

    mutable DiscFolder m_Folder; ///< caches listings
    BackupCopies m_BackupCopies;
    MessageHandler m_OnBackupCopy;
    mutable std::set<std::string> m_Reported; ///< names of files whose copies were used
};

} // namespace deskplayer

#endif
