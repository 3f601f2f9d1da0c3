// A listener that delivers to its client on another thread: what the client receives, and when.

#include "clientkit/queuedlistener.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <limits>
#include <set>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

#include "bdmvnavigator/inavigatorevent.h"
#include "queuedlistenertest.h"
#include "testkit/allocationcounter.h"
#include "testkit/operatornew.h"
#include "testprogram.h"

using bdmv::QueuedListener;
using bdmvtest::ActingListener;
using bdmvtest::OptionsOf;
using bdmvtest::QueuedListenerTest;
using bdmvtest::WaitUntilIdle;

TEST_F(QueuedListenerTest, DeliversWhatAListDelivers)
{
    gate.Open();
    QueuedListener queued(client);
    bd::EventListenerList<bdmv::INavigatorListener> list;
    list.AddListener(&queued);
    bd::EventListenerList_FireParam0(list, &bdmv::INavigatorListener::PlayStarted);
    bd::EventListenerList_FireParam1(list, &bdmv::INavigatorListener::Playlist,
                                     bd::PlayListIdDef(800));
    list.RemoveListener(&queued);
    gate.WaitForArrivals(2);
    queued.Close();
    EXPECT_EQ(journal.Take(), "client.PlayStarted()\nclient.Playlist(800)\n");
}

TEST_F(QueuedListenerTest, DeliversOnOneThreadOfItsOwn)
{
    std::set<std::thread::id> threads;
    ActingListener listener([&](const bdmv::Callback&) {
        threads.insert(std::this_thread::get_id());
        gate.Pass();
    });
    gate.Open();
    QueuedListener queued(listener);
    queued.Paused();
    gate.WaitForArrivals(1);
    queued.Stopped();
    std::thread([&] { queued.PlayStarted(); }).join();
    gate.WaitForArrivals(3);
    queued.Close();
    EXPECT_EQ(threads.size(), 1U);
    EXPECT_EQ(threads.count(std::this_thread::get_id()), 0U);
}

TEST_F(QueuedListenerTest, WithoutPlacesIsRefused)
{
    EXPECT_THROW(QueuedListener(client, OptionsOf(0)), std::invalid_argument);
}

TEST_F(QueuedListenerTest, WithBlocksThatCannotBeAddressedIsRefused)
{
    QueuedListener::Options options;
    options.largestBlock = std::numeric_limits<std::size_t>::max() / 4 + 1;
    EXPECT_THROW(QueuedListener(client, options), std::length_error);
}

TEST_F(QueuedListenerTest, DoesNotMakeItsCallerWaitForTheClient)
{
    QueuedListener queued(client, OptionsOf(2));
    queued.Paused();
    gate.WaitForArrivals(1);
    for (int i = 0; i < 1000; ++i) {
        queued.Stopped(); // would wait for ever
    }
    const QueuedListener::Counters counters = queued.GetCounters();
    EXPECT_EQ(counters.received, 1001U);
    EXPECT_EQ(counters.delivered, 0U);
    EXPECT_EQ(counters.lost, 998U);
    gate.Open();
}

TEST_F(QueuedListenerTest, HasNoPlaceForTheCallbackThatIsRunning)
{
    QueuedListener queued(client, OptionsOf(1));
    queued.Paused();
    gate.WaitForArrivals(1);
    queued.Stopped();
    EXPECT_EQ(queued.GetCounters().lost, 0U);
    queued.Stopped();
    EXPECT_EQ(queued.GetCounters().lost, 1U);
    gate.Open();
}

TEST_F(QueuedListenerTest, HasTwoHundredAndFiftySixPlacesByDefault)
{
    QueuedListener queued(client);
    queued.Paused();
    gate.WaitForArrivals(1);
    for (int i = 0; i < 256; ++i) {
        queued.Stopped();
    }
    EXPECT_EQ(queued.GetCounters().lost, 0U);
    queued.Stopped();
    EXPECT_EQ(queued.GetCounters().lost, 1U);
    gate.Open();
}

TEST_F(QueuedListenerTest, KeepsBlocksOfUpToFourKibibytesByDefault)
{
    const std::vector<char> bytes(4097);
    QueuedListener queued(client);
    queued.Paused();
    gate.WaitForArrivals(1);
    queued.SystemSuspended(bytes.data(), 4096);
    EXPECT_EQ(queued.GetCounters().lost, 0U);
    queued.SystemSuspended(bytes.data(), 4097);
    EXPECT_EQ(queued.GetCounters().lost, 1U);
    gate.Open();
}

