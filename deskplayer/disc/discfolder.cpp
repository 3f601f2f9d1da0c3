#include "disc/discfolder.h"

#include <system_error>

#include "disc/errors.h"

namespace deskplayer
{

namespace
{

namespace fs = std::filesystem;

bool Exists(const fs::path& path)
{
    std::error_code error;
    return fs::status(path, error).type() != fs::file_type::not_found;
}

bool IsFolder(const fs::path& path)
{
    std::error_code error;
    return fs::is_directory(path, error);
}

/** Converts ASCII letters only: tolower() would depend on the locale. */
std::string LowerCase(std::string text)
{
    for (char& character : text) {
        if (character >= 'A' && character <= 'Z') {
            character = static_cast<char>(character - 'A' + 'a');
        }
    }
    return text;
}

/** Among names that differ only in case, the first in ASCII order is kept. */
std::map<std::string, std::string> List(const fs::path& folder, std::error_code& error)
{
    std::map<std::string, std::string> names;
    for (fs::directory_iterator entry(folder, error), end; !error && entry != end;
         entry.increment(error)) {
        const std::string name = entry->path().filename().string();
        const auto [known, isNew] = names.try_emplace(LowerCase(name), name);
        if (!isNew && name < known->second) {
            known->second = name;
        }
    }
    return names;
}

} // namespace

DiscFolder::DiscFolder(const fs::path& folder) : m_Bdmv(Find(folder, "BDMV"))
{
    if (IsFolder(m_Bdmv)) {
        return;
    }
    if (!IsFolder(Find(folder, "PLAYLIST"))) {
        throw FileError(folder.string(), "not a disc, expected a BDMV folder or its parent");
    }
    m_Bdmv = folder;
}

fs::path DiscFolder::PathOf(const std::string& name)
{
    fs::path path = m_Bdmv;
    for (const fs::path& part : fs::path(name)) {
        path = Find(path, part.string());
    }
    return path;
}

std::string DiscFolder::DisplayNameOf(const fs::path& path) const
{
    return "BDMV/" + path.lexically_relative(m_Bdmv).string();
}

std::vector<std::string> DiscFolder::LowerCaseNamesIn(const std::string& name,
                                                      const std::string& expected)
{
    const fs::path folder = PathOf(name);
    std::error_code error;
    std::vector<std::string> names;
    for (const auto& entry : List(folder, error)) {
        names.push_back(entry.first);
    }
    if (error) {
        throw FileError(folder.string(), error.message(), expected);
    }
    return names;
}

fs::path DiscFolder::Find(const fs::path& folder, const std::string& name)
{
    if (Exists(folder / name)) {
        return folder / name;
    }
    auto listing = m_Listings.find(folder);
    if (listing == m_Listings.end()) {
        std::error_code error; // a folder that cannot be listed has no other names to offer
        listing = m_Listings.emplace(folder, List(folder, error)).first;
    }
    const auto match = listing->second.find(LowerCase(name));
    return folder / (match == listing->second.end() ? name : match->second);
}

} // namespace deskplayer
