#include <gtest/gtest.h>

#include <cerrno>
#include <list>
#include <new>
#include <system_error>
#include <type_traits>

#include "bd/eventlistenerlist.h"
#include "mutexwatch.h"
#include "probe.h"
#include "testkit/allocationcounter.h"
#include "testkit/operatornew.h"

using bdmvtest::IProbe;
using bdmvtest::Probe;

namespace
{

typedef bd::EventListenerList<IProbe> List;

static_assert(std::is_default_constructible_v<List>, "starts empty");
static_assert(!std::is_copy_constructible_v<List> && !std::is_copy_assignable_v<List> &&
                  !std::is_move_constructible_v<List> && !std::is_move_assignable_v<List>,
              "a list cannot move away from its lock");

class EventListenerList : public testing::Test
{
protected:
    /** The calls of one walk. */
    std::string Walk()
    {
        bd::EventListenerList_FireParam0(list, &IProbe::Call0);
        return journal.Take();
    }

    /** The numbers of lock and unlock calls of the operating system that the action makes. */
    template <typename Action> static std::pair<std::size_t, std::size_t> LocksOf(Action action)
    {
        const std::size_t locks = bdmvtest::CountMutexLocks();
        const std::size_t unlocks = bdmvtest::CountMutexUnlocks();
        action();
        return {bdmvtest::CountMutexLocks() - locks, bdmvtest::CountMutexUnlocks() - unlocks};
    }

    bdmvtest::Journal journal;
    Probe a{journal, "A"};
    Probe b{journal, "B"};
    Probe c{journal, "C"};
    List list;
};

const std::pair<std::size_t, std::size_t> Once = {1, 1};

} // namespace

TEST_F(EventListenerList, StartsEmpty)
{
    EXPECT_FALSE(list.ListenerExists(&a));
    EXPECT_EQ("", Walk());
}

TEST_F(EventListenerList, AddsAListener)
{
    EXPECT_TRUE(list.AddListener(&a));
    EXPECT_TRUE(list.ListenerExists(&a));
    EXPECT_EQ("A.Call0()\n", Walk());
}

TEST_F(EventListenerList, KeepsTheOrderOfRegistration)
{
    list.AddListener(&b);
    list.AddListener(&c);
    list.AddListener(&a);

    EXPECT_EQ("B.Call0()\nC.Call0()\nA.Call0()\n", Walk());
}

TEST_F(EventListenerList, RefusesNull)
{
    EXPECT_FALSE(list.AddListener(nullptr));
    EXPECT_FALSE(list.ListenerExists(nullptr));
    EXPECT_EQ("", Walk());
}

TEST_F(EventListenerList, RefusesAListenerThatIsAlreadyRegistered)
{
    list.AddListener(&a);
    list.AddListener(&b);

    EXPECT_FALSE(list.AddListener(&a));
    EXPECT_EQ("A.Call0()\nB.Call0()\n", Walk());
}

TEST_F(EventListenerList, RemovesAListener)
{
    list.AddListener(&a);
    list.AddListener(&b);
    list.AddListener(&c);

    EXPECT_TRUE(list.RemoveListener(&b));
    EXPECT_FALSE(list.ListenerExists(&b));
    EXPECT_TRUE(list.ListenerExists(&a));
    EXPECT_TRUE(list.ListenerExists(&c));
    EXPECT_EQ("A.Call0()\nC.Call0()\n", Walk());
}

TEST_F(EventListenerList, DoesNotRemoveAnUnregisteredListener)
{
    list.AddListener(&a);

    EXPECT_FALSE(list.RemoveListener(&b));
    EXPECT_EQ("A.Call0()\n", Walk());
}

TEST_F(EventListenerList, DoesNotRemoveAListenerTwice)
{
    list.AddListener(&a);
    list.RemoveListener(&a);

    EXPECT_FALSE(list.RemoveListener(&a));
}

TEST_F(EventListenerList, DoesNotRemoveNull)
{
    list.AddListener(&a);

    EXPECT_FALSE(list.RemoveListener(nullptr));
    EXPECT_EQ("A.Call0()\n", Walk());
}

TEST_F(EventListenerList, AppendsAListenerThatIsAddedAgain)
{
    list.AddListener(&a);
    list.AddListener(&b);
    list.RemoveListener(&a);

    EXPECT_TRUE(list.AddListener(&a));
    EXPECT_EQ("B.Call0()\nA.Call0()\n", Walk());
}

TEST_F(EventListenerList, IsIndependentOfOtherLists)
{
    List other;
    list.AddListener(&a);

    EXPECT_FALSE(other.ListenerExists(&a));
    EXPECT_TRUE(other.AddListener(&a));
}

TEST_F(EventListenerList, DropsItsListenersSilently)
{
    {
        List other;
        other.AddListener(&a);
        other.AddListener(&b);
    }

    EXPECT_EQ("", journal.Take());
}

TEST_F(EventListenerList, TakesTheLockOnceToAdd)
{
    EXPECT_EQ(Once, LocksOf([this] { list.AddListener(&a); }));
    EXPECT_EQ(Once, LocksOf([this] { list.AddListener(&a); }));
}

TEST_F(EventListenerList, TakesTheLockOnceToRemove)
{
    list.AddListener(&a);

    EXPECT_EQ(Once, LocksOf([this] { list.RemoveListener(&a); }));
    EXPECT_EQ(Once, LocksOf([this] { list.RemoveListener(&a); }));
}

TEST_F(EventListenerList, TakesTheLockOnceToLookUp)
{
    EXPECT_EQ(Once, LocksOf([this] { list.ListenerExists(&a); }));
}

TEST_F(EventListenerList, HoldsItsListenersThenItsLock)
{
    list.ListenerExists(&a);

    EXPECT_EQ(reinterpret_cast<const char*>(&list) + sizeof(std::list<IProbe*>),
              bdmvtest::LastMutexLocked());
}

TEST_F(EventListenerList, IsUnchangedWhenMemoryRunsOut)
{
    list.AddListener(&a);
    bdmvtest::FailAllocationAfter(0);
    EXPECT_THROW(list.AddListener(&b), std::bad_alloc);
    bdmvtest::FailAllocationAfter(-1);

    EXPECT_FALSE(list.ListenerExists(&b));
    EXPECT_EQ("A.Call0()\n", Walk());
    EXPECT_TRUE(list.AddListener(&b));
    EXPECT_EQ("A.Call0()\nB.Call0()\n", Walk());
}

TEST_F(EventListenerList, FreesEveryBlockItAllocates)
{
    const long blocks = bdmvtest::CountLiveBlocks();
    {
        List other;
        other.AddListener(&a);
        other.AddListener(&b);
        other.RemoveListener(&a);
        EXPECT_EQ(blocks + 1, bdmvtest::CountLiveBlocks());
    }

    EXPECT_EQ(blocks, bdmvtest::CountLiveBlocks());
}

TEST_F(EventListenerList, IsUnchangedWhenTheLockIsRefused)
{
    list.AddListener(&a);

    bdmvtest::FailMutexLock(EAGAIN);
    EXPECT_THROW(list.AddListener(&b), std::system_error);
    bdmvtest::FailMutexLock(EAGAIN);
    EXPECT_THROW(list.RemoveListener(&a), std::system_error);
    bdmvtest::FailMutexLock(EAGAIN);
    EXPECT_THROW(list.ListenerExists(&a), std::system_error);

    EXPECT_EQ("A.Call0()\n", Walk());
}
