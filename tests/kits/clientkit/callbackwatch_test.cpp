// A listener that measures another one.

#include "clientkit/callbackwatch.h"

#include <gtest/gtest.h>

#include <atomic>
#include <chrono>
#include <functional>
#include <stdexcept>
#include <string>
#include <thread>

#include "bdmvnavigator/inavigatorevent.h"
#include "database/iprogramdata.h"
#include "testkit/allocationcounter.h"
#include "testkit/fakeplatform.h"
#include "testkit/operatornew.h"
#include "testkit/recordinglistener.h"

namespace
{

using bdmv::CallbackWatch;
using std::chrono::microseconds;
using std::chrono::steady_clock;

/** Whatever a callback takes is over this budget. */
constexpr microseconds None(-1);

constexpr microseconds Hours = std::chrono::hours(24);

/** Keeps the calling thread busy for at least this long. */
void Spin(microseconds time)
{
    const steady_clock::time_point begin = steady_clock::now();
    while (steady_clock::now() - begin < time) {
    }
}

/** Runs an action of the test in every callback. */
class Client : public bdmv::CallbackListener
{
public:
    std::function<void()> onCallback = [] {};

private:
    void OnCallback(const bdmv::Callback& /*callback*/) override { onCallback(); }
};

class CallbackWatchTest : public ::testing::Test
{
protected:
    CallbackWatchTest() { platform.RecordFormats(); }

    bdmvtest::Journal journal;
    bdmvtest::FakePlatform platform{&journal};
    Client client;
    CallbackWatch watch{client, "user interface", Hours};
};

std::size_t CountLines(const std::string& text, const std::string& line)
{
    std::size_t count = 0;
    for (std::size_t found = text.find(line); found != std::string::npos;
         found = text.find(line, found + 1)) {
        ++count;
    }
    return count;
}

} // namespace

TEST_F(CallbackWatchTest, PassesCallbacksOn)
{
    bdmvtest::RecordingListener recorder(journal, "client");
    CallbackWatch recorded(recorder, "recorder", Hours);
    bd::EventListenerList<bdmv::INavigatorListener> list;
    list.AddListener(&recorded);
    bd::EventListenerList_FireParam2(list, &bdmv::INavigatorListener::AudioInfoChanged, true,
                                     bd::AudioInfoType());
    recorded.PlayItem(800, 3, bd::VideoFormatType1080p, bd::VideoAspectRatioType16x9);
    const std::string text = journal.Take();
    EXPECT_EQ(text.find("client.AudioInfoChanged(true, "), 0U) << text;
    EXPECT_NE(text.find("client.PlayItem(800, 3, VideoFormatType1080p, VideoAspectRatioType16x9)"),
              std::string::npos)
        << text;
}

TEST_F(CallbackWatchTest, MeasuresTheTimeOfTheClient)
{
    client.onCallback = [] { Spin(microseconds(300)); };
    const steady_clock::time_point begin = steady_clock::now();
    watch.Paused();
    watch.Paused();
    const steady_clock::duration outside = steady_clock::now() - begin;
    const CallbackWatch::Statistics statistics = watch.Get(bdmv::CallbackPaused);
    EXPECT_EQ(statistics.count, 2U);
    EXPECT_GE(statistics.longest, microseconds(300));
    EXPECT_GE(statistics.total, microseconds(600));
    EXPECT_LE(statistics.longest, statistics.total - microseconds(300));
    EXPECT_LE(statistics.total, outside);
}

TEST_F(CallbackWatchTest, KeepsAHistogram)
{
    client.onCallback = [] { Spin(microseconds(300)); };
    watch.Paused();
    const CallbackWatch::Statistics statistics = watch.Get(bdmv::CallbackPaused);
    std::uint64_t slower = 0;
    for (std::size_t place = 9; place < 24; ++place) { // 256 us or more
        slower += statistics.histogram[place];
    }
    EXPECT_EQ(slower, 1U);
}

TEST_F(CallbackWatchTest, KeepsStatisticsByCallback)
{
    watch.Paused();
    EXPECT_EQ(watch.Get(bdmv::CallbackPaused).count, 1U);
    EXPECT_EQ(watch.Get(bdmv::CallbackStopped).count, 0U);
    EXPECT_EQ(watch.Get(bdmv::Callback__sizeof).count, 0U);
}

TEST_F(CallbackWatchTest, ReportsACallbackOverBudget)
{
    CallbackWatch strict(client, "user interface", microseconds(100));
    client.onCallback = [] { Spin(microseconds(150)); };
    strict.CurrentTimePosition(900000);
    EXPECT_EQ(journal.Take(),
              "log? 57 3 0 -> on\n"
              "format: Slow callback - listener: %s, callback: %s, time: %llu us\n"
              "log 57 3 0: Slow callback - listener: user interface, callback: "
              "CurrentTimePosition, time: " +
                  std::to_string(strict.Get(bdmv::CallbackCurrentTimePosition).longest.count()) +
                  " us\n");
}

TEST_F(CallbackWatchTest, DoesNotReportACallbackWithinBudget)
{
    watch.CurrentTimePosition(900000);
    EXPECT_EQ(journal.Take(), "");
}

TEST_F(CallbackWatchTest, WritesNoLineThatIsSwitchedOff)
{
    platform.DisableLog();
    CallbackWatch strict(client, "user interface", None);
    strict.Paused();
    EXPECT_EQ(journal.Take(), "log? 57 3 0 -> off\n");
}

