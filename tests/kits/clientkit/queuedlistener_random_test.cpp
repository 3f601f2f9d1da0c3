// Random streams through tiny queues, with a client that continues at random moments: whatever is
// lost, the client ends with the same status as a listener that received everything.

#include <gtest/gtest.h>

#include <algorithm>
#include <atomic>
#include <random>
#include <thread>
#include <vector>

#include "clientkit/playbackstatus.h"
#include "clientkit/queuedlistener.h"
#include "gate.h"
#include "queuedlistenertest.h"
#include "randomcallbacks.h"

namespace
{

using bdmv::QueuedListener;
using bdmvtest::Gate;
using bdmvtest::IsIdle;
using bdmvtest::OptionsOf;
using bdmvtest::WaitUntilIdle;

/** A ticket that no random callback has: as many bits, but not one of the few values. */
constexpr bd::UInt32 LastTicket = 0x12345678;

/** Follows the status, and stays in each callback until the gate lets it pass. */
class SlowClient : public bdmv::CallbackListener
{
public:
    explicit SlowClient(Gate& gate) : m_rGate(gate) {}

    /** Waits until the queue has delivered all that it has received, and its resync. */
    void WaitForTheEnd(QueuedListener& queued)
    {
        bdmv::IProgramData::RefPtr none;
        while (!m_Last) {
            WaitUntilIdle(queued);
            // Lost if the queue still discards what is lost; then this comes again.
            queued.ExecuteButton(LastTicket, 0, none);
            WaitUntilIdle(queued);
        }
    }

    bdmv::PlaybackStatus Status() const { return m_Status.Status(); }

private:
    void OnCallback(const bdmv::Callback& callback) override
    {
        m_rGate.Pass();
        Deliver(callback, m_Status);
        const auto* const button = callback.As<bdmv::callbacks::ExecuteButton>();
        if (button != nullptr && button->ticket == LastTicket) {
            m_Last = true;
        }
    }

    Gate& m_rGate;
    bdmv::StatusListener m_Status;
    std::atomic<bool> m_Last{false};
};

/** Waits until the client is in a callback, or has nothing to do. */
void WaitForTheClient(const QueuedListener& queued, Gate& gate)
{
    while (!gate.IsWaiting() && !IsIdle(queued)) {
        std::this_thread::yield();
    }
}

/** Delivers to a queue; the client returns from up to two callbacks after each. */
QueuedListener::Counters TestStream(unsigned seed, std::size_t places)
{
    std::mt19937 random(seed);
    Gate gate;
    SlowClient client(gate);
    bdmv::StatusListener direct;
    QueuedListener queued(client, OptionsOf(places));
    for (const bdmv::Callback& callback : bdmvtest::RandomCallbacks(seed).Sequence(200)) {
        Deliver(callback, direct);
        Deliver(callback, queued);
        for (unsigned long steps = random() % 3; steps > 0; --steps) {
            WaitForTheClient(queued, gate);
            if (gate.IsWaiting()) {
                gate.AllowOne();
            }
        }
    }
    gate.Open();
    client.WaitForTheEnd(queued);
    queued.Close();
    EXPECT_EQ(client.Status(), direct.Status()) << "seed " << seed << ", places " << places;
    const QueuedListener::Counters counters = queued.GetCounters();
    EXPECT_EQ(counters.received, counters.delivered + counters.merged + counters.lost);
    return counters;
}

} // namespace

TEST(QueuedListenerRandom, StreamsEndWithTheStatusOfADirectListener)
{
    std::uint64_t lost = 0;
    std::uint64_t delivered = 0;
    for (unsigned seed = 0; seed < 40; ++seed) {
        const QueuedListener::Counters counters = TestStream(seed, 1 + seed % 5);
        lost += counters.lost;
        delivered += counters.delivered;
    }
    EXPECT_GT(lost, 100U);
    EXPECT_GT(delivered, 500U);
}

TEST(QueuedListenerRandom, StreamToAClientThatStaysInItsFirstCallbackLosesWhatFindsNoPlace)
{
    Gate gate;
    SlowClient client(gate);
    bdmv::StatusListener direct;
    QueuedListener queued(client, OptionsOf(10));
    queued.Paused();
    direct.Paused();
    gate.WaitForArrivals(1);
    for (bd::ChapterNumberDef i = 1; i <= 1000; ++i) {
        queued.ChapterNumber(i);
        direct.ChapterNumber(i);
    }
    gate.Open();
    client.WaitForTheEnd(queued);
    queued.Close();
    EXPECT_EQ(client.Status(), direct.Status());
    EXPECT_EQ(client.Status().chapter.value, 1000U);
    const QueuedListener::Counters counters = queued.GetCounters();
    EXPECT_EQ(counters.lost, 990U);
    EXPECT_EQ(counters.resyncs, 1U);
}

TEST(QueuedListenerRandom, ThreadsThatDeliverAtOnceAreAllCounted)
{
    constexpr unsigned Each = 300;
    Gate gate;
    gate.Open();
    SlowClient client(gate);
    bdmv::StatusListener direct;
    QueuedListener queued(client, OptionsOf(4));
    const auto deliver = [&](unsigned seed) {
        for (const bdmv::Callback& callback : bdmvtest::RandomCallbacks(seed).Sequence(Each)) {
            Deliver(callback, queued);
        }
    };
    std::thread first(deliver, 1);
    std::thread second(deliver, 2);
    first.join();
    second.join();
    WaitUntilIdle(queued);
    const QueuedListener::Counters counters = queued.GetCounters();
    EXPECT_EQ(counters.received, 2 * Each);
    EXPECT_EQ(counters.received, counters.delivered + counters.merged + counters.lost);
}

TEST(QueuedListenerRandom, MomentsToCloseLeaveEverythingCounted)
{
    for (unsigned seed = 0; seed < 50; ++seed) {
        Gate gate;
        gate.Open();
        SlowClient client(gate);
        QueuedListener queued(client, OptionsOf(1 + seed % 3));
        std::thread delivering([&] {
            for (const bdmv::Callback& callback : bdmvtest::RandomCallbacks(seed).Sequence(50)) {
                Deliver(callback, queued);
            }
        });
        for (unsigned i = 0; i < seed; ++i) {
            std::this_thread::yield();
        }
        queued.Close();
        delivering.join();
        const QueuedListener::Counters counters = queued.GetCounters();
        EXPECT_EQ(counters.received, 50U);
        EXPECT_EQ(counters.received, counters.delivered + counters.merged + counters.lost);
    }
}
