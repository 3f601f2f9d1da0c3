#include "support/scriptableplaybackcontext.h"

#include "support/describe.h"

namespace bdmvtest
{

/** An output parameter and the value to write into it. */
template <typename Value> struct ScriptablePlaybackContext::Output {
    Value& target;
    const Value& value;
};

template <typename Value>
ScriptablePlaybackContext::Output<Value> ScriptablePlaybackContext::Out(Value& target,
                                                                        const Value& value)
{
    return {target, value};
}

/** Calls the action of the test first, which may change the answer. */
template <typename Value, typename... Arguments>
const Value& ScriptablePlaybackContext::Answer(const char* operation, const Value& value,
                                               const Arguments&... arguments)
{
    Enter(operation);
    if (m_pJournal != nullptr) {
        m_pJournal->Add("context." + DescribeCall(operation, arguments...) + " -> " +
                        Describe(value));
    }
    return value;
}

template <typename... Outputs>
void ScriptablePlaybackContext::Fill(const char* operation, Outputs... outputs)
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
Value ScriptablePlaybackContext::FillAndReturn(const char* operation, const Value& result,
                                               Outputs... outputs)
{
    Fill(operation, outputs...);
    if (m_pJournal != nullptr) {
        m_pJournal->Add("context." + std::string(operation) + " returned " + Describe(result));
    }
    return result;
}

void ScriptablePlaybackContext::Enter(const char* operation)
{
    if (onQuery) {
        onQuery(operation);
    }
}

ScriptablePlaybackContext::ScriptablePlaybackContext(Journal& journal) : m_pJournal(&journal) {}

const bd::DataBlockDef& ScriptablePlaybackContext::GetSystemResumeData()
{
    return Answer("GetSystemResumeData", systemResumeData);
}

void ScriptablePlaybackContext::CleanupSystemResumeData()
{
    Enter("CleanupSystemResumeData");
    if (m_pJournal != nullptr) {
        m_pJournal->Add("context.CleanupSystemResumeData()");
    }
}

bool ScriptablePlaybackContext::IsPlayingAfterSystemResume()
{
    return Answer("IsPlayingAfterSystemResume", playingAfterSystemResume);
}

bd::PlayListIdDef ScriptablePlaybackContext::GetPlayListId()
{
    return Answer("GetPlayListId", playListId);
}

bd::PlayItemIdDef ScriptablePlaybackContext::GetPlayItemId()
{
    return Answer("GetPlayItemId", playItemId);
}

const bd::PlayMode& ScriptablePlaybackContext::GetPlayMode()
{
    return Answer("GetPlayMode", playMode);
}

bd::Trigger ScriptablePlaybackContext::GetTrigger()
{
    return Answer("GetTrigger", trigger);
}

bd::TimePosition ScriptablePlaybackContext::GetTriggerReachedTime()
{
    return Answer("GetTriggerReachedTime", triggerReachedTime);
}

bd::TriggerType ScriptablePlaybackContext::GetCurrentABRepeatState()
{
    return Answer("GetCurrentABRepeatState", currentABRepeatState);
}

bd::TriggerType ScriptablePlaybackContext::GetCurrentChpTitleRepeatState()
{
    return Answer("GetCurrentChpTitleRepeatState", currentChpTitleRepeatState);
}

bd::TriggerType ScriptablePlaybackContext::GetTriggerTypeByTime(bd::TimePosition time)
{
    return Answer("GetTriggerTypeByTime", triggerTypeByTime, time);
}

bd::ChapterNumberDef ScriptablePlaybackContext::GetCurrentChapter()
{
    return Answer("GetCurrentChapter", currentChapter);
}

bd::PlayListMarkIdDef ScriptablePlaybackContext::GetCurrentPLMarkId(bd::TimePosition& time)
{
    return FillAndReturn("GetCurrentPLMarkId", currentPLMarkId, Out(time, currentPLMarkTime));
}

void ScriptablePlaybackContext::GetVideoInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    Fill("GetVideoInfo", Out(*number, video.number), Out(*count, video.count));
}

void ScriptablePlaybackContext::GetVideoAttributes(bd::VideoFormatType& format,
                                                   bd::VideoAspectRatioType& aspectRatio)
{
    Fill("GetVideoAttributes", Out(format, videoFormat), Out(aspectRatio, videoAspectRatio));
}

void ScriptablePlaybackContext::GetAudioInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    Fill("GetAudioInfo", Out(*number, audio.number), Out(*count, audio.count));
}

