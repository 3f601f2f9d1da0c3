#include "disc/aspectratios.h"

#include <algorithm>

namespace deskplayer
{

namespace
{

void Report(const MessageHandler& handler, const std::string& message)
{
    if (handler) {
        handler(message);
    }
}

} // namespace

AspectRatio AspectRatios::Find(const PlayList& playList, std::size_t playItem, const Stream& stream)
{
    const std::optional<std::string> name = ClipOfStream(playList, playItem, stream);
    if (!name) {
        return {std::nullopt, "its clip is unknown"};
    }
    const Clip& clip = Read(*name);
    if (!clip.problem.empty()) {
        return {std::nullopt, clip.problem};
    }
    const auto ratio = std::lower_bound(
        clip.ratios.begin(), clip.ratios.end(), stream.pid,
        [](const auto& candidate, std::uint16_t pid) { return candidate.first < pid; });
    if (ratio == clip.ratios.end() || ratio->first != stream.pid) {
        return {std::nullopt, "not in the clip information"};
    }
    return {ratio->second, ""};
}

const AspectRatios::Clip& AspectRatios::Read(const std::string& name)
{
    const auto [entry, isNew] = m_Clips.try_emplace(name);
    Clip& clip = entry->second;
    if (isNew) {
        try {
            clip.ratios = AspectRatiosOf(m_rDisc.ReadClipInfo(name));
        } catch (const MissingFileError& error) {
            clip.problem = error.what();
            Report(m_Handlers.onMissing, clip.problem);
        } catch (const DiscError& error) {
            clip.problem = error.what();
            Report(m_Handlers.onUnreadable, clip.problem);
        }
    }
    return clip;
}

} // namespace deskplayer
