#include <atomic>
#include <thread>
#include <vector>

#include "allevents.h"
#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "eventtest.h"

namespace
{

const int rounds = 200;

/**
 * The list must never call it on two threads at once: it counts without a lock, and its only atomic
 * is relaxed, so that ThreadSanitizer detects every missing lock.
 */
class CountingListener : public bdmv::NavigatorListenerAdapter
{
public:
    void Paused() override
    {
        overlaps += m_IsInside.exchange(true, std::memory_order_relaxed) ? 1 : 0;
        std::this_thread::yield();
        m_IsInside.store(false, std::memory_order_relaxed);
        ++pauses;
    }
    void CurrentTimePosition(const bd::TimePosition&) override { ++positions; }

    int pauses = 0;
    int positions = 0;
    int overlaps = 0;

private:
    std::atomic<bool> m_IsInside{false};
};

/** Counts the calls it receives while it is in no list. */
class TemporaryListener : public bdmv::NavigatorListenerAdapter
{
public:
    void Paused() override { callsWhileUnlisted += isListed ? 0 : 1; }

    bool isListed = false; ///< changed while the listener is in no list
    int callsWhileUnlisted = 0;
};

TEST(ConcurrentDispatch, DeliversEveryEventOnceWhileListenersAreAddedAndRemoved)
{
    bdmvtest::FakePlatform platform(nullptr);
    Context context;
    Listeners listeners;
    CountingListener permanent;
    TemporaryListener temporaries[2];
    listeners.AddListener(&permanent);

    std::atomic<int> dispatching{2};
    const auto dispatchAll = [&] {
        for (int round = 0; round < rounds; ++round) {
            for (const EventClass& eventClass : AllEvents()) {
                eventClass.make(context)->Dispatch(listeners);
            }
        }
        --dispatching;
    };
    const auto addAndRemove = [&](TemporaryListener& temporary) {
        while (dispatching != 0) {
            temporary.isListed = true;
            EXPECT_TRUE(listeners.AddListener(&temporary));
            EXPECT_TRUE(listeners.ListenerExists(&temporary));
            EXPECT_TRUE(listeners.RemoveListener(&temporary));
            temporary.isListed = false;
        }
    };
    std::vector<std::thread> threads;
    threads.emplace_back(dispatchAll);
    threads.emplace_back(dispatchAll);
    threads.emplace_back(addAndRemove, std::ref(temporaries[0]));
    threads.emplace_back(addAndRemove, std::ref(temporaries[1]));
    for (std::thread& thread : threads) {
        thread.join();
    }

    EXPECT_EQ(permanent.pauses, 2 * rounds);
    EXPECT_EQ(permanent.positions, 2 * rounds);
    EXPECT_EQ(permanent.overlaps, 0);
    EXPECT_EQ(temporaries[0].callsWhileUnlisted + temporaries[1].callsWhileUnlisted, 0);
}

} // namespace
