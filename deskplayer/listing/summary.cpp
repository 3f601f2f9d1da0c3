#include "listing/summary.h"

#include <algorithm>

#include "disc/codes.h"

namespace deskplayer
{

namespace
{

constexpr std::size_t WidthOfStreams = 53;

std::string StreamText(const StreamAttributes& attributes)
{
    const std::string coding = CodingTypeName(attributes.codingType);
    switch (KindOfStream(attributes.codingType)) {
    case StreamKindVideo: {
        const std::string text = coding + ", " + VideoFormatName(attributes.videoFormat) + ", " +
                                 FrameRateName(attributes.frameRate);
        return attributes.codingType == CodingTypeH265
                   ? text + ", " + DynamicRangeName(attributes.dynamicRange) + " dynamic range"
                   : text;
    }
    case StreamKindAudio:
        return LanguageName(attributes.language) + ": " + coding + ", " +
               AudioPresentationName(attributes.audioPresentation) + ", " +
               SampleRateName(attributes.sampleRate);
    case StreamKindGraphics:
    case StreamKindTextSubtitle:
        return LanguageName(attributes.language);
    default:
        return coding;
    }
}

/** Adds one line per stream. */
void AddStreams(Lines& lines, const std::string& label, const std::vector<Stream>& streams,
                const AspectText& aspectText)
{
    for (const Stream& stream : streams) {
        const bool video = KindOfStream(stream.attributes.codingType) == StreamKindVideo;
        lines.push_back(label + StreamText(stream.attributes) + (video ? aspectText(stream) : ""));
    }
}

/** Adds the languages of streams, which can be many: as many as fit on each line. */
void AddLanguages(Lines& lines, const std::string& label, const std::vector<Stream>& streams)
{
    std::string line = label;
    for (std::size_t number = 0; number < streams.size(); ++number) {
        const bool last = number + 1 == streams.size();
        const std::string word = StreamText(streams[number].attributes) + (last ? "" : ",");
        if (number > 0 && line.size() + 1 + word.size() > WidthOfStreams) {
            lines.push_back(line);
            line.assign(label.size() - 1, ' ');
        }
        line += (number > 0 ? " " : "") + word;
    }
    if (!streams.empty()) {
        lines.push_back(line);
    }
}

} // namespace

Lines StreamLines(const StreamTable& streams, const AspectText& aspectText)
{
    Lines lines;
    AddStreams(lines, "video: ", streams.primaryVideo, aspectText);
    AddStreams(lines, "enhancement video: ", streams.enhancementVideo, aspectText);
    AddStreams(lines, "audio: ", streams.primaryAudio, aspectText);
    AddLanguages(lines, "subtitles: ", streams.pg);
    AddLanguages(lines, "menus: ", streams.ig);
    AddStreams(lines, "secondary video: ", streams.secondaryVideo, aspectText);
    AddStreams(lines, "secondary audio: ", streams.secondaryAudio, aspectText);
    AddLanguages(lines, "picture-in-picture subtitles: ", streams.pipPg);
    return lines;
}

std::size_t LongestItem(const PlayList& playList)
{
    const auto shorter = [](const PlayItem& left, const PlayItem& right) {
        return left.outTime - left.inTime < right.outTime - right.inTime;
    };
    const auto& items = playList.playItems;
    const auto longest = std::max_element(items.begin(), items.end(), shorter);
    return static_cast<std::size_t>(longest - items.begin());
}

std::size_t ItemsWithOtherStreams(const PlayList& playList, std::size_t item)
{
    // Aspect ratios are ignored: comparing them would require reading the clips of all play items.
    const AspectText nothing = [](const Stream&) { return ""; };
    const auto& items = playList.playItems;
    const Lines common = StreamLines(items[item].streams, nothing);
    return static_cast<std::size_t>(
        std::count_if(items.begin(), items.end(), [&](const PlayItem& other) {
            return StreamLines(other.streams, nothing) != common;
        }));
}

std::size_t MostAngles(const PlayList& playList)
{
    std::size_t most = 0;
    for (const PlayItem& item : playList.playItems) {
        most = std::max(most, NumberOfAngles(item));
    }
    return most;
}

} // namespace deskplayer
