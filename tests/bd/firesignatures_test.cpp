// Every signature that events fire, with deduced template arguments and with explicit ones that
// name the listener's parameters as declared.

#include <gtest/gtest.h>

#include <string>

#include "bd/eventlistenerlist.h"
#include "bdmvnavigator/inavigatorlistener.h"
#include "testkit/recordinglistener.h"

namespace
{

typedef bdmv::INavigatorListener Listener;

class FireSignatures : public testing::Test
{
protected:
    FireSignatures() { list.AddListener(&a); }

    // Each fires twice: with deduced and with explicit template arguments.

    template <typename Owner> void Fire0(void (Owner::*method)())
    {
        bd::EventListenerList_FireParam0(list, method);
        bd::EventListenerList_FireParam0<Listener>(list, method);
    }

    template <typename P1, typename Owner> void Fire1(void (Owner::*method)(P1), const P1& param)
    {
        bd::EventListenerList_FireParam1(list, method, param);
        bd::EventListenerList_FireParam1<Listener, P1>(list, method, param);
    }

    template <typename P1, typename P2, typename Owner>
    void Fire2(void (Owner::*method)(P1, P2), const P1& param1, const P2& param2)
    {
        bd::EventListenerList_FireParam2(list, method, param1, param2);
        bd::EventListenerList_FireParam2<Listener, P1, P2>(list, method, param1, param2);
    }

    template <typename P1, typename P2, typename P3, typename Owner>
    void Fire3(void (Owner::*method)(P1, P2, P3), const P1& param1, const P2& param2,
               const P3& param3)
    {
        bd::EventListenerList_FireParam3(list, method, param1, param2, param3);
        bd::EventListenerList_FireParam3<Listener, P1, P2, P3>(list, method, param1, param2,
                                                               param3);
    }

    template <typename P1, typename P2, typename P3, typename P4, typename Owner>
    void Fire4(void (Owner::*method)(P1, P2, P3, P4), const P1& param1, const P2& param2,
               const P3& param3, const P4& param4)
    {
        bd::EventListenerList_FireParam4(list, method, param1, param2, param3, param4);
        bd::EventListenerList_FireParam4<Listener, P1, P2, P3, P4>(list, method, param1, param2,
                                                                   param3, param4);
    }

    void ExpectTwice(const std::string& call)
    {
        EXPECT_EQ("A." + call + "\nA." + call + "\n", journal.Take());
    }

    bdmvtest::Journal journal;
    bdmvtest::RecordingListener a{journal, "A"};
    bd::EventListenerList<Listener> list;
};

} // namespace

TEST_F(FireSignatures, NoArguments)
{
    Fire0(&Listener::PlayStarted);
    ExpectTwice("PlayStarted()");
    Fire0(&Listener::FirstPictureDelivered);
    ExpectTwice("FirstPictureDelivered()");
    Fire0(&Listener::PlayFailed);
    ExpectTwice("PlayFailed()");
    Fire0(&Listener::Paused);
    ExpectTwice("Paused()");
    Fire0(&Listener::Stopped);
    ExpectTwice("Stopped()");
    Fire0(&Listener::StillOn);
    ExpectTwice("StillOn()");
    Fire0(&Listener::StillOff);
    ExpectTwice("StillOff()");
    Fire0(&Listener::Suspended);
    ExpectTwice("Suspended()");
    Fire0(&Listener::Resumed);
    ExpectTwice("Resumed()");
    Fire0(&Listener::ResumeFailed);
    ExpectTwice("ResumeFailed()");
    Fire0(&Listener::SystemResumeFailed);
    ExpectTwice("SystemResumeFailed()");
    Fire0(&Listener::JumpOccurred);
    ExpectTwice("JumpOccurred()");
    Fire0(&Listener::PreloadFailed);
    ExpectTwice("PreloadFailed()");
    Fire0(&Listener::PictureInPictureAvailable);
    ExpectTwice("PictureInPictureAvailable()");
    Fire0(&Listener::PictureInPictureUnavailable);
    ExpectTwice("PictureInPictureUnavailable()");
    Fire0(&Listener::SecondaryAudioAvailable);
    ExpectTwice("SecondaryAudioAvailable()");
    Fire0(&Listener::SecondaryAudioUnavailable);
    ExpectTwice("SecondaryAudioUnavailable()");
    Fire0(&Listener::InteractiveGraphicsVisible);
    ExpectTwice("InteractiveGraphicsVisible()");
    Fire0(&Listener::InteractiveGraphicsInvisible);
    ExpectTwice("InteractiveGraphicsInvisible()");
    Fire0(&Listener::InteractiveGraphicsActive);
    ExpectTwice("InteractiveGraphicsActive()");
    Fire0(&Listener::InteractiveGraphicsInactive);
    ExpectTwice("InteractiveGraphicsInactive()");
    Fire0(&Listener::PopUpMenuAvailable);
    ExpectTwice("PopUpMenuAvailable()");
    Fire0(&Listener::PopUpMenuUnavailable);
    ExpectTwice("PopUpMenuUnavailable()");
    Fire0(&Listener::ButtonActivationBusy);
    ExpectTwice("ButtonActivationBusy()");
    Fire0(&Listener::ButtonActivationDone);
    ExpectTwice("ButtonActivationDone()");
}

