#include <gtest/gtest.h>

#include <atomic>
#include <chrono>
#include <functional>
#include <thread>

#include "bd/eventlistenerlist.h"

namespace
{

class ITick
{
public:
    ITick() = default;
    virtual ~ITick() = default;
    ITick(const ITick&) = delete;
    ITick& operator=(const ITick&) = delete;
    virtual void Tick() = 0;
};

typedef bd::EventListenerList<ITick> List;

void Fire(List& list)
{
    bd::EventListenerList_FireParam0(list, &ITick::Tick);
}

void WaitFor(const std::atomic<bool>& flag)
{
    while (!flag) {
        std::this_thread::yield();
    }
}

/** Signals a running callback, and prolongs it until another thread is about to use the list. */
class SlowListener : public ITick
{
public:
    void Tick() override
    {
        ++calls;
        running = true;
        WaitFor(awaited);
        std::this_thread::sleep_for(std::chrono::milliseconds(50));
        finished = true;
    }

    std::atomic<int> calls{0};
    std::atomic<bool> running{false};
    std::atomic<bool> awaited{false};
    std::atomic<bool> finished{false};
};

class QuickListener : public ITick
{
public:
    void Tick() override {}
};

class DeliveryThreads : public testing::Test
{
protected:
    DeliveryThreads() { list.AddListener(&slow); }

    /** Whether the action, started during a callback, returns only after the callback. */
    bool WaitsForTheCallback(const std::function<void()>& action)
    {
        std::thread firing([this] { Fire(list); });
        WaitFor(slow.running);
        slow.awaited = true;
        action();
        const bool waited = slow.finished;
        firing.join();
        return waited;
    }

    SlowListener slow;
    QuickListener quick;
    List list;
};

} // namespace

TEST_F(DeliveryThreads, RemovalWaitsForTheRunningCallback)
{
    EXPECT_TRUE(WaitsForTheCallback([this] { list.RemoveListener(&slow); }));
}

TEST_F(DeliveryThreads, NoCallbackRunsAfterRemoval)
{
    WaitsForTheCallback([this] { list.RemoveListener(&slow); });
    Fire(list);

    EXPECT_EQ(1, slow.calls);
}

TEST_F(DeliveryThreads, RegistrationWaitsForTheRunningCallback)
{
    EXPECT_TRUE(WaitsForTheCallback([this] { list.AddListener(&quick); }));
}

TEST_F(DeliveryThreads, LookUpWaitsForTheRunningCallback)
{
    EXPECT_TRUE(WaitsForTheCallback([this] { list.ListenerExists(&quick); }));
}

TEST_F(DeliveryThreads, AnotherDeliveryWaitsForTheRunningCallback)
{
    EXPECT_TRUE(WaitsForTheCallback([this] { Fire(list); }));
}

namespace
{

/** Lives only while it is registered. Only the list's lock guards its members. */
class ShortLivedListener : public ITick
{
public:
    void Tick() override
    {
        EXPECT_TRUE(registered);
        ++calls;
    }

    bool registered = true;
    int calls = 0;
};

} // namespace

TEST(DeliveryOnManyThreads, TwoMayFireWhileTwoRegister)
{
    List list;
    std::atomic<int> registering{2};
    std::atomic<int> walks{0};
    const auto fire = [&] {
        while (registering > 0) {
            Fire(list);
            ++walks;
            std::this_thread::yield();
        }
    };
    const auto registerAndRemove = [&] {
        for (int turn = 0; turn < 500; ++turn) {
            ShortLivedListener listener;
            EXPECT_TRUE(list.AddListener(&listener));
            EXPECT_TRUE(list.ListenerExists(&listener));
            std::this_thread::yield();
            EXPECT_TRUE(list.RemoveListener(&listener));
            listener.registered = false;
            EXPECT_FALSE(list.ListenerExists(&listener));
        }
        --registering;
    };
    std::thread threads[] = {std::thread(fire), std::thread(fire), std::thread(registerAndRemove),
                             std::thread(registerAndRemove)};
    for (std::thread& thread : threads) {
        thread.join();
    }

    EXPECT_GT(walks, 0);
    Fire(list);
}
