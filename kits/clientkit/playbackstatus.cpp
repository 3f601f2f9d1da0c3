#include "clientkit/playbackstatus.h"

#include "bd/guard.h"

namespace bdmv
{

namespace
{

const char* const g_States[] = {"Stopped", "Playing", "Paused", "Still", "Suspended", "Standby"};

} // namespace

const char* NameOf(PlaybackState state)
{
    return state >= PlaybackStopped && state <= PlaybackStandby ? g_States[state] : "unknown";
}

bool operator==(const PlayItemStatus& left, const PlayItemStatus& right)
{
    return left.playListId == right.playListId && left.playItemId == right.playItemId &&
           left.videoFormat == right.videoFormat && left.aspectRatio == right.aspectRatio;
}

PlaybackStatus::PlaybackStatus() : resumesTo(PlaybackPlaying) {}

bool operator==(const PlaybackStatus& left, const PlaybackStatus& right)
{
    return left.state == right.state && left.resumesTo == right.resumesTo &&
           left.playList == right.playList && left.playItem == right.playItem &&
           left.chapter == right.chapter && left.position == right.position &&
           left.playMode == right.playMode && left.zoom == right.zoom && left.mask == right.mask &&
           left.video == right.video && left.angle == right.angle && left.audio == right.audio &&
           left.audioInfo == right.audioInfo && left.subtitle == right.subtitle &&
           left.subtitleAvailable == right.subtitleAvailable &&
           left.subtitleShown == right.subtitleShown && left.subtitleStyle == right.subtitleStyle &&
           left.subtitleStyles == right.subtitleStyles && left.pipAvailable == right.pipAvailable &&
           left.secondaryVideo == right.secondaryVideo &&
           left.secondaryVideoShown == right.secondaryVideoShown &&
           left.secondaryAudioAvailable == right.secondaryAudioAvailable &&
           left.secondaryAudio == right.secondaryAudio &&
           left.secondaryAudioShown == right.secondaryAudioShown &&
           left.secondaryAudioInfo == right.secondaryAudioInfo &&
           left.pipSubtitle == right.pipSubtitle &&
           left.pipSubtitleAvailable == right.pipSubtitleAvailable &&
           left.pipSubtitleSelected == right.pipSubtitleSelected &&
           left.interactiveGraphics == right.interactiveGraphics &&
           left.menuVisible == right.menuVisible && left.menuActive == right.menuActive &&
           left.popUpMenuAvailable == right.popUpMenuAvailable &&
           left.buttonBusy == right.buttonBusy;
}

PlaybackStatus StatusListener::Status() const
{
    const bd::Guard<bd::ThreadMutex> guard(m_StatusLock);
    return m_Status;
}

void StatusListener::OnCallback(const Callback& callback)
{
    const bd::Guard<bd::ThreadMutex> guard(m_StatusLock);
    Apply(callback, m_Status);
}

} // namespace bdmv
