#include "session/session.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "../testdesk.h"

namespace deskplayer
{

namespace
{

/** Carries out a script and records the calls of the hooks. */
class Session : public testing::Test
{
protected:
    /** @return the callbacks, with the refusals in between */
    std::string PlayScript(TestDesk& desk, const std::string& script)
    {
        std::string received;
        SessionHooks hooks = desk.Hooks();
        hooks.beforeTimePasses = [this, &desk, count = hooks.beforeTimePasses](Ticks time) {
            count(time);
            timesPassed.emplace_back(desk.clock.Now(), time);
        };
        hooks.onRefused = [&received, &desk](std::size_t line, const std::string& reason) {
            received += desk.TakeWithoutPositions();
            received += "line " + std::to_string(line) + ": " + reason + "\n";
        };
        PlaySession(ParseScript(script, "a.session", CommandSyntaxes()), desk.desk, hooks);
        return received + desk.TakeWithoutPositions();
    }

    std::vector<std::pair<Ticks, Ticks>> timesPassed; ///< start and duration
};

const char* const StartOfItem =
    "0 PlayStarted()\n"
    "0 Playlist(7)\n"
    "0 PlayItem(7, 0, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
    "0 VideoInfo(1)\n"
    "0 AngleInfo(1)\n"
    "0 UOMask(0)\n"
    "0 FirstPictureDelivered()\n";

TEST_F(Session, CarriesOutEachStepAtItsTimeAndPlaysToTheEnd)
{
    TestDesk desk(ListOf({Item(10)}));

    EXPECT_EQ(PlayScript(desk, "play\n"
                               "after 2s pause\n"
                               "step\n"
                               "at 60 continue\n"),
              std::string(StartOfItem) + "2 Paused()\n"
                                         "2 Stepped(90900, PlayDirectionForward)\n"
                                         "60 Continued(PlayDirectionForward, PlaySpeedNormal)\n"
                                         "67+44100 Finished(EndOfMedia)\n");
}

TEST_F(Session, ReportsRefusalsWithTheirLineAndContinues)
{
    TestDesk desk(ListOf({Item(10)}));

    EXPECT_EQ(PlayScript(desk, "play\n"
                               "\n"
                               "after 1s continue # refused: not paused\n"
                               "pause\n"),
              std::string(StartOfItem) + "line 3: not paused, but playing\n"
                                         "1 Paused()\n");
}

TEST_F(Session, RunsWithoutHooks)
{
    TestDesk desk(ListOf({Item(1)}));

    PlaySession(ParseScript("play\nstep\n", "a.session", CommandSyntaxes()), desk.desk,
                SessionHooks());

    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Finished);
}

TEST_F(Session, ContinuesItsTimeAfterPlaybackHasEnded)
{
    TestDesk desk(ListOf({Item(1)}));

    EXPECT_EQ(PlayScript(desk, "play\nat 1:00:00 fail play\nplay\nafter 3 stop\n"),
              std::string(StartOfItem) + "1 Finished(EndOfMedia)\n"
                                         "3600 PlayFailed()\n"
                                         "line 4: not playing, paused or in a still, but "
                                         "finished\n");
    EXPECT_EQ(desk.clock.Now(), 3603 * Second);
}

TEST_F(Session, DoesNothingWithoutSteps)
{
    TestDesk desk(ListOf({Item(1)}));

    EXPECT_EQ(PlayScript(desk, "# nothing\n"), "");
    EXPECT_EQ(desk.clock.Now(), Ticks(0));
}

TEST_F(Session, EndsWherePlaybackWaits)
{
    const std::pair<const char*, Status> ends[] = {{"pause", Status::Paused},
                                                   {"suspend", Status::Suspended},
                                                   {"standby", Status::Standby},
                                                   {"stop", Status::Stopped},
                                                   {"seek 4", Status::Still}};
    for (const auto& [command, status] : ends) {
        SCOPED_TRACE(command);
        TestDesk desk(ListOf({WithEndlessStill(Item(10))}));
        PlayScript(desk, std::string("play\nafter 2s ") + command + "\n");
        EXPECT_EQ(desk.navigator.CurrentStatus(), status);
        EXPECT_EQ(desk.clock.Now(), (status == Status::Still ? 8 : 2) * Second);
    }
}

TEST_F(Session, EndsWherePlaybackWouldRepeatForever)
{
    for (const char* const repeat :
         {"repeat a\nafter 1s repeat b", "repeat chapter", "repeat title"}) {
        SCOPED_TRACE(repeat);
        TestDesk desk(ListOf({Item(10)}, {Entry(0, Ticks(0))}));
        PlayScript(desk, std::string("play\nafter 2s ") + repeat + "\nafter 30s step\n");
        EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Playing);
        EXPECT_GE(desk.clock.Now(), 32 * Second);
        EXPECT_LE(desk.clock.Now(), 33 * Second);
    }
}

TEST_F(Session, PlaysToTheEndOncePlaybackHasLeftTheRepeat)
{
    TestDesk desk(ListOf({Item(10)}));

    PlayScript(desk, "play\nrepeat a\nafter 1s repeat b\nseek 5\n");

    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Finished);
    EXPECT_EQ(desk.clock.Now(), 6 * Second);
}

TEST_F(Session, CallsTheHookBeforeEveryChange)
{
    TestDesk desk(ListOf({Item(2)}, {Link(0, Ticks(100))}));

    PlayScript(desk, "after 5s play\nafter 1.5s pause\nafter 10s continue\n");

    typedef std::vector<std::pair<Ticks, Ticks>> Times;
    EXPECT_EQ(timesPassed, (Times{{Ticks(0), 5 * Second},
                                  {5 * Second, Ticks(100)},
                                  {5 * Second + Ticks(100), Second - Ticks(100)},
                                  {6 * Second, Second / 2},
                                  {6 * Second + Second / 2, 10 * Second},
                                  {16 * Second + Second / 2, Second / 2}}));
    EXPECT_EQ(desk.clock.Now(), 17 * Second);
}

