#include <gtest/gtest.h>

#include <stdexcept>

#include "bdmvnavigator/navigatorevent.h"
#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "navigatorkit/eventqueue.h"
#include "testkit/fakeplatform.h"
#include "testkit/operatornew.h"
#include "testkit/scriptableplaybackcontext.h"

namespace
{

/** The number of allocations of an action. */
template <typename Action> std::size_t AllocationsOf(Action action)
{
    const std::size_t before = bdmvtest::CountAllocations();
    action();
    return bdmvtest::CountAllocations() - before;
}

TEST(EventQueueAllocation, IsOneInTheConstructor)
{
    EXPECT_EQ(AllocationsOf([] { const bdmv::EventQueue queue(100); }), 1U);
}

TEST(EventQueueAllocation, IsFreedByTheDestructor)
{
    const long before = bdmvtest::CountLiveBlocks();
    {
        const bdmv::EventQueue queue(100);
    }
    EXPECT_EQ(bdmvtest::CountLiveBlocks(), before);
}

TEST(EventQueueAllocation, LeavesNothingBehindWhenItFails)
{
    const long before = bdmvtest::CountLiveBlocks();
    bdmvtest::FailAllocationAfter(0);
    EXPECT_THROW(bdmv::EventQueue(100), std::bad_alloc);
    bdmvtest::FailAllocationAfter(-1);

    EXPECT_EQ(bdmvtest::CountLiveBlocks(), before);
}

/** Fails in its constructor, with an exception that is not on the heap of operator new. */
class ThrowingEvent : public bdmv::INavigatorEvent
{
public:
    ThrowingEvent() { throw 1; }
    void Dispatch(Listeners& /*listeners*/) override {}
};

TEST(EventQueueAllocation, DoesNotHappenAfterConstruction)
{
    bdmvtest::ScriptablePlaybackContext context;
    bdmv::NavigatorListenerAdapter listener;
    bdmv::INavigatorEvent::Listeners listeners;
    listeners.AddListener(&listener);
    bdmv::EventQueue queue(5);

    EXPECT_EQ(AllocationsOf([&] {
                  for (int lap = 0; lap < 10; ++lap) {
                      EXPECT_THROW(queue.Post<ThrowingEvent>(), int);
                      while (queue.Post<bdmv::PausedEvent>(context)) {
                      }
                      for (int i = 0; i < 3; ++i) {
                          queue.DispatchNext(listeners);
                      }
                      queue.GetCounters();
                  }
                  queue.Close();
                  queue.Run(listeners);
              }),
              0U);
    EXPECT_EQ(queue.GetCounters().dispatched, 32U);
}

} // namespace
