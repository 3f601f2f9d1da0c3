#include <gtest/gtest.h>

#include <functional>
#include <utility>

#include "../testdesk.h"

namespace deskplayer
{

namespace
{

typedef Outcome (SimulatedNavigator::*Select)(std::uint64_t number);
typedef Outcome (SimulatedNavigator::*Switch)(bool on);

bd::PlayMode Fast()
{
    return bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedFast1);
}

/** Operations that select one of two streams. */
struct Selection {
    Select select;
    const char* what;
    const char* received; ///< when the second was selected
};

const Selection Selections[] = {
    {&SimulatedNavigator::SelectAudio, "audio stream",
     "1 AudioInfo(2)\n"
     "1 AudioInfoChanged(true, (AudioFormatPcm, AudioSampleRateUnknown, "
     "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 4353, 0))\n"},
    {&SimulatedNavigator::SelectSubtitle, "subtitle stream",
     "1 PresentationGraphicsInfo(2, true)\n"},
    {&SimulatedNavigator::SelectAngle, "angle", "1 AngleInfo(2)\n"},
    {&SimulatedNavigator::SelectSecondaryVideo, "secondary video stream",
     "1 SecondaryVideoInfo(2)\n"
     "1 SecondaryVideoDisplay(2, false)\n"},
    {&SimulatedNavigator::SelectSecondaryAudio, "secondary audio stream",
     "1 SecondaryAudioInfo(2)\n"
     "1 SecondaryAudioDisplay(2, false)\n"
     "1 AudioInfoChanged(false, (AudioFormatEac3Sec, AudioSampleRateUnknown, "
     "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 6657, 0))\n"},
    {&SimulatedNavigator::SelectPipSubtitle, "picture-in-picture subtitle stream",
     "1 PipPgTextStInfo(2, false)\n"},
};

TEST(Streams, AreSelectedAndAnnouncedOnce)
{
    for (const Selection& selection : Selections) {
        SCOPED_TRACE(selection.what);
        TestDesk desk(ListOf({RichItem(10)}));
        desk.Start(Second);
        const std::string before = desk.Snapshot();

        EXPECT_TRUE((desk.navigator.*selection.select)(2).IsDone());
        EXPECT_EQ(desk.Take(), selection.received);
        EXPECT_NE(desk.Snapshot(), before);

        EXPECT_TRUE((desk.navigator.*selection.select)(2).IsDone());
        EXPECT_EQ(desk.Take(), "") << "nothing has changed";

        EXPECT_TRUE((desk.navigator.*selection.select)(1).IsDone());
        EXPECT_EQ(desk.Snapshot(), before);
    }
}

TEST(Streams, ThatDoNotExistAreRefused)
{
    for (const Selection& selection : Selections) {
        SCOPED_TRACE(selection.what);
        TestDesk desk(ListOf({RichItem(10)}));
        desk.Start(Second);
        const std::string before = desk.Snapshot();

        for (const std::uint64_t number : std::vector<std::uint64_t>{0, 3, 257, 65537}) {
            EXPECT_EQ((desk.navigator.*selection.select)(number).Reason(),
                      "no " + std::string(selection.what) + " " + std::to_string(number) + "; " +
                          selection.what + "s are numbered 1 to 2");
        }
        EXPECT_EQ(desk.Take(), "");
        EXPECT_EQ(desk.Snapshot(), before);
    }
}

TEST(Streams, CannotBeSelectedIfThereAreNone)
{
    for (const Selection& selection : Selections) {
        SCOPED_TRACE(selection.what);
        TestDesk desk(ListOf({Item(10)}));
        desk.Start(Second);

        const std::string what = selection.what;
        EXPECT_EQ((desk.navigator.*selection.select)(2).Reason(),
                  "no " + what + " 2; " +
                      (what == "angle" ? "the only angle is 1" : "there are no " + what + "s"));
        EXPECT_EQ(desk.Take(), "");
    }
}

TEST(Streams, FallBackToTheLastAndKeepTheSelection)
{
    PlayItem poor = RichItem(1);
    poor.streams.primaryAudio.pop_back();
    TestDesk desk(ListOf({RichItem(1), poor, Item(1), RichItem(1)}));
    desk.Start();
    desk.Do(desk.navigator.SelectAudio(2));

    desk.navigator.Advance(Second);
    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "1 AudioInfo(1)\n"
              "1 AudioInfoChanged(true, (AudioFormatAc3, AudioSampleRateUnknown, "
              "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 4352, 0))\n");
    desk.navigator.Advance(Second);
    EXPECT_NE(desk.Take().find("2 AudioInfo(0)\n"), std::string::npos);
    desk.navigator.Advance(Second);
    const std::string received = desk.Take();
    EXPECT_NE(received.find("3 AudioInfo(2)\n"), std::string::npos);
    EXPECT_NE(
        received.find("3 AudioInfoChanged(true, (AudioFormatPcm, AudioSampleRateUnknown, "
                      "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 4353, 0))\n"),
        std::string::npos);
}

