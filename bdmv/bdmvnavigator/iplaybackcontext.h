/**
 * @file
 * The interface through which events read the playback in progress.
 */
#ifndef BDMVNAVIGATOR_IPLAYBACKCONTEXT_H
#define BDMVNAVIGATOR_IPLAYBACKCONTEXT_H

#include "bd/types.h"
#include "bdmvnavigator/inaverror.h"
#include "bdstreaming/types.h"
#include "database/iprogramdata.h"
#include "database/uomasktable.h"

namespace bdmv
{

/**
 * The navigator's record of the playback in progress, as far as events read it.
 *
 * Events call these operations on the dispatching thread while they are dispatched, never while the
 * lock of a listener list is held; events take no other lock. A context that another thread changes
 * meanwhile keeps each query consistent; events do not expect consistency across queries. Queries
 * are assumed to succeed.
 *
 * An operation with output parameters should write all of them. An output that it leaves unset
 * keeps its earlier value: the event's preset (0, false, empty, or no information, unless the
 * operation says otherwise) or, in the GetPgTextStInfo() call of PresentationGraphicsInfoEvent, the
 * value that rGetPgTextStInfo() wrote.
 *
 * The order of the operations is part of the binary interface.
 */
class IPlaybackContext : public INavError
{
public:
    typedef INavError::ErrCode ErrCode;  ///< what operations with output parameters return
    typedef IProgramData::RefPtr RefPtr; ///< shares the program of a button

    IPlaybackContext() = default;
    ~IPlaybackContext() override = default;
    IPlaybackContext(const IPlaybackContext&) = default;
    IPlaybackContext& operator=(const IPlaybackContext&) = default;

    /**
     * The block prepared for a system suspend.
     *
     * @return valid until CleanupSystemResumeData()
     */
    virtual const bd::DataBlockDef& GetSystemResumeData() = 0;

    /** Discards the system resume data. Called after the callbacks, even when there is no data. */
    virtual void CleanupSystemResumeData() = 0;

    /** Whether playback runs after the system resume. */
    virtual bool IsPlayingAfterSystemResume() = 0;

    /** The play list being played. */
    virtual bd::PlayListIdDef GetPlayListId() = 0;

    /** The play item being played. */
    virtual bd::PlayItemIdDef GetPlayItemId() = 0;

    /**
     * The play mode that is set, which is the requested one.
     *
     * @return valid until the event has copied or read it
     */
    virtual const bd::PlayMode& GetPlayMode() = 0;

    /** The trigger that is set. */
    virtual bd::Trigger GetTrigger() = 0;

    /** The time at which the trigger was reached. */
    virtual bd::TimePosition GetTriggerReachedTime() = 0;

    /** The A-B repeat state in force. */
    virtual bd::TriggerType GetCurrentABRepeatState() = 0;

    /** The chapter or title repeat state in force. */
    virtual bd::TriggerType GetCurrentChpTitleRepeatState() = 0;

    /** The kind of trigger at @p time. */
    virtual bd::TriggerType GetTriggerTypeByTime(bd::TimePosition time) = 0;

    /** The current chapter. */
    virtual bd::ChapterNumberDef GetCurrentChapter() = 0;

    /**
     * The current play list mark.
     *
     * @param[in,out] time receives the time of the mark; preset to bd::TimePositionNone
     */
    virtual bd::PlayListMarkIdDef GetCurrentPLMarkId(bd::TimePosition& time) = 0;

    /** The current primary video stream, and the number of primary video streams. */
    virtual void GetVideoInfo(bd::StreamNumberDef* number, bd::UInt8* count) = 0;

    /** Video format and aspect ratio of the primary video. */
    virtual void GetVideoAttributes(bd::VideoFormatType& format,
                                    bd::VideoAspectRatioType& aspectRatio) = 0;

