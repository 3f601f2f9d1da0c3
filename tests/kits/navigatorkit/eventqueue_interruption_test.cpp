// A producer that is interrupted between any two instructions of Post(), and continues after others
// have posted and dispatched: a signal handler does what those would do.

#include "navigatorkit/eventqueue.h"

#include <gtest/gtest.h>

#include <atomic>
#include <csignal>
#include <cstdint>
#include <ctime>
#include <sys/time.h>

namespace
{

/** About one in fifty, in code not optimised, is between two reads that the producer compares. */
const int Interruptions = 1000;

class EmptyEvent : public bdmv::INavigatorEvent
{
public:
    void Dispatch(Listeners& /*listeners*/) override {}
};

/** Posts on one thread, which a timer interrupts. */
class EventQueueInterruption : public testing::Test
{
protected:
    EventQueueInterruption()
    {
        pInterrupted = this;
        std::signal(SIGALRM, [](int /*signal*/) { pInterrupted->HandleSignal(); });
        // More at once than ever later: Post() takes the lock for a new maximum, and the handler,
        // which may need the lock when a lap ends, must not interrupt it there.
        for (int i = 0; i < 4; ++i) {
            Post();
        }
        DispatchAll();
    }

    ~EventQueueInterruption() override { std::signal(SIGALRM, SIG_DFL); }

    bdmv::INavigatorEvent::Listeners listeners;
    bdmv::EventQueue queue{256};
    std::atomic<int> refused{0};

    void Post() { refused += queue.Post<EmptyEvent>() ? 0 : 1; }

    void DispatchAll()
    {
        while (queue.DispatchNext(listeners)) {
        }
    }

    /** Posts events and dispatches each, until it has been interrupted. */
    void PostUntilInterrupted()
    {
        isInterrupted = false;
        const itimerval once = {{0, 0}, {0, 20}};
        setitimer(ITIMER_REAL, &once, nullptr);
        while (!isInterrupted) {
            isPosting = true;
            Post();
            isPosting = false;
            DispatchAll();
        }
    }

private:
    static EventQueueInterruption* pInterrupted;
    std::atomic<bool> isPosting{false};
    std::atomic<bool> isInterrupted{false};

    /** Posts and dispatches, never more than two events at once. */
    void HandleSignal()
    {
        for (int i = 0; isPosting && i < 8; ++i) {
            Post();
            DispatchAll();
        }
        isInterrupted = true;
    }
};

EventQueueInterruption* EventQueueInterruption::pInterrupted = nullptr;

TEST_F(EventQueueInterruption, OfAProducerRefusesNoEventWhilePlacesAreFree)
{
    for (int i = 0; i < Interruptions; ++i) {
        PostUntilInterrupted();
    }

    EXPECT_EQ(refused, 0);
}

// The position that a producer stores last, where the next one starts to look for its entry. Only a
// producer that was interrupted right before it stores an old one, so the test stores it instead:
// an explicit instantiation may name a private member.
std::atomic<std::uint32_t>& EndOf(bdmv::EventQueue& queue);
template <auto Member> struct Access {
    friend std::atomic<std::uint32_t>& EndOf(bdmv::EventQueue& queue)
    {
        return (queue.*Member).end;
    }
};
template struct Access<&bdmv::EventQueue::m_Posting>;

TEST_F(EventQueueInterruption, OfAProducerForMillionsOfEventsDoesNotSlowDownTheNextOne)
{
    const std::uint32_t positions = std::uint32_t(1) << 31;
    const std::uint32_t manyLaps = std::uint32_t(1) << 26;
    EndOf(queue) = (EndOf(queue) + positions - manyLaps) % positions;

    const std::clock_t before = std::clock();
    Post();

    EXPECT_LT(std::clock() - before, CLOCKS_PER_SEC / 10);
    EXPECT_TRUE(queue.DispatchNext(listeners));
}

} // namespace
