#include "clientkit/scopedlistener.h"

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <type_traits>
#include <utility>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "testkit/fakeplatform.h"

namespace
{

using bdmv::INavigatorListener;
typedef bdmv::ScopedListener<INavigatorListener> Registration;

class ScopedListener : public testing::Test
{
protected:
    /** Runs @p action inside a callback of the list. */
    void InsideACallback(const std::function<void()>& action)
    {
        struct Caller : bdmv::NavigatorListenerAdapter {
            std::function<void()> action;
            void Paused() override { action(); }
        } actor;
        actor.action = action;
        list.AddListener(&actor);
        bd::EventListenerList_FireParam0(list, &INavigatorListener::Paused);
        list.RemoveListener(&actor);
    }

    static void ExpectDeadlock(const std::function<void()>& action)
    {
        try {
            action();
            ADD_FAILURE() << "nothing was thrown";
        } catch (const std::system_error& error) {
            EXPECT_EQ(error.code(), std::errc::resource_deadlock_would_occur);
        }
    }

    bool Contains(INavigatorListener& client) { return list.ListenerExists(&client); }

    bdmvtest::Journal journal;
    bdmvtest::FakePlatform platform{&journal};
    bd::EventListenerList<INavigatorListener> list;
    bdmv::NavigatorListenerAdapter listener;
    bdmv::NavigatorListenerAdapter other;
};

static_assert(!std::is_copy_constructible<Registration>::value, "one registration, one owner");
static_assert(!std::is_copy_assignable<Registration>::value, "one registration, one owner");
static_assert(std::is_nothrow_move_constructible<Registration>::value, "fits in containers");
static_assert(std::is_nothrow_move_assignable<Registration>::value, "fits in containers");

TEST_F(ScopedListener, AddsTheListenerForItsLifetime)
{
    {
        const Registration registration(list, listener);
        EXPECT_TRUE(registration.IsRegistered());
        EXPECT_TRUE(Contains(listener));
    }
    EXPECT_FALSE(Contains(listener));
}

TEST_F(ScopedListener, IsEmptyByDefault)
{
    Registration registration;
    EXPECT_FALSE(registration.IsRegistered());
    registration.Remove();
    EXPECT_FALSE(registration.IsRegistered());
}

TEST_F(ScopedListener, LeavesAListenerThatWasInTheListBefore)
{
    list.AddListener(&listener);
    {
        const Registration registration(list, listener);
        EXPECT_FALSE(registration.IsRegistered());
    }
    EXPECT_TRUE(Contains(listener));
}

TEST_F(ScopedListener, RemovesOnRequest)
{
    Registration registration(list, listener);
    registration.Remove();

    EXPECT_FALSE(registration.IsRegistered());
    EXPECT_FALSE(Contains(listener));
}

TEST_F(ScopedListener, RemovesOnlyOnce)
{
    Registration registration(list, listener);
    registration.Remove();
    list.AddListener(&listener);
    registration.Remove();

    EXPECT_TRUE(Contains(listener));
}

TEST_F(ScopedListener, MovesTheRegistration)
{
    Registration from(list, listener);
    {
        const Registration to(std::move(from));
        EXPECT_TRUE(to.IsRegistered());
        EXPECT_FALSE(from.IsRegistered()); // NOLINT(bugprone-use-after-move): defined
        EXPECT_TRUE(Contains(listener));
    }
    EXPECT_FALSE(Contains(listener));
}

TEST_F(ScopedListener, RemovesItsOwnListenerWhenItIsAssigned)
{
    Registration from(list, listener);
    Registration to(list, other);
    to = std::move(from);

    EXPECT_FALSE(Contains(other));
    EXPECT_TRUE(Contains(listener));
    EXPECT_TRUE(to.IsRegistered());
    EXPECT_FALSE(from.IsRegistered()); // NOLINT(bugprone-use-after-move): defined
    to.Remove();
    EXPECT_FALSE(Contains(listener));
}

TEST_F(ScopedListener, IsUnchangedWhenMovedToItself)
{
    Registration registration(list, listener);
    Registration& same = registration;
    registration = std::move(same);

    EXPECT_TRUE(registration.IsRegistered());
    EXPECT_TRUE(Contains(listener));
}

TEST_F(ScopedListener, ThrowsWhenItRemovesInsideACallback)
{
    Registration registration(list, listener);
    InsideACallback([&] { ExpectDeadlock([&] { registration.Remove(); }); });

    EXPECT_TRUE(registration.IsRegistered());
    EXPECT_TRUE(Contains(listener));
}

TEST_F(ScopedListener, ThrowsWhenItIsMadeInsideACallback)
{
    InsideACallback([&] { ExpectDeadlock([&] { const Registration late(list, listener); }); });

    EXPECT_FALSE(Contains(listener));
}

TEST_F(ScopedListener, ReportsThatItIsDestroyedInsideACallback)
{
    auto registration = std::make_unique<Registration>(list, listener);
    InsideACallback([&] { registration.reset(); });

    EXPECT_EQ(journal.Take().find(
                  "assert: bdmv::ScopedListener: not destroyed inside a callback of its list, "),
              0U);
    EXPECT_TRUE(Contains(listener));
}

TEST_F(ScopedListener, ReportsThatItIsReplacedInsideACallback)
{
    Registration from(list, listener);
    Registration to(list, other);
    InsideACallback([&] { to = std::move(from); });

    EXPECT_EQ(journal.Take().find("assert: "), 0U);
    EXPECT_TRUE(Contains(other));
    EXPECT_TRUE(to.IsRegistered());
    to.Remove();
    EXPECT_FALSE(Contains(listener));
}

} // namespace
