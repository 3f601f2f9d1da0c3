#include "listing/aspectratios.h"

#include "disc/codes.h"

namespace deskplayer
{

AspectRatio AspectRatios::Find(const PlayList& playList, std::size_t playItem, const Stream& stream)
{
    const std::optional<std::string> name = ClipOfStream(playList, playItem, stream);
    if (!name) {
        return {std::nullopt, "its clip is not known"};
    }
    const Clip& clip = Read(*name);
    if (!clip.problem.empty()) {
        return {std::nullopt, clip.problem};
    }
    const auto ratio = clip.ratios.find(stream.pid);
    if (ratio == clip.ratios.end()) {
        return {std::nullopt, "not in the clip information"};
    }
    return {ratio->second, ""};
}

const AspectRatios::Clip& AspectRatios::Read(const std::string& name)
{
    const auto [entry, isNew] = m_Clips.try_emplace(name);
    Clip& clip = entry->second;
    if (!isNew) {
        return clip;
    }
    try {
        const ClipInfo clipInfo = m_rDisc.ReadClipInfo(name);
        for (const Program& program : clipInfo.programs) {
            for (const ProgramStream& stream : program.streams) {
                if (KindOfStream(stream.attributes.codingType) == StreamKindVideo) {
                    clip.ratios.emplace(stream.pid, stream.aspectRatio); // the first one counts
                }
            }
        }
    } catch (const DiscError& error) {
        clip.problem = error.what();
    }
    return clip;
}

} // namespace deskplayer
