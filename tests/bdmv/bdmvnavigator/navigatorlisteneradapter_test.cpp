#include <gtest/gtest.h>

#include <memory>
#include <type_traits>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "testkit/fakeplatform.h"

namespace
{

struct EmptyProgram : bdmv::IProgramData {
    bd::UInt16 GetNumberOfNavigationCommands() const override { return 0; }
    const bdmv::INavigationCommandData* GetNavigationCommandData(CommandIdDef) const override
    {
        return nullptr;
    }
};

} // namespace

TEST(NavigatorListenerAdapter, IsAConcreteListener)
{
    EXPECT_TRUE((std::is_base_of_v<bdmv::INavigatorListener, bdmv::NavigatorListenerAdapter>));
    EXPECT_FALSE(std::is_abstract_v<bdmv::NavigatorListenerAdapter>);
}

TEST(NavigatorListenerAdapter, CanBeCopied)
{
    EXPECT_TRUE(std::is_copy_constructible_v<bdmv::NavigatorListenerAdapter>);
    EXPECT_TRUE(std::is_copy_assignable_v<bdmv::NavigatorListenerAdapter>);
}

TEST(NavigatorListenerAdapter, CanOverrideASingleCallback)
{
    struct FrontPanel : bdmv::NavigatorListenerAdapter {
        void Paused() override { ++pauses; }
        int pauses = 0;
    };
    FrontPanel frontPanel;
    bdmv::INavigatorListener& listener = frontPanel;
    listener.PlayStarted();
    listener.Paused();

    EXPECT_EQ(1, frontPanel.pauses);
}

TEST(NavigatorListenerAdapter, DoesNothingInAnyCallback)
{
    bdmvtest::Journal journal;
    bdmvtest::FakePlatform platform(&journal);
    platform.RecordAtomicAdds();
    const std::unique_ptr<bdmv::INavigatorListener> listener(new bdmv::NavigatorListenerAdapter);
    bdmv::IProgramData::RefPtr program(new EmptyProgram);
    const bdmv::IProgramData* const rawProgram = program.Get();

    listener->PlayStarted();
    listener->FirstPictureDelivered();
    listener->PlayFailed();
    listener->Paused();
    listener->Continued(bd::PlayDirectionForward, bd::PlaySpeedNormal);
    listener->Stepped(1, bd::PlayDirectionForward);
    listener->TriggerTimeReached(bd::TRIGGER_A, 1);
    listener->TriggerSet(bd::TRIGGER_A, true);
    listener->ZoomModeSet(bd::ZOOM_PARAM_Def());
    listener->Stopped();
    listener->Finished(bdmv::INavControlListener::EndOfMedia);
    listener->StillOn();
    listener->StillOff();
    listener->Suspended();
    listener->Resumed();
    listener->ResumeFailed();
    listener->SystemSuspended(nullptr, 1);
    listener->SystemResumed(true);
    listener->SystemResumeFailed();
    listener->JumpOccurred();
    listener->PreloadFailed();

    listener->Playlist(1);
    listener->PlayItem(1, 1, bd::VideoFormatType1080p, bd::VideoAspectRatioType16x9);
    listener->PlayMode(bd::PlayDirectionForward, bd::PlaySpeedNormal);
    listener->AudioInfo(1);
    listener->VideoInfo(1);
    listener->AngleInfo(1);
    listener->InteractiveGraphicsInfo(1);
    listener->PresentationGraphicsInfo(1, true);
    listener->SecondaryAudioInfo(1);
    listener->SecondaryVideoInfo(1);
    listener->PipPgTextStInfo(1, true);
    listener->AudioInfoChanged(true, bd::AudioInfoType());
    listener->TextSubtitleStyleInfo(1);
    listener->TextSubtitleStylesAvailable(1);
    listener->UOMask(bdmv::UOMaskTable(1));
    listener->ChapterNumber(1);
    listener->MarkInfo(1, 1, 1);
    listener->CurrentTimePosition(1);
    listener->PictureInPictureAvailable();
    listener->PictureInPictureUnavailable();
    listener->SecondaryAudioAvailable();
    listener->SecondaryAudioUnavailable();
    listener->PresentationGraphicsDisplay(true);
    listener->SecondaryVideoDisplay(1, true);
    listener->SecondaryAudioDisplay(1, true);
    listener->PipPgTextSelect(true);

    listener->ExecuteButton(1, 1, program);

    listener->InteractiveGraphicsVisible();
    listener->InteractiveGraphicsInvisible();
    listener->PopUpMenuAvailable();
    listener->PopUpMenuUnavailable();
    listener->ButtonActivationBusy();
    listener->ButtonActivationDone();
    listener->InteractiveGraphicsActive();
    listener->InteractiveGraphicsInactive();

    EXPECT_EQ("", journal.Take());
    EXPECT_EQ(rawProgram, program.Get());
    EXPECT_EQ(1, program.GetCount());
}
