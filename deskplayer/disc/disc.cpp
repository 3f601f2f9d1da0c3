#include "disc/disc.h"

#include <algorithm>
#include <cerrno>
#include <fstream>
#include <set>
#include <system_error>
#include <utility>

#include "disc/timeline.h"
#include "text/printable.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

namespace fs = std::filesystem;

const std::string BackupFolder = "BACKUP/";

Bytes ReadFile(const fs::path& path, std::uintmax_t largest)
{
    std::error_code error;
    const fs::file_status status = fs::status(path, error);
    if (status.type() == fs::file_type::not_found) {
        throw MissingFileError(path.string(), error.message(), "a file");
    }
    if (error) {
        throw FileError(path.string(), error.message(), "a file");
    }
    if (!fs::is_regular_file(status)) {
        throw FileError(path.string(), "", "a regular file");
    }
    const std::uintmax_t size = fs::file_size(path, error); // the maximum value on failure
    if (size > largest) {
        throw FileError(path.string(), "has " + std::to_string(size) + " bytes",
                        "at most " + std::to_string(largest));
    }

    Bytes bytes(static_cast<std::size_t>(size));
    errno = 0;
    std::ifstream stream(path, std::ios::binary);
    stream.read(reinterpret_cast<char*>(bytes.data()), static_cast<std::streamsize>(size));
    if (!stream) {
        throw FileError(path.string(), "cannot be read: " + std::generic_category().message(errno),
                        std::to_string(size) + " bytes");
    }
    return bytes;
}

/** The number in the lower-case name of a play list file; nothing if the name is not one of a play
 * list. */
std::optional<std::uint32_t> NumberInName(const std::string& fileName, const char* extension)
{
    if (fileName.size() != 10 || fileName.substr(5) != extension ||
        fileName.find_first_not_of("0123456789") != 5) {
        return std::nullopt;
    }
    return static_cast<std::uint32_t>(std::stoul(fileName.substr(0, 5)));
}

std::string PlayListFileName(std::uint32_t number)
{
    std::string digits = std::to_string(number);
    digits.insert(0, 5 - std::min<std::size_t>(5, digits.size()), '0');
    return "PLAYLIST/" + digits + ".mpls";
}

std::string ClipInfoFileName(const std::string& clip)
{
    return "CLIPINF/" + clip + ".clpi";
}

} // namespace

Disc::Disc(const fs::path& folder, BackupCopies backupCopies, MessageHandler onBackupCopy)
    : m_Folder(folder), m_BackupCopies(backupCopies), m_OnBackupCopy(std::move(onBackupCopy))
{
}

std::vector<std::uint32_t> Disc::PlayListNumbers() const
{
    std::set<std::uint32_t> numbers;
    const auto addFrom = [&](const std::string& folder) {
        for (const std::string& name :
             m_Folder.LowerCaseNamesIn(folder, "a folder of play lists")) {
            if (const auto number = NumberInName(name, ".mpls")) {
                numbers.insert(*number);
            }
        }
    };
    if (m_BackupCopies == BackupCopies::Use) {
        try {
            addFrom(BackupFolder + "PLAYLIST");
        } catch (const FileError&) {
            // Most discs in a folder have no backup copies.
        }
    }
    try {
        addFrom("PLAYLIST");
    } catch (const FileError&) {
        if (numbers.empty()) {
            throw;
        }
    }
    return std::vector<std::uint32_t>(numbers.begin(), numbers.end());
}

template <typename Value>
Value Disc::Read(const std::string& name, std::uintmax_t largest,
                 Value (*parse)(const Bytes&, const std::string&)) const
{
    const auto read = [&](const fs::path& path) {
        return parse(ReadFile(path, largest), m_Folder.DisplayNameOf(path));
    };
    try {
        return read(m_Folder.PathOf(name));
    } catch (const DiscError& error) {
        if (m_BackupCopies == BackupCopies::Ignore) {
            throw;
        }
        const fs::path copy = m_Folder.PathOf(BackupFolder + name);
        std::optional<Value> value;
        try {
            value = read(copy);
        } catch (const DiscError&) {
            // The message about the file itself is the one that helps.
        }
        if (!value) {
            throw;
        }
        if (m_OnBackupCopy && m_Reported.insert(name).second) {
            m_OnBackupCopy(std::string(error.what()) + "; using the copy " +
                           Printable(m_Folder.DisplayNameOf(copy)));
        }
        return std::move(*value);
    }
}

std::vector<std::string> Disc::ClipNames() const
{
    std::vector<std::string> clips;
    for (const std::string& name : m_Folder.LowerCaseNamesIn("CLIPINF", "a folder of clips")) {
        if (NumberInName(name, ".clpi")) {
            clips.push_back(name.substr(0, 5));
        }
    }
    return clips;
}

PlayList Disc::ReadPlayList(std::uint32_t number) const
{
    return Read(PlayListFileName(number), LargestPlayListFile, ParsePlayList);
}

ClipInfo Disc::ReadClipInfo(const std::string& clip) const
{
    return Read(ClipInfoFileName(clip), LargestFile, ParseClipInfo);
}

Index Disc::ReadIndex() const
{
    return Read("index.bdmv", LargestFile, ParseIndex);
}

MovieObjects Disc::ReadMovieObjects() const
{
    return Read("MovieObject.bdmv", LargestFile, ParseMovieObjects);
}

LongestPlayList Disc::FindLongestPlayList() const
{
    std::optional<std::uint32_t> longest;
    Ticks greatestDuration(0);
    std::vector<std::string> skipped;
    for (const std::uint32_t number : PlayListNumbers()) {
        try {
            const Ticks duration = BuildTimeLine(ReadPlayList(number)).duration;
            if (duration > LongestDuration) {
                skipped.push_back("BDMV/" + PlayListFileName(number) + ": lasts " +
                                  TimeText(duration) + ", expected at most " +
                                  TimeText(LongestDuration));
            } else if (!longest || duration > greatestDuration) {
                longest = number;
                greatestDuration = duration;
            }
        } catch (const DiscError& error) {
            skipped.emplace_back(error.what());
        }
    }
    if (!longest) {
        throw FileError(m_Folder.PathOf("PLAYLIST").string(),
                        skipped.empty() ? "no play list, expected files such as 00000.mpls"
                                        : "no play list can be played: " + skipped.front());
    }
    // Read again rather than kept: keeping it would double the peak memory.
    return {*longest, ReadPlayList(*longest), std::move(skipped)};
}

} // namespace deskplayer
