/**
 * @file
 * A listener that writes every callback into the journal.
 *
 * @code
 * bdmvtest::Journal journal;
 * bdmvtest::RecordingListener a(journal, "A");
 * listeners.AddListener(&a);
 * ...
 * EXPECT_EQ(journal.Take(), "A.Paused()\nA.AngleInfo(2)\n");
 * @endcode
 *
 * Entries in the journal: the listener's name, the callback, and its arguments, enumerators by name
 * and numbers in decimal:
 *
 *     A.PlayItem(800, 0, VideoFormatType1080p, VideoAspectRatioType16x9)
 *     B.SystemSuspended(bytes 1 2 3, 3)
 *
 * It overrides every callback itself instead of deriving from bdmv::CallbackListener: it must be
 * an independent witness of which slot was called, and must not add a reference to a program.
 */
#ifndef TESTKIT_RECORDINGLISTENER_H
#define TESTKIT_RECORDINGLISTENER_H

#include <functional>
#include <string>
#include <utility>

#include "bdmvnavigator/inavigatorlistener.h"
#include "testkit/describe.h"
#include "testkit/journal.h"

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
    RecordingListener(Journal& journal, std::string name)
        : m_rJournal(journal), m_Name(std::move(name))
    {
    }

    RecordingListener(const RecordingListener&) = delete;
    RecordingListener& operator=(const RecordingListener&) = delete;

    /** Called after a callback has been recorded, with its entry without the listener's name. */
    std::function<void(const std::string& callback)> onCallback;

    // INavControlListener
    void PlayStarted() override { Record(DescribeCall("PlayStarted")); }
    void FirstPictureDelivered() override { Record(DescribeCall("FirstPictureDelivered")); }
    void PlayFailed() override { Record(DescribeCall("PlayFailed")); }
    void Paused() override { Record(DescribeCall("Paused")); }
    void Continued(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed) override
    {
        Record(DescribeCall("Continued", direction, speed));
    }
    void Stepped(const bd::TimePosition& position, bd::PlayDirectionDef direction) override
    {
        Record(DescribeCall("Stepped", position, direction));
    }
    void TriggerTimeReached(bd::TriggerType type, const bd::TimePosition& time) override
    {
        Record(DescribeCall("TriggerTimeReached", type, time));
    }
    void TriggerSet(bd::TriggerType type, bool result) override
    {
        Record(DescribeCall("TriggerSet", type, result));
    }
    void ZoomModeSet(bd::ZOOM_PARAM_Def zoom) override
    {
        Record(DescribeCall("ZoomModeSet", zoom));
    }
    void Stopped() override { Record(DescribeCall("Stopped")); }
    void Finished(FinishedReason reason) override { Record(DescribeCall("Finished", reason)); }
    void StillOn() override { Record(DescribeCall("StillOn")); }
    void StillOff() override { Record(DescribeCall("StillOff")); }
    void Suspended() override { Record(DescribeCall("Suspended")); }
    void Resumed() override { Record(DescribeCall("Resumed")); }
    void ResumeFailed() override { Record(DescribeCall("ResumeFailed")); }
    void SystemSuspended(const void* data, bd::UInt32 size) override
    {
        Record("SystemSuspended(" + DescribeBytes(data, size) + ")");
    }
    void SystemResumed(bool playing) override { Record(DescribeCall("SystemResumed", playing)); }
    void SystemResumeFailed() override { Record(DescribeCall("SystemResumeFailed")); }
    void JumpOccurred() override { Record(DescribeCall("JumpOccurred")); }
    void PreloadFailed() override { Record(DescribeCall("PreloadFailed")); }

    // INavSettingsListener
    void Playlist(bd::PlayListIdDef playListId) override
    {
        Record(DescribeCall("Playlist", playListId));
    }
    void PlayItem(bd::PlayListIdDef playListId, bd::PlayItemIdDef playItemId,
                  bd::VideoFormatType videoFormat, bd::VideoAspectRatioType aspectRatio) override
    {
        Record(DescribeCall("PlayItem", playListId, playItemId, videoFormat, aspectRatio));
    }
    void PlayMode(bd::PlayDirectionDef direction, bd::PlaySpeedDef speed) override
    {
        Record(DescribeCall("PlayMode", direction, speed));
    }
    void AudioInfo(bd::StreamNumberDef number) override
    {
        Record(DescribeCall("AudioInfo", number));
    }
    void VideoInfo(bd::StreamNumberDef number) override
    {
        Record(DescribeCall("VideoInfo", number));
    }
    void AngleInfo(bd::AngleNumberDef number) override
    {
        Record(DescribeCall("AngleInfo", number));
    }
    void InteractiveGraphicsInfo(bd::StreamNumberDef number) override
    {
        Record(DescribeCall("InteractiveGraphicsInfo", number));
    }
    void PresentationGraphicsInfo(bd::StreamNumberDef number, bool available) override
    {
        Record(DescribeCall("PresentationGraphicsInfo", number, available));
    }
    void SecondaryAudioInfo(bd::StreamNumberDef number) override
    {
        Record(DescribeCall("SecondaryAudioInfo", number));
    }
    void SecondaryVideoInfo(bd::StreamNumberDef number) override
    {
        Record(DescribeCall("SecondaryVideoInfo", number));
    }
    void PipPgTextStInfo(bd::StreamNumberDef number, bool available) override
    {
        Record(DescribeCall("PipPgTextStInfo", number, available));
    }
    void AudioInfoChanged(bool isPrimary, bd::AudioInfoType info) override
    {
        Record(DescribeCall("AudioInfoChanged", isPrimary, info));
    }
    void TextSubtitleStyleInfo(bd::UserStyleNumber styleNumber) override
    {
        Record(DescribeCall("TextSubtitleStyleInfo", styleNumber));
    }
    void TextSubtitleStylesAvailable(bd::UInt8 numberOfStyles) override
    {
        Record(DescribeCall("TextSubtitleStylesAvailable", numberOfStyles));
    }
    void UOMask(const bdmv::UOMaskTable& mask) override { Record(DescribeCall("UOMask", mask)); }
    void ChapterNumber(const bd::ChapterNumberDef& chapter) override
    {
        Record(DescribeCall("ChapterNumber", chapter));
    }
    void MarkInfo(bd::PlayListIdDef playListId, const bd::PlayListMarkIdDef& markId,
                  const bd::TimePosition& time) override
    {
        Record(DescribeCall("MarkInfo", playListId, markId, time));
    }
    void CurrentTimePosition(const bd::TimePosition& position) override
    {
        Record(DescribeCall("CurrentTimePosition", position));
    }
    void PictureInPictureAvailable() override { Record(DescribeCall("PictureInPictureAvailable")); }
    void PictureInPictureUnavailable() override
    {
        Record(DescribeCall("PictureInPictureUnavailable"));
    }
    void SecondaryAudioAvailable() override { Record(DescribeCall("SecondaryAudioAvailable")); }
    void SecondaryAudioUnavailable() override { Record(DescribeCall("SecondaryAudioUnavailable")); }
    void PresentationGraphicsDisplay(bool shown) override
    {
        Record(DescribeCall("PresentationGraphicsDisplay", shown));
    }
    void SecondaryVideoDisplay(bd::StreamNumberDef number, bool shown) override
    {
        Record(DescribeCall("SecondaryVideoDisplay", number, shown));
    }
    void SecondaryAudioDisplay(bd::StreamNumberDef number, bool shown) override
    {
        Record(DescribeCall("SecondaryAudioDisplay", number, shown));
    }
    void PipPgTextSelect(bool pick) override { Record(DescribeCall("PipPgTextSelect", pick)); }

    // INavButtonListener
    void ExecuteButton(bd::UInt32 ticket, bd::ButtonId buttonId,
                       bdmv::IProgramData::RefPtr& program) override
    {
        Record(DescribeCall("ExecuteButton", ticket, buttonId, program));
    }

    // INavInteractiveListener
    void InteractiveGraphicsVisible() override
    {
        Record(DescribeCall("InteractiveGraphicsVisible"));
    }
    void InteractiveGraphicsInvisible() override
    {
        Record(DescribeCall("InteractiveGraphicsInvisible"));
    }
    void PopUpMenuAvailable() override { Record(DescribeCall("PopUpMenuAvailable")); }
    void PopUpMenuUnavailable() override { Record(DescribeCall("PopUpMenuUnavailable")); }
    void ButtonActivationBusy() override { Record(DescribeCall("ButtonActivationBusy")); }
    void ButtonActivationDone() override { Record(DescribeCall("ButtonActivationDone")); }
    void InteractiveGraphicsActive() override { Record(DescribeCall("InteractiveGraphicsActive")); }
    void InteractiveGraphicsInactive() override
    {
        Record(DescribeCall("InteractiveGraphicsInactive"));
    }

private:
    void Record(const std::string& callback)
    {
        m_rJournal.Add(m_Name + "." + callback);
        if (onCallback) {
            onCallback(callback);
        }
    }

    Journal& m_rJournal;
    std::string m_Name;
};

} // namespace bdmvtest

#endif
