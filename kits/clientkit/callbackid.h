/**
 * @file
 * The callbacks of INavigatorListener by number and by name.
 */
#ifndef CLIENTKIT_CALLBACKID_H
#define CLIENTKIT_CALLBACKID_H

#include "kevro/kevro_types.h"

namespace bdmv
{

/**
 * Every callback in slot order, with the interface that declares it: the one source of numbers,
 * names and interfaces.
 *
 * @param ENTRY a macro of two names: interface and callback
 */
#define BDMV_CALLBACKS(ENTRY)                                                                      \
    ENTRY(Control, PlayStarted)                                                                    \
    ENTRY(Control, FirstPictureDelivered)                                                          \
    ENTRY(Control, PlayFailed)                                                                     \
    ENTRY(Control, Paused)                                                                         \
    ENTRY(Control, Continued)                                                                      \
    ENTRY(Control, Stepped)                                                                        \
    ENTRY(Control, TriggerTimeReached)                                                             \
    ENTRY(Control, TriggerSet)                                                                     \
    ENTRY(Control, ZoomModeSet)                                                                    \
    ENTRY(Control, Stopped)                                                                        \
    ENTRY(Control, Finished)                                                                       \
    ENTRY(Control, StillOn)                                                                        \
    ENTRY(Control, StillOff)                                                                       \
    ENTRY(Control, Suspended)                                                                      \
    ENTRY(Control, Resumed)                                                                        \
    ENTRY(Control, ResumeFailed)                                                                   \
    ENTRY(Control, SystemSuspended)                                                                \
    ENTRY(Control, SystemResumed)                                                                  \
    ENTRY(Control, SystemResumeFailed)                                                             \
    ENTRY(Control, JumpOccurred)                                                                   \
    ENTRY(Control, PreloadFailed)                                                                  \
    ENTRY(Settings, Playlist)                                                                      \
    ENTRY(Settings, PlayItem)                                                                      \
    ENTRY(Settings, PlayMode)                                                                      \
    ENTRY(Settings, AudioInfo)                                                                     \
    ENTRY(Settings, VideoInfo)                                                                     \
    ENTRY(Settings, AngleInfo)                                                                     \
    ENTRY(Settings, InteractiveGraphicsInfo)                                                       \
    ENTRY(Settings, PresentationGraphicsInfo)                                                      \
    ENTRY(Settings, SecondaryAudioInfo)                                                            \
    ENTRY(Settings, SecondaryVideoInfo)                                                            \
    ENTRY(Settings, PipPgTextStInfo)                                                               \
    ENTRY(Settings, AudioInfoChanged)                                                              \
    ENTRY(Settings, TextSubtitleStyleInfo)                                                         \
    ENTRY(Settings, TextSubtitleStylesAvailable)                                                   \
    ENTRY(Settings, UOMask)                                                                        \
    ENTRY(Settings, ChapterNumber)                                                                 \
    ENTRY(Settings, MarkInfo)                                                                      \
    ENTRY(Settings, CurrentTimePosition)                                                           \
    ENTRY(Settings, PictureInPictureAvailable)                                                     \
    ENTRY(Settings, PictureInPictureUnavailable)                                                   \
    ENTRY(Settings, SecondaryAudioAvailable)                                                       \
    ENTRY(Settings, SecondaryAudioUnavailable)                                                     \
    ENTRY(Settings, PresentationGraphicsDisplay)                                                   \
    ENTRY(Settings, SecondaryVideoDisplay)                                                         \
    ENTRY(Settings, SecondaryAudioDisplay)                                                         \
    ENTRY(Settings, PipPgTextSelect)                                                               \
    ENTRY(Button, ExecuteButton)                                                                   \
    ENTRY(Interactive, InteractiveGraphicsVisible)                                                 \
    ENTRY(Interactive, InteractiveGraphicsInvisible)                                               \
    ENTRY(Interactive, PopUpMenuAvailable)                                                         \
    ENTRY(Interactive, PopUpMenuUnavailable)                                                       \
    ENTRY(Interactive, ButtonActivationBusy)                                                       \
    ENTRY(Interactive, ButtonActivationDone)                                                       \
    ENTRY(Interactive, InteractiveGraphicsActive)                                                  \
    ENTRY(Interactive, InteractiveGraphicsInactive)

/** Identifies a callback: CallbackPlayStarted = 0 and so on, in slot order. */
enum CallbackId : KEVRO_Int32 {
/** Writes an enumerator; undefined below. */
#define BDMV_CALLBACK_ENUMERATOR(interface, name) Callback##name,
    BDMV_CALLBACKS(BDMV_CALLBACK_ENUMERATOR)
#undef BDMV_CALLBACK_ENUMERATOR
        Callback__sizeof ///< the number of callbacks
};

/** The interface that declares a callback. */
enum ListenerInterface : KEVRO_Int32 {
    ListenerInterfaceControl = 0,
    ListenerInterfaceSettings = 1,
    ListenerInterfaceButton = 2,
    ListenerInterfaceInteractive = 3,
    ListenerInterface__sizeof ///< the number of interfaces
};

/** "PlayStarted" for CallbackPlayStarted; "unknown" for a value that is no callback. Any thread. */
const char* NameOf(CallbackId id);

/** The interface that declares a callback; ListenerInterface__sizeof for any other value. */
ListenerInterface InterfaceOf(CallbackId id);

/** "control", "settings", "button" or "interactive"; "unknown" for any other value. */
const char* NameOf(ListenerInterface interface);

} // namespace bdmv

#endif
