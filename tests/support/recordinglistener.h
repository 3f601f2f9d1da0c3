/**
 * @file
 * A listener that writes every callback into the journal.
 *
 * Entries in the journal: the listener's name, the callback, and its arguments, enumerators by name
 * and numbers in decimal:
 *
 *     A.PlayItem(800, 0, VideoFormatType1080p, VideoAspectRatioType16x9)
 *     B.SystemSuspended(bytes 1 2 3, 3)
 */
#ifndef SUPPORT_RECORDINGLISTENER_H
#define SUPPORT_RECORDINGLISTENER_H

#include <functional>
#include <string>

#include "bdmvnavigator/inavigatorlistener.h"
#include "support/journal.h"

namespace bdmvtest
{

/** Records every callback, then may run an action of the test. */
class RecordingListener : public bdmv::INavigatorListener
{
public:
    /**
     * @param journal receives the entries; must outlive the listener
     * @param name    the prefix of the callbacks
     */
    RecordingListener(Journal& journal, std::string name);

    /** Called after a callback has been recorded, with its entry without the listener's name. */
    std::function<void(const std::string& callback)> onCallback;

    // INavControlListener
    void PlayStarted() override;
    void FirstPictureDelivered() override;
    void PlayFailed() override;
    void Paused() override;
    void Continued(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed) override;
    void Stepped(const bd::TimePosition& position, bd::PlayDirectionDef direction) override;
    void TriggerTimeReached(bd::TriggerType type, const bd::TimePosition& time) override;
    void TriggerSet(bd::TriggerType type, bool result) override;
    void ZoomModeSet(bd::ZOOM_PARAM_Def zoom) override;
    void Stopped() override;
    void Finished(FinishedReason reason) override;
    void StillOn() override;
    void StillOff() override;
    void Suspended() override;
    void Resumed() override;
    void ResumeFailed() override;
    void SystemSuspended(const void* data, bd::UInt32 size) override;
    void SystemResumed(bool playing) override;
    void SystemResumeFailed() override;
    void JumpOccurred() override;
    void PreloadFailed() override;

    // INavSettingsListener
    void Playlist(bd::PlayListIdDef playListId) override;
    void PlayItem(bd::PlayListIdDef playListId, bd::PlayItemIdDef playItemId,
                  bd::VideoFormatType videoFormat, bd::VideoAspectRatioType aspectRatio) override;
    void PlayMode(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed) override;
    void AudioInfo(bd::StreamNumberDef number) override;
    void VideoInfo(bd::StreamNumberDef number) override;
    void AngleInfo(bd::AngleNumberDef number) override;
    void InteractiveGraphicsInfo(bd::StreamNumberDef number) override;
    void PresentationGraphicsInfo(bd::StreamNumberDef number, bool available) override;
    void SecondaryAudioInfo(bd::StreamNumberDef number) override;
    void SecondaryVideoInfo(bd::StreamNumberDef number) override;
    void PipPgTextStInfo(bd::StreamNumberDef number, bool available) override;
    void AudioInfoChanged(bool isPrimary, bd::AudioInfoType info) override;
    void TextSubtitleStyleInfo(bd::UserStyleNumber styleNumber) override;
    void TextSubtitleStylesAvailable(bd::UInt8 numberOfStyles) override;
    void UOMask(const bdmv::UOMaskTable& mask) override;
    void ChapterNumber(const bd::ChapterNumberDef& chapter) override;
    void MarkInfo(bd::PlayListIdDef playListId, const bd::PlayListMarkIdDef& markId,
                  const bd::TimePosition& time) override;
    void CurrentTimePosition(const bd::TimePosition& position) override;
    void PictureInPictureAvailable() override;
    void PictureInPictureUnavailable() override;
    void SecondaryAudioAvailable() override;
    void SecondaryAudioUnavailable() override;
    void PresentationGraphicsDisplay(bool shown) override;
    void SecondaryVideoDisplay(bd::StreamNumberDef number, bool shown) override;
    void SecondaryAudioDisplay(bd::StreamNumberDef number, bool shown) override;
    void PipPgTextSelect(bool pick) override;

    // INavButtonListener
    void ExecuteButton(bd::UInt32 ticket, bd::ButtonId buttonId,
                       bdmv::IProgramData::RefPtr& program) override;

    // INavInteractiveListener
    void InteractiveGraphicsVisible() override;
    void InteractiveGraphicsInvisible() override;
    void PopUpMenuAvailable() override;
    void PopUpMenuUnavailable() override;
    void ButtonActivationBusy() override;
    void ButtonActivationDone() override;
    void InteractiveGraphicsActive() override;
    void InteractiveGraphicsInactive() override;

private:
    void Record(const std::string& callback);

    Journal& m_rJournal;
    std::string m_Name;
};

} // namespace bdmvtest

#endif
