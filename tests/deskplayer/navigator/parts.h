/**
 * @file
 * Parts of the navigator, for tests that do not need all of it.
 */
#ifndef TESTS_DESKPLAYER_NAVIGATOR_PARTS_H
#define TESTS_DESKPLAYER_NAVIGATOR_PARTS_H

#include <string>
#include <utility>

#include "../testdesk.h"
#include "navigator/eventsender.h"
#include "navigator/playbackcontext.h"
#include "navigator/playhead.h"
#include "testkit/recordinglistener.h"

namespace deskplayer
{

/** Play list number 7, its state, which tests set, and the classes that answer queries about it. */
struct StateParts {
    explicit StateParts(PlayList list) : playList(LayOut(7, std::move(list))) {}

    const LoadedPlayList playList;
    PlaybackState state;
    Playhead playhead{playList, state};
    PlaybackContext context{playhead, state};
};

/** The same with a listener that records callbacks. */
struct EventParts : StateParts {
    explicit EventParts(PlayList list) : StateParts(std::move(list))
    {
        delivery.Listeners().AddListener(&listener);
    }

    /** The callbacks since the last call, one per line. */
    std::string Take() { return journal.Take(); }

    bdmvtest::Journal journal;
    bdmvtest::RecordingListener listener{journal, "A"};
    EventDelivery delivery;
    EventSender sender{context, delivery};
};

} // namespace deskplayer

#endif
