/**
 * @file
 * What a desk consists of: a navigator with everything it needs.
 */
#ifndef DESKPLAYER_NAVIGATOR_DESKPARTS_H
#define DESKPLAYER_NAVIGATOR_DESKPARTS_H

#include <utility>
#include <vector>

#include "navigator/eventdelivery.h"
#include "navigator/resumedatakeeper.h"
#include "navigator/simulatednavigator.h"
#include "navigator/virtualclock.h"

namespace deskplayer
{

/**
 * Owns a clock, a delivering thread, a navigator, and the listener that stores its resume data,
 * which is registered before all others.
 *
 * Call all operations except Listeners() from one thread. Every event has been delivered when an
 * operation of the navigator returns, so a listener may be destroyed before the desk once it has
 * been removed, or once no more operations follow.
 */
class DeskParts
{
public:
    /** Starts the delivering thread. */
    explicit DeskParts(LoadedPlayList playList)
        : m_Navigator(std::move(playList), m_Clock, m_Delivery)
    {
        Listeners().AddListener(&m_Keeper);
    }

    DeskParts(const DeskParts&) = delete;
    DeskParts& operator=(const DeskParts&) = delete;

    /** The list in which clients register. Any thread. */
    bdmv::INavigatorEvent::Listeners& Listeners() { return m_Delivery.Listeners(); }

    SimulatedNavigator& Navigator() { return m_Navigator; }

    /** The time of the session. Any thread may read it. */
    VirtualClock& Clock() { return m_Clock; }

    /** The resume data of the last standby; empty before the first. */
    const std::vector<bd::UInt8>& ResumeData() const { return m_Keeper.ResumeData(); }

private:
    VirtualClock m_Clock;
    ResumeDataKeeper m_Keeper;
    EventDelivery m_Delivery; ///< after the members that its thread uses
    SimulatedNavigator m_Navigator;
};

} // namespace deskplayer

#endif
