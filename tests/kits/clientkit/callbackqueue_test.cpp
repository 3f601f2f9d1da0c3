// What waits for a client: what stays, merges and is lost, and where the resync is.

#include <gtest/gtest.h>

#include <stdexcept>
#include <vector>

#include "callbackqueuebench.h"

namespace callbacks = bdmv::callbacks;
using bdmv::Callback;
using bdmv::CallbackQueue;
using bdmvtest::OptionsOf;
typedef bdmvtest::QueueBench Bench;

TEST(CallbackQueue, IsEmptyAtFirst)
{
    Bench bench(2);
    EXPECT_TRUE(bench.queue.IsEmpty());
    EXPECT_EQ(bench.TakeOne(), "nothing\n");
}

TEST(CallbackQueue, WithoutPlacesIsRefused)
{
    EXPECT_THROW(CallbackQueue(OptionsOf(0)), std::invalid_argument);
}

TEST(CallbackQueue, GivesCallbacksInTheirOrder)
{
    Bench bench(3);
    bench.Put({callbacks::Paused(), callbacks::ChapterNumber{5}, callbacks::Stopped()});
    EXPECT_EQ(bench.TakeOne(), "client.Paused()\n");
    EXPECT_EQ(bench.TakeOne(), "client.ChapterNumber(5)\n");
    EXPECT_EQ(bench.TakeOne(), "client.Stopped()\n");
    EXPECT_TRUE(bench.queue.IsEmpty());
}

TEST(CallbackQueue, UsesItsPlacesAgain)
{
    Bench bench(3);
    bench.Put({callbacks::Paused(), callbacks::Stopped()});
    for (bd::ChapterNumberDef i = 0; i < 10; ++i) {
        bench.Put({callbacks::ChapterNumber{i}});
        bench.TakeOne();
    }
    EXPECT_EQ(bench.TakeAll(), "client.ChapterNumber(8)\nclient.ChapterNumber(9)\n");
    EXPECT_EQ(bench.Counters().lost, 0U);
}

TEST(CallbackQueue, MergesPositionsThatWaitNextToEachOther)
{
    Bench bench(3);
    bench.Put({callbacks::Paused(), callbacks::CurrentTimePosition{1},
               callbacks::CurrentTimePosition{2}, callbacks::CurrentTimePosition{3}});
    EXPECT_EQ(bench.Counters().merged, 2U);
    EXPECT_EQ(bench.TakeAll(), "client.Paused()\nclient.CurrentTimePosition(3)\n");
}

TEST(CallbackQueue, KeepsPositionsApartThatWaitWithAnotherCallbackBetween)
{
    Bench bench(3);
    bench.Put({callbacks::CurrentTimePosition{1}, callbacks::Paused(),
               callbacks::CurrentTimePosition{2}});
    EXPECT_EQ(bench.TakeAll(), "client.CurrentTimePosition(1)\nclient.Paused()\n"
                               "client.CurrentTimePosition(2)\n");
    EXPECT_EQ(bench.Counters().merged, 0U);
}

TEST(CallbackQueue, DoesNotMergeSteps)
{
    Bench bench(4);
    bench.Put({callbacks::Stepped{1, bd::PlayDirectionForward},
               callbacks::Stepped{2, bd::PlayDirectionForward}, callbacks::CurrentTimePosition{3},
               callbacks::Stepped{4, bd::PlayDirectionForward}});
    EXPECT_EQ(bench.TakeAll(), "client.Stepped(1, PlayDirectionForward)\n"
                               "client.Stepped(2, PlayDirectionForward)\n"
                               "client.CurrentTimePosition(3)\n"
                               "client.Stepped(4, PlayDirectionForward)\n");
    EXPECT_EQ(bench.Counters().merged, 0U);
}

TEST(CallbackQueue, DoesNotMergeWithAPositionThatWasTaken)
{
    Bench bench(3);
    bench.Put({callbacks::CurrentTimePosition{1}});
    EXPECT_EQ(bench.TakeOne(), "client.CurrentTimePosition(1)\n");
    bench.Put({callbacks::CurrentTimePosition{2}});
    EXPECT_EQ(bench.TakeAll(), "client.CurrentTimePosition(2)\n");
    EXPECT_EQ(bench.Counters().merged, 0U);
}

