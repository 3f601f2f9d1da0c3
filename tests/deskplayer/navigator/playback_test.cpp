#include <gtest/gtest.h>

#include "../testdesk.h"

namespace deskplayer
{

namespace
{

TEST(Playback, AnnouncesEverythingAboutTheFirstItemAtTheStart)
{
    TestDesk desk(ListOf({RichItem(10)}, {Entry(0, Ticks(0))}));

    EXPECT_TRUE(desk.navigator.Play().IsDone());

    EXPECT_EQ(desk.Take(), "0 PlayStarted()\n"
                           "0 Playlist(7)\n"
                           "0 PlayItem(7, 0, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
                           "0 VideoInfo(1)\n"
                           "0 AudioInfo(1)\n"
                           "0 AngleInfo(1)\n"
                           "0 PresentationGraphicsInfo(1, true)\n"
                           "0 SecondaryVideoInfo(1)\n"
                           "0 SecondaryVideoDisplay(1, false)\n"
                           "0 SecondaryAudioInfo(1)\n"
                           "0 SecondaryAudioDisplay(1, false)\n"
                           "0 PipPgTextStInfo(1, false)\n"
                           "0 InteractiveGraphicsInfo(1)\n"
                           "0 AudioInfoChanged(true, (AudioFormatAc3, AudioSampleRateUnknown, "
                           "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 4352, 0))\n"
                           "0 AudioInfoChanged(false, (AudioFormatEac3Sec, AudioSampleRateUnknown, "
                           "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 6656, 0))\n"
                           "0 TextSubtitleStylesAvailable(4)\n"
                           "0 TextSubtitleStyleInfo(1)\n"
                           "0 PictureInPictureAvailable()\n"
                           "0 SecondaryAudioAvailable()\n"
                           "0 UOMask(0)\n"
                           "0 PopUpMenuAvailable()\n"
                           "0 FirstPictureDelivered()\n"
                           "0 MarkInfo(7, 0, 0)\n"
                           "0 ChapterNumber(1)\n"
                           "0 CurrentTimePosition(0)\n");
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Playing);
}

TEST(Playback, DoesNotAnnounceWhatThePlayListLacks)
{
    TestDesk desk(ListOf({Item(10)}));

    desk.navigator.Play();

    EXPECT_EQ(desk.Take(), "0 PlayStarted()\n"
                           "0 Playlist(7)\n"
                           "0 PlayItem(7, 0, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
                           "0 VideoInfo(1)\n"
                           "0 AngleInfo(1)\n"
                           "0 UOMask(0)\n"
                           "0 FirstPictureDelivered()\n"
                           "0 CurrentTimePosition(0)\n");
}

TEST(Playback, PlaysItsItemsInSequenceAndFinishes)
{
    TestDesk desk(ListOf({Item(2), Item(1)}));
    desk.Start();

    EXPECT_EQ(desk.navigator.Advance(5 * Second), 2 * Second);

    EXPECT_EQ(desk.Take(), "1 CurrentTimePosition(45000)\n"
                           "2 CurrentTimePosition(90000)\n"
                           "2 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
                           "3 CurrentTimePosition(135000)\n"
                           "3 Finished(EndOfMedia)\n");
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Finished);
    EXPECT_EQ(desk.clock.Now(), 3 * Second);
}

TEST(Playback, AnnouncesOnlyTheDifferencesAtTheNextItem)
{
    PlayItem other = Forbidding(RichItem(1), {bd::UserOperationStop});
    other.streams.primaryAudio.pop_back();
    other.streams.ig.clear();
    TestDesk desk(ListOf({RichItem(1), RichItem(1), other}));
    desk.Start();

    desk.navigator.Advance(2 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "2 PlayItem(7, 2, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "2 AudioInfo(1)\n"
              "2 InteractiveGraphicsInfo(0)\n"
              "2 UOMask(128)\n"
              "2 PopUpMenuUnavailable()\n");
}

