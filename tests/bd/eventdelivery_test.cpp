#include <gtest/gtest.h>

#include <cerrno>
#include <exception>
#include <functional>
#include <stdexcept>
#include <string>
#include <system_error>
#include <utility>
#include <vector>

#include "bd/eventlistenerlist.h"
#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "mutexwatch.h"
#include "probe.h"
#include "testkit/allocationcounter.h"
#include "testkit/fakeplatform.h"

using bd::EventListenerList_FireInvoker;
using bd::EventListenerList_FireParam0;
using bd::EventListenerList_FireParam1;
using bd::EventListenerList_FireParam2;
using bd::EventListenerList_FireParam3;
using bd::EventListenerList_FireParam4;
using bdmvtest::CountedValue;
using bdmvtest::IProbe;
using bdmvtest::Probe;

namespace
{

typedef bd::EventListenerList<IProbe> List;

/** The listeners A, B and C, registered in this order. */
class EventDelivery : public testing::Test
{
protected:
    EventDelivery()
    {
        list.AddListener(&a);
        list.AddListener(&b);
        list.AddListener(&c);
        CountedValue::copies = 0;
    }

    void ExpectListAndLockAreSound()
    {
        journal.Take();
        a.onCall = b.onCall = c.onCall = nullptr;
        EXPECT_NO_THROW(EventListenerList_FireParam0(list, &IProbe::Call0));
        EXPECT_EQ("A.Call0()\nB.Call0()\nC.Call0()\n", journal.Take());
    }

    bdmvtest::Journal journal;
    bdmvtest::FakePlatform platform{&journal};
    Probe a{journal, "A"};
    Probe b{journal, "B"};
    Probe c{journal, "C"};
    List list;
};

} // namespace

TEST_F(EventDelivery, CallsAMethodWithoutArgumentsFrontToBack)
{
    EventListenerList_FireParam0(list, &IProbe::Call0);

    EXPECT_EQ("A.Call0()\nB.Call0()\nC.Call0()\n", journal.Take());
}

TEST_F(EventDelivery, CallsAMethodWithOneArgumentFrontToBack)
{
    EventListenerList_FireParam1(list, &IProbe::Call1, 1);

    EXPECT_EQ("A.Call1(1)\nB.Call1(1)\nC.Call1(1)\n", journal.Take());
}

TEST_F(EventDelivery, CallsAMethodWithTwoArgumentsFrontToBack)
{
    EventListenerList_FireParam2(list, &IProbe::Call2, 1, 2);

    EXPECT_EQ("A.Call2(1, 2)\nB.Call2(1, 2)\nC.Call2(1, 2)\n", journal.Take());
}

TEST_F(EventDelivery, CallsAMethodWithThreeArgumentsFrontToBack)
{
    EventListenerList_FireParam3(list, &IProbe::Call3, 1, 2, 3);

    EXPECT_EQ("A.Call3(1, 2, 3)\nB.Call3(1, 2, 3)\nC.Call3(1, 2, 3)\n", journal.Take());
}

TEST_F(EventDelivery, CallsAMethodWithFourArgumentsFrontToBack)
{
    EventListenerList_FireParam4(list, &IProbe::Call4, 1, 2, 3, 4);

    EXPECT_EQ("A.Call4(1, 2, 3, 4)\nB.Call4(1, 2, 3, 4)\nC.Call4(1, 2, 3, 4)\n", journal.Take());
}

TEST_F(EventDelivery, FinishesOneCallbackBeforeTheNext)
{
    EventListenerList_FireParam0(list, &IProbe::Call0);
    EventListenerList_FireParam1(list, &IProbe::Call1, 1);

    EXPECT_EQ("A.Call0()\nB.Call0()\nC.Call0()\n"
              "A.Call1(1)\nB.Call1(1)\nC.Call1(1)\n",
              journal.Take());
}

