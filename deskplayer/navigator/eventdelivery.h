/**
 * @file
 * The thread that delivers events to listeners.
 */
#ifndef DESKPLAYER_NAVIGATOR_EVENTDELIVERY_H
#define DESKPLAYER_NAVIGATOR_EVENTDELIVERY_H

#include <condition_variable>
#include <exception>
#include <mutex>
#include <thread>
#include <utility>

#include "bdmvnavigator/inavigatorevent.h"
#include "navigatorkit/eventqueue.h"

namespace deskplayer
{

/**
 * A queue of events, and the thread that delivers them in order.
 *
 * Call Post() and Settle() from the navigator's thread. From Post() until Settle() returns, the
 * delivering thread reads the playback context, so the navigator must not change it. Earlier writes
 * of the navigator are visible to the listeners, and writes of the listeners are visible to the
 * navigator afterwards. This makes a session exactly repeatable although events report values at
 * dispatch.
 */
class EventDelivery
{
public:
    /** Starts the thread. */
    EventDelivery();

    /** Delivers the events still queued and ends the thread. */
    ~EventDelivery();

    EventDelivery(const EventDelivery&) = delete;
    EventDelivery& operator=(const EventDelivery&) = delete;

    /** The list in which clients register. Any thread. */
    bdmv::INavigatorEvent::Listeners& Listeners() { return m_Listeners; }

    /**
     * Queues an event.
     *
     * @param arguments those of the event's constructor
     * @return false, and nothing is queued, if the queue is full: 256 events fit between two calls
     *         of Settle()
     */
    template <typename Event, typename... Arguments> bool Post(Arguments&&... arguments)
    {
        return m_Queue.Post<Event>(std::forward<Arguments>(arguments)...);
    }

    /**
     * Waits until everything posted has been delivered.
     *
     * @throw the first exception thrown by a listener; later events have been delivered
     */
    void Settle();

private:
    class SettledEvent;

    void Deliver();

    bdmv::INavigatorEvent::Listeners m_Listeners;
    bdmv::EventQueue m_Queue;
    std::exception_ptr m_Failure; ///< the first since the last Settle(), of the delivering thread
    std::mutex m_Mutex;           ///< guards m_IsSettled
    std::condition_variable m_Settled;
    bool m_IsSettled = false;
    std::thread m_Thread; ///< last, so that it starts after everything it uses is constructed
};

} // namespace deskplayer

#endif
