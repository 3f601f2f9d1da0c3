#include "testkit/spylistener.h"

#include <gtest/gtest.h>

#include <chrono>
#include <stdexcept>
#include <thread>
#include <vector>

#include "testkit/matchers.h"

namespace
{

namespace callbacks = bdmv::callbacks;
using bdmvtest::Is;
using bdmvtest::SpyListener;
using std::chrono::milliseconds;
using testing::ElementsAre;
using testing::IsEmpty;

/** Long enough under an emulator; a test that passes does not wait for it. */
const milliseconds Long = std::chrono::seconds(60);
const milliseconds None(0);

TEST(SpyListener, KeepsCallbacksInOrder)
{
    SpyListener spy;
    spy.PlayStarted();
    spy.Playlist(800);
    EXPECT_THAT(spy.Callbacks(),
                ElementsAre(Is(callbacks::PlayStarted()), Is(callbacks::Playlist{800})));
}

TEST(SpyListener, CountsCallbacksByKind)
{
    SpyListener spy;
    spy.Paused();
    spy.Playlist(800);
    spy.Paused();
    EXPECT_EQ(spy.Count(), 3u);
    EXPECT_EQ(spy.Count(bdmv::CallbackPaused), 2u);
    EXPECT_EQ(spy.Count(bdmv::CallbackStopped), 0u);
}

TEST(SpyListener, CountsNoneForAValueThatIsNoCallback)
{
    SpyListener spy;
    spy.InteractiveGraphicsInactive(); // the last one
    EXPECT_EQ(spy.Count(bdmv::Callback__sizeof), 0u);
    EXPECT_EQ(spy.Count(static_cast<bdmv::CallbackId>(-1)), 0u);
}

TEST(SpyListener, ForgetsWhatIsTaken)
{
    SpyListener spy;
    spy.Paused();
    EXPECT_THAT(spy.Take(), ElementsAre(Is(callbacks::Paused())));
    EXPECT_THAT(spy.Callbacks(), IsEmpty());
    EXPECT_EQ(spy.Count(bdmv::CallbackPaused), 0u);
}

TEST(SpyListener, ForgetsWhatIsCleared)
{
    SpyListener spy;
    spy.Paused();
    spy.Clear();
    EXPECT_THAT(spy.Callbacks(), IsEmpty());
}

TEST(SpyListener, OwnsTheBytesOfSystemSuspended)
{
    SpyListener spy;
    std::vector<bd::UInt8> bytes = {1, 2, 3};
    spy.SystemSuspended(bytes.data(), 3);
    bytes = {4, 5, 6};
    spy.SystemSuspended(bytes.data(), 3);
    const std::vector<bdmv::Callback> received = spy.Take();
    bytes.clear();
    bytes.shrink_to_fit();
    const bd::UInt8 first[] = {1, 2, 3};
    const bd::UInt8 second[] = {4, 5, 6};
    EXPECT_THAT(received, ElementsAre(Is(callbacks::SystemSuspended{first, 3}),
                                      Is(callbacks::SystemSuspended{second, 3})));
}

TEST(SpyListener, KeepsAnEmptyBlockApartFromNone)
{
    SpyListener spy;
    const bd::UInt8 byte = 1;
    spy.SystemSuspended(&byte, 0);
    spy.SystemSuspended(nullptr, 3);
    EXPECT_THAT(spy.Callbacks(), ElementsAre(Is(callbacks::SystemSuspended{&byte, 0}),
                                             Is(callbacks::SystemSuspended{nullptr, 3})));
}

TEST(SpyListener, RunsAnActionAfterKeepingTheCallback)
{
    SpyListener spy;
    std::vector<bdmv::Callback> atTheAction;
    spy.onCallback = [&](const bdmv::Callback& callback) {
        EXPECT_EQ(callback, bdmv::Callback(callbacks::Playlist{800}));
        atTheAction = spy.Callbacks();
        throw std::runtime_error("of the test");
    };
    EXPECT_THROW(spy.Playlist(800), std::runtime_error);
    EXPECT_THAT(atTheAction, ElementsAre(Is(callbacks::Playlist{800})));
}

TEST(WaitFor, ReturnsAtOnceForACallbackThatPrecedesIt)
{
    SpyListener spy;
    spy.Paused();
    EXPECT_TRUE(spy.WaitFor(bdmv::CallbackPaused, None));
}

TEST(WaitFor, TimesOutWithoutACallbackOfTheKind)
{
    SpyListener spy;
    spy.Stopped();
    EXPECT_FALSE(spy.WaitFor(bdmv::CallbackPaused, milliseconds(1)));
}

TEST(WaitFor, TimesOutForAValueThatIsNoCallback)
{
    SpyListener spy;
    spy.InteractiveGraphicsInactive(); // the last one
    EXPECT_FALSE(spy.WaitFor(bdmv::Callback__sizeof, None));
    EXPECT_FALSE(spy.WaitFor(static_cast<bdmv::CallbackId>(-1), None));
}

TEST(WaitFor, IsSatisfiedOnceByEachCallback)
{
    SpyListener spy;
    spy.Paused();
    spy.Paused();
    EXPECT_TRUE(spy.WaitFor(bdmv::CallbackPaused, None));
    EXPECT_TRUE(spy.WaitFor(bdmv::CallbackPaused, None));
    EXPECT_FALSE(spy.WaitFor(bdmv::CallbackPaused, None));
}

TEST(WaitFor, LeavesOtherKindsToTheirOwnCalls)
{
    SpyListener spy;
    spy.Paused();
    spy.Stopped();
    EXPECT_TRUE(spy.WaitFor(bdmv::CallbackStopped, None));
    EXPECT_TRUE(spy.WaitFor(bdmv::CallbackPaused, None));
}

TEST(WaitFor, TakesNothingWhenItTimesOut)
{
    SpyListener spy;
    EXPECT_FALSE(spy.WaitFor(bdmv::CallbackPaused, None));
    spy.Paused();
    EXPECT_TRUE(spy.WaitFor(bdmv::CallbackPaused, None));
}

TEST(WaitFor, NeedsANewCallbackAfterClear)
{
    SpyListener spy;
    spy.Paused();
    spy.Paused();
    EXPECT_TRUE(spy.WaitFor(bdmv::CallbackPaused, None));
    spy.Clear();
    EXPECT_FALSE(spy.WaitFor(bdmv::CallbackPaused, None));
    spy.Paused();
    EXPECT_TRUE(spy.WaitFor(bdmv::CallbackPaused, None));
}

TEST(WaitFor, LeavesTheCallbackInTheList)
{
    SpyListener spy;
    spy.Paused();
    spy.WaitFor(bdmv::CallbackPaused, None);
    EXPECT_THAT(spy.Callbacks(), ElementsAre(Is(callbacks::Paused())));
}

TEST(WaitFor, WaitsForACallbackOfAnotherThread)
{
    SpyListener spy;
    std::thread delivery([&spy] { spy.Playlist(800); });
    EXPECT_TRUE(spy.WaitFor(bdmv::CallbackPlaylist, Long));
    EXPECT_THAT(spy.Callbacks(), ElementsAre(Is(callbacks::Playlist{800})));
    delivery.join();
}

TEST(WaitFor, ServesSeveralThreadsWithOneCallbackEach)
{
    SpyListener spy;
    std::vector<std::thread> waiting;
    for (int i = 0; i < 3; ++i) {
        waiting.emplace_back([&spy] { EXPECT_TRUE(spy.WaitFor(bdmv::CallbackPaused, Long)); });
    }
    for (int i = 0; i < 3; ++i) {
        spy.Paused();
    }
    for (std::thread& thread : waiting) {
        thread.join();
    }
    EXPECT_FALSE(spy.WaitFor(bdmv::CallbackPaused, None));
}

TEST(WaitFor, TakesTheLongestTimeout)
{
    SpyListener spy;
    std::thread delivery([&spy] { spy.Paused(); });
    EXPECT_TRUE(spy.WaitFor(bdmv::CallbackPaused, milliseconds::max()));
    delivery.join();
}

} // namespace
