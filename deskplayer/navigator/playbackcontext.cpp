#include "navigator/playbackcontext.h"

#include <algorithm>
#include <iterator>
#include <tuple>
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

} // namespace

PlaybackContext::PlaybackContext(LoadedPlayList playList) : m_PlayList(std::move(playList)) {}

const bd::DataBlockDef& PlaybackContext::GetSystemResumeData()
{
    return m_SystemResumeBlock;
}

void PlaybackContext::CleanupSystemResumeData()
{
    StoreSystemResumeData({});
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
    if (m_State.pointB) {
        return bd::TRIGGER_B;
    }
    return m_State.pointA ? bd::TRIGGER_A : bd::TRIGGER_AB_NONE;
}

bd::TriggerType PlaybackContext::GetCurrentChpTitleRepeatState()
{
    return m_State.chapterTitleRepeat;
}

bd::TriggerType PlaybackContext::GetTriggerTypeByTime(bd::TimePosition time)
{
    if (m_State.triggerReached && time == m_State.triggerReachedTime) {
        return *m_State.triggerReached;
    }
    if (time == m_State.pointB) {
        return bd::TRIGGER_B;
    }
    // The end of a chapter or title is no point of its own: the repeat state tells.
    return time == m_State.notifyAt ? bd::TRIGGER_NOTIFY_FROM_CURPOS : bd::TRIGGER_INVALID;
}

bd::ChapterNumberDef PlaybackContext::GetCurrentChapter()
{
    const Chapter* const chapter = CurrentChapter();
    return chapter == nullptr ? 0 : static_cast<bd::ChapterNumberDef>(chapter->number);
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
    std::tie(*number, *count) = ChosenVideo();
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
    std::tie(*number, *count) = ChosenAudio();
}

void PlaybackContext::GetIgInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    std::tie(*number, *count) = ChosenIg();
}

bdmv::IPlaybackContext::ErrCode PlaybackContext::rGetPgTextStInfo(bd::StreamNumberDef* number,
                                                                  bd::UInt8* count)
{
    GetPgTextStInfo(number, count);
    return CurrentItem() == nullptr ? ErrNotAllowed : ErrOk;
}

void PlaybackContext::GetPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    std::tie(*number, *count) = ChosenPg();
}

void PlaybackContext::GetSecondaryVideoInfo(bd::StreamNumberDef* number, bd::UInt8* count,
                                            bool* async)
{
    std::tie(*number, *count) = ChosenSecondaryVideo();
    *async = *number != 0 && IsAsync(CurrentStreams().secondaryVideo[*number - 1U]);
}

void PlaybackContext::GetSecondaryAudioInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    std::tie(*number, *count) = ChosenSecondaryAudio();
}

void PlaybackContext::GetPipPgTextStInfo(bd::StreamNumberDef* number, bd::UInt8* count)
{
    std::tie(*number, *count) = ChosenPipPg();
}

void PlaybackContext::GetAngleInfo(bd::AngleNumberDef* number, bd::UInt8* count)
{
    bd::StreamNumberDef angle = 0;
    std::tie(angle, *count) = ChosenAngle();
    *number = static_cast<bd::AngleNumberDef>(angle);
}

bool PlaybackContext::GetPgTextStDisplay()
{
    return m_State.selection.pgShown;
}

bool PlaybackContext::GetSecondaryVideoDisplay()
{
    return m_State.selection.secondaryVideoShown;
}

bool PlaybackContext::GetSecondaryAudioDisplay()
{
    return m_State.selection.secondaryAudioShown;
}

bool PlaybackContext::GetPipPgTextStSelect()
{
    return m_State.selection.pipPgPicked;
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

void PlaybackContext::GetExecuteButtonData(RefPtr& program, bd::UInt32& ticket,
                                           bd::ButtonId& buttonId)
{
    program = m_State.button.program;
    ticket = m_State.button.ticket;
    buttonId = m_State.button.id;
}

bd::UserStyleNumber PlaybackContext::GetCurrentTextSubtitleStyleNumber()
{
    return m_State.selection.style;
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

const Chapter* PlaybackContext::CurrentChapter() const
{
    // Where one play item ends and the next starts, those of the next one come later.
    const std::vector<Chapter>& chapters = m_PlayList.chaptersByStart;
    const auto behind = std::upper_bound(chapters.begin(), chapters.end(), m_State,
                                         [](const PlaybackState& state, const Chapter& chapter) {
                                             return std::tie(state.position, state.item) <
                                                    std::tie(chapter.start, chapter.playItem);
                                         });
    return behind == chapters.begin() ? nullptr : &*std::prev(behind);
}

const StreamTable& PlaybackContext::CurrentStreams() const
{
    const PlayItem* const item = CurrentItem();
    return item == nullptr ? NoStreams : item->streams;
}

/** The stream that was asked for, or the last where it is not there. */
PlaybackContext::NumberAndCount PlaybackContext::Choose(bd::StreamNumberDef wanted,
                                                        std::size_t count)
{
    const auto all = static_cast<bd::UInt8>(count);
    return {std::min<bd::StreamNumberDef>(wanted, all), all};
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenVideo() const
{
    return Choose(m_State.selection.video, CurrentStreams().primaryVideo.size());
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenAudio() const
{
    return Choose(m_State.selection.audio, CurrentStreams().primaryAudio.size());
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenPg() const
{
    return Choose(m_State.selection.pg, CurrentStreams().pg.size());
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenSecondaryVideo() const
{
    return Choose(m_State.selection.secondaryVideo, CurrentStreams().secondaryVideo.size());
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenSecondaryAudio() const
{
    return Choose(m_State.selection.secondaryAudio, CurrentStreams().secondaryAudio.size());
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenPipPg() const
{
    return Choose(m_State.selection.pipPg, CurrentStreams().pipPg.size());
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenIg() const
{
    return Choose(m_State.selection.ig, CurrentStreams().ig.size());
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenAngle() const
{
    const PlayItem* const item = CurrentItem();
    return Choose(m_State.selection.angle, item == nullptr ? 0 : NumberOfAngles(*item));
}

void PlaybackContext::StoreSystemResumeData(std::vector<bd::UInt8> block)
{
    m_SystemResumeData = std::move(block);
    m_SystemResumeBlock = {m_SystemResumeData.data(),
                           static_cast<bd::UInt32>(m_SystemResumeData.size())};
}

/** A stream runs on its own when the sub path that brings it is not in step with the play item. */
bool PlaybackContext::IsAsync(const Stream& stream) const
{
    const std::vector<SubPath>& subPaths = m_PlayList.playList.subPaths;
    return stream.entryType == EntryTypeSubPath && stream.subPath < subPaths.size() &&
           subPaths[stream.subPath].type == bd::SubPathOutOfMuxASynchPipPresentationPath;
}

} // namespace deskplayer