TEST_F(Session, RethrowsTheExceptionOfAListener)
{
    class Thrower : public bdmv::NavigatorListenerAdapter
    {
        void Paused() override { throw std::runtime_error("paused"); }
    };
    TestDesk desk(ListOf({Item(10)}));
    Thrower thrower;
    desk.desk.Listeners().AddListener(&thrower);

    EXPECT_THROW(PlayScript(desk, "play\npause\n"), std::runtime_error);

    desk.desk.Listeners().RemoveListener(&thrower);
}

/** The callbacks of playing a play list from start to end. */
std::string CallbacksFromStartToEnd(TestDesk& desk)
{
    PlayFromStartToEnd(desk.desk, desk.Hooks());
    return desk.TakeWithoutPositions();
}

TEST(FromStartToEnd, PlaysAndFinishes)
{
    TestDesk desk(ListOf({Item(10)}));

    EXPECT_EQ(CallbacksFromStartToEnd(desk),
              std::string(StartOfItem) + "10 Finished(EndOfMedia)\n");
}

TEST(FromStartToEnd, LeavesEndlessStillsAfterThreeSecondsAndTimedOnesAfterTheirTime)
{
    TestDesk desk(ListOf({WithEndlessStill(Item(1)), WithTimedStill(Item(1), 10),
                          Forbidding(WithEndlessStill(Item(1)), {bd::UserOperationStillOff})}));

    EXPECT_EQ(CallbacksFromStartToEnd(desk),
              std::string(StartOfItem) +
                  "1 StillOn()\n"
                  "4 StillOff()\n"
                  "4 PlayItem(7, 1, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
                  "5 StillOn()\n"
                  "15 StillOff()\n"
                  "15 PlayItem(7, 2, VideoFormatType1080p, VideoAspectRatioTypeNoInfo)\n"
                  "15 UOMask(1024)\n"
                  "16 StillOn()\n"
                  "19 StillOff()\n"
                  "19 Finished(EndOfMedia)\n");
}

TEST(FromStartToEnd, FinishesWhenThereIsNothingToPlay)
{
    TestDesk desk(ListOf({}));

    EXPECT_EQ(CallbacksFromStartToEnd(desk), "0 PlayStarted()\n"
                                             "0 Playlist(7)\n"
                                             "0 Finished(EndOfMedia)\n");
}

TEST(FromStartToEnd, FinishesWhenNothingHasLength)
{
    TestDesk desk(ListOf({Item(0), WithTimedStill(Item(0), 0), Item(0)}, {Entry(1, Ticks(0))}));

    const std::string received = CallbacksFromStartToEnd(desk);

    const std::string end = "0 Finished(EndOfMedia)\n";
    EXPECT_EQ(received.substr(received.size() - end.size()), end) << received;
}

TEST(FromStartToEnd, CallsTheHookBeforeTimePasses)
{
    TestDesk desk(ListOf({WithEndlessStill(Item(2))}));
    Ticks waited(0);
    SessionHooks hooks = desk.Hooks();
    hooks.beforeTimePasses = [&waited, &desk, count = hooks.beforeTimePasses](Ticks time) {
        count(time);
        EXPECT_EQ(desk.clock.Now(), waited);
        waited += time;
    };

    PlayFromStartToEnd(desk.desk, hooks);

    EXPECT_EQ(waited, 5 * Second);
    EXPECT_EQ(desk.clock.Now(), waited);
}

TEST(FromStartToEnd, ReportsEverySecondOfTwoHours)
{
    TestDesk desk(ListOf({Item(7200)}));

    PlayFromStartToEnd(desk.desk, desk.Hooks());

    const std::string received = desk.Take();
    const std::string others = std::string(StartOfItem) + "7200 Finished(EndOfMedia)\n";
    EXPECT_EQ(std::count(received.begin(), received.end(), '\n'),
              7201 + std::count(others.begin(), others.end(), '\n'));
    EXPECT_NE(received.find("\n3601 CurrentTimePosition(162045000)\n"), std::string::npos);
}

TEST(SessionExpectations, AreCheckedAtTheirTimeWithoutEndingTheirCommand)
{
    TestDesk desk(ListOf({Item(10)}));
    std::string calls;
    SessionHooks hooks = desk.Hooks();
    hooks.beforeCommand = [&] { calls += "command\n"; };
    hooks.onExpectation = [&](const ScriptStep& step) {
        calls += std::to_string(desk.clock.Now() / Second) + " line " + std::to_string(step.line);
        for (const std::string& word : step.words) {
            calls += " " + word;
        }
        calls += "\n";
    };

    PlaySession(ParseScript("play\n"
                            "expect nothing\n"
                            "after 2s expect PlayStarted\n"
                            "pause\n"
                            "after 1s expect Paused a=1 b=2\n",
                            "a.session", CommandSyntaxes()),
                desk.desk, hooks);

    EXPECT_EQ(calls, "command\n"
                     "0 line 2\n"
                     "2 line 3 PlayStarted\n"
                     "command\n"
                     "3 line 5 Paused a=1 b=2\n");
}

TEST(SessionExpectations, AreIgnoredWithoutAHook)
{
    TestDesk desk(ListOf({Item(10)}));

    PlaySession(ParseScript("expect Stopped\nplay\n", "a.session", CommandSyntaxes()), desk.desk,
                desk.Hooks());

    EXPECT_EQ(desk.navigator.CurrentStatus(), Status::Finished);
}

} // namespace

} // namespace deskplayer
