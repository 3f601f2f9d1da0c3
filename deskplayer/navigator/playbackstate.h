/**
 * @file
 * The state of playback.
 */
#ifndef DESKPLAYER_NAVIGATOR_PLAYBACKSTATE_H
#define DESKPLAYER_NAVIGATOR_PLAYBACKSTATE_H

#include <cstddef>
#include <cstdint>
#include <optional>

#include "bd/types.h"
#include "bdstreaming/types.h"
#include "database/iprogramdata.h"
#include "deskplayer/ticks.h"

namespace deskplayer
{

/**
 * The viewer's selection. Streams, angles and styles are numbered from 1. A play item that lacks
 * the selected one uses its last instead; the selection is kept.
 */
struct StreamSelection {
    bd::StreamNumberDef video = 1;
    bd::StreamNumberDef audio = 1;
    bd::StreamNumberDef ig = 1;
    bd::StreamNumberDef pg = 1;
    bd::StreamNumberDef secondaryVideo = 1;
    bd::StreamNumberDef secondaryAudio = 1;
    bd::StreamNumberDef pipPg = 1;
    bd::AngleNumberDef angle = 1;
    bd::UserStyleNumber style = 1;

    bool pgShown = true;
    bool secondaryVideoShown = false;
    bool secondaryAudioShown = false;
    bool pipPgPicked = false;
};

/** An activated button whose program is to be executed. */
struct PendingButton {
    bdmv::IProgramData::RefPtr program;
    bd::UInt32 ticket = 0;
    bd::ButtonId id = 0;
};

enum class Status {
    Stopped, ///< not started yet, stopped on request, or failed
    Playing,
    Paused,
    Still,     ///< holds the last picture of a play item
    Suspended, ///< holds until it is resumed
    Standby,   ///< the system is in standby
    Finished   ///< played to the end, or out of data
};

/** Positions are on the time line of the play list. */
struct PlaybackState {
    Status status = Status::Stopped;
    Status statusBeforeSuspend = Status::Stopped; ///< restored when playback resumes
    std::optional<Ticks> stillLeft;               ///< remaining time of a timed still

    Ticks position{0};
    std::size_t item = 0;                    ///< the active play item
    std::optional<std::size_t> previousItem; ///< the play item that was active before
    std::optional<std::size_t> mark;         ///< index of the mark that was passed last

    bd::PlayMode playMode;        ///< the play mode requested
    bd::PlayMode currentPlayMode; ///< the play mode in effect
    StreamSelection selection;

    std::optional<Ticks> pointA;                           ///< of the A-B repeat
    std::optional<Ticks> pointB;                           ///< if set, A to B repeats
    std::optional<Ticks> notifyAt;                         ///< the position of the trigger
    bd::TriggerType chapterTitleRepeat = bd::TRIGGER_NONE; ///< TRIGGER_CHP, TRIGGER_TITLE
    bd::TriggerType trigger = bd::TRIGGER_NONE;            ///< the one set last
    Ticks triggerReachedTime{0};
    std::optional<bd::TriggerType> triggerReached; ///< while the listeners are notified

    bd::ZOOM_PARAM_Def zoom = {};
    bdstreaming::FinishedReason finishedReason = bdstreaming::FinishedReasonEndOfMedia;
    bool playingAfterSystemResume = false;
    PendingButton button;
};

} // namespace deskplayer

#endif
