// What a queue borrows, copies and shares: blocks and programs.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "callbackqueuebench.h"
#include "testkit/allocationcounter.h"
#include "testprogram.h"

namespace callbacks = bdmv::callbacks;
using bdmv::Callback;
using bdmv::CallbackQueue;
using bdmvtest::OptionsOf;
typedef bdmvtest::QueueBench Bench;

TEST(CallbackQueueArguments, CopiesBlocks)
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

TEST(CallbackQueueArguments, LosesABlockThatIsTooLargeAndGivesTheRestOfTheState)
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

TEST(CallbackQueueArguments, LosesABlockThatFindsNoRoomAmongOtherBlocks)
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

TEST(CallbackQueueArguments, KeepsTheBlockOfACallbackUntilItIsFinished)
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

TEST(CallbackQueueArguments, FreesTheBlocksOfCallbacksThatAreLostLater)
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

TEST(CallbackQueueArguments, HandsOnStandbyWithoutABlock)
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

TEST(CallbackQueueArguments, SharesAProgramUntilItIsTaken)
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

TEST(CallbackQueueArguments, KeepsTheProgramOfACallbackThatIsLostLater)
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

TEST(CallbackQueueArguments, DoesNotKeepAProgramThatIsLostAtOnce)
{
    Bench bench(1);
    const bdmv::IProgramData::RefPtr program(new bdmvtest::TestProgram([] {}));
    bench.Put({callbacks::Paused(), callbacks::ExecuteButton{1, 2, program}});
    EXPECT_TRUE(program.IsUnique());
}

TEST(CallbackQueueArguments, DoesNotAllocateAfterConstruction)
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
