#include "navigatorkit/eventqueue.h"

#include <gtest/gtest.h>

#include <atomic>
#include <functional>
#include <stdexcept>
#include <thread>
#include <vector>

namespace
{

const int Producers = 4;
const int EventsEach = 5000;

/** The producer and the number of an event, appended without a lock: one thread delivers. */
struct Delivered {
    int producer;
    int number;

    bool operator==(const Delivered& other) const
    {
        return producer == other.producer && number == other.number;
    }
};

class NumberedEvent : public bdmv::INavigatorEvent
{
public:
    NumberedEvent(std::vector<Delivered>& delivered, Delivered self)
        : m_rDelivered(delivered), m_Self(self)
    {
    }
    void Dispatch(Listeners& /*listeners*/) override { m_rDelivered.push_back(m_Self); }

private:
    std::vector<Delivered>& m_rDelivered;
    Delivered m_Self;
};

/** Its constructor may throw. */
class UnreliableNumberedEvent : public NumberedEvent
{
public:
    UnreliableNumberedEvent(std::vector<Delivered>& delivered, Delivered self, bool fails)
        : NumberedEvent(delivered, self)
    {
        if (fails) {
            throw std::runtime_error("constructor");
        }
    }
};

/** Runs an action in its constructor and another in its dispatch. */
class ActingEvent : public bdmv::INavigatorEvent
{
public:
    typedef std::function<void()> Action;

    ActingEvent(const Action& whileConstructed, const Action& whileDispatched)
        : m_rWhileDispatched(whileDispatched)
    {
        whileConstructed();
    }
    void Dispatch(Listeners& /*listeners*/) override { m_rWhileDispatched(); }

private:
    const Action& m_rWhileDispatched;
};

void WaitFor(const std::atomic<bool>& flag)
{
    while (!flag) {
        std::this_thread::yield();
    }
}

/** Long enough for a deliverer to stop yielding and to block; no test relies on it. */
void LetTheDelivererBlock()
{
    for (int i = 0; i < 1000; ++i) {
        std::this_thread::yield();
    }
}

class EventQueueThreads : public testing::Test
{
protected:
    bdmv::INavigatorEvent::Listeners listeners;
    std::vector<Delivered> delivered;
    bdmv::EventQueue queue{7};

    void Run() { queue.Run(listeners); }

    /** Posts, and tries again while the queue is full. @return the number of refusals */
    unsigned PostUntilTaken(Delivered event)
    {
        unsigned refusals = 0;
        while (!queue.Post<NumberedEvent>(delivered, event)) {
            ++refusals;
            std::this_thread::yield();
        }
        return refusals;
    }