TEST(Playback, AnnouncesThePositionEverySecond)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start();
    desk.Do(desk.navigator.SearchTime(Second / 2));

    desk.navigator.Advance(2 * Second);

    EXPECT_EQ(desk.Take(), "0+22500 CurrentTimePosition(45000)\n"
                           "1+22500 CurrentTimePosition(90000)\n");
}

TEST(Playback, AnnouncesMarksAndChaptersAtTheirPositions)
{
    TestDesk desk(ListOf({Item(2), Item(2)},
                         {Entry(0, Ticks(0)), Link(0, Ticks(100)), Entry(1, Ticks(100))}));
    desk.Start();

    desk.navigator.Advance(3 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "0+100 MarkInfo(7, 1, 100)\n"
              "2 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "2+100 MarkInfo(7, 2, 90100)\n"
              "2+100 ChapterNumber(2)\n");
}

TEST(Playback, AnnouncesMarksAtTheSamePositionInPlayListOrder)
{
    TestDesk desk(
        ListOf({Item(2)}, {Link(0, Ticks(100)), Entry(0, Ticks(100)), Link(0, Ticks(100))}));
    desk.Start();

    desk.navigator.Advance(Second / 2);

    EXPECT_EQ(desk.Take(), "0+100 MarkInfo(7, 0, 100)\n"
                           "0+100 MarkInfo(7, 1, 100)\n"
                           "0+100 MarkInfo(7, 2, 100)\n"
                           "0+100 ChapterNumber(1)\n");
}

TEST(Playback, AnnouncesTheMarkAtTheStartOfAnItemWithThatItem)
{
    TestDesk desk(ListOf({Item(1), Item(1)}, {Entry(1, Ticks(0))}));
    desk.Start();

    desk.navigator.Advance(Second);

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "1 MarkInfo(7, 0, 45000)\n"
              "1 ChapterNumber(1)\n");
}

TEST(Playback, StartsFromTheBeginningAfterAStopAndAnnouncesEverythingAgain)
{
    TestDesk desk(ListOf({Item(10)}, {Entry(0, Ticks(0))}));
    desk.navigator.Play();
    const std::string firstStart = desk.Take();
    desk.navigator.Advance(4 * Second);
    desk.Take();

    EXPECT_TRUE(desk.navigator.Stop().IsDone());
    EXPECT_EQ(desk.Take(), "4 Stopped()\n");
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Stopped);
    EXPECT_EQ(desk.navigator.Advance(Second), Second);
    EXPECT_EQ(desk.clock.Now(), 4 * Second);
    EXPECT_EQ(desk.navigator.TimeToNextChange(), std::nullopt);

    desk.navigator.Play();
    EXPECT_EQ(desk.navigator.Context().GetCurrentTimePosition(), 0);
    std::string secondStart = firstStart;
    for (std::size_t at = 0; at < secondStart.size(); at = secondStart.find('\n', at) + 1) {
        secondStart[at] = '4';
    }
    EXPECT_EQ(desk.Take(), secondStart);
}

TEST(Playback, StartsAtNormalSpeedWithoutRepeatAndWithTheSelectedStreams)
{
    TestDesk desk(ListOf({RichItem(10)}, {Entry(0, Ticks(0))}));
    desk.Start();
    desk.Do(desk.navigator.SelectAudio(2));
    desk.Do(desk.navigator.RepeatTitle());
    desk.Do(desk.navigator.Zoom({{1, 2, 3, 4}, {5, 6, 7, 8}, 9}));
    desk.Do(desk.navigator.SetPlayMode(bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedFast3)));
    desk.Do(desk.navigator.Stop());

    desk.Start();

    EXPECT_EQ(desk.navigator.Context().GetCurrentPlayMode(), bd::PlayMode());
    EXPECT_EQ(desk.navigator.Context().GetPlayMode(), bd::PlayMode());
    EXPECT_FALSE(desk.navigator.IsRepeating());
    bd::ZOOM_PARAM_Def zoom = {{1, 1, 1, 1}, {1, 1, 1, 1}, 1};
    desk.navigator.Context().GetZoomScaleInfo(zoom);
    EXPECT_EQ(zoom.rClipRectangle.Width, 0);
    bd::StreamNumberDef audio = 0;
    bd::UInt8 count = 0;
    desk.navigator.Context().GetAudioInfo(&audio, &count);
    EXPECT_EQ(audio, 2);
}

