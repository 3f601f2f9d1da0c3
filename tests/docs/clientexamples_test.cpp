// The examples of docs/clients.md.

#include <gtest/gtest.h>

#include <atomic>
#include <chrono>
#include <string>
#include <vector>

#include "bdmvnavigator/inavigatorevent.h"
#include "bdmvnavigator/navigatorevent.h"
#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "clientkit/blackbox.h"
#include "clientkit/callbackwatch.h"
#include "clientkit/listenerrelay.h"
#include "clientkit/playbackstatus.h"
#include "clientkit/queuedlistener.h"
#include "clientkit/scopedlistener.h"
#include "kits/clientkit/randomcallbacks.h"
#include "testkit/bench.h"
#include "testkit/spylistener.h"

namespace
{

typedef bdmv::INavigatorEvent::Listeners Listeners;

void Fire(Listeners& listeners, void (bdmv::INavControlListener::*callback)())
{
    bd::EventListenerList_FireParam0(listeners, callback);
}

void FireChapter(Listeners& listeners, bd::ChapterNumberDef chapter)
{
    bd::EventListenerList_FireParam1(listeners, &bdmv::INavigatorListener::ChapterNumber, chapter);
}

class Recorder : public bdmv::CallbackListener
{
public:
    const std::vector<bdmv::Callback>& Callbacks() const { return m_Callbacks; }

private:
    void OnCallback(const bdmv::Callback& callback) override
    {
        if (callback.Id() != bdmv::CallbackCurrentTimePosition) {
            m_Callbacks.push_back(callback);
        }
    }

    std::vector<bdmv::Callback> m_Callbacks;
};

TEST(ClientExamples, CallbackListener)
{
    Recorder recorder;
    recorder.PlayStarted();
    recorder.CurrentTimePosition(45000);
    recorder.ChapterNumber(2);
    std::vector<bd::ChapterNumberDef> bookmarks;
    bdmvtest::CallbackKeeper userInterface;

    for (const bdmv::Callback& callback : recorder.Callbacks()) {
        if (const auto* const chapter = callback.As<bdmv::callbacks::ChapterNumber>()) {
            bookmarks.push_back(chapter->chapter);
        }
        Deliver(callback, userInterface);
    }

    EXPECT_EQ(bookmarks, std::vector<bd::ChapterNumberDef>{2});
    EXPECT_EQ(userInterface.callbacks, recorder.Callbacks());
    EXPECT_EQ(userInterface.callbacks.size(), 2U);
}

class FrontPanel
{
public:
    explicit FrontPanel(bdmv::INavigatorEvent::Listeners& listeners)
        : m_Registration(listeners, m_Lamp)
    {
    }

    bool IsLit() const { return m_Lamp.isLit; }

private:
    struct PauseLamp : bdmv::NavigatorListenerAdapter {
        void Paused() override { isLit = true; }
        void Continued(bd::PlayDirectionDef, bd::PlaySpeedDef) override { isLit = false; }

        std::atomic<bool> isLit{false};
    };

