/**
 * @file
 * The playback context of a play list on a disc.
 */
#ifndef DESKPLAYER_NAVIGATOR_PLAYBACKCONTEXT_H
#define DESKPLAYER_NAVIGATOR_PLAYBACKCONTEXT_H

#include <cstddef>
#include <optional>
#include <utility>
#include <vector>

#include "bdmvnavigator/iplaybackcontext.h"
#include "navigator/playbackstate.h"
#include "navigator/playhead.h"

namespace deskplayer
{

/**
 * Answers every query from the play list and the state of playback.
 *
 * Positions are in 45 kHz ticks on the time line of the play list. Play items and marks are
 * numbered as in the play list, from 0, and chapters from 1.
 *
 * The navigator's thread changes the state only while no event is queued or being dispatched; the
 * delivering thread only reads it.
 */
class PlaybackContext final : public bdmv::IPlaybackContext
{
public:
    /** @param playhead and @p state must outlive the context */
    PlaybackContext(const Playhead& playhead, const PlaybackState& state)
        : m_rPlayhead(playhead), m_rState(state)
    {
    }

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

    /** The selected stream, from 1, and the number of streams of its kind; 0 and 0 for none. */
    typedef std::pair<bd::StreamNumberDef, bd::UInt8> NumberAndCount;

    NumberAndCount ChosenVideo() const;
    NumberAndCount ChosenAudio() const;
    NumberAndCount ChosenPg() const;
    NumberAndCount ChosenSecondaryVideo() const;
    NumberAndCount ChosenSecondaryAudio() const;
    NumberAndCount ChosenPipPg() const;
    NumberAndCount ChosenIg() const;
    NumberAndCount ChosenAngle() const;

    /** Stores the block that GetSystemResumeData() returns until CleanupSystemResumeData(). */
    void StoreSystemResumeData(std::vector<bd::UInt8> block);

    /** Whether a stream has its own time base instead of the play item's. */
    bool IsAsync(const Stream& stream) const;

private:
    static NumberAndCount Choose(bd::StreamNumberDef wanted, std::size_t count);
    const StreamTable& CurrentStreams() const { return m_rPlayhead.CurrentStreams(); }

    const Playhead& m_rPlayhead;
    const PlaybackState& m_rState;
    std::vector<bd::UInt8> m_SystemResumeData;
    bd::DataBlockDef m_SystemResumeBlock = {nullptr, 0};
};

} // namespace deskplayer

#endif