TEST(CallbackQueue, MergesWhenAllPlacesAreTaken)
{
    Bench bench(1);
    bench.Put({callbacks::CurrentTimePosition{1}, callbacks::CurrentTimePosition{2}});
    EXPECT_EQ(bench.TakeAll(), "client.CurrentTimePosition(2)\n");
    EXPECT_EQ(bench.Counters().lost, 0U);
}

TEST(CallbackQueue, GivesAResyncInsteadOfWhatFoundNoPlace)
{
    Bench bench(2);
    bench.Put({callbacks::Paused(), callbacks::ChapterNumber{1}, callbacks::ChapterNumber{2},
               callbacks::ChapterNumber{3}});
    EXPECT_EQ(bench.TakeAll(), "client.Paused()\nclient.ChapterNumber(1)\nresync\n"
                               "client.Paused()\nclient.ChapterNumber(3)\n");
    EXPECT_EQ(bench.Counters().lost, 2U);
    EXPECT_EQ(bench.Counters().resyncs, 1U);
}

TEST(CallbackQueue, GivesTheStatusAtTheLastLossThenWhatCameAfterIt)
{
    Bench bench(2);
    bench.Put({callbacks::Paused(), callbacks::ChapterNumber{1}, callbacks::ChapterNumber{2}});
    EXPECT_EQ(bench.TakeOne(), "client.Paused()\n");
    bench.Put({callbacks::ChapterNumber{3}});
    EXPECT_EQ(bench.TakeAll(), "client.ChapterNumber(1)\nresync\nclient.Paused()\n"
                               "client.ChapterNumber(2)\nclient.ChapterNumber(3)\n");
    EXPECT_EQ(bench.Counters().lost, 1U);
}

TEST(CallbackQueue, GivesAResyncEvenWhenNothingLastingWasLost)
{
    Bench bench(1);
    bench.Put({callbacks::Paused(), callbacks::JumpOccurred()});
    EXPECT_EQ(bench.TakeAll(), "client.Paused()\nresync\nclient.Paused()\n");
}

TEST(CallbackQueue, DoesNotMergeAPositionWithOneBeforeALoss)
{
    Bench bench(2);
    bench.Put({callbacks::Paused(), callbacks::CurrentTimePosition{1}, callbacks::StillOn()});
    bench.TakeOne();
    bench.Put({callbacks::CurrentTimePosition{2}, callbacks::CurrentTimePosition{3}});
    EXPECT_EQ(bench.TakeAll(), "client.CurrentTimePosition(1)\nresync\nclient.StillOn()\n"
                               "client.CurrentTimePosition(1)\n"
                               "client.CurrentTimePosition(3)\n");
    EXPECT_EQ(bench.Counters().merged, 1U);
}

TEST(CallbackQueue, LosesAPositionThatComesAfterALossWhileAllPlacesAreTaken)
{
    Bench bench(1);
    bench.Put({callbacks::CurrentTimePosition{1}, callbacks::Paused(),
               callbacks::CurrentTimePosition{2}});
    EXPECT_EQ(bench.TakeAll(), "client.CurrentTimePosition(1)\nresync\nclient.Paused()\n"
                               "client.CurrentTimePosition(2)\n");
    EXPECT_EQ(bench.Counters().lost, 2U);
}

TEST(CallbackQueue, ExtendsAResyncThatWasNotTaken)
{
    Bench bench(2);
    bench.Put({callbacks::Paused(), callbacks::ChapterNumber{1}, callbacks::ChapterNumber{2}});
    bench.TakeOne();
    bench.Put({callbacks::ChapterNumber{3}, callbacks::ChapterNumber{4}});
    EXPECT_EQ(bench.Counters().lost, 3U);
    EXPECT_EQ(bench.TakeOne(), "client.ChapterNumber(1)\n");
    bench.Put({callbacks::ChapterNumber{5}});
    EXPECT_EQ(bench.TakeAll(), "discarded\nresync\nclient.Paused()\nclient.ChapterNumber(4)\n"
                               "client.ChapterNumber(5)\n");
    EXPECT_EQ(bench.Counters().resyncs, 1U);
    EXPECT_EQ(bench.Counters().received, 6U);
    EXPECT_EQ(bench.Counters().delivered, 3U);
    EXPECT_EQ(bench.Counters().lost, 3U);
}

