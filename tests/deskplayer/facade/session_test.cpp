#include "deskplayer/session.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "deskplayer/output.h"
#include "sampledisc.h"

namespace deskplayer
{

namespace
{

using Lines = std::vector<std::string>;

using bdmvtest::SampleDisc;

/** Play list 2 of the sample disc, which lasts 20 s. */
class SessionOnADesk : public testing::Test
{
protected:
    Desk desk{SampleDisc, 2};
};

TEST_F(SessionOnADesk, ReportsNothingIfItGoesAsDemanded)
{
    const SessionReport report = PlaySession(desk, Session("play\nat 5 pause\nexpect Paused\n"));

    EXPECT_EQ(report.unmet, Lines());
    EXPECT_EQ(report.refused, Lines());
}

TEST_F(SessionOnADesk, PlaysASessionThatWasMovedFrom)
{
    Session session("play\nat 5 continue\n");
    Session constructed(std::move(session));
    constructed = std::move(session); // NOLINT(bugprone-use-after-move): it is copied

    // NOLINTNEXTLINE(bugprone-use-after-move): it was copied
    const SessionReport report = PlaySession(desk, session);

    EXPECT_EQ(report.refused,
              Lines({"session:2: refused at 00:00:05.000: not paused, but playing"}));
}

TEST_F(SessionOnADesk, ReportsExpectationsThatWereNotMet)
{
    const Session session("play\n"
                          "at 5 pause\n"
                          "expect Stopped\n"
                          "expect nothing\n",
                          "a.session");

    const SessionReport report = PlaySession(desk, session);

    EXPECT_EQ(report.unmet, Lines({"a.session:3: expected Stopped by 00:00:05.000; since the last "
                                   "command: Paused",
                                   "a.session:4: expected nothing by 00:00:05.000; since the last "
                                   "command: Paused"}));
    EXPECT_EQ(report.refused, Lines());
}

TEST_F(SessionOnADesk, ReportsRefusedCommands)
{
    const SessionReport report = PlaySession(desk, Session("play\nat 5 continue\n"));

    EXPECT_EQ(report.refused,
              Lines({"session:2: refused at 00:00:05.000: not paused, but playing"}));
    EXPECT_EQ(report.unmet, Lines());
}

TEST_F(SessionOnADesk, PassesEachLineOfTheReportOnAtItsTime)
{
    Lines messages;
    SessionOptions options;
    options.onMessage = [this, &messages](const std::string& message) {
        messages.push_back(message);
        EXPECT_EQ(desk.Now(), messages.size() * Ticks(std::chrono::seconds(5)));
    };

    const SessionReport report =
        PlaySession(desk, Session("play\nat 5 continue\nat 10 expect Paused\n"), options);

    ASSERT_EQ(messages.size(), 2U);
    EXPECT_EQ(report.refused, Lines({messages[0]}));
    EXPECT_EQ(report.unmet, Lines({messages[1]}));
}

TEST_F(SessionOnADesk, PlaysOnAfterItsLastStep)
{
    EXPECT_EQ(PlaySession(desk, Session("play\n")).refused, Lines());
    EXPECT_EQ(desk.Now(), std::chrono::seconds(20));
}

TEST_F(SessionOnADesk, CanStayAtItsLastStepForAnotherOneToContinue)
{
    SessionOptions options;
    options.playOn = false;

    EXPECT_EQ(PlaySession(desk, Session("play\nat 2 audio 1\n"), options).refused, Lines());
    EXPECT_EQ(desk.Now(), std::chrono::seconds(2));

    const Session second("at 3 pause\nexpect Paused\n");
    EXPECT_EQ(PlaySession(desk, second, options).unmet, Lines());
    EXPECT_EQ(desk.Now(), std::chrono::seconds(5)) << "times count from the start of a session";
}

TEST_F(SessionOnADesk, CallsTheTimeHandlerForAllTimeThatPasses)
{
    Ticks sum(0);
    SessionOptions options;
    options.beforeTimePasses = [this, &sum](Ticks time) {
        EXPECT_EQ(desk.Now(), sum);
        sum += time;
    };

    EXPECT_EQ(PlaySession(desk, Session("play\nat 5 pause\nafter 90s continue\n"), options).refused,
              Lines());

    EXPECT_EQ(sum, std::chrono::seconds(110));
    EXPECT_EQ(desk.Now(), sum);
}

TEST_F(SessionOnADesk, LeavesAnEndlessStillWithoutAViewer)
{
    Desk film(SampleDisc, 1);
    Ticks sum(0);

    PlayFromStartToEnd(film, [&sum](Ticks time) { sum += time; });

    EXPECT_EQ(sum, film.Now());
    EXPECT_EQ(film.Now(), std::chrono::seconds(174 + 5 + 3)) << "the film, a timed still, 3 s";
}

/** Throws at a pause. */
class Thrower : public bdmv::NavigatorListenerAdapter
{
public:
    void Paused() override { throw std::runtime_error("paused"); }
};

TEST_F(SessionOnADesk, PassesOnWhatAListenerThrows)
{
    Thrower thrower;
    desk.Listeners().AddListener(&thrower);

    EXPECT_THROW((void)PlaySession(desk, Session("play\npause\nexpect Paused\n")),
                 std::runtime_error);
}

TEST_F(SessionOnADesk, LeavesNoListenerInTheList)
{
    // On a stack of its own, so that a listener left there would be called after its destruction.
    std::thread([this] {
        EXPECT_EQ(PlaySession(desk, Session("expect nothing\n")).unmet, Lines());
    }).join();

    PlayFromStartToEnd(desk);

    EXPECT_EQ(desk.Now(), std::chrono::seconds(20));
}

TEST(Session, CanBePlayedOnSeveralDesks)
{
    const Session session("play\nat 5 pause\nexpect Paused\n");
    for (const std::uint32_t number : {1U, 2U}) {
        Desk desk(SampleDisc, number);
        EXPECT_EQ(PlaySession(desk, session).unmet, Lines());
        EXPECT_EQ(desk.Now(), std::chrono::seconds(5));
    }
}

std::string ErrorOf(Session (*read)())
{
    try {
        read();
    } catch (const SessionError& error) {
        return error.what();
    }
    return "no error";
}

TEST(Session, ThatIsMalformedThrowsAnErrorThatNamesPlaceAndExpectation)
{
    const std::string unexpected =
        ErrorOf([] { return Session("play\n  chapter nxt\n", "a.session"); });
    EXPECT_EQ(unexpected.rfind("a.session:2:11: unexpected 'nxt'; expected next, previous", 0), 0U)
        << unexpected;
    EXPECT_EQ(ErrorOf([] { return Session("expect playstarted\n"); }),
              "session:1:8: 'playstarted' is not a callback; did you mean PlayStarted?");
}

TEST(Session, IsReadFromAFile)
{
    Desk desk(SampleDisc);

    const SessionReport report =
        PlaySession(desk, ReadSessionFile(BDMVNAVIGATOR_SESSIONS "/evening.session"));

    EXPECT_EQ(report.unmet, Lines());
    EXPECT_EQ(report.refused, Lines({BDMVNAVIGATOR_SESSIONS
                                     "/evening.session:4: refused at "
                                     "00:00:02.000: SkipToNextPoint is forbidden by play item 0"}));
}

TEST(Session, ThatCannotBeReadThrowsAnErrorThatNamesTheFile)
{
    EXPECT_EQ(ErrorOf([] { return ReadSessionFile("no.session"); }),
              "no.session: cannot read session, expected a text file");
}

} // namespace

} // namespace deskplayer
