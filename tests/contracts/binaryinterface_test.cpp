// The order of the virtual operations is part of the binary interface: an implementation compiled
// elsewhere is called by slot number. The order is read from pointers to members, which hold the
// slot of a virtual function in every ABI that follows the Itanium C++ ABI.

#include <gtest/gtest.h>

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string>
#include <vector>

#include "bdmvnavigator/inavigatorevent.h"
#include "bdmvnavigator/inavigatorlistener.h"
#include "bdmvnavigator/iplaybackcontext.h"
#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "database/inavigationcommanddata.h"
#include "database/iprogramdata.h"

namespace
{

constexpr long DestructorSlots = 2;
constexpr long NotVirtual = -1;

/**
 * The slot of a virtual member function in the virtual table, from 0.
 *
 * @tparam Signature the parameters and the result that the function must have
 */
template <typename Signature, typename Interface> long SlotOf(Signature Interface::*function)
{
    struct {
        std::intptr_t pointer;    // to the function; for a virtual one its offset in the table,
        std::intptr_t adjustment; // and one of the two is odd to say so
    } parts;
    static_assert(sizeof(parts) == sizeof(function), "a pointer to member of the Itanium C++ ABI");
    std::memcpy(&parts, &function, sizeof(parts));

    const std::intptr_t size = sizeof(void*);
    if ((parts.pointer & 1) != 0) {
        return (parts.pointer - 1) / size;
    }
    return (parts.adjustment & 1) != 0 ? parts.pointer / size : NotVirtual;
}

/** An operation and where it stands. */
struct Operation {
    std::string name;
    long slot;
};

/** The operations fill the table behind the two slots of the destructor, in this order. */
void ExpectInThisOrder(const std::vector<Operation>& operations)
{
    long slot = DestructorSlots;
    for (const Operation& operation : operations) {
        EXPECT_EQ(slot, operation.slot) << operation.name;
        ++slot;
    }
}

/** Adds an operation of its own, which stands behind those of the interface. */
template <typename Interface> struct Extended : Interface {
    virtual void Next() = 0;
};

/** How many operations an interface has besides its destructor. */
template <typename Interface> long CountOperations()
{
    return SlotOf<void()>(&Extended<Interface>::Next) - DestructorSlots;
}

struct NotVirtualAtAll {
    void Plain() {}
};

} // namespace

TEST(BinaryInterface, OrdinaryMemberFunctionsHaveNoSlot)
{
    EXPECT_EQ(NotVirtual, SlotOf<void()>(&NotVirtualAtAll::Plain));
}

TEST(BinaryInterface, OfControlListener)
{
    typedef bdmv::INavControlListener I;
    ExpectInThisOrder({
        {"PlayStarted", SlotOf<void()>(&I::PlayStarted)},
        {"FirstPictureDelivered", SlotOf<void()>(&I::FirstPictureDelivered)},
        {"PlayFailed", SlotOf<void()>(&I::PlayFailed)},
        {"Paused", SlotOf<void()>(&I::Paused)},
        {"Continued", SlotOf<void(bd::PlayDirectionDef, bd::PlaySpeedDef)>(&I::Continued)},
        {"Stepped", SlotOf<void(const bd::TimePosition&, bd::PlayDirectionDef)>(&I::Stepped)},
        {"TriggerTimeReached",
         SlotOf<void(bd::TriggerType, const bd::TimePosition&)>(&I::TriggerTimeReached)},
        {"TriggerSet", SlotOf<void(bd::TriggerType, bool)>(&I::TriggerSet)},
        {"ZoomModeSet", SlotOf<void(bd::ZOOM_PARAM_Def)>(&I::ZoomModeSet)},
        {"Stopped", SlotOf<void()>(&I::Stopped)},
        {"Finished", SlotOf<void(bdmv::INavControlListener::FinishedReason)>(&I::Finished)},
        {"StillOn", SlotOf<void()>(&I::StillOn)},
        {"StillOff", SlotOf<void()>(&I::StillOff)},
        {"Suspended", SlotOf<void()>(&I::Suspended)},
        {"Resumed", SlotOf<void()>(&I::Resumed)},
        {"ResumeFailed", SlotOf<void()>(&I::ResumeFailed)},
        {"SystemSuspended", SlotOf<void(const void*, bd::UInt32)>(&I::SystemSuspended)},
        {"SystemResumed", SlotOf<void(bool)>(&I::SystemResumed)},
        {"SystemResumeFailed", SlotOf<void()>(&I::SystemResumeFailed)},
        {"JumpOccurred", SlotOf<void()>(&I::JumpOccurred)},
        {"PreloadFailed", SlotOf<void()>(&I::PreloadFailed)},
    });
    EXPECT_EQ(21, CountOperations<I>());
}

