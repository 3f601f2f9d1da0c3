/**
 * @file
 * The playback context over a play list of a disc.
 */
#ifndef DESKPLAYER_NAVIGATOR_PLAYBACKCONTEXT_H
#define DESKPLAYER_NAVIGATOR_PLAYBACKCONTEXT_H

#include <cstddef>
#include <optional>
#include <vector>

#include "bdmvnavigator/iplaybackcontext.h"
#include "navigator/loadedplaylist.h"

namespace deskplayer
{

/** What changes while a play list plays. Stream, angle and style numbers count from 1; 0 is none.
 */
struct PlaybackState {
    std::uint64_t position = 0; ///< on the time line of the play list, in ticks of 45 kHz
    std::size_t item = 0;       ///< the play item in playback
    std::optional<std::size_t> previousItem; ///< the one that was in playback before

    bd::PlayMode playMode;        ///< what was asked for
    bd::PlayMode currentPlayMode; ///< what playback does

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

    std::optional<std::size_t> mark; ///< index of the mark passed last

    bd::TriggerType trigger = bd::TRIGGER_NONE;
    bd::TimePosition triggerReachedTime = 0;
    bd::TriggerType abRepeat = bd::TRIGGER_AB_NONE;
    bd::TriggerType chapterTitleRepeat = bd::TRIGGER_NONE;

    bd::ZOOM_PARAM_Def zoom = {};
    bdstreaming::FinishedReason finishedReason = bdstreaming::FinishedReasonEndOfMedia;
    bool playingAfterSystemResume = false;
};

/**
 * Answers every query from the play list and from the state of playback.
 *
 * Reports positions in ticks of 45 kHz on the time line of the play list, play items and marks by
 * their number in the play list, from 0, and chapters from 1.
 *
 * The navigator's thread changes the state while no event is on its way; the delivering thread only
 * reads it.
 */
class PlaybackContext : public bdmv::IPlaybackContext
{
public:
    explicit PlaybackContext(LoadedPlayList playList);
    ~PlaybackContext() override = default;
    PlaybackContext(const PlaybackContext&) = delete;
    PlaybackContext& operator=(const PlaybackContext&) = delete;

    const bd::DataBlockDef& GetSystemResumeData() override;
    void CleanupSystemResumeData() override;
    bool IsPlayingAfterSystemResume() override;
    bd::PlayListIdDef GetPlayListId() override;
    bd::PlayItemIdDef GetPlayItemId() override;
    const bd::PlayMode& GetPlayMode() override;
    bd::Trigger GetTrigger() override;
    bd::TimePosition GetTriggerReachedTime() override;
    bd::TriggerType GetCurrentABRepeatState() override;
    bd::TriggerType GetCurrentChpTitleRepeatState() override;
    bd::TriggerType GetTriggerTypeByTime(bd::TimePosition time) override;
    bd::ChapterNumberDef GetCurrentChapter() override;
    bd::PlayListMarkIdDef GetCurrentPLMarkId(bd::TimePosition& time) override;
    void GetVideoInfo(bd::StreamNumberDef* number, bd::UInt8* count) override;
    void GetVideoAttributes(bd::VideoFormatType& format,
                            bd::VideoAspectRatioType& aspectRatio) override;
    void GetAudioInfo(bd::StreamNumberDef* number, bd::UInt8* count) override;
    void GetIgInfo(bd::StreamNumberDef* number, bd::UInt8* count) override;
    ErrCode rGetPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count) override;
    void GetPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count) override;
    void GetSecondaryVideoInfo(bd::StreamNumberDef* number, bd::UInt8* count, bool* async) override;
    void GetSecondaryAudioInfo(bd::StreamNumberDef* number, bd::UInt8* count) override;
    void GetPipPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count) override;
    void GetAngleInfo(bd::AngleNumberDef* number, bd::UInt8* count) override;
    bool GetPgTextStDisplay() override;
    bool GetSecondaryVideoDisplay() override;
    bool GetSecondaryAudioDisplay() override;
    bool GetPipPgTextStSelect() override;
    void GetUOMask(bdmv::UOMaskTable& mask) override;
    const bd::PlayMode& GetCurrentPlayMode() override;
    bd::TimePosition GetCurrentTimePosition() override;
    void GetExecuteButtonData(RefPtr& program, bd::UInt32& ticket, bd::ButtonId& buttonId) override;
    bd::UserStyleNumber GetCurrentTextSubtitleStyleNumber() override;
    bd::UInt8 GetNumberOfTextSubtitleStyles() override;
    bdstreaming::FinishedReason GetFinishedReason() override;
    void GetZoomScaleInfo(bd::ZOOM_PARAM_Def& zoom) override;
    void IsAsyncPipInCurrentPlayItem(bool& fg2ndVid, bool& fg2ndAud, bool& fgPrev2ndVid,
                                     bool& fgPrev2ndAud) override;

protected:
    const LoadedPlayList& PlayListInPlayback() const { return m_PlayList; }

    /** The play item in playback; null while there is none. */
    const PlayItem* CurrentItem() const;

    /** The streams of the play item in playback; none while there is none. */
    const StreamTable& CurrentStreams() const;

    PlaybackState& State() { return m_State; }
    const PlaybackState& State() const { return m_State; }

    std::vector<bd::UInt8> m_SystemResumeData;

private:
    bool IsAsync(const Stream& stream) const;

    const LoadedPlayList m_PlayList;
    PlaybackState m_State;
    bd::DataBlockDef m_SystemResumeBlock = {nullptr, 0};
};

} // namespace deskplayer

#endif
