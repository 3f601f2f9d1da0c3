/**
 * @file
 * A listener that receives every callback as a value.
 *
 * @code
 * class Recorder : public bdmv::CallbackListener
 * {
 *     void OnCallback(const bdmv::Callback& callback) override {
 * m_Names.push_back(NameOf(callback.Id())); }
 * };
 * @endcode
 */
#ifndef CLIENTKIT_CALLBACKLISTENER_H
#define CLIENTKIT_CALLBACKLISTENER_H

#include "bdmvnavigator/inavigatorlistener.h"
#include "clientkit/callback.h"

namespace bdmv
{

/**
 * Turns every callback into a Callback and passes it on.
 *
 * INavigatorListener states the rules for callbacks; they hold for OnCallback() as well.
 */
class CallbackListener : public INavigatorListener
{
public:
    // INavControlListener
    void PlayStarted() final;
    void FirstPictureDelivered() final;
    void PlayFailed() final;
    void Paused() final;
    void Continued(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed) final;
    void Stepped(const bd::TimePosition& position, bd::PlayDirectionDef direction) final;
    void TriggerTimeReached(bd::TriggerType type, const bd::TimePosition& time) final;
    void TriggerSet(bd::TriggerType type, bool result) final;
    void ZoomModeSet(bd::ZOOM_PARAM_Def zoom) final;
    void Stopped() final;
    void Finished(FinishedReason reason) final;
    void StillOn() final;
    void StillOff() final;
    void Suspended() final;
    void Resumed() final;
    void ResumeFailed() final;
    void SystemSuspended(const void* data, bd::UInt32 size) final;
    void SystemResumed(bool playing) final;
    void SystemResumeFailed() final;
    void JumpOccurred() final;
    void PreloadFailed() final;

    // INavSettingsListener
    void Playlist(bd::PlayListIdDef playListId) final;
    void PlayItem(bd::PlayListIdDef playListId, bd::PlayItemIdDef playItemId,
                  bd::VideoFormatType videoFormat, bd::VideoAspectRatioType aspectRatio) final;
    void PlayMode(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed) final;
    void AudioInfo(bd::StreamNumberDef number) final;
    void VideoInfo(bd::StreamNumberDef number) final;
    void AngleInfo(bd::AngleNumberDef number) final;
    void InteractiveGraphicsInfo(bd::StreamNumberDef number) final;
    void PresentationGraphicsInfo(bd::StreamNumberDef number, bool available) final;
    void SecondaryAudioInfo(bd::StreamNumberDef number) final;
    void SecondaryVideoInfo(bd::StreamNumberDef number) final;
    void PipPgTextStInfo(bd::StreamNumberDef number, bool available) final;
    void AudioInfoChanged(bool isPrimary, bd::AudioInfoType info) final;
    void TextSubtitleStyleInfo(bd::UserStyleNumber styleNumber) final;
    void TextSubtitleStylesAvailable(bd::UInt8 numberOfStyles) final;
    void UOMask(const UOMaskTable& mask) final;
    void ChapterNumber(const bd::ChapterNumberDef& chapter) final;
    void MarkInfo(bd::PlayListIdDef playListId, const bd::PlayListMarkIdDef& markId,
                  const bd::TimePosition& time) final;
    void CurrentTimePosition(const bd::TimePosition& position) final;
    void PictureInPictureAvailable() final;
    void PictureInPictureUnavailable() final;
    void SecondaryAudioAvailable() final;
    void SecondaryAudioUnavailable() final;
    void PresentationGraphicsDisplay(bool shown) final;
    void SecondaryVideoDisplay(bd::StreamNumberDef number, bool shown) final;
    void SecondaryAudioDisplay(bd::StreamNumberDef number, bool shown) final;
    void PipPgTextSelect(bool pick) final;

    // INavButtonListener
    void ExecuteButton(bd::UInt32 ticket, bd::ButtonId buttonId,
                       IProgramData::RefPtr& program) final;

    // INavInteractiveListener
    void InteractiveGraphicsVisible() final;
    void InteractiveGraphicsInvisible() final;
    void PopUpMenuAvailable() final;
    void PopUpMenuUnavailable() final;
    void ButtonActivationBusy() final;
    void ButtonActivationDone() final;
    void InteractiveGraphicsActive() final;
    void InteractiveGraphicsInactive() final;

protected:
    /**
     * Called for every callback, on the delivering thread.
     *
     * @param callback lives for the duration of the call; the bytes of callbacks::SystemSuspended
     *                 do too, even for a copy
     */
    virtual void OnCallback(const Callback& callback) = 0;
};

} // namespace bdmv

#endif
