/**
 * @file
 * A playback context that answers immediately.
 */
#ifndef BENCH_CONTEXT_H
#define BENCH_CONTEXT_H

#include "bdmvnavigator/iplaybackcontext.h"
#include "listener.h"

namespace bench
{

/** Answers the queries of the measured events, and ignores all others. */
class Context final : public bdmv::IPlaybackContext
{
public:
    // The queries of the measured events. They are defined in a separate source, so that no caller
    // can inline them.
    bd::PlayListIdDef GetPlayListId() override;
    bd::PlayItemIdDef GetPlayItemId() override;
    bd::TimePosition GetCurrentTimePosition() override;
    void GetVideoAttributes(bd::VideoFormatType& format,
                            bd::VideoAspectRatioType& aspectRatio) override;
    void IsAsyncPipInCurrentPlayItem(bool& fg2ndVid, bool& fg2ndAud, bool& fgPrev2ndVid,
                                     bool& fgPrev2ndAud) override;

    const bd::DataBlockDef& GetSystemResumeData() override { return m_ResumeData; }
    void CleanupSystemResumeData() override {}
    bool IsPlayingAfterSystemResume() override { return false; }
    const bd::PlayMode& GetPlayMode() override { return m_PlayMode; }
    bd::Trigger GetTrigger() override { return {bd::TRIGGER_NONE}; }
    bd::TimePosition GetTriggerReachedTime() override { return 0; }
    bd::TriggerType GetCurrentABRepeatState() override { return bd::TRIGGER_AB_NONE; }
    bd::TriggerType GetCurrentChpTitleRepeatState() override { return bd::TRIGGER_NONE; }
    bd::TriggerType GetTriggerTypeByTime(bd::TimePosition) override { return bd::TRIGGER_NONE; }
    bd::ChapterNumberDef GetCurrentChapter() override { return 0; }
    bd::PlayListMarkIdDef GetCurrentPLMarkId(bd::TimePosition&) override { return 0; }
    void GetVideoInfo(bd::StreamNumberDef*, bd::UInt8*) override {}
    void GetAudioInfo(bd::StreamNumberDef*, bd::UInt8*) override {}
    void GetIgInfo(bd::StreamNumberDef*, bd::UInt8*) override {}
    ErrCode rGetPgTextStInfo(bd::StreamNumberDef*, bd::UInt8*) override { return ErrOk; }
    void GetPgTextStInfo(bd::StreamNumberDef*, bd::UInt8*) override {}
    void GetSecondaryVideoInfo(bd::StreamNumberDef*, bd::UInt8*, bool*) override {}
    void GetSecondaryAudioInfo(bd::StreamNumberDef*, bd::UInt8*) override {}
    void GetPipPgTextStInfo(bd::StreamNumberDef*, bd::UInt8*) override {}
    void GetAngleInfo(bd::AngleNumberDef*, bd::UInt8*) override {}
    bool GetPgTextStDisplay() override { return false; }
    bool GetSecondaryVideoDisplay() override { return false; }
    bool GetSecondaryAudioDisplay() override { return false; }
    bool GetPipPgTextStSelect() override { return false; }
    void GetUOMask(bdmv::UOMaskTable&) override {}
    const bd::PlayMode& GetCurrentPlayMode() override { return m_PlayMode; }
    void GetExecuteButtonData(RefPtr&, bd::UInt32&, bd::ButtonId&) override {}
    bd::UserStyleNumber GetCurrentTextSubtitleStyleNumber() override { return 0; }
    bd::UInt8 GetNumberOfTextSubtitleStyles() override { return 0; }
    bdstreaming::FinishedReason GetFinishedReason() override
    {
        return bdstreaming::FinishedReasonEndOfMedia;
    }
    void GetZoomScaleInfo(bd::ZOOM_PARAM_Def&) override {}

private:
    bd::DataBlockDef m_ResumeData = {nullptr, 0};
    bd::PlayMode m_PlayMode;
};

} // namespace bench

#endif
