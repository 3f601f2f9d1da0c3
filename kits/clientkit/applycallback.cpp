#include "clientkit/playbackstatus.h"

namespace bdmv
{

namespace
{

/** Applies a callback of any type. */
class Application
{
public:
    explicit Application(PlaybackStatus& status) : m_rStatus(status) {}

    void operator()(const callbacks::PlayStarted&) { SetState(PlaybackPlaying); }
    void operator()(const callbacks::PlayFailed&) { SetState(PlaybackStopped); }
    void operator()(const callbacks::Paused&) { SetState(PlaybackPaused); }
    void operator()(const callbacks::Continued&) { SetState(PlaybackPlaying); }
    void operator()(const callbacks::Stopped&) { SetState(PlaybackStopped); }
    void operator()(const callbacks::Finished&) { SetState(PlaybackStopped); }
    void operator()(const callbacks::StillOn&) { SetState(PlaybackStill); }

    void operator()(const callbacks::StillOff&)
    {
        if (m_rStatus.state.value == PlaybackStill) {
            SetState(PlaybackPlaying);
        }
    }

    void operator()(const callbacks::Suspended&)
    {
        if (m_rStatus.state.value != PlaybackSuspended) {
            const PlaybackState before =
                m_rStatus.state.known ? m_rStatus.state.value : PlaybackPlaying;
            SetState(PlaybackSuspended);
            m_rStatus.resumesTo = before;
        }
    }

    void operator()(const callbacks::Resumed&) { SetState(m_rStatus.resumesTo); }
    void operator()(const callbacks::ResumeFailed&) { SetState(PlaybackStopped); }
    void operator()(const callbacks::SystemSuspended&) { SetState(PlaybackStandby); }

    void operator()(const callbacks::SystemResumed& callback)
    {
        SetState(callback.playing ? PlaybackPlaying : PlaybackStopped);
    }

    void operator()(const callbacks::SystemResumeFailed&) { SetState(PlaybackStopped); }

    void operator()(const callbacks::Playlist& callback)
    {
        m_rStatus.playList.Set(callback.playListId);
    }

    void operator()(const callbacks::PlayItem& callback)
    {
        m_rStatus.playItem.Set(PlayItemStatus{callback.playListId, callback.playItemId,
                                              callback.videoFormat, callback.aspectRatio});
    }

    void operator()(const callbacks::ChapterNumber& callback)
    {
        m_rStatus.chapter.Set(callback.chapter);
    }

    void operator()(const callbacks::Stepped& callback)
    {
        m_rStatus.position.Set(callback.position);
    }

    void operator()(const callbacks::CurrentTimePosition& callback)
    {
        m_rStatus.position.Set(callback.position);
    }

    void operator()(const callbacks::PlayMode& callback)
    {
        m_rStatus.playMode.Set(bd::PlayMode(callback.direction, callback.speed));
    }

    void operator()(const callbacks::ZoomModeSet& callback) { m_rStatus.zoom.Set(callback.zoom); }
    void operator()(const callbacks::UOMask& callback) { m_rStatus.mask.Set(callback.mask); }
    void operator()(const callbacks::VideoInfo& callback) { m_rStatus.video.Set(callback.number); }
    void operator()(const callbacks::AngleInfo& callback) { m_rStatus.angle.Set(callback.number); }
    void operator()(const callbacks::AudioInfo& callback) { m_rStatus.audio.Set(callback.number); }

    void operator()(const callbacks::AudioInfoChanged& callback)
    {
        (callback.isPrimary ? m_rStatus.audioInfo : m_rStatus.secondaryAudioInfo)
            .Set(callback.info);
    }

    void operator()(const callbacks::PresentationGraphicsInfo& callback)
    {
        m_rStatus.subtitle.Set(callback.number);
        m_rStatus.subtitleAvailable.Set(callback.available);
    }

    void operator()(const callbacks::PresentationGraphicsDisplay& callback)
    {
        m_rStatus.subtitleShown.Set(callback.shown);
    }

