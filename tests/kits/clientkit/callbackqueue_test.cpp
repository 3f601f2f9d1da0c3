// What waits for a client: what stays, merges and is lost, and where the resync is.

#include "clientkit/callbackqueue.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

#include "testkit/allocationcounter.h"
#include "testkit/fakeplatform.h"
#include "testkit/recordinglistener.h"
#include "testprogram.h"

namespace
{

namespace callbacks = bdmv::callbacks;
using bdmv::Callback;
using bdmv::CallbackQueue;

bdmv::QueuedListener::Options OptionsOf(std::size_t places, std::size_t largestBlock = 16)
{
    bdmv::QueuedListener::Options options;
    options.places = places;
    options.largestBlock = largestBlock;
    return options;
}

/** A queue, and a client that takes from it when the test says so. */
class Bench
{
public:
    explicit Bench(std::size_t places, std::size_t largestBlock = 16)
        : queue(OptionsOf(places, largestBlock))
    {
    }

    void Put(const std::vector<Callback>& all)
    {
        for (const Callback& callback : all) {
            queue.Put(callback);
        }
    }

    /** What the client receives from one step: callbacks, or "resync: " and callbacks. */
    std::string TakeOne()
    {
        std::string text;
        Callback callback = callbacks::PlayStarted();
        bdmv::PlaybackStatus status;
        switch (queue.Take(callback, status)) {
        case CallbackQueue::StepDeliver:
            Deliver(callback, m_Recorder);
            text = m_Journal.Take();
            break;
        case CallbackQueue::StepResync:
            Deliver(status, m_Recorder);
            text = "resync\n" + m_Journal.Take();
            break;
        case CallbackQueue::StepDiscard:
            text = "discarded\n";
            break;
        case CallbackQueue::StepNone:
            text = "nothing\n";
            break;
        }
        queue.Finish();
        return text;
    }

    std::string TakeAll()
    {
        std::string text;
        while (!queue.IsEmpty()) {
            text += TakeOne();
        }
        return text;
    }

    bdmv::QueuedListener::Counters Counters() const { return queue.GetCounters(); }

    CallbackQueue queue;

private:
    bdmvtest::Journal m_Journal;
    bdmvtest::RecordingListener m_Recorder{m_Journal, "client"};
};

} // namespace

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

TEST(CallbackQueue, CopiesBlocks)
{
    Bench bench(2);
    std::string first = "abc";
    std::string second = "de";
    bench.Put({callbacks::SystemSuspended{first.data(), 3},
               callbacks::SystemSuspended{second.data(), 2}});
    first = second = "....";
    EXPECT_EQ(bench.TakeAll(), "client.SystemSuspended(bytes 97 98 99, 3)\n"
                               "client.SystemSuspended(bytes 100 101, 2)\n");
}

TEST(CallbackQueue, LosesABlockThatIsTooLargeAndGivesTheRestOfTheState)
{
    Bench bench(4, 3);
    bench.Put({callbacks::ChapterNumber{1}, callbacks::SystemSuspended{"abcd", 4},
               callbacks::ChapterNumber{2}});
    Callback callback = callbacks::PlayStarted();
    EXPECT_EQ(bench.TakeOne(), "client.ChapterNumber(1)\n");
    bdmv::PlaybackStatus status;
    ASSERT_EQ(bench.queue.Take(callback, status), CallbackQueue::StepResync);
    bench.queue.Finish();
    EXPECT_EQ(status.state.value, bdmv::PlaybackStandby);
    EXPECT_EQ(status.chapter.value, 1U);
    EXPECT_EQ(bench.TakeAll(), "client.ChapterNumber(2)\n");
    EXPECT_EQ(bench.Counters().lost, 1U);
    EXPECT_EQ(bench.Counters().delivered, 2U);
}

TEST(CallbackQueue, LosesABlockThatFindsNoRoomAmongOtherBlocks)
{
    const char bytes[16] = {};
    Bench bench(8, 16);
    bench.Put(std::vector<Callback>(5, callbacks::SystemSuspended{bytes, 16}));
    EXPECT_EQ(bench.Counters().lost, 1U);
    bench.TakeOne();
    bench.Put({callbacks::SystemSuspended{"abc", 3}});
    EXPECT_EQ(bench.Counters().lost, 1U);
    const std::string text = bench.TakeAll();
    EXPECT_EQ(text.substr(text.rfind("client")), "client.SystemSuspended(bytes 97 98 99, 3)\n");
}

