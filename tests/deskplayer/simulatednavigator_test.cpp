#include "navigator/simulatednavigator.h"

#include <gtest/gtest.h>

#include "session/builtinsession.h"
#include "support/fakeplatform.h"
#include "support/recordinglistener.h"

namespace
{

using deskplayer::SimulatedNavigator;

constexpr std::uint64_t Second = 45000;

deskplayer::PlayItem Item(std::uint32_t seconds, std::uint8_t stillMode = 0,
                          std::uint16_t stillTime = 0)
{
    deskplayer::PlayItem item;
    item.inTime = 600 * Second;
    item.outTime = item.inTime + static_cast<std::uint32_t>(seconds * Second);
    item.stillMode = stillMode;
    item.stillTime = stillTime;
    deskplayer::Stream video;
    video.attributes.frameRate = 6;
    item.streams.primaryVideo = {video};
    return item;
}

/** A navigator over play items, and what its listener hears. */
class Desk
{
public:
    explicit Desk(const std::vector<deskplayer::PlayItem>& items)
        : navigator(Load(items), clock, delivery)
    {
        platform.DisableLog();
        delivery.Listeners().AddListener(&listener);
    }

    /** The callbacks since the last call, each with the second of the session it came at. */
    std::string Take()
    {
        std::string heard;
        heard.swap(callbacks);
        return heard;
    }

    bdmvtest::Journal journal;
    bdmvtest::FakePlatform platform{nullptr};
    deskplayer::VirtualClock clock;
    std::string callbacks;
    bdmvtest::RecordingListener listener{journal, "A"};
    deskplayer::EventDelivery delivery;
    SimulatedNavigator navigator;

private:
    deskplayer::LoadedPlayList Load(const std::vector<deskplayer::PlayItem>& items)
    {
        listener.onCallback = [this](const std::string& callback) {
            callbacks += std::to_string(clock.Now() / Second) + " " + callback + "\n";
        };
        deskplayer::LoadedPlayList loaded;
        loaded.playList.playItems = items;
        loaded.timeLine = deskplayer::BuildTimeLine(loaded.playList);
        loaded.aspectRatios.resize(items.size());
        return loaded;
    }
};

TEST(SimulatedNavigatorTest, PlaysItsItemsOneAfterTheOther)
{
    Desk desk({Item(10), Item(5)});

    desk.navigator.Play();

    EXPECT_EQ(desk.navigator.Advance(20 * Second), 5 * Second);
    EXPECT_EQ(desk.Take(), "0 PlayStarted()\n"
                           "0 FirstPictureDelivered()\n"
                           "15 Finished(0)\n");
    EXPECT_EQ(desk.navigator.GetPlayItemId(), 1);
    EXPECT_EQ(desk.navigator.CurrentStatus(), SimulatedNavigator::Status::Finished);
}

TEST(SimulatedNavigatorTest, StandsStillWhilePaused)
{
    Desk desk({Item(10)});
    desk.navigator.Play();
    desk.navigator.Advance(4 * Second);
    desk.Take();

    desk.navigator.Pause();
    desk.navigator.Advance(100 * Second);
    desk.navigator.Continue();

    EXPECT_EQ(desk.navigator.GetCurrentTimePosition(), 4 * Second);
    EXPECT_EQ(desk.Take(), "4 Paused()\n"
                           "104 Continued(0, 5)\n");
}

TEST(SimulatedNavigatorTest, StepsByOnePicture)
{
    Desk desk({Item(10)});
    desk.navigator.Play();
    desk.navigator.Pause();
    desk.Take();

    desk.navigator.Step();
    desk.navigator.Step();

    EXPECT_EQ(desk.Take(), "0 Stepped(900, 0)\n"
                           "0 Stepped(1800, 0)\n");
}

TEST(SimulatedNavigatorTest, DoesNotStepBeyondTheLastPictureOfAnItem)
{
    Desk desk({Item(1)});
    desk.navigator.Play();
    desk.navigator.Advance(Second - 900);
    desk.navigator.Pause();
    desk.Take();

    desk.navigator.Step();

    EXPECT_EQ(desk.Take(), "");
}

TEST(SimulatedNavigatorTest, LeavesATimedStillByItself)
{
    Desk desk({Item(10, deskplayer::StillModeTimed, 5), Item(1)});
    desk.navigator.Play();
    desk.Take();

    desk.navigator.Advance(100 * Second);

    EXPECT_EQ(desk.Take(), "10 StillOn()\n"
                           "15 StillOff()\n"
                           "16 Finished(0)\n");
}

TEST(SimulatedNavigatorTest, HoldsAnEndlessStillUntilItIsEnded)
{
    Desk desk({Item(10, deskplayer::StillModeEndless)});
    desk.navigator.Play();
    desk.Take();

    EXPECT_EQ(desk.navigator.Advance(1000 * Second), 0);
    EXPECT_FALSE(desk.navigator.TimeToNextChange());
    desk.navigator.EndStill();

    EXPECT_EQ(desk.Take(), "10 StillOn()\n"
                           "1000 StillOff()\n"
                           "1000 Finished(0)\n");
}

TEST(SimulatedNavigatorTest, FinishesAtOnceWhenThereIsNothingToPlay)
{
    Desk desk({});

    desk.navigator.Play();

    EXPECT_EQ(desk.Take(), "0 PlayStarted()\n"
                           "0 Finished(0)\n");
}

TEST(SimulatedNavigatorTest, StopsAndStartsFromTheBeginning)
{
    Desk desk({Item(10)});
    desk.navigator.Play();
    desk.navigator.Advance(4 * Second);
    desk.Take();

    desk.navigator.Stop();
    EXPECT_EQ(desk.navigator.Advance(Second), Second);
    desk.navigator.Play();

    EXPECT_EQ(desk.navigator.GetCurrentTimePosition(), 0);
    EXPECT_EQ(desk.Take(), "4 Stopped()\n"
                           "4 PlayStarted()\n"
                           "4 FirstPictureDelivered()\n");
}

TEST(SimulatedNavigatorTest, IgnoresWhatMakesNoSense)
{
    Desk desk({Item(10)});

    desk.navigator.Pause();
    desk.navigator.Continue();
    desk.navigator.Step();
    desk.navigator.EndStill();
    desk.navigator.Stop();

    EXPECT_EQ(desk.Take(), "");
}

TEST(BuiltInSessionTest, PausesStepsAndContinuesAThirdOfTheWayThrough)
{
    Desk desk({Item(30)});

    deskplayer::PlayBuiltInSession(desk.navigator, 30 * Second);

    EXPECT_EQ(desk.Take(), "0 PlayStarted()\n"
                           "0 FirstPictureDelivered()\n"
                           "10 Paused()\n"
                           "12 Stepped(450900, 0)\n"
                           "12 Continued(0, 5)\n"
                           "31 Finished(0)\n");
}

TEST(BuiltInSessionTest, LeavesAnEndlessStillAfterThreeSeconds)
{
    Desk desk({Item(3, deskplayer::StillModeEndless)});

    deskplayer::PlayBuiltInSession(desk.navigator, 3 * Second);

    EXPECT_EQ(desk.Take(), "0 PlayStarted()\n"
                           "0 FirstPictureDelivered()\n"
                           "1 Paused()\n"
                           "3 Stepped(45900, 0)\n"
                           "3 Continued(0, 5)\n"
                           "4 StillOn()\n"
                           "7 StillOff()\n"
                           "7 Finished(0)\n");
}

} // namespace