TEST(BinaryInterface, OfSettingsListener)
{
    typedef bdmv::INavSettingsListener I;
    ExpectInThisOrder({
        {"Playlist", SlotOf<void(bd::PlayListIdDef)>(&I::Playlist)},
        {"PlayItem", SlotOf<void(bd::PlayListIdDef, bd::PlayItemIdDef, bd::VideoFormatType,
                                 bd::VideoAspectRatioType)>(&I::PlayItem)},
        {"PlayMode", SlotOf<void(bd::PlayDirectionDef, bd::PlaySpeedDef)>(&I::PlayMode)},
        {"AudioInfo", SlotOf<void(bd::StreamNumberDef)>(&I::AudioInfo)},
        {"VideoInfo", SlotOf<void(bd::StreamNumberDef)>(&I::VideoInfo)},
        {"AngleInfo", SlotOf<void(bd::AngleNumberDef)>(&I::AngleInfo)},
        {"InteractiveGraphicsInfo", SlotOf<void(bd::StreamNumberDef)>(&I::InteractiveGraphicsInfo)},
        {"PresentationGraphicsInfo",
         SlotOf<void(bd::StreamNumberDef, bool)>(&I::PresentationGraphicsInfo)},
        {"SecondaryAudioInfo", SlotOf<void(bd::StreamNumberDef)>(&I::SecondaryAudioInfo)},
        {"SecondaryVideoInfo", SlotOf<void(bd::StreamNumberDef)>(&I::SecondaryVideoInfo)},
        {"PipPgTextStInfo", SlotOf<void(bd::StreamNumberDef, bool)>(&I::PipPgTextStInfo)},
        {"AudioInfoChanged", SlotOf<void(bool, bd::AudioInfoType)>(&I::AudioInfoChanged)},
        {"TextSubtitleStyleInfo", SlotOf<void(bd::UserStyleNumber)>(&I::TextSubtitleStyleInfo)},
        {"TextSubtitleStylesAvailable", SlotOf<void(bd::UInt8)>(&I::TextSubtitleStylesAvailable)},
        {"UOMask", SlotOf<void(const bdmv::UOMaskTable&)>(&I::UOMask)},
        {"ChapterNumber", SlotOf<void(const bd::ChapterNumberDef&)>(&I::ChapterNumber)},
        {"MarkInfo",
         SlotOf<void(bd::PlayListIdDef, const bd::PlayListMarkIdDef&, const bd::TimePosition&)>(
             &I::MarkInfo)},
        {"CurrentTimePosition", SlotOf<void(const bd::TimePosition&)>(&I::CurrentTimePosition)},
        {"PictureInPictureAvailable", SlotOf<void()>(&I::PictureInPictureAvailable)},
        {"PictureInPictureUnavailable", SlotOf<void()>(&I::PictureInPictureUnavailable)},
        {"SecondaryAudioAvailable", SlotOf<void()>(&I::SecondaryAudioAvailable)},
        {"SecondaryAudioUnavailable", SlotOf<void()>(&I::SecondaryAudioUnavailable)},
        {"PresentationGraphicsDisplay", SlotOf<void(bool)>(&I::PresentationGraphicsDisplay)},
        {"SecondaryVideoDisplay",
         SlotOf<void(bd::StreamNumberDef, bool)>(&I::SecondaryVideoDisplay)},
        {"SecondaryAudioDisplay",
         SlotOf<void(bd::StreamNumberDef, bool)>(&I::SecondaryAudioDisplay)},
        {"PipPgTextSelect", SlotOf<void(bool)>(&I::PipPgTextSelect)},
    });
    EXPECT_EQ(26, CountOperations<I>());
}

TEST(BinaryInterface, OfButtonListener)
{
    typedef bdmv::INavButtonListener I;
    ExpectInThisOrder({
        {"ExecuteButton", SlotOf<void(bd::UInt32, bd::ButtonId, bd::RefPtr<bdmv::IProgramData>&)>(
                              &I::ExecuteButton)},
    });
    EXPECT_EQ(1, CountOperations<I>());
}

