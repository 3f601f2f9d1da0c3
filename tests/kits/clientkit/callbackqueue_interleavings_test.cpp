// Every order in which a stream can be received and taken, for small queues: the client is always
// at a place of the stream, loses only what finds no room, and ends with the right status.

#include "clientkit/callbackqueue.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <vector>

#include "callbackqueuebench.h"
#include "stream.h"

namespace
{

namespace callbacks = bdmv::callbacks;
using bdmv::Callback;
using bdmv::CallbackQueue;
using bdmvtest::Follower;
using bdmvtest::Stream;

/** The largest block that the queues of this test keep; blocks of these streams have one byte more.
 */
constexpr std::size_t LargestBlock = 3;

/** Receives callbacks of a resync for a follower. */
class Repetition : public bdmv::CallbackListener
{
public:
    explicit Repetition(Follower& follower) : m_rFollower(follower) {}

private:
    void OnCallback(const Callback& callback) override { m_rFollower.Repeat(callback); }

    Follower& m_rFollower;
};

/** A queue and its client. */
class Run
{
public:
    Run(const Stream& stream, std::size_t places)
        : m_rStream(stream), m_Places(places), m_Queue(bdmvtest::OptionsOf(places, LargestBlock)),
          m_Follower(stream)
    {
    }

    void PutNext()
    {
        const Callback& callback = m_rStream[m_Sent];
        const bdmv::QueuedListener::Counters before = m_Queue.GetCounters();
        m_Queue.Put(callback);
        const bdmv::QueuedListener::Counters after = m_Queue.GetCounters();
        if (after.lost > before.lost) {
            const auto* const standby = callback.As<callbacks::SystemSuspended>();
            EXPECT_TRUE(m_Used == m_Places || (standby != nullptr && standby->size > LargestBlock))
                << "lost although there was room";
            m_LastLost = m_Sent;
        } else if (after.merged == before.merged) {
            ++m_Used;
            EXPECT_LE(m_Used, m_Places);
        }
        ++m_Sent;
    }

    void TakeNext()
    {
        Callback callback = callbacks::PlayStarted();
        bdmv::PlaybackStatus status;
        switch (m_Queue.Take(callback, status)) {
        case CallbackQueue::StepDeliver:
            --m_Used;
            m_Follower.Deliver(callback);
            break;
        case CallbackQueue::StepDiscard:
            --m_Used;
            break;
        case CallbackQueue::StepResync: {
            Repetition repetition(m_Follower);
            Deliver(status, repetition);
            m_Follower.EndResync(m_LastLost);
            break;
        }
        case CallbackQueue::StepNone:
            break;
        }
        m_Queue.Finish();
    }

    void TakeAllAndCheck()
    {
        while (!m_Queue.IsEmpty()) {
            TakeNext();
        }
        EXPECT_TRUE(m_Follower.IsAtTheEnd());
        const bdmv::QueuedListener::Counters counters = m_Queue.GetCounters();
        EXPECT_EQ(counters.received, m_rStream.Size());
        EXPECT_EQ(counters.received, counters.delivered + counters.merged + counters.lost);
        EXPECT_EQ(counters.delivered, m_Follower.delivered);
        EXPECT_EQ(counters.resyncs, m_Follower.resyncs);
        EXPECT_EQ(counters.resyncs > 0, counters.lost > 0);
        EXPECT_LE(counters.resyncs, counters.lost);
    }

private:
    const Stream& m_rStream;
    const std::size_t m_Places;
    CallbackQueue m_Queue;
    Follower m_Follower;
    std::size_t m_Sent = 0;
    std::size_t m_Used = 0;
    std::size_t m_LastLost = 0;
};

/** Zero, one or two steps of the client after each callback, in every combination. */
void TestEveryInterleaving(const Stream& stream)
{
    std::size_t combinations = 1;
    for (std::size_t i = 0; i < stream.Size(); ++i) {
        combinations *= 3;
    }
    for (std::size_t places = 1; places <= 3; ++places) {
        for (std::size_t combination = 0; combination < combinations; ++combination) {
            Run run(stream, places);
            std::size_t steps = combination;
            for (std::size_t i = 0; i < stream.Size(); ++i) {
                run.PutNext();
                for (std::size_t step = steps % 3; step > 0; --step) {
                    run.TakeNext();
                }
                steps /= 3;
            }
            run.TakeAllAndCheck();
            ASSERT_FALSE(::testing::Test::HasFailure())
                << "with " << places << " places, combination " << combination;
        }
    }
}

} // namespace

TEST(CallbackQueueInterleavings, OfDistinctCallbacksKeepTheClientInTheStream)
{
    TestEveryInterleaving(
        Stream({callbacks::PlayStarted(), callbacks::ChapterNumber{1}, callbacks::AudioInfo{1},
                callbacks::ChapterNumber{2}, callbacks::Stepped{5, bd::PlayDirectionForward},
                callbacks::AudioInfo{2}, callbacks::Stopped()}));
}

TEST(CallbackQueueInterleavings, OfPositionsKeepTheClientInTheStream)
{
    TestEveryInterleaving(
        Stream({callbacks::CurrentTimePosition{1}, callbacks::CurrentTimePosition{2},
                callbacks::ChapterNumber{1}, callbacks::CurrentTimePosition{3},
                callbacks::CurrentTimePosition{4}, callbacks::CurrentTimePosition{5},
                callbacks::ChapterNumber{2}}));
}

TEST(CallbackQueueInterleavings, OfBlocksThatAreTooLargeKeepTheClientInTheStream)
{
    static const char bytes[LargestBlock + 1] = {};
    TestEveryInterleaving(
        Stream({callbacks::ChapterNumber{1}, callbacks::SystemSuspended{bytes, sizeof bytes},
                callbacks::CurrentTimePosition{1}, callbacks::ChapterNumber{2},
                callbacks::SystemSuspended{bytes, sizeof bytes}, callbacks::CurrentTimePosition{2},
                callbacks::SystemResumed{true}}));
}
