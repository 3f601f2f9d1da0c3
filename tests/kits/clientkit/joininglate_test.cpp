#include <gtest/gtest.h>

#include <atomic>
#include <thread>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "joiningclient.h"
#include "randomcallbacks.h"

namespace
{

namespace callbacks = bdmv::callbacks;

TEST(JoiningLate, EqualsJoiningAtTheStartForEveryPrefixOfRandomCallbacks)
{
    for (unsigned seed = 0; seed < 1000; ++seed) {
        SCOPED_TRACE(seed);
        bdmv::ListenerRelay relay;
        bdmvtest::ClientsOfEveryPrefix clients(relay);
        for (const bdmv::Callback& callback :
             bdmvtest::RandomCallbacks(seed).Sequence(seed % 40 + 1)) {
            Deliver(callback, relay);
            clients.JoinLate();
        }
        clients.ExpectTheSame();
        if (HasFatalFailure()) {
            return;
        }
    }
}

/**
 * Any callback and a position, in turn. No other callback changes the position, so that it tells
 * how many callbacks came before.
 */
std::vector<bdmv::Callback> CallbacksWithPositions(std::size_t count)
{
    bdmvtest::RandomCallbacks random(1);
    std::vector<bdmv::Callback> sequence;
    while (sequence.size() < count) {
        const bdmv::Callback callback = random.Next();
        if (callback.Id() != bdmv::CallbackStepped &&
            callback.Id() != bdmv::CallbackCurrentTimePosition) {
            sequence.push_back(callback);
            sequence.push_back(callbacks::CurrentTimePosition{sequence.size()});
        }
    }
    return sequence;
}

/** A client that joins on one thread and receives callbacks on another. */
class ConcurrentClient : public bdmvtest::JoiningClient
{
public:
    /** Callbacks that Join() reported on the thread that made the client. */
    std::size_t reported = 0;
    bdmv::PlaybackStatus statusAfterJoin;

protected:
    void OnCallback(const bdmv::Callback& callback) override
    {
        JoiningClient::OnCallback(callback);
        if (std::this_thread::get_id() == m_Thread) {
            ++reported;
            statusAfterJoin = status;
        }
    }

private:
    const std::thread::id m_Thread = std::this_thread::get_id();
};

/** A sequence of callbacks, and the statuses before and after each. */
struct Reference {
    std::vector<bdmv::Callback> sequence = CallbacksWithPositions(20000);
    std::vector<bdmv::PlaybackStatus> statuses{bdmv::PlaybackStatus()};

    Reference()
    {
        for (const bdmv::Callback& callback : sequence) {
            statuses.push_back(statuses.back());
            Apply(callback, statuses.back());
        }
    }

    /** Whether the client received what comes after one prefix, from there without a gap. */
    bool Continues(const ConcurrentClient& client) const
    {
        const bdmv::Reported<bd::TimePosition>& position = client.statusAfterJoin.position;
        const std::size_t prefix = position.known ? position.value + 1 : 0;
        return ContinuesFrom(prefix, client) || ContinuesFrom(prefix + 1, client);
    }

private:
    bool ContinuesFrom(std::size_t prefix, const ConcurrentClient& client) const
    {
        const std::size_t count = client.received.size() - client.reported;
        return prefix + count < statuses.size() && statuses[prefix] == client.statusAfterJoin &&
               statuses[prefix + count] == client.status &&
               std::equal(client.received.end() - static_cast<std::ptrdiff_t>(count),
                          client.received.end(),
                          sequence.begin() + static_cast<std::ptrdiff_t>(prefix));
    }
};

TEST(JoiningLate, MissesNothingAndRepeatsNothingWhileCallbacksAreDelivered)
{
    const Reference reference;
    bdmv::ListenerRelay relay;
    bdmvtest::JoiningClient first;
    relay.Join(first);
    std::atomic<int> joining{0};
    std::atomic<bool> delivering{true};
    std::atomic<int> received{0}; // clients that received a callback between joining and leaving
    std::atomic<int> gaps{0};
    const auto joinAndLeave = [&] {
        ++joining;
        for (int round = 0; round < 100 && delivering;) {
            ConcurrentClient client;
            relay.Join(client);
            std::this_thread::yield();
            relay.Leave(client);
            gaps += reference.Continues(client) ? 0 : 1;
            if (client.received.size() > client.reported) {
                ++received;
                ++round;
            }
        }
        --joining;
    };

    std::thread joiners[2]{std::thread(joinAndLeave), std::thread(joinAndLeave)};
    while (joining < 2) {
        std::this_thread::yield();
    }
    std::size_t delivered = 0;
    while (joining > 0 && delivered < reference.sequence.size()) {
        Deliver(reference.sequence[delivered++], relay);
        std::this_thread::yield();
    }
    delivering = false;
    for (std::thread& joiner : joiners) {
        joiner.join();
    }

    EXPECT_EQ(gaps, 0);
    EXPECT_GT(received, 0);
    EXPECT_EQ(first.received.size(), delivered);
    EXPECT_EQ(relay.Status(), reference.statuses[delivered]);
}

/** Makes another thread deliver a callback while it is brought up to date itself. */
class SlowClient : public bdmv::NavigatorListenerAdapter
{
public:
    explicit SlowClient(bdmv::ListenerRelay& relay) : m_rRelay(relay) {}

    void PlayStarted() override
    {
        std::atomic<bool> delivering{false};
        deliverer = std::thread([this, &delivering] {
            delivering = true;
            m_rRelay.Paused();
        });
        while (!delivering) {
            std::this_thread::yield();
        }
        // Gives the callback time to get as far as it can.
        for (int i = 0; i < 100 && m_rRelay.Status().state.value == bdmv::PlaybackPlaying; ++i) {
            std::this_thread::yield();
        }
    }

    std::thread deliverer;

private:
    bdmv::ListenerRelay& m_rRelay;
};

TEST(JoiningLate, DoesNotRepeatACallbackThatHasWaitedForAnotherClientToJoin)
{
    for (int round = 0; round < 50; ++round) {
        bdmv::ListenerRelay relay;
        relay.PlayStarted();
        SlowClient slow(relay);
        bdmvtest::CallbackKeeper late;
        relay.Join(slow);
        relay.Join(late);
        slow.deliverer.join();

        EXPECT_EQ(std::count(late.callbacks.begin(), late.callbacks.end(),
                             bdmv::Callback(callbacks::Paused{})),
                  1);
    }
}

TEST(JoiningLate, ReadsTheStatusWhileCallbacksAreDelivered)
{
    const Reference reference;
    bdmv::StatusListener listener;
    std::atomic<bool> reading{true};
    std::thread reader([&] {
        for (int round = 0; round < 100; ++round) {
            const bdmv::PlaybackStatus status = listener.Status();
            const std::size_t prefix = status.position.known ? status.position.value + 1 : 0;
            EXPECT_TRUE(status == reference.statuses[prefix] ||
                        status == reference.statuses[prefix + 1]);
            std::this_thread::yield();
        }
        reading = false;
    });
    for (std::size_t next = 0; reading && next < reference.sequence.size(); ++next) {
        Deliver(reference.sequence[next], listener);
        std::this_thread::yield();
    }
    reader.join();
}

} // namespace