TEST_F(QueuedListenerTest, ResynchronisesAClientAfterALoss)
{
    QueuedListener queued(client, OptionsOf(1));
    queued.Paused();
    gate.WaitForArrivals(1);
    queued.Stopped();
    queued.PlayStarted();
    queued.StillOn();
    gate.AllowOne();
    gate.WaitForArrivals(2); // in Stopped(): its place is free
    queued.ChapterNumber(3);
    gate.Open();
    gate.WaitForArrivals(4);
    queued.Close();
    EXPECT_EQ(journal.Take(), "client.Paused()\nclient.Stopped()\n"
                              "client.StillOn()\nclient.ChapterNumber(3)\n");
    const QueuedListener::Counters counters = queued.GetCounters();
    EXPECT_EQ(counters.received, 5U);
    EXPECT_EQ(counters.delivered, 3U);
    EXPECT_EQ(counters.lost, 2U);
    EXPECT_EQ(counters.resyncs, 1U);
}

TEST_F(QueuedListenerTest, ResynchronisesAClientThatNothingElseFollows)
{
    QueuedListener queued(client, OptionsOf(1));
    queued.Paused();
    gate.WaitForArrivals(1);
    queued.PlayStarted();
    queued.StillOn();
    gate.Open();
    gate.WaitForArrivals(3);
    queued.Close();
    EXPECT_EQ(journal.Take(), "client.Paused()\nclient.PlayStarted()\nclient.StillOn()\n");
}

TEST_F(QueuedListenerTest, MergesPositionsWhileTheClientIsBusy)
{
    QueuedListener queued(client, OptionsOf(1));
    queued.CurrentTimePosition(1);
    gate.WaitForArrivals(1);
    queued.CurrentTimePosition(2);
    queued.CurrentTimePosition(3);
    gate.Open();
    gate.WaitForArrivals(2);
    queued.Close();
    EXPECT_EQ(journal.Take(), "client.CurrentTimePosition(1)\nclient.CurrentTimePosition(3)\n");
    EXPECT_EQ(queued.GetCounters().merged, 1U);
    EXPECT_EQ(queued.GetCounters().delivered, 2U);
}

TEST_F(QueuedListenerTest, DeliversACopyOfABlock)
{
    QueuedListener queued(client);
    queued.Paused();
    gate.WaitForArrivals(1);
    std::string bytes = "abc";
    queued.SystemSuspended(bytes.data(), 3);
    bytes = "...";
    gate.Open();
    gate.WaitForArrivals(2);
    queued.Close();
    EXPECT_EQ(journal.Take(), "client.Paused()\nclient.SystemSuspended(bytes 97 98 99, 3)\n");
}

TEST_F(QueuedListenerTest, ReportsAnExceptionAndContinues)
{
    client.onCallback = [this](const std::string& callback) {
        gate.Pass();
        if (callback == "Paused()") {
            throw std::runtime_error("client");
        }
    };
    gate.Open();
    QueuedListener queued(client);
    queued.Paused();
    queued.Stopped();
    gate.WaitForArrivals(2);
    queued.Close();
    const std::string text = journal.Take();
    EXPECT_EQ(text.find("client.Paused()\nassert: bdmv::QueuedListener: the client does not throw, "
                        "kits/clientkit/queuedlistener.cpp:"),
              0U)
        << text;
    EXPECT_NE(text.find("\nclient.Stopped()\n"), std::string::npos) << text;
    EXPECT_EQ(queued.GetCounters().delivered, 2U);
}

TEST_F(QueuedListenerTest, ContinuesAResyncAfterAnException)
{
    client.onCallback = [this](const std::string& callback) {
        gate.Pass();
        if (callback == "StillOn()") {
            throw std::runtime_error("client");
        }
    };
    QueuedListener queued(client, OptionsOf(1));
    queued.Paused();
    gate.WaitForArrivals(1);
    queued.ChapterNumber(1);
    queued.StillOn();
    gate.Open();
    gate.WaitForArrivals(4);
    queued.Close();
    const std::string text = journal.Take();
    EXPECT_NE(text.find("client.StillOn()\nassert: "), std::string::npos) << text;
    EXPECT_EQ(text.substr(text.rfind("client.")), "client.ChapterNumber(1)\n") << text;
}

TEST_F(QueuedListenerTest, ReceivesCallbacksInsideACallbackOfTheClient)
{
    QueuedListener* self = nullptr;
    ActingListener listener([&](const bdmv::Callback& callback) {
        if (callback.Id() == bdmv::CallbackPaused) {
            self->Stopped();
        }
        gate.Pass();
    });
    QueuedListener queued(listener);
    self = &queued;
    gate.Open();
    queued.Paused();
    gate.WaitForArrivals(2);
    WaitUntilIdle(queued);
    EXPECT_EQ(queued.GetCounters().delivered, 2U);
}

