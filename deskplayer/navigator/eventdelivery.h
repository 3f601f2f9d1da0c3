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
 * Post() and Settle() belong to the thread of the navigator. Between Post() and Settle() the
 * delivering thread reads the playback context, so the navigator leaves it alone; what it wrote
 * before is visible to the listeners, and what they did is visible to it afterwards. That is what
 * makes a session exactly repeatable although events report the values of their dispatch.
 */
class EventDelivery
{
public:
    /** Starts the thread. */
    EventDelivery();

    /** Delivers what is still queued and ends the thread. */
    ~EventDelivery();

    EventDelivery(const EventDelivery&) = delete;
    EventDelivery& operator=(const EventDelivery&) = delete;

    /** Where clients register. Any thread. */
    bdmv::INavigatorEvent::Listeners& Listeners() { return m_Listeners; }

    /** Queues an event. */
    void Post(std::unique_ptr<bdmv::INavigatorEvent> event);

    /**
     * Waits until everything posted has been delivered.
     *
     * @throw what a listener threw; the events behind that one have been delivered all the same
     */
    void Settle();

private:
    void Deliver();
    template <typename Condition>
    void Wait(std::unique_lock<std::mutex>& lock, Condition condition);

    bdmv::INavigatorEvent::Listeners m_Listeners;
    std::mutex m_Mutex; ///< guards what follows
    std::condition_variable m_Changed;
    std::deque<std::unique_ptr<bdmv::INavigatorEvent>> m_Queue;
    std::uint64_t m_Undelivered = 0; ///< queued, and the one being dispatched
    std::exception_ptr m_Failure;    ///< the first since the last Settle()
    bool m_Ending = false;
    std::thread m_Thread; ///< last, so that it finds everything in place
};

} // namespace deskplayer

#endif