    PauseLamp m_Lamp;
    bdmv::ScopedListener<bdmv::INavigatorListener> m_Registration;
};

TEST(ClientExamples, ScopedListener)
{
    Listeners listeners;
    {
        const FrontPanel panel(listeners);
        Fire(listeners, &bdmv::INavigatorListener::Paused);
        EXPECT_TRUE(panel.IsLit());
        bd::EventListenerList_FireParam2(listeners, &bdmv::INavigatorListener::Continued,
                                         bd::PlayDirectionForward, bd::PlaySpeedNormal);
        EXPECT_FALSE(panel.IsLit());
    }
    Fire(listeners, &bdmv::INavigatorListener::Paused);
}

std::string WhatIsPlaying(const bdmv::StatusListener& follower)
{
    const bdmv::PlaybackStatus status = follower.Status();
    if (!status.state.known || status.state.value == bdmv::PlaybackStopped) {
        return "nothing";
    }
    std::string answer = NameOf(status.state.value);
    if (status.chapter.known) {
        answer += ", chapter " + std::to_string(status.chapter.value);
    }
    return answer;
}

TEST(ClientExamples, StatusListener)
{
    Listeners listeners;
    bdmv::StatusListener follower;
    listeners.AddListener(&follower);

    EXPECT_EQ(WhatIsPlaying(follower), "nothing");
    Fire(listeners, &bdmv::INavigatorListener::PlayStarted);
    EXPECT_EQ(WhatIsPlaying(follower), "Playing");
    FireChapter(listeners, 3);
    Fire(listeners, &bdmv::INavigatorListener::Paused);
    EXPECT_EQ(WhatIsPlaying(follower), "Paused, chapter 3");
    Fire(listeners, &bdmv::INavigatorListener::Stopped);
    EXPECT_EQ(WhatIsPlaying(follower), "nothing");
}

TEST(ClientExamples, ListenerRelay)
{
    Listeners listeners;
    bdmvtest::CallbackKeeper userInterface;

    bdmv::ListenerRelay relay;
    listeners.AddListener(&relay); // before playback starts

    Fire(listeners, &bdmv::INavigatorListener::PlayStarted);
    FireChapter(listeners, 5);

    relay.Join(userInterface);  // PlayStarted(), ChapterNumber(5), ...
    relay.Leave(userInterface); // no callback of userInterface runs from here on

    FireChapter(listeners, 6);
    EXPECT_EQ(userInterface.callbacks,
              (std::vector<bdmv::Callback>{bdmv::callbacks::PlayStarted{},
                                           bdmv::callbacks::ChapterNumber{5}}));
}

TEST(ClientExamples, QueuedListener)
{
    Listeners listeners;
    bdmvtest::SpyListener userInterface;

    bdmv::QueuedListener queued(userInterface); // starts the thread
    listeners.AddListener(&queued);             // instead of the user interface itself

    Fire(listeners, &bdmv::INavigatorListener::Paused);
    EXPECT_TRUE(userInterface.WaitFor(bdmv::CallbackPaused, std::chrono::minutes(1)));

    listeners.RemoveListener(&queued);
    queued.Close(); // no callback of userInterface runs from here on

    const bdmv::QueuedListener::Counters counters = queued.GetCounters();
    EXPECT_EQ(counters.delivered, 1U);
    EXPECT_EQ(counters.lost, 0U);
}

TEST(ClientExamples, CallbackWatch)
{
    Listeners listeners;
    bdmvtest::SpyListener userInterface;

    bdmv::CallbackWatch watch(userInterface, "user interface", std::chrono::milliseconds(5));
    listeners.AddListener(&watch); // instead of the user interface itself

    Fire(listeners, &bdmv::INavigatorListener::Paused);

    const bdmv::CallbackWatch::Statistics pauses = watch.Get(bdmv::CallbackPaused);
    EXPECT_EQ(pauses.count, 1U);
    EXPECT_EQ(userInterface.Count(bdmv::CallbackPaused), 1U);
}

void WriteToReport(void* report, const char* bytes, std::size_t size)
{
    static_cast<std::string*>(report)->append(bytes, size);
}

std::string FailureReport(const bdmv::BlackBox& box)
{
    std::string report;
    box.Dump(WriteToReport, &report);
    return report;
}

TEST(ClientExamples, BlackBox)
{
    const auto TicksSinceStart = []() -> std::uint64_t { return 90000; };
    bdmv::BlackBox box(1000, TicksSinceStart);
    box.ChapterNumber(3);

    const std::string report = FailureReport(box);
    EXPECT_NE(report.find("\"ticks\":90000,"), std::string::npos) << report;
    EXPECT_NE(report.find("\"ChapterNumber\",\"arguments\":{\"chapter\":3}"), std::string::npos)
        << report;
}

TEST(ClientExamples, Bench)
{
    bdmv::StatusListener follower;
    bdmvtest::Bench bench{&follower};
    bench.context.currentChapter = 3;
    bench.Dispatch<bdmv::PlayStartedEvent>();
    bench.Dispatch<bdmv::ChapterEvent>();

    EXPECT_EQ(WhatIsPlaying(follower), "Playing, chapter 3");
}

} // namespace