TEST_F(EventDelivery, CallsNothingWithoutListeners)
{
    List empty;
    EventListenerList_FireParam4(empty, &IProbe::Call4, 1, 2, 3, 4);

    EXPECT_EQ("", journal.Take());
}

// Values

TEST_F(EventDelivery, CopiesAValueOnceAndThenOncePerListener)
{
    const CountedValue value(1);
    EventListenerList_FireParam1(list, &IProbe::Copy1, value);

    EXPECT_EQ("A.Copy1(1)\nB.Copy1(1)\nC.Copy1(1)\n", journal.Take());
    EXPECT_EQ(1 + 3, CountedValue::copies);
}

TEST_F(EventDelivery, CopiesEachOfTwoValuesOnceAndThenOncePerListener)
{
    const CountedValue value(1);
    EventListenerList_FireParam2(list, &IProbe::Copy2, value, value);

    EXPECT_EQ(2 * (1 + 3), CountedValue::copies);
}

TEST_F(EventDelivery, CopiesEachOfThreeValuesOnceAndThenOncePerListener)
{
    const CountedValue value(1);
    EventListenerList_FireParam3(list, &IProbe::Copy3, value, value, value);

    EXPECT_EQ(3 * (1 + 3), CountedValue::copies);
}

TEST_F(EventDelivery, CopiesEachOfFourValuesOnceAndThenOncePerListener)
{
    const CountedValue value(1);
    EventListenerList_FireParam4(list, &IProbe::Copy4, value, value, value, value);

    EXPECT_EQ(4 * (1 + 3), CountedValue::copies);
}

TEST_F(EventDelivery, CopiesAValueOnceWithoutListeners)
{
    List empty;
    EventListenerList_FireParam1(empty, &IProbe::Copy1, CountedValue(1));

    EXPECT_EQ(1, CountedValue::copies);
}

TEST_F(EventDelivery, TreatsAConstValueAsAValue)
{
    EventListenerList_FireParam1(list, &IProbe::CopyConst, CountedValue(1));

    EXPECT_EQ("A.CopyConst(1)\nB.CopyConst(1)\nC.CopyConst(1)\n", journal.Take());
    EXPECT_EQ(1 + 3, CountedValue::copies);
}

TEST_F(EventDelivery, AcceptsAConstValueTypeGivenExplicitly)
{
    EventListenerList_FireParam1<IProbe, const CountedValue>(list, &IProbe::CopyConst,
                                                             CountedValue(1));

    EXPECT_EQ("A.CopyConst(1)\nB.CopyConst(1)\nC.CopyConst(1)\n", journal.Take());
    EXPECT_EQ(1 + 3, CountedValue::copies);
}

TEST_F(EventDelivery, KeepsAChangeOfAValueFromLaterListeners)
{
    a.increment = 10;
    CountedValue value(1);
    EventListenerList_FireParam1(list, &IProbe::Copy1, value);

    EXPECT_EQ("A.Copy1(1)\nB.Copy1(1)\nC.Copy1(1)\n", journal.Take());
    EXPECT_EQ(1, value.number);
}

TEST_F(EventDelivery, ConvertsAnArgumentToTheParameterOfTheMethod)
{
    const short number = 1;
    EventListenerList_FireParam1(list, &IProbe::Call1, number);

    EXPECT_EQ("A.Call1(1)\nB.Call1(1)\nC.Call1(1)\n", journal.Take());
}

// References

TEST_F(EventDelivery, GivesEveryListenerTheCallersObject)
{
    int number = 1;
    EventListenerList_FireParam1(list, &IProbe::Refer1, number);

    const std::vector<const int*> expected = {&number};
    EXPECT_EQ(expected, a.referents);
    EXPECT_EQ(expected, b.referents);
    EXPECT_EQ(expected, c.referents);
}

