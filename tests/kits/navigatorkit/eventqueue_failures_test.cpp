// Constructors and callbacks that throw, and dispatching inside a callback.

#include "navigatorkit/eventqueue.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <system_error>
#include <vector>

#include "probeevent.h"

namespace
{

/** Its constructor may throw. */
class UnreliableEvent : public bdmv::INavigatorEvent
{
public:
    UnreliableEvent(bool throws, const ProbeEvent::Action& before)
    {
        if (before) {
            before();
        }
        if (throws) {
            throw std::runtime_error("constructor");
        }
    }
    void Dispatch(Listeners& /*listeners*/) override {}
};

class EventQueueFailures : public testing::Test
{
protected:
    History history;
    bdmv::INavigatorEvent::Listeners listeners;
    bdmv::EventQueue queue{3};

    bool Post(int number, ProbeEvent::Action whileDispatched = nullptr)
    {
        return queue.Post<ProbeEvent>(history, number, std::move(whileDispatched));
    }

    bool PostUnreliable(bool throws, const ProbeEvent::Action& before = nullptr)
    {
        return queue.Post<UnreliableEvent>(throws, before);
    }

    void PostThrowing(const ProbeEvent::Action& before = nullptr)
    {
        EXPECT_THROW(PostUnreliable(true, before), std::runtime_error);
    }

    void DispatchAll()
    {
        while (queue.DispatchNext(listeners)) {
        }
    }