TEST(Playback, FinishesAtOnceWhenThereIsNothingToPlay)
{
    TestDesk desk(ListOf({}));

    EXPECT_TRUE(desk.navigator.Play().IsDone());

    EXPECT_EQ(desk.Take(), "0 PlayStarted()\n"
                           "0 Playlist(7)\n"
                           "0 Finished(EndOfMedia)\n");
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Finished);
    EXPECT_EQ(desk.navigator.Advance(Second), Second);
}

TEST(Playback, FailsToStartOnceOnRequest)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.navigator.FailNextPlay();

    EXPECT_TRUE(desk.navigator.Play().IsDone());
    EXPECT_EQ(desk.Take(), "0 PlayFailed()\n");
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Stopped);

    desk.Start();
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Playing);
}

TEST(Playback, HoldsItsPositionWhilePaused)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(4 * Second);

    EXPECT_TRUE(desk.navigator.Pause().IsDone());
    EXPECT_EQ(desk.navigator.TimeToNextChange(), std::nullopt);
    EXPECT_EQ(desk.navigator.Advance(100 * Second), Ticks(0));
    EXPECT_TRUE(desk.navigator.Continue().IsDone());

    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 4 * Second);
    EXPECT_EQ(desk.Take(), "4 Paused()\n"
                           "104 Continued(PlayDirectionForward, PlaySpeedNormal)\n");
}

TEST(Playback, StepsByOnePictureInTheDirectionOfPlay)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(Second);
    desk.Do(desk.navigator.Pause());

    EXPECT_TRUE(desk.navigator.Step().IsDone());
    EXPECT_TRUE(desk.navigator.Step().IsDone());
    desk.navigator.SetPlayMode(bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedNormal));
    EXPECT_TRUE(desk.navigator.Step().IsDone());

    EXPECT_EQ(desk.Take(), "1 Stepped(45900, PlayDirectionForward)\n"
                           "1 Stepped(46800, PlayDirectionForward)\n"
                           "1 Stepped(45900, PlayDirectionBackward)\n");
}

TEST(Playback, StepsByTheDurationOfAPicture)
{
    const struct {
        std::uint8_t frameRate;
        std::uint64_t ticks;
    } rates[] = {{1, 1877}, {2, 1875}, {3, 1800}, {4, 1502}, {6, 900}, {7, 751}, {0, 1800}};
    for (const auto& rate : rates) {
        SCOPED_TRACE(+rate.frameRate);
        PlayItem item = Item(10);
        item.streams.primaryVideo.front().attributes.frameRate = rate.frameRate;
        TestDesk desk(ListOf({item}));
        desk.Start();
        desk.Do(desk.navigator.Pause());

        desk.Do(desk.navigator.Step());

        EXPECT_EQ(desk.navigator.Context().GetCurrentTimePosition(), rate.ticks);
    }
}

