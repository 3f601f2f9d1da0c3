// The end of a queue: Close() and the destructor, at every moment and on every thread.

#include <gtest/gtest.h>

#include <atomic>
#include <future>
#include <memory>
#include <string>
#include <system_error>
#include <thread>

#include "bdmvnavigator/inavigatorevent.h"
#include "clientkit/queuedlistener.h"
#include "queuedlistenertest.h"
#include "testprogram.h"

using bdmv::QueuedListener;
using bdmvtest::ActingListener;
using bdmvtest::OptionsOf;
using bdmvtest::QueuedListenerTest;
using bdmvtest::WaitUntilIdle;

typedef QueuedListenerTest QueuedListenerCloseTest;

namespace
{

/** Waits until the queue has lost a callback, which shows that Close() has begun. */
void WaitForLoss(const QueuedListener& queued)
{
    while (queued.GetCounters().lost == 0) {
        std::this_thread::yield();
    }
}

/** Gives other threads many chances to run. */
void YieldOften()
{
    for (int i = 0; i < 1000; ++i) {
        std::this_thread::yield();
    }
}

} // namespace

TEST_F(QueuedListenerCloseTest, EndsAQueueThatIsIdle)
{
    QueuedListener queued(client);
    queued.Close();
    EXPECT_EQ(queued.GetCounters().received, 0U);
}

TEST_F(QueuedListenerCloseTest, WaitsForTheCallbackThatIsRunning)
{
    QueuedListener* self = nullptr;
    std::atomic<bool> returned(false);
    ActingListener listener([&](const bdmv::Callback&) {
        gate.Pass();
        WaitForLoss(*self);
        YieldOften();
        returned = true;
    });
    QueuedListener queued(listener);
    self = &queued;
    queued.Paused();
    gate.WaitForArrivals(1);
    queued.Stopped();
    gate.Open();
    queued.Close();
    EXPECT_TRUE(returned);
    EXPECT_EQ(queued.GetCounters().delivered, 1U);
}

TEST_F(QueuedListenerCloseTest, LosesAndCountsWhatWaits)
{
    QueuedListener queued(client);
    queued.Paused();
    gate.WaitForArrivals(1);
    queued.Stopped();
    queued.PlayStarted();
    std::thread closer([&] { queued.Close(); });
    WaitForLoss(queued);
    gate.Open();
    closer.join();
    EXPECT_EQ(journal.Take(), "client.Paused()\n");
    const QueuedListener::Counters counters = queued.GetCounters();
    EXPECT_EQ(counters.received, 3U);
    EXPECT_EQ(counters.delivered, 1U);
    EXPECT_EQ(counters.lost, 2U);
}

TEST_F(QueuedListenerCloseTest, CancelsAResync)
{
    QueuedListener queued(client, OptionsOf(1));
    queued.Paused();
    gate.WaitForArrivals(1);
    queued.Stopped();
    queued.PlayStarted();
    std::thread closer([&] { queued.Close(); });
    while (queued.GetCounters().lost < 2) {
        std::this_thread::yield();
    }
    gate.Open();
    closer.join();
    EXPECT_EQ(journal.Take(), "client.Paused()\n");
    EXPECT_EQ(queued.GetCounters().resyncs, 0U);
}

TEST_F(QueuedListenerCloseTest, CutsAResyncShort)
{
    QueuedListener queued(client, OptionsOf(1));
    queued.Paused();
    gate.WaitForArrivals(1);
    queued.ChapterNumber(1);
    queued.StillOn();
    gate.AllowOne();
    gate.AllowOne();
    gate.WaitForArrivals(3); // in the resync
    queued.Stopped();
    std::thread closer([&] { queued.Close(); });
    while (queued.GetCounters().lost < 2) {
        std::this_thread::yield();
    }
    gate.Open();
    closer.join();
    EXPECT_EQ(journal.Take(), "client.Paused()\nclient.ChapterNumber(1)\nclient.StillOn()\n");
    EXPECT_EQ(queued.GetCounters().resyncs, 0U);
}

TEST_F(QueuedListenerCloseTest, LosesAndCountsWhatIsReceivedAfterwards)
{
    gate.Open();
    QueuedListener queued(client);
    queued.Close();
    queued.Paused();
    EXPECT_EQ(queued.GetCounters().received, 1U);
    EXPECT_EQ(queued.GetCounters().lost, 1U);
    queued.Close();
    EXPECT_EQ(journal.Take(), "");
}

TEST_F(QueuedListenerCloseTest, MayBeRepeated)
{
    gate.Open();
    QueuedListener queued(client);
    queued.Close();
    queued.Close();
}

TEST_F(QueuedListenerCloseTest, IsAllowedOnAThreadThatHasTheIdOfTheEndedOne)
{
    gate.Open();
    QueuedListener queued(client);
    queued.Paused();
    gate.WaitForArrivals(1);
    queued.Close();
    for (int i = 0; i < 20; ++i) { // the system uses the id again, mostly at once
        std::thread([&] { EXPECT_NO_THROW(queued.Close()); }).join();
    }
}

