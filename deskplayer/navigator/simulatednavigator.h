/**
 * @file
 * A navigator that plays a play list without a stream.
 */
#ifndef DESKPLAYER_NAVIGATOR_SIMULATEDNAVIGATOR_H
#define DESKPLAYER_NAVIGATOR_SIMULATEDNAVIGATOR_H

#include <cstdint>
#include <optional>

#include "navigator/eventdelivery.h"
#include "navigator/playbackcontext.h"
#include "navigator/virtualclock.h"

namespace deskplayer
{

/**
 * Plays a play list on a virtual clock and sends the events that a navigator would.
 *
 * Every event has been delivered when an operation returns, with the values of its moment. All
 * operations belong to one thread. They throw what a listener threw.
 *
 * Play items are played in sequence, whatever playback type the play list asks for.
 */
class SimulatedNavigator final : public PlaybackContext
{
public:
    enum class Status {
        Stopped, ///< not started yet, or stopped on request
        Playing,
        Paused,
        Still,   ///< holds the last picture of a play item
        Finished ///< everything has been played
    };

    /** @param clock and @p delivery must outlive the navigator */
    SimulatedNavigator(LoadedPlayList playList, VirtualClock& clock, EventDelivery& delivery);

    Status CurrentStatus() const { return m_Status; }

    /**
     * How long it takes until playback changes by itself, in ticks of 45 kHz; nothing when it waits
     * for an operation, or has ended.
     */
    std::optional<std::uint64_t> TimeToNextChange() const;

    /** Starts at the beginning. */
    void Play();

    /** Holds playback; does nothing unless it is playing. */
    void Pause();

    /** Goes on after Pause(); does nothing unless paused. */
    void Continue();

    /** Shows the next picture, if the play item has one; does nothing unless paused. */
    void Step();

    /** Ends a still and goes on with the next play item; does nothing outside of one. */
    void EndStill();

    /** Ends playback; does nothing when there is none. */
    void Stop();

    /**
     * Lets time pass, and playback with it.
     *
     * @param ticks in ticks of 45 kHz
     * @return how much of it was left when playback ended; the clock stands there
     */
    std::uint64_t Advance(std::uint64_t ticks);

private:
    template <typename Event> void Send();
    std::uint64_t EndOfItem() const;
    void ReachEndOfItem();
    void EnterNextItem();

    VirtualClock& m_rClock;
    EventDelivery& m_rDelivery;
    Status m_Status = Status::Stopped;
    std::optional<std::uint64_t> m_StillLeft; ///< of a still that ends by itself, in ticks
};

} // namespace deskplayer

#endif