TEST(Playback, AnnouncesEverythingThatAStepPasses)
{
    TestDesk desk(
        ListOf({Item(10)}, {Entry(0, Ticks(0)), Entry(0, Second - Ticks(500)),
                            Link(0, Second - Ticks(300)), Entry(0, Second + Ticks(400))}));
    desk.Start(Second - Ticks(500));
    desk.Do(desk.navigator.SearchTime(Second - Ticks(501)));
    desk.Do(desk.navigator.SetTrigger(Second + Ticks(100)));
    desk.Do(desk.navigator.Pause());

    EXPECT_TRUE(desk.navigator.Step().IsDone());
    EXPECT_EQ(desk.Take(), "0+44500 MarkInfo(7, 1, 44500)\n"
                           "0+44500 ChapterNumber(2)\n"
                           "0+44500 MarkInfo(7, 2, 44700)\n"
                           "0+44500 CurrentTimePosition(45000)\n"
                           "0+44500 TriggerTimeReached(TRIGGER_NOTIFY_FROM_CURPOS, 45100)\n"
                           "0+44500 Stepped(45399, PlayDirectionForward)\n");

    EXPECT_TRUE(desk.navigator.Step().IsDone());
    EXPECT_EQ(desk.Take(), "0+44500 MarkInfo(7, 3, 45400)\n"
                           "0+44500 ChapterNumber(3)\n"
                           "0+44500 Stepped(46299, PlayDirectionForward)\n");

    desk.navigator.SetPlayMode(bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedNormal));
    EXPECT_TRUE(desk.navigator.Step().IsDone());
    EXPECT_EQ(desk.Take(), "0+44500 MarkInfo(7, 3, 45400)\n"
                           "0+44500 ChapterNumber(2)\n"
                           "0+44500 Stepped(45399, PlayDirectionBackward)\n");
}

TEST(Playback, AnnouncesMarksAndChaptersWhereAStepEnds)
{
    TestDesk desk(ListOf({Item(10)}, {Entry(0, Ticks(0)), Entry(0, Ticks(900))}));
    desk.Start();
    desk.Do(desk.navigator.Pause());

    EXPECT_TRUE(desk.navigator.Step().IsDone());

    EXPECT_EQ(desk.Take(), "0 MarkInfo(7, 1, 900)\n"
                           "0 ChapterNumber(2)\n"
                           "0 Stepped(900, PlayDirectionForward)\n");
}

TEST(Playback, StepsFromTheEndOfARepeatToItsStart)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(Second + Ticks(1));
    desk.Do(desk.navigator.SetPointA());
    desk.navigator.Advance(Ticks(1000));
    desk.Do(desk.navigator.SetPointB());
    desk.navigator.Advance(Ticks(500));
    desk.Do(desk.navigator.Pause());

    EXPECT_TRUE(desk.navigator.Step().IsDone());

    EXPECT_EQ(desk.Take(), "1+1501 TriggerTimeReached(TRIGGER_B, 46001)\n"
                           "1+1501 JumpOccurred()\n"
                           "1+1501 CurrentTimePosition(45001)\n"
                           "1+1501 Stepped(45001, PlayDirectionForward)\n");
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Paused);
}

TEST(Playback, StepsBackToTheStartAndKeepsItsDirection)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(Ticks(900));
    desk.Do(desk.navigator.Pause());
    desk.Do(
        desk.navigator.SetPlayMode(bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedNormal)));

    EXPECT_TRUE(desk.navigator.Step().IsDone());

    EXPECT_EQ(desk.Take(), "0+900 CurrentTimePosition(0)\n"
                           "0+900 Stepped(0, PlayDirectionBackward)\n");
    EXPECT_FALSE(desk.navigator.Step().IsDone());
}

TEST(Playback, StepsIntoTheNextItem)
{
    TestDesk desk(ListOf({Item(1), Item(0), Item(1)}, {Entry(0, Ticks(0)), Entry(2, Ticks(0))}));
    desk.Start(Second - Ticks(900));
    desk.Do(desk.navigator.Pause());

    EXPECT_TRUE(desk.navigator.Step().IsDone());

    EXPECT_EQ(desk.Take(), "0+44100 CurrentTimePosition(45000)\n"
                           "0+44100 PlayItem(7, 1, VideoFormatType1080p, "
                           "VideoAspectRatioTypeNoInfo)\n"
                           "0+44100 PlayItem(7, 2, VideoFormatType1080p, "
                           "VideoAspectRatioTypeNoInfo)\n"
                           "0+44100 MarkInfo(7, 1, 45000)\n"
                           "0+44100 ChapterNumber(2)\n"
                           "0+44100 Stepped(45000, PlayDirectionForward)\n");
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Paused);
}

