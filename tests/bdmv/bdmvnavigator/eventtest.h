/**
 * @file
 * Fixtures and journal entries that the tests of all events share.
 *
 * Every test states the whole journal of a dispatch. The three shapes that make up most of a
 * journal have a function each:
 *
 *     Queried("GetPlayListId() -> 800")     context.GetPlayListId() -> 800
 *
 *     Logged("Sending Paused")              log? 57 5 0 -> on
 *                                           log 57 5 0: Sending Paused
 *
 *     Fired("Paused()")                     A.Paused()
 *                                           B.Paused()
 *                                           C.Paused()
 */
#ifndef TESTS_BDMV_BDMVNAVIGATOR_EVENTTEST_H
#define TESTS_BDMV_BDMVNAVIGATOR_EVENTTEST_H

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <string>
#include <utility>

#include "bdmvnavigator/navigatorevent.h"
#include "testkit/fakeplatform.h"
#include "testkit/recordinglistener.h"
#include "testkit/scriptableplaybackcontext.h"

typedef bdmvtest::ScriptablePlaybackContext Context;
typedef bd::EventListenerList<bdmv::INavigatorListener> Listeners;

/** The entry of a call to the context. */
inline std::string Queried(const std::string& query)
{
    return "context." + query + "\n";
}

/** The entries of a line that is written, and of the check of the log switch before it. */
inline std::string Logged(const std::string& line, const std::string& tag = "57 5 0")
{
    return "log? " + tag + " -> on\nlog " + tag + ": " + line + "\n";
}

/** The entry of a line that is not written because the log switch is off. */
inline std::string NotLogged(const std::string& tag = "57 5 0")
{
    return "log? " + tag + " -> off\n";
}

/** The entries of a callback that A, B and C receive, in this order. */
inline std::string Fired(const std::string& callback)
{
    return "A." + callback + "\nB." + callback + "\nC." + callback + "\n";
}

/** A context, the listeners A, B and C in this order, and the journal of all calls. */
class EventTest : public testing::Test
{
protected:
    EventTest()
    {
        listeners.AddListener(&a);
        listeners.AddListener(&b);
        listeners.AddListener(&c);
    }

    /** Creates the event, dispatches it to A, B and C, and deletes it. Returns the whole journal.
     */
    template <typename Event> std::string Dispatch()
    {
        const std::unique_ptr<bdmv::INavigatorEvent> event(new Event(context));
        event->Dispatch(listeners);
        return journal.Take();
    }

    /** Runs an action of the test whenever the log switch is called. */
    void WhenTheLogSwitchIsAsked(KEVRO_Bool answer, std::function<void()> action)
    {
        platform.SetLogSwitch(
            [answer, action = std::move(action)](KEVRO_UInt32, KEVRO_Int32, KEVRO_Bool) {
                action();
                return answer;
            });
    }

    bdmvtest::Journal journal;
    bdmvtest::FakePlatform platform{&journal};
    Context context{journal};
    bdmvtest::RecordingListener a{journal, "A"};
    bdmvtest::RecordingListener b{journal, "B"};
    bdmvtest::RecordingListener c{journal, "C"};
    Listeners listeners;
};

/**
 * An event, the state of the context when it is dispatched, and the journal that must result.
 *
 * A family states its events as scenarios of EventScenario, which dispatches each with and
 * without listeners, with and without a log, and through every failure of a listener.
 */
struct Scenario {
    std::string name;
    std::function<bdmv::INavigatorEvent*(bdmv::IPlaybackContext&)> make;
    std::function<void(Context&)> arrange; ///< may run several times
    std::string journal;                   ///< with A, B and C in the list and the log on
};

/** Shows the name where the test program lists its tests. */
inline void PrintTo(const Scenario& scenario, std::ostream* stream)
{
    *stream << scenario.name;
}

/** Creates an event of a class, with the values that it stores at construction. */
template <typename Event, typename... Stored>
std::function<bdmv::INavigatorEvent*(bdmv::IPlaybackContext&)> New(Stored... stored)
{
    return [=](bdmv::IPlaybackContext& context) { return new Event(context, stored...); };
}

/** An event without queries: a line and a callback without arguments. */
template <typename Event>
Scenario Notification(const std::string& line, const std::string& callback)
{
    return {callback.substr(0, callback.find('(')), New<Event>(), [](Context&) {},
            Logged(line) + Fired(callback)};
}

/** Runs the scenario that is its parameter. */
class EventScenario : public EventTest, public testing::WithParamInterface<Scenario>
{
public:
    static std::string Name(const testing::TestParamInfo<Scenario>& info)
    {
        return info.param.name;
    }

protected:
    /** The event is created before the context has its values: it must read them later. */
    void DispatchScenario(Listeners& list)
    {
        const std::unique_ptr<bdmv::INavigatorEvent> event(GetParam().make(context));
        GetParam().arrange(context);
        event->Dispatch(list);
    }

    /** Makes one callback, counted over all listeners from 0, run an action. */
    void OnCallback(std::size_t number, const std::function<void()>& action)
    {
        m_Callbacks = 0;
        a.onCallback = b.onCallback = c.onCallback = [this, number, action](const std::string&) {
            if (m_Callbacks++ == number) {
                action();
            }
        };
    }

    /** The list still works: the same event reaches the same listeners again. */
    void ExpectTheListToBeSound()
    {
        a.onCallback = b.onCallback = c.onCallback = nullptr;
        DispatchScenario(listeners);
        EXPECT_EQ(journal.Take(), GetParam().journal);
    }

private:
    std::size_t m_Callbacks = 0;
};

#endif
