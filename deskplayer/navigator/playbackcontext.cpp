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

/** Assumed number of user styles of a text subtitle stream, whose file is not read. */
constexpr bd::UInt8 TextSubtitleStyles = 4;

bool IsTextSubtitle(const Stream& stream)
{
    return KindOfStream(stream.attributes.codingType) == StreamKind::StreamKindTextSubtitle;
}

} // namespace

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
    return m_rState.playingAfterSystemResume;
}

bd::PlayListIdDef PlaybackContext::GetPlayListId()
{
    return m_rPlayhead.LoadedList().number;
}

bd::PlayItemIdDef PlaybackContext::GetPlayItemId()
{
    return static_cast<bd::PlayItemIdDef>(m_rState.item);
}

const bd::PlayMode& PlaybackContext::GetPlayMode()
{
    return m_rState.playMode;
}

bd::Trigger PlaybackContext::GetTrigger()
{
    return {m_rState.trigger};
}

bd::TimePosition PlaybackContext::GetTriggerReachedTime()
{
    return m_rState.triggerReachedTime.count();
}

bd::TriggerType PlaybackContext::GetCurrentABRepeatState()
{
    if (m_rState.pointB) {
        return bd::TRIGGER_B;
    }
    return m_rState.pointA ? bd::TRIGGER_A : bd::TRIGGER_AB_NONE;
}

bd::TriggerType PlaybackContext::GetCurrentChpTitleRepeatState()
{
    return m_rState.chapterTitleRepeat;
}

bd::TriggerType PlaybackContext::GetTriggerTypeByTime(bd::TimePosition time)
{
    const Ticks position(time);
    if (m_rState.triggerReached && position == m_rState.triggerReachedTime) {
        return *m_rState.triggerReached;
    }
    if (position == m_rState.pointB) {
        return bd::TRIGGER_B;
    }
    // No trigger is set at the end of a chapter or title: the repeat state identifies it.
    return position == m_rState.notifyAt ? bd::TRIGGER_NOTIFY_FROM_CURPOS : bd::TRIGGER_INVALID;
}

bd::ChapterNumberDef PlaybackContext::GetCurrentChapter()
{
    const Chapter* const chapter = m_rPlayhead.CurrentChapter();
    return chapter == nullptr ? 0 : static_cast<bd::ChapterNumberDef>(chapter->number);
}

