#include <gtest/gtest.h>

#include "allevents.h"
#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "testkit/allocationcounter.h"
#include "testkit/fakeplatform.h"
#include "testkit/operatornew.h"
#include "testkit/scriptableplaybackcontext.h"

namespace
{

/** A program without commands. */
class Program : public bdmv::IProgramData
{
public:
    bd::UInt16 GetNumberOfNavigationCommands() const override { return 0; }
    const bdmv::INavigationCommandData* GetNavigationCommandData(CommandIdDef) const override
    {
        return nullptr;
    }
};

/** With a true parameter every event takes its longest path. */
class DeliveryAllocation : public testing::TestWithParam<bool>
{
protected:
    DeliveryAllocation()
    {
        context.executeButtonProgram = bdmv::IProgramData::RefPtr(new Program);
        context.async2ndVid = context.async2ndAud = GetParam();
        context.triggerTypeByTime = GetParam() ? bd::TRIGGER_INVALID : bd::TRIGGER_NONE;
        context.finishedReason = static_cast<bdstreaming::FinishedReason>(GetParam() ? 2 : 0);
        for (bdmv::NavigatorListenerAdapter& listener : adapters) {
            listeners.AddListener(&listener);
        }
    }

    void ExpectNoAllocation()
    {
        for (const EventClass& eventClass : AllEvents()) {
            const std::unique_ptr<bdmv::INavigatorEvent> event = eventClass.make(context);
            const std::size_t before = bdmvtest::CountAllocations();
            event->Dispatch(listeners);
            const std::size_t after = bdmvtest::CountAllocations();

            EXPECT_EQ(after, before) << eventClass.name;
        }
    }

    bdmvtest::FakePlatform platform{nullptr};
    bdmvtest::ScriptablePlaybackContext context;
    bdmv::NavigatorListenerAdapter adapters[3];
    bd::EventListenerList<bdmv::INavigatorListener> listeners;
};

INSTANTIATE_TEST_SUITE_P(Paths, DeliveryAllocation, testing::Bool());

TEST_P(DeliveryAllocation, NoEventAllocatesWithTheLogOn)
{
    ExpectNoAllocation();
}

TEST_P(DeliveryAllocation, NoEventAllocatesWithTheLogOff)
{
    platform.DisableLog();

    ExpectNoAllocation();
}

TEST_P(DeliveryAllocation, DeletingAnEventThroughItsInterfaceFreesItsMemory)
{
    for (const EventClass& eventClass : AllEvents()) {
        const long before = bdmvtest::CountLiveBlocks();
        bdmv::INavigatorEvent* const event = eventClass.make(context).release();
        EXPECT_EQ(bdmvtest::CountLiveBlocks(), before + 1) << eventClass.name;
        event->Dispatch(listeners);
        delete event;

        EXPECT_EQ(bdmvtest::CountLiveBlocks(), before) << eventClass.name;
    }
}

TEST_P(DeliveryAllocation, AnAllocationInACallbackIsDetected)
{
    struct AllocatingListener : bdmv::NavigatorListenerAdapter {
        void Paused() override { block.reset(new int); }
        std::unique_ptr<int> block;
    } allocating;
    listeners.AddListener(&allocating);
    const std::size_t before = bdmvtest::CountAllocations();

    bdmv::PausedEvent(context).Dispatch(listeners);

    EXPECT_EQ(bdmvtest::CountAllocations(), before + 1);
}

} // namespace
