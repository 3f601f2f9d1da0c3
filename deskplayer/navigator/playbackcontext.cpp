#include "navigator/playbackcontext.h"

#include <algorithm>
#include <utility>

#include "bd/constants.h"
#include "disc/codes.h"

namespace deskplayer
{

namespace
{

const StreamTable NoStreams;

/** User styles that a text subtitle stream is taken to have: its own file would tell. */
constexpr bd::UInt8 TextSubtitleStyles = 4;

bool IsTextSubtitle(const Stream& stream)
{
    return KindOfStream(stream.attributes.codingType) == StreamKind::StreamKindTextSubtitle;
}

/** Writes how many streams there are, and the wanted one of them, or the last when it is not there.
 */
void Select(const std::vector<Stream>& streams, bd::StreamNumberDef wanted,
            bd::StreamNumberDef* number, bd::UInt8* count)
{
    *count = static_cast<bd::UInt8>(streams.size());
    *number = std::min<bd::StreamNumberDef>(wanted, *count);
}

} // namespace

PlaybackContext::PlaybackContext(LoadedPlayList playList) : m_PlayList(std::move(playList)) {}

const bd::DataBlockDef& PlaybackContext::GetSystemResumeData()
{
    m_SystemResumeBlock.pData = m_SystemResumeData.data();
    m_SystemResumeBlock.size = static_cast<bd::UInt32>(m_SystemResumeData.size());
    return m_SystemResumeBlock;
}

void PlaybackContext::CleanupSystemResumeData()
{
    m_SystemResumeData.clear();
}

bool PlaybackContext::IsPlayingAfterSystemResume()
{
    return m_State.playingAfterSystemResume;
}

bd::PlayListIdDef PlaybackContext::GetPlayListId()
{
    return m_PlayList.number;
}

bd::PlayItemIdDef PlaybackContext::GetPlayItemId()
{
    return static_cast<bd::PlayItemIdDef>(m_State.item);
}

const bd::PlayMode& PlaybackContext::GetPlayMode()
{
    return m_State.playMode;
}

bd::Trigger PlaybackContext::GetTrigger()
{
    return {m_State.trigger};
}

bd::TimePosition PlaybackContext::GetTriggerReachedTime()
{
    return m_State.triggerReachedTime;
}

bd::TriggerType PlaybackContext::GetCurrentABRepeatState()
{
    return m_State.abRepeat;
}

bd::TriggerType PlaybackContext::GetCurrentChpTitleRepeatState()
{
    return m_State.chapterTitleRepeat;
}

bd::TriggerType PlaybackContext::GetTriggerTypeByTime(bd::TimePosition time)
{
    return time == m_State.triggerReachedTime ? m_State.trigger : bd::TRIGGER_INVALID;
}

bd::ChapterNumberDef PlaybackContext::GetCurrentChapter()
{
    bd::ChapterNumberDef number = 0;
    for (const Chapter& chapter : m_PlayList.timeLine.chapters) {
        if (chapter.start <= m_State.position) {
            number = static_cast<bd::ChapterNumberDef>(chapter.number);
        }
    }
    return number;
}

bd::PlayListMarkIdDef PlaybackContext::GetCurrentPLMarkId(bd::TimePosition& time)
{
    if (!m_State.mark) {
        return 0;
    }
    time = m_PlayList.timeLine.markPositions[*m_State.mark].value_or(bd::TimePositionNone);
    return static_cast<bd::PlayListMarkIdDef>(*m_State.mark);
}

void PlaybackContext::GetVideoInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    Select(CurrentStreams().primaryVideo, m_State.video, number, count);
}

void PlaybackContext::GetVideoAttributes(bd::VideoFormatType& format,
                                         bd::VideoAspectRatioType& aspectRatio)
{
    format = bd::VideoFormatTypeNoInfo;
    aspectRatio = bd::VideoAspectRatioTypeNoInfo;
    const std::vector<Stream>& videos = CurrentStreams().primaryVideo;
    if (!videos.empty()) {
        // Both are numbered as on the disc; a number without a name travels as it is.
        format = static_cast<bd::VideoFormatType>(videos.front().attributes.videoFormat);
        if (const std::optional<std::uint8_t> code = m_PlayList.aspectRatios[m_State.item]) {
            aspectRatio = static_cast<bd::VideoAspectRatioType>(*code);
        }
    }
}

void PlaybackContext::GetAudioInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    Select(CurrentStreams().primaryAudio, m_State.audio, number, count);
}

void PlaybackContext::GetIgInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    Select(CurrentStreams().ig, m_State.ig, number, count);
}

bdmv::IPlaybackContext::ErrCode PlaybackContext::rGetPgTextStInfo(bd::StreamNumberDef* number,
                                                                  bd::UInt8* count)
{
    Select(CurrentStreams().pg, m_State.pg, number, count);
    return *count == 0 ? ErrNotAllowed : ErrOk;
}

