#include <vector>

#include "eventtest.h"
#include "testkit/describe.h"

namespace
{

using namespace bd;
using bdmvtest::Describe;

enum Asked { Nothing, States, StatesAndTrigger };

/** A trigger that is reached, the repeat states at that time, and the trigger reported. */
struct Reached {
    std::string name;
    TriggerType typeByTime;
    TriggerType abRepeat;
    TriggerType chpTitleRepeat;
    TriggerType set;
    Asked asked; ///< further queries, after GetTriggerTypeByTime()
    TriggerType reported;
};

const Reached reachedTriggers[] = {
    // Point B.
    {"BWithoutABWithChapter", TRIGGER_B, TRIGGER_AB_NONE, TRIGGER_CHP, TRIGGER_A, States,
     TRIGGER_NOTIFY_FROM_CURPOS},
    {"BWithoutABWithTitle", TRIGGER_B, TRIGGER_AB_NONE, TRIGGER_TITLE, TRIGGER_A, States,
     TRIGGER_NOTIFY_FROM_CURPOS},
    {"BWithoutABWithChapterStateABNone", TRIGGER_B, TRIGGER_AB_NONE, TRIGGER_AB_NONE, TRIGGER_A,
     States, TRIGGER_NOTIFY_FROM_CURPOS},
    {"BWithoutABWithChapterStateOfTheOtherFamily", TRIGGER_B, TRIGGER_AB_NONE, TriggerTypeNone,
     TRIGGER_A, States, TRIGGER_NOTIFY_FROM_CURPOS},
    {"BWithoutABWithoutChapter", TRIGGER_B, TRIGGER_AB_NONE, TRIGGER_NONE, TRIGGER_A, States,
     TRIGGER_B},
    {"BWithABWithChapter", TRIGGER_B, TRIGGER_A_AND_B, TRIGGER_CHP, TRIGGER_A, States, TRIGGER_B},
    {"BWithABStateNoneWithChapter", TRIGGER_B, TRIGGER_NONE, TRIGGER_CHP, TRIGGER_A, States,
     TRIGGER_B},
    {"BWithABWithoutChapter", TRIGGER_B, TRIGGER_B, TRIGGER_NONE, TRIGGER_A, States, TRIGGER_B},

    // A time without a trigger.
    {"InvalidInABWithChapter", TRIGGER_INVALID, TRIGGER_B, TRIGGER_CHP, TRIGGER_A, States,
     TRIGGER_B},
    {"InvalidInABWithoutChapter", TRIGGER_INVALID, TRIGGER_B, TRIGGER_NONE, TRIGGER_A, States,
     TRIGGER_B},
    {"InvalidWithTitle", TRIGGER_INVALID, TRIGGER_A, TRIGGER_TITLE, TRIGGER_CURPOS, States,
     TRIGGER_TITLE},
    {"InvalidWithoutABWithChapter", TRIGGER_INVALID, TRIGGER_AB_NONE, TRIGGER_CHP, TRIGGER_CURPOS,
     States, TRIGGER_CHP},
    {"InvalidInAAndBWithChapter", TRIGGER_INVALID, TRIGGER_A_AND_B, TRIGGER_CHP, TRIGGER_CURPOS,
     States, TRIGGER_CHP},
    {"InvalidWithChapterStateABNone", TRIGGER_INVALID, TRIGGER_AB_NONE, TRIGGER_AB_NONE,
     TRIGGER_CURPOS, States, TRIGGER_AB_NONE},
    {"InvalidWithChapterStateInvalid", TRIGGER_INVALID, TRIGGER_A, TRIGGER_INVALID, TRIGGER_CURPOS,
     States, TRIGGER_INVALID},
    {"InvalidWithChapterStateOfTheOtherFamily", TRIGGER_INVALID, TRIGGER_A, TriggerTypeNone,
     TRIGGER_CURPOS, States, TriggerTypeNone},
    {"InvalidWithATriggerSet", TRIGGER_INVALID, TRIGGER_A, TRIGGER_NONE, TRIGGER_CURPOS,
     StatesAndTrigger, TRIGGER_CURPOS},
    {"InvalidWithABStateNoneAndATriggerSet", TRIGGER_INVALID, TRIGGER_NONE, TRIGGER_NONE,
     TriggerTypeSpecificPoint, StatesAndTrigger, TriggerTypeSpecificPoint},
    {"InvalidWithAnInvalidTriggerSet", TRIGGER_INVALID, TRIGGER_AB_NONE, TRIGGER_NONE,
     TRIGGER_INVALID, StatesAndTrigger, TRIGGER_INVALID},
};

std::string QueriesFor(const Reached& reached)
{
    std::string queries;
    if (reached.asked != Nothing) {
        queries +=
            Queried("GetCurrentABRepeatState() -> " + Describe(reached.abRepeat)) +
            Queried("GetCurrentChpTitleRepeatState() -> " + Describe(reached.chpTitleRepeat));
    }
    if (reached.asked == StatesAndTrigger) {
        queries += Queried("GetTrigger() -> (" + Describe(reached.set) + ")");
    }
    return queries;
}

Scenario TriggerReached(const Reached& reached)
{
    return {reached.name, New<bdmv::TriggerReachedEvent>(),
            [reached](Context& context) {
                context.triggerReachedTime = 6000000000;
                context.triggerTypeByTime = reached.typeByTime;
                context.currentABRepeatState = reached.abRepeat;
                context.currentChpTitleRepeatState = reached.chpTitleRepeat;
                context.trigger.triggerType = reached.set;
            },
            Logged("Sending Trigger Reached") + Queried("GetTriggerReachedTime() -> 6000000000") +
                Queried("GetTriggerTypeByTime(6000000000) -> " + Describe(reached.typeByTime)) +
                QueriesFor(reached) +
                Logged("TriggerRead time type=" + std::to_string(reached.reported) +
                           ",time = 6000000000",
                       "57 3 0") +
                Fired("TriggerTimeReached(" + Describe(reached.reported) + ", 6000000000)")};
}

std::vector<Scenario> TriggerReachedScenarios()
{
    std::vector<Scenario> scenarios;
    for (const Reached& reached : reachedTriggers) {
        scenarios.push_back(TriggerReached(reached));
    }
    return scenarios;
}

/** All kinds that are reported unchanged, among them one outside the list. */
std::vector<Scenario> OtherTriggerReachedScenarios()
{
    std::vector<Scenario> scenarios;
    for (int type = TriggerTypeNone; type <= TRIGGER_NOTIFY_FROM_CURPOS + 1; ++type) {
        const TriggerType other = static_cast<TriggerType>(type);
        if (other != TRIGGER_B && other != TRIGGER_INVALID) {
            scenarios.push_back(
                TriggerReached({"Type" + std::to_string(type), other, TRIGGER_AB_NONE, TRIGGER_CHP,
                                TRIGGER_A, Nothing, other}));
        }
    }
    return scenarios;
}

INSTANTIATE_TEST_SUITE_P(TriggerReached, EventScenario,
                         testing::ValuesIn(TriggerReachedScenarios()), EventScenario::Name);
INSTANTIATE_TEST_SUITE_P(OtherTriggerReached, EventScenario,
                         testing::ValuesIn(OtherTriggerReachedScenarios()), EventScenario::Name);

class TriggerReachedEvents : public EventTest
{
protected:
    /** Switches the log on for one level, without high-frequency lines. */
    void EnableLevel(KEVRO_Int32 enabled)
    {
        platform.SetLogSwitch(
            [enabled](KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool hiFreq) {
                return KEVRO_Bool{component == 57 && level == enabled && hiFreq == 0};
            });
    }

