/**
 * @file
 * The rooms of the navigator, for tests that need some of them and no navigator.
 */
#ifndef TESTS_DESKPLAYER_NAVIGATOR_ROOMS_H
#define TESTS_DESKPLAYER_NAVIGATOR_ROOMS_H

#include <string>
#include <utility>

#include "../testdesk.h"
#include "navigator/eventsender.h"
#include "navigator/playbackcontext.h"
#include "navigator/playhead.h"
#include "support/recordinglistener.h"

namespace deskplayer
{

/** A play list, number 7, its state, which the test writes, and what answers about them. */
struct StateRooms {
    explicit StateRooms(PlayList list) : playList(LayOut(7, std::move(list))) {}

    const LoadedPlayList playList;
    PlaybackState state;
    Playhead playhead{playList, state};
    PlaybackContext context{playhead, state};
};

/** The same with a listener that writes down the events. */
struct EventRooms : StateRooms {
    explicit EventRooms(PlayList list) : StateRooms(std::move(list))
    {
        delivery.Listeners().AddListener(&listener);
    }

    /** The callbacks since the last call, one a line. */
    std::string Take() { return journal.Take(); }

    bdmvtest::Journal journal;
    bdmvtest::RecordingListener listener{journal, "A"};
    EventDelivery delivery;
    EventSender sender{context, delivery};
};

} // namespace deskplayer

#endif
