/**
 * @file
 * The thread that delivers events to listeners.
 */
#ifndef DESKPLAYER_NAVIGATOR_EVENTDELIVERY_H
#define DESKPLAYER_NAVIGATOR_EVENTDELIVERY_H

#include <condition_variable>
#include <cstdint>
#include <deque>
#include <exception>
#include <memory>
#include <mutex>
#include <thread>

#include "bdmvnavigator/inavigatorevent.h"

namespace deskplayer
{

/**
 * A queue of events, and the thread that dispatches and deletes them in order.
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

    /** Queues an event. */
    void Post(std::unique_ptr<bdmv::INavigatorEvent> event);

    /**
     * Waits until everything posted has been delivered.
     *
     * @throw the first exception thrown by a listener; later events have been delivered
     */
    void Settle();

private:
    void Deliver();
    template <typename Condition>
    void Wait(std::unique_lock<std::mutex>& lock, Condition condition);

    bdmv::INavigatorEvent::Listeners m_Listeners;
    std::mutex m_Mutex; ///< guards the members below
    std::condition_variable m_Changed;
    std::deque<std::unique_ptr<bdmv::INavigatorEvent>> m_Queue;
    std::uint64_t m_Undelivered = 0; ///< events queued or being dispatched
    std::exception_ptr m_Failure;    ///< the first since the last Settle()
    bool m_Ending = false;
    std::thread m_Thread; ///< last, so that it starts after everything it uses is constructed
};

} // namespace deskplayer

#endif
