#include "navigator/loadedplaylist.h"

#include <algorithm>
#include <tuple>

#include "disc/aspectratios.h"
#include "text/timetext.h"

namespace deskplayer
{

LoadedPlayList LayOut(std::uint32_t number, PlayList playList)
{
    LoadedPlayList loaded;
    loaded.number = number;
    loaded.playList = std::move(playList);
    loaded.timeLine = BuildTimeLine(loaded.playList);
    for (std::size_t mark = 0; mark < loaded.timeLine.markPositions.size(); ++mark) {
        if (const auto position = loaded.timeLine.markPositions[mark]) {
            loaded.marksByPosition.emplace_back(*position, mark);
        }
    }
    std::sort(loaded.marksByPosition.begin(), loaded.marksByPosition.end());
    loaded.chaptersByStart = loaded.timeLine.chapters;
    std::stable_sort(loaded.chaptersByStart.begin(), loaded.chaptersByStart.end(),
                     [](const Chapter& left, const Chapter& right) {
                         return std::tie(left.start, left.playItem) <
                                std::tie(right.start, right.playItem);
                     });
    loaded.aspectRatios.resize(loaded.playList.playItems.size());
    return loaded;
}

LoadedPlayList LoadPlayList(const Disc& disc, std::uint32_t number, PlayList playList)
{
    LoadedPlayList loaded = LayOut(number, std::move(playList));
    if (loaded.timeLine.duration > LongestDuration) {
        throw FileError("play list " + std::to_string(number),
                        "lasts " + TimeText(loaded.timeLine.duration) + ", expected at most " +
                            TimeText(LongestDuration));
    }
    AspectRatios aspectRatios(disc,
                              {{}, [&loaded](const std::string& reason) {
                                   loaded.notes.push_back("aspect ratio not known: " + reason);
                               }});
    for (std::size_t item = 0; item < loaded.playList.playItems.size(); ++item) {
        const std::vector<Stream>& videos = loaded.playList.playItems[item].streams.primaryVideo;
        if (!videos.empty()) {
            loaded.aspectRatios[item] =
                aspectRatios.Find(loaded.playList, item, videos.front()).code;
        }
    }
    return loaded;
}

} // namespace deskplayer
