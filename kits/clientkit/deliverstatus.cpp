#include "clientkit/playbackstatus.h"

namespace bdmv
{

namespace
{

/** Reports a status to a listener. */
class Report
{
public:
    Report(const PlaybackStatus& status, INavigatorListener& listener)
        : m_rStatus(status), m_rListener(listener)
    {
    }

    void SendState()
    {
        if (!m_rStatus.state.known) {
            return;
        }
        if (m_rStatus.state.value == PlaybackSuspended) {
            Enter(m_rStatus.resumesTo);
        }
        Enter(m_rStatus.state.value);
    }

    void SendTitle()
    {
        Send(m_rStatus.playList, &INavigatorListener::Playlist);
        if (m_rStatus.playItem.known) {
            const PlayItemStatus& item = m_rStatus.playItem.value;
            m_rListener.PlayItem(item.playListId, item.playItemId, item.videoFormat,
                                 item.aspectRatio);
        }
        Send(m_rStatus.chapter, &INavigatorListener::ChapterNumber);
        Send(m_rStatus.position, &INavigatorListener::CurrentTimePosition);
        if (m_rStatus.playMode.known) {
            const bd::PlayMode& mode = m_rStatus.playMode.value;
            m_rListener.PlayMode(mode.Direction(), mode.Speed());
        }
        Send(m_rStatus.zoom, &INavigatorListener::ZoomModeSet);
        Send(m_rStatus.mask, &INavigatorListener::UOMask);
    }

    void SendPrimaryStreams()
    {
        Send(m_rStatus.video, &INavigatorListener::VideoInfo);
        Send(m_rStatus.angle, &INavigatorListener::AngleInfo);
        Send(m_rStatus.audio, &INavigatorListener::AudioInfo);
        SendAudioInfo(true, m_rStatus.audioInfo);
        if (m_rStatus.subtitle.known) {
            m_rListener.PresentationGraphicsInfo(m_rStatus.subtitle.value,
                                                 m_rStatus.subtitleAvailable.value);
        }
        Send(m_rStatus.subtitleShown, &INavigatorListener::PresentationGraphicsDisplay);
        Send(m_rStatus.subtitleStyle, &INavigatorListener::TextSubtitleStyleInfo);
        Send(m_rStatus.subtitleStyles, &INavigatorListener::TextSubtitleStylesAvailable);
    }

    void SendSecondaryStreams()
    {
        Send(m_rStatus.pipAvailable, &INavigatorListener::PictureInPictureAvailable,
             &INavigatorListener::PictureInPictureUnavailable);
        Send(m_rStatus.secondaryVideo, &INavigatorListener::SecondaryVideoInfo);
        if (m_rStatus.secondaryVideoShown.known) {
            m_rListener.SecondaryVideoDisplay(m_rStatus.secondaryVideo.value,
                                              m_rStatus.secondaryVideoShown.value);
        }
        Send(m_rStatus.secondaryAudioAvailable, &INavigatorListener::SecondaryAudioAvailable,
             &INavigatorListener::SecondaryAudioUnavailable);
        Send(m_rStatus.secondaryAudio, &INavigatorListener::SecondaryAudioInfo);
        if (m_rStatus.secondaryAudioShown.known) {
            m_rListener.SecondaryAudioDisplay(m_rStatus.secondaryAudio.value,
                                              m_rStatus.secondaryAudioShown.value);
        }
        SendAudioInfo(false, m_rStatus.secondaryAudioInfo);
        if (m_rStatus.pipSubtitle.known) {
            m_rListener.PipPgTextStInfo(m_rStatus.pipSubtitle.value,
                                        m_rStatus.pipSubtitleAvailable.value);
        }
        Send(m_rStatus.pipSubtitleSelected, &INavigatorListener::PipPgTextSelect);
    }

    void SendMenu()
    {
        Send(m_rStatus.interactiveGraphics, &INavigatorListener::InteractiveGraphicsInfo);
        Send(m_rStatus.menuVisible, &INavigatorListener::InteractiveGraphicsVisible,
             &INavigatorListener::InteractiveGraphicsInvisible);
        Send(m_rStatus.menuActive, &INavigatorListener::InteractiveGraphicsActive,
             &INavigatorListener::InteractiveGraphicsInactive);
        Send(m_rStatus.popUpMenuAvailable, &INavigatorListener::PopUpMenuAvailable,
             &INavigatorListener::PopUpMenuUnavailable);
        Send(m_rStatus.buttonBusy, &INavigatorListener::ButtonActivationBusy,
             &INavigatorListener::ButtonActivationDone);
    }

private:
    void Enter(PlaybackState state)
    {
        switch (state) {
        case PlaybackStopped:
            m_rListener.Stopped();
            break;
        case PlaybackPlaying:
            m_rListener.PlayStarted();
            break;
        case PlaybackPaused:
            m_rListener.Paused();
            break;
        case PlaybackStill:
            m_rListener.StillOn();
            break;
        case PlaybackSuspended:
            m_rListener.Suspended();
            break;
        case PlaybackStandby:
            m_rListener.SystemSuspended(nullptr, 0);
            break;
        }
    }

    template <typename Value, typename Owner, typename Parameter>
    void Send(const Reported<Value>& part, void (Owner::*slot)(Parameter))
    {
        if (part.known) {
            (m_rListener.*slot)(part.value);
        }
    }

    template <typename Owner>
    void Send(const Reported<bool>& part, void (Owner::*slotIfTrue)(), void (Owner::*slotIfFalse)())
    {
        if (part.known) {
            (m_rListener.*(part.value ? slotIfTrue : slotIfFalse))();
        }
    }

    void SendAudioInfo(bool isPrimary, const Reported<bd::AudioInfoType>& part)
    {
        if (part.known) {
            m_rListener.AudioInfoChanged(isPrimary, part.value);
        }
    }

    const PlaybackStatus& m_rStatus;
    INavigatorListener& m_rListener;
};

bool IsOver(const PlaybackStatus& status)
{
    return status.state.value == PlaybackStopped || status.state.value == PlaybackStandby;
}

} // namespace

void Deliver(const PlaybackStatus& status, INavigatorListener& listener)
{
    Report report(status, listener);
    if (!IsOver(status)) {
        report.SendState();
    }
    report.SendTitle();
    report.SendPrimaryStreams();
    report.SendSecondaryStreams();
    report.SendMenu();
    if (IsOver(status)) {
        report.SendState();
    }
}

} // namespace bdmv
