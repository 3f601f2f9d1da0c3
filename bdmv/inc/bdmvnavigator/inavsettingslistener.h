/**
 * @file
 * Callbacks that report the playback position and the selected streams.
 */
#ifndef BDMVNAVIGATOR_INAVSETTINGSLISTENER_H
#define BDMVNAVIGATOR_INAVSETTINGSLISTENER_H

#include "bd/types.h"
#include "database/uomasktable.h"

namespace bdmv
{

/**
 * The position of playback in the title, the selected streams, and what is available.
 *
 * INavigatorListener states the rules that all callbacks share. Their order is part of the binary
 * interface.
 */
class INavSettingsListener
{
public:
    INavSettingsListener() = default;
    virtual ~INavSettingsListener() = default;
    INavSettingsListener(const INavSettingsListener&) = default;
    INavSettingsListener& operator=(const INavSettingsListener&) = default;

    /**
     * A play list is being played. Sent by PlaylistEvent.
     *
     * @param playListId its number
     */
    virtual void Playlist(bd::PlayListIdDef playListId) = 0;

    /**
     * A play item is being played. Sent by PlayItemEvent.
     *
     * @param playListId  number of its play list
     * @param playItemId  its number within the play list
     * @param videoFormat format of the primary video
     * @param aspectRatio aspect ratio of the primary video
     */
    virtual void PlayItem(bd::PlayListIdDef playListId, bd::PlayItemIdDef playItemId,
                          bd::VideoFormatType videoFormat,
                          bd::VideoAspectRatioType aspectRatio) = 0;

    /**
     * The play mode changed. Sent by PlayModeEvent.
     *
     * @param direction the current direction of playback
     * @param speed     the current speed of playback
     */
    virtual void PlayMode(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed) = 0;

    /**
     * A primary audio stream is selected. Sent by AudioInfoEvent.
     *
     * @param number its stream number
     */
    virtual void AudioInfo(bd::StreamNumberDef number) = 0;

    /**
     * A primary video stream is selected. Sent by VideoInfoEvent.
     *
     * @param number its stream number
     */
    virtual void VideoInfo(bd::StreamNumberDef number) = 0;

    /**
     * An angle is selected. Sent by AngleInfoEvent.
     *
     * @param number the angle number
     */
    virtual void AngleInfo(bd::AngleNumberDef number) = 0;

    /**
     * An interactive graphics stream is selected. Sent by InteractiveGraphicsInfoEvent.
     *
     * @param number its stream number
     */
    virtual void InteractiveGraphicsInfo(bd::StreamNumberDef number) = 0;

    /**
     * A presentation graphics or text subtitle stream is selected. Sent by
     * PresentationGraphicsInfoEvent.
     *
     * @param number    its stream number
     * @param available whether it is available: subtitles are shown, and there is at least one
     *                  stream
     */
    virtual void PresentationGraphicsInfo(bd::StreamNumberDef number, bool available) = 0;

    /**
     * A secondary audio stream is selected. Sent by SecondaryAudioInfoEvent.
     *
     * @param number its stream number
     */
    virtual void SecondaryAudioInfo(bd::StreamNumberDef number) = 0;

    /**
     * A secondary video stream is selected. Sent by SecondaryVideoInfoEvent.
     *
     * @param number its stream number
     */
    virtual void SecondaryVideoInfo(bd::StreamNumberDef number) = 0;

    /**
     * A subtitle stream is selected for the picture-in-picture window. Sent by
     * PipPgTextStInfoEvent.
     *
     * @param number    its stream number
     * @param available whether it is available
     */
    virtual void PipPgTextStInfo(bd::StreamNumberDef number, bool available) = 0;

    /**
     * The attributes of an audio stream changed. Sent by AudioInfoChangedEvent.
     *
     * @param isPrimary true for the primary audio, false for the secondary
     * @param info      the new attributes
     */
    virtual void AudioInfoChanged(bool isPrimary, bd::AudioInfoType info) = 0;

    /**
     * A text subtitle user style is selected. Sent by TextSubtitleStyleInfoEvent.
     *
     * @param styleNumber its number
     */
    virtual void TextSubtitleStyleInfo(bd::UserStyleNumber styleNumber) = 0;

    /**
     * Text subtitle user styles are available. Sent by TextSubtitleStylesAvailableEvent.
     *
     * @param numberOfStyles their number
     */
    virtual void TextSubtitleStylesAvailable(bd::UInt8 numberOfStyles) = 0;

    /**
     * The set of forbidden user operations changed. Sent by UOMaskEvent.
     *
     * @param mask the mask now in force
     */
    virtual void UOMask(const UOMaskTable& mask) = 0;

    /**
     * A chapter began. Sent by ChapterEvent.
     *
     * @param chapter its number
     */
    virtual void ChapterNumber(const bd::ChapterNumberDef& chapter) = 0;

    /**
     * Playback passed a play list mark. Sent by MarkInfoEvent.
     *
     * @param playListId number of the play list
     * @param markId     number of the mark
     * @param time       time position of the mark; bd::TimePositionNone when it has none
     */
    virtual void MarkInfo(bd::PlayListIdDef playListId, const bd::PlayListMarkIdDef& markId,
                          const bd::TimePosition& time) = 0;

    /**
     * The current time position. Sent by CurrentTimePositionEvent.
     *
     * @param position the position
     */
    virtual void CurrentTimePosition(const bd::TimePosition& position) = 0;

    /** Picture-in-picture became available. Sent by PipAvailableEvent, PlayItemEvent,
     * PlayModeEvent. */
    virtual void PictureInPictureAvailable() = 0;

    /** Picture-in-picture became unavailable. Sent by PipUnavailableEvent, PlayItemEvent,
     * PlayModeEvent. */
    virtual void PictureInPictureUnavailable() = 0;

    /**
     * Secondary audio became available. Sent by SecondaryAudioAvailableEvent, PlayItemEvent,
     * PlayModeEvent.
     */
    virtual void SecondaryAudioAvailable() = 0;

    /**
     * Secondary audio became unavailable. Sent by SecondaryAudioUnavailableEvent, PlayItemEvent,
     * PlayModeEvent.
     */
    virtual void SecondaryAudioUnavailable() = 0;

    /**
     * Presentation graphics and text subtitles were switched on or off. Sent by
     * PresentationGraphicsDisplayEvent.
     *
     * @param shown whether they are shown
     */
    virtual void PresentationGraphicsDisplay(bool shown) = 0;

    /**
     * The secondary video was switched on or off. Sent by SecondaryVideoDisplayEvent and
     * SecondaryVideoInfoEvent.
     *
     * @param number its stream number
     * @param shown  whether it is shown
     */
    virtual void SecondaryVideoDisplay(bd::StreamNumberDef number, bool shown) = 0;

    /**
     * The secondary audio was switched on or off. Sent by SecondaryAudioDisplayEvent and
     * SecondaryAudioInfoEvent.
     *
     * @param number its stream number
     * @param shown  whether it is output
     */
    virtual void SecondaryAudioDisplay(bd::StreamNumberDef number, bool shown) = 0;

    /**
     * The picture-in-picture subtitle was selected or deselected. Sent by PipPgTextSelectEvent.
     *
     * @param pick whether the subtitle stream is taken from the picture-in-picture selection
     */
    virtual void PipPgTextSelect(bool pick) = 0;
};

} // namespace bdmv

#endif
