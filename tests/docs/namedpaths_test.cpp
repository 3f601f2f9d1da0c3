// The files and folders that documents name exist.

#include <gtest/gtest.h>

#include <filesystem>
#include <ostream>
#include <regex>
#include <set>
#include <string>
#include <vector>

#include "docs/markdown.h"

namespace
{

namespace fs = std::filesystem;

const fs::path Root = BDMVNAVIGATOR_SOURCE_DIR;

/** Whether a word has a folder or an extension that this project uses. */
bool LooksLikeAPath(const std::string& word)
{
    static const std::regex path("[\\w.][\\w.+-]*/[\\w./+-]*"
                                 "|[\\w-]+\\.(c|cmake|cpp|h|json|md|py|session|txt)");
    return std::regex_match(word, path);
}

/** Whether a path is below the folder of the builds, which a checkout does not have. */
bool IsBuilt(const std::string& path)
{
    return StartsWith(path, "build/");
}

/** The words of code in a line: those in its code spans, or all if it is within a code block. */
std::vector<std::string> CodeWords(const std::string& line, bool inBlock)
{
    std::vector<std::string> words;
    for (const std::string& code : inBlock ? std::vector<std::string>{line} : CodeSpans(line)) {
        for (const std::string& word : AllMatches(code, "([^\\s,;:]+)")) {
            words.push_back(word);
        }
    }
    return words;
}

/** The paths that a document names in its code, as it writes them. */
std::set<std::string> PathsInCode(const std::string& document)
{
    std::set<std::string> paths;
    bool inBlock = false;
    for (const Chapter& chapter : ReadMarkdown(Root / document)) {
        for (const std::string& line : chapter.lines) {
            if (StartsWith(line, "```")) {
                inBlock = !inBlock;
                continue;
            }
            for (const std::string& word : CodeWords(line, inBlock)) {
                if (LooksLikeAPath(word) && !IsBuilt(word)) {
                    paths.insert(word);
                }
            }
        }
    }
    return paths;
}

/** The targets of its links that are files, as it writes them. */
std::set<std::string> LinkedFiles(const std::string& document)
{
    std::set<std::string> files;
    for (const std::string& target : LinkTargets(ReadFile(Root / document))) {
        if (!StartsWith(target, "https:")) {
            files.insert(target);
        }
    }
    return files;
}

bool IsSource(const fs::path& file)
{
    return file.extension() == ".h" || file.extension() == ".cpp" || file.extension() == ".c";
}

/** The folders below @p top that directly contain headers or sources, each with a slash at its end.
 */
std::set<std::string> FoldersOfSources(const std::string& top)
{
    std::set<std::string> folders;
    for (const fs::directory_entry& entry : fs::recursive_directory_iterator(Root / top)) {
        if (IsSource(entry.path())) {
            folders.insert(entry.path().parent_path().lexically_relative(Root).string() + "/");
        }
    }
    return folders;
}

/** A document, and how many paths it names at least: it must not pass because none are found. */
struct Document {
    std::string name;
    std::size_t fewestPaths;
    std::size_t fewestLinks;
};

void PrintTo(const Document& document, std::ostream* stream)
{
    *stream << document.name;
}

class NamedPaths : public testing::TestWithParam<Document>
{
public:
    static std::string Name(const testing::TestParamInfo<Document>& info)
    {
        return fs::path(info.param.name).stem().string();
    }
};

} // namespace

TEST_P(NamedPaths, InCodeExist)
{
    for (const std::string& path : PathsInCode(GetParam().name)) {
        EXPECT_TRUE(fs::exists(Root / path)) << path;
    }
}

TEST_P(NamedPaths, InCodeAreMany)
{
    EXPECT_GE(PathsInCode(GetParam().name).size(), GetParam().fewestPaths);
}

TEST_P(NamedPaths, InLinksExist)
{
    const fs::path folder = (Root / GetParam().name).parent_path();
    for (const std::string& target : LinkedFiles(GetParam().name)) {
        EXPECT_TRUE(fs::exists(folder / target)) << target;
    }
}

TEST_P(NamedPaths, InLinksAreMany)
{
    EXPECT_GE(LinkedFiles(GetParam().name).size(), GetParam().fewestLinks);
}

INSTANTIATE_TEST_SUITE_P(Documents, NamedPaths,
                         testing::Values(Document{"docs/architecture.md", 60, 3},
                                         Document{"CONTRIBUTING.md", 20, 2}),
                         NamedPaths::Name);

TEST(Architecture, NamesEveryFolderOfSources)
{
    const std::set<std::string> named = PathsInCode("docs/architecture.md");
    for (const char* const top : {"inc", "bdmv", "prv_inc", "bd", "kits", "ports", "deskplayer"}) {
        for (const std::string& folder : FoldersOfSources(top)) {
            EXPECT_EQ(named.count(folder), 1U) << folder;
        }
    }
}
