#include "playbacks.h"

#include <algorithm>
#include <cctype>
#include <string>

#include "testdiscs.h"

namespace deskplayer
{

namespace
{

namespace fs = std::filesystem;

} // namespace

std::ostream& operator<<(std::ostream& stream, const Playback& playback)
{
    std::string name = playback.disc.filename().string() + '_' + std::to_string(playback.playList) +
                       (playback.session.empty() ? "" : '_' + playback.session.stem().string());
    std::replace_if(
        name.begin(), name.end(),
        [](char character) { return std::isalnum(static_cast<unsigned char>(character)) == 0; },
        '_');
    return stream << name;
}

std::vector<fs::path> SampleDiscs()
{
    std::vector<fs::path> discs = TestDiscs();
    discs.emplace_back(fs::path(BDMVNAVIGATOR_EXAMPLES) / "discs/sample");
    return discs;
}

std::vector<fs::path> SampleSessions()
{
    return FilesBelow(fs::path(BDMVNAVIGATOR_EXAMPLES) / "sessions", ".session");
}

std::vector<Playback> PlaybacksOf(const std::vector<fs::path>& discs)
{
    std::vector<Playback> playbacks;
    for (const fs::path& disc : discs) {
        for (const fs::path& file : FilesBelow(disc / "BDMV/PLAYLIST", ".mpls")) {
            const auto playList = static_cast<std::uint32_t>(std::stoul(file.stem().string()));
            playbacks.push_back({disc, playList, {}});
            for (const fs::path& session : SampleSessions()) {
                playbacks.push_back({disc, playList, session});
            }
        }
    }
    return playbacks;
}

} // namespace deskplayer
