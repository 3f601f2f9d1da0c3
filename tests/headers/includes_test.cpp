// Which file includes which: the library needs only itself, the standard libraries of C and C++ and
// the operating system's threads, every folder uses only the folders below it, and no files or
// folders include each other in a cycle.

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <map>
#include <regex>
#include <set>
#include <string>
#include <vector>

namespace
{

namespace fs = std::filesystem;

const fs::path Root = BDMVNAVIGATOR_SOURCE_DIR;
const std::vector<std::string> IncludeRoots = {
    "inc",        "bdmv/inc",    "bdmv",          "prv_inc", "kits", "deskplayer/inc",
    "deskplayer", "ports/linux", "measure/bench", "tests"};

/** An #include line of a file. */
struct Include {
    std::string file; ///< relative to the root of the sources
    std::string name; ///< with its quotes or angle brackets

    bool IsQuoted() const { return name.front() == '"'; }
    std::string Path() const { return name.substr(1, name.size() - 2); }

    /** The included file, relative to the root of the sources; empty if it is not one of them. */
    std::string Target() const
    {
        std::vector<std::string> folders = {fs::path(file).parent_path()};
        folders.insert(folders.end(), IncludeRoots.begin(), IncludeRoots.end());
        for (const std::string& folder : folders) {
            if (fs::is_regular_file(Root / folder / Path())) {
                return (fs::path(folder) / Path()).lexically_normal();
            }
        }
        return "";
    }
};

/** Every #include of the headers and sources below the folders, which must contain some. */
std::vector<Include> IncludesBelow(const std::vector<std::string>& folders)
{
    static const std::regex directive("^\\s*#\\s*include\\s*([\"<][^\">]+[\">])");
    std::vector<Include> includes;
    for (const std::string& folder : folders) {
        for (const fs::directory_entry& entry : fs::recursive_directory_iterator(Root / folder)) {
            static const std::set<fs::path> extensions = {".h", ".cpp", ".c"};
            if (extensions.count(entry.path().extension()) == 0) {
                continue;
            }
            std::ifstream file(entry.path());
            std::smatch match;
            for (std::string line; std::getline(file, line);) {
                if (std::regex_search(line, match, directive)) {
                    includes.push_back({entry.path().lexically_relative(Root), match[1]});
                }
            }
        }
    }
    EXPECT_FALSE(includes.empty());
    return includes;
}

bool IsBelow(const std::string& path, const std::vector<std::string>& folders)
{
    return std::any_of(folders.begin(), folders.end(), [&path](const std::string& folder) {
        return path.compare(0, folder.size() + 1, folder + "/") == 0;
    });
}

const std::set<std::string> SystemHeaders = {
    // C
    "assert.h", "ctype.h", "errno.h", "fenv.h", "float.h", "inttypes.h", "limits.h", "locale.h",
    "math.h", "setjmp.h", "signal.h", "stdarg.h", "stdbool.h", "stddef.h", "stdint.h", "stdio.h",
    "stdlib.h", "string.h", "time.h", "wchar.h", "wctype.h",
    // C++11
    "algorithm", "array", "atomic", "bitset", "cassert", "ccomplex", "cctype", "cerrno", "cfenv",
    "cfloat", "chrono", "cinttypes", "ciso646", "climits", "clocale", "cmath", "codecvt", "complex",
    "condition_variable", "csetjmp", "csignal", "cstdalign", "cstdarg", "cstdbool", "cstddef",
    "cstdint", "cstdio", "cstdlib", "cstring", "ctgmath", "ctime", "cuchar", "cwchar", "cwctype",
    "deque", "exception", "forward_list", "fstream", "functional", "future", "initializer_list",
    "iomanip", "ios", "iosfwd", "iostream", "istream", "iterator", "limits", "list", "locale",
    "map", "memory", "mutex", "new", "numeric", "ostream", "queue", "random", "ratio", "regex",
    "scoped_allocator", "set", "sstream", "stack", "stdexcept", "streambuf", "string", "strstream",
    "system_error", "thread", "tuple", "type_traits", "typeindex", "typeinfo", "unordered_map",
    "unordered_set", "utility", "valarray", "vector",
    // the operating system's threads
    "pthread.h"};

} // namespace

TEST(Includes, OfTheLibraryAreItsOwnStandardOrForThreads)
{
    for (const Include& include : IncludesBelow({"inc", "bdmv", "prv_inc", "bd"})) {
        const bool known = include.IsQuoted()
                               ? IsBelow(include.Target(), {"inc", "bdmv", "prv_inc"})
                               : SystemHeaders.count(include.Path()) != 0;
        EXPECT_TRUE(known) << include.file << " includes " << include.name;
    }
}

