#include "clientkit/playbackstatus.h"

#include <gtest/gtest.h>

#include <ostream>
#include <set>
#include <string>

#include "randomcallbacks.h"

namespace bdmv
{

// For the messages of failed tests.
static void PrintTo(PlaybackState state, std::ostream* stream)
{
    *stream << NameOf(state);
}

} // namespace bdmv

namespace
{

namespace callbacks = bdmv::callbacks;
using bdmv::PlaybackStatus;

PlaybackStatus After(const std::vector<bdmv::Callback>& sequence)
{
    PlaybackStatus status;
    for (const bdmv::Callback& callback : sequence) {
        Apply(callback, status);
    }
    return status;
}

/** Callbacks, and the state of playback after them. */
struct StateCase {
    const char* name;
    std::vector<bdmv::Callback> sequence;
    bdmv::PlaybackState state;
};

class StateOfPlayback : public testing::TestWithParam<StateCase>
{
};

TEST_P(StateOfPlayback, FollowsTheCallbacks)
{
    const PlaybackStatus status = After(GetParam().sequence);

    EXPECT_TRUE(status.state.known);
    EXPECT_EQ(status.state.value, GetParam().state);
}

constexpr callbacks::PlayStarted Started{};
constexpr callbacks::Paused Paused{};
constexpr callbacks::StillOn StillOn{};
constexpr callbacks::StillOff StillOff{};
constexpr callbacks::Stopped Stopped{};
constexpr callbacks::Suspended Suspended{};
constexpr callbacks::Resumed Resumed{};
constexpr callbacks::Continued Continued{bd::PlayDirectionForward, bd::PlaySpeedNormal};
constexpr callbacks::Finished Finished{bdmv::INavControlListener::EndOfMedia};
constexpr callbacks::SystemSuspended SystemSuspended{nullptr, 0};
constexpr callbacks::SystemResumed SystemResumedPlaying{true};
constexpr callbacks::SystemResumed SystemResumedStopped{false};

const StateCase StateCases[] = {
    {"PlayStarted", {Started}, bdmv::PlaybackPlaying},
    {"Continued", {Paused, Continued}, bdmv::PlaybackPlaying},
    {"Paused", {Started, Paused}, bdmv::PlaybackPaused},
    {"StillOn", {Started, StillOn}, bdmv::PlaybackStill},
    {"StillOffDuringAStill", {StillOn, StillOff}, bdmv::PlaybackPlaying},
    {"StillOffDuringAPause", {StillOn, Paused, StillOff}, bdmv::PlaybackPaused},
    {"Stopped", {Started, Stopped}, bdmv::PlaybackStopped},
    {"Finished", {Started, Finished}, bdmv::PlaybackStopped},
    {"PlayFailed", {Started, callbacks::PlayFailed{}}, bdmv::PlaybackStopped},
    {"Suspended", {Started, Suspended}, bdmv::PlaybackSuspended},
    {"ResumedWhilePlaying", {Started, Suspended, Resumed}, bdmv::PlaybackPlaying},
    {"ResumedWhilePaused", {Paused, Suspended, Resumed}, bdmv::PlaybackPaused},
    {"ResumedDuringAStill", {StillOn, Suspended, Resumed}, bdmv::PlaybackStill},
    {"ResumedAfterSuspendedTwice", {Paused, Suspended, Suspended, Resumed}, bdmv::PlaybackPaused},
    {"ResumedFromAnUnknownState", {Suspended, Resumed}, bdmv::PlaybackPlaying},
    {"ResumedAfterAnEarlierPause",
     {Paused, Suspended, Resumed, Continued, Suspended, Resumed},
     bdmv::PlaybackPlaying},
    {"ResumedWithoutSuspension", {Paused, Resumed}, bdmv::PlaybackPlaying},
    {"ResumedAfterAnEnd", {Paused, Suspended, Stopped, Resumed}, bdmv::PlaybackPlaying},
    {"ResumeFailed", {Suspended, callbacks::ResumeFailed{}}, bdmv::PlaybackStopped},
    {"SystemSuspended", {Started, SystemSuspended}, bdmv::PlaybackStandby},
    {"SystemResumedPlaying", {SystemSuspended, SystemResumedPlaying}, bdmv::PlaybackPlaying},
    {"SystemResumedStopped", {SystemSuspended, SystemResumedStopped}, bdmv::PlaybackStopped},
    {"SystemResumeFailed",
     {SystemSuspended, callbacks::SystemResumeFailed{}},
     bdmv::PlaybackStopped},
};

INSTANTIATE_TEST_SUITE_P(PlaybackStatus, StateOfPlayback, testing::ValuesIn(StateCases),
                         [](const auto& test) { return std::string(test.param.name); });

TEST(PlaybackStatus, KnowsNothingAtFirst)
{
    const PlaybackStatus status;

    EXPECT_FALSE(status.state.known);
    EXPECT_FALSE(status.chapter.known);
    EXPECT_EQ(status, PlaybackStatus());
}

TEST(PlaybackStatus, DoesNotKnowTheStateAfterAStillOffAlone)
{
    EXPECT_FALSE(After({StillOff}).state.known);
}

TEST(PlaybackStatus, KeepsTheArgumentsOfThePlayItem)
{
    const PlaybackStatus status = After(
        {callbacks::PlayItem{800, 3, bd::VideoFormatType1080p, bd::VideoAspectRatioType16x9}});

    EXPECT_TRUE(status.playItem.known);
    EXPECT_EQ(status.playItem.value.playListId, 800U);
    EXPECT_EQ(status.playItem.value.playItemId, 3U);
    EXPECT_EQ(status.playItem.value.videoFormat, bd::VideoFormatType1080p);
    EXPECT_EQ(status.playItem.value.aspectRatio, bd::VideoAspectRatioType16x9);
    EXPECT_FALSE(status.playList.known);
}

TEST(PlaybackStatus, TakesThePositionOfAStep)
{
    const PlaybackStatus status = After({Paused, callbacks::CurrentTimePosition{45000},
                                         callbacks::Stepped{46877, bd::PlayDirectionForward}});

    EXPECT_EQ(status.position.value, 46877U);
    EXPECT_EQ(status.state.value, bdmv::PlaybackPaused);
}

TEST(PlaybackStatus, TakesThePlayModeOfPlayModeOnly)
{
    const PlaybackStatus status =
        After({callbacks::PlayMode{bd::PlayDirectionBackward, bd::PlaySpeedFast2}, Continued});

    EXPECT_EQ(status.playMode.value, bd::PlayMode(bd::PlayDirectionBackward, bd::PlaySpeedFast2));
}

TEST(PlaybackStatus, TakesTheNumberOfASecondaryStreamFromItsDisplayToo)
{
    const PlaybackStatus status =
        After({callbacks::SecondaryVideoInfo{1}, callbacks::SecondaryVideoDisplay{2, true},
               callbacks::SecondaryAudioDisplay{3, true}, callbacks::SecondaryAudioInfo{4}});

    EXPECT_EQ(status.secondaryVideo.value, 2U);
    EXPECT_TRUE(status.secondaryVideoShown.value);
    EXPECT_EQ(status.secondaryAudio.value, 4U);
    EXPECT_TRUE(status.secondaryAudioShown.value);
}

TEST(PlaybackStatus, KeepsThePartsOfStoppedPlayback)
{
    const PlaybackStatus status = After({callbacks::Playlist{800}, Stopped});

    EXPECT_TRUE(status.playList.known);
    EXPECT_EQ(status.playList.value, 800U);
}

TEST(PlaybackStatus, ChangesWithEveryCallbackButTheMomentaryOnes)
{
    const std::set<bdmv::CallbackId> momentary{bdmv::CallbackFirstPictureDelivered,
                                               bdmv::CallbackTriggerTimeReached,
                                               bdmv::CallbackTriggerSet,
                                               bdmv::CallbackJumpOccurred,
                                               bdmv::CallbackPreloadFailed,
                                               bdmv::CallbackMarkInfo,
                                               bdmv::CallbackExecuteButton};
    bdmvtest::RandomCallbacks random(1);

    for (int id = 0; id < bdmv::Callback__sizeof; ++id) {
        const bdmv::Callback callback = random.Make(static_cast<bdmv::CallbackId>(id));
        PlaybackStatus status = After({StillOn});
        const PlaybackStatus before = status;
        Apply(callback, status);

        const bool changed = status != before || callback.Id() == bdmv::CallbackStillOn;
        EXPECT_EQ(changed, momentary.count(callback.Id()) == 0) << NameOf(callback.Id());
    }
}

/** Callbacks that differ in one argument only give statuses that differ. */
TEST(PlaybackStatus, ComparesEveryArgument)
{
    bd::AudioInfoType audioInfo;
    audioInfo.pid = 0x1100;
    const std::vector<std::pair<bdmv::Callback, bdmv::Callback>> pairs{
        {callbacks::PlayItem{1, 2, bd::VideoFormatType480i, bd::VideoAspectRatioType4x3},
         callbacks::PlayItem{9, 2, bd::VideoFormatType480i, bd::VideoAspectRatioType4x3}},
        {callbacks::PlayItem{1, 2, bd::VideoFormatType480i, bd::VideoAspectRatioType4x3},
         callbacks::PlayItem{1, 9, bd::VideoFormatType480i, bd::VideoAspectRatioType4x3}},
        {callbacks::PlayItem{1, 2, bd::VideoFormatType480i, bd::VideoAspectRatioType4x3},
         callbacks::PlayItem{1, 2, bd::VideoFormatType1080p, bd::VideoAspectRatioType4x3}},
        {callbacks::PlayItem{1, 2, bd::VideoFormatType480i, bd::VideoAspectRatioType4x3},
         callbacks::PlayItem{1, 2, bd::VideoFormatType480i, bd::VideoAspectRatioType16x9}},
        {callbacks::PresentationGraphicsInfo{1, true},
         callbacks::PresentationGraphicsInfo{1, false}},
        {callbacks::PresentationGraphicsInfo{1, true},
         callbacks::PresentationGraphicsInfo{2, true}},
        {callbacks::PipPgTextStInfo{1, true}, callbacks::PipPgTextStInfo{1, false}},
        {callbacks::PipPgTextStInfo{1, true}, callbacks::PipPgTextStInfo{2, true}},
        {callbacks::SecondaryVideoDisplay{1, true}, callbacks::SecondaryVideoDisplay{1, false}},
        {callbacks::SecondaryVideoDisplay{1, true}, callbacks::SecondaryVideoDisplay{2, true}},
        {callbacks::SecondaryAudioDisplay{1, true}, callbacks::SecondaryAudioDisplay{1, false}},
        {callbacks::SecondaryAudioDisplay{1, true}, callbacks::SecondaryAudioDisplay{2, true}},
        {callbacks::AudioInfoChanged{true, bd::AudioInfoType()},
         callbacks::AudioInfoChanged{false, bd::AudioInfoType()}},
        {callbacks::AudioInfoChanged{true, bd::AudioInfoType()},
         callbacks::AudioInfoChanged{true, audioInfo}},
        {callbacks::AudioInfoChanged{false, bd::AudioInfoType()},
         callbacks::AudioInfoChanged{false, audioInfo}},
        {callbacks::UOMask{bdmv::UOMaskTable(1)}, callbacks::UOMask{bdmv::UOMaskTable(2)}},
        {callbacks::PictureInPictureAvailable{}, callbacks::PictureInPictureUnavailable{}},
        {callbacks::InteractiveGraphicsVisible{}, callbacks::InteractiveGraphicsInvisible{}},
        {callbacks::ButtonActivationBusy{}, callbacks::ButtonActivationDone{}},
    };

    for (const auto& pair : pairs) {
        EXPECT_NE(After({pair.first}), After({pair.second})) << NameOf(pair.first.Id());
    }
}

TEST(PlaybackStatus, ComparesWhatPlaybackResumesTo)
{
    EXPECT_NE(After({Started, Suspended}), After({Paused, Suspended}));
}

TEST(PlaybackStatus, ComparesUnequalValuesOfUnknownPartsAsEqual)
{
    bdmv::Reported<int> left;
    bdmv::Reported<int> right;
    right.value = 1;

    EXPECT_TRUE(left == right);
    right.Set(1);
    EXPECT_TRUE(left != right);
    left.Set(2);
    EXPECT_TRUE(left != right);
}

TEST(PlaybackStatus, NamesTheStates)
{
    EXPECT_STREQ(NameOf(bdmv::PlaybackStopped), "Stopped");
    EXPECT_STREQ(NameOf(bdmv::PlaybackPlaying), "Playing");
    EXPECT_STREQ(NameOf(bdmv::PlaybackPaused), "Paused");
    EXPECT_STREQ(NameOf(bdmv::PlaybackStill), "Still");
    EXPECT_STREQ(NameOf(bdmv::PlaybackSuspended), "Suspended");
    EXPECT_STREQ(NameOf(bdmv::PlaybackStandby), "Standby");
    EXPECT_STREQ(NameOf(static_cast<bdmv::PlaybackState>(6)), "unknown");
    EXPECT_STREQ(NameOf(static_cast<bdmv::PlaybackState>(-1)), "unknown");
}

TEST(StatusListener, KeepsTheStatus)
{
    bdmv::StatusListener listener;
    listener.PlayStarted();
    listener.ChapterNumber(7);

    EXPECT_EQ(listener.Status(), After({Started, callbacks::ChapterNumber{7}}));
}

} // namespace
