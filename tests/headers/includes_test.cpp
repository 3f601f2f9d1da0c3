// The direction of includes: the library needs nothing but itself, the standard libraries of C and
// C++ and the operating system's threads, and a layer includes only lower layers.

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <regex>
#include <set>
#include <string>
#include <vector>

namespace
{

namespace fs = std::filesystem;

const fs::path Root = BDMVNAVIGATOR_SOURCE_DIR;
const std::vector<std::string> IncludeRoots = {"inc", "bdmv/inc", "bdmv", "prv_inc"};

/** An #include line of a file. */
struct Include {
    std::string file; ///< relative to the root of the sources
    std::string name; ///< with its quotes or angle brackets

    bool IsQuoted() const { return name.front() == '"'; }
    std::string Path() const { return name.substr(1, name.size() - 2); }

    /** The library's file, relative to the root of the sources; empty for any other file. */
    std::string Target() const
    {
        for (const std::string& root : IncludeRoots) {
            if (fs::is_regular_file(Root / root / Path())) {
                return (fs::path(root) / Path()).lexically_normal();
            }
        }
        return "";
    }
};

/** Every #include of the headers and sources below the folders; there must be at least one. */
std::vector<Include> IncludesBelow(const std::vector<std::string>& folders)
{
    static const std::regex directive("^\\s*#\\s*include\\s*([\"<][^\">]+[\">])");
    std::vector<Include> includes;
    for (const std::string& folder : folders) {
        for (const fs::directory_entry& entry : fs::recursive_directory_iterator(Root / folder)) {
            if (entry.path().extension() != ".h" && entry.path().extension() != ".cpp") {
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

/** No file below @p folders includes a file of the library that lies outside @p allowed. */
void ExpectTargetsBelow(const std::vector<std::string>& folders,
                        const std::vector<std::string>& allowed)
{
    for (const Include& include : IncludesBelow(folders)) {
        if (include.IsQuoted()) {
            EXPECT_TRUE(IsBelow(include.Target(), allowed))
                << include.file << " includes " << include.name;
        }
    }
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

TEST(Includes, OfTheLibraryAreItsOwnTheStandardLibrariesOrTheThreads)
{
    for (const Include& include : IncludesBelow({"inc", "bdmv", "prv_inc", "bd"})) {
        const bool known = include.IsQuoted()
                               ? IsBelow(include.Target(), {"inc", "bdmv", "prv_inc"})
                               : SystemHeaders.count(include.Path()) != 0;
        EXPECT_TRUE(known) << include.file << " includes " << include.name;
    }
}

TEST(Includes, OfPublicHeadersExcludeTheNavigatorsHeaders)
{
    ExpectTargetsBelow({"inc", "bdmv/inc", "prv_inc"}, {"inc", "bdmv/inc", "prv_inc"});
}

TEST(Includes, OfTheBaseLayerStayBelowTheNavigator)
{
    ExpectTargetsBelow({"inc", "bd"}, {"inc", "prv_inc"});
}

TEST(Includes, OfThePlatformInterfaceAreItsOwn)
{
    ExpectTargetsBelow({"prv_inc"}, {"prv_inc"});
}
