/**
 * @file
 * What the callbacks of INavigatorListener say lasts: the state of playback, the play item, the
 * selected streams, the menu and the like, as one value.
 *
 * @code
 * bdmv::StatusListener follower;
 * navigatorListeners.AddListener(&follower);
 * ...
 * const bdmv::PlaybackStatus status = follower.Status(); // any thread, at any time
 * if (status.chapter.known) {
 *     ShowChapter(status.chapter.value);
 * }
 * @endcode
 *
 * Every part of the status is what was reported last. A part that no callback has reported yet is
 * unknown; a known part never becomes unknown again. When playback stops, the play list, the play
 * item and the rest therefore keep their last values: check the state of playback first.
 */
#ifndef CLIENTKIT_PLAYBACKSTATUS_H
#define CLIENTKIT_PLAYBACKSTATUS_H

#include <type_traits>

#include "bd/threadmutex.h"
#include "clientkit/callback.h"

namespace bdmv
{

/** The state of playback. */
enum PlaybackState : KEVRO_Int32 {
    PlaybackStopped = 0, ///< stopped, finished or failed
    PlaybackPlaying = 1, ///< at whatever speed
    PlaybackPaused = 2,
    PlaybackStill = 3,     ///< a still is being shown
    PlaybackSuspended = 4, ///< to be resumed later
    PlaybackStandby = 5    ///< the system is in standby
};

/** "Stopped" for PlaybackStopped; "unknown" for a value that is no state. Any thread. */
const char* NameOf(PlaybackState state);

/** A part of the status. */
template <typename Value> struct Reported {
    bool known;  ///< whether a callback has reported it
    Value value; ///< what was reported last; zero or the like until then

    Reported() : known(false), value() {}

    /** Makes @p newValue the value that was reported last. */
    void Set(const Value& newValue)
    {
        known = true;
        value = newValue;
    }
};

/** Unknown values are equal. */
template <typename Value> bool operator==(const Reported<Value>& left, const Reported<Value>& right)
{
    return left.known == right.known && (!left.known || left.value == right.value);
}

/** Whether one is known and the other is not, or the values differ. */
template <typename Value> bool operator!=(const Reported<Value>& left, const Reported<Value>& right)
{
    return !(left == right);
}

/** A play item and its primary video; see INavSettingsListener::PlayItem(). */
struct PlayItemStatus {
    bd::PlayListIdDef playListId;         ///< number of the play list
    bd::PlayItemIdDef playItemId;         ///< number of the play item
    bd::VideoFormatType videoFormat;      ///< of the primary video
    bd::VideoAspectRatioType aspectRatio; ///< of the primary video
};

/** Whether all members are equal. */
bool operator==(const PlayItemStatus& left, const PlayItemStatus& right);

/** Whether any member differs. */
inline bool operator!=(const PlayItemStatus& left, const PlayItemStatus& right)
{
    return !(left == right);
}

/** Everything that the callbacks say lasts. A plain value: copying it allocates nothing. */
struct PlaybackStatus {
    Reported<PlaybackState> state; ///< playing, paused, stopped and the like

    /**
     * The state that Resumed returns to: during PlaybackSuspended the state before it;
     * PlaybackPlaying if that is unknown, and during every other state.
     */
    PlaybackState resumesTo;

    Reported<bd::PlayListIdDef> playList;   ///< number of the play list
    Reported<PlayItemStatus> playItem;      ///< names a play list too; may precede a new #playList
    Reported<bd::ChapterNumberDef> chapter; ///< number of the chapter
    Reported<bd::TimePosition> position;    ///< by Stepped too
    Reported<bd::PlayMode> playMode;   ///< the current one; Continued reports the requested one
    Reported<bd::ZOOM_PARAM_Def> zoom; ///< by ZoomModeSet
    Reported<UOMaskTable> mask;        ///< compared as stored, whatever ::g_u1Bduopmask says

