/**
 * @file
 * The callbacks of a navigator's listener, and the interfaces that declare them.
 */
#ifndef DESKPLAYER_OUTPUT_CALLBACKS_H
#define DESKPLAYER_OUTPUT_CALLBACKS_H

#include <array>
#include <cstddef>
#include <string_view>

namespace deskplayer
{

/** The interface that declares a callback. */
enum class ListenerInterface { Control, Settings, Button, Interactive };

/** Indexed by ListenerInterface. */
inline constexpr std::array<std::string_view, 4> InterfaceNames{"control", "settings", "button",
                                                                "interactive"};

// All callbacks in order of declaration: the source of the enumerators and names below.
#define DESKPLAYER_CALLBACKS(ENTRY)                                                                \
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

/** Identifies a callback; numbered from 0 in order of declaration. */
enum class CallbackId : std::size_t {
#define DESKPLAYER_ENUMERATOR(interface, name) name,
    DESKPLAYER_CALLBACKS(DESKPLAYER_ENUMERATOR)
#undef DESKPLAYER_ENUMERATOR
};

/** The properties of a callback. */
struct CallbackInfo {
    ListenerInterface interface;
    std::string_view name;
};

/** Indexed by CallbackId. */
inline constexpr std::array AllCallbacks{
#define DESKPLAYER_INFO(interface, name) CallbackInfo{ListenerInterface::interface, #name},
    DESKPLAYER_CALLBACKS(DESKPLAYER_INFO)
#undef DESKPLAYER_INFO
};
#undef DESKPLAYER_CALLBACKS

constexpr std::string_view NameOf(ListenerInterface interface)
{
    return InterfaceNames[static_cast<std::size_t>(interface)];
}

constexpr const CallbackInfo& InfoOf(CallbackId id)
{
    return AllCallbacks[static_cast<std::size_t>(id)];
}

} // namespace deskplayer

#endif