TEST_F(EventDelivery, GivesEveryListenerTheCallersTwoObjects)
{
    int numbers[2] = {1, 2};
    EventListenerList_FireParam2(list, &IProbe::Refer2, numbers[0], numbers[1]);

    const std::vector<const int*> expected = {&numbers[0], &numbers[1]};
    EXPECT_EQ(expected, a.referents);
    EXPECT_EQ(expected, c.referents);
}

TEST_F(EventDelivery, GivesEveryListenerTheCallersThreeObjects)
{
    int numbers[3] = {1, 2, 3};
    EventListenerList_FireParam3(list, &IProbe::Refer3, numbers[0], numbers[1], numbers[2]);

    const std::vector<const int*> expected = {&numbers[0], &numbers[1], &numbers[2]};
    EXPECT_EQ(expected, a.referents);
    EXPECT_EQ(expected, c.referents);
}

TEST_F(EventDelivery, GivesEveryListenerTheCallersFourObjects)
{
    int numbers[4] = {1, 2, 3, 4};
    EventListenerList_FireParam4(list, &IProbe::Refer4, numbers[0], numbers[1], numbers[2],
                                 numbers[3]);

    const std::vector<const int*> expected = {&numbers[0], &numbers[1], &numbers[2], &numbers[3]};
    EXPECT_EQ(expected, a.referents);
    EXPECT_EQ(expected, c.referents);
}

TEST_F(EventDelivery, ShowsAChangeThroughAReferenceToLaterListenersAndTheCaller)
{
    a.increment = 10;
    b.increment = 100;
    int number = 1;
    EventListenerList_FireParam1(list, &IProbe::Refer1, number);

    EXPECT_EQ("A.Refer1(1)\nB.Refer1(11)\nC.Refer1(111)\n", journal.Take());
    EXPECT_EQ(111, number);
}

// Custom invokers

namespace
{

/** Counts its calls, and cannot be copied. */
class CountingInvoker
{
public:
    CountingInvoker() = default;
    CountingInvoker(const CountingInvoker&) = delete;
    CountingInvoker& operator=(const CountingInvoker&) = delete;

    void Fire(IProbe& listener) { listener.Call1(++calls); }

    int calls = 0;
};

} // namespace

TEST_F(EventDelivery, AcceptsAnyInvoker)
{
    CountingInvoker invoker;
    EventListenerList_FireInvoker(list, invoker);

    EXPECT_EQ("A.Call1(1)\nB.Call1(2)\nC.Call1(3)\n", journal.Take());
    EXPECT_EQ(3, invoker.calls);
}

TEST_F(EventDelivery, TakesListAndInvokerByReference)
{
    void (*const fire)(List&, CountingInvoker&) =
        &EventListenerList_FireInvoker<IProbe, CountingInvoker>;
    CountingInvoker invoker;
    fire(list, invoker);

    EXPECT_EQ(3, invoker.calls);
}

// The lock

TEST_F(EventDelivery, TakesTheLockOncePerWalk)
{
    bdmv::NavigatorListenerAdapter quiet;
    bd::EventListenerList<bdmv::INavigatorListener> quietList;
    quietList.AddListener(&quiet);
    const std::size_t locks = bdmvtest::CountMutexLocks();
    const std::size_t unlocks = bdmvtest::CountMutexUnlocks();
    EventListenerList_FireParam0(quietList, &bdmv::INavigatorListener::Paused);

    EXPECT_EQ(locks + 1, bdmvtest::CountMutexLocks());
    EXPECT_EQ(unlocks + 1, bdmvtest::CountMutexUnlocks());
}

TEST_F(EventDelivery, TakesTheLockOnceWithoutListeners)
{
    List empty;
    const std::size_t locks = bdmvtest::CountMutexLocks();
    const std::size_t unlocks = bdmvtest::CountMutexUnlocks();
    EventListenerList_FireParam0(empty, &IProbe::Call0);

    EXPECT_EQ(locks + 1, bdmvtest::CountMutexLocks());
    EXPECT_EQ(unlocks + 1, bdmvtest::CountMutexUnlocks());
}