TEST_F(FireSignatures, Flag)
{
    Fire1<bool>(&Listener::SystemResumed, true);
    ExpectTwice("SystemResumed(true)");
    Fire1<bool>(&Listener::PipPgTextSelect, false);
    ExpectTwice("PipPgTextSelect(false)");
    Fire1<bool>(&Listener::PresentationGraphicsDisplay, true);
    ExpectTwice("PresentationGraphicsDisplay(true)");
}

TEST_F(FireSignatures, EightBits)
{
    Fire1<bd::UInt8>(&Listener::TextSubtitleStylesAvailable, 255);
    ExpectTwice("TextSubtitleStylesAvailable(255)");
    Fire1<bd::UInt8>(&Listener::TextSubtitleStyleInfo, 25);
    ExpectTwice("TextSubtitleStyleInfo(25)");
}

TEST_F(FireSignatures, ConstEightBits)
{
    Fire1<const bd::UInt8>(&Listener::AngleInfo, 9);
    ExpectTwice("AngleInfo(9)");
}

TEST_F(FireSignatures, ConstSixteenBits)
{
    Fire1<const bd::UInt16>(&Listener::AudioInfo, 65535);
    ExpectTwice("AudioInfo(65535)");
    Fire1<const bd::UInt16>(&Listener::VideoInfo, 2);
    ExpectTwice("VideoInfo(2)");
    Fire1<const bd::UInt16>(&Listener::InteractiveGraphicsInfo, 3);
    ExpectTwice("InteractiveGraphicsInfo(3)");
    Fire1<const bd::UInt16>(&Listener::SecondaryAudioInfo, 4);
    ExpectTwice("SecondaryAudioInfo(4)");
    Fire1<const bd::UInt16>(&Listener::SecondaryVideoInfo, 5);
    ExpectTwice("SecondaryVideoInfo(5)");
}

TEST_F(FireSignatures, ReferenceToSixteenBits)
{
    const bd::ChapterNumberDef chapter = 999;
    Fire1<const bd::UInt16&>(&Listener::ChapterNumber, chapter);
    ExpectTwice("ChapterNumber(999)");
}

TEST_F(FireSignatures, ThirtyTwoBits)
{
    Fire1<bd::UInt32>(&Listener::Playlist, 4294967295u);
    ExpectTwice("Playlist(4294967295)");
}

TEST_F(FireSignatures, ReferenceToSixtyFourBits)
{
    const bd::TimePosition position = 18446744073709551615u;
    Fire1<const bd::UInt64&>(&Listener::CurrentTimePosition, position);
    ExpectTwice("CurrentTimePosition(18446744073709551615)");
}

TEST_F(FireSignatures, ZoomParameters)
{
    const bd::ZOOM_PARAM_Def zoom = {{1, 2, 3, 4}, {5, 6, 7, 8}, 9};
    Fire1<bd::ZOOM_PARAM_Def>(&Listener::ZoomModeSet, zoom);
    ExpectTwice("ZoomModeSet(((1, 2, 3, 4), (5, 6, 7, 8), 9))");
}

TEST_F(FireSignatures, FinishedReason)
{
    Fire1<bdmv::INavControlListener::FinishedReason>(&Listener::Finished,
                                                     bdmv::INavControlListener::DataStarvation);
    ExpectTwice("Finished(DataStarvation)");
}

TEST_F(FireSignatures, ReferenceToUOMaskTable)
{
    const bdmv::UOMaskTable mask(1);
    Fire1<const bdmv::UOMaskTable&>(&Listener::UOMask, mask);
    ExpectTwice("UOMask(9223372036854775808)");
}

TEST_F(FireSignatures, DirectionAndSpeed)
{
    Fire2<bd::PlayDirectionDef, bd::PlaySpeedDef>(&Listener::Continued, bd::PlayDirectionBackward,
                                                  bd::PlaySpeedFast1);
    ExpectTwice("Continued(PlayDirectionBackward, PlaySpeedFast1)");
}