TEST_F(CallbackWatchTest, ReportsAtMostOneASecondAndCallback)
{
    CallbackWatch strict(client, "user interface", None);
    const steady_clock::time_point begin = steady_clock::now();
    for (int i = 0; i < 1000; ++i) {
        strict.Paused();
        strict.Stopped();
    }
    const std::chrono::duration<double> passed = steady_clock::now() - begin;
    const std::string text = journal.Take();
    for (const char* const callback : {"callback: Paused", "callback: Stopped"}) {
        const std::size_t lines = CountLines(text, callback);
        EXPECT_GE(lines, 1U) << callback;
        EXPECT_LE(static_cast<double>(lines), 1 + passed.count()) << callback;
    }
}

TEST_F(CallbackWatchTest, PassesExceptionsOnAndCountsTheirTime)
{
    CallbackWatch strict(client, "user interface", microseconds(100));
    client.onCallback = [] {
        Spin(microseconds(150));
        throw std::runtime_error("client");
    };
    EXPECT_THROW(strict.Paused(), std::runtime_error);
    EXPECT_EQ(strict.Get(bdmv::CallbackPaused).count, 1U);
    EXPECT_GE(strict.Get(bdmv::CallbackPaused).total, microseconds(150));
    EXPECT_EQ(CountLines(journal.Take(), "callback: Paused"), 1U);
}

TEST_F(CallbackWatchTest, CopiesTheNameOfTheClient)
{
    std::string name = "front panel";
    CallbackWatch strict(client, name.c_str(), None);
    name = "overwritten";
    strict.Paused();
    EXPECT_EQ(CountLines(journal.Take(), "listener: front panel, "), 1U);
}

TEST_F(CallbackWatchTest, MayBeReadInsideACallbackOnAnyThread)
{
    std::uint64_t inside = 99;
    std::uint64_t onOtherThread = 99;
    client.onCallback = [&] {
        inside = watch.Get(bdmv::CallbackPaused).count;
        std::thread([&] { onOtherThread = watch.Get(bdmv::CallbackPaused).count; }).join();
    };
    watch.Paused();
    EXPECT_EQ(inside, 0U);
    EXPECT_EQ(onOtherThread, 0U);
}

TEST_F(CallbackWatchTest, MayBeReadWhileTheLogIsWritten)
{
    CallbackWatch strict(client, "user interface", None);
    std::uint64_t whileLogging = 99;
    platform.SetLogSwitch([&](KEVRO_UInt32, KEVRO_Int32, KEVRO_Bool) -> KEVRO_Bool {
        whileLogging = strict.Get(bdmv::CallbackPaused).count;
        return 0;
    });
    strict.Paused();
    EXPECT_EQ(whileLogging, 1U);
}

TEST_F(CallbackWatchTest, CountsCallbacksOfConcurrentThreads)
{
    constexpr int Each = 500;
    std::atomic<bool> over(false);
    std::thread reader([&] {
        std::uint64_t last = 0;
        while (!over) {
            const CallbackWatch::Statistics statistics = watch.Get(bdmv::CallbackPaused);
            std::uint64_t counted = 0;
            for (const std::uint64_t place : statistics.histogram) {
                counted += place;
            }
            EXPECT_EQ(statistics.count, counted);
            EXPECT_GE(statistics.count, last);
            last = statistics.count;
        }
    });
    const auto deliver = [this] {
        for (int i = 0; i < Each; ++i) {
            watch.Paused();
        }
    };
    std::thread first(deliver);
    std::thread second(deliver);
    first.join();
    second.join();
    over = true;
    reader.join();
    EXPECT_EQ(watch.Get(bdmv::CallbackPaused).count, 2U * Each);
}

TEST(CallbackWatchExample, OfItsHeaderWorks)
{
    const bdmvtest::FakePlatform platform(nullptr);
    Client userInterface;
    bdmv::INavigatorEvent::Listeners listeners;
    microseconds shown(-1);
    const auto Show = [&](microseconds longest, microseconds mean) { shown = longest + mean; };

    bdmv::CallbackWatch watch(userInterface, "user interface", std::chrono::milliseconds(5));
    listeners.AddListener(&watch); // instead of the user interface itself

    bd::EventListenerList_FireParam4(listeners, &bdmv::INavigatorListener::PlayItem,
                                     bd::PlayListIdDef(800), bd::PlayItemIdDef(0),
                                     bd::VideoFormatType1080p, bd::VideoAspectRatioType16x9);

    const bdmv::CallbackWatch::Statistics statistics = watch.Get(bdmv::CallbackPlayItem);
    if (statistics.count > 0) {
        Show(statistics.longest, statistics.total / statistics.count);
    }

    EXPECT_EQ(shown, statistics.longest + statistics.total);
}

TEST(CallbackWatchAllocations, AreNoneAfterConstruction)
{
    bdmvtest::FakePlatform platform(nullptr);
    Client client;
    CallbackWatch watch(client, "a name that does not fit into the string itself", None);
    const std::size_t before = bdmvtest::CountAllocations();
    watch.Paused();
    watch.AudioInfoChanged(true, bd::AudioInfoType());
    watch.Get(bdmv::CallbackPaused);
    EXPECT_EQ(bdmvtest::CountAllocations(), before);
}