void ScriptablePlaybackContext::GetIgInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    Fill("GetIgInfo", Out(*number, ig.number), Out(*count, ig.count));
}

bdmv::IPlaybackContext::ErrCode
ScriptablePlaybackContext::rGetPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    return FillAndReturn("rGetPgTextStInfo", rPgTextStResult, Out(*number, rPgTextSt.number),
                         Out(*count, rPgTextSt.count));
}

void ScriptablePlaybackContext::GetPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    Fill("GetPgTextStInfo", Out(*number, pgTextSt.number), Out(*count, pgTextSt.count));
}

void ScriptablePlaybackContext::GetSecondaryVideoInfo(bd::StreamNumberDef* number, bd::UInt8* count,
                                                      bool* async)
{
    Fill("GetSecondaryVideoInfo", Out(*number, secondaryVideo.number),
         Out(*count, secondaryVideo.count), Out(*async, secondaryVideoAsync));
}

void ScriptablePlaybackContext::GetSecondaryAudioInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    Fill("GetSecondaryAudioInfo", Out(*number, secondaryAudio.number),
         Out(*count, secondaryAudio.count));
}

void ScriptablePlaybackContext::GetPipPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    Fill("GetPipPgTextStInfo", Out(*number, pipPgTextSt.number), Out(*count, pipPgTextSt.count));
}

void ScriptablePlaybackContext::GetAngleInfo(bd::AngleNumberDef* number, bd::UInt8* count)
{
    Fill("GetAngleInfo", Out(*number, angleNumber), Out(*count, angleCount));
}

bool ScriptablePlaybackContext::GetPgTextStDisplay()
{
    return Answer("GetPgTextStDisplay", pgTextStDisplay);
}

bool ScriptablePlaybackContext::GetSecondaryVideoDisplay()
{
    return Answer("GetSecondaryVideoDisplay", secondaryVideoDisplay);
}

bool ScriptablePlaybackContext::GetSecondaryAudioDisplay()
{
    return Answer("GetSecondaryAudioDisplay", secondaryAudioDisplay);
}

bool ScriptablePlaybackContext::GetPipPgTextStSelect()
{
    return Answer("GetPipPgTextStSelect", pipPgTextStSelect);
}

void ScriptablePlaybackContext::GetUOMask(bdmv::UOMaskTable& mask)
{
    Fill("GetUOMask", Out(mask, uoMask));
}

const bd::PlayMode& ScriptablePlaybackContext::GetCurrentPlayMode()
{
    return Answer("GetCurrentPlayMode", currentPlayMode);
}

bd::TimePosition ScriptablePlaybackContext::GetCurrentTimePosition()
{
    return Answer("GetCurrentTimePosition", currentTimePosition);
}

void ScriptablePlaybackContext::GetExecuteButtonData(RefPtr& program, bd::UInt32& ticket,
                                                     bd::ButtonId& buttonId)
{
    Fill("GetExecuteButtonData", Out(program, executeButtonProgram),
         Out(ticket, executeButtonTicket), Out(buttonId, executeButtonId));
}

bd::UserStyleNumber ScriptablePlaybackContext::GetCurrentTextSubtitleStyleNumber()
{
    return Answer("GetCurrentTextSubtitleStyleNumber", currentTextSubtitleStyleNumber);
}

bd::UInt8 ScriptablePlaybackContext::GetNumberOfTextSubtitleStyles()
{
    return Answer("GetNumberOfTextSubtitleStyles", numberOfTextSubtitleStyles);
}

bdstreaming::FinishedReason ScriptablePlaybackContext::GetFinishedReason()
{
    return Answer("GetFinishedReason", finishedReason);
}

void ScriptablePlaybackContext::GetZoomScaleInfo(bd::ZOOM_PARAM_Def& zoom)
{
    Fill("GetZoomScaleInfo", Out(zoom, zoomScaleInfo));
}

void ScriptablePlaybackContext::IsAsyncPipInCurrentPlayItem(bool& fg2ndVid, bool& fg2ndAud,
                                                            bool& fgPrev2ndVid, bool& fgPrev2ndAud)
{
    Fill("IsAsyncPipInCurrentPlayItem", Out(fg2ndVid, async2ndVid), Out(fg2ndAud, async2ndAud),
         Out(fgPrev2ndVid, prev2ndVid), Out(fgPrev2ndAud, prev2ndAud));
}

} // namespace bdmvtest