TEST(CallbackQueue, KeepsTheBlockOfACallbackUntilItIsFinished)
{
    Bench bench(8, 16);
    const char bytes[16] = {};
    bench.Put({callbacks::SystemSuspended{"abc", 3}});
    Callback callback = callbacks::PlayStarted();
    bdmv::PlaybackStatus status;
    bench.queue.Take(callback, status);
    bench.Put(std::vector<Callback>(5, callbacks::SystemSuspended{bytes, 16}));
    const void* const data = callback.As<callbacks::SystemSuspended>()->data;
    EXPECT_EQ(std::string(static_cast<const char*>(data), 3), "abc");
    EXPECT_EQ(bench.Counters().lost, 2U); // three largest blocks fit beside it
}

TEST(CallbackQueue, FreesTheBlocksOfCallbacksThatAreLostLater)
{
    const char bytes[16] = {};
    Bench bench(2);
    for (int i = 0; i < 10; ++i) {
        bench.Put({callbacks::Paused(), callbacks::Paused(), callbacks::Paused()});
        bench.TakeOne();
        bench.Put({callbacks::SystemSuspended{bytes, 16}, callbacks::Paused()});
        bench.TakeOne();
        EXPECT_EQ(bench.TakeOne(), "discarded\n");
        EXPECT_EQ(bench.TakeOne().substr(0, 6), "resync");
    }
    bench.Put({callbacks::SystemSuspended{bytes, 16}});
    EXPECT_NE(bench.TakeAll(), "");
    EXPECT_EQ(bench.Counters().lost, 30U);
}

TEST(CallbackQueue, HandsOnStandbyWithoutABlock)
{
    Bench bench(3, 2);
    bench.Put({callbacks::SystemSuspended{nullptr, 0}, callbacks::SystemSuspended{"abc", 0},
               callbacks::SystemSuspended{nullptr, 3}});
    Callback callback = callbacks::PlayStarted();
    bdmv::PlaybackStatus status;
    for (const bd::UInt32 size : {0U, 0U, 3U}) {
        ASSERT_EQ(bench.queue.Take(callback, status), CallbackQueue::StepDeliver);
        EXPECT_EQ(callback, Callback(callbacks::SystemSuspended{nullptr, size}));
        bench.queue.Finish();
    }
}

TEST(CallbackQueue, SharesAProgramUntilItIsTaken)
{
    bool destroyed = false;
    Bench bench(1);
    Callback callback = callbacks::PlayStarted();
    bdmv::PlaybackStatus status;
    bench.Put({callbacks::ExecuteButton{
        1, 2, bdmv::IProgramData::RefPtr(new bdmvtest::TestProgram([&] { destroyed = true; }))}});
    bench.queue.Take(callback, status);
    bench.queue.Finish();
    EXPECT_FALSE(destroyed);
    EXPECT_TRUE(callback.As<callbacks::ExecuteButton>()->program.IsUnique());
    callback = callbacks::PlayStarted();
    EXPECT_TRUE(destroyed);
}

TEST(CallbackQueue, KeepsTheProgramOfACallbackThatIsLostLater)
{
    bool destroyed = false;
    Bench bench(2);
    bench.Put({callbacks::Paused(), callbacks::Paused(), callbacks::Paused()});
    bench.TakeOne();
    bench.Put({callbacks::ExecuteButton{
        1, 2, bdmv::IProgramData::RefPtr(new bdmvtest::TestProgram([&] { destroyed = true; }))}});
    bench.Put({callbacks::Paused()});
    EXPECT_FALSE(destroyed);
    EXPECT_EQ(bench.TakeOne(), "client.Paused()\n");
    EXPECT_EQ(bench.TakeOne(), "discarded\n");
    EXPECT_TRUE(destroyed);
}

TEST(CallbackQueue, DoesNotKeepAProgramThatIsLostAtOnce)
{
    Bench bench(1);
    const bdmv::IProgramData::RefPtr program(new bdmvtest::TestProgram([] {}));
    bench.Put({callbacks::Paused(), callbacks::ExecuteButton{1, 2, program}});
    EXPECT_TRUE(program.IsUnique());
}

TEST(CallbackQueue, DoesNotAllocateAfterConstruction)
{
    CallbackQueue queue(OptionsOf(2));
    const Callback program = callbacks::ExecuteButton{
        1, 2, bdmv::IProgramData::RefPtr(new bdmvtest::TestProgram([] {}))};
    Callback callback = callbacks::PlayStarted();
    bdmv::PlaybackStatus status;
    const std::size_t before = bdmvtest::CountAllocations();
    for (int i = 0; i < 10; ++i) {
        queue.Put(program);
        queue.Put(callbacks::SystemSuspended{"abc", 3});
        queue.Put(callbacks::CurrentTimePosition{1});
        while (queue.Take(callback, status) != CallbackQueue::StepNone) {
            queue.Finish();
        }
    }
    EXPECT_EQ(bdmvtest::CountAllocations(), before);
}
