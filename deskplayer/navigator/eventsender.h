/**
 * @file
 * Sends events and waits until they have been delivered.
 */
#ifndef DESKPLAYER_NAVIGATOR_EVENTSENDER_H
#define DESKPLAYER_NAVIGATOR_EVENTSENDER_H

#include <memory>

#include "bdmvnavigator/iplaybackcontext.h"
#include "navigator/eventdelivery.h"

namespace deskplayer
{

/** Makes events over a playback context. Belongs to the navigator's thread. */
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
     * Returns when every listener has been called, with the values of this moment.
     *
     * @param arguments of the event, after the context
     * @throw what a listener threw
     */
    template <typename Event, typename... Arguments> void Send(Arguments... arguments)
    {
        m_rDelivery.Post(std::make_unique<Event>(m_rContext, arguments...));
        m_rDelivery.Settle();
    }

private:
    bdmv::IPlaybackContext& m_rContext;
    EventDelivery& m_rDelivery;
};

} // namespace deskplayer

#endif