TEST(Playback, StepsToTheStartOfTheNextItemFromTheMiddleOfTheLastPicture)
{
    TestDesk desk(ListOf({Item(1), Item(1)}));
    desk.Start(Second - Ticks(10));
    desk.Do(desk.navigator.Pause());

    EXPECT_TRUE(desk.navigator.Step().IsDone());

    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), Second);
    EXPECT_EQ(desk.navigator.Context().GetPlayItemId(), 1);
}

TEST(Playback, StepsBackToTheLastPictureOfThePreviousItem)
{
    PlayItem first = Item(1);
    first.streams.primaryVideo.front().attributes.frameRate = 2; // 1875 ticks a picture
    TestDesk desk(ListOf({first, Item(0), Item(1)}));
    for (const Ticks position : {Second, Second + Ticks(899)}) {
        desk.Start();
        desk.Do(desk.navigator.Pause());
        desk.Do(desk.navigator.SetPlayMode(
            bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedNormal)));
        desk.Do(desk.navigator.SearchTime(position));

        EXPECT_TRUE(desk.navigator.Step().IsDone());

        EXPECT_EQ(desk.navigator.Context().GetPlayItemId(), 0);
        EXPECT_EQ(desk.navigator.Context().GetCurrentTimePosition(), 45000U - 1875U);
        desk.Do(desk.navigator.Stop());
    }
}

TEST(Playback, RefusesToStepWhereNoPictureFollows)
{
    struct {
        PlayList playList;
        Ticks position;
        bd::PlayDirectionDef direction;
        const char* reason;
    } const cases[] = {
        {ListOf({Item(1)}), Second - Ticks(900), bd::PlayDirectionForward,
         "no further picture before a still or the end"},
        {ListOf({Item(1), Item(0)}), Second - Ticks(900), bd::PlayDirectionForward,
         "no further picture before a still or the end"},
        {ListOf({WithTimedStill(Item(1), 5), Item(1)}), Second - Ticks(900),
         bd::PlayDirectionForward, "no further picture before a still or the end"},
        {ListOf({Item(1), WithTimedStill(Item(0), 5), Item(1)}), Second - Ticks(900),
         bd::PlayDirectionForward, "no further picture before a still or the end"},
        {ListOf({Item(1)}), Ticks(0), bd::PlayDirectionBackward, "this is the first picture"},
        {ListOf({Item(1)}), Ticks(899), bd::PlayDirectionBackward, "this is the first picture"}};
    for (const auto& item : cases) {
        TestDesk desk(item.playList);
        desk.Start();
        desk.Do(desk.navigator.Pause());
        desk.Do(desk.navigator.SetPlayMode(bd::PlayMode(item.direction, bd::PlaySpeedNormal)));
        desk.Do(desk.navigator.SearchTime(item.position));
        const std::string before = desk.Snapshot();

        EXPECT_EQ(desk.navigator.Step().Reason(), item.reason);
        EXPECT_EQ(desk.Take(), "");
        EXPECT_EQ(desk.Snapshot(), before);
    }
}

TEST(Playback, StepsFromTheLastPictureToTheStartOfARepeatedTitle)
{
    TestDesk desk(ListOf({Item(1), Item(1)}));
    desk.Start(2 * Second - Ticks(900));
    desk.Do(desk.navigator.Pause());
    desk.Do(desk.navigator.RepeatTitle());

    EXPECT_TRUE(desk.navigator.Step().IsDone());

    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), Ticks(0));
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Paused);
}

TEST(Playback, RefusesToStepInARepeatedTitleWithoutLength)
{
    TestDesk desk(ListOf({Item(0), Item(0)}));
    desk.Start();
    desk.Do(desk.navigator.Pause());
    desk.Do(desk.navigator.RepeatTitle());

    EXPECT_FALSE(desk.navigator.Step().IsDone());
}

