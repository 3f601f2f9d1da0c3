#include "navigator/loadedplaylist.h"

#include <gtest/gtest.h>

#include "../testdesk.h"
#include "disc/errors.h"
#include "navigator/audioinfo.h"

namespace deskplayer
{

namespace
{

Disc SampleDisc()
{
    return Disc(BDMVNAVIGATOR_SAMPLE_DISC);
}

TEST(LoadedPlayList, HasMarksAndChaptersInOrderOfTheirPositions)
{
    const LoadedPlayList loaded =
        LayOut(5, ListOf({Item(10)}, {Entry(0, Ticks(700)), Link(0, Ticks(300)), Entry(3, Ticks(0)),
                                      Entry(0, Ticks(300)), Link(0, 1000 * Second)}));

    EXPECT_EQ(loaded.number, 5);
    EXPECT_EQ(loaded.timeLine.duration, 10 * Second);
    typedef std::vector<std::pair<Ticks, std::size_t>> Marks;
    EXPECT_EQ(loaded.marksByPosition, (Marks{{Ticks(300), 1}, {Ticks(300), 3}, {Ticks(700), 0}}));
    ASSERT_EQ(loaded.chaptersByStart.size(), 2);
    EXPECT_EQ(loaded.chaptersByStart[0].number, 3);
    EXPECT_EQ(loaded.chaptersByStart[1].number, 1);
    EXPECT_EQ(loaded.aspectRatios, (std::vector<std::optional<std::uint8_t>>{std::nullopt}));
}

TEST(LoadedPlayList, TakesAspectRatiosFromTheClips)
{
    const Disc disc = SampleDisc();

    const LoadedPlayList film = LoadPlayList(disc, 1, disc.ReadPlayList(1));
    const LoadedPlayList trailer = LoadPlayList(disc, 2, disc.ReadPlayList(2));

    EXPECT_EQ(film.aspectRatios, std::vector<std::optional<std::uint8_t>>(6, 3));
    EXPECT_EQ(trailer.aspectRatios, std::vector<std::optional<std::uint8_t>>(1, 2));
}

TEST(LoadedPlayList, LoadsWithoutClips)
{
    PlayItem withoutVideo = Item(10);
    withoutVideo.streams.primaryVideo.clear();

    const LoadedPlayList loaded = LoadPlayList(SampleDisc(), 1, ListOf({Item(10), withoutVideo}));

    EXPECT_EQ(loaded.aspectRatios, std::vector<std::optional<std::uint8_t>>(2, std::nullopt));
    EXPECT_TRUE(loaded.notes.empty());
}

/** A play list that is @p more longer than the maximum. */
PlayList LongestAnd(Ticks more)
{
    std::vector<PlayItem> items(10, Item(10 * 3600));
    items.push_back(ItemOfTicks(more));
    return ListOf(items);
}

TEST(LoadedPlayList, LastsAtMostAHundredHours)
{
    const LoadedPlayList longest = LoadPlayList(SampleDisc(), 1, LongestAnd(Ticks(0)));
    EXPECT_EQ(longest.timeLine.duration, LongestDuration);

    try {
        LoadPlayList(SampleDisc(), 1, LongestAnd(Ticks(45)));
        ADD_FAILURE() << "played";
    } catch (const FileError& error) {
        EXPECT_STREQ(error.what(),
                     "play list 1: lasts 100:00:00.001, expected at most 100:00:00.000");
    }
    EXPECT_THROW(LoadPlayList(SampleDisc(), 1, LongestAnd(Ticks(1))), FileError);
}

TEST(AudioInfo, HasTheFormatOfEveryCodingType)
{
    const std::pair<std::uint8_t, bd::AudioFormatType> formats[] = {
        {0x03, bd::AudioFormatMpeg},        {0x04, bd::AudioFormatMpeg},
        {0x80, bd::AudioFormatPcm},         {0x81, bd::AudioFormatAc3},
        {0x82, bd::AudioFormatDts},         {0x83, bd::AudioFormatLossless},
        {0x84, bd::AudioFormatEac3},        {0x85, bd::AudioFormatDtshdPriNoXll},
        {0x86, bd::AudioFormatDtshdPriXll}, {0xA1, bd::AudioFormatEac3Sec},
        {0xA2, bd::AudioFormatDtshdSec}};
    std::size_t known = 0;
    for (int code = 0; code < 256; ++code) {
        SCOPED_TRACE(code);
        bd::AudioFormatType expected = bd::AudioFormatUnknown;
        for (const auto& [codingType, format] : formats) {
            if (codingType == code) {
                expected = format;
                ++known;
            }
        }
        EXPECT_EQ(AudioInfoOf(StreamOf(static_cast<std::uint8_t>(code))).format, expected);
    }
    EXPECT_EQ(known, std::size(formats));
}

TEST(AudioInfo, HasTheHighestSampleRateAndTheChannels)
{
    for (int code = 0; code < 256; ++code) {
        SCOPED_TRACE(code);
        Stream stream = StreamOf(CodingAc3, 0x1FFF);
        stream.attributes.sampleRate = static_cast<std::uint8_t>(code);
        stream.attributes.audioPresentation = static_cast<std::uint8_t>(code);

        const bd::AudioInfoType info = AudioInfoOf(stream);

        EXPECT_EQ(info.sampleRate, code == 1                 ? bd::AudioSampleRate_48000
                                   : code == 4 || code == 14 ? bd::AudioSampleRate_96000
                                   : code == 5 || code == 12 ? bd::AudioSampleRate_192000
                                                             : bd::AudioSampleRateUnknown);
        EXPECT_EQ(info.channels, code == 1                 ? bd::AudioChannelTypeMono
                                 : code == 3               ? bd::AudioChannelTypeStereo
                                 : code == 6 || code == 12 ? bd::AudioChannelTypeMultiCh
                                                           : bd::AudioChannelTypeUnknown);
        EXPECT_EQ(info.pid, 0x1FFF);
        EXPECT_EQ(info.bitsPerSampling, bd::AudioBitsPerSamplingTypeInvalid);
        EXPECT_EQ(info.u4AudChannelLayout, 0);
    }
}

} // namespace

} // namespace deskplayer
