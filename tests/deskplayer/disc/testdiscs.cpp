#include "testdiscs.h"

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <iterator>

namespace deskplayer
{

namespace
{

namespace fs = std::filesystem;

std::vector<fs::path> DiscsIn(const fs::path& folder)
{
    std::vector<fs::path> discs;
    for (const fs::directory_entry& entry : fs::directory_iterator(folder)) {
        if (fs::exists(entry.path() / "expected.json")) {
            discs.push_back(entry.path());
        }
    }
    std::sort(discs.begin(), discs.end());
    return discs;
}

} // namespace

std::vector<fs::path> TestDiscs()
{
    return DiscsIn(BDMVNAVIGATOR_TEST_DISCS);
}

std::vector<fs::path> FurtherDiscs()
{
    const char* const folder = std::getenv("BDMVNAVIGATOR_DISCS");
    return folder ? DiscsIn(folder) : std::vector<fs::path>();
}

fs::path TestDisc(const std::string& name)
{
    return fs::path(BDMVNAVIGATOR_TEST_DISCS) / name;
}

std::vector<fs::path> FilesBelow(const fs::path& folder, const std::string& extension)
{
    std::vector<fs::path> files;
    for (const fs::directory_entry& entry : fs::recursive_directory_iterator(folder)) {
        if (entry.path().extension() == extension) {
            files.push_back(entry.path());
        }
    }
    std::sort(files.begin(), files.end());
    return files;
}

Bytes ReadContents(const fs::path& path)
{
    std::ifstream stream(path, std::ios::binary);
    return Bytes(std::istreambuf_iterator<char>(stream), std::istreambuf_iterator<char>());
}

void WriteBytes(const fs::path& path, const Bytes& bytes)
{
    std::ofstream(path, std::ios::binary)
        .write(reinterpret_cast<const char*>(bytes.data()),
               static_cast<std::streamsize>(bytes.size()));
}

} // namespace deskplayer
