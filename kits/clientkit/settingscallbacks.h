/**
 * @file
 * The callbacks of INavSettingsListener as values: each has the name and the arguments of its
 * callback.
 */
#ifndef CLIENTKIT_SETTINGSCALLBACKS_H
#define CLIENTKIT_SETTINGSCALLBACKS_H

#include "bdmvnavigator/inavigatorlistener.h"
#include "clientkit/callbackid.h"
#include "clientkit/withoutarguments.h"

namespace bdmv
{
namespace callbacks
{

/** INavSettingsListener::Playlist(). */
struct Playlist {
    static constexpr CallbackId Id() { return CallbackPlaylist; }

    bd::PlayListIdDef playListId;

    void CallOn(INavigatorListener& listener) const { listener.Playlist(playListId); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("playListId", self.playListId);
    }
};

/** INavSettingsListener::PlayItem(). */
struct PlayItem {
    static constexpr CallbackId Id() { return CallbackPlayItem; }

    bd::PlayListIdDef playListId;
    bd::PlayItemIdDef playItemId;
    bd::VideoFormatType videoFormat;
    bd::VideoAspectRatioType aspectRatio;

    void CallOn(INavigatorListener& listener) const
    {
        listener.PlayItem(playListId, playItemId, videoFormat, aspectRatio);
    }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("playListId", self.playListId);
        visitor("playItemId", self.playItemId);
        visitor("videoFormat", self.videoFormat);
        visitor("aspectRatio", self.aspectRatio);
    }
};

/** INavSettingsListener::PlayMode(). */
struct PlayMode {
    static constexpr CallbackId Id() { return CallbackPlayMode; }

    bd::PlayDirectionDef direction;
    bd::PlaySpeedDef speed;

    void CallOn(INavigatorListener& listener) const { listener.PlayMode(direction, speed); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("direction", self.direction);
        visitor("speed", self.speed);
    }
};

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

/** INavSettingsListener::TextSubtitleStyleInfo(). */
struct TextSubtitleStyleInfo {
    static constexpr CallbackId Id() { return CallbackTextSubtitleStyleInfo; }

    bd::UserStyleNumber styleNumber;

    void CallOn(INavigatorListener& listener) const { listener.TextSubtitleStyleInfo(styleNumber); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("styleNumber", self.styleNumber);
    }
};

/** INavSettingsListener::TextSubtitleStylesAvailable(). */
struct TextSubtitleStylesAvailable {
    static constexpr CallbackId Id() { return CallbackTextSubtitleStylesAvailable; }

    bd::UInt8 numberOfStyles;

    void CallOn(INavigatorListener& listener) const
    {
        listener.TextSubtitleStylesAvailable(numberOfStyles);
    }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("numberOfStyles", self.numberOfStyles);
    }
};

/** INavSettingsListener::UOMask(). */
struct UOMask {
    static constexpr CallbackId Id() { return CallbackUOMask; }

    UOMaskTable mask;

    void CallOn(INavigatorListener& listener) const { listener.UOMask(mask); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("forbidden", self.mask);
    }
};

/** INavSettingsListener::ChapterNumber(). */
struct ChapterNumber {
    static constexpr CallbackId Id() { return CallbackChapterNumber; }

    bd::ChapterNumberDef chapter;

    void CallOn(INavigatorListener& listener) const { listener.ChapterNumber(chapter); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("chapter", self.chapter);
    }
};

/** INavSettingsListener::MarkInfo(). */
struct MarkInfo {
    static constexpr CallbackId Id() { return CallbackMarkInfo; }

    bd::PlayListIdDef playListId;
    bd::PlayListMarkIdDef markId;
    bd::TimePosition time;

    void CallOn(INavigatorListener& listener) const { listener.MarkInfo(playListId, markId, time); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("playListId", self.playListId);
        visitor("markId", self.markId);
        visitor("time", self.time);
    }
};

/** INavSettingsListener::CurrentTimePosition(). */
struct CurrentTimePosition {
    static constexpr CallbackId Id() { return CallbackCurrentTimePosition; }

    bd::TimePosition position;

    void CallOn(INavigatorListener& listener) const { listener.CurrentTimePosition(position); }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("position", self.position);
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