TEST_F(QueuedListenerTest, CountsACallbackAsDeliveredWhenItHasReturned)
{
    QueuedListener* self = nullptr;
    std::uint64_t inside = 99;
    ActingListener listener([&](const bdmv::Callback&) { inside = self->GetCounters().delivered; });
    QueuedListener queued(listener);
    self = &queued;
    queued.Paused();
    WaitUntilIdle(queued);
    EXPECT_EQ(inside, 0U);
    EXPECT_EQ(queued.GetCounters().delivered, 1U);
}

TEST_F(QueuedListenerTest, ReleasesProgramsOnTheThreadOfTheClientWithoutALock)
{
    std::thread::id clientThread;
    std::thread::id destroyingThread;
    std::uint64_t received = 0;
    ActingListener listener([&](const bdmv::Callback&) {
        clientThread = std::this_thread::get_id();
        gate.Pass();
    });
    bdmvtest::Gate destroyed;
    QueuedListener queued(listener);
    {
        bdmv::IProgramData::RefPtr program(new bdmvtest::TestProgram([&] {
            destroyingThread = std::this_thread::get_id();
            received = queued.GetCounters().received; // would never return under the lock
            destroyed.Pass();
        }));
        queued.ExecuteButton(1, 2, program);
    }
    gate.Open(); // only now, so that the client's thread releases the program last
    destroyed.WaitForArrivals(1);
    destroyed.Open();
    queued.Close();
    EXPECT_EQ(destroyingThread, clientThread);
    EXPECT_EQ(received, 1U);
}

TEST_F(QueuedListenerTest, ReleasesLostProgramsOnTheThreadOfTheClientToo)
{
    std::thread::id clientThread;
    std::thread::id destroyingThread;
    ActingListener listener([&](const bdmv::Callback&) {
        clientThread = std::this_thread::get_id();
        gate.Pass();
    });
    QueuedListener queued(listener);
    queued.Paused();
    gate.WaitForArrivals(1);
    {
        bdmv::IProgramData::RefPtr program(new bdmvtest::TestProgram([&] {
            destroyingThread = std::this_thread::get_id();
            queued.GetCounters();
        }));
        queued.ExecuteButton(1, 2, program);
    }
    std::thread closer([&] { queued.Close(); });
    while (queued.GetCounters().lost == 0) {
        std::this_thread::yield();
    }
    EXPECT_EQ(destroyingThread, std::thread::id());
    gate.Open();
    closer.join();
    EXPECT_EQ(destroyingThread, clientThread);
}

TEST_F(QueuedListenerTest, WorksAsTheExampleOfItsHeader)
{
    bdmvtest::RecordingListener& userInterface = client;
    bdmv::INavigatorEvent::Listeners listeners;
    std::uint64_t reported = 0;
    const auto Report = [&](std::uint64_t lost, std::uint64_t) { reported = lost; };

    bdmv::QueuedListener queued(userInterface); // starts the thread
    listeners.AddListener(&queued);             // instead of the user interface itself

    for (int i = 0; i < 300; ++i) {
        bd::EventListenerList_FireParam0(listeners, &bdmv::INavigatorListener::JumpOccurred);
    }
    gate.Open();

    listeners.RemoveListener(&queued);
    queued.Close(); // no callback of the user interface runs from here on

    const bdmv::QueuedListener::Counters counters = queued.GetCounters();
    if (counters.lost > 0) {
        Report(counters.lost, counters.received);
    }

    EXPECT_GE(reported, 300U - 257U); // one running, 256 waiting
    EXPECT_EQ(counters.received, 300U);
}

TEST(QueuedListenerAllocations, AreNoneOnEitherThreadAfterConstruction)
{
    bdmvtest::FakePlatform platform(nullptr);
    bdmvtest::Gate gate;
    std::vector<std::size_t> counts;
    counts.reserve(1000);
    ActingListener listener([&](const bdmv::Callback&) {
        counts.push_back(bdmvtest::CountAllocations());
        gate.Pass();
    });
    bdmv::IProgramData::RefPtr program(new bdmvtest::TestProgram([] {}));
    QueuedListener queued(listener, OptionsOf(3));
    const std::size_t before = bdmvtest::CountAllocations();
    queued.Paused();
    gate.WaitForArrivals(1);
    queued.SystemSuspended("abc", 3);
    queued.ExecuteButton(1, 2, program);
    queued.AudioInfoChanged(true, bd::AudioInfoType());
    queued.ChapterNumber(1); // lost
    gate.AllowOne();
    gate.WaitForArrivals(2);
    queued.CurrentTimePosition(1);
    queued.CurrentTimePosition(2);
    gate.Open();
    WaitUntilIdle(queued);
    queued.GetCounters();
    EXPECT_EQ(bdmvtest::CountAllocations(), before);
    queued.Close();
    EXPECT_EQ(queued.GetCounters().resyncs, 1U);
    EXPECT_GT(counts.size(), 6U);
    EXPECT_EQ(counts.front(), counts.back());
}
