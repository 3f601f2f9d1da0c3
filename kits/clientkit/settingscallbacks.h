/**
 * @file
 * The callbacks of INavSettingsListener as values: each has the name and the arguments of its
 * callback. Those about streams have a header of their own.
 */
#ifndef CLIENTKIT_SETTINGSCALLBACKS_H
#define CLIENTKIT_SETTINGSCALLBACKS_H

#include "bdmvnavigator/inavigatorlistener.h"
#include "clientkit/callbackid.h"
#include "clientkit/streamcallbacks.h"

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

} // namespace callbacks
} // namespace bdmv

#endif