TEST(Streams, AnnounceAudioAttributesOnlyWhenTheyDiffer)
{
    PlayItem other = RichItem(1);
    other.streams.primaryAudio.front().attributes.sampleRate = 1;
    PlayItem further = other;
    further.streams.primaryAudio.pop_back();
    TestDesk desk(ListOf({RichItem(1), other, further}));
    desk.Start();

    desk.navigator.Advance(2 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "1 AudioInfoChanged(true, (AudioFormatAc3, AudioSampleRate_48000, "
              "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 4352, 0))\n"
              "2 PlayItem(7, 2, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "2 AudioInfo(1)\n");
}

TEST(Streams, AreShownAndHidden)
{
    const struct {
        Switch show;
        bool before;
        const char* on;
        const char* off;
    } switches[] = {
        {&SimulatedNavigator::ShowSubtitles, true, "1 PresentationGraphicsDisplay(true)\n",
         "1 PresentationGraphicsDisplay(false)\n"},
        {&SimulatedNavigator::ShowSecondaryVideo, false, "1 SecondaryVideoDisplay(1, true)\n",
         "1 SecondaryVideoDisplay(1, false)\n"},
        {&SimulatedNavigator::ShowSecondaryAudio, false, "1 SecondaryAudioDisplay(1, true)\n",
         "1 SecondaryAudioDisplay(1, false)\n"},
        {&SimulatedNavigator::PickPipSubtitle, false, "1 PipPgTextSelect(true)\n",
         "1 PipPgTextSelect(false)\n"},
    };
    for (const auto& item : switches) {
        SCOPED_TRACE(item.on);
        TestDesk desk(ListOf({RichItem(10)}));
        desk.Start(Second);
        const std::string before = desk.Snapshot();

        EXPECT_TRUE((desk.navigator.*item.show)(!item.before).IsDone());
        EXPECT_EQ(desk.Take(), item.before ? item.off : item.on);
        EXPECT_NE(desk.Snapshot(), before);
        EXPECT_TRUE((desk.navigator.*item.show)(item.before).IsDone());
        EXPECT_EQ(desk.Take(), item.before ? item.on : item.off);
        EXPECT_EQ(desk.Snapshot(), before);
    }
}

TEST(Streams, ThatAnItemLacksCanBeHiddenButNotShown)
{
    TestDesk desk(ListOf({RichItem(10), Item(10)}));
    desk.Start(Second);
    desk.Do(desk.navigator.ShowSecondaryVideo(true));
    desk.Do(desk.navigator.ShowSecondaryAudio(true));
    desk.Do(desk.navigator.SearchTime(11 * Second));

    EXPECT_EQ(desk.navigator.ShowSecondaryVideo(true).Reason(),
              "the play item has no secondary video");
    EXPECT_EQ(desk.navigator.ShowSecondaryAudio(true).Reason(),
              "the play item has no secondary audio");
    EXPECT_EQ(desk.Take(), "");

    EXPECT_TRUE(desk.navigator.ShowSecondaryVideo(false).IsDone());
    EXPECT_TRUE(desk.navigator.ShowSecondaryAudio(false).IsDone());
    EXPECT_EQ(desk.Take(), "1 SecondaryVideoDisplay(0, false)\n"
                           "1 SecondaryAudioDisplay(0, false)\n");
}

TEST(Streams, HiddenSubtitlesAreNotAvailable)
{
    TestDesk desk(ListOf({RichItem(10)}));
    desk.Start(Second);
    desk.Do(desk.navigator.ShowSubtitles(false));

    desk.navigator.SelectSubtitle(2);

    EXPECT_EQ(desk.Take(), "1 PresentationGraphicsInfo(2, false)\n");
}

TEST(Streams, OfTextSubtitlesHaveFourStyles)
{
    TestDesk desk(ListOf({RichItem(10)}));
    desk.Start(Second);
    const std::string before = desk.Snapshot();

    EXPECT_EQ(desk.navigator.SelectStyle(0).Reason(),
              "no text subtitle style 0; text subtitle styles are numbered 1 to 4");
    EXPECT_EQ(desk.navigator.SelectStyle(5).Reason(),
              "no text subtitle style 5; text subtitle styles are numbered 1 to 4");
    EXPECT_EQ(desk.Take(), "");
    EXPECT_EQ(desk.Snapshot(), before);

    EXPECT_TRUE(desk.navigator.SelectStyle(4).IsDone());
    EXPECT_EQ(desk.Take(), "1 TextSubtitleStyleInfo(4)\n");
    EXPECT_EQ(desk.navigator.Context().GetCurrentTextSubtitleStyleNumber(), 4);
}

TEST(Streams, WithoutTextSubtitlesHaveNoStyles)
{
    PlayItem item = RichItem(10);
    item.streams.pg = {StreamOf(CodingGraphics)};
    TestDesk desk(ListOf({item, RichItem(10), item}));
    desk.Start();

    EXPECT_EQ(desk.navigator.SelectStyle(1).Reason(),
              "no text subtitle style 1; there are no text subtitle styles");

    desk.navigator.Advance(10 * Second);
    EXPECT_EQ(desk.TakeWithoutPositions(),
              "10 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "10 PresentationGraphicsInfo(1, true)\n"
              "10 TextSubtitleStylesAvailable(4)\n"
              "10 TextSubtitleStyleInfo(1)\n");
    desk.navigator.Advance(10 * Second);
    EXPECT_EQ(desk.TakeWithoutPositions(),
              "20 PlayItem(7, 2, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "20 PresentationGraphicsInfo(1, true)\n"
              "20 TextSubtitleStylesAvailable(0)\n");
}

TEST(Zoom, IsAnnouncedWithItsParameters)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(Second);

    EXPECT_TRUE(desk.navigator.Zoom({{1, 2, 3, 4}, {5, 6, 7, 8}, 9}).IsDone());

    EXPECT_EQ(desk.Take(), "1 ZoomModeSet(((1, 2, 3, 4), (5, 6, 7, 8), 9))\n");
}

