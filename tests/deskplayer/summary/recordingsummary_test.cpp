#include "summary/recordingsummary.h"

#include <gtest/gtest.h>

#include <array>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "records.h"
#include "testkit/fakeplatform.h"

namespace deskplayer
{

namespace
{

const callbacks::PlayMode Fast{bd::PlayDirectionForward, bd::PlaySpeedFast2};
const callbacks::PlayMode Backward{bd::PlayDirectionBackward, bd::PlaySpeedNormal};
const callbacks::PlayMode Normal{bd::PlayDirectionForward, bd::PlaySpeedNormal};

constexpr bd::UserOperationMaskDef Search = bd::UserOperationChapterSearch;
constexpr bd::UserOperationMaskDef Pause = bd::UserOperationPauseOn;

RecordingSummary SummaryOf(const std::vector<CallbackRecord>& records)
{
    Summarizer summarizer;
    for (const CallbackRecord& record : records) {
        summarizer.OnRecord(record);
    }
    return summarizer.Summary();
}

/** "Playing 10 s x 2", for the states that occurred. */
std::vector<std::string> StatesIn(const RecordingSummary& summary)
{
    std::vector<std::string> states;
    for (std::size_t state = 0; state < summary.states.size(); ++state) {
        const Periods& periods = summary.states[state];
        if (periods.count > 0 || periods.total > Ticks(0)) {
            states.push_back(SummaryStateNames[state] + std::string(" ") +
                             std::to_string(periods.total.count() / TicksPerSecond) + " s x " +
                             std::to_string(periods.count));
        }
    }
    return states;
}

using States = std::vector<std::string>;

OperationSummary OperationIn(const RecordingSummary& summary, bd::UserOperationMaskDef operation)
{
    return summary.operations[static_cast<std::size_t>(operation)];
}

void ExpectForbidden(const OperationSummary& operation, std::uint64_t seconds, std::uint64_t count,
                     std::optional<bool> atEnd)
{
    EXPECT_EQ(operation.forbidden.total, Seconds(seconds));
    EXPECT_EQ(operation.forbidden.count, count);
    EXPECT_EQ(operation.forbiddenAtEnd, atEnd);
}

TEST(Summary, OfNothingIsEmpty)
{
    const RecordingSummary summary = Summarizer().Summary();

    EXPECT_EQ(summary.callbacks, 0U);
    EXPECT_EQ(summary.duration, Ticks(0));
    EXPECT_FALSE(summary.lastCallback);
    EXPECT_EQ(StatesIn(summary), States());
}

TEST(Summary, CountsCallbacksByKindWithTheFirstAndTheLastTime)
{
    const RecordingSummary summary =
        SummaryOf({At(1, callbacks::Paused{}), At(2, callbacks::AudioInfo{1}),
                   At(3, callbacks::Paused{}), At(4, callbacks::Paused{})});

    EXPECT_EQ(summary.callbacks, 4U);
    const CallbackSummary& paused = summary.callbackKinds[bdmv::CallbackPaused];
    EXPECT_EQ(paused.count, 3U);
    EXPECT_EQ(paused.first, Seconds(1));
    EXPECT_EQ(paused.last, Seconds(4));
    EXPECT_EQ(summary.callbackKinds[bdmv::CallbackAudioInfo].count, 1U);
    EXPECT_EQ(summary.callbackKinds[bdmv::CallbackStopped].count, 0U);
}

TEST(Summary, ExtendsFromTheFirstRecordToTheLast)
{
    Summarizer summarizer;
    summarizer.OnRecord(At(100, callbacks::Paused{}));
    summarizer.OnStart({Seconds(110), "May 31 20:15:00"});
    summarizer.OnGap({Seconds(120), "lost", {}});
    summarizer.OnStart({Seconds(130), "May 31 20:16:00"});
    const RecordingSummary summary = summarizer.Summary();

    EXPECT_EQ(summary.begin, Seconds(100));
    EXPECT_EQ(summary.end, Seconds(130));
    EXPECT_EQ(summary.duration, Seconds(30));
    EXPECT_EQ(summary.wallClock, "May 31 20:15:00") << "the first";
}

TEST(Summary, MeasuresTheTimeInEachState)
{
    EXPECT_EQ(StatesIn(SummaryOf({At(0, callbacks::AudioInfo{1}), At(1, callbacks::PlayStarted{}),
                                  At(3, callbacks::Paused{}), At(6, callbacks::StillOn{}),
                                  At(10, callbacks::StillOff{}), At(15, callbacks::Suspended{}),
                                  At(21, callbacks::SystemSuspended{nullptr, 0}),
                                  At(28, callbacks::Stopped{}), At(36, callbacks::AngleInfo{1})})),
              (States{"Playing 7 s x 2", "Paused 3 s x 1", "Still 4 s x 1", "Suspended 6 s x 1",
                      "Standby 7 s x 1", "Stopped 8 s x 1", "Unknown 1 s x 1"}));
}

TEST(Summary, CountsAStateOnceUntilItIsLeft)
{
    EXPECT_EQ(StatesIn(SummaryOf({At(0, callbacks::Paused{}), At(1, callbacks::Paused{}),
                                  At(2, callbacks::PlayStarted{}), At(3, callbacks::Paused{})})),
              (States{"Playing 1 s x 1", "Paused 2 s x 2"}));
}

TEST(Summary, TellsTrickPlayFromPlaying)
{
    EXPECT_EQ(StatesIn(SummaryOf({At(0, callbacks::PlayStarted{}), At(1, Fast), At(3, Normal),
                                  At(6, Backward), At(10, callbacks::Paused{}),
                                  At(15, callbacks::AudioInfo{1})})),
              (States{"Playing 4 s x 2", "TrickPlay 6 s x 2", "Paused 5 s x 1"}));
}

TEST(Summary, ForgetsThePlayModeWhenPlaybackStops)
{
    EXPECT_EQ(StatesIn(SummaryOf({At(0, callbacks::PlayStarted{}), At(0, Fast),
                                  At(1, callbacks::Stopped{}), At(2, callbacks::PlayStarted{}),
                                  At(3, callbacks::AudioInfo{1})})),
              (States{"Playing 1 s x 2", "TrickPlay 1 s x 1", "Stopped 1 s x 1"}));
}

TEST(Summary, KnowsNoStateFromTheCallbackBeforeAGap)
{
    Summarizer summarizer;
    summarizer.OnRecord(At(0, callbacks::PlayStarted{}));
    summarizer.OnRecord(At(0, Fast));
    summarizer.OnRecord(At(10, callbacks::AudioInfo{1}));
    summarizer.OnGap({Seconds(12), "lost", 1});
    summarizer.OnRecord(At(15, callbacks::PlayStarted{}));
    summarizer.OnRecord(At(16, callbacks::AudioInfo{1}));

    EXPECT_EQ(StatesIn(summarizer.Summary()),
              (States{"Playing 1 s x 2", "TrickPlay 10 s x 1", "Unknown 5 s x 1"}));
}

TEST(Summary, GuessesNoAbsentArgument)
{
    ArgumentSet first;
    first.set(0);
    const RecordingSummary summary = SummaryOf(
        {At(0, callbacks::PlayStarted{}), At(0, Fast), At(1, callbacks::PlayMode{}, first),
         At(1, Forbidding({Search})), At(3, Forbidding({Search}), first),
         At(6, callbacks::SystemResumed{true}, first), At(10, callbacks::AudioInfo{1})});

    EXPECT_EQ(StatesIn(summary),
              (States{"Playing 5 s x 2", "TrickPlay 1 s x 1", "Unknown 4 s x 1"}));
    ExpectForbidden(OperationIn(summary, Search), 2, 1, {});
}

TEST(Summary, MeasuresHowLongOperationsAreForbidden)
{
    const RecordingSummary summary =
        SummaryOf({At(0, callbacks::PlayStarted{}), At(1, Forbidding({Search, Pause})),
                   At(3, Forbidding({Search})), At(6, Forbidding({})), At(10, Forbidding({Pause})),
                   At(15, Forbidding({Pause})), At(21, callbacks::AudioInfo{1})});

    ExpectForbidden(OperationIn(summary, Search), 5, 1, false);
    ExpectForbidden(OperationIn(summary, Pause), 13, 2, true);
    ExpectForbidden(OperationIn(summary, bd::UserOperationStop), 0, 0, false);
}

TEST(Summary, MeasuresOperationsOnlyWhileSomethingIsPlayed)
{
    ExpectForbidden(
        OperationIn(SummaryOf({At(0, callbacks::PlayStarted{}), At(0, Forbidding({Search})),
                               At(1, callbacks::Stopped{}), At(3, callbacks::PlayStarted{}),
                               At(6, callbacks::AudioInfo{1})}),
                    Search),
        1, 1, false);
    ExpectForbidden(
        OperationIn(
            SummaryOf({At(0, callbacks::PlayStarted{}), At(0, Forbidding({Search})),
                       At(1, callbacks::SystemSuspended{nullptr, 0}),
                       At(3, callbacks::SystemResumed{true}), At(6, callbacks::AudioInfo{1})}),
            Search),
        4, 2, true);
}

TEST(Summary, KnowsNoOperationFromTheCallbackBeforeAGap)
{
    Summarizer summarizer;
    summarizer.OnRecord(At(0, Forbidding({Search})));
    summarizer.OnRecord(At(3, callbacks::AudioInfo{1}));
    summarizer.OnGap({Seconds(5), "lost", 1});
    summarizer.OnRecord(At(9, callbacks::AudioInfo{1}));

    ExpectForbidden(OperationIn(summarizer.Summary(), Search), 3, 1, {});
}

TEST(Summary, MeasuresWaitsWithinEventsOnly)
{
    const RecordingSummary summary = SummaryOf(
        {At(1, callbacks::PlayItem{}), At(9, callbacks::PictureInPictureAvailable{}),
         ContinuingAt(Ticks(9 * TicksPerSecond + 9), callbacks::SecondaryAudioAvailable{}),
         At(20, callbacks::Paused{})});

    EXPECT_EQ(summary.waits, 1U);
    ASSERT_EQ(summary.longestWaits.size(), 1U);
    const Wait& wait = summary.longestWaits[0];
    EXPECT_EQ(wait.duration, Ticks(9));
    EXPECT_EQ(wait.time, Seconds(9));
    EXPECT_EQ(wait.after, bdmv::CallbackPictureInPictureAvailable);
    EXPECT_EQ(wait.before, bdmv::CallbackSecondaryAudioAvailable);
}

TEST(Summary, KeepsTheLongestWaitsInOrderTheFirstOfEqualOnes)
{
    Summarizer summarizer;
    const std::array<std::uint64_t, 9> waits = {3, 0, 9, 5, 3, 1, 9, 7, 4};
    for (std::size_t i = 0; i < waits.size(); ++i) {
        const Ticks begin = Seconds(i);
        summarizer.OnRecord(At(i, callbacks::PlayItem{}));
        summarizer.OnRecord(
            ContinuingAt(begin + Ticks(waits[i]), callbacks::PictureInPictureAvailable{}));
    }
    const RecordingSummary summary = summarizer.Summary();

    std::vector<std::pair<std::uint64_t, std::uint64_t>> longest;
    for (const Wait& wait : summary.longestWaits) {
        longest.emplace_back(wait.duration.count(), wait.time.count() / TicksPerSecond);
    }
    EXPECT_EQ(summary.waits, waits.size());
    EXPECT_EQ(longest, (decltype(longest){{9, 2}, {9, 6}, {7, 7}, {5, 3}, {4, 8}}));
}

TEST(Summary, ListsNoWaitOfNothing)
{
    const RecordingSummary summary =
        SummaryOf({At(1, callbacks::PlayItem{}),
                   ContinuingAt(Seconds(1), callbacks::PictureInPictureAvailable{})});

    EXPECT_EQ(summary.waits, 1U);
    EXPECT_TRUE(summary.longestWaits.empty());
}

TEST(Summary, CountsGapsByCause)
{
    Summarizer summarizer;
    summarizer.OnGap({Seconds(1), "lost", 17});
    summarizer.OnGap({Seconds(2), "restart", {}});
    summarizer.OnGap({Seconds(3), "lost", {}});
    summarizer.OnGap({Seconds(4), "lost", 3});
    const std::vector<GapSummary> gaps = summarizer.Summary().gaps;

    ASSERT_EQ(gaps.size(), 2U);
    EXPECT_EQ(gaps[0].cause, "lost");
    EXPECT_EQ(gaps[0].count, 3U);
    EXPECT_EQ(gaps[0].lost, 20U);
    EXPECT_EQ(gaps[0].first, Seconds(1));
    EXPECT_EQ(gaps[0].last, Seconds(4));
    EXPECT_EQ(gaps[1].cause, "restart");
    EXPECT_FALSE(gaps[1].lost);
}

TEST(Summary, OfARecordingWithManyCausesCountsTheLastOnesTogether)
{
    Summarizer summarizer;
    for (std::size_t cause = 0; cause < Summarizer::GapCauses + 3; ++cause) {
        summarizer.OnGap({Seconds(cause), std::to_string(cause), 1});
    }
    const std::vector<GapSummary> gaps = summarizer.Summary().gaps;

    ASSERT_EQ(gaps.size(), Summarizer::GapCauses + 1);
    EXPECT_EQ(gaps[Summarizer::GapCauses - 1].cause, "15");
    EXPECT_EQ(gaps.back().cause, "other");
    EXPECT_EQ(gaps.back().count, 3U);
}

TEST(Summary, KeepsTheLastCallbackWithoutItsBytes)
{
    EXPECT_EQ(SummaryOf({At(1, callbacks::Paused{}), At(2, callbacks::AudioInfo{3})})
                  .lastCallback->callback,
              bdmv::Callback(callbacks::AudioInfo{3}));

    const RecordingSummary summary = SummaryOf({At(1, callbacks::SystemSuspended{"abc", 3})});
    EXPECT_EQ(summary.lastCallback->callback,
              bdmv::Callback(callbacks::SystemSuspended{nullptr, 3}));
    EXPECT_TRUE(summary.lastCallback->absent[0]);
    EXPECT_FALSE(summary.lastCallback->absent[1]);
}

TEST(Summary, BeginsAnotherRecordingWhereTimeGoesBack)
{
    const RecordingSummary summary =
        SummaryOf({At(100, callbacks::PlayStarted{}), At(110, Forbidding({Search})),
                   At(20, callbacks::AudioInfo{1}), At(23, callbacks::AudioInfo{2})});

    EXPECT_EQ(summary.duration, Seconds(13));
    EXPECT_EQ(summary.end, Seconds(23));
    EXPECT_EQ(StatesIn(summary), (States{"Playing 10 s x 1", "Unknown 3 s x 1"}));
    ExpectForbidden(OperationIn(summary, Search), 0, 1, {});
}

} // namespace

} // namespace deskplayer
