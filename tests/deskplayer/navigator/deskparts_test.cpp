#include "navigator/deskparts.h"

#include <gtest/gtest.h>

#include "../testdesk.h"

namespace deskplayer
{

namespace
{

class ResumeCounter : public bdmv::NavigatorListenerAdapter
{
public:
    explicit ResumeCounter(const DeskParts& desk) : m_rDesk(desk) {}

    void SystemSuspended(const void* /*data*/, bd::UInt32 size) override
    {
        keptBefore = m_rDesk.ResumeData().size() == size;
    }
    void SystemResumed(bool /*playing*/) override { ++resumed; }
    void SystemResumeFailed() override { ++failed; }

    bool keptBefore = false;
    int resumed = 0;
    int failed = 0;

private:
    const DeskParts& m_rDesk;
};

TEST(DeskParts, WakesUpWithTheResumeDataThatItStored)
{
    DeskParts desk(LayOut(7, ListOf({Item(10)})));
    ResumeCounter counter(desk);
    desk.Listeners().AddListener(&counter);
    desk.Navigator().Play();
    desk.Navigator().GoToStandby();

    desk.Navigator().WakeUp(desk.ResumeData());

    EXPECT_EQ(counter.resumed, 1);
    EXPECT_EQ(counter.failed, 0);
    desk.Listeners().RemoveListener(&counter);
}

TEST(DeskParts, StoresTheResumeDataBeforeOtherListenersAreNotified)
{
    DeskParts desk(LayOut(7, ListOf({Item(10)})));
    ResumeCounter counter(desk);
    desk.Listeners().AddListener(&counter);
    desk.Navigator().Play();

    desk.Navigator().GoToStandby();

    EXPECT_TRUE(counter.keptBefore);
    desk.Listeners().RemoveListener(&counter);
}

TEST(DeskParts, HasNoResumeDataBeforeTheFirstStandby)
{
    const DeskParts desk(LayOut(7, ListOf({Item(10)})));
    EXPECT_TRUE(desk.ResumeData().empty());
}

} // namespace

} // namespace deskplayer
