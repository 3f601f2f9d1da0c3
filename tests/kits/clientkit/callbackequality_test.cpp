// Two values are equal if and only if all their arguments are.

#include <gtest/gtest.h>

#include <map>
#include <string>

#include "kits/clientkit/changedarguments.h"
#include "kits/clientkit/everycallback.h"
#include "testkit/fakeplatform.h"

namespace bdmv
{
namespace
{

using namespace callbacks;

TEST(CallbackEquality, HoldsForTheSameCallbackWithTheSameArguments)
{
    IProgramData::RefPtr program = bdmvtest::MakeProgram();
    bdmvtest::CollectingListener first;
    bdmvtest::CollectingListener second;
    bdmvtest::CallEveryCallback(first, program);
    bdmvtest::CallEveryCallback(second, program);

    for (std::size_t i = 0; i < first.callbacks.size(); ++i) {
        EXPECT_TRUE(first.callbacks[i] == second.callbacks[i]) << NameOf(first.callbacks[i].Id());
        EXPECT_FALSE(first.callbacks[i] != second.callbacks[i]) << NameOf(first.callbacks[i].Id());
    }
}

TEST(CallbackEquality, FailsForAnotherCallback)
{
    const std::vector<Callback> callbacks = bdmvtest::EveryCallback();
    for (std::size_t i = 0; i < callbacks.size(); ++i) {
        for (std::size_t j = 0; j < callbacks.size(); ++j) {
            EXPECT_EQ(i == j, callbacks[i] == callbacks[j])
                << NameOf(callbacks[i].Id()) << ' ' << NameOf(callbacks[j].Id());
        }
    }
    EXPECT_FALSE(Callback(AudioInfo{1}) == Callback(VideoInfo{1}));
}

TEST(CallbackEquality, FailsForAnyOtherArgument)
{
    std::map<std::string, int> changes;
    for (const Callback& callback : bdmvtest::EveryCallback()) {
        for (const bdmvtest::ChangedCallback& changed : bdmvtest::WithEachNumberChanged(callback)) {
            EXPECT_FALSE(callback == changed.callback) << changed.change;
            EXPECT_TRUE(callback != changed.callback) << changed.change;
            ++changes[changed.change];
        }
    }

    EXPECT_EQ(2, changes["PlayItem.aspectRatio"]);
    EXPECT_EQ(8, changes["ZoomModeSet.clip"]);
    EXPECT_EQ(2, changes["SystemSuspended.data"]);
    EXPECT_EQ(2, changes["UOMask.forbidden"]);
    EXPECT_EQ(2, changes["ExecuteButton.commands"]);
    EXPECT_EQ(56U, changes.size()); // the arguments of all callbacks
}

TEST(CallbackEquality, IgnoresTheDebugOverrideOfMasks)
{
    const bdmvtest::FakePlatform platform(nullptr); // clears the override at the end
    g_u1Bduopmask = 2;

    EXPECT_FALSE(Callback(UOMask{UOMaskTable(1)}) == Callback(UOMask{UOMaskTable(2)}));
}

TEST(CallbackEquality, IgnoresWhatAnEarlierValueLeft)
{
    Callback callback = CurrentTimePosition{~bd::TimePosition(0)};
    callback = AngleInfo{1};

    EXPECT_TRUE(callback == Callback(AngleInfo{1}));
}

} // namespace
} // namespace bdmv
