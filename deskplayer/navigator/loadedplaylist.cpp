#include "navigator/loadedplaylist.h"

#include <utility>

namespace deskplayer
{

LoadedPlayList LoadPlayList(const Disc& disc, std::uint32_t number, PlayList playList)
{
    LoadedPlayList loaded;
    loaded.number = number;
    loaded.timeLine = BuildTimeLine(playList);
    for (std::size_t item = 0; item < playList.playItems.size(); ++item) {
        const std::vector<Stream>& videos = playList.playItems[item].streams.primaryVideo;
        loaded.aspectRatios.push_back(
            videos.empty() ? std::nullopt : disc.AspectRatio(playList, item, videos.front()));
    }
    loaded.playList = std::move(playList);
    return loaded;
}

} // namespace deskplayer