    static std::string Queries()
    {
        return Queried("GetTriggerReachedTime() -> 0") +
               Queried("GetTriggerTypeByTime(0) -> TRIGGER_NONE");
    }
};

TEST_F(TriggerReachedEvents, WritesOnlyTheDiagnosticWhenOnlyWarningsAreOn)
{
    EnableLevel(KEVRO_Log_LevelWarning);

    EXPECT_EQ(Dispatch<bdmv::TriggerReachedEvent>(),
              NotLogged() + Queries() + Logged("TriggerRead time type=4,time = 0", "57 3 0") +
                  Fired("TriggerTimeReached(TRIGGER_NONE, 0)"));
}

TEST_F(TriggerReachedEvents, WritesOnlyTheNotificationWhenOnlyEventsAreOn)
{
    EnableLevel(KEVRO_Log_LevelEvent);

    EXPECT_EQ(Dispatch<bdmv::TriggerReachedEvent>(),
              Logged("Sending Trigger Reached") + Queries() + NotLogged("57 3 0") +
                  Fired("TriggerTimeReached(TRIGGER_NONE, 0)"));
}

const Scenario triggerSetScenarios[] = {
    {"TriggerSetFailed", New<bdmv::TriggerSetEvent>(TRIGGER_A, false),
     [](Context& context) { context.trigger.triggerType = TRIGGER_TITLE; },
     Logged("Sending Trigger Set") + Fired("TriggerSet(TRIGGER_A, false)")},
    {"TriggerSetDone", New<bdmv::TriggerSetEvent>(TRIGGER_NOTIFY_FROM_CURPOS, true),
     [](Context& context) { context.trigger.triggerType = TRIGGER_TITLE; },
     Logged("Sending Trigger Set") + Fired("TriggerSet(TRIGGER_NOTIFY_FROM_CURPOS, true)")},
};

INSTANTIATE_TEST_SUITE_P(TriggerSet, EventScenario, testing::ValuesIn(triggerSetScenarios),
                         EventScenario::Name);

const Scenario currentTimePositionScenarios[] = {
    {"CurrentTimePosition", New<bdmv::CurrentTimePositionEvent>(),
     [](Context& context) { context.currentTimePosition = 6000000000; },
     Queried("GetCurrentTimePosition() -> 6000000000") +
         Logged("Sending CurrentTimePosition - position: 6000000000", "57 5 1") +
         Fired("CurrentTimePosition(6000000000)")},
    {"CurrentTimePositionNone", New<bdmv::CurrentTimePositionEvent>(),
     [](Context& context) { context.currentTimePosition = 0xFFFFFFFFFFFFFFFFULL; },
     Queried("GetCurrentTimePosition() -> 18446744073709551615") +
         Logged("Sending CurrentTimePosition - position: 18446744073709551615", "57 5 1") +
         Fired("CurrentTimePosition(18446744073709551615)")},
};

INSTANTIATE_TEST_SUITE_P(CurrentTimePosition, EventScenario,
                         testing::ValuesIn(currentTimePositionScenarios), EventScenario::Name);

const ZOOM_PARAM_Def zoom = {{1, 2, 3, 4}, {5, 6, 7, 65535}, 4294967295};

const Scenario zoomModeSetScenarios[] = {
    {"ZoomModeSet", New<bdmv::ZoomModeSetEvent>(),
     [](Context& context) { context.zoomScaleInfo = zoom; },
     Logged("Sending ZoomModeSetEvent callback") +
         Queried("GetZoomScaleInfo(((0, 0, 0, 0), (0, 0, 0, 0), 0)) -> "
                 "((1, 2, 3, 4), (5, 6, 7, 65535), 4294967295)") +
         Fired("ZoomModeSet(((1, 2, 3, 4), (5, 6, 7, 65535), 4294967295))")},
    {"ZoomModeSetUntouched", New<bdmv::ZoomModeSetEvent>(),
     [](Context& context) { context.untouched = {"GetZoomScaleInfo"}; },
     Logged("Sending ZoomModeSetEvent callback") +
         Queried("GetZoomScaleInfo(((0, 0, 0, 0), (0, 0, 0, 0), 0)) -> untouched") +
         Fired("ZoomModeSet(((0, 0, 0, 0), (0, 0, 0, 0), 0))")},
};

INSTANTIATE_TEST_SUITE_P(ZoomModeSet, EventScenario, testing::ValuesIn(zoomModeSetScenarios),
                         EventScenario::Name);

std::function<void(Context&)> Plays(PlayDirectionDef direction, PlaySpeedDef speed,
                                    bool async2ndVid, bool async2ndAud, bool previous = false)
{
    return [=](Context& context) {
        context.playMode = PlayMode(PlayDirectionForward, PlaySpeedSlow3);
        context.currentPlayMode = PlayMode(direction, speed);
        context.async2ndVid = async2ndVid;
        context.async2ndAud = async2ndAud;
        context.prev2ndVid = previous;
        context.prev2ndAud = previous;
    };
}

const std::string playsPip =
    Logged("For normal play notify async pip available") + Fired("PictureInPictureAvailable()");
const std::string playsAudio =
    Logged("For normal play notify async 2ndaud available") + Fired("SecondaryAudioAvailable()");
const std::string stopsPip =
    Logged("For speed play notify async pip unavailable") + Fired("PictureInPictureUnavailable()");
const std::string stopsAudio =
    Logged("For speed play notify async 2ndaud unavailable") + Fired("SecondaryAudioUnavailable()");

const std::string normalPlay =
    Queried("GetCurrentPlayMode() -> (PlayDirectionForward, PlaySpeedNormal)") +
    Logged("Sending PlayMode - direction: 0, speedIndex: 5") +
    Fired("PlayMode(PlayDirectionForward, PlaySpeedNormal)");
const std::string fastPlay =
    Queried("GetCurrentPlayMode() -> (PlayDirectionForward, PlaySpeedFast1)") +
    Logged("Sending PlayMode - direction: 0, speedIndex: 6") +
    Fired("PlayMode(PlayDirectionForward, PlaySpeedFast1)");

std::string AsyncFlags(const std::string& flags)
{
    return Queried("IsAsyncPipInCurrentPlayItem(false, false, false, false) -> " + flags);
}

const Scenario playModeScenarios[] = {
    {"NormalPlay", New<bdmv::PlayModeEvent>(),
     Plays(PlayDirectionForward, PlaySpeedNormal, false, false),
     normalPlay + AsyncFlags("false, false, false, false")},
    {"NormalPlayWithAsyncVideo", New<bdmv::PlayModeEvent>(),
     Plays(PlayDirectionForward, PlaySpeedNormal, true, false),
     normalPlay + AsyncFlags("true, false, false, false") + playsPip},
    {"NormalPlayWithAsyncAudio", New<bdmv::PlayModeEvent>(),
     Plays(PlayDirectionForward, PlaySpeedNormal, false, true),
     normalPlay + AsyncFlags("false, true, false, false") + playsAudio},
    {"NormalPlayWithAsyncVideoAndAudio", New<bdmv::PlayModeEvent>(),
     Plays(PlayDirectionForward, PlaySpeedNormal, true, true),
     normalPlay + AsyncFlags("true, true, false, false") + playsPip + playsAudio},
    {"NormalPlayWithPreviousStreamsOnly", New<bdmv::PlayModeEvent>(),
     Plays(PlayDirectionForward, PlaySpeedNormal, false, false, true),
     normalPlay + AsyncFlags("false, false, true, true")},
    {"FastPlay", New<bdmv::PlayModeEvent>(),
     Plays(PlayDirectionForward, PlaySpeedFast1, false, false),
     fastPlay + AsyncFlags("false, false, false, false")},
    {"FastPlayWithAsyncVideo", New<bdmv::PlayModeEvent>(),
     Plays(PlayDirectionForward, PlaySpeedFast1, true, false),
     fastPlay + AsyncFlags("true, false, false, false") + stopsPip},
    {"FastPlayWithAsyncAudio", New<bdmv::PlayModeEvent>(),
     Plays(PlayDirectionForward, PlaySpeedFast1, false, true),
     fastPlay + AsyncFlags("false, true, false, false") + stopsAudio},
    {"FastPlayWithAsyncVideoAndAudio", New<bdmv::PlayModeEvent>(),
     Plays(PlayDirectionForward, PlaySpeedFast1, true, true),
     fastPlay + AsyncFlags("true, true, false, false") + stopsPip + stopsAudio},
    {"FastPlayWithPreviousStreamsOnly", New<bdmv::PlayModeEvent>(),
     Plays(PlayDirectionForward, PlaySpeedFast1, false, false, true),
     fastPlay + AsyncFlags("false, false, true, true")},
    {"NormalPlayBackward", New<bdmv::PlayModeEvent>(),
     Plays(PlayDirectionBackward, PlaySpeedNormal, true, true),
     Queried("GetCurrentPlayMode() -> (PlayDirectionBackward, PlaySpeedNormal)") +
         Logged("Sending PlayMode - direction: 1, speedIndex: 5") +
         Fired("PlayMode(PlayDirectionBackward, PlaySpeedNormal)") +
         AsyncFlags("true, true, false, false") + playsPip + playsAudio},
    {"AsyncFlagsUntouched", New<bdmv::PlayModeEvent>(),
     [](Context& context) {
         Plays(PlayDirectionForward, PlaySpeedNormal, true, true)(context);
         context.untouched = {"IsAsyncPipInCurrentPlayItem"};
     },
     normalPlay + AsyncFlags("untouched")},
};

INSTANTIATE_TEST_SUITE_P(PlayMode, EventScenario, testing::ValuesIn(playModeScenarios),
                         EventScenario::Name);

class PlayModeEvents : public EventTest
{
};

TEST_F(PlayModeEvents, WithdrawsAsyncStreamsAtEverySpeedButNormal)
{
    for (int speed = PlaySpeedSlow5; speed <= PlaySpeedFast12; ++speed) {
        for (const PlayDirectionDef direction : {PlayDirectionForward, PlayDirectionBackward}) {
            const PlayMode mode(direction, static_cast<PlaySpeedDef>(speed));
            Plays(mode.Direction(), mode.Speed(), true, true)(context);

            EXPECT_EQ(
                Dispatch<bdmv::PlayModeEvent>(),
                Queried("GetCurrentPlayMode() -> " + Describe(mode)) +
                    Logged("Sending PlayMode - direction: " + std::to_string(direction) +
                           ", speedIndex: " + std::to_string(speed)) +
                    Fired("PlayMode" + Describe(mode)) + AsyncFlags("true, true, false, false") +
                    (speed == PlaySpeedNormal ? playsPip + playsAudio : stopsPip + stopsAudio));
        }
    }
}

TEST_F(PlayModeEvents, DecidesByTheReportedSpeedAndTheLaterFlags)
{
    WhenTheLogSwitchIsAsked(
        1, [this] { context.currentPlayMode = PlayMode(PlayDirectionBackward, PlaySpeedFast1); });
    c.onCallback = [this](const std::string&) { context.async2ndVid = true; };

    EXPECT_EQ(Dispatch<bdmv::PlayModeEvent>(),
              normalPlay + AsyncFlags("true, false, false, false") + playsPip);
}

TEST_F(PlayModeEvents, QueriesTheFlagsOnce)
{
    Plays(PlayDirectionForward, PlaySpeedNormal, true, true)(context);
    b.onCallback = [this](const std::string& callback) {
        if (callback == "PictureInPictureAvailable()") {
            context.async2ndAud = false;
        }
    };

    EXPECT_EQ(Dispatch<bdmv::PlayModeEvent>(),
              normalPlay + AsyncFlags("true, true, false, false") + playsPip + playsAudio);
}

TEST_F(PlayModeEvents, AllowsListChangesBetweenItsCallbacks)
{
    Plays(PlayDirectionForward, PlaySpeedNormal, true, false)(context);
    context.onQuery = [this](const std::string& operation) {
        if (operation == "IsAsyncPipInCurrentPlayItem") {
            listeners.RemoveListener(&b);
        }
    };

    EXPECT_EQ(Dispatch<bdmv::PlayModeEvent>(),
              normalPlay + AsyncFlags("true, false, false, false") +
                  Logged("For normal play notify async pip available") +
                  "A.PictureInPictureAvailable()\nC.PictureInPictureAvailable()\n");
}

} // namespace