TEST(Streams, AreZoomedToTheBordersOfThePicture)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(Second);

    EXPECT_TRUE(desk.navigator.Zoom({WholePicture, WholePicture, 0}).IsDone());
    EXPECT_TRUE(desk.navigator.Zoom({{1919, 1079, 1, 1}, WholePicture, 0}).IsDone());
}

TEST(Streams, AreNotZoomedToRectanglesOutsideThePicture)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(Second);
    const std::string before = desk.Snapshot();
    const struct {
        bd::ZoomRectangleDef rectangle;
        const char* reason;
    } cases[] = {{{0, 0, 0, 0}, "a rectangle of 0x0 has no area"},
                 {{0, 0, 1, 0}, "a rectangle of 1x0 has no area"},
                 {{0, 0, 0, 1}, "a rectangle of 0x1 has no area"},
                 {{1919, 0, 2, 1}, "the rectangle extends to 1921,1, but the picture is 1920x1080"},
                 {{0, 1080, 1, 1}, "the rectangle extends to 1,1081, but the picture is 1920x1080"},
                 {{65535, 65535, 65535, 65535},
                  "the rectangle extends to 131070,131070, but the picture is 1920x1080"}};
    for (const auto& wrong : cases) {
        EXPECT_EQ(desk.navigator.Zoom({wrong.rectangle, WholePicture, 0}).Reason(), wrong.reason);
        EXPECT_EQ(desk.navigator.Zoom({WholePicture, wrong.rectangle, 0}).Reason(), wrong.reason);
    }
    EXPECT_EQ(desk.Take(), "");
    EXPECT_EQ(desk.Snapshot(), before);
}

/** A play item whose secondary streams come from a sub path of @p type. */
PlayList WithSecondaryStreamsOf(bd::SubPathType type)
{
    PlayItem item = Item(10);
    item.streams.secondaryVideo = {StreamOfSubPath(0x1B, 0)};
    item.streams.secondaryAudio = {StreamOfSubPath(CodingEac3Secondary, 0)};
    PlayList playList = ListOf({item, Item(10)});
    playList.subPaths.resize(1);
    playList.subPaths.front().type = static_cast<std::uint8_t>(type);
    return playList;
}

constexpr const char* Available = "0 PictureInPictureAvailable()\n"
                                  "0 SecondaryAudioAvailable()\n";
constexpr const char* Unavailable = "0 PictureInPictureUnavailable()\n"
                                    "0 SecondaryAudioUnavailable()\n";