bd::PlayListMarkIdDef PlaybackContext::GetCurrentPLMarkId(bd::TimePosition& time)
{
    if (!m_rState.mark) {
        return 0;
    }
    const std::optional<Ticks> position =
        m_rPlayhead.LoadedList().timeLine.markPositions[*m_rState.mark];
    time = position ? position->count() : bd::TimePositionNone;
    return static_cast<bd::PlayListMarkIdDef>(*m_rState.mark);
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
        // The enumerations have the disc's codes; codes without an enumerator are passed on.
        format = static_cast<bd::VideoFormatType>(videos.front().attributes.videoFormat);
        if (const std::optional<std::uint8_t> code =
                m_rPlayhead.LoadedList().aspectRatios[m_rState.item]) {
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
    return m_rPlayhead.CurrentItem() == nullptr ? ErrNotAllowed : ErrOk;
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
    return m_rState.selection.pgShown;
}

bool PlaybackContext::GetSecondaryVideoDisplay()
{
    return m_rState.selection.secondaryVideoShown;
}

bool PlaybackContext::GetSecondaryAudioDisplay()
{
    return m_rState.selection.secondaryAudioShown;
}

bool PlaybackContext::GetPipPgTextStSelect()
{
    return m_rState.selection.pipPgPicked;
}

void PlaybackContext::GetUOMask(bdmv::UOMaskTable& mask)
{
    mask = bdmv::UOMaskTable(m_rPlayhead.LoadedList().playList.applicationInfo.uoMask);
    if (const PlayItem* const item = m_rPlayhead.CurrentItem()) {
        mask |= bdmv::UOMaskTable(item->uoMask);
    }
}

const bd::PlayMode& PlaybackContext::GetCurrentPlayMode()
{
    return m_rState.currentPlayMode;
}

bd::TimePosition PlaybackContext::GetCurrentTimePosition()
{
    return m_rState.position.count();
}

void PlaybackContext::GetExecuteButtonData(RefPtr& program, bd::UInt32& ticket,
                                           bd::ButtonId& buttonId)
{
    program = m_rState.button.program;
    ticket = m_rState.button.ticket;
    buttonId = m_rState.button.id;
}

bd::UserStyleNumber PlaybackContext::GetCurrentTextSubtitleStyleNumber()
{
    return m_rState.selection.style;
}

bd::UInt8 PlaybackContext::GetNumberOfTextSubtitleStyles()
{
    const std::vector<Stream>& streams = CurrentStreams().pg;
    const bool any = std::any_of(streams.begin(), streams.end(), IsTextSubtitle);
    return any ? TextSubtitleStyles : 0;
}

bdstreaming::FinishedReason PlaybackContext::GetFinishedReason()
{
    return m_rState.finishedReason;
}

void PlaybackContext::GetZoomScaleInfo(bd::ZOOM_PARAM_Def& zoom)
{
    zoom = m_rState.zoom;
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

    // Streams of the previous play item become unavailable only if this one has none.
    const StreamTable& previous =
        m_rState.previousItem
            ? m_rPlayhead.LoadedList().playList.playItems[*m_rState.previousItem].streams
            : NoStreams;
    fgPrev2ndVid = !previous.secondaryVideo.empty() && streams.secondaryVideo.empty();
    fgPrev2ndAud = !previous.secondaryAudio.empty() && streams.secondaryAudio.empty();
}

/** The wanted stream, or the last one if it does not exist. */
PlaybackContext::NumberAndCount PlaybackContext::Choose(bd::StreamNumberDef wanted,
                                                        std::size_t count)
{
    const auto all = static_cast<bd::UInt8>(count);
    return {std::min<bd::StreamNumberDef>(wanted, all), all};
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenVideo() const
{
    return Choose(m_rState.selection.video, CurrentStreams().primaryVideo.size());
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenAudio() const
{
    return Choose(m_rState.selection.audio, CurrentStreams().primaryAudio.size());
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenPg() const
{
    return Choose(m_rState.selection.pg, CurrentStreams().pg.size());
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenSecondaryVideo() const
{
    return Choose(m_rState.selection.secondaryVideo, CurrentStreams().secondaryVideo.size());
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenSecondaryAudio() const
{
    return Choose(m_rState.selection.secondaryAudio, CurrentStreams().secondaryAudio.size());
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenPipPg() const
{
    return Choose(m_rState.selection.pipPg, CurrentStreams().pipPg.size());
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenIg() const
{
    return Choose(m_rState.selection.ig, CurrentStreams().ig.size());
}

PlaybackContext::NumberAndCount PlaybackContext::ChosenAngle() const
{
    const PlayItem* const item = m_rPlayhead.CurrentItem();
    return Choose(m_rState.selection.angle, item == nullptr ? 0 : NumberOfAngles(*item));
}

void PlaybackContext::StoreSystemResumeData(std::vector<bd::UInt8> block)
{
    m_SystemResumeData = std::move(block);
    m_SystemResumeBlock = {m_SystemResumeData.data(),
                           static_cast<bd::UInt32>(m_SystemResumeData.size())};
}

/** Whether the sub path that carries the stream is not synchronized with the play item. */
bool PlaybackContext::IsAsync(const Stream& stream) const
{
    const std::vector<SubPath>& subPaths = m_rPlayhead.LoadedList().playList.subPaths;
    return stream.entryType == EntryTypeSubPath && stream.subPath < subPaths.size() &&
           subPaths[stream.subPath].type == bd::SubPathOutOfMuxASynchPipPresentationPath;
}

} // namespace deskplayer
