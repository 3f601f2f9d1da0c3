#include "listing/listing.h"

#include <algorithm>
#include <cinttypes>
#include <cstdio>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "disc/aspectratios.h"
#include "disc/codes.h"
#include "disc/timeline.h"
#include "listing/faults.h"
#include "listing/summary.h"
#include "text/printable.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

constexpr std::size_t WidthOfFirstColumns = 47; ///< all columns but the streams

std::string ObjectText(const IndexObject& object)
{
    std::string text;
    std::uint8_t movie = 0; // the playback type of a movie; the next one is interactive
    switch (object.objectType) {
    case ObjectTypeMovieObject:
        text = "movie object " + std::to_string(object.movieObject);
        break;
    case ObjectTypeJavaObject:
        text = "Java object " + Printable(object.javaObject);
        movie = 2;
        break;
    default:
        text = "reserved object type " + std::to_string(object.objectType);
    }
    if (object.playbackType == movie) {
        return text + ", movie";
    }
    if (object.playbackType == movie + 1) {
        return text + ", interactive";
    }
    return text + ", reserved playback type " + std::to_string(object.playbackType);
}

std::string AccessText(std::uint8_t accessType)
{
    switch (accessType) {
    case 0:
        return "title search permitted";
    case 1:
        return "title search forbidden";
    default:
        return "title search forbidden (access type " + std::to_string(accessType) + ")";
    }
}

std::string IndexText(const Index& index)
{
    std::string text = "version " + index.version;
    if (index.videoFormat != 0) {
        text += ", " + VideoFormatName(index.videoFormat);
    }
    if (index.frameRate != 0) {
        text += ", " + FrameRateName(index.frameRate);
    }
    if (index.stereoscopicContent) {
        text += ", stereoscopic content";
    }
    if (index.stereoscopicOutputPreferred) {
        text += ", stereoscopic output preferred";
    }
    const std::size_t titles = index.titles.size();
    return text + ", " + std::to_string(titles) + (titles == 1 ? " title" : " titles");
}

void ListTitles(std::ostream& output, const Disc& disc, Faults& faults)
{
    Index index;
    try {
        index = disc.ReadIndex();
    } catch (const DiscError& error) {
        output << "Index           " << error.what() << '\n';
        faults.Add(error.what());
        return;
    }
    output << "Index           " << IndexText(index) << '\n'
           << "First playback  " << ObjectText(index.firstPlayback) << '\n'
           << "Top menu        " << ObjectText(index.topMenu) << '\n';
    std::size_t number = 0;
    for (const IndexObject& title : index.titles) {
        std::string label = "Title " + std::to_string(++number);
        label.resize(std::max<std::size_t>(label.size(), 14), ' ');
        output << label << "  " << ObjectText(title) << ", " << AccessText(title.accessType)
               << '\n';
    }
}

/** The streams of the longest play item, and the number of play items with other streams. */
Lines StreamLines(const PlayList& playList, AspectRatios& aspectRatios)
{
    if (playList.playItems.empty()) {
        return {};
    }
    const std::size_t longest = LongestItem(playList);
    const StreamTable& shown = playList.playItems[longest].streams;
    Lines lines = StreamLines(shown, [&](const Stream& stream) {
        const std::optional<std::uint8_t> code = aspectRatios.Find(playList, longest, stream).code;
        return code ? ", " + AspectRatioName(*code) : ", aspect ratio unknown";
    });

    const std::size_t others = ItemsWithOtherStreams(playList, longest);
    if (others > 0) {
        lines.push_back("other streams in " + std::to_string(others) + " of " +
                        std::to_string(playList.playItems.size()) + " play items");
    }
    return lines;
}

void ListPlayList(std::ostream& output, const PlayList& playList, AspectRatios& aspectRatios)
{
    const TimeLine timeLine = BuildTimeLine(playList);
    char columns[128];
    std::snprintf(columns, sizeof columns, "%-12s  %5zu  %8zu  %6zu",
                  TimeText(timeLine.duration).c_str(), playList.playItems.size(),
                  timeLine.chapters.size(), MostAngles(playList));
    output << columns;
    std::string separator = "  ";
    for (const std::string& line : StreamLines(playList, aspectRatios)) {
        output << separator << line;
        separator = '\n' + std::string(WidthOfFirstColumns, ' ');
    }
    output << '\n';
}

} // namespace

std::size_t ListPlayLists(std::ostream& output, const Disc& disc,
                          const std::vector<std::uint32_t>& numbers, const MessageHandler& onFault)
{
    Faults faults(onFault);
    ListTitles(output, disc, faults);
    output << '\n';
    if (numbers.empty()) {
        output << "There are no play lists.\n";
        return faults.Count();
    }

    output << "Number  Duration      Items  Chapters  Angles  Streams\n";
    AspectRatios aspectRatios(disc, faults.OfClips());
    for (const std::uint32_t number : numbers) {
        char label[16];
        std::snprintf(label, sizeof label, "%05" PRIu32 "   ", number);
        output << label;
        try {
            ListPlayList(output, disc.ReadPlayList(number), aspectRatios);
        } catch (const DiscError& error) {
            output << error.what() << '\n';
            faults.Add(error.what());
        }
    }
    return faults.Count();
}

} // namespace deskplayer
