/**
 * @file
 * Finds the files of a disc, whatever the case of their names.
 */
#ifndef DESKPLAYER_DISC_DISCFOLDER_H
#define DESKPLAYER_DISC_DISCFOLDER_H

#include <filesystem>
#include <map>
#include <string>
#include <vector>

namespace deskplayer
{

/**
 * A BDMV folder. Some discs and file systems show folders in lower case and extensions in upper
 * case, so names are compared without regard to the case of ASCII letters. A file with the exact
 * name is preferred.
 *
 * Folders are listed at most once, and only if a name is not found as it is.
 */
class DiscFolder
{
public:
    /**
     * @param folder a BDMV folder or its parent
     * @throw FileError @p folder is neither
     */
    explicit DiscFolder(const std::filesystem::path& folder);

    /**
     * The path of a file or folder.
     *
     * @param name such as "PLAYLIST/00001.mpls"
     * @return the path that has exactly this name if there is no match
     */
    std::filesystem::path PathOf(const std::string& name);

    /** The path of a file for messages: relative to the parent of the BDMV folder. */
    std::string DisplayNameOf(const std::filesystem::path& path) const;

    /**
     * Names of the entries of a folder, with upper-case letters replaced by lower-case ones.
     *
     * @param name such as "PLAYLIST"
     * @param expected for messages
     * @throw FileError the folder cannot be read
     */
    std::vector<std::string> LowerCaseNamesIn(const std::string& name, const std::string& expected);

private:
    /** Actual names by their lower-case form. */
    using Names = std::map<std::string, std::string>;

    std::filesystem::path Find(const std::filesystem::path& folder, const std::string& name);

    std::map<std::filesystem::path, Names> m_Listings; ///< before m_Bdmv, whose search uses it
    std::filesystem::path m_Bdmv;
};

} // namespace deskplayer

#endif
