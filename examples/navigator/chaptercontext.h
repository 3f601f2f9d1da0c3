/**
 * @file
 * The playback context of the navigator: what its events report.
 */
#ifndef EXAMPLES_NAVIGATOR_CHAPTERCONTEXT_H
#define EXAMPLES_NAVIGATOR_CHAPTERCONTEXT_H

#include "bdmvnavigator/iplaybackcontext.h"

/**
 * A play list with chapters, a video stream and two audio streams; the discs of this navigator have
 * nothing else. An output that is left alone keeps the preset of the event.
 */
class ChapterContext : public bdmv::IPlaybackContext
{
public:
    bd::ChapterNumberDef chapter = 1;
    bd::StreamNumberDef audio = 1;

    bd::PlayListIdDef GetPlayListId() override { return 1; }
    bd::ChapterNumberDef GetCurrentChapter() override { return chapter; }
    void GetAudioInfo(bd::StreamNumberDef* number, bd::UInt8* count) override
    {
        *number = audio;
        *count = 2;
    }
    void GetVideoInfo(bd::StreamNumberDef* number, bd::UInt8* count) override
    {
        *number = 1;
        *count = 1;
    }
    const bd::PlayMode& GetPlayMode() override { return m_PlayMode; }
    const bd::PlayMode& GetCurrentPlayMode() override { return m_PlayMode; }
    bdstreaming::FinishedReason GetFinishedReason() override
    {
        return bdstreaming::FinishedReasonEndOfMedia;
    }

    // What the discs of this navigator lack.
    const bd::DataBlockDef& GetSystemResumeData() override { return m_NoData; }
    void CleanupSystemResumeData() override {}
    bool IsPlayingAfterSystemResume() override { return false; }
    bd::PlayItemIdDef GetPlayItemId() override { return 0; }
    bd::TimePosition GetCurrentTimePosition() override { return 0; }
    bd::Trigger GetTrigger() override { return {bd::TRIGGER_NONE}; }
    bd::TimePosition GetTriggerReachedTime() override { return 0; }
    bd::TriggerType GetCurrentABRepeatState() override { return bd::TRIGGER_AB_NONE; }
    bd::TriggerType GetCurrentChpTitleRepeatState() override { return bd::TRIGGER_NONE; }
    bd::TriggerType GetTriggerTypeByTime(bd::TimePosition) override { return bd::TRIGGER_NONE; }
    bd::PlayListMarkIdDef GetCurrentPLMarkId(bd::TimePosition&) override { return 0; }
    void GetVideoAttributes(bd::VideoFormatType&, bd::VideoAspectRatioType&) override {}
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
    void GetExecuteButtonData(RefPtr&, bd::UInt32&, bd::ButtonId&) override {}
    bd::UserStyleNumber GetCurrentTextSubtitleStyleNumber() override { return 0; }
    bd::UInt8 GetNumberOfTextSubtitleStyles() override { return 0; }
    void GetZoomScaleInfo(bd::ZOOM_PARAM_Def&) override {}
    void IsAsyncPipInCurrentPlayItem(bool&, bool&, bool&, bool&) override {}

private:
    const bd::PlayMode m_PlayMode;
    const bd::DataBlockDef m_NoData = {nullptr, 0};
};

#endif
