/**
 * @file
 * A playback context that answers with the values that a test has set.
 *
 * @code
 * bdmvtest::ScriptablePlaybackContext context;
 * context.playListId = 800;
 * context.onQuery = [](const std::string& operation) { ... };
 * bdmv::PlaylistEvent event(context);
 * @endcode
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
#ifndef TESTKIT_SCRIPTABLEPLAYBACKCONTEXT_H
#define TESTKIT_SCRIPTABLEPLAYBACKCONTEXT_H

#include <functional>
#include <set>
#include <string>

#include "bdmvnavigator/iplaybackcontext.h"
#include "testkit/describe.h"
#include "testkit/journal.h"

namespace bdmvtest
{

/** Answers from public fields, one for every value that an operation returns. */
class ScriptablePlaybackContext : public bdmv::IPlaybackContext
{
public:
    /** The selected stream, and the number of streams of its kind. */
    struct Stream {
        bd::StreamNumberDef number = 0; ///< of the selected stream
        bd::UInt8 count = 0;            ///< of streams of its kind
    };

    /** @param journal receives the entries; must outlive the context */
    explicit ScriptablePlaybackContext(Journal& journal) : m_pJournal(&journal) {}

    /** Without a journal, it answers without allocating, and to several threads at once. */
    ScriptablePlaybackContext() = default;

    /** @{ */
    /** Named for the operation that returns or writes it. */
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
    Stream rPgTextSt; // what rGetPgTextStInfo() writes
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
    /** @} */

    /** Operations that do not write their output parameters. */
    std::set<std::string> untouched;

    /** Called with the name of an operation before it answers. */
    std::function<void(const std::string& operation)> onQuery;

    const bd::DataBlockDef& GetSystemResumeData() override
    {
        return Answer("GetSystemResumeData", systemResumeData);
    }
    void CleanupSystemResumeData() override
    {
        Enter("CleanupSystemResumeData");
        if (m_pJournal != nullptr) {
            m_pJournal->Add("context.CleanupSystemResumeData()");
        }
    }
    bool IsPlayingAfterSystemResume() override
    {
        return Answer("IsPlayingAfterSystemResume", playingAfterSystemResume);
    }
    bd::PlayListIdDef GetPlayListId() override { return Answer("GetPlayListId", playListId); }
    bd::PlayItemIdDef GetPlayItemId() override { return Answer("GetPlayItemId", playItemId); }
    const bd::PlayMode& GetPlayMode() override { return Answer("GetPlayMode", playMode); }
    bd::Trigger GetTrigger() override { return Answer("GetTrigger", trigger); }
    bd::TimePosition GetTriggerReachedTime() override
    {
        return Answer("GetTriggerReachedTime", triggerReachedTime);
    }
    bd::TriggerType GetCurrentABRepeatState() override
    {
        return Answer("GetCurrentABRepeatState", currentABRepeatState);
    }
    bd::TriggerType GetCurrentChpTitleRepeatState() override
    {
        return Answer("GetCurrentChpTitleRepeatState", currentChpTitleRepeatState);
    }
    bd::TriggerType GetTriggerTypeByTime(bd::TimePosition time) override
    {
        return Answer("GetTriggerTypeByTime", triggerTypeByTime, time);
    }
    bd::ChapterNumberDef GetCurrentChapter() override
    {
        return Answer("GetCurrentChapter", currentChapter);
    }
    bd::PlayListMarkIdDef GetCurrentPLMarkId(bd::TimePosition& time) override
    {
        return FillAndReturn("GetCurrentPLMarkId", currentPLMarkId, Out(time, currentPLMarkTime));
    }
    void GetVideoInfo(bd::StreamNumberDef* number, bd::UInt8* count) override
    {
        Fill("GetVideoInfo", Out(*number, video.number), Out(*count, video.count));
    }
    void GetVideoAttributes(bd::VideoFormatType& format,
                            bd::VideoAspectRatioType& aspectRatio) override
    {
        Fill("GetVideoAttributes", Out(format, videoFormat), Out(aspectRatio, videoAspectRatio));
    }
    void GetAudioInfo(bd::StreamNumberDef* number, bd::UInt8* count) override
    {
        Fill("GetAudioInfo", Out(*number, audio.number), Out(*count, audio.count));
    }
    void GetIgInfo(bd::StreamNumberDef* number, bd::UInt8* count) override
    {
        Fill("GetIgInfo", Out(*number, ig.number), Out(*count, ig.count));
    }
    ErrCode rGetPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count) override
    {
        return FillAndReturn("rGetPgTextStInfo", rPgTextStResult, Out(*number, rPgTextSt.number),
                             Out(*count, rPgTextSt.count));
    }
    void GetPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count) override
    {
        Fill("GetPgTextStInfo", Out(*number, pgTextSt.number), Out(*count, pgTextSt.count));
    }
    void GetSecondaryVideoInfo(bd::StreamNumberDef* number, bd::UInt8* count, bool* async) override
    {
        Fill("GetSecondaryVideoInfo", Out(*number, secondaryVideo.number),
             Out(*count, secondaryVideo.count), Out(*async, secondaryVideoAsync));
    }
    void GetSecondaryAudioInfo(bd::StreamNumberDef* number, bd::UInt8* count) override
    {
        Fill("GetSecondaryAudioInfo", Out(*number, secondaryAudio.number),
             Out(*count, secondaryAudio.count));
    }
    void GetPipPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count) override
    {
        Fill("GetPipPgTextStInfo", Out(*number, pipPgTextSt.number),
             Out(*count, pipPgTextSt.count));
    }
    void GetAngleInfo(bd::AngleNumberDef* number, bd::UInt8* count) override
    {
        Fill("GetAngleInfo", Out(*number, angleNumber), Out(*count, angleCount));
    }
    bool GetPgTextStDisplay() override { return Answer("GetPgTextStDisplay", pgTextStDisplay); }
    bool GetSecondaryVideoDisplay() override
    {
        return Answer("GetSecondaryVideoDisplay", secondaryVideoDisplay);
    }
    bool GetSecondaryAudioDisplay() override
    {
        return Answer("GetSecondaryAudioDisplay", secondaryAudioDisplay);
    }
    bool GetPipPgTextStSelect() override
    {
        return Answer("GetPipPgTextStSelect", pipPgTextStSelect);
    }
    void GetUOMask(bdmv::UOMaskTable& mask) override { Fill("GetUOMask", Out(mask, uoMask)); }
    const bd::PlayMode& GetCurrentPlayMode() override
    {
        return Answer("GetCurrentPlayMode", currentPlayMode);
    }
    bd::TimePosition GetCurrentTimePosition() override
    {
        return Answer("GetCurrentTimePosition", currentTimePosition);
    }
    void GetExecuteButtonData(RefPtr& program, bd::UInt32& ticket, bd::ButtonId& buttonId) override
    {
        Fill("GetExecuteButtonData", Out(program, executeButtonProgram),
             Out(ticket, executeButtonTicket), Out(buttonId, executeButtonId));
    }
    bd::UserStyleNumber GetCurrentTextSubtitleStyleNumber() override
    {
        return Answer("GetCurrentTextSubtitleStyleNumber", currentTextSubtitleStyleNumber);
    }
    bd::UInt8 GetNumberOfTextSubtitleStyles() override
    {
        return Answer("GetNumberOfTextSubtitleStyles", numberOfTextSubtitleStyles);
    }
    bdstreaming::FinishedReason GetFinishedReason() override
    {
        return Answer("GetFinishedReason", finishedReason);
    }
    void GetZoomScaleInfo(bd::ZOOM_PARAM_Def& zoom) override
    {
        Fill("GetZoomScaleInfo", Out(zoom, zoomScaleInfo));
    }
    void IsAsyncPipInCurrentPlayItem(bool& fg2ndVid, bool& fg2ndAud, bool& fgPrev2ndVid,
                                     bool& fgPrev2ndAud) override
    {
        Fill("IsAsyncPipInCurrentPlayItem", Out(fg2ndVid, async2ndVid), Out(fg2ndAud, async2ndAud),
             Out(fgPrev2ndVid, prev2ndVid), Out(fgPrev2ndAud, prev2ndAud));
    }