namespace
{

const std::vector<std::string> Library = {"inc", "bdmv", "prv_inc", "bd"};
const std::vector<std::string> AllFolders = {"inc",  "bdmv",       "prv_inc",  "bd",      "ports",
                                             "kits", "deskplayer", "examples", "measure", "tests"};

std::vector<std::string> operator+(std::vector<std::string> left,
                                   const std::vector<std::string>& right)
{
    left.insert(left.end(), right.begin(), right.end());
    return left;
}

/** What each folder may include besides its own files; a folder without a row has its parent's. */
const std::map<std::string, std::vector<std::string>> Allowed = {
    {"prv_inc", {}},
    {"inc", {"prv_inc"}},
    {"bd", {"inc", "prv_inc"}},
    {"bdmv/inc", {"inc", "prv_inc"}},
    {"bdmv", {"bdmv/inc", "inc", "prv_inc"}},
    {"ports", {"bdmv/inc", "inc", "prv_inc"}},
    {"kits/navigatorkit", Library},
    {"kits/clientkit", Library},
    {"kits/testkit", Library + std::vector<std::string>{"kits/clientkit"}},
    {"deskplayer/inc", Library},
    {"deskplayer/text", Library + std::vector<std::string>{"kits/clientkit", "deskplayer/inc"}},
    {"deskplayer/disc", {"deskplayer/inc", "deskplayer/text"}},
    {"deskplayer/navigator",
     Library + std::vector<std::string>{"kits/navigatorkit", "deskplayer/inc", "deskplayer/disc",
                                        "deskplayer/text"}},
    {"deskplayer/session", {"deskplayer/inc", "deskplayer/navigator", "deskplayer/text"}},
    {"deskplayer/check", {"deskplayer/disc", "deskplayer/text"}},
    {"deskplayer/listing", {"deskplayer/inc", "deskplayer/disc", "deskplayer/text"}},
    {"deskplayer/output",
     Library + std::vector<std::string>{"kits/clientkit", "deskplayer/inc", "deskplayer/navigator",
                                        "deskplayer/text"}},
    {"deskplayer/fieldlog",
     Library + std::vector<std::string>{"kits/clientkit", "deskplayer/inc", "deskplayer/output",
                                        "deskplayer/text"}},
    {"deskplayer/recording",
     Library + std::vector<std::string>{"kits/clientkit", "deskplayer/inc", "deskplayer/navigator",
                                        "deskplayer/output", "deskplayer/text"}},
    {"deskplayer/summary",
     Library + std::vector<std::string>{"kits/clientkit", "deskplayer/inc", "deskplayer/output",
                                        "deskplayer/text"}},
    {"deskplayer/facade",
     Library + std::vector<std::string>{"deskplayer/inc", "deskplayer/disc", "deskplayer/navigator",
                                        "deskplayer/output", "deskplayer/recording",
                                        "deskplayer/session", "deskplayer/text"}},
    {"deskplayer", Library + std::vector<std::string>{"kits/clientkit", "ports"}},
    {"examples", Library + std::vector<std::string>{"deskplayer/inc", "kits"}},
    {"measure", AllFolders},
    {"tests", AllFolders}};

/** The row of Allowed for a file. */
std::string RowOf(const std::string& file)
{
    fs::path folder = fs::path(file).parent_path();
    while (!folder.empty() && Allowed.count(folder) == 0) {
        folder = folder.parent_path();
    }
    return folder;
}

typedef std::map<std::string, std::set<std::string>> Graph;

/** Maps every file, or every folder, to the others that it includes. */
Graph IncludeGraph(std::string (*nodeOf)(const std::string& file))
{
    Graph graph;
    for (const Include& include : IncludesBelow(AllFolders)) {
        const std::string target = include.IsQuoted() ? include.Target() : "";
        if (!target.empty() && nodeOf(include.file) != nodeOf(target)) {
            graph[nodeOf(include.file)].insert(nodeOf(target));
        }
    }
    return graph;
}

/** Removes nodes that include none of the remaining ones: those left are on a cycle or lead to one.
 */
Graph WithoutEnds(Graph graph)
{
    for (bool changed = true; changed;) {
        changed = false;
        for (auto node = graph.begin(); node != graph.end();) {
            const bool isEnd =
                std::none_of(node->second.begin(), node->second.end(),
                             [&graph](const std::string& to) { return graph.count(to) != 0; });
            node = isEnd ? graph.erase(node) : std::next(node);
            changed |= isEnd;
        }
    }
    return graph;
}

std::string NamesIn(const Graph& graph)
{
    std::string names;
    for (const auto& node : graph) {
        names += node.first + "\n";
    }
    return names;
}

std::string FileItself(const std::string& file)
{
    return file;
}

std::string FolderOf(const std::string& file)
{
    return fs::path(file).parent_path();
}

} // namespace

TEST(Includes, LeadOnlyToFoldersBelow)
{
    for (const Include& include : IncludesBelow(AllFolders)) {
        const std::string target = include.IsQuoted() ? include.Target() : "";
        if (target.empty()) {
            continue;
        }
        const std::string row = RowOf(include.file);
        ASSERT_NE(row, "") << include.file << " is in a folder without a rule";
        EXPECT_TRUE(IsBelow(target, {row}) || IsBelow(target, Allowed.at(row)))
            << include.file << " includes " << include.name;
    }
}

TEST(Includes, OfFilesFormNoCycle)
{
    EXPECT_EQ(NamesIn(WithoutEnds(IncludeGraph(FileItself))), "");
}

TEST(Includes, OfFoldersFormNoCycle)
{
    EXPECT_EQ(NamesIn(WithoutEnds(IncludeGraph(FolderOf))), "");
}