TEST(BinaryInterface, OfInteractiveListener)
{
    typedef bdmv::INavInteractiveListener I;
    ExpectInThisOrder({
        {"InteractiveGraphicsVisible", SlotOf<void()>(&I::InteractiveGraphicsVisible)},
        {"InteractiveGraphicsInvisible", SlotOf<void()>(&I::InteractiveGraphicsInvisible)},
        {"PopUpMenuAvailable", SlotOf<void()>(&I::PopUpMenuAvailable)},
        {"PopUpMenuUnavailable", SlotOf<void()>(&I::PopUpMenuUnavailable)},
        {"ButtonActivationBusy", SlotOf<void()>(&I::ButtonActivationBusy)},
        {"ButtonActivationDone", SlotOf<void()>(&I::ButtonActivationDone)},
        {"InteractiveGraphicsActive", SlotOf<void()>(&I::InteractiveGraphicsActive)},
        {"InteractiveGraphicsInactive", SlotOf<void()>(&I::InteractiveGraphicsInactive)},
    });
    EXPECT_EQ(8, CountOperations<I>());
}

TEST(BinaryInterface, OfListenerIsControlSettingsButtonInteractive)
{
    bdmv::NavigatorListenerAdapter adapter;
    bdmv::INavigatorListener* const listener = &adapter;
    const char* const start = reinterpret_cast<const char*>(listener);
    const auto offsetOf = [start](const void* base) {
        return static_cast<const char*>(base) - start;
    };
    const std::ptrdiff_t size = sizeof(void*);

    EXPECT_EQ(0 * size, offsetOf(static_cast<bdmv::INavControlListener*>(listener)));
    EXPECT_EQ(1 * size, offsetOf(static_cast<bdmv::INavSettingsListener*>(listener)));
    EXPECT_EQ(2 * size, offsetOf(static_cast<bdmv::INavButtonListener*>(listener)));
    EXPECT_EQ(3 * size, offsetOf(static_cast<bdmv::INavInteractiveListener*>(listener)));
}

TEST(BinaryInterface, OfListenerAddsNoOperations)
{
    EXPECT_EQ(CountOperations<bdmv::INavControlListener>(),
              CountOperations<bdmv::INavigatorListener>());
}

TEST(BinaryInterface, OfErrorInterfaceHasNoOperations)
{
    EXPECT_EQ(0, CountOperations<bdmv::INavError>());
}