TEST(Playback, StepsFromTheLastPictureOfARepeatedChapterThatEndsInAStill)
{
    TestDesk desk(ListOf({WithEndlessStill(Item(1))}, {Entry(0, Second / 2)}));
    desk.Start(Second - Ticks(900));
    desk.Do(desk.navigator.Pause());
    desk.Do(desk.navigator.RepeatChapter());

    EXPECT_TRUE(desk.navigator.Step().IsDone());

    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), Second / 2);
}

TEST(Playback, LeavesATimedStillAfterItsTime)
{
    TestDesk desk(ListOf({WithTimedStill(Item(1), 5), Item(1)}));
    desk.Start();

    EXPECT_EQ(desk.navigator.Advance(10 * Second), 3 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1 StillOn()\n"
              "6 StillOff()\n"
              "6 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "7 Finished(EndOfMedia)\n");
}

TEST(Playback, MeasuresATimedStillInSessionTimeAtAnySpeed)
{
    TestDesk desk(ListOf({WithTimedStill(Item(4), 5)}));
    desk.Start();
    desk.Do(desk.navigator.SetPlayMode(bd::PlayMode(bd::PlayDirectionForward, bd::PlaySpeedFast2)));

    desk.navigator.Advance(Second);
    EXPECT_EQ(desk.navigator.TimeToNextChange(), 5 * Second);
    desk.navigator.Advance(2 * Second);
    EXPECT_EQ(desk.navigator.TimeToNextChange(), 3 * Second);
    desk.navigator.Advance(10 * Second);

    EXPECT_EQ(desk.TakeWithoutPositions(), "1 StillOn()\n"
                                           "6 StillOff()\n"
                                           "6 Finished(EndOfMedia)\n");
}

TEST(Playback, HoldsAnEndlessStillUntilItIsEnded)
{
    TestDesk desk(ListOf({WithEndlessStill(Item(1)), Item(1)}));
    desk.Start();

    EXPECT_EQ(desk.navigator.Advance(1000 * Second), Ticks(0));
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Still);
    EXPECT_EQ(desk.navigator.TimeToNextChange(), std::nullopt);
    EXPECT_TRUE(desk.navigator.EndStill().IsDone());

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "1 StillOn()\n"
              "1000 StillOff()\n"
              "1000 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n");
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Playing);
}

TEST(Playback, EndsATimedStillEarly)
{
    TestDesk desk(ListOf({WithTimedStill(Item(1), 5), Item(1)}));
    desk.Start(2 * Second);

    EXPECT_TRUE(desk.navigator.EndStill().IsDone());
    desk.navigator.Advance(Second);

    EXPECT_EQ(desk.TakeWithoutPositions(),
              "2 StillOff()\n"
              "2 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
              "3 Finished(EndOfMedia)\n");
}

TEST(Playback, LeavesAStillByProgramEvenIfTheMaskForbidsIt)
{
    TestDesk desk(
        ListOf({Forbidding(WithEndlessStill(Item(1)), {bd::UserOperationStillOff}), Item(1)}));
    desk.Start(Second);

    desk.navigator.LeaveStill();

    EXPECT_EQ(desk.Take(), "1 StillOff()\n"
                           "1 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
                           "1 UOMask(0)\n");
}

TEST(Playback, IgnoresLeavingAStillWhilePlaying)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start(Second);
    const std::string before = desk.Snapshot();

    desk.navigator.LeaveStill();

    EXPECT_EQ(desk.Take(), "");
    EXPECT_EQ(desk.Snapshot(), before);
}

TEST(Playback, ResumesAfterASuspendAtTheSamePosition)
{
    TestDesk desk(ListOf({WithTimedStill(Item(3), 5)}));
    desk.Start(2 * Second);

    EXPECT_TRUE(desk.navigator.Suspend().IsDone());
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Suspended);
    EXPECT_EQ(desk.navigator.TimeToNextChange(), std::nullopt);
    EXPECT_EQ(desk.navigator.Advance(60 * Second), Ticks(0));
    EXPECT_TRUE(desk.navigator.Resume().IsDone());

    EXPECT_EQ(desk.Take(), "2 Suspended()\n"
                           "62 Resumed()\n");
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Playing);
    EXPECT_EQ(Ticks(desk.navigator.Context().GetCurrentTimePosition()), 2 * Second);
}

