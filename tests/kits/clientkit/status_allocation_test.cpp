#include <gtest/gtest.h>

#include "clientkit/listenerrelay.h"
#include "clientkit/playbackstatus.h"
#include "randomcallbacks.h"
#include "testkit/allocationcounter.h"
#include "testkit/fakeplatform.h"
#include "testkit/operatornew.h"

namespace
{

class Counter : public bdmv::CallbackListener
{
public:
    int callbacks = 0;

protected:
    void OnCallback(const bdmv::Callback&) override { ++callbacks; }
};

/** @return the allocations while the listener receives each of the 56 callbacks */
std::size_t AllocationsOfDeliveries(bdmv::INavigatorListener& listener)
{
    bdmvtest::RandomCallbacks random(1);
    const std::size_t before = bdmvtest::CountAllocations();
    for (int id = 0; id < bdmv::Callback__sizeof; ++id) {
        Deliver(random.Make(static_cast<bdmv::CallbackId>(id)), listener);
    }
    return bdmvtest::CountAllocations() - before;
}

TEST(StatusAllocation, FollowsWithoutAllocating)
{
    bdmv::StatusListener listener;

    EXPECT_EQ(AllocationsOfDeliveries(listener), 0U);
}

TEST(StatusAllocation, CopiesTheStatusWithoutAllocating)
{
    bdmv::StatusListener listener;
    const std::size_t before = bdmvtest::CountAllocations();
    const bdmv::PlaybackStatus status = listener.Status();
    const std::size_t after = bdmvtest::CountAllocations();

    EXPECT_EQ(after, before);
    EXPECT_FALSE(status.state.known);
}

TEST(StatusAllocation, DeliversAStatusWithoutAllocating)
{
    bdmv::StatusListener listener;
    AllocationsOfDeliveries(listener);
    const bdmv::PlaybackStatus status = listener.Status();
    Counter counter;
    const std::size_t before = bdmvtest::CountAllocations();
    Deliver(status, counter);
    const std::size_t after = bdmvtest::CountAllocations();

    EXPECT_EQ(after, before);
    EXPECT_GT(counter.callbacks, 20);
}

TEST(StatusAllocation, RelaysWithoutAllocating)
{
    bdmv::ListenerRelay relay;
    Counter clients[2];
    relay.Join(clients[0]);
    relay.Join(clients[1]);

    EXPECT_EQ(AllocationsOfDeliveries(relay), 0U);
    EXPECT_EQ(clients[1].callbacks, 56);
}

TEST(StatusAllocation, DoesNotJoinWithoutMemory)
{
    bdmv::ListenerRelay relay;
    relay.PlayStarted();
    Counter client;

    bdmvtest::FailAllocationAfter(0);
    EXPECT_THROW(relay.Join(client), std::bad_alloc);
    bdmvtest::FailAllocationAfter(-1);

    EXPECT_EQ(client.callbacks, 0);
    EXPECT_FALSE(relay.Leave(client));
    EXPECT_TRUE(relay.Join(client));
}

} // namespace