TEST(CallbackQueue, GivesASecondResyncAfterALossThatFollowsTheFirst)
{
    Bench bench(1);
    bench.Put({callbacks::Paused(), callbacks::ChapterNumber{1}});
    EXPECT_EQ(bench.TakeAll(), "client.Paused()\nresync\nclient.Paused()\n"
                               "client.ChapterNumber(1)\n");
    bench.Put({callbacks::ChapterNumber{2}, callbacks::ChapterNumber{3}});
    EXPECT_EQ(bench.TakeAll(), "client.ChapterNumber(2)\nresync\nclient.Paused()\n"
                               "client.ChapterNumber(3)\n");
    EXPECT_EQ(bench.Counters().resyncs, 2U);
}

TEST(CallbackQueue, CountsWhatIsTakenWhenItIsFinished)
{
    Bench bench(1);
    bench.Put({callbacks::Paused(), callbacks::Stopped()});
    Callback callback = callbacks::PlayStarted();
    bdmv::PlaybackStatus status;
    bench.queue.Take(callback, status);
    EXPECT_EQ(bench.Counters().delivered, 0U);
    bench.queue.Finish();
    EXPECT_EQ(bench.Counters().delivered, 1U);
    bench.queue.Take(callback, status);
    EXPECT_EQ(bench.Counters().resyncs, 0U);
    bench.queue.Finish();
    EXPECT_EQ(bench.Counters().resyncs, 1U);
    EXPECT_EQ(bench.Counters().delivered, 1U);
}

TEST(CallbackQueue, RefusesACallbackAsReceivedAndLost)
{
    Bench bench(1);
    bench.queue.Refuse();
    EXPECT_EQ(bench.Counters().received, 1U);
    EXPECT_EQ(bench.Counters().lost, 1U);
    EXPECT_TRUE(bench.queue.IsEmpty());
}

TEST(CallbackQueue, LosesAllOnRequest)
{
    Bench bench(3);
    bench.Put({callbacks::Paused(), callbacks::ChapterNumber{1}});
    bench.queue.LoseAll();
    EXPECT_EQ(bench.Counters().lost, 2U);
    EXPECT_EQ(bench.TakeAll(), "discarded\ndiscarded\n");
    EXPECT_EQ(bench.Counters().delivered, 0U);
}

TEST(CallbackQueue, LosesWhatWaitsAfterAResyncTooAndTheResync)
{
    Bench bench(2);
    bench.Put({callbacks::Paused(), callbacks::ChapterNumber{1}, callbacks::ChapterNumber{2}});
    bench.TakeOne();
    bench.Put({callbacks::ChapterNumber{3}});
    bench.queue.LoseAll();
    EXPECT_EQ(bench.Counters().lost, 3U);
    EXPECT_EQ(bench.TakeAll(), "discarded\ndiscarded\n");
    EXPECT_EQ(bench.Counters().resyncs, 0U);
    EXPECT_EQ(bench.Counters().received, 4U);
}

TEST(CallbackQueue, DoesNotCountAResyncThatWasCutShort)
{
    Bench bench(1);
    bench.Put({callbacks::Paused(), callbacks::Stopped()});
    bench.TakeOne();
    Callback callback = callbacks::PlayStarted();
    bdmv::PlaybackStatus status;
    ASSERT_EQ(bench.queue.Take(callback, status), CallbackQueue::StepResync);
    bench.queue.LoseAll();
    bench.queue.Finish();
    EXPECT_EQ(bench.Counters().resyncs, 0U);
}

TEST(CallbackQueue, CountsACallbackThatWasTakenBeforeAllWereLost)
{
    Bench bench(1);
    bench.Put({callbacks::Paused()});
    Callback callback = callbacks::PlayStarted();
    bdmv::PlaybackStatus status;
    bench.queue.Take(callback, status);
    bench.queue.LoseAll();
    bench.queue.Finish();
    EXPECT_EQ(bench.Counters().delivered, 1U);
    EXPECT_EQ(bench.Counters().lost, 0U);
}