TEST(Playback, ResumesIntoAPauseOrAStillAfterASuspend)
{
    TestDesk desk(ListOf({WithTimedStill(Item(3), 5)}));
    desk.Start();
    desk.Do(desk.navigator.Pause());
    desk.Do(desk.navigator.Suspend());
    desk.Do(desk.navigator.Resume());
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Paused);

    desk.Do(desk.navigator.Continue());
    desk.navigator.Advance(4 * Second);
    desk.Do(desk.navigator.Suspend());
    desk.navigator.Advance(100 * Second);
    desk.Do(desk.navigator.Resume());
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Still);
    EXPECT_EQ(desk.navigator.TimeToNextChange(), 4 * Second);
}

TEST(Playback, StopsAndClosesTheMenuWhenTheResumeFails)
{
    TestDesk desk(ListOf({RichItem(10)}, {Entry(0, Ticks(0))}));
    desk.navigator.FailNextResume();
    desk.Start();
    desk.Do(desk.navigator.OpenPopUpMenu());
    desk.Do(desk.navigator.Suspend());

    EXPECT_TRUE(desk.navigator.Resume().IsDone());
    EXPECT_EQ(desk.Take(), "0 InteractiveGraphicsInvisible()\n"
                           "0 InteractiveGraphicsInactive()\n"
                           "0 ResumeFailed()\n");
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Stopped);

    desk.Start();
    desk.Do(desk.navigator.OpenPopUpMenu());
    desk.Do(desk.navigator.Suspend());
    desk.Do(desk.navigator.Resume());
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Playing);
}

TEST(Playback, ContinuesAfterAFailedPreload)
{
    TestDesk desk(ListOf({Item(10)}));
    desk.Start();
    const std::string before = desk.Snapshot();

    EXPECT_TRUE(desk.navigator.FailPreload().IsDone());

    EXPECT_EQ(desk.Take(), "0 PreloadFailed()\n");
    EXPECT_EQ(desk.Snapshot(), before);
}

TEST(Playback, FinishesAndClosesTheMenuOnDataStarvation)
{
    TestDesk desk(ListOf({RichItem(10)}, {Entry(0, Ticks(0))}));
    desk.Start(Second);
    desk.Do(desk.navigator.OpenPopUpMenu());

    EXPECT_TRUE(desk.navigator.Starve().IsDone());

    EXPECT_EQ(desk.Take(), "1 InteractiveGraphicsInvisible()\n"
                           "1 InteractiveGraphicsInactive()\n"
                           "1 Finished(DataStarvation)\n");
    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Finished);
    EXPECT_EQ(desk.navigator.Context().GetFinishedReason(),
              bdstreaming::FinishedReasonDataStarvation);
}

TEST(Playback, FinishesAtTheEndOfMediaAfterAnEarlierStarvation)
{
    TestDesk desk(ListOf({Item(1)}));
    desk.Start();
    desk.Do(desk.navigator.Starve());

    desk.Start();
    desk.navigator.Advance(Second);

    EXPECT_EQ(desk.TakeWithoutPositions(), "1 Finished(EndOfMedia)\n");
}

TEST(Playback, RethrowsTheExceptionOfAListener)
{
    class Thrower : public bdmv::NavigatorListenerAdapter
    {
        void Paused() override { throw std::runtime_error("paused"); }
    };
    TestDesk desk(ListOf({Item(1)}));
    Thrower thrower;
    desk.Start();
    desk.desk.Listeners().AddListener(&thrower);

    EXPECT_THROW(desk.navigator.Pause(), std::runtime_error);

    desk.desk.Listeners().RemoveListener(&thrower);
}

} // namespace

} // namespace deskplayer
