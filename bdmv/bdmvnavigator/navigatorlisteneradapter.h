/**
 * @file
 * A listener that ignores every callback, to derive from when only a few are wanted.
 *
 * @code
 * class FrontPanel : public bdmv::NavigatorListenerAdapter
 * {
 * public:
 *     void Paused() override { m_Display.Show("PAUSE"); }
 * };
 * @endcode
 */
#ifndef BDMVNAVIGATOR_NAVIGATORLISTENERADAPTER_H
#define BDMVNAVIGATOR_NAVIGATORLISTENERADAPTER_H

#include "bdmvnavigator/inavigatorlistener.h"

namespace bdmv
{

/** Implements every callback with an empty body. */
class NavigatorListenerAdapter : public INavigatorListener
{
public:
    // INavControlListener
    void PlayStarted() override {}
    void FirstPictureDelivered() override {}
    void PlayFailed() override {}
    void Paused() override {}
    void Continued(bd::PlayDirectionDef /*direction*/, bd::PlaySpeedDef /*speed*/) override {}
    void Stepped(const bd::TimePosition& /*position*/, bd::PlayDirectionDef /*direction*/) override
    {
    }
    void TriggerTimeReached(bd::TriggerType /*type*/, const bd::TimePosition& /*time*/) override {}
    void TriggerSet(bd::TriggerType /*type*/, bool /*result*/) override {}
    void ZoomModeSet(bd::ZOOM_PARAM_Def /*zoom*/) override {}
    void Stopped() override {}
    void Finished(FinishedReason /*reason*/) override {}
    void StillOn() override {}
    void StillOff() override {}
    void Suspended() override {}
    void Resumed() override {}
    void ResumeFailed() override {}
    void SystemSuspended(const void* /*data*/, bd::UInt32 /*size*/) override {}
    void SystemResumed(bool /*playing*/) override {}
    void SystemResumeFailed() override {}
    void JumpOccurred() override {}
    void PreloadFailed() override {}

    // INavSettingsListener
    void Playlist(bd::PlayListIdDef /*playListId*/) override {}
    void PlayItem(bd::PlayListIdDef /*playListId*/, bd::PlayItemIdDef /*playItemId*/,
                  bd::VideoFormatType /*videoFormat*/,
                  bd::VideoAspectRatioType /*aspectRatio*/) override
    {
    }
    void PlayMode(bd::PlayDirectionDef /*direction*/, bd::PlaySpeedDef /*speed*/) override {}
    void AudioInfo(bd::StreamNumberDef /*number*/) override {}
    void VideoInfo(bd::StreamNumberDef /*number*/) override {}
    void AngleInfo(bd::AngleNumberDef /*number*/) override {}
    void InteractiveGraphicsInfo(bd::StreamNumberDef /*number*/) override {}
    void PresentationGraphicsInfo(bd::StreamNumberDef /*number*/, bool /*available*/) override {}
    void SecondaryAudioInfo(bd::StreamNumberDef /*number*/) override {}
    void SecondaryVideoInfo(bd::StreamNumberDef /*number*/) override {}
    void PipPgTextStInfo(bd::StreamNumberDef /*number*/, bool /*available*/) override {}
    void AudioInfoChanged(bool /*isPrimary*/, bd::AudioInfoType /*info*/) override {}
    void TextSubtitleStyleInfo(bd::UserStyleNumber /*styleNumber*/) override {}
    void TextSubtitleStylesAvailable(bd::UInt8 /*numberOfStyles*/) override {}
    void UOMask(const UOMaskTable& /*mask*/) override {}
    void ChapterNumber(const bd::ChapterNumberDef& /*chapter*/) override {}
    void MarkInfo(bd::PlayListIdDef /*playListId*/, const bd::PlayListMarkIdDef& /*markId*/,
                  const bd::TimePosition& /*time*/) override
    {
    }
    void CurrentTimePosition(const bd::TimePosition& /*position*/) override {}
    void PictureInPictureAvailable() override {}
    void PictureInPictureUnavailable() override {}
    void SecondaryAudioAvailable() override {}
    void SecondaryAudioUnavailable() override {}
    void PresentationGraphicsDisplay(bool /*shown*/) override {}
    void SecondaryVideoDisplay(bd::StreamNumberDef /*number*/, bool /*shown*/) override {}
    void SecondaryAudioDisplay(bd::StreamNumberDef /*number*/, bool /*shown*/) override {}
    void PipPgTextSelect(bool /*pick*/) override {}

    // INavButtonListener
    void ExecuteButton(bd::UInt32 /*ticket*/, bd::ButtonId /*buttonId*/,
                       IProgramData::RefPtr& /*program*/) override
    {
    }

    // INavInteractiveListener
    void InteractiveGraphicsVisible() override {}
    void InteractiveGraphicsInvisible() override {}
    void PopUpMenuAvailable() override {}
    void PopUpMenuUnavailable() override {}
    void ButtonActivationBusy() override {}
    void ButtonActivationDone() override {}
    void InteractiveGraphicsActive() override {}
    void InteractiveGraphicsInactive() override {}
};

} // namespace bdmv

#endif
