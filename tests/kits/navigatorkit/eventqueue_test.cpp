#include "navigatorkit/eventqueue.h"

#include <gtest/gtest.h>

#include <memory>
#include <stdexcept>
#include <type_traits>

#include "bdmvnavigator/navigatorevent.h"
#include "probeevent.h"
#include "testkit/fakeplatform.h"
#include "testkit/recordinglistener.h"
#include "testkit/scriptableplaybackcontext.h"

namespace
{

class EventQueue : public testing::Test
{
protected:
    History history; ///< before the queue, whose events write to it
    bdmv::INavigatorEvent::Listeners listeners;
    bdmv::EventQueue queue{3};

    bool Post(int number, ProbeEvent::Action whileDispatched = nullptr)
    {
        return queue.Post<ProbeEvent>(history, number, std::move(whileDispatched));
    }

    bool DispatchNext() { return queue.DispatchNext(listeners); }

    History Take() { return std::exchange(history, {}); }
};

TEST_F(EventQueue, RefusesToHaveNoPlaces)
{
    EXPECT_THROW(bdmv::EventQueue(0), std::invalid_argument);
}

TEST_F(EventQueue, RefusesToHaveMorePlacesThanItCanNumber)
{
    EXPECT_THROW(bdmv::EventQueue(bdmv::EventQueue::MostPlaces + 1), std::invalid_argument);
}

TEST_F(EventQueue, CanBeNeitherCopiedNorMoved)
{
    EXPECT_FALSE(std::is_copy_constructible<bdmv::EventQueue>::value);
    EXPECT_FALSE(std::is_copy_assignable<bdmv::EventQueue>::value);
    EXPECT_FALSE(std::is_move_constructible<bdmv::EventQueue>::value);
    EXPECT_FALSE(std::is_move_assignable<bdmv::EventQueue>::value);
}

TEST_F(EventQueue, ConstructsAtOnceAndDestroysAfterDelivery)
{
    EXPECT_TRUE(Post(1));
    EXPECT_EQ(Take(), History{"+1"});

    EXPECT_TRUE(DispatchNext());
    EXPECT_EQ(Take(), (History{"1", "-1"}));
}

TEST_F(EventQueue, DispatchesNothingWhenEmpty)
{
    EXPECT_FALSE(DispatchNext());
    Post(1);
    DispatchNext();
    EXPECT_FALSE(DispatchNext());
}

TEST_F(EventQueue, DispatchesOneEventAtATimeInTheOrderOfPosting)
{
    Post(1);
    Post(2);
    Post(3);
    Take();

    DispatchNext();
    EXPECT_EQ(Take(), (History{"1", "-1"}));
    DispatchNext();
    EXPECT_EQ(Take(), (History{"2", "-2"}));
    DispatchNext();
    EXPECT_EQ(Take(), (History{"3", "-3"}));
}

TEST_F(EventQueue, PassesItsListenersToTheEvent)
{
    bdmvtest::Journal journal;
    const bdmvtest::FakePlatform platform(&journal);
    bdmvtest::ScriptablePlaybackContext context(journal);
    bdmvtest::RecordingListener listener(journal, "A");
    listeners.AddListener(&listener);

    queue.Post<bdmv::PausedEvent>(context);
    DispatchNext();

    EXPECT_EQ(journal.Take(), "log? 57 5 0 -> on\n"
                              "log 57 5 0: Sending Paused\n"
                              "A.Paused()\n");
}

TEST_F(EventQueue, HasPlacesForEveryEventThatStoresArguments)
{
    bdmvtest::Journal journal;
    bdmvtest::ScriptablePlaybackContext context(journal);

    EXPECT_TRUE(queue.Post<bdmv::AudioInfoChangedEvent>(context, true, bd::AudioInfoType()));
    EXPECT_TRUE(queue.Post<bdmv::MarkInfoEvent>(context, bdmv::IPlayListMark::MarkTypeEntryMark));
    EXPECT_TRUE(queue.Post<bdmv::TriggerSetEvent>(context, bd::TRIGGER_NONE, true));
}

/** As large and as strictly aligned as a place. */
class alignas(std::max_align_t) LargestEvent : public bdmv::INavigatorEvent
{
public:
    LargestEvent(const void*& address, std::unique_ptr<int> moved, int& referred)
        : m_rAddress(address)
    {
        referred = *moved;
    }
    void Dispatch(Listeners& /*listeners*/) override { m_rAddress = this; }

private:
    const void*& m_rAddress;
    [[maybe_unused]] unsigned char m_Bytes[bdmv::EventQueue::LargestEvent - 2 * sizeof(void*)] = {};
};
static_assert(sizeof(LargestEvent) == bdmv::EventQueue::LargestEvent, "it fills a place");

TEST_F(EventQueue, AlignsEveryPlace)
{
    for (int i = 0; i < 3; ++i) {
        const void* address = nullptr;
        int referred = 0;
        queue.Post<LargestEvent>(address, std::make_unique<int>(5), referred);
        DispatchNext();

        EXPECT_NE(address, nullptr);
        EXPECT_EQ(reinterpret_cast<std::uintptr_t>(address) % alignof(std::max_align_t), 0U);
    }
}

TEST_F(EventQueue, ForwardsTheArgumentsToTheConstructor)
{
    const void* address = nullptr;
    int referred = 0;

    queue.Post<LargestEvent>(address, std::make_unique<int>(5), referred);

    EXPECT_EQ(referred, 5);
}

struct AnotherBase {
    virtual ~AnotherBase() = default;
    int value = 0;
};

class DerivedTwice : public AnotherBase, public ProbeEvent
{
public:
    explicit DerivedTwice(History& history) : ProbeEvent(history, 7) {}
};
static_assert(sizeof(DerivedTwice) <= bdmv::EventQueue::LargestEvent, "it fits in a place");

TEST_F(EventQueue, DeliversAnEventWhoseInterfaceIsNotItsFirstBase)
{
    queue.Post<DerivedTwice>(history);
    DispatchNext();

    EXPECT_EQ(Take(), (History{"+7", "7", "-7"}));
}

TEST_F(EventQueue, ConstructsNothingWhenFull)
{
    for (int i = 1; i <= 3; ++i) {
        EXPECT_TRUE(Post(i));
    }
    Take();

    EXPECT_FALSE(Post(4));
    EXPECT_EQ(Take(), History{});
}

TEST_F(EventQueue, HasAPlaceAgainAfterADelivery)
{
    for (int i = 1; i <= 3; ++i) {
        Post(i);
    }
    DispatchNext();

    EXPECT_TRUE(Post(4));
    EXPECT_FALSE(Post(5));
}

TEST_F(EventQueue, KeepsThePlaceOfAnEventWhileItIsDispatched)
{
    bool inCallback = true;
    Post(1, [&] { inCallback = Post(4); });
    Post(2);
    Post(3);

    DispatchNext();

    EXPECT_FALSE(inCallback);
    EXPECT_TRUE(Post(4));
}

TEST_F(EventQueue, TakesAnEventPostedInACallbackAfterThoseThatWait)
{
    Post(1, [this] { EXPECT_TRUE(Post(3)); });
    Post(2);
    while (DispatchNext()) {
    }

    EXPECT_EQ(Take(), (History{"+1", "+2", "1", "+3", "-1", "2", "-2", "3", "-3"}));
}

TEST_F(EventQueue, TakesAnEventPostedByAConstructorBeforeTheOneConstructed)
{
    class Posting : public ProbeEvent
    {
    public:
        Posting(bdmv::EventQueue& queue, History& history) : ProbeEvent(history, 1)
        {
            EXPECT_TRUE(queue.Post<ProbeEvent>(history, 2));
        }
    };
    queue.Post<Posting>(queue, history);
    while (DispatchNext()) {
    }

    EXPECT_EQ(Take(), (History{"+1", "+2", "2", "-2", "1", "-1"}));
}

TEST_F(EventQueue, DestroysWhatIsLeftUndeliveredInOrder)
{
    {
        bdmv::EventQueue local(3);
        for (int i = 0; i < 2; ++i) { // so that what is left spans two laps
            local.Post<ProbeEvent>(history, i);
            local.DispatchNext(listeners);
        }
        local.Post<ProbeEvent>(history, 2);
        local.Post<ProbeEvent>(history, 3);
        Take();
    }

    EXPECT_EQ(Take(), (History{"-2", "-3"}));
}

TEST_F(EventQueue, RefusesOnceClosed)
{
    queue.Close();

    EXPECT_FALSE(Post(1));
    EXPECT_EQ(Take(), History{});
}

TEST_F(EventQueue, CanBeClosedTwice)
{
    Post(1);
    queue.Close();
    queue.Close();

    EXPECT_FALSE(Post(2));
    queue.Run(listeners);
    EXPECT_EQ(Take(), (History{"+1", "1", "-1"}));
}

TEST_F(EventQueue, DeliversAfterCloseWhatWasPostedBefore)
{
    Post(1);
    Post(2);
    queue.Close();

    EXPECT_TRUE(DispatchNext());
    queue.Run(listeners);

    EXPECT_EQ(Take(), (History{"+1", "+2", "1", "-1", "2", "-2"}));
    EXPECT_FALSE(DispatchNext());
}

TEST_F(EventQueue, ReturnsFromRunAtOnceWhenClosedAndEmpty)
{
    queue.Close();
    queue.Run(listeners);
    queue.Run(listeners);
}

TEST_F(EventQueue, CanBeClosedInACallback)
{
    Post(1, [this] {
        queue.Close();
        EXPECT_FALSE(Post(3));
    });
    Post(2);

    queue.Run(listeners);

    EXPECT_EQ(Take(), (History{"+1", "+2", "1", "-1", "2", "-2"}));
}

/** Queues with several numbers of places. */
class EventQueueOf : public testing::TestWithParam<int>
{
};

INSTANTIATE_TEST_SUITE_P(Places, EventQueueOf, testing::Values(1, 2, 3, 4, 5, 7, 8, 100));

TEST_P(EventQueueOf, HoldsAsManyEventsAsPlacesAndKeepsTheirOrderLapAfterLap)
{
    History history;
    bdmv::INavigatorEvent::Listeners listeners;
    bdmv::EventQueue queue(static_cast<std::size_t>(GetParam()));
    int posted = 0;
    int dispatched = 0;
    for (int batch = 1; batch <= 40; ++batch) {
        int count = 0;
        for (; queue.Post<ProbeEvent>(history, posted); ++posted) {
            ++count;
        }
        EXPECT_EQ(count, batch == 1 ? GetParam() : std::min(batch - 1, GetParam()));

        for (int i = 0; i < std::min(batch, GetParam()); ++i) {
            history.clear();
            ASSERT_TRUE(queue.DispatchNext(listeners));
            ASSERT_EQ(history.front(), std::to_string(dispatched++));
        }
        const bdmv::EventQueue::Counters counters = queue.GetCounters();
        ASSERT_EQ(counters.posted, static_cast<std::uint64_t>(posted));
        ASSERT_EQ(counters.dispatched, static_cast<std::uint64_t>(dispatched));
        ASSERT_EQ(counters.refused, static_cast<std::uint64_t>(batch));
        ASSERT_EQ(counters.mostAtOnce, static_cast<std::size_t>(GetParam()));
    }
}

TEST_F(EventQueue, CountsNothingAtFirst)
{
    const bdmv::EventQueue::Counters counters = queue.GetCounters();

    EXPECT_EQ(counters.posted, 0U);
    EXPECT_EQ(counters.dispatched, 0U);
    EXPECT_EQ(counters.refused, 0U);
    EXPECT_EQ(counters.mostAtOnce, 0U);
}

TEST_F(EventQueue, CountsAnEventAsDispatchedOnceItIsDestroyed)
{
    Post(1, [this] {
        EXPECT_EQ(queue.GetCounters().posted, 1U);
        EXPECT_EQ(queue.GetCounters().dispatched, 0U);
    });
    DispatchNext();

    EXPECT_EQ(queue.GetCounters().posted, 1U);
    EXPECT_EQ(queue.GetCounters().dispatched, 1U);
}

TEST_F(EventQueue, CountsRefusalsOfAFullAndOfAClosedQueue)
{
    for (int i = 1; i <= 4; ++i) {
        Post(i);
    }
    EXPECT_EQ(queue.GetCounters().refused, 1U);
    DispatchNext();
    queue.Close();
    Post(5);

    EXPECT_EQ(queue.GetCounters().refused, 2U);
    EXPECT_EQ(queue.GetCounters().posted, 3U);
}

TEST_F(EventQueue, CountsTheMostEventsAtOnceWithTheOneInDispatch)
{
    Post(1, [this] {
        Post(2);
        EXPECT_EQ(queue.GetCounters().mostAtOnce, 2U);
    });
    EXPECT_EQ(queue.GetCounters().mostAtOnce, 1U);
    DispatchNext();
    DispatchNext();
    for (int i = 3; i < 10; ++i) {
        Post(i);
        DispatchNext();
    }

    EXPECT_EQ(queue.GetCounters().mostAtOnce, 2U);
}

} // namespace
