#include <exception>
#include <sstream>
#include <system_error>
#include <vector>

#include "eventtest.h"

// Tests that apply to every scenario of every event. Each family of events instantiates them.

namespace
{

bool IsCallback(const std::string& entry)
{
    return entry.compare(0, 2, "A.") == 0 || entry.compare(0, 2, "B.") == 0 ||
           entry.compare(0, 2, "C.") == 0;
}

std::vector<std::string> EntriesOf(const std::string& journal)
{
    std::vector<std::string> entries;
    std::istringstream stream(journal);
    for (std::string entry; std::getline(stream, entry);) {
        entries.push_back(entry + "\n");
    }
    return entries;
}

std::string WithoutCallbacks(const std::string& journal)
{
    std::string kept;
    for (const std::string& entry : EntriesOf(journal)) {
        kept += IsCallback(entry) ? "" : entry;
    }
    return kept;
}

std::string WithTheLogOff(const std::string& journal)
{
    std::string kept;
    for (const std::string& entry : EntriesOf(journal)) {
        if (entry.compare(0, 4, "log?") == 0) {
            kept += entry.substr(0, entry.find(" -> ")) + " -> off\n";
        } else if (entry.compare(0, 4, "log ") != 0) {
            kept += entry;
        }
    }
    return kept;
}

/** For every callback in the journal, in order, the journal up to and including it. */
std::vector<std::string> UpToEachCallback(const std::string& journal)
{
    std::vector<std::string> prefixes;
    std::string prefix;
    for (const std::string& entry : EntriesOf(journal)) {
        prefix += entry;
        if (IsCallback(entry)) {
            prefixes.push_back(prefix);
        }
    }
    return prefixes;
}

/** An operation that a callback must not perform on the list that is calling it. */
struct Reentry {
    const char* name;
    void (*reenter)(Listeners& listeners, bdmv::INavigatorListener& listener);
};

const Reentry reentries[] = {
    {"add", [](Listeners& listeners,
               bdmv::INavigatorListener& listener) { listeners.AddListener(&listener); }},
    {"remove", [](Listeners& listeners,
                  bdmv::INavigatorListener& listener) { listeners.RemoveListener(&listener); }},
    {"look up", [](Listeners& listeners,
                   bdmv::INavigatorListener& listener) { listeners.ListenerExists(&listener); }},
    {"fire",
     [](Listeners& listeners, bdmv::INavigatorListener&) {
         bd::EventListenerList_FireParam0(listeners, &bdmv::INavigatorListener::Paused);
     }},
};

} // namespace

TEST_P(EventScenario, HappensInTheStatedOrder)
{
    DispatchScenario(listeners);

    EXPECT_EQ(journal.Take(), GetParam().journal);
}

TEST_P(EventScenario, DiffersOnlyInTheCallbacksWithoutListeners)
{
    Listeners empty;

    DispatchScenario(empty);

    EXPECT_EQ(journal.Take(), WithoutCallbacks(GetParam().journal));
}

TEST_P(EventScenario, DiffersOnlyInTheLinesWhenTheLogIsOff)
{
    platform.DisableLog();

    DispatchScenario(listeners);

    EXPECT_EQ(journal.Take(), WithTheLogOff(GetParam().journal));
}

TEST_P(EventScenario, DoesNothingWhenCreatedAndDeleted)
{
    GetParam().arrange(context);
    platform.RecordAtomicAdds();

    delete GetParam().make(context);

    EXPECT_EQ(journal.Take(), "");
}

TEST_P(EventScenario, QueriesLogsAndAssertsWhileTheListIsFree)
{
    const auto useTheList = [this] { EXPECT_TRUE(listeners.ListenerExists(&a)); };
    context.onQuery = [useTheList](const std::string&) { useTheList(); };
    platform.onAssert = useTheList;
    WhenTheLogSwitchIsAsked(1, useTheList);

    DispatchScenario(listeners);

    EXPECT_EQ(journal.Take(), GetParam().journal);
}

TEST_P(EventScenario, EndsAtTheCallbackThatThrows)
{
    const std::vector<std::string> prefixes = UpToEachCallback(GetParam().journal);
    for (std::size_t i = 0; i < prefixes.size(); ++i) {
        const std::exception_ptr failure = std::make_exception_ptr(i);
        OnCallback(i, [failure] { std::rethrow_exception(failure); });
        std::exception_ptr caught;
        try {
            DispatchScenario(listeners);
        } catch (...) {
            caught = std::current_exception();
        }
        EXPECT_EQ(caught, failure);
        EXPECT_EQ(journal.Take(), prefixes[i]);
    }

    ExpectTheListToBeSound();
}

TEST_P(EventScenario, EndsAtTheCallbackThatReentersTheList)
{
    bdmvtest::RecordingListener late(journal, "late");
    const std::vector<std::string> prefixes = UpToEachCallback(GetParam().journal);
    for (std::size_t i = 0; i < prefixes.size(); ++i) {
        for (const Reentry& reentry : reentries) {
            SCOPED_TRACE(reentry.name);
            OnCallback(i, [&] { reentry.reenter(listeners, late); });
            std::error_code refusal;
            try {
                DispatchScenario(listeners);
            } catch (const std::system_error& error) {
                refusal = error.code();
            }
            EXPECT_EQ(refusal, std::errc::resource_deadlock_would_occur);
            EXPECT_EQ(journal.Take(), prefixes[i]);
        }
    }

    ExpectTheListToBeSound();
}

TEST_P(EventScenario, ContinuesWhenTheCallbackHandlesTheRefusal)
{
    const std::size_t callbacks = UpToEachCallback(GetParam().journal).size();
    for (std::size_t i = 0; i < callbacks; ++i) {
        for (const Reentry& reentry : reentries) {
            SCOPED_TRACE(reentry.name);
            OnCallback(i, [&] { EXPECT_THROW(reentry.reenter(listeners, a), std::system_error); });

            DispatchScenario(listeners);

            EXPECT_EQ(journal.Take(), GetParam().journal);
        }
    }
}