void PlaybackContext::GetPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    Select(CurrentStreams().pg, m_State.pg, number, count);
}

void PlaybackContext::GetSecondaryVideoInfo(bd::StreamNumberDef* number, bd::UInt8* count,
                                            bool* async)
{
    const std::vector<Stream>& streams = CurrentStreams().secondaryVideo;
    Select(streams, m_State.secondaryVideo, number, count);
    *async = *number != 0 && IsAsync(streams[*number - 1U]);
}

void PlaybackContext::GetSecondaryAudioInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    Select(CurrentStreams().secondaryAudio, m_State.secondaryAudio, number, count);
}

void PlaybackContext::GetPipPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    Select(CurrentStreams().pipPg, m_State.pipPg, number, count);
}

void PlaybackContext::GetAngleInfo(bd::AngleNumberDef* number, bd::UInt8* count)
{
    const PlayItem* const item = CurrentItem();
    *count = item == nullptr ? 0 : static_cast<bd::UInt8>(1 + item->furtherAngles.size());
    *number = m_State.angle <= *count ? m_State.angle : *count;
}

bool PlaybackContext::GetPgTextStDisplay()
{
    return m_State.pgShown;
}

bool PlaybackContext::GetSecondaryVideoDisplay()
{
    return m_State.secondaryVideoShown;
}

bool PlaybackContext::GetSecondaryAudioDisplay()
{
    return m_State.secondaryAudioShown;
}

bool PlaybackContext::GetPipPgTextStSelect()
{
    return m_State.pipPgPicked;
}

void PlaybackContext::GetUOMask(bdmv::UOMaskTable& mask)
{
    mask = bdmv::UOMaskTable(m_PlayList.playList.applicationInfo.uoMask);
    if (const PlayItem* const item = CurrentItem()) {
        mask |= bdmv::UOMaskTable(item->uoMask);
    }
}

const bd::PlayMode& PlaybackContext::GetCurrentPlayMode()
{
    return m_State.currentPlayMode;
}

bd::TimePosition PlaybackContext::GetCurrentTimePosition()
{
    return m_State.position;
}

void PlaybackContext::GetExecuteButtonData(RefPtr& /*program*/, bd::UInt32& /*ticket*/,
                                           bd::ButtonId& /*buttonId*/)
{
    // No button is waiting to be executed: what the event preset says so.
}

bd::UserStyleNumber PlaybackContext::GetCurrentTextSubtitleStyleNumber()
{
    return m_State.style;
}

bd::UInt8 PlaybackContext::GetNumberOfTextSubtitleStyles()
{
    const std::vector<Stream>& streams = CurrentStreams().pg;
    const bool any = std::any_of(streams.begin(), streams.end(), IsTextSubtitle);
    return any ? TextSubtitleStyles : 0;
}

bdstreaming::FinishedReason PlaybackContext::GetFinishedReason()
{
    return m_State.finishedReason;
}

void PlaybackContext::GetZoomScaleInfo(bd::ZOOM_PARAM_Def& zoom)
{
    zoom = m_State.zoom;
}

void PlaybackContext::IsAsyncPipInCurrentPlayItem(bool& fg2ndVid, bool& fg2ndAud,
                                                  bool& fgPrev2ndVid, bool& fgPrev2ndAud)
{
    const auto anyAsync = [this](const std::vector<Stream>& streams) {
        return std::any_of(streams.begin(), streams.end(),
                           [this](const Stream& stream) { return IsAsync(stream); });
    };
    const StreamTable& streams = CurrentStreams();
    fg2ndVid = anyAsync(streams.secondaryVideo);
    fg2ndAud = anyAsync(streams.secondaryAudio);

    // What the previous play item offered becomes unavailable only where this one lacks it.
    const StreamTable& previous = m_State.previousItem
                                      ? m_PlayList.playList.playItems[*m_State.previousItem].streams
                                      : NoStreams;
    fgPrev2ndVid = !previous.secondaryVideo.empty() && streams.secondaryVideo.empty();
    fgPrev2ndAud = !previous.secondaryAudio.empty() && streams.secondaryAudio.empty();
}

const PlayItem* PlaybackContext::CurrentItem() const
{
    const std::vector<PlayItem>& items = m_PlayList.playList.playItems;
    return m_State.item < items.size() ? &items[m_State.item] : nullptr;
}

const StreamTable& PlaybackContext::CurrentStreams() const
{
    const PlayItem* const item = CurrentItem();
    return item == nullptr ? NoStreams : item->streams;
}

/** A stream runs on its own when the sub path that brings it is not in step with the play item. */
bool PlaybackContext::IsAsync(const Stream& stream) const
{
    const std::vector<SubPath>& subPaths = m_PlayList.playList.subPaths;
    return stream.entryType == EntryTypeSubPath && stream.subPath < subPaths.size() &&
           subPaths[stream.subPath].type == bd::SubPathOutOfMuxASynchPipPresentationPath;
}

} // namespace deskplayer