    /** The current primary audio stream, and the number of primary audio streams. */
    virtual void GetAudioInfo(bd::StreamNumberDef* number, bd::UInt8* count) = 0;

    /** The current interactive graphics stream, and the number of them. */
    virtual void GetIgInfo(bd::StreamNumberDef* number, bd::UInt8* count) = 0;

    /**
     * As GetPgTextStInfo(), with a result.
     *
     * PresentationGraphicsInfoEvent calls it before GetPgTextStInfo(), with the same variables, so
     * an output that the latter does not write keeps the value written here.
     *
     * @return INavError::ErrNotAllowed suppresses the event
     */
    virtual ErrCode rGetPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count) = 0;

    /** The current presentation graphics or text subtitle stream, and the number of them. */
    virtual void GetPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count) = 0;

    /** The current secondary video stream, the number of them, and whether it plays asynchronously.
     */
    virtual void GetSecondaryVideoInfo(bd::StreamNumberDef* number, bd::UInt8* count,
                                       bool* async) = 0;

    /** The current secondary audio stream, and the number of them. */
    virtual void GetSecondaryAudioInfo(bd::StreamNumberDef* number, bd::UInt8* count) = 0;

    /** The current picture-in-picture subtitle stream, and the number of them. */
    virtual void GetPipPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count) = 0;

    /** The current angle, and the number of angles. */
    virtual void GetAngleInfo(bd::AngleNumberDef* number, bd::UInt8* count) = 0;

    /** Whether presentation graphics and text subtitles are shown. */
    virtual bool GetPgTextStDisplay() = 0;

    /** Whether the secondary video is shown. */
    virtual bool GetSecondaryVideoDisplay() = 0;

    /** Whether the secondary audio is output. */
    virtual bool GetSecondaryAudioDisplay() = 0;

    /** Whether the subtitle stream is taken from the picture-in-picture selection. */
    virtual bool GetPipPgTextStSelect() = 0;

    /**
     * The user operation mask now in force.
     *
     * @param[in,out] mask preset to nothing forbidden
     */
    virtual void GetUOMask(UOMaskTable& mask) = 0;

    /**
     * The current play mode; may differ from GetPlayMode().
     *
     * @return valid until the event has copied or read it
     */
    virtual const bd::PlayMode& GetCurrentPlayMode() = 0;

    /** The current playback position. */
    virtual bd::TimePosition GetCurrentTimePosition() = 0;

    /**
     * The pending button execution.
     *
     * @param[in,out] program  receives a counted reference; preset to empty
     * @param[in,out] ticket   preset to 0
     * @param[in,out] buttonId preset to 0
     */
    virtual void GetExecuteButtonData(RefPtr& program, bd::UInt32& ticket,
                                      bd::ButtonId& buttonId) = 0;

    /** The text subtitle user style in use. */
    virtual bd::UserStyleNumber GetCurrentTextSubtitleStyleNumber() = 0;

    /** The number of text subtitle user styles. */
    virtual bd::UInt8 GetNumberOfTextSubtitleStyles() = 0;

    /** Why playback finished. */
    virtual bdstreaming::FinishedReason GetFinishedReason() = 0;

    /** The zoom parameters in force. */
    virtual void GetZoomScaleInfo(bd::ZOOM_PARAM_Def& zoom) = 0;

    /**
     * Which secondary streams play asynchronously. All flags are preset to false.
     *
     * @param[in,out] fg2ndVid     the current play item has an asynchronous secondary video
     * @param[in,out] fg2ndAud     the current play item has an asynchronous secondary audio
     * @param[in,out] fgPrev2ndVid the previous play item had a secondary video
     * @param[in,out] fgPrev2ndAud the previous play item had a secondary audio
     */
    virtual void IsAsyncPipInCurrentPlayItem(bool& fg2ndVid, bool& fg2ndAud, bool& fgPrev2ndVid,
                                             bool& fgPrev2ndAud) = 0;
};

} // namespace bdmv

#endif