TEST_F(FireSignatures, ConstDirectionAndConstSpeed)
{
    Fire2<const bd::PlayDirectionDef, const bd::PlaySpeedDef>(
        &Listener::PlayMode, bd::PlayDirectionBackward, bd::PlaySpeedFast1);
    ExpectTwice("PlayMode(PlayDirectionBackward, PlaySpeedFast1)");
}

TEST_F(FireSignatures, ReferenceToSixtyFourBitsAndDirection)
{
    const bd::TimePosition position = 90000;
    Fire2<const bd::UInt64&, bd::PlayDirectionDef>(&Listener::Stepped, position,
                                                   bd::PlayDirectionBackward);
    ExpectTwice("Stepped(90000, PlayDirectionBackward)");
}

TEST_F(FireSignatures, TriggerTypeAndReferenceToSixtyFourBits)
{
    const bd::TimePosition time = 90000;
    Fire2<bd::TriggerType, const bd::UInt64&>(&Listener::TriggerTimeReached, bd::TRIGGER_CHP, time);
    ExpectTwice("TriggerTimeReached(TRIGGER_CHP, 90000)");
}

TEST_F(FireSignatures, TriggerTypeAndFlag)
{
    Fire2<bd::TriggerType, bool>(&Listener::TriggerSet, bd::TRIGGER_A, true);
    ExpectTwice("TriggerSet(TRIGGER_A, true)");
}

TEST_F(FireSignatures, ConstSixteenBitsAndFlag)
{
    Fire2<const bd::UInt16, bool>(&Listener::SecondaryAudioDisplay, 1, true);
    ExpectTwice("SecondaryAudioDisplay(1, true)");
    Fire2<const bd::UInt16, bool>(&Listener::SecondaryVideoDisplay, 2, false);
    ExpectTwice("SecondaryVideoDisplay(2, false)");
    Fire2<const bd::UInt16, bool>(&Listener::PipPgTextStInfo, 3, true);
    ExpectTwice("PipPgTextStInfo(3, true)");
    Fire2<const bd::UInt16, bool>(&Listener::PresentationGraphicsInfo, 4, false);
    ExpectTwice("PresentationGraphicsInfo(4, false)");
}

TEST_F(FireSignatures, BlockAndThirtyTwoBits)
{
    const bd::UInt8 bytes[] = {1, 2, 3};
    Fire2<const void*, bd::UInt32>(&Listener::SystemSuspended, bytes, 3);
    ExpectTwice("SystemSuspended(bytes 1 2 3, 3)");
}

TEST_F(FireSignatures, FlagAndAudioInfo)
{
    bd::AudioInfoType info;
    info.format = bd::AudioFormatEac3;
    info.pid = 0x1100;
    Fire2<bool, bd::AudioInfoType>(&Listener::AudioInfoChanged, true, info);
    ExpectTwice("AudioInfoChanged(true, (AudioFormatEac3, AudioSampleRateUnknown, "
                "AudioBitsPerSamplingTypeInvalid, AudioChannelTypeUnknown, 4352, 0))");
}

TEST_F(FireSignatures, ThirtyTwoBitsAndReferencesToSixteenAndSixtyFourBits)
{
    const bd::PlayListMarkIdDef markId = 4;
    const bd::TimePosition time = 90000;
    Fire3<bd::UInt32, const bd::UInt16&, const bd::UInt64&>(&Listener::MarkInfo, 800, markId, time);
    ExpectTwice("MarkInfo(800, 4, 90000)");
}

TEST_F(FireSignatures, ThirtyTwoAndSixteenBitsAndReferenceToProgram)
{
    bd::RefPtr<bdmv::IProgramData> program;
    Fire3<bd::UInt32, bd::UInt16, bd::RefPtr<bdmv::IProgramData>&>(&Listener::ExecuteButton, 7, 3,
                                                                   program);
    ExpectTwice("ExecuteButton(7, 3, no program)");
}

TEST_F(FireSignatures, ThirtyTwoAndSixteenBitsAndVideoAttributes)
{
    Fire4<bd::UInt32, bd::UInt16, bd::VideoFormatType, bd::VideoAspectRatioType>(
        &Listener::PlayItem, 800, 1, bd::VideoFormatType1080p, bd::VideoAspectRatioType16x9);
    ExpectTwice("PlayItem(800, 1, VideoFormatType1080p, VideoAspectRatioType16x9)");
}
