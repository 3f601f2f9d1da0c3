/**
 * @file
 * Sends events and waits until they have been delivered.
 */
#ifndef DESKPLAYER_NAVIGATOR_EVENTSENDER_H
#define DESKPLAYER_NAVIGATOR_EVENTSENDER_H

#include <utility>

#include "bdmvnavigator/iplaybackcontext.h"
#include "navigator/eventdelivery.h"

namespace deskplayer
{

/** Creates events that query one playback context. Use it on the navigator's thread. */
class EventSender
{
public:
    /** @param context and @p delivery must outlive the sender */
    EventSender(bdmv::IPlaybackContext& context, EventDelivery& delivery)
        : m_rContext(context), m_rDelivery(delivery)
    {
    }

    EventSender(const EventSender&) = delete;
    EventSender& operator=(const EventSender&) = delete;

    /**
     * Sends an event with the current values, and returns when every listener has been called.
     *
     * @param arguments the event's constructor arguments after the context
     * @throw any exception thrown by a listener
     */
    template <typename Event, typename... Arguments> void Send(Arguments&&... arguments)
    {
        // There is a place: nothing has been posted since the last call.
        m_rDelivery.Post<Event>(m_rContext, std::forward<Arguments>(arguments)...);
        m_rDelivery.Settle();
    }

private:
    bdmv::IPlaybackContext& m_rContext;
    EventDelivery& m_rDelivery;
};

} // namespace deskplayer

#endif
