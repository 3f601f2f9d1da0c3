#include "navigator/playbackcontext.h"

#include <gtest/gtest.h>

#include "../testdesk.h"
#include "bd/constants.h"
#include "navigator/buttonprogram.h"

namespace deskplayer
{

namespace
{

/** The selected stream and the number of streams of its kind. */
typedef std::pair<int, int> NumberAndCount;
typedef void (PlaybackContext::*StreamQuery)(bd::StreamNumberDef*, bd::UInt8*);

NumberAndCount Ask(PlaybackContext& context, StreamQuery query)
{
    bd::StreamNumberDef number = 99;
    bd::UInt8 count = 99;
    (context.*query)(&number, &count);
    return {number, count};
}

/** Two rich items with an aspect ratio and one without streams, with marks. */
LoadedPlayList ThreeItems()
{
    PlayItem poor = Item(10);
    poor.streams.primaryVideo.clear();
    LoadedPlayList loaded =
        LayOut(800, ListOf({RichItem(10), RichItem(10), poor},
                           {Entry(0, Ticks(0)), Link(0, Ticks(5)), Entry(1, Ticks(0))}));
    loaded.aspectRatios[0] = 2;
    return loaded;
}

class PlaybackContextQueries : public testing::Test
{
protected:
    const LoadedPlayList playList = ThreeItems();
    PlaybackState state;
    Playhead playhead{playList, state};
    PlaybackContext context{playhead, state};
};

TEST_F(PlaybackContextQueries, HasTheResumeDataUntilItIsCleanedUp)
{
    EXPECT_EQ(context.GetSystemResumeData().size, 0);

    context.StoreSystemResumeData({1, 2, 3});
    ASSERT_EQ(context.GetSystemResumeData().size, 3);
    EXPECT_EQ(context.GetSystemResumeData().pData[2], 3);

    context.CleanupSystemResumeData();
    EXPECT_EQ(context.GetSystemResumeData().size, 0);
}

TEST_F(PlaybackContextQueries, ReportsWhetherItPlaysAfterAResume)
{
    EXPECT_FALSE(context.IsPlayingAfterSystemResume());
    state.playingAfterSystemResume = true;
    EXPECT_TRUE(context.IsPlayingAfterSystemResume());
}

TEST_F(PlaybackContextQueries, NumbersPlayListAndPlayItem)
{
    EXPECT_EQ(context.GetPlayListId(), 800);
    EXPECT_EQ(context.GetPlayItemId(), 0);
    state.item = 2;
    EXPECT_EQ(context.GetPlayItemId(), 2);
}

TEST_F(PlaybackContextQueries, DistinguishesTheRequestedPlayModeFromTheCurrentOne)
{
    state.playMode = bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast1);

