/**
 * @file
 * The callbacks of INavSettingsListener about streams and angles as values: each has the name and
 * the arguments of its callback.
 */
#ifndef CLIENTKIT_STREAMCALLBACKS_H
#define CLIENTKIT_STREAMCALLBACKS_H

#include "bdmvnavigator/inavigatorlistener.h"
#include "clientkit/callbackid.h"
#include "clientkit/withoutarguments.h"

namespace bdmv
{
namespace callbacks
{

/** INavSettingsListener::AudioInfo(). */
struct AudioInfo {
    static constexpr CallbackId Id() { return CallbackAudioInfo; }

    bd::StreamNumberDef number;

    void CallOn(INavigatorListener& listener) const { listener.AudioInfo(number); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("number", self.number);
    }
};

/** INavSettingsListener::VideoInfo(). */
struct VideoInfo {
    static constexpr CallbackId Id() { return CallbackVideoInfo; }

    bd::StreamNumberDef number;

    void CallOn(INavigatorListener& listener) const { listener.VideoInfo(number); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("number", self.number);
    }
};

/** INavSettingsListener::AngleInfo(). */
struct AngleInfo {
    static constexpr CallbackId Id() { return CallbackAngleInfo; }

    bd::AngleNumberDef number;

    void CallOn(INavigatorListener& listener) const { listener.AngleInfo(number); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("number", self.number);
    }
};

/** INavSettingsListener::InteractiveGraphicsInfo(). */
struct InteractiveGraphicsInfo {
    static constexpr CallbackId Id() { return CallbackInteractiveGraphicsInfo; }

    bd::StreamNumberDef number;

    void CallOn(INavigatorListener& listener) const { listener.InteractiveGraphicsInfo(number); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("number", self.number);
    }
};

/** INavSettingsListener::PresentationGraphicsInfo(). */
struct PresentationGraphicsInfo {
    static constexpr CallbackId Id() { return CallbackPresentationGraphicsInfo; }

    bd::StreamNumberDef number;
    bool available;

    void CallOn(INavigatorListener& listener) const
    {
        listener.PresentationGraphicsInfo(number, available);
    }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("number", self.number);
        visitor("available", self.available);
    }
};

/** INavSettingsListener::SecondaryAudioInfo(). */
struct SecondaryAudioInfo {
    static constexpr CallbackId Id() { return CallbackSecondaryAudioInfo; }

    bd::StreamNumberDef number;

    void CallOn(INavigatorListener& listener) const { listener.SecondaryAudioInfo(number); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("number", self.number);
    }
};

/** INavSettingsListener::SecondaryVideoInfo(). */
struct SecondaryVideoInfo {
    static constexpr CallbackId Id() { return CallbackSecondaryVideoInfo; }

    bd::StreamNumberDef number;

    void CallOn(INavigatorListener& listener) const { listener.SecondaryVideoInfo(number); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("number", self.number);
    }
};

/** INavSettingsListener::PipPgTextStInfo(). */
struct PipPgTextStInfo {
    static constexpr CallbackId Id() { return CallbackPipPgTextStInfo; }

    bd::StreamNumberDef number;
    bool available;

    void CallOn(INavigatorListener& listener) const { listener.PipPgTextStInfo(number, available); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("number", self.number);
        visitor("available", self.available);
    }
};

/** INavSettingsListener::AudioInfoChanged(). */
struct AudioInfoChanged {
    static constexpr CallbackId Id() { return CallbackAudioInfoChanged; }

    bool isPrimary;
    bd::AudioInfoType info;

    void CallOn(INavigatorListener& listener) const { listener.AudioInfoChanged(isPrimary, info); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("isPrimary", self.isPrimary);
        visitor("format", self.info.format);
        visitor("sampleRate", self.info.sampleRate);
        visitor("bitsPerSample", self.info.bitsPerSampling);
        visitor("channels", self.info.channels);
        visitor("pid", self.info.pid);
        visitor("channelLayout", self.info.u4AudChannelLayout);
    }
};

/** INavSettingsListener::PictureInPictureAvailable(). */
typedef WithoutArguments<CallbackPictureInPictureAvailable, INavSettingsListener,
                         &INavSettingsListener::PictureInPictureAvailable>
    PictureInPictureAvailable;

/** INavSettingsListener::PictureInPictureUnavailable(). */
typedef WithoutArguments<CallbackPictureInPictureUnavailable, INavSettingsListener,
                         &INavSettingsListener::PictureInPictureUnavailable>
    PictureInPictureUnavailable;

/** INavSettingsListener::SecondaryAudioAvailable(). */
typedef WithoutArguments<CallbackSecondaryAudioAvailable, INavSettingsListener,
                         &INavSettingsListener::SecondaryAudioAvailable>
    SecondaryAudioAvailable;

/** INavSettingsListener::SecondaryAudioUnavailable(). */
typedef WithoutArguments<CallbackSecondaryAudioUnavailable, INavSettingsListener,
                         &INavSettingsListener::SecondaryAudioUnavailable>
    SecondaryAudioUnavailable;

/** INavSettingsListener::PresentationGraphicsDisplay(). */
struct PresentationGraphicsDisplay {
    static constexpr CallbackId Id() { return CallbackPresentationGraphicsDisplay; }

    bool shown;

    void CallOn(INavigatorListener& listener) const { listener.PresentationGraphicsDisplay(shown); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("shown", self.shown);
    }
};

/** INavSettingsListener::SecondaryVideoDisplay(). */
struct SecondaryVideoDisplay {
    static constexpr CallbackId Id() { return CallbackSecondaryVideoDisplay; }

    bd::StreamNumberDef number;
    bool shown;

    void CallOn(INavigatorListener& listener) const
    {
        listener.SecondaryVideoDisplay(number, shown);
    }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("number", self.number);
        visitor("shown", self.shown);
    }
};

/** INavSettingsListener::SecondaryAudioDisplay(). */
struct SecondaryAudioDisplay {
    static constexpr CallbackId Id() { return CallbackSecondaryAudioDisplay; }

    bd::StreamNumberDef number;
    bool shown;

    void CallOn(INavigatorListener& listener) const
    {
        listener.SecondaryAudioDisplay(number, shown);
    }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("number", self.number);
        visitor("shown", self.shown);
    }
};

/** INavSettingsListener::PipPgTextSelect(). */
struct PipPgTextSelect {
    static constexpr CallbackId Id() { return CallbackPipPgTextSelect; }

    bool pick;

    void CallOn(INavigatorListener& listener) const { listener.PipPgTextSelect(pick); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("pick", self.pick);
    }
};

} // namespace callbacks
} // namespace bdmv

#endif