    Reported<bd::StreamNumberDef> video;         ///< primary
    Reported<bd::AngleNumberDef> angle;          ///< number of the angle
    Reported<bd::StreamNumberDef> audio;         ///< primary
    Reported<bd::AudioInfoType> audioInfo;       ///< of the primary audio
    Reported<bd::StreamNumberDef> subtitle;      ///< presentation graphics or text subtitles
    Reported<bool> subtitleAvailable;            ///< by PresentationGraphicsInfo
    Reported<bool> subtitleShown;                ///< by PresentationGraphicsDisplay
    Reported<bd::UserStyleNumber> subtitleStyle; ///< user style of text subtitles
    Reported<bd::UInt8> subtitleStyles;          ///< number of user styles

    Reported<bool> pipAvailable;                  ///< by PictureInPictureAvailable and its opposite
    Reported<bd::StreamNumberDef> secondaryVideo; ///< by SecondaryVideoDisplay too
    Reported<bool> secondaryVideoShown;           ///< by SecondaryVideoDisplay
    Reported<bool> secondaryAudioAvailable;       ///< by SecondaryAudioAvailable and its opposite
    Reported<bd::StreamNumberDef> secondaryAudio; ///< by SecondaryAudioDisplay too
    Reported<bool> secondaryAudioShown;           ///< by SecondaryAudioDisplay
    Reported<bd::AudioInfoType> secondaryAudioInfo; ///< attributes of the stream
    Reported<bd::StreamNumberDef> pipSubtitle;      ///< of the picture-in-picture window
    Reported<bool> pipSubtitleAvailable;            ///< by PipPgTextStInfo
    Reported<bool> pipSubtitleSelected;             ///< by PipPgTextSelect

    Reported<bd::StreamNumberDef> interactiveGraphics; ///< the stream of menus
    Reported<bool> menuVisible;                        ///< whether interactive graphics are visible
    Reported<bool> menuActive;                         ///< whether interactive graphics are active
    Reported<bool> popUpMenuAvailable;                 ///< whether a pop-up menu can be opened
    Reported<bool> buttonBusy; ///< whether the activation of a button is under way

    /** Nothing is known. */
    PlaybackStatus();
};

static_assert(std::is_trivially_copyable<PlaybackStatus>::value, "a plain value");

/** Whether all parts are equal, as Reported compares them. */
bool operator==(const PlaybackStatus& left, const PlaybackStatus& right);

/** Whether any part differs. */
inline bool operator!=(const PlaybackStatus& left, const PlaybackStatus& right)
{
    return !(left == right);
}

/** Makes @p status include what the callback reports; a momentary callback changes nothing. */
void Apply(const Callback& callback, PlaybackStatus& status);

/**
 * Reports a status to a listener as ordinary callbacks.
 *
 * Applied in their order to a new PlaybackStatus, or to any that the same sequence of callbacks led
 * to earlier, they give @p status. Unknown parts are left out. A state in which playback is under
 * way comes first, `Stopped` and `SystemSuspended` come last, so that a listener that resets its
 * display on these callbacks ends with the right one. `SystemSuspended` comes without its block,
 * which does not last. No momentary callback is sent, and nothing is allocated.
 *
 * @throw whatever the listener throws; it has then received only a part
 */
void Deliver(const PlaybackStatus& status, INavigatorListener& listener);

/**
 * Keeps the status. Needs to be registered before playback starts to know all of it.
 */
class StatusListener : public CallbackListener
{
public:
    StatusListener() = default;

    StatusListener(const StatusListener&) = delete;
    StatusListener& operator=(const StatusListener&) = delete;

    /**
     * The status including the latest callback. Any thread, also inside a callback. Waits at most
     * until another thread has copied or updated the status.
     */
    PlaybackStatus Status() const;

private:
    void OnCallback(const Callback& callback) override;

    bd::ThreadMutex m_StatusLock; ///< guards m_Status; no listener is called under it
    PlaybackStatus m_Status;
};

} // namespace bdmv

#endif
