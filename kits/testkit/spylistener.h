/**
 * @file
 * A listener that keeps every callback as a value, and waits for callbacks of other threads.
 *
 * @code
 * bdmvtest::SpyListener spy;
 * player.AddListener(&spy);
 * player.Play();                       // another thread delivers
 *
 * ASSERT_TRUE(spy.WaitFor(bdmv::CallbackFinished, std::chrono::seconds(5)));
 * EXPECT_THAT(spy.Callbacks(), testing::ElementsAre(
 *     bdmvtest::Is(bdmv::callbacks::PlayStarted()),
 *     bdmvtest::Has(&bdmv::callbacks::Playlist::playListId, 800u),
 *     bdmvtest::IsA(bdmv::CallbackFinished)));  // the matchers of testkit/matchers.h
 * @endcode
 *
 * Remove the spy from its list before it is destroyed: WaitFor() may return while the delivering
 * thread is still inside the callback.
 */
#ifndef TESTKIT_SPYLISTENER_H
#define TESTKIT_SPYLISTENER_H

#include <algorithm>
#include <array>
#include <chrono>
#include <condition_variable>
#include <cstddef>
#include <deque>
#include <functional>
#include <mutex>
#include <utility>
#include <vector>

#include "clientkit/callback.h"
#include "testkit/describecallback.h"

namespace bdmvtest
{

/**
 * Keeps every callback, then may run an action of the test.
 *
 * All functions may be called from any thread at any time, also inside a callback; the action is
 * set before callbacks arrive. The spy allocates on the delivering thread.
 */
class SpyListener : public bdmv::CallbackListener
{
public:
    SpyListener() = default;

    SpyListener(const SpyListener&) = delete;
    SpyListener& operator=(const SpyListener&) = delete;

    /** Called with each callback after it has been kept; may throw. */
    std::function<void(const bdmv::Callback& callback)> onCallback;

    /**
     * The callbacks since construction, Clear() or Take(), oldest first. The spy copies the bytes
     * of bdmv::callbacks::SystemSuspended and owns them until it is destroyed.
     */
    std::vector<bdmv::Callback> Callbacks() const
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        return m_Callbacks;
    }

    /** The number of callbacks in Callbacks(). */
    std::size_t Count() const
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        return m_Callbacks.size();
    }

    /** The number of callbacks of one kind in Callbacks(); 0 for a value that is no callback. */
    std::size_t Count(bdmv::CallbackId id) const
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        return m_Tallies[PlaceOf(id)].received;
    }

    /**
     * Returns Callbacks() and forgets them. For WaitFor() they have not been received.
     */
    std::vector<bdmv::Callback> Take()
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        m_Tallies.fill(Tally());
        return std::exchange(m_Callbacks, {});
    }

    /** Forgets the callbacks, like Take(). */
    void Clear() { Take(); }

    /**
     * Waits for a callback of a kind.
     *
     * Each callback satisfies one call of WaitFor(). If one has been received that satisfied none
     * yet, the function returns at once: it is harmless when the callback precedes the call. A
     * second call with the same @p id therefore waits for a second callback. Kinds are independent:
     * the order of calls for different kinds says nothing about the order of their callbacks, which
     * Callbacks() shows. A call that times out leaves everything as it was. Clear() and Take()
     * forget what was received; calls that wait meanwhile continue to wait.
     *
     * When it returns true, the callback is in Callbacks(), unless they have been cleared since.
     * Other listeners of the same delivery may not have received it yet.
     *
     * Any thread, and several at once. On a thread that delivers to the spy itself, inside a
     * callback, only callbacks that were received before can satisfy it.
     *
     * @param id      a value that is no callback is never received
     * @param timeout at most a day; a longer one counts as a day
     * @return false if no callback of this kind was received in time
     */
    bool WaitFor(bdmv::CallbackId id, std::chrono::milliseconds timeout)
    {
        const std::chrono::milliseconds day = std::chrono::hours(24);
        std::unique_lock<std::mutex> lock(m_Mutex);
        Tally& tally = m_Tallies[PlaceOf(id)];
        const bool received = m_HasReceived.wait_for(
            lock, std::min(timeout, day), [&tally] { return tally.received > tally.awaited; });
        tally.awaited += received ? 1 : 0;
        return received;
    }

private:
    /** The callbacks of one kind since they were last cleared. */
    struct Tally {
        std::size_t received = 0;
        std::size_t awaited = 0; ///< those that satisfied a call of WaitFor()
    };

    /** The last place is for values that are no callback. */
    static std::size_t PlaceOf(bdmv::CallbackId id)
    {
        return std::min(static_cast<std::size_t>(id), std::size_t{bdmv::Callback__sizeof});
    }

    void OnCallback(const bdmv::Callback& callback) override
    {
        Keep(callback);
        if (onCallback) {
            onCallback(callback);
        }
    }

    void Keep(const bdmv::Callback& callback)
    {
        const std::lock_guard<std::mutex> lock(m_Mutex);
        m_Callbacks.push_back(WithOwnBytes(callback));
        ++m_Tallies[PlaceOf(callback.Id())].received;
        m_HasReceived.notify_all();
    }

    bdmv::Callback WithOwnBytes(const bdmv::Callback& callback)
    {
        const auto* const suspended = callback.As<bdmv::callbacks::SystemSuspended>();
        if (suspended == nullptr || suspended->data == nullptr) {
            return callback;
        }
        const auto* const begin = static_cast<const unsigned char*>(suspended->data);
        // Never empty, so that the address is not null.
        m_Blocks.emplace_back(begin, begin + suspended->size).push_back(0);
        return bdmv::callbacks::SystemSuspended{m_Blocks.back().data(), suspended->size};
    }

    mutable std::mutex m_Mutex;
    std::condition_variable m_HasReceived;
    std::vector<bdmv::Callback> m_Callbacks;
    std::array<Tally, bdmv::Callback__sizeof + 1> m_Tallies = {};
    std::deque<std::vector<unsigned char>> m_Blocks;
};

} // namespace bdmvtest

#endif