    History Take() { return std::exchange(history, {}); }
};

TEST_F(EventQueueFailures, PassOnWhatAConstructorThrowsAndCountNothing)
{
    PostThrowing();

    EXPECT_FALSE(queue.DispatchNext(listeners));
    const bdmv::EventQueue::Counters counters = queue.GetCounters();
    EXPECT_EQ(counters.posted, 0U);
    EXPECT_EQ(counters.dispatched, 0U);
    EXPECT_EQ(counters.refused, 0U);
    EXPECT_EQ(counters.mostAtOnce, 0U);
}

TEST_F(EventQueueFailures, OfConstructorsLeaveAllPlaces)
{
    for (int i = 0; i < 5; ++i) {
        PostThrowing();
    }
    for (int i = 1; i <= 3; ++i) {
        EXPECT_TRUE(Post(i));
    }

    EXPECT_FALSE(Post(4));
    EXPECT_EQ(queue.GetCounters().mostAtOnce, 3U);
}

TEST_F(EventQueueFailures, OfAConstructorDoNotAffectLaterEventsOfItsClass)
{
    PostThrowing();
    for (int i = 1; i <= 3; ++i) {
        EXPECT_TRUE(PostUnreliable(false));
    }

    EXPECT_FALSE(PostUnreliable(false));
    DispatchAll();
    EXPECT_EQ(queue.GetCounters().dispatched, 3U);
}

TEST_F(EventQueueFailures, OfNestedConstructorsLeaveAllPlaces)
{
    PostThrowing([this] { PostThrowing([this] { PostThrowing(); }); });
    for (int i = 1; i <= 3; ++i) {
        EXPECT_TRUE(Post(i));
    }

    EXPECT_FALSE(Post(4));
}

TEST_F(EventQueueFailures, OfConstructorsLeaveTheOrder)
{
    int posted = 0;
    for (int lap = 0; lap < 5; ++lap) {
        for (int i = 0; i < 3; ++i) {
            PostThrowing();
            EXPECT_TRUE(Post(posted++));
        }
        EXPECT_FALSE(Post(-1));
        for (int i = 0; i < 3; ++i) {
            Take();
            EXPECT_TRUE(queue.DispatchNext(listeners));
            EXPECT_EQ(history.front(), std::to_string(posted - 3 + i));
        }
    }
    EXPECT_EQ(queue.GetCounters().dispatched, 15U);
}

TEST_F(EventQueueFailures, OfAConstructorLeaveEventsPostedInIt)
{
    PostThrowing([this] { EXPECT_TRUE(Post(1)); });
    Post(2);
    Take();
    DispatchAll();

    EXPECT_EQ(Take(), (History{"1", "-1", "2", "-2"}));
}

TEST_F(EventQueueFailures, OfAConstructorAreRefusalsInAFullQueue)
{
    for (int i = 1; i <= 3; ++i) {
        Post(i);
    }

    EXPECT_FALSE(PostUnreliable(true));
}

TEST_F(EventQueueFailures, OfAConstructorLeaveAClosedQueueClosed)
{
    PostThrowing([this] { queue.Close(); });

    EXPECT_FALSE(Post(1));
    queue.Run(listeners);
    EXPECT_EQ(Take(), History{});
}

TEST_F(EventQueueFailures, OfACallbackLeaveDispatchNextAfterTheEventIsDestroyed)
{
    Post(1, [] { throw std::runtime_error("callback"); });
    Post(2);
    Post(3);
    Take();

    EXPECT_THROW(queue.DispatchNext(listeners), std::runtime_error);
    EXPECT_EQ(Take(), (History{"1", "-1"}));
    EXPECT_EQ(queue.GetCounters().dispatched, 1U);
    EXPECT_TRUE(Post(4));
}

TEST_F(EventQueueFailures, OfACallbackLeaveTheQueueUsable)
{
    Post(1, [] { throw std::runtime_error("callback"); });
    Post(2);
    EXPECT_THROW(queue.DispatchNext(listeners), std::runtime_error);
    Take();
    DispatchAll();

    EXPECT_EQ(Take(), (History{"2", "-2"}));
}

TEST_F(EventQueueFailures, OfACallbackLeaveRunWhichCanContinue)
{
    Post(1, [] { throw std::runtime_error("callback"); });
    Post(2);
    queue.Close();
    Take();

    EXPECT_THROW(queue.Run(listeners), std::runtime_error);
    EXPECT_EQ(Take(), (History{"1", "-1"}));
    queue.Run(listeners);
    EXPECT_EQ(Take(), (History{"2", "-2"}));
}

/** Expects the exception for a thread that would wait for itself. */
template <typename Action> void ExpectDeadlockError(Action action)
{
    try {
        action();
        ADD_FAILURE() << "nothing was thrown";
    } catch (const std::system_error& error) {
        EXPECT_EQ(error.code(), std::errc::resource_deadlock_would_occur);
    }
}

TEST_F(EventQueueFailures, OfDispatchingInACallbackTakeNothing)
{
    Post(1, [this] {
        ExpectDeadlockError([this] { queue.DispatchNext(listeners); });
        ExpectDeadlockError([this] { queue.Run(listeners); });
    });
    Post(2);
    Take();

    EXPECT_TRUE(queue.DispatchNext(listeners));
    EXPECT_EQ(Take(), (History{"1", "-1"}));
    EXPECT_TRUE(queue.DispatchNext(listeners));
    EXPECT_EQ(Take(), (History{"2", "-2"}));
}

TEST_F(EventQueueFailures, OfDispatchingInACallbackDoNotDependOnWhatIsQueued)
{
    Post(1, [this] { ExpectDeadlockError([this] { queue.DispatchNext(listeners); }); });

    EXPECT_TRUE(queue.DispatchNext(listeners));
}

TEST_F(EventQueueFailures, OfDispatchingInACallbackReachTheCallerIfNotCaught)
{
    Post(1, [this] { queue.DispatchNext(listeners); });
    Post(2);

    ExpectDeadlockError([this] { queue.DispatchNext(listeners); });
    Take();
    EXPECT_TRUE(queue.DispatchNext(listeners));
    EXPECT_EQ(Take(), (History{"2", "-2"}));
}

TEST_F(EventQueueFailures, DoNotIncludeDispatchingFromAnotherQueueInACallback)
{
    bdmv::EventQueue other(1);
    other.Post<ProbeEvent>(history, 2);
    Post(1, [&] { EXPECT_TRUE(other.DispatchNext(listeners)); });
    Take();

    queue.DispatchNext(listeners);

    EXPECT_EQ(Take(), (History{"1", "2", "-2", "-1"}));
}

} // namespace
