#include "navigator/announcer.h"

#include <gtest/gtest.h>

#include <sstream>

#include "parts.h"

namespace deskplayer
{

namespace
{

PlayItem PoorItem(std::uint32_t seconds)
{
    PlayItem item = Item(seconds);
    item.streams = StreamTable();
    return item;
}

class AnnouncerOnThreeItems : public testing::Test
{
protected:
    EventParts parts{ListOf({RichItem(10), RichItem(10), PoorItem(10)},
                            {Entry(0, Ticks(0)), Entry(1, Ticks(0))})};
    Announcer announcer{parts.playhead, parts.state, parts.context, parts.sender};

    /** The names of the callbacks since the last call. */
    std::string TakeNames()
    {
        std::istringstream received(parts.Take());
        std::string names;
        for (std::string line; std::getline(received, line);) {
            names += line.substr(2, line.find('(') - 2) + " ";
        }
        return names;
    }
};

TEST_F(AnnouncerOnThreeItems, AnnouncesEverythingAboutTheFirstItem)
{
    announcer.AnnounceItem();

    EXPECT_EQ(TakeNames(),
              "PlayItem VideoInfo AudioInfo AngleInfo PresentationGraphicsInfo SecondaryVideoInfo "
              "SecondaryVideoDisplay SecondaryAudioInfo SecondaryAudioDisplay PipPgTextStInfo "
              "InteractiveGraphicsInfo AudioInfoChanged "
              "AudioInfoChanged TextSubtitleStylesAvailable TextSubtitleStyleInfo "
              "PictureInPictureAvailable SecondaryAudioAvailable UOMask ");
}

TEST_F(AnnouncerOnThreeItems, AnnouncesOnlyTheItemWhenNothingElseDiffers)
{
    announcer.AnnounceItem();
    TakeNames();
    parts.playhead.Enter(1);

    announcer.AnnounceItem();

    EXPECT_EQ(TakeNames(), "PlayItem ");
}

TEST_F(AnnouncerOnThreeItems, AnnouncesEverythingAgainAfterForgetting)
{
    announcer.AnnounceItem();
    const std::string first = TakeNames();

    announcer.Forget();
    announcer.AnnounceItem();

    EXPECT_EQ(TakeNames(), first);
}

TEST_F(AnnouncerOnThreeItems, AnnouncesMissingStreams)
{
    announcer.AnnounceItem();
    TakeNames();
    parts.playhead.Enter(2);

    announcer.AnnounceStreams();

    EXPECT_EQ(TakeNames(),
              "VideoInfo AudioInfo AngleInfo PresentationGraphicsInfo SecondaryVideoInfo "
              "SecondaryVideoDisplay SecondaryAudioInfo SecondaryAudioDisplay PipPgTextStInfo "
              "InteractiveGraphicsInfo "
              "TextSubtitleStylesAvailable ");
}

TEST_F(AnnouncerOnThreeItems, AnnouncesSyncStreamsOnlyAtNormalSpeed)
{
    announcer.AnnounceSyncStreams();
    EXPECT_EQ(TakeNames(), "PictureInPictureAvailable SecondaryAudioAvailable ");

    parts.state.currentPlayMode = bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedFast1);
    announcer.AnnounceSyncStreams();
    EXPECT_EQ(TakeNames(), "PictureInPictureUnavailable SecondaryAudioUnavailable ");

    announcer.AnnounceSyncStreams();
    EXPECT_EQ(TakeNames(), "");
}

TEST_F(AnnouncerOnThreeItems, AnnouncesAChangeOfTheSelectedAudio)
{
    announcer.AnnounceItem();
    TakeNames();
    parts.state.selection.audio = 2;

    announcer.AnnounceStreams();

    EXPECT_EQ(TakeNames(), "AudioInfo AudioInfoChanged ");
}

TEST_F(AnnouncerOnThreeItems, AnnouncesTheMenuWhenItsAvailabilityChanges)
{
    announcer.AnnounceMenu();
    announcer.AnnounceMenu();
    EXPECT_EQ(TakeNames(), "PopUpMenuAvailable ");

    parts.playhead.Enter(2);
    announcer.AnnounceMenu();
    EXPECT_EQ(TakeNames(), "PopUpMenuUnavailable ");
}

TEST_F(AnnouncerOnThreeItems, AnnouncesAChapterOnce)
{
    EXPECT_EQ(announcer.AnnouncedChapter(), 0);

    announcer.AnnounceChapter();
    announcer.AnnounceChapter();

    EXPECT_EQ(parts.Take(), "A.ChapterNumber(1)\n");
    EXPECT_EQ(announcer.AnnouncedChapter(), 1);
}

} // namespace

} // namespace deskplayer
