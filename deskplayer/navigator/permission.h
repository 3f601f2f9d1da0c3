/**
 * @file
 * Whether an operation may be carried out now, and why not.
 */
#ifndef DESKPLAYER_NAVIGATOR_PERMISSION_H
#define DESKPLAYER_NAVIGATOR_PERMISSION_H

#include <initializer_list>

#include "navigator/outcome.h"
#include "navigator/playbackstate.h"
#include "navigator/playhead.h"

namespace deskplayer
{

/** A status as refusals name it: "playing", "in a still". */
const char* StatusName(Status status);

/** Checks operations against the mask of the disc and the status of playback. Changes nothing. */
class Permission
{
public:
    /** @param playhead and @p state must outlive the permission */
    Permission(const Playhead& playhead, const PlaybackState& state)
        : m_rPlayhead(playhead), m_rState(state)
    {
    }

    Permission(const Permission&) = delete;
    Permission& operator=(const Permission&) = delete;

    /**
     * Whether the play list and the active play item permit an operation; the reason names which of
     * them forbids it, or the debug override of the masks. Everything is permitted while nothing
     * plays.
     */
    Outcome CheckMask(bd::UserOperationMaskDef operation) const;

    /** Whether playback has one of these statuses. */
    Outcome CheckStatus(std::initializer_list<Status> statuses) const;

    /** Whether playback shows a picture: playing, paused or in a still. */
    Outcome CheckActive() const;

private:
    const Playhead& m_rPlayhead;
    const PlaybackState& m_rState;
};

} // namespace deskplayer

#endif