private:
    /** An output parameter and the value to write into it. */
    template <typename Value> struct Output {
        Value& target;
        const Value& value;
    };

    template <typename Value> static Output<Value> Out(Value& target, const Value& value)
    {
        return {target, value};
    }

    /** Calls the action of the test first, which may change the answer. */
    template <typename Value, typename... Arguments>
    const Value& Answer(const char* operation, const Value& value, const Arguments&... arguments)
    {
        Enter(operation);
        if (m_pJournal != nullptr) {
            m_pJournal->Add("context." + DescribeCall(operation, arguments...) + " -> " +
                            Describe(value));
        }
        return value;
    }

    template <typename... Outputs> void Fill(const char* operation, Outputs... outputs)
    {
        Enter(operation);
        const bool touches = untouched.empty() || untouched.count(operation) == 0;
        std::string call;
        if (m_pJournal != nullptr) {
            call = "context." + DescribeCall(operation, outputs.target...) + " -> ";
        }
        if (touches) {
            ((outputs.target = outputs.value), ...);
        }
        if (m_pJournal != nullptr) {
            m_pJournal->Add(call + (touches ? DescribeAll(outputs.target...) : "untouched"));
        }
    }

    template <typename Value, typename... Outputs>
    Value FillAndReturn(const char* operation, const Value& result, Outputs... outputs)
    {
        Fill(operation, outputs...);
        if (m_pJournal != nullptr) {
            m_pJournal->Add("context." + std::string(operation) + " returned " + Describe(result));
        }
        return result;
    }

    void Enter(const char* operation)
    {
        if (onQuery) {
            onQuery(operation);
        }
    }

    Journal* m_pJournal = nullptr;
};

} // namespace bdmvtest

#endif
