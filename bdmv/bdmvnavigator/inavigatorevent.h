/**
 * @file
 * The interface of the events that the navigator queues, each dispatched once and then deleted.
 */
#ifndef BDMVNAVIGATOR_INAVIGATOREVENT_H
#define BDMVNAVIGATOR_INAVIGATOREVENT_H

#include "bd/eventlistenerlist.h"
#include "bdmvnavigator/inavigatorlistener.h"

namespace bdmv
{

/**
 * An event of the navigator.
 *
 * Created with plain `new` when something happens, dispatched once, later, on the delivering
 * thread, then deleted through this interface.
 */
class INavigatorEvent
{
public:
    typedef bd::EventListenerList<INavigatorListener> Listeners; ///< the navigator's listeners

    INavigatorEvent() = default;
    virtual ~INavigatorEvent() = default;
    INavigatorEvent(const INavigatorEvent&) = default;
    INavigatorEvent& operator=(const INavigatorEvent&) = default;

    /**
     * Delivers the event to every listener, in the order of the list.
     *
     * Call it once. Allocates nothing.
     *
     * @param listeners the navigator's listeners; its lock must not be held by the calling thread
     * @throw whatever a callback throws; the rest of the event is then skipped. The event still
     *        belongs to the caller.
     * @throw std::system_error the lock of @p listeners could not be taken
     */
    virtual void Dispatch(bd::EventListenerList<INavigatorListener>& listeners) = 0;
};

} // namespace bdmv

#endif