    EXPECT_EQ(context.GetPlayMode(), state.playMode);
    EXPECT_EQ(context.GetCurrentPlayMode(), bd::PlayMode());
}

TEST_F(PlaybackContextQueries, ReportsTheTriggerAndWhenItWasReached)
{
    EXPECT_EQ(context.GetTrigger().triggerType, bd::TRIGGER_NONE);
    state.trigger = bd::TRIGGER_CHP;
    state.triggerReachedTime = Ticks(0x100000000);

    EXPECT_EQ(context.GetTrigger().triggerType, bd::TRIGGER_CHP);
    EXPECT_EQ(context.GetTriggerReachedTime(), 0x100000000);
}

TEST_F(PlaybackContextQueries, ReportsTheRepeatStates)
{
    EXPECT_EQ(context.GetCurrentABRepeatState(), bd::TRIGGER_AB_NONE);
    EXPECT_EQ(context.GetCurrentChpTitleRepeatState(), bd::TRIGGER_NONE);

    state.pointA = Ticks(5);
    EXPECT_EQ(context.GetCurrentABRepeatState(), bd::TRIGGER_A);
    state.pointB = Ticks(10);
    EXPECT_EQ(context.GetCurrentABRepeatState(), bd::TRIGGER_B);
    state.chapterTitleRepeat = bd::TRIGGER_TITLE;
    EXPECT_EQ(context.GetCurrentChpTitleRepeatState(), bd::TRIGGER_TITLE);
}

TEST_F(PlaybackContextQueries, ReportsTheTriggerAtATime)
{
    EXPECT_EQ(context.GetTriggerTypeByTime(0), bd::TRIGGER_INVALID);
    state.pointA = Ticks(5);
    state.pointB = Ticks(10);
    state.notifyAt = Ticks(20);
    EXPECT_EQ(context.GetTriggerTypeByTime(5), bd::TRIGGER_INVALID);
    EXPECT_EQ(context.GetTriggerTypeByTime(10), bd::TRIGGER_B);
    EXPECT_EQ(context.GetTriggerTypeByTime(20), bd::TRIGGER_NOTIFY_FROM_CURPOS);
    EXPECT_EQ(context.GetTriggerTypeByTime(21), bd::TRIGGER_INVALID);
    state.notifyAt = Ticks(10);
    EXPECT_EQ(context.GetTriggerTypeByTime(10), bd::TRIGGER_B);
    state.triggerReachedTime = Ticks(10);
    state.triggerReached = bd::TRIGGER_NOTIFY_FROM_CURPOS;
    EXPECT_EQ(context.GetTriggerTypeByTime(10), bd::TRIGGER_NOTIFY_FROM_CURPOS);
    EXPECT_EQ(context.GetTriggerTypeByTime(20), bd::TRIGGER_INVALID);
}

TEST_F(PlaybackContextQueries, ReportsTheChapterAtThePosition)
{
    EXPECT_EQ(context.GetCurrentChapter(), 1);
    state.position = 10 * Second - Ticks(1);
    EXPECT_EQ(context.GetCurrentChapter(), 1);
    state.position = 10 * Second;
    EXPECT_EQ(context.GetCurrentChapter(), 1) << "at the end of the play item";
    state.item = 1;
    EXPECT_EQ(context.GetCurrentChapter(), 2);
    state.position = 30 * Second;
    EXPECT_EQ(context.GetCurrentChapter(), 2);
}

TEST_F(PlaybackContextQueries, ReportsTheMarkThatWasPassedLast)
{
    bd::TimePosition time = bd::TimePositionNone;
    EXPECT_EQ(context.GetCurrentPLMarkId(time), 0);
    EXPECT_EQ(time, bd::TimePositionNone) << "no mark, no time";

    state.mark = 2;
    EXPECT_EQ(context.GetCurrentPLMarkId(time), 2);
    EXPECT_EQ(Ticks(time), 10 * Second);
}

TEST_F(PlaybackContextQueries, ReportsStreamsAndTheirCount)
{
    const StreamQuery queries[] = {&PlaybackContext::GetVideoInfo,
                                   &PlaybackContext::GetAudioInfo,
                                   &PlaybackContext::GetIgInfo,
                                   &PlaybackContext::GetPgTextStInfo,
                                   &PlaybackContext::GetSecondaryAudioInfo,
                                   &PlaybackContext::GetPipPgTextStInfo};
    bd::StreamNumberDef StreamSelection::*const fields[] = {
        &StreamSelection::video, &StreamSelection::audio,          &StreamSelection::ig,
        &StreamSelection::pg,    &StreamSelection::secondaryAudio, &StreamSelection::pipPg};
    for (std::size_t i = 0; i < std::size(queries); ++i) {
        SCOPED_TRACE(i);
        const int count = i == 0 ? 1 : 2; // only one video stream
        state = PlaybackState();
        EXPECT_EQ(Ask(context, queries[i]), NumberAndCount(1, count));
        state.selection.*fields[i] = 2;
        EXPECT_EQ(Ask(context, queries[i]), NumberAndCount(count, count));
        state.selection.*fields[i] = 3;
        EXPECT_EQ(Ask(context, queries[i]), NumberAndCount(count, count)) << "the last one instead";
        state.item = 2;
        EXPECT_EQ(Ask(context, queries[i]), NumberAndCount(0, 0));
    }
}

TEST_F(PlaybackContextQueries, ReportsSubtitlesWithAResult)
{
    bd::StreamNumberDef number = 99;
    bd::UInt8 count = 99;
    state.selection.pg = 2;
    EXPECT_EQ(context.rGetPgTextStInfo(&number, &count), bdmv::INavError::ErrOk);
    EXPECT_EQ(number, 2);
    EXPECT_EQ(count, 2);
}

TEST_F(PlaybackContextQueries, ReportsSecondaryVideoAndWhetherItIsAsync)
{
    bd::StreamNumberDef number = 99;
    bd::UInt8 count = 99;
    bool async = true;
    context.GetSecondaryVideoInfo(&number, &count, &async);
    EXPECT_EQ(number, 1);
    EXPECT_EQ(count, 2);
    EXPECT_FALSE(async);

    state.item = 2;
    async = true;
    context.GetSecondaryVideoInfo(&number, &count, &async);
    EXPECT_EQ(number, 0);
    EXPECT_EQ(count, 0);
    EXPECT_FALSE(async);
}

TEST_F(PlaybackContextQueries, ReportsAtLeastOneAngle)
{
    bd::AngleNumberDef number = 99;
    bd::UInt8 count = 99;
    state.selection.angle = 2;
    context.GetAngleInfo(&number, &count);
    EXPECT_EQ(number, 2);
    EXPECT_EQ(count, 2);

    state.item = 2;
    context.GetAngleInfo(&number, &count);
    EXPECT_EQ(number, 1);
    EXPECT_EQ(count, 1);
}

TEST_F(PlaybackContextQueries, ReportsVideoFormatAndAspectRatioAsOnTheDisc)
{
    bd::VideoFormatType format = bd::VideoFormatType480i;
    bd::VideoAspectRatioType ratio = bd::VideoAspectRatioType16x9;
    context.GetVideoAttributes(format, ratio);
    EXPECT_EQ(format, bd::VideoFormatType1080p);
    EXPECT_EQ(ratio, bd::VideoAspectRatioType4x3);

    state.item = 1;
    context.GetVideoAttributes(format, ratio);
    EXPECT_EQ(format, bd::VideoFormatType1080p);
    EXPECT_EQ(ratio, bd::VideoAspectRatioTypeNoInfo) << "not in any clip information";

    state.item = 2;
    context.GetVideoAttributes(format, ratio);
    EXPECT_EQ(format, bd::VideoFormatTypeNoInfo) << "no video stream";
    EXPECT_EQ(ratio, bd::VideoAspectRatioTypeNoInfo);
}

TEST_F(PlaybackContextQueries, ReportsWhichStreamsAreShown)
{
    EXPECT_TRUE(context.GetPgTextStDisplay());
    EXPECT_FALSE(context.GetSecondaryVideoDisplay());
    EXPECT_FALSE(context.GetSecondaryAudioDisplay());
    EXPECT_FALSE(context.GetPipPgTextStSelect());

    state.selection.pgShown = false;
    EXPECT_FALSE(context.GetPgTextStDisplay());
    state.selection.secondaryVideoShown = true;
    EXPECT_TRUE(context.GetSecondaryVideoDisplay());
    EXPECT_FALSE(context.GetSecondaryAudioDisplay());
    state.selection.secondaryAudioShown = true;
    EXPECT_TRUE(context.GetSecondaryAudioDisplay());
    EXPECT_FALSE(context.GetPipPgTextStSelect());
    state.selection.pipPgPicked = true;
    EXPECT_TRUE(context.GetPipPgTextStSelect());
}

TEST(PlaybackContext, CombinesTheMasksOfPlayListAndItem)
{
    PlayList playList = ListOf({Forbidding(Item(10), {bd::UserOperationStop}), Item(10)});
    playList.applicationInfo.uoMask = MaskOf({bd::UserOperationPauseOn});
    const LoadedPlayList loaded = LayOut(1, playList);
    PlaybackState state;
    const Playhead playhead(loaded, state);
    PlaybackContext context(playhead, state);
    bdmv::UOMaskTable mask;

    context.GetUOMask(mask);
    EXPECT_EQ(mask, bdmv::UOMaskTable(MaskOf({bd::UserOperationStop, bd::UserOperationPauseOn})));

    state.item = 1;
    context.GetUOMask(mask);
    EXPECT_EQ(mask, bdmv::UOMaskTable(MaskOf({bd::UserOperationPauseOn})));
}

TEST_F(PlaybackContextQueries, ReportsThePosition)
{
    state.position = Ticks(0x100000000);
    EXPECT_EQ(context.GetCurrentTimePosition(), 0x100000000);
}

TEST_F(PlaybackContextQueries, SharesTheProgramOfTheButton)
{
    bdmv::IProgramData::RefPtr program;
    bd::UInt32 ticket = 99;
    bd::ButtonId button = 99;
    context.GetExecuteButtonData(program, ticket, button);
    EXPECT_FALSE(program);
    EXPECT_EQ(ticket, 0);
    EXPECT_EQ(button, 0);

    state.button = {new ButtonProgram({}), 5, 6};
    context.GetExecuteButtonData(program, ticket, button);
    EXPECT_EQ(program.GetCount(), 2);
    EXPECT_EQ(ticket, 5);
    EXPECT_EQ(button, 6);
}

TEST_F(PlaybackContextQueries, ReportsTheStyleAndTheNumberOfStyles)
{
    state.selection.style = 3;
    EXPECT_EQ(context.GetCurrentTextSubtitleStyleNumber(), 3);
    EXPECT_EQ(context.GetNumberOfTextSubtitleStyles(), 4);
    state.item = 2;
    EXPECT_EQ(context.GetNumberOfTextSubtitleStyles(), 0);
}

TEST_F(PlaybackContextQueries, ReportsTheReasonWhyPlaybackFinished)
{
    EXPECT_EQ(context.GetFinishedReason(), bdstreaming::FinishedReasonEndOfMedia);
    state.finishedReason = bdstreaming::FinishedReasonDataStarvation;
    EXPECT_EQ(context.GetFinishedReason(), bdstreaming::FinishedReasonDataStarvation);
}

TEST_F(PlaybackContextQueries, ReportsTheZoom)
{
    state.zoom = {{1, 2, 3, 4}, {5, 6, 7, 8}, 9};
    bd::ZOOM_PARAM_Def zoom = {};
    context.GetZoomScaleInfo(zoom);
    EXPECT_EQ(zoom.rClipRectangle.Height, 4);
    EXPECT_EQ(zoom.rDestRectangle.X, 5);
    EXPECT_EQ(zoom.u4Delay, 9);
}

/** The results of IsAsyncPipInCurrentPlayItem(), in the order of its parameters. */
std::vector<bool> AsyncFlagsOf(PlaybackContext& context)
{
    bool video = true;
    bool audio = true;
    bool previousVideo = true;
    bool previousAudio = true;
    context.IsAsyncPipInCurrentPlayItem(video, audio, previousVideo, previousAudio);
    return {video, audio, previousVideo, previousAudio};
}

TEST(PlaybackContext, ReportsAsyncSecondaryStreams)
{
    PlayItem onItsOwn = Item(1);
    onItsOwn.streams.secondaryVideo = {StreamOf(0x1B), StreamOfSubPath(0x1B, 0)};
    PlayItem inStep = Item(1);
    inStep.streams.secondaryVideo = {StreamOf(0x1B), StreamOfSubPath(0x1B, 1)};
    inStep.streams.secondaryAudio = {StreamOfSubPath(CodingEac3Secondary, 0)};
    PlayList playList = ListOf({onItsOwn, inStep, Item(1)});
    playList.subPaths.resize(2);
    playList.subPaths[0].type = bd::SubPathOutOfMuxASynchPipPresentationPath;
    playList.subPaths[1].type = bd::SubPathOutOfMuxSynchPipPresentationPath;
    const LoadedPlayList loaded = LayOut(1, playList);
    PlaybackState state;
    const Playhead playhead(loaded, state);
    PlaybackContext context(playhead, state);

    EXPECT_EQ(AsyncFlagsOf(context), (std::vector<bool>{true, false, false, false}));

    state.item = 1;
    state.previousItem = 0;
    EXPECT_EQ(AsyncFlagsOf(context), (std::vector<bool>{false, true, false, false}));

    state.item = 2;
    state.previousItem = 1;
    EXPECT_EQ(AsyncFlagsOf(context), (std::vector<bool>{false, false, true, true}));

    state.previousItem = 0;
    EXPECT_EQ(AsyncFlagsOf(context), (std::vector<bool>{false, false, true, false}));

    bd::StreamNumberDef number = 0;
    bd::UInt8 count = 0;
    bool async = false;
    state.item = 0;
    state.selection.secondaryVideo = 2;
    context.GetSecondaryVideoInfo(&number, &count, &async);
    EXPECT_TRUE(async) << "the second one";
}

TEST(PlaybackContext, ReportsNothingWithoutPlayItems)
{
    PlayList playList;
    playList.applicationInfo.uoMask = MaskOf({bd::UserOperationStop});
    const LoadedPlayList loaded = LayOut(3, playList);
    PlaybackState state;
    const Playhead playhead(loaded, state);
    PlaybackContext context(playhead, state);

    for (const StreamQuery query :
         {&PlaybackContext::GetVideoInfo, &PlaybackContext::GetAudioInfo,
          &PlaybackContext::GetIgInfo, &PlaybackContext::GetPgTextStInfo,
          &PlaybackContext::GetSecondaryAudioInfo, &PlaybackContext::GetPipPgTextStInfo}) {
        EXPECT_EQ(Ask(context, query), NumberAndCount(0, 0));
    }
    bd::StreamNumberDef number = 99;
    bd::UInt8 count = 99;
    bool async = true;
    EXPECT_EQ(context.rGetPgTextStInfo(&number, &count), bdmv::INavError::ErrNotAllowed);
    EXPECT_EQ(count, 0);
    context.GetSecondaryVideoInfo(&number, &count, &async);
    EXPECT_EQ(number, 0);
    EXPECT_FALSE(async);
    bd::AngleNumberDef angle = 99;
    context.GetAngleInfo(&angle, &count);
    EXPECT_EQ(angle, 0);
    EXPECT_EQ(count, 0);
    bd::VideoFormatType format = bd::VideoFormatType480i;
    bd::VideoAspectRatioType ratio = bd::VideoAspectRatioType16x9;
    context.GetVideoAttributes(format, ratio);
    EXPECT_EQ(format, bd::VideoFormatTypeNoInfo);
    EXPECT_EQ(ratio, bd::VideoAspectRatioTypeNoInfo);
    bdmv::UOMaskTable mask;
    context.GetUOMask(mask);
    EXPECT_EQ(mask, bdmv::UOMaskTable(MaskOf({bd::UserOperationStop})));
    EXPECT_EQ(AsyncFlagsOf(context), std::vector<bool>(4, false));
    EXPECT_EQ(context.GetPlayItemId(), 0);
    EXPECT_EQ(context.GetCurrentChapter(), 0);
    EXPECT_EQ(context.GetNumberOfTextSubtitleStyles(), 0);
    EXPECT_EQ(context.GetCurrentTimePosition(), 0);
}

} // namespace

} // namespace deskplayer
