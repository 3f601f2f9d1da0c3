/**
 * @file
 * Everything that a test of a client or of an event needs, in one object.
 *
 * @code
 * Display display;                       // the client under test, a bdmv::INavigatorListener
 * bdmvtest::Bench bench{&display};
 * bench.context.playListId = 800;
 * bench.Dispatch<bdmv::PlaylistEvent>();
 * EXPECT_EQ(display.Text(), "play list 800");
 *
 * bdmvtest::RecordingListener a{bench.journal, "A"};
 * bench.listeners.AddListener(&a);
 * EXPECT_EQ(bench.Dispatch<bdmv::PausedEvent>(),
 *           bdmvtest::Logged("Sending Paused") + "A.Paused()\n");
 * @endcode
 *
 * A bench contains a fake platform, so only one may exist at a time.
 */
#ifndef TESTKIT_BENCH_H
#define TESTKIT_BENCH_H

#include <functional>
#include <initializer_list>
#include <string>
#include <utility>

#include "bd/eventlistenerlist.h"
#include "bdmvnavigator/inavigatorevent.h"
#include "bdmvnavigator/inavigatorlistener.h"
#include "testkit/fakeplatform.h"
#include "testkit/journal.h"
#include "testkit/scriptableplaybackcontext.h"

namespace bdmvtest
{

/** The entry of a call to the context: Queried("GetPlayListId() -> 800"). */
inline std::string Queried(const std::string& query)
{
    return "context." + query + "\n";
}

/**
 * The entries of a line that is written, and of the check of the log switch before it.
 *
 * @param tag component, level and high-frequency flag; those of a line about an event by default
 */
inline std::string Logged(const std::string& line, const std::string& tag = "57 5 0")
{
    return "log? " + tag + " -> on\nlog " + tag + ": " + line + "\n";
}

/** The entry of a line that is not written because the log switch is off. */
inline std::string NotLogged(const std::string& tag = "57 5 0")
{
    return "log? " + tag + " -> off\n";
}

/**
 * A context, a list of listeners and a platform that write into one journal. The list delivers on
 * the thread that calls Dispatch(), so nothing has to be waited for.
 */
class Bench
{
public:
    Bench() = default;

    /** @param clients are added to the list, in this order; must outlive the bench */
    Bench(std::initializer_list<bdmv::INavigatorListener*> clients)
    {
        for (bdmv::INavigatorListener* const client : clients) {
            listeners.AddListener(client);
        }
    }

    /**
     * Creates an event, dispatches it to the listeners and destroys it.
     *
     * @param stored what the event's constructor takes besides the context
     * @return the journal since the last dispatch
     * @throw whatever a listener throws
     */
    template <typename Event, typename... Stored> std::string Dispatch(Stored&&... stored)
    {
        Event event(context, std::forward<Stored>(stored)...);
        static_cast<bdmv::INavigatorEvent&>(event).Dispatch(listeners);
        return journal.Take();
    }

    /** Runs an action whenever the log switch is called, which then returns @p answer. */
    void WhenTheLogSwitchIsAsked(KEVRO_Bool answer, std::function<void()> action)
    {
        platform.SetLogSwitch(
            [answer, action = std::move(action)](KEVRO_UInt32, KEVRO_Int32, KEVRO_Bool) {
                action();
                return answer;
            });
    }

    Journal journal;                            ///< entries of context, platform and listeners
    FakePlatform platform{&journal};            ///< the functions of the platform
    ScriptablePlaybackContext context{journal}; ///< what events query
    bd::EventListenerList<bdmv::INavigatorListener> listeners; ///< receive the events
};

} // namespace bdmvtest

#endif
