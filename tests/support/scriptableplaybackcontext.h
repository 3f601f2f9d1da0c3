/**
 * @file
 * A playback context that answers with the values that a test has set.
 *
 * Entries in the journal: the operation, the values of its output parameters at the call, and its
 * answer:
 *
 *     context.GetPlayListId() -> 800
 *     context.GetAudioInfo(0, 0) -> 2, 3
 *     context.GetAudioInfo(0, 0) -> untouched
 *     context.GetCurrentPLMarkId(18446744073709551615) -> 27000
 *     context.GetCurrentPLMarkId returned 5
 */
#ifndef SUPPORT_SCRIPTABLEPLAYBACKCONTEXT_H
#define SUPPORT_SCRIPTABLEPLAYBACKCONTEXT_H

#include <functional>
#include <set>
#include <string>

#include "bdmvnavigator/iplaybackcontext.h"
#include "support/journal.h"

namespace bdmvtest
{

/** Answers from public fields, one for every value that an operation returns. */
class ScriptablePlaybackContext : public bdmv::IPlaybackContext
{
public:
    /** The selected stream, and the number of streams of its kind. */
    struct Stream {
        bd::StreamNumberDef number = 0;
        bd::UInt8 count = 0;
    };

    /** @param journal receives the entries; must outlive the context */
    explicit ScriptablePlaybackContext(Journal& journal);

    /** Without a journal, it answers without allocating, and to several threads at once. */
    ScriptablePlaybackContext() = default;

    bd::DataBlockDef systemResumeData = {nullptr, 0};
    bool playingAfterSystemResume = false;
    bd::PlayListIdDef playListId = 0;
    bd::PlayItemIdDef playItemId = 0;
    bd::PlayMode playMode;
    bd::PlayMode currentPlayMode;
    bd::Trigger trigger = {bd::TRIGGER_NONE};
    bd::TimePosition triggerReachedTime = 0;
    bd::TriggerType currentABRepeatState = bd::TRIGGER_AB_NONE;
    bd::TriggerType currentChpTitleRepeatState = bd::TRIGGER_NONE;
    bd::TriggerType triggerTypeByTime = bd::TRIGGER_NONE;
    bd::ChapterNumberDef currentChapter = 0;
    bd::PlayListMarkIdDef currentPLMarkId = 0;
    bd::TimePosition currentPLMarkTime = 0;
    bd::VideoFormatType videoFormat = bd::VideoFormatType1080p;
    bd::VideoAspectRatioType videoAspectRatio = bd::VideoAspectRatioType16x9;
    Stream video;
    Stream audio;
    Stream ig;
    Stream rPgTextSt; ///< what rGetPgTextStInfo() writes
    ErrCode rPgTextStResult = ErrOk;
    Stream pgTextSt;
    Stream secondaryVideo;
    bool secondaryVideoAsync = false;
    Stream secondaryAudio;
    Stream pipPgTextSt;
    bd::AngleNumberDef angleNumber = 0;
    bd::UInt8 angleCount = 0;
    bool pgTextStDisplay = false;
    bool secondaryVideoDisplay = false;
    bool secondaryAudioDisplay = false;
    bool pipPgTextStSelect = false;
    bdmv::UOMaskTable uoMask;
    bd::TimePosition currentTimePosition = 0;
    RefPtr executeButtonProgram;
    bd::UInt32 executeButtonTicket = 0;
    bd::ButtonId executeButtonId = 0;
    bd::UserStyleNumber currentTextSubtitleStyleNumber = 0;
    bd::UInt8 numberOfTextSubtitleStyles = 0;
    bdstreaming::FinishedReason finishedReason = bdstreaming::FinishedReasonEndOfMedia;
    bd::ZOOM_PARAM_Def zoomScaleInfo = {};
    bool async2ndVid = false;
    bool async2ndAud = false;
    bool prev2ndVid = false;
    bool prev2ndAud = false;

    /** Operations that do not write their output parameters. */
    std::set<std::string> untouched;

    /** Called with the name of an operation before it answers. */
    std::function<void(const std::string& operation)> onQuery;

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

private:
    template <typename Value> struct Output;
    template <typename Value> static Output<Value> Out(Value& target, const Value& value);
    template <typename Value, typename... Arguments>
    const Value& Answer(const char* operation, const Value& value, const Arguments&... arguments);
    template <typename... Outputs> void Fill(const char* operation, Outputs... outputs);
    template <typename Value, typename... Outputs>
    Value FillAndReturn(const char* operation, const Value& result, Outputs... outputs);
    void Enter(const char* operation);

    Journal* m_pJournal = nullptr;
};

} // namespace bdmvtest

#endif