TEST_F(EventDelivery, HoldsTheLockFromTheFirstCallbackToTheLast)
{
    struct Watch : bdmv::NavigatorListenerAdapter {
        void Paused() override
        {
            locks = bdmvtest::CountMutexLocks();
            unlocks = bdmvtest::CountMutexUnlocks();
        }
        std::size_t locks = 0;
        std::size_t unlocks = 0;
    };
    Watch first;
    Watch last;
    bd::EventListenerList<bdmv::INavigatorListener> watched;
    watched.AddListener(&first);
    watched.AddListener(&last);
    const std::size_t locks = bdmvtest::CountMutexLocks();
    const std::size_t unlocks = bdmvtest::CountMutexUnlocks();
    EventListenerList_FireParam0(watched, &bdmv::INavigatorListener::Paused);

    EXPECT_EQ(locks + 1, first.locks);
    EXPECT_EQ(unlocks, first.unlocks);
    EXPECT_EQ(locks + 1, last.locks);
    EXPECT_EQ(unlocks, last.unlocks);
}

TEST_F(EventDelivery, CallsNoListenerWhenTheLockIsRefused)
{
    bdmvtest::FailMutexLock(EAGAIN);
    try {
        EventListenerList_FireParam0(list, &IProbe::Call0);
        ADD_FAILURE() << "no exception was thrown";
    } catch (const std::system_error& error) {
        EXPECT_EQ(std::errc::resource_unavailable_try_again, error.code());
    }

    EXPECT_EQ("", journal.Take());
    ExpectListAndLockAreSound();
}

TEST_F(EventDelivery, CopiesItsValueBeforeItTakesTheLock)
{
    const CountedValue value(1);
    bdmvtest::FailMutexLock(EAGAIN);
    EXPECT_THROW(EventListenerList_FireParam1(list, &IProbe::Copy1, value), std::system_error);

    EXPECT_EQ(1, CountedValue::copies);
}

// Listeners that throw

TEST_F(EventDelivery, EndsAtTheListenerThatThrows)
{
    const std::vector<std::pair<Probe*, std::string>> cases = {
        {&a, "A.Call0()\n"},
        {&b, "A.Call0()\nB.Call0()\n"},
        {&c, "A.Call0()\nB.Call0()\nC.Call0()\n"},
    };
    for (const auto& [thrower, calls] : cases) {
        thrower->onCall = [] { throw std::runtime_error("thrown"); };
        EXPECT_THROW(EventListenerList_FireParam0(list, &IProbe::Call0), std::runtime_error);
        EXPECT_EQ(calls, journal.Take());
        ExpectListAndLockAreSound();
    }
}

TEST_F(EventDelivery, PassesOnTheExceptionThatAListenerThrows)
{
    const std::exception_ptr thrown = std::make_exception_ptr(std::runtime_error("thrown"));
    std::exception_ptr caught;
    b.onCall = [&thrown] { std::rethrow_exception(thrown); };
    try {
        EventListenerList_FireParam4(list, &IProbe::Call4, 1, 2, 3, 4);
    } catch (...) {
        caught = std::current_exception();
    }

    EXPECT_EQ(thrown, caught);
}

// Callbacks that use the list that is calling them

namespace
{

/** An operation on the list, and its name. */
struct Operation {
    std::string name;
    std::function<void(List& list, IProbe& listener)> run;
};

const std::vector<Operation>& Operations()
{
    static const std::vector<Operation> operations = {
        {"Add", [](List& list, IProbe& listener) { list.AddListener(&listener); }},
        {"Remove", [](List& list, IProbe& listener) { list.RemoveListener(&listener); }},
        {"LookUp", [](List& list, IProbe& listener) { list.ListenerExists(&listener); }},
        {"Fire",
         [](List& list, IProbe&) { EventListenerList_FireParam1(list, &IProbe::Call1, 1); }},
    };
    return operations;
}

class ReentrantDelivery : public EventDelivery, public testing::WithParamInterface<Operation>
{
protected:
    Probe another{journal, "another"};
};

INSTANTIATE_TEST_SUITE_P(Callback, ReentrantDelivery, testing::ValuesIn(Operations()),
                         [](const auto& instance) { return instance.param.name; });

} // namespace

