#include "program/page.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <filesystem>
#include <fstream>
#include <memory>
#include <string>
#include <string_view>
#include <system_error>
#include <utility>
#include <vector>

#include "program/comparison.h"
#include "program/failure.h"
#include "program/recordingfile.h"
#include "text/printable.h"

namespace deskplayer
{

namespace
{

namespace fs = std::filesystem;

/** The line of a page whose place the recordings take. */
constexpr std::string_view Marker = "<!--recordings-->";

/** Bytes of the largest page. */
constexpr std::size_t LargestPage = std::size_t{16} * 1024 * 1024;

/** In the build tree as it is where the program is installed. */
fs::path InstalledPage()
{
    std::error_code noProcessFileSystem;
    const fs::path program = fs::read_symlink("/proc/self/exe", noProcessFileSystem);
    return (program.parent_path() / "../share/bdmvnavigator/timeline.html").lexically_normal();
}

fs::path PagePath(const Options& options)
{
    return options.page.empty() ? InstalledPage() : fs::path(options.page);
}

std::string ReadPage(const Options& options)
{
    const fs::path path = PagePath(options);
    std::ifstream file(path, std::ios::binary);
    if (!file) {
        throw UsageError(Printable(path.string()) + ": cannot open page" +
                         (options.page.empty()
                              ? "; build it with scripts/page, or name another with --page"
                              : ""));
    }
    std::string text;
    std::array<char, 4096> part{};
    while (file && text.size() <= LargestPage) {
        file.read(part.data(), part.size());
        text.append(part.data(), static_cast<std::size_t>(file.gcount()));
    }
    if (file.bad()) {
        throw UsageError(Printable(path.string()) + ": cannot read page");
    }
    if (text.size() > LargestPage) {
        throw UsageError(Printable(path.string()) + ": page too large; expected at most " +
                         std::to_string(LargestPage) + " bytes");
    }
    return text;
}

/** Where the markers are that take up a whole line. */
std::vector<std::size_t> FindMarkers(std::string_view text)
{
    std::vector<std::size_t> found;
    for (std::size_t at = text.find(Marker); at != std::string_view::npos;
         at = text.find(Marker, at + 1)) {
        const std::size_t end = at + Marker.size();
        if ((at == 0 || text[at - 1] == '\n') && (end == text.size() || text[end] == '\n')) {
            found.push_back(at);
        }
    }
    return found;
}

PageFrame ReadFrame(const Options& options)
{
    const std::string text = ReadPage(options);
    const std::vector<std::size_t> markers = FindMarkers(text);
    if (markers.size() != 1) {
        throw UsageError(Printable(PagePath(options).string()) +
                         ": not a page for recordings; expected one line " + std::string(Marker) +
                         ", found " + std::to_string(markers.size()));
    }
    return {text.substr(0, markers[0]), text.substr(markers[0] + Marker.size()), {}};
}

/** The name of the recording for people: of the input that it comes from. */
std::string RecordingName(const Options& options)
{
    if (!options.fieldLogs.empty()) {
        const std::size_t others = options.fieldLogs.size() - 1;
        return InputName(options.fieldLogs.front()) +
               (others == 0 ? "" : " and " + std::to_string(others) + " more");
    }
    if (!options.replay.empty()) {
        return InputName(options.replay);
    }
    return options.session.empty() ? options.disc : options.session;
}

bool ReadsStandardInput(const Options& options)
{
    return options.remote || options.replay == StandardInput ||
           std::count(options.fieldLogs.begin(), options.fieldLogs.end(), StandardInput) != 0;
}

void CheckInputs(const Options& options)
{
    if (options.compare == StandardInput && ReadsStandardInput(options)) {
        throw UsageError("--compare: standard input is already in use");
    }
    std::error_code notBothExist;
    if (fs::equivalent(options.compare, options.output, notBothExist)) {
        throw UsageError("--output: is the recording to compare with");
    }
    if (fs::equivalent(PagePath(options), options.output, notBothExist)) {
        throw UsageError("--output: is the page");
    }
}

} // namespace

void PreparePage(const Options& options, OutputSettings& settings)
{
    if (settings.format != OutputFormat::Html) {
        if (!options.compare.empty() || !options.page.empty()) {
            throw UsageError(std::string(options.compare.empty() ? "--page" : "--compare") +
                             " requires --format html");
        }
        return;
    }
    CheckInputs(options);
    PageFrame frame = ReadFrame(options);
    if (!options.compare.empty()) {
        const auto comparison = std::make_shared<Comparison>(options, settings.filter);
        frame.writeOthers = [comparison](std::ostream& page) { comparison->WriteTo(page); };
    }
    settings.recordingName = RecordingName(options);
    settings.page = std::make_shared<PageFrame>(std::move(frame));
}

} // namespace deskplayer