    void operator()(const callbacks::TextSubtitleStyleInfo& callback)
    {
        m_rStatus.subtitleStyle.Set(callback.styleNumber);
    }

    void operator()(const callbacks::TextSubtitleStylesAvailable& callback)
    {
        m_rStatus.subtitleStyles.Set(callback.numberOfStyles);
    }

    void operator()(const callbacks::PictureInPictureAvailable&)
    {
        m_rStatus.pipAvailable.Set(true);
    }

    void operator()(const callbacks::PictureInPictureUnavailable&)
    {
        m_rStatus.pipAvailable.Set(false);
    }

    void operator()(const callbacks::SecondaryVideoInfo& callback)
    {
        m_rStatus.secondaryVideo.Set(callback.number);
    }

    void operator()(const callbacks::SecondaryVideoDisplay& callback)
    {
        m_rStatus.secondaryVideo.Set(callback.number);
        m_rStatus.secondaryVideoShown.Set(callback.shown);
    }

    void operator()(const callbacks::SecondaryAudioAvailable&)
    {
        m_rStatus.secondaryAudioAvailable.Set(true);
    }

    void operator()(const callbacks::SecondaryAudioUnavailable&)
    {
        m_rStatus.secondaryAudioAvailable.Set(false);
    }

    void operator()(const callbacks::SecondaryAudioInfo& callback)
    {
        m_rStatus.secondaryAudio.Set(callback.number);
    }

    void operator()(const callbacks::SecondaryAudioDisplay& callback)
    {
        m_rStatus.secondaryAudio.Set(callback.number);
        m_rStatus.secondaryAudioShown.Set(callback.shown);
    }

    void operator()(const callbacks::PipPgTextStInfo& callback)
    {
        m_rStatus.pipSubtitle.Set(callback.number);
        m_rStatus.pipSubtitleAvailable.Set(callback.available);
    }

    void operator()(const callbacks::PipPgTextSelect& callback)
    {
        m_rStatus.pipSubtitleSelected.Set(callback.pick);
    }

    void operator()(const callbacks::InteractiveGraphicsInfo& callback)
    {
        m_rStatus.interactiveGraphics.Set(callback.number);
    }

    void operator()(const callbacks::InteractiveGraphicsVisible&)
    {
        m_rStatus.menuVisible.Set(true);
    }

    void operator()(const callbacks::InteractiveGraphicsInvisible&)
    {
        m_rStatus.menuVisible.Set(false);
    }

    void operator()(const callbacks::InteractiveGraphicsActive&) { m_rStatus.menuActive.Set(true); }

    void operator()(const callbacks::InteractiveGraphicsInactive&)
    {
        m_rStatus.menuActive.Set(false);
    }

    void operator()(const callbacks::PopUpMenuAvailable&)
    {
        m_rStatus.popUpMenuAvailable.Set(true);
    }

    void operator()(const callbacks::PopUpMenuUnavailable&)
    {
        m_rStatus.popUpMenuAvailable.Set(false);
    }

    void operator()(const callbacks::ButtonActivationBusy&) { m_rStatus.buttonBusy.Set(true); }
    void operator()(const callbacks::ButtonActivationDone&) { m_rStatus.buttonBusy.Set(false); }

    // Momentary. Listed one by one, so that a callback without a meaning does not compile.
    void operator()(const callbacks::FirstPictureDelivered&) {}
    void operator()(const callbacks::TriggerTimeReached&) {}
    void operator()(const callbacks::TriggerSet&) {}
    void operator()(const callbacks::JumpOccurred&) {}
    void operator()(const callbacks::PreloadFailed&) {}
    void operator()(const callbacks::MarkInfo&) {}
    void operator()(const callbacks::ExecuteButton&) {}

private:
    void SetState(PlaybackState state)
    {
        m_rStatus.state.Set(state);
        m_rStatus.resumesTo = PlaybackPlaying;
    }

    PlaybackStatus& m_rStatus;
};

} // namespace

void Apply(const Callback& callback, PlaybackStatus& status)
{
    callback.Visit(Application(status));
}

} // namespace bdmv