TEST(BinaryInterface, OfPlaybackContext)
{
    typedef bdmv::IPlaybackContext I;
    typedef void StreamInfo(bd::StreamNumberDef*, bd::UInt8*);
    ExpectInThisOrder({
        {"GetSystemResumeData", SlotOf<const bd::DataBlockDef&()>(&I::GetSystemResumeData)},
        {"CleanupSystemResumeData", SlotOf<void()>(&I::CleanupSystemResumeData)},
        {"IsPlayingAfterSystemResume", SlotOf<bool()>(&I::IsPlayingAfterSystemResume)},
        {"GetPlayListId", SlotOf<bd::PlayListIdDef()>(&I::GetPlayListId)},
        {"GetPlayItemId", SlotOf<bd::PlayItemIdDef()>(&I::GetPlayItemId)},
        {"GetPlayMode", SlotOf<const bd::PlayMode&()>(&I::GetPlayMode)},
        {"GetTrigger", SlotOf<bd::Trigger()>(&I::GetTrigger)},
        {"GetTriggerReachedTime", SlotOf<bd::TimePosition()>(&I::GetTriggerReachedTime)},
        {"GetCurrentABRepeatState", SlotOf<bd::TriggerType()>(&I::GetCurrentABRepeatState)},
        {"GetCurrentChpTitleRepeatState",
         SlotOf<bd::TriggerType()>(&I::GetCurrentChpTitleRepeatState)},
        {"GetTriggerTypeByTime",
         SlotOf<bd::TriggerType(bd::TimePosition)>(&I::GetTriggerTypeByTime)},
        {"GetCurrentChapter", SlotOf<bd::ChapterNumberDef()>(&I::GetCurrentChapter)},
        {"GetCurrentPLMarkId",
         SlotOf<bd::PlayListMarkIdDef(bd::TimePosition&)>(&I::GetCurrentPLMarkId)},
        {"GetVideoInfo", SlotOf<StreamInfo>(&I::GetVideoInfo)},
        {"GetVideoAttributes",
         SlotOf<void(bd::VideoFormatType&, bd::VideoAspectRatioType&)>(&I::GetVideoAttributes)},
        {"GetAudioInfo", SlotOf<StreamInfo>(&I::GetAudioInfo)},
        {"GetIgInfo", SlotOf<StreamInfo>(&I::GetIgInfo)},
        {"rGetPgTextStInfo",
         SlotOf<bdmv::INavError::ErrCode(bd::StreamNumberDef*, bd::UInt8*)>(&I::rGetPgTextStInfo)},
        {"GetPgTextStInfo", SlotOf<StreamInfo>(&I::GetPgTextStInfo)},
        {"GetSecondaryVideoInfo",
         SlotOf<void(bd::StreamNumberDef*, bd::UInt8*, bool*)>(&I::GetSecondaryVideoInfo)},
        {"GetSecondaryAudioInfo", SlotOf<StreamInfo>(&I::GetSecondaryAudioInfo)},
        {"GetPipPgTextStInfo", SlotOf<StreamInfo>(&I::GetPipPgTextStInfo)},
        {"GetAngleInfo", SlotOf<void(bd::AngleNumberDef*, bd::UInt8*)>(&I::GetAngleInfo)},
        {"GetPgTextStDisplay", SlotOf<bool()>(&I::GetPgTextStDisplay)},
        {"GetSecondaryVideoDisplay", SlotOf<bool()>(&I::GetSecondaryVideoDisplay)},
        {"GetSecondaryAudioDisplay", SlotOf<bool()>(&I::GetSecondaryAudioDisplay)},
        {"GetPipPgTextStSelect", SlotOf<bool()>(&I::GetPipPgTextStSelect)},
        {"GetUOMask", SlotOf<void(bdmv::UOMaskTable&)>(&I::GetUOMask)},
        {"GetCurrentPlayMode", SlotOf<const bd::PlayMode&()>(&I::GetCurrentPlayMode)},
        {"GetCurrentTimePosition", SlotOf<bd::TimePosition()>(&I::GetCurrentTimePosition)},
        {"GetExecuteButtonData",
         SlotOf<void(bd::RefPtr<bdmv::IProgramData>&, bd::UInt32&, bd::ButtonId&)>(
             &I::GetExecuteButtonData)},
        {"GetCurrentTextSubtitleStyleNumber",
         SlotOf<bd::UserStyleNumber()>(&I::GetCurrentTextSubtitleStyleNumber)},
        {"GetNumberOfTextSubtitleStyles", SlotOf<bd::UInt8()>(&I::GetNumberOfTextSubtitleStyles)},
        {"GetFinishedReason", SlotOf<bdstreaming::FinishedReason()>(&I::GetFinishedReason)},
        {"GetZoomScaleInfo", SlotOf<void(bd::ZOOM_PARAM_Def&)>(&I::GetZoomScaleInfo)},
        {"IsAsyncPipInCurrentPlayItem",
         SlotOf<void(bool&, bool&, bool&, bool&)>(&I::IsAsyncPipInCurrentPlayItem)},
    });
    EXPECT_EQ(36, CountOperations<I>());
}

TEST(BinaryInterface, OfProgramData)
{
    typedef bdmv::IProgramData I;
    ExpectInThisOrder({
        {"GetNumberOfNavigationCommands",
         SlotOf<bd::UInt16() const>(&I::GetNumberOfNavigationCommands)},
        {"GetNavigationCommandData",
         SlotOf<const bdmv::INavigationCommandData*(I::CommandIdDef) const>(
             &I::GetNavigationCommandData)},
    });
    EXPECT_EQ(2, CountOperations<I>());
}

TEST(BinaryInterface, OfNavigationCommandData)
{
    typedef bdmv::INavigationCommandData I;
    ExpectInThisOrder({
        {"GetCommand", SlotOf<I::Command() const>(&I::GetCommand)},
        {"GetOperands",
         SlotOf<void(bool&, bd::UInt32&, bool&, bd::UInt32&) const>(&I::GetOperands)},
    });
    EXPECT_EQ(2, CountOperations<I>());
}

TEST(BinaryInterface, OfNavigatorEvent)
{
    typedef bdmv::INavigatorEvent I;
    ExpectInThisOrder({
        {"Dispatch", SlotOf<void(bd::EventListenerList<bdmv::INavigatorListener>&)>(&I::Dispatch)},
    });
    EXPECT_EQ(1, CountOperations<I>());
}
