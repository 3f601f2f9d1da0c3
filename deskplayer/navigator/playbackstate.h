/**
 * @file
 * What changes while a play list plays.
 */
#ifndef DESKPLAYER_NAVIGATOR_PLAYBACKSTATE_H
#define DESKPLAYER_NAVIGATOR_PLAYBACKSTATE_H

#include <cstddef>
#include <cstdint>
#include <optional>

#include "bd/types.h"
#include "bdstreaming/types.h"
#include "database/iprogramdata.h"
#include "text/ticks.h"

namespace deskplayer
{

/**
 * What the viewer has chosen. Streams, angles and styles count from 1. A play item that lacks the
 * chosen one shows its last instead; the choice stays.
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

/** A button that was activated and waits for its program to be executed. */
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
    Finished   ///< played to the end, or the stream ran dry
};

/** Positions are on the time line of the play list. */
struct PlaybackState {
    Status status = Status::Stopped;
    Status statusBeforeSuspend = Status::Stopped; ///< restored when playback resumes
    std::optional<Ticks> stillLeft;               ///< of a still that ends by itself

    Ticks position{0};
    std::size_t item = 0;                    ///< the play item in playback
    std::optional<std::size_t> previousItem; ///< the one that was in playback before
    std::optional<std::size_t> mark;         ///< index of the mark that was passed last

    bd::PlayMode playMode;        ///< what was asked for
    bd::PlayMode currentPlayMode; ///< what playback does
    StreamSelection selection;

    std::optional<Ticks> pointA;                           ///< of the A-B repeat
    std::optional<Ticks> pointB;                           ///< set: A to B repeats
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
