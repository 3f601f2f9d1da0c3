#include "testkit/bench.h"

#include <gtest/gtest.h>

#include "bdmvnavigator/navigatorevent.h"
#include "testkit/recordinglistener.h"
#include "testkit/spylistener.h"

namespace
{

using bdmvtest::Bench;
using bdmvtest::Logged;
using bdmvtest::NotLogged;
using bdmvtest::Queried;

TEST(Bench, ReturnsTheWholeJournalOfADispatch)
{
    Bench bench;
    bdmvtest::RecordingListener listener(bench.journal, "A");
    bench.listeners.AddListener(&listener);
    bench.context.angleNumber = 2;
    bench.context.angleCount = 3;
    EXPECT_EQ(bench.Dispatch<bdmv::AngleInfoEvent>(), Queried("GetAngleInfo(0, 0) -> 2, 3") +
                                                          Logged("Sending AngleInfo - angleNr: 2") +
                                                          "A.AngleInfo(2)\n");
}

TEST(Bench, DeliversToItsClientsInOrder)
{
    bdmvtest::Journal order;
    bdmvtest::RecordingListener first(order, "first");
    bdmvtest::RecordingListener second(order, "second");
    Bench bench{&first, &second};
    bench.Dispatch<bdmv::PausedEvent>();
    EXPECT_EQ(order.Take(), "first.Paused()\nsecond.Paused()\n");
}

TEST(Bench, PassesStoredValuesToTheEvent)
{
    bdmvtest::SpyListener spy;
    Bench bench{&spy};
    bench.Dispatch<bdmv::TriggerSetEvent>(bd::TRIGGER_B, true);
    const auto callbacks = spy.Callbacks();
    ASSERT_EQ(callbacks.size(), 1u);
    EXPECT_EQ(callbacks[0].As<bdmv::callbacks::TriggerSet>()->type, bd::TRIGGER_B);
}

TEST(Bench, ShowsThatALineIsNotWritten)
{
    Bench bench;
    bench.platform.DisableLog();
    EXPECT_EQ(bench.Dispatch<bdmv::PausedEvent>(), NotLogged());
}

TEST(Bench, RunsAnActionWhenTheLogSwitchIsCalled)
{
    Bench bench;
    int calls = 0;
    bench.WhenTheLogSwitchIsAsked(0, [&calls] { ++calls; });
    EXPECT_EQ(bench.Dispatch<bdmv::PausedEvent>(), NotLogged());
    EXPECT_EQ(calls, 1);
}

} // namespace
