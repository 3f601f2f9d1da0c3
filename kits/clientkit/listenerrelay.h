/**
 * @file
 * Passes callbacks on to clients that may join at any time: a client that joins late first receives
 * what lasts of the callbacks before.
 *
 * @code
 * bdmv::ListenerRelay relay;
 * navigatorListeners.AddListener(&relay); // before playback starts
 * ...
 * relay.Join(userInterface);  // PlayStarted(), PlayItem(800, 2, ...), ChapterNumber(5), ...
 * ...                         // and from here on every callback
 * relay.Leave(userInterface); // no callback runs after this
 * @endcode
 *
 * Lifetime. The relay owns neither the list nor the clients. Remove it from the list before
 * destroying it. Clients that have not left are dropped.
 *
 * Re-entrancy. Clients are called with a lock of the relay held, as the list holds its own. Inside
 * a callback of the relay Join() and Leave() throw std::system_error with
 * std::errc::resource_deadlock_would_occur. Status() may be called there.
 *
 * Threads. Every operation may be called from any thread. The callbacks that bring a client up to
 * date run on the thread that calls Join(), with the lock held: until they have returned, the
 * thread that delivers waits with the next callback. They must return promptly as all callbacks
 * must, and must not wait for a thread that delivers: neither use the list in which the relay is
 * registered, nor take a lock that is held while events are delivered. Call Join() and Leave()
 * without such a lock, too.
 *
 * Exceptions. What a client throws leaves the relay's callback: the clients after it miss that
 * callback, but the status includes it. What a client throws while it is brought up to date leaves
 * Join(); the client has not joined.
 *
 * Memory. Join() may allocate. Passing on a callback allocates nothing.
 */
#ifndef CLIENTKIT_LISTENERRELAY_H
#define CLIENTKIT_LISTENERRELAY_H

#include <vector>

#include "bd/threadmutex.h"
#include "clientkit/callback.h"
#include "clientkit/playbackstatus.h"

namespace bdmv
{

/** A listener that passes callbacks on to its clients. */
class ListenerRelay : public CallbackListener
{
public:
    ListenerRelay() = default;

    ListenerRelay(const ListenerRelay&) = delete;
    ListenerRelay& operator=(const ListenerRelay&) = delete;

    /**
     * Reports the status to a client, see Deliver(), and appends it to the clients: it receives
     * every callback that the status does not include yet, and no other.
     *
     * @param client not owned; must live until it has left or the relay is destroyed
     * @return false, and no callback, if the client has joined already
     * @throw std::bad_alloc out of memory; the client has not joined and received nothing
     * @throw std::system_error the lock could not be taken, see bd::ThreadMutex::Acquire()
     * @throw whatever the client throws; it has not joined
     */
    bool Join(INavigatorListener& client);

    /**
     * Removes a client. Once this has returned, no callback of the client is running or will run.
     *
     * @return false for a client that has not joined
     * @throw std::system_error the lock could not be taken, see bd::ThreadMutex::Acquire()
     */
    bool Leave(INavigatorListener& client);

    /** The status including the callback that is being passed on. Any thread, without waiting for
     * a client. */
    PlaybackStatus Status() const;

private:
    typedef std::vector<INavigatorListener*> Clients;

    void OnCallback(const Callback& callback) override;
    void Include(const Callback& callback);
    Clients::iterator Find(INavigatorListener& client);

    bd::ThreadMutex m_StatusLock;  ///< guards m_Status; no client is called under it
    PlaybackStatus m_Status;       ///< changes with m_ClientsLock held as well
    bd::ThreadMutex m_ClientsLock; ///< guards m_Clients, held while clients are called
    Clients m_Clients;             ///< in the order in which they joined
};

} // namespace bdmv

#endif