TEST(SecondaryStreams, AreAnnouncedWithTheItemIfAsyncAndAfterItsStreamsIfSync)
{
    for (const bool inStep : {true, false}) {
        SCOPED_TRACE(inStep);
        TestDesk desk(WithSecondaryStreamsOf(inStep
                                                 ? bd::SubPathOutOfMuxSynchPipPresentationPath
                                                 : bd::SubPathOutOfMuxASynchPipPresentationPath));

        desk.navigator.Play();

        EXPECT_EQ(desk.Take(),
                  "0 PlayStarted()\n"
                  "0 Playlist(7)\n"
                  "0 PlayItem(7, 0, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n" +
                      std::string(inStep ? "" : Available) +
                      "0 VideoInfo(1)\n"
                      "0 AngleInfo(1)\n"
                      "0 SecondaryVideoInfo(1)\n"
                      "0 SecondaryVideoDisplay(1, false)\n"
                      "0 SecondaryAudioInfo(1)\n"
                      "0 SecondaryAudioDisplay(1, false)\n"
                      "0 AudioInfoChanged(false, (AudioFormatEac3Sec, AudioSampleRateUnknown, "
                      "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 0, 0))\n" +
                      (inStep ? Available : "") +
                      "0 UOMask(0)\n"
                      "0 FirstPictureDelivered()\n"
                      "0 CurrentTimePosition(0)\n");
    }
}

TEST(SecondaryStreams, AreAvailableOnlyAtNormalSpeed)
{
    for (const bd::SubPathType type : {bd::SubPathOutOfMuxSynchPipPresentationPath,
                                       bd::SubPathOutOfMuxASynchPipPresentationPath}) {
        SCOPED_TRACE(type);
        TestDesk desk(WithSecondaryStreamsOf(type));
        desk.Start();

        desk.navigator.SetPlayMode(Fast());
        EXPECT_EQ(desk.Take(),
                  std::string("0 PlayMode(PlayDirectionForward, PlaySpeedFast1)\n") + Unavailable);
        desk.navigator.SetPlayMode(bd::PlayMode());
        EXPECT_EQ(desk.Take(),
                  std::string("0 PlayMode(PlayDirectionForward, PlaySpeedNormal)\n") + Available);
    }
}

TEST(SecondaryStreams, AreAnnouncedUnavailableOnceInAnItemWithoutThem)
{
    for (const bd::SubPathType type : {bd::SubPathOutOfMuxSynchPipPresentationPath,
                                       bd::SubPathOutOfMuxASynchPipPresentationPath}) {
        SCOPED_TRACE(type);
        TestDesk desk(WithSecondaryStreamsOf(type));
        desk.Start();

        desk.navigator.Advance(10 * Second);

        EXPECT_EQ(desk.TakeWithoutPositions(),
                  "10 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
                  "10 PictureInPictureUnavailable()\n"
                  "10 SecondaryAudioUnavailable()\n"
                  "10 SecondaryVideoInfo(0)\n"
                  "10 SecondaryVideoDisplay(0, false)\n"
                  "10 SecondaryAudioInfo(0)\n"
                  "10 SecondaryAudioDisplay(0, false)\n");
    }
}

TEST(SecondaryStreams, ThatAreAsyncAreAnnouncedInANewItemAtAnySpeed)
{
    PlayList playList = WithSecondaryStreamsOf(bd::SubPathOutOfMuxASynchPipPresentationPath);
    std::swap(playList.playItems[0], playList.playItems[1]);
    TestDesk desk(playList);
    desk.Start();
    desk.navigator.SetPlayMode(Fast());
    desk.Take();

    desk.navigator.SearchTime(15 * Second);

    const std::string received = desk.Take();
    EXPECT_NE(received.find(Available), std::string::npos) << received;
    EXPECT_EQ(received.find("Unavailable"), std::string::npos) << received;
    desk.navigator.SetPlayMode(bd::PlayMode());
    EXPECT_EQ(desk.Take(),
              std::string("0 PlayMode(PlayDirectionForward, PlaySpeedNormal)\n") + Available);
}

TEST(SecondaryStreams, OfAMissingSubPathAreSync)
{
    PlayItem item = Item(10);
    item.streams.secondaryVideo = {StreamOfSubPath(0x1B, 3)};
    TestDesk desk(ListOf({item}));
    desk.Start();
    bd::StreamNumberDef number = 0;
    bd::UInt8 count = 0;
    bool async = true;

    desk.navigator.Context().GetSecondaryVideoInfo(&number, &count, &async);

    EXPECT_FALSE(async);
}

} // namespace

} // namespace deskplayer