TEST_F(QueuedListenerCloseTest, WaitsOnEveryThreadThatCloses)
{
    QueuedListener* self = nullptr;
    std::atomic<bool> returned(false);
    ActingListener listener([&](const bdmv::Callback&) {
        gate.Pass();
        WaitForLoss(*self);
        YieldOften();
        returned = true;
    });
    QueuedListener queued(listener);
    self = &queued;
    queued.Paused();
    gate.WaitForArrivals(1);
    queued.Stopped();
    const auto close = [&] {
        queued.Close();
        EXPECT_TRUE(returned);
    };
    gate.Open();
    std::thread first(close);
    std::thread second(close);
    first.join();
    second.join();
}

TEST_F(QueuedListenerCloseTest, InsideACallbackThrowsAndChangesNothing)
{
    QueuedListener* self = nullptr;
    std::error_code code;
    ActingListener listener([&](const bdmv::Callback& callback) {
        if (callback.Id() == bdmv::CallbackPaused) {
            try {
                self->Close();
            } catch (const std::system_error& error) {
                code = error.code();
            }
        }
    });
    QueuedListener queued(listener);
    self = &queued;
    queued.Paused();
    queued.Stopped();
    WaitUntilIdle(queued);
    EXPECT_EQ(code, std::errc::resource_deadlock_would_occur);
    EXPECT_EQ(queued.GetCounters().delivered, 2U);
    EXPECT_EQ(queued.GetCounters().lost, 0U);
}

TEST_F(QueuedListenerCloseTest, InsideTheDestructorOfAProgramThrows)
{
    std::error_code code;
    bdmvtest::Gate destroyed;
    ActingListener listener([&](const bdmv::Callback&) { gate.Pass(); });
    QueuedListener queued(listener);
    {
        bdmv::IProgramData::RefPtr program(new bdmvtest::TestProgram([&] {
            try {
                queued.Close();
            } catch (const std::system_error& error) {
                code = error.code();
            }
            destroyed.Pass();
        }));
        queued.ExecuteButton(1, 2, program);
    }
    gate.Open(); // only now, so that the client's thread releases the program last
    destroyed.WaitForArrivals(1);
    destroyed.Open();
    queued.Close();
    EXPECT_EQ(code, std::errc::resource_deadlock_would_occur);
}

TEST_F(QueuedListenerCloseTest, HappensInTheDestructor)
{
    QueuedListener* self = nullptr;
    std::atomic<bool> returned(false);
    ActingListener listener([&](const bdmv::Callback&) {
        gate.Pass();
        WaitForLoss(*self);
        YieldOften();
        returned = true;
    });
    {
        QueuedListener queued(listener);
        self = &queued;
        queued.Paused();
        gate.WaitForArrivals(1);
        queued.Stopped();
        gate.Open();
    }
    EXPECT_TRUE(returned);
}

TEST_F(QueuedListenerCloseTest, InTheDestructorAfterCloseIsHarmless)
{
    gate.Open();
    auto queued = std::make_unique<QueuedListener>(client);
    queued->Paused();
    queued->Close();
    queued.reset();
    EXPECT_EQ(journal.Take().find("assert"), std::string::npos);
}

TEST_F(QueuedListenerCloseTest, ByTheDestructorInsideACallbackIsReportedAndThatCallbackIsTheLast)
{
    std::unique_ptr<QueuedListener> queued;
    // Shared, because the thread that nobody waits for may still be in it when the test is over.
    const auto destroyed = std::make_shared<std::promise<void>>();
    int calls = 0;
    ActingListener listener([&](const bdmv::Callback&) {
        gate.Pass();
        ++calls;
        queued.reset();
    });
    queued = std::make_unique<QueuedListener>(listener);
    queued->Paused();
    gate.WaitForArrivals(1);
    {
        bdmv::IProgramData::RefPtr program(
            new bdmvtest::TestProgram([destroyed] { destroyed->set_value(); }));
        queued->ExecuteButton(1, 2, program);
    }
    gate.Open();
    destroyed->get_future().wait();
    EXPECT_EQ(calls, 1);
    const std::string text = journal.Take();
    EXPECT_EQ(text.find("assert: bdmv::QueuedListener: not destroyed inside a callback of its "
                        "client, kits/clientkit/queuedlistener.cpp:"),
              0U)
        << text;
}

TEST_F(QueuedListenerCloseTest, LetsTheClientBeDestroyedFirst)
{
    gate.Open();
    auto listener =
        std::make_unique<ActingListener>([this](const bdmv::Callback&) { gate.Pass(); });
    QueuedListener queued(*listener);
    queued.Paused();
    queued.Close();
    listener.reset();
    queued.Stopped();
    EXPECT_EQ(queued.GetCounters().received, 2U);
}

TEST_F(QueuedListenerCloseTest, IsIndependentOfTheLifeOfTheList)
{
    gate.Open();
    QueuedListener queued(client);
    {
        bdmv::INavigatorEvent::Listeners listeners;
        listeners.AddListener(&queued);
        bd::EventListenerList_FireParam0(listeners, &bdmv::INavigatorListener::Paused);
    }
    gate.WaitForArrivals(1);
    queued.Close();
    EXPECT_EQ(journal.Take(), "client.Paused()\n");
}