TEST_P(ReentrantDelivery, GetsAnExceptionInsideTheCallback)
{
    for (Probe* const listener : {static_cast<Probe*>(&b), &another}) {
        std::error_code error;
        b.onCall = [this, &error, listener] {
            try {
                GetParam().run(list, *listener);
            } catch (const std::system_error& refusal) {
                error = refusal.code();
            }
        };
        EventListenerList_FireParam0(list, &IProbe::Call0);

        EXPECT_EQ(std::errc::resource_deadlock_would_occur, error);
        EXPECT_EQ("A.Call0()\nB.Call0()\nC.Call0()\n", journal.Take());
        ExpectListAndLockAreSound();
    }
}

TEST_P(ReentrantDelivery, UncaughtExceptionInsideACallbackEndsTheWalk)
{
    b.onCall = [this] { GetParam().run(list, another); };
    try {
        EventListenerList_FireParam0(list, &IProbe::Call0);
        ADD_FAILURE() << "no exception was thrown";
    } catch (const std::system_error& refusal) {
        EXPECT_EQ(std::errc::resource_deadlock_would_occur, refusal.code());
    }

    EXPECT_EQ("A.Call0()\nB.Call0()\n", journal.Take());
    ExpectListAndLockAreSound();
}

TEST_F(EventDelivery, LetsACallbackUseAnotherList)
{
    List other;
    Probe another(journal, "another");
    other.AddListener(&another);
    b.onCall = [&other] { EventListenerList_FireParam1(other, &IProbe::Call1, 1); };
    EventListenerList_FireParam0(list, &IProbe::Call0);

    EXPECT_EQ("A.Call0()\nB.Call0()\nanother.Call1(1)\nC.Call0()\n", journal.Take());
}

// Memory

TEST(EventDeliveryMemory, AllocatesNothing)
{
    struct Counter : bdmv::NavigatorListenerAdapter {
        void Paused() override { ++calls; }
        void ZoomModeSet(bd::ZOOM_PARAM_Def) override { ++calls; }
        void AudioInfoChanged(bool, bd::AudioInfoType) override { ++calls; }
        void MarkInfo(bd::PlayListIdDef, const bd::PlayListMarkIdDef&,
                      const bd::TimePosition&) override
        {
            ++calls;
        }
        void PlayItem(bd::PlayListIdDef, bd::PlayItemIdDef, bd::VideoFormatType,
                      bd::VideoAspectRatioType) override
        {
            ++calls;
        }
        int calls = 0;
    };
    typedef bdmv::INavigatorListener Listener;
    Counter first;
    Counter second;
    bd::EventListenerList<Listener> list;
    list.AddListener(&first);
    list.AddListener(&second);

    const std::size_t before = bdmvtest::CountAllocations();
    EventListenerList_FireParam0(list, &Listener::Paused);
    EventListenerList_FireParam1(list, &Listener::ZoomModeSet, bd::ZOOM_PARAM_Def());
    EventListenerList_FireParam2(list, &Listener::AudioInfoChanged, true, bd::AudioInfoType());
    EventListenerList_FireParam3(list, &Listener::MarkInfo, 1, 2, 3);
    EventListenerList_FireParam4(list, &Listener::PlayItem, 1, 2, bd::VideoFormatType1080p,
                                 bd::VideoAspectRatioType16x9);
    const std::size_t after = bdmvtest::CountAllocations();

    EXPECT_EQ(5, first.calls);
    EXPECT_EQ(5, second.calls);
    EXPECT_EQ(before, after);
}
