#include "programtest.h"

#include <sys/resource.h>
#include <unistd.h>

#include <algorithm>
#include <fstream>
#include <iterator>
#include <regex>
#include <sstream>

const std::string SampleDisc = BDMVNAVIGATOR_SAMPLE_DISC;
const std::string AllEvents = BDMVNAVIGATOR_SESSIONS "/all-events.session";
const std::string Evening = BDMVNAVIGATOR_SESSIONS "/evening.session";
const std::string PausedLogLine =
    "2024-05-31 20:15:00.123456 BdmvNavigator Event: Sending Paused\n";

std::vector<std::string> LinesOf(const std::string& text)
{
    std::vector<std::string> lines;
    std::istringstream stream(text);
    for (std::string line; std::getline(stream, line);) {
        lines.push_back(line);
    }
    return lines;
}

std::string LastLine(const std::string& text)
{
    const std::vector<std::string> lines = LinesOf(text);
    return lines.empty() ? "" : lines.back();
}

std::string Without(const std::string& pattern, const std::string& text)
{
    std::string rest;
    for (const std::string& line : LinesOf(text)) {
        if (line.find(pattern) == std::string::npos) {
            rest += line + "\n";
        }
    }
    return rest;
}

std::string ReadContents(const fs::path& path)
{
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

void ResizeSparsely(const fs::path& file, std::uintmax_t size)
{
    rlimit limit = {};
    getrlimit(RLIMIT_FSIZE, &limit);
    const rlimit none = {limit.rlim_max, limit.rlim_max};
    setrlimit(RLIMIT_FSIZE, &none);
    fs::resize_file(file, size);
    setrlimit(RLIMIT_FSIZE, &limit);
}

void ExpectUsageError(const std::vector<std::string>& arguments, const std::string& message)
{
    const ProgramResult result = RunDeskPlayer(arguments);
    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.output, "");
    EXPECT_EQ(result.errors, "bdmv-deskplayer: " + message + "\n");
}

ScratchFolder::ScratchFolder()
    : folder(fs::temp_directory_path() / ("program-test-" + std::to_string(getpid())))
{
    fs::remove_all(folder);
    fs::create_directories(folder);
}

ScratchFolder::~ScratchFolder()
{
    fs::remove_all(folder);
}

std::string ScratchFolder::WriteFile(const std::string& name, const std::string& content) const
{
    std::ofstream(folder / name, std::ios::binary) << content;
    return folder / name;
}

ScratchDisc::ScratchDisc()
{
    fs::copy(SampleDisc, disc, fs::copy_options::recursive);
    fs::remove(disc / "BDMV/PLAYLIST/00002.mpls");
}

void ScratchDisc::Patch(std::streamoff offset, const std::string& bytes) const
{
    std::fstream file(playList, std::ios::binary | std::ios::in | std::ios::out);
    file.seekp(offset);
    file << bytes;
}

void ScratchDisc::MakeShort(std::uint32_t ticks) const
{
    const std::streamoff inTimeOfTheFirstItem = 0x52;
    fs::copy_file(fs::path(SampleDisc) / "BDMV/PLAYLIST/00002.mpls", playList,
                  fs::copy_options::overwrite_existing);
    std::fstream file(playList, std::ios::binary | std::ios::in | std::ios::out);
    file.seekg(inTimeOfTheFirstItem);
    std::uint32_t time = ticks;
    for (int shift = 24; shift >= 0; shift -= 8) {
        time += static_cast<std::uint32_t>(file.get()) << shift;
    }
    file.seekp(inTimeOfTheFirstItem + 4);
    for (int shift = 24; shift >= 0; shift -= 8) {
        file.put(static_cast<char>(time >> shift));
    }
}

void ScratchDisc::ExpectRefused(const std::string& message,
                                const std::vector<std::string>& furtherArguments) const
{
    std::vector<std::string> arguments = {disc};
    arguments.insert(arguments.end(), furtherArguments.begin(), furtherArguments.end());
    const ProgramResult result = RunDeskPlayer(arguments);
    EXPECT_EQ(result.status, 3);
    EXPECT_EQ(result.output, "");
    EXPECT_EQ(std::count(result.errors.begin(), result.errors.end(), '\n'), 1);
    EXPECT_TRUE(std::regex_search(result.errors, std::regex(message))) << result.errors;
}
