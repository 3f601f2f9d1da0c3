#include "navigator/eventdelivery.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <thread>

#include "bdmvnavigator/navigatorevent.h"
#include "testkit/fakeplatform.h"
#include "testkit/recordinglistener.h"
#include "testkit/scriptableplaybackcontext.h"

namespace
{

class DeliveryThread : public testing::Test
{
protected:
    template <typename Event> void Post() { delivery->Post(std::make_unique<Event>(context)); }

    bdmvtest::Journal journal;
    bdmvtest::FakePlatform platform{&journal};
    bdmvtest::ScriptablePlaybackContext context{journal};
    bdmvtest::RecordingListener listener{journal, "A"};
    std::unique_ptr<deskplayer::EventDelivery> delivery =
        std::make_unique<deskplayer::EventDelivery>();

    DeliveryThread()
    {
        platform.DisableLog();
        delivery->Listeners().AddListener(&listener);
    }
};

TEST_F(DeliveryThread, DeliversInOrderOnItsOwnThread)
{
    std::thread::id thread;
    listener.onCallback = [&thread](const std::string&) { thread = std::this_thread::get_id(); };

    Post<bdmv::PausedEvent>();
    Post<bdmv::StoppedEvent>();
    delivery->Settle();

    EXPECT_EQ(journal.Take(), "log? 57 5 0 -> off\n"
                              "A.Paused()\n"
                              "log? 57 5 0 -> off\n"
                              "A.Stopped()\n");
    EXPECT_NE(thread, std::this_thread::get_id());
}

TEST_F(DeliveryThread, SettlesAtOnceIfNothingWasPosted)
{
    delivery->Settle();

    EXPECT_EQ(journal.Take(), "");
}

TEST_F(DeliveryThread, RethrowsTheExceptionOfAListenerAndContinuesDelivering)
{
    listener.onCallback = [](const std::string& callback) {
        if (callback == "Paused()") {
            throw std::runtime_error("paused");
        }
    };

    Post<bdmv::PausedEvent>();
    Post<bdmv::StoppedEvent>();

    EXPECT_THROW(delivery->Settle(), std::runtime_error);
    EXPECT_EQ(journal.Take(), "log? 57 5 0 -> off\n"
                              "A.Paused()\n"
                              "log? 57 5 0 -> off\n"
                              "A.Stopped()\n");
    EXPECT_NO_THROW(delivery->Settle());
}

TEST_F(DeliveryThread, DeliversQueuedEventsBeforeItEnds)
{
    for (int i = 0; i < 100; ++i) {
        Post<bdmv::PausedEvent>();
    }
    delivery.reset();

    const std::string entries = journal.Take();
    int paused = 0;
    for (std::size_t at = 0; (at = entries.find("A.Paused()", at)) != std::string::npos; ++at) {
        ++paused;
    }
    EXPECT_EQ(paused, 100);
}

} // namespace
