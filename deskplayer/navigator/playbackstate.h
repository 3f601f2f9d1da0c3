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

/** Positions are on the time line of the play list, in ticks of 45 kHz. */
struct PlaybackState {
    std::uint64_t position = 0;
    std::size_t item = 0;                    ///< the play item in playback
    std::optional<std::size_t> previousItem; ///< the one that was in playback before
    std::optional<std::size_t> mark;         ///< index of the mark that was passed last

    bd::PlayMode playMode;        ///< what was asked for
    bd::PlayMode currentPlayMode; ///< what playback does
    StreamSelection selection;

    std::optional<std::uint64_t> pointA;                   ///< of the A-B repeat
    std::optional<std::uint64_t> pointB;                   ///< set: A to B repeats
    std::optional<std::uint64_t> notifyAt;                 ///< a time to be told about
    bd::TriggerType chapterTitleRepeat = bd::TRIGGER_NONE; ///< TRIGGER_CHP, TRIGGER_TITLE
    bd::TriggerType trigger = bd::TRIGGER_NONE;            ///< what was set last
    bd::TimePosition triggerReachedTime = 0;
    std::optional<bd::TriggerType> triggerReached; ///< which one, while the listeners are told

    bd::ZOOM_PARAM_Def zoom = {};
    bdstreaming::FinishedReason finishedReason = bdstreaming::FinishedReasonEndOfMedia;
    bool playingAfterSystemResume = false;
    PendingButton button;
};

} // namespace deskplayer

#endif
