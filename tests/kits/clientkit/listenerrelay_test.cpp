#include "clientkit/listenerrelay.h"

#include <gtest/gtest.h>

#include <functional>
#include <stdexcept>
#include <system_error>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "randomcallbacks.h"

namespace
{

namespace callbacks = bdmv::callbacks;
using bdmv::ListenerRelay;
typedef std::vector<bdmv::Callback> Callbacks;

/** Acts when playback is paused, and when it starts. */
class Actor : public bdmv::NavigatorListenerAdapter
{
public:
    explicit Actor(std::function<void()> action) : m_Action(std::move(action)) {}

    void Paused() override { m_Action(); }
    void PlayStarted() override { m_Action(); }

private:
    std::function<void()> m_Action;
};

void ExpectDeadlock(const std::function<void()>& action)
{
    try {
        action();
        ADD_FAILURE() << "nothing was thrown";
    } catch (const std::system_error& error) {
        EXPECT_EQ(error.code(), std::errc::resource_deadlock_would_occur);
    }
}

void Fail()
{
    throw std::runtime_error("from a client");
}

TEST(ListenerRelay, PassesOnEveryCallback)
{
    ListenerRelay relay;
    bdmvtest::CallbackKeeper client;
    relay.Join(client);
    bdmvtest::RandomCallbacks random(1);
    Callbacks expected;
    for (int id = 0; id < bdmv::Callback__sizeof; ++id) {
        expected.push_back(random.Make(static_cast<bdmv::CallbackId>(id)));
        Deliver(expected.back(), relay);
    }

    EXPECT_EQ(client.callbacks, expected);
}

TEST(ListenerRelay, CallsTheClientsInTheOrderInWhichTheyJoined)
{
    ListenerRelay relay;
    std::string order;
    Actor first([&] { order += "first "; });
    Actor second([&] { order += "second "; });
    relay.Join(first);
    relay.Join(second);
    relay.Paused();

    EXPECT_EQ(order, "first second ");
}

TEST(ListenerRelay, ReportsTheStatusToAClientThatJoins)
{
    ListenerRelay relay;
    relay.PlayStarted();
    relay.ChapterNumber(3);
    relay.JumpOccurred();
    bdmvtest::CallbackKeeper client;

    EXPECT_TRUE(relay.Join(client));
    EXPECT_EQ(client.callbacks, (Callbacks{callbacks::PlayStarted{}, callbacks::ChapterNumber{3}}));
}

TEST(ListenerRelay, RefusesAClientThatHasJoined)
{
    ListenerRelay relay;
    relay.PlayStarted();
    bdmvtest::CallbackKeeper client;
    relay.Join(client);
    client.callbacks.clear();

    EXPECT_FALSE(relay.Join(client));
    EXPECT_TRUE(client.callbacks.empty());
    relay.Paused();
    EXPECT_EQ(client.callbacks, Callbacks{callbacks::Paused{}});
}

TEST(ListenerRelay, CallsNoClientThatHasLeft)
{
    ListenerRelay relay;
    bdmvtest::CallbackKeeper leaving;
    bdmvtest::CallbackKeeper staying;
    relay.Join(leaving);
    relay.Join(staying);

    EXPECT_TRUE(relay.Leave(leaving));
    relay.Paused();
    EXPECT_TRUE(leaving.callbacks.empty());
    EXPECT_EQ(staying.callbacks.size(), 1U);
    EXPECT_FALSE(relay.Leave(leaving));
}

TEST(ListenerRelay, BringsAClientThatJoinsAgainUpToDate)
{
    ListenerRelay relay;
    bdmvtest::CallbackKeeper client;
    relay.Join(client);
    relay.Leave(client);
    relay.Paused();

    EXPECT_TRUE(relay.Join(client));
    EXPECT_EQ(client.callbacks, Callbacks{callbacks::Paused{}});
}

TEST(ListenerRelay, ThrowsOnJoinAndLeaveInsideACallback)
{
    ListenerRelay relay;
    bdmvtest::CallbackKeeper other;
    int calls = 0;
    Actor client([&] {
        ++calls;
        ExpectDeadlock([&] { relay.Join(other); });
        ExpectDeadlock([&] { relay.Leave(client); });
    });
    relay.Join(client);
    relay.Paused();

    EXPECT_EQ(calls, 1);
    EXPECT_FALSE(relay.Leave(other));
    EXPECT_TRUE(relay.Leave(client));
}

TEST(ListenerRelay, ThrowsOnJoinAndLeaveWhileAClientIsBroughtUpToDate)
{
    ListenerRelay relay;
    relay.Paused();
    bdmvtest::CallbackKeeper other;
    int calls = 0;
    Actor client([&] {
        ++calls;
        ExpectDeadlock([&] { relay.Join(other); });
        ExpectDeadlock([&] { relay.Leave(client); });
    });

    EXPECT_TRUE(relay.Join(client));
    EXPECT_EQ(calls, 1);
    EXPECT_FALSE(relay.Leave(other));
}

TEST(ListenerRelay, AnswersInsideACallbackWithTheStatusIncludingIt)
{
    ListenerRelay relay;
    relay.PlayStarted();
    bdmv::PlaybackStatus status;
    Actor client([&] { status = relay.Status(); });
    relay.Join(client);
    EXPECT_EQ(status.state.value, bdmv::PlaybackPlaying);
    relay.Paused();
    EXPECT_EQ(status.state.value, bdmv::PlaybackPaused);
}

TEST(ListenerRelay, PassesOnWhatAClientThrows)
{
    ListenerRelay relay;
    Actor throwing(Fail);
    bdmvtest::CallbackKeeper after;
    relay.Join(throwing);
    relay.Join(after);

    EXPECT_THROW(relay.Paused(), std::runtime_error);
    EXPECT_TRUE(after.callbacks.empty());
    EXPECT_EQ(relay.Status().state.value, bdmv::PlaybackPaused);
    relay.Stopped();
    EXPECT_EQ(after.callbacks, Callbacks{callbacks::Stopped{}});
}

TEST(ListenerRelay, LeavesOutAClientThatThrowsWhileItJoins)
{
    ListenerRelay relay;
    relay.Paused();
    bool throws = true;
    Actor client([&] {
        if (throws) {
            Fail();
        }
    });

    EXPECT_THROW(relay.Join(client), std::runtime_error);
    EXPECT_FALSE(relay.Leave(client));
    throws = false;
    EXPECT_TRUE(relay.Join(client));
}

TEST(ListenerRelay, DropsClientsThatHaveNotLeft)
{
    bdmvtest::CallbackKeeper client;
    {
        ListenerRelay relay;
        relay.Join(client);
    }
    EXPECT_TRUE(client.callbacks.empty());
}

} // namespace