    /** Every event of every producer once, and those of one producer in order. */
    void ExpectAllDelivered()
    {
        int next[Producers] = {};
        for (const Delivered& event : delivered) {
            ASSERT_EQ(event.number, next[event.producer]) << "of producer " << event.producer;
            ++next[event.producer];
        }
        for (const int count : next) {
            EXPECT_EQ(count, EventsEach);
        }
    }
};

TEST_F(EventQueueThreads, DeliversEveryEventOnceInTheOrderOfItsProducer)
{
    std::thread deliverer([this] { Run(); });
    std::atomic<unsigned> refusals{0};
    std::vector<std::thread> producers;
    for (int producer = 0; producer < Producers; ++producer) {
        producers.emplace_back([this, producer, &refusals] {
            for (int number = 0; number < EventsEach; ++number) {
                refusals += PostUntilTaken({producer, number});
            }
        });
    }
    for (std::thread& producer : producers) {
        producer.join();
    }
    queue.Close();
    deliverer.join();

    ExpectAllDelivered();
    const bdmv::EventQueue::Counters counters = queue.GetCounters();
    EXPECT_EQ(counters.posted, std::uint64_t(Producers) * EventsEach);
    EXPECT_EQ(counters.dispatched, counters.posted);
    EXPECT_EQ(counters.refused, refusals);
    EXPECT_GE(counters.mostAtOnce, 1U);
    EXPECT_LE(counters.mostAtOnce, 7U);
}

TEST_F(EventQueueThreads, LoseNothingWhenProducersPostAtTheSameInstant)
{
    for (int round = 0; round < 60; ++round) {
        bdmv::EventQueue large(std::size_t(Producers) * EventsEach);
        std::atomic<int> waiting{Producers};
        std::vector<std::thread> producers;
        for (int producer = 0; producer < Producers; ++producer) {
            producers.emplace_back([this, producer, &large, &waiting] {
                --waiting;
                while (waiting != 0) {
                    std::this_thread::yield();
                }
                for (int number = 0; number < EventsEach; ++number) {
                    large.Post<NumberedEvent>(delivered, Delivered{producer, number});
                }
            });
        }
        for (std::thread& producer : producers) {
            producer.join();
        }
        delivered.clear();
        while (large.DispatchNext(listeners)) {
        }
        ExpectAllDelivered();
        EXPECT_EQ(large.GetCounters().posted, std::uint64_t(Producers) * EventsEach);
    }
}

TEST_F(EventQueueThreads, KeepTheOrderOfPostsThatFollowEachOther)
{
    std::thread deliverer([this] { Run(); });
    std::atomic<int> turn{0};
    const auto post = [this, &turn](int producer) {
        for (int number = producer; number < EventsEach; number += 2) {
            while (turn.load(std::memory_order_relaxed) != number) {
                std::this_thread::yield();
            }
            PostUntilTaken({0, number});
            turn.store(number + 1, std::memory_order_relaxed);
        }
    };
    std::thread first(post, 0);
    std::thread second(post, 1);
    first.join();
    second.join();
    queue.Close();
    deliverer.join();

    ASSERT_EQ(delivered.size(), static_cast<std::size_t>(EventsEach));
    for (int number = 0; number < EventsEach; ++number) {
        ASSERT_EQ(delivered[static_cast<std::size_t>(number)], (Delivered{0, number}));
    }
}

TEST_F(EventQueueThreads, LoseNoPlaceToConstructorsThatThrow)
{
    std::thread deliverer([this] { Run(); });
    std::vector<std::thread> producers;
    for (int producer = 0; producer < Producers; ++producer) {
        producers.emplace_back([this, producer] {
            for (int number = 0; number < EventsEach; ++number) {
                for (bool taken = false; !taken;) {
                    try {
                        queue.Post<UnreliableNumberedEvent>(delivered, Delivered{producer, number},
                                                            true);
                    } catch (const std::runtime_error&) {
                    }
                    taken = queue.Post<UnreliableNumberedEvent>(delivered,
                                                                Delivered{producer, number}, false);
                    std::this_thread::yield();
                }
            }
        });
    }
    for (std::thread& producer : producers) {
        producer.join();
    }
    std::vector<Delivered> late;
    const ActingEvent::Action fillTheQueue = [&] {
        for (int i = 0; i < 6; ++i) {
            EXPECT_TRUE(queue.Post<NumberedEvent>(late, Delivered{0, i}));
        }
        EXPECT_FALSE(queue.Post<NumberedEvent>(late, Delivered{0, 6}));
    };
    while (!queue.Post<ActingEvent>([] {}, fillTheQueue)) {
        std::this_thread::yield();
    }
    while (queue.GetCounters().dispatched != std::uint64_t(Producers) * EventsEach + 7) {
        std::this_thread::yield();
    }
    queue.Close();
    deliverer.join();

    ExpectAllDelivered();
    EXPECT_EQ(late.size(), 6U);
}

TEST_F(EventQueueThreads, WakeADelivererThatWaits)
{
    std::atomic<bool> wasDispatched{false};
    const ActingEvent::Action dispatched = [&wasDispatched] { wasDispatched = true; };
    std::thread deliverer([this] { Run(); });
    for (int i = 0; i < 20; ++i) {
        LetTheDelivererBlock();
        EXPECT_TRUE(queue.Post<ActingEvent>([] {}, dispatched));
        WaitFor(wasDispatched);
        wasDispatched = false;
    }
    queue.Close();
    deliverer.join();
}

TEST_F(EventQueueThreads, EndRunByClosingWhileItWaits)
{
    std::thread deliverer([this] { Run(); });
    LetTheDelivererBlock();
    queue.Close();
    deliverer.join();

    EXPECT_EQ(queue.GetCounters().dispatched, 0U);
}

TEST_F(EventQueueThreads, MakeWhatAProducerDidVisibleToTheDispatch)
{
    int written = 0;
    int read = 0;
    const ActingEvent::Action dispatched = [&] { read = written; };
    std::thread deliverer([this] { Run(); });
    written = 1;
    queue.Post<ActingEvent>([] {}, dispatched);
    queue.Close();
    deliverer.join();

    EXPECT_EQ(read, 1);
}

TEST_F(EventQueueThreads, AreNotHeldUpByAConstructorThatWaits)
{
    std::atomic<bool> isConstructing{false};
    std::atomic<bool> mayContinue{false};
    const ActingEvent::Action construct = [&] {
        isConstructing = true;
        WaitFor(mayContinue);
    };
    const ActingEvent::Action dispatched = [this] { delivered.push_back({0, 9}); };
    std::thread producer([&] { queue.Post<ActingEvent>(construct, dispatched); });
    WaitFor(isConstructing);

    for (int number = 0; number < 20; ++number) {
        EXPECT_TRUE(queue.Post<NumberedEvent>(delivered, Delivered{0, number}));
        EXPECT_TRUE(queue.DispatchNext(listeners));
        EXPECT_FALSE(queue.DispatchNext(listeners));
    }
    mayContinue = true;
    producer.join();
    EXPECT_TRUE(queue.DispatchNext(listeners));
    EXPECT_EQ(delivered.back(), (Delivered{0, 9}));
}

TEST_F(EventQueueThreads, DeliverAnEventWhoseConstructorClosesTheQueue)
{
    const ActingEvent::Action dispatched = [this] { delivered.push_back({0, 9}); };
    std::thread deliverer([this] { Run(); });
    const ActingEvent::Action construct = [this] {
        queue.Close();
        LetTheDelivererBlock();
    };
    EXPECT_TRUE(queue.Post<ActingEvent>(construct, dispatched));
    deliverer.join();

    EXPECT_EQ(delivered, (std::vector<Delivered>{{0, 9}}));
}

TEST_F(EventQueueThreads, EndRunWhenAConstructorThrowsAfterClosing)
{
    std::thread deliverer([this] { Run(); });
    const ActingEvent::Action dispatched = [] { ADD_FAILURE(); };
    const ActingEvent::Action construct = [this] {
        queue.Close();
        LetTheDelivererBlock();
        throw std::runtime_error("constructor");
    };
    EXPECT_THROW(queue.Post<ActingEvent>(construct, dispatched), std::runtime_error);
    deliverer.join();
}

TEST_F(EventQueueThreads, ReadCountersThatFitTogether)
{
    std::thread deliverer([this] { Run(); });
    std::atomic<bool> isOver{false};
    std::thread reader([this, &isOver] {
        bdmv::EventQueue::Counters last = queue.GetCounters();
        while (!isOver) {
            const bdmv::EventQueue::Counters now = queue.GetCounters();
            EXPECT_LE(now.dispatched, now.posted);
            EXPECT_LE(last.posted, now.posted);
            EXPECT_LE(last.dispatched, now.dispatched);
            EXPECT_LE(last.mostAtOnce, now.mostAtOnce);
            last = now;
        }
    });
    for (int number = 0; number < EventsEach; ++number) {
        PostUntilTaken({0, number});
    }
    isOver = true;
    reader.join();
    queue.Close();
    deliverer.join();

    EXPECT_EQ(queue.GetCounters().posted, static_cast<std::uint64_t>(EventsEach));
}

} // namespace
