// The order of the virtual operations is part of the binary interface: an implementation compiled
// elsewhere is called by slot number. The tests prove it from both sides, in every ABI that follows
// the Itanium C++ ABI. The caller: a pointer to member contains the slot that a call by name uses.
// The object: its virtual table is read, each entry is called as a function whose first argument is
// the object, and the override records its name.

#include <gtest/gtest.h>

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <functional>
#include <new>
#include <string>
#include <type_traits>
#include <vector>

#include "bdmvnavigator/inavigatorevent.h"
#include "bdmvnavigator/inavigatorlistener.h"
#include "bdmvnavigator/iplaybackcontext.h"
#include "database/inavigationcommanddata.h"
#include "database/iplaylistmark.h"
#include "database/iprogramdata.h"
#include "testkit/journal.h"
#include "testkit/recordinglistener.h"
#include "testkit/scriptableplaybackcontext.h"

#if defined(__clang__)
// In machine code a virtual function is a plain function, and it is called as one.
#define CALLS_TABLE_ENTRY __attribute__((no_sanitize("function")))
#else
#define CALLS_TABLE_ENTRY
#endif

namespace
{

constexpr long CompleteDestructorSlot = 0;
constexpr long DeletingDestructorSlot = 1;
constexpr long DestructorSlots = 2;
constexpr long NotVirtual = -1;

// Where the lowest bit of a function's address is in use, the adjustment of the object is doubled
// and its lowest bit marks a virtual function.
#if defined(__arm__) || defined(__aarch64__) || defined(__mips__)
constexpr bool MarkIsInAdjustment = true;
#else
constexpr bool MarkIsInAdjustment = false;
#endif

/**
 * The slot of a virtual member function in the virtual table, from 0: the one that a call by name
 * uses.
 */
template <typename Function> long SlotOf(Function function)
{
    struct {
        std::intptr_t pointer; // to the function; for a virtual one its offset in the table
        std::intptr_t adjustment;
    } parts;
    static_assert(sizeof(parts) == sizeof(function), "a pointer to member of the Itanium C++ ABI");
    std::memcpy(&parts, &function, sizeof(parts));

    const std::intptr_t size = sizeof(void*);
    if (MarkIsInAdjustment) {
        return (parts.adjustment & 1) != 0 ? parts.pointer / size : NotVirtual;
    }
    return (parts.pointer & 1) != 0 ? (parts.pointer - 1) / size : NotVirtual;
}

/** The function in a slot of an object's virtual table. */
template <typename Function> Function TableEntry(const void* object, long slot)
{
    const void* const* table = nullptr;
    std::memcpy(&table, object, sizeof(table));
    Function function = nullptr;
    std::memcpy(&function, &table[slot], sizeof(function));
    return function;
}

/** An argument: a value, or the object that a reference or a pointer refers to. */
template <typename Parameter> struct Argument {
    std::remove_const_t<std::remove_reference_t<Parameter>> value = {};
    operator Parameter() { return static_cast<Parameter>(value); }
};

template <typename Value> struct Argument<Value*> {
    Value value = {};
    operator Value*() { return &value; }
};

template <> struct Argument<const void*> {
    operator const void*() { return nullptr; }
};

/** Calls the operation of a signature in a slot of an object's table. */
template <typename Signature> struct TableCall;

template <typename Result, typename... Parameters> struct TableCall<Result(Parameters...)> {
    CALLS_TABLE_ENTRY static void Call(void* object, long slot)
    {
        const auto entry = TableEntry<Result (*)(void*, Parameters...)>(object, slot);
        static_cast<void>(entry(object, Argument<Parameters>()...));
    }
};

template <typename Result, typename... Parameters>
struct TableCall<Result(Parameters...) const> : TableCall<Result(Parameters...)> {
};

CALLS_TABLE_ENTRY void CallDestructor(void* object, long slot)
{
    TableEntry<void (*)(void*)>(object, slot)(object);
}

/** An operation, the slot that callers use, and a function that calls a slot of an object. */
struct Operation {
    std::string name;
    long slot;
    std::function<void(void* object, long slot)> call;
};

/** @tparam Signature the parameters and the result that the operation must have */
template <typename Signature, typename Interface>
Operation Op(const char* name, Signature Interface::*function)
{
    return {name, SlotOf(function), TableCall<Signature>::Call};
}

/**
 * Callers expect the operations after the two slots of the destructor, in this order, and the
 * object has them there.
 *
 * @param object  implements the interface, and records its calls in the journal
 * @param journal has entries such as "name.Operation(arguments)"
 */
template <typename Interface>
void ExpectInThisOrder(Interface& object, bdmvtest::Journal& journal,
                       const std::vector<Operation>& operations)
{
    long slot = DestructorSlots;
    for (const Operation& operation : operations) {
        EXPECT_EQ(slot, operation.slot) << operation.name;
        journal.Take();
        operation.call(&object, slot);
        const std::string ran = journal.Take();
        EXPECT_NE(std::string::npos, ran.find("." + operation.name + "("))
            << operation.name << ", but slot " << slot << " ran " << ran;
        ++slot;
    }
}

/** Adds an operation, which follows those of the interface. */
template <typename Interface> struct Extended : Interface {
    virtual void Next() = 0;
};

/** The number of operations of an interface besides its destructor. */
template <typename Interface> long CountOperations()
{
    return SlotOf(&Extended<Interface>::Next) - DestructorSlots;
}

struct PlainClass {
    void Plain() {}
};

class BinaryInterface : public testing::Test
{
protected:
    bdmvtest::Journal journal;
    bdmvtest::RecordingListener listener{journal, "listener"};
    bdmvtest::ScriptablePlaybackContext context{journal};
};

class RecordingProgram : public bdmv::IProgramData
{
public:
    explicit RecordingProgram(bdmvtest::Journal& journal) : m_rJournal(journal) {}

    bd::UInt16 GetNumberOfNavigationCommands() const override
    {
        m_rJournal.Add("program.GetNumberOfNavigationCommands()");
        return 0;
    }

    const bdmv::INavigationCommandData* GetNavigationCommandData(CommandIdDef) const override
    {
        m_rJournal.Add("program.GetNavigationCommandData(command)");
        return nullptr;
    }

private:
    bdmvtest::Journal& m_rJournal;
};

class RecordingCommand : public bdmv::INavigationCommandData
{
public:
    explicit RecordingCommand(bdmvtest::Journal& journal) : m_rJournal(journal) {}

    Command GetCommand() const override
    {
        m_rJournal.Add("command.GetCommand()");
        return CommandNop;
    }

    void GetOperands(bool&, bd::UInt32&, bool&, bd::UInt32&) const override
    {
        m_rJournal.Add("command.GetOperands(operands)");
    }

private:
    bdmvtest::Journal& m_rJournal;
};

class RecordingEvent : public bdmv::INavigatorEvent
{
public:
    explicit RecordingEvent(bdmvtest::Journal& journal) : m_rJournal(journal) {}

    void Dispatch(Listeners&) override { m_rJournal.Add("event.Dispatch(listeners)"); }

private:
    bdmvtest::Journal& m_rJournal;
};

/** Counts its destructions and its deletions; does not own its memory. */
template <typename Implementation> struct CountedDestruction : Implementation {
    using Implementation::Implementation;
    ~CountedDestruction() override { ++destroyed; }
    static void operator delete(void*) { ++deleted; }

    static inline int destroyed = 0;
    static inline int deleted = 0;
};

/** The table begins with the destructor: the one that only destroys, then the one that deletes. */
template <typename Interface, typename Implementation, typename... Arguments>
void ExpectDestructorFirst(const char* name, Arguments&&... arguments)
{
    SCOPED_TRACE(name);
    typedef CountedDestruction<Implementation> Object;
    Object::destroyed = 0;
    Object::deleted = 0;

    alignas(Object) unsigned char memory[sizeof(Object)];
    Interface* object = ::new (memory) Object(arguments...);
    CallDestructor(object, CompleteDestructorSlot);
    EXPECT_EQ(1, Object::destroyed);
    EXPECT_EQ(0, Object::deleted);

    object = ::new (memory) Object(arguments...);
    CallDestructor(object, DeletingDestructorSlot);
    EXPECT_EQ(2, Object::destroyed);
    EXPECT_EQ(1, Object::deleted);
}

struct Mark : bdmv::IPlayListMark {
};

} // namespace

TEST_F(BinaryInterface, OrdinaryMemberFunctionsHaveNoSlot)
{
    EXPECT_EQ(NotVirtual, SlotOf(&PlainClass::Plain));
}

TEST_F(BinaryInterface, BeginsWithTheDestructor)
{
    using bdmvtest::RecordingListener;
    using bdmvtest::ScriptablePlaybackContext;
    ExpectDestructorFirst<bdmv::INavControlListener, RecordingListener>("control", journal, "");
    ExpectDestructorFirst<bdmv::INavSettingsListener, RecordingListener>("settings", journal, "");
    ExpectDestructorFirst<bdmv::INavButtonListener, RecordingListener>("button", journal, "");
    ExpectDestructorFirst<bdmv::INavInteractiveListener, RecordingListener>("menu", journal, "");
    ExpectDestructorFirst<bdmv::INavigatorListener, RecordingListener>("listener", journal, "");
    ExpectDestructorFirst<bdmv::IPlaybackContext, ScriptablePlaybackContext>("context", journal);
    ExpectDestructorFirst<bdmv::INavError, ScriptablePlaybackContext>("error", journal);
    ExpectDestructorFirst<bdmv::IProgramData, RecordingProgram>("program", journal);
    ExpectDestructorFirst<bdmv::INavigationCommandData, RecordingCommand>("command", journal);
    ExpectDestructorFirst<bdmv::IPlayListMark, Mark>("mark");
    ExpectDestructorFirst<bdmv::INavigatorEvent, RecordingEvent>("event", journal);
}

TEST_F(BinaryInterface, OfControlListener)
{
    typedef bdmv::INavControlListener I;
    ExpectInThisOrder<I>(
        listener, journal,
        {
            Op<void()>("PlayStarted", &I::PlayStarted),
            Op<void()>("FirstPictureDelivered", &I::FirstPictureDelivered),
            Op<void()>("PlayFailed", &I::PlayFailed),
            Op<void()>("Paused", &I::Paused),
            Op<void(bd::PlayDirectionDef, bd::PlaySpeedDef)>("Continued", &I::Continued),
            Op<void(const bd::TimePosition&, bd::PlayDirectionDef)>("Stepped", &I::Stepped),
            Op<void(bd::TriggerType, const bd::TimePosition&)>("TriggerTimeReached",
                                                               &I::TriggerTimeReached),
            Op<void(bd::TriggerType, bool)>("TriggerSet", &I::TriggerSet),
            Op<void(bd::ZOOM_PARAM_Def)>("ZoomModeSet", &I::ZoomModeSet),
            Op<void()>("Stopped", &I::Stopped),
            Op<void(bdmv::INavControlListener::FinishedReason)>("Finished", &I::Finished),
            Op<void()>("StillOn", &I::StillOn),
            Op<void()>("StillOff", &I::StillOff),
            Op<void()>("Suspended", &I::Suspended),
            Op<void()>("Resumed", &I::Resumed),
            Op<void()>("ResumeFailed", &I::ResumeFailed),
            Op<void(const void*, bd::UInt32)>("SystemSuspended", &I::SystemSuspended),
            Op<void(bool)>("SystemResumed", &I::SystemResumed),
            Op<void()>("SystemResumeFailed", &I::SystemResumeFailed),
            Op<void()>("JumpOccurred", &I::JumpOccurred),
            Op<void()>("PreloadFailed", &I::PreloadFailed),
        });
    EXPECT_EQ(21, CountOperations<I>());
}

TEST_F(BinaryInterface, OfSettingsListener)
{
    typedef bdmv::INavSettingsListener I;
    ExpectInThisOrder<I>(
        listener, journal,
        {
            Op<void(bd::PlayListIdDef)>("Playlist", &I::Playlist),
            Op<void(bd::PlayListIdDef, bd::PlayItemIdDef, bd::VideoFormatType,
                    bd::VideoAspectRatioType)>("PlayItem", &I::PlayItem),
            Op<void(bd::PlayDirectionDef, bd::PlaySpeedDef)>("PlayMode", &I::PlayMode),
            Op<void(bd::StreamNumberDef)>("AudioInfo", &I::AudioInfo),
            Op<void(bd::StreamNumberDef)>("VideoInfo", &I::VideoInfo),
            Op<void(bd::AngleNumberDef)>("AngleInfo", &I::AngleInfo),
            Op<void(bd::StreamNumberDef)>("InteractiveGraphicsInfo", &I::InteractiveGraphicsInfo),
            Op<void(bd::StreamNumberDef, bool)>("PresentationGraphicsInfo",
                                                &I::PresentationGraphicsInfo),
            Op<void(bd::StreamNumberDef)>("SecondaryAudioInfo", &I::SecondaryAudioInfo),
            Op<void(bd::StreamNumberDef)>("SecondaryVideoInfo", &I::SecondaryVideoInfo),
            Op<void(bd::StreamNumberDef, bool)>("PipPgTextStInfo", &I::PipPgTextStInfo),
            Op<void(bool, bd::AudioInfoType)>("AudioInfoChanged", &I::AudioInfoChanged),
            Op<void(bd::UserStyleNumber)>("TextSubtitleStyleInfo", &I::TextSubtitleStyleInfo),
            Op<void(bd::UInt8)>("TextSubtitleStylesAvailable", &I::TextSubtitleStylesAvailable),
            Op<void(const bdmv::UOMaskTable&)>("UOMask", &I::UOMask),
            Op<void(const bd::ChapterNumberDef&)>("ChapterNumber", &I::ChapterNumber),
            Op<void(bd::PlayListIdDef, const bd::PlayListMarkIdDef&, const bd::TimePosition&)>(
                "MarkInfo", &I::MarkInfo),
            Op<void(const bd::TimePosition&)>("CurrentTimePosition", &I::CurrentTimePosition),
            Op<void()>("PictureInPictureAvailable", &I::PictureInPictureAvailable),
            Op<void()>("PictureInPictureUnavailable", &I::PictureInPictureUnavailable),
            Op<void()>("SecondaryAudioAvailable", &I::SecondaryAudioAvailable),
            Op<void()>("SecondaryAudioUnavailable", &I::SecondaryAudioUnavailable),
            Op<void(bool)>("PresentationGraphicsDisplay", &I::PresentationGraphicsDisplay),
            Op<void(bd::StreamNumberDef, bool)>("SecondaryVideoDisplay", &I::SecondaryVideoDisplay),
            Op<void(bd::StreamNumberDef, bool)>("SecondaryAudioDisplay", &I::SecondaryAudioDisplay),
            Op<void(bool)>("PipPgTextSelect", &I::PipPgTextSelect),
        });
    EXPECT_EQ(26, CountOperations<I>());
}

TEST_F(BinaryInterface, OfButtonListener)
{
    typedef bdmv::INavButtonListener I;
    ExpectInThisOrder<I>(listener, journal,
                         {
                             Op<void(bd::UInt32, bd::ButtonId, bd::RefPtr<bdmv::IProgramData>&)>(
                                 "ExecuteButton", &I::ExecuteButton),
                         });
    EXPECT_EQ(1, CountOperations<I>());
}

TEST_F(BinaryInterface, OfInteractiveListener)
{
    typedef bdmv::INavInteractiveListener I;
    ExpectInThisOrder<I>(
        listener, journal,
        {
            Op<void()>("InteractiveGraphicsVisible", &I::InteractiveGraphicsVisible),
            Op<void()>("InteractiveGraphicsInvisible", &I::InteractiveGraphicsInvisible),
            Op<void()>("PopUpMenuAvailable", &I::PopUpMenuAvailable),
            Op<void()>("PopUpMenuUnavailable", &I::PopUpMenuUnavailable),
            Op<void()>("ButtonActivationBusy", &I::ButtonActivationBusy),
            Op<void()>("ButtonActivationDone", &I::ButtonActivationDone),
            Op<void()>("InteractiveGraphicsActive", &I::InteractiveGraphicsActive),
            Op<void()>("InteractiveGraphicsInactive", &I::InteractiveGraphicsInactive),
        });
    EXPECT_EQ(8, CountOperations<I>());
}

TEST_F(BinaryInterface, OfListenerIsControlSettingsButtonInteractive)
{
    bdmv::INavigatorListener* const all = &listener;
    const char* const start = reinterpret_cast<const char*>(all);
    const auto offsetOf = [start](const void* base) {
        return static_cast<const char*>(base) - start;
    };
    const std::ptrdiff_t size = sizeof(void*);

    EXPECT_EQ(0 * size, offsetOf(static_cast<bdmv::INavControlListener*>(all)));
    EXPECT_EQ(1 * size, offsetOf(static_cast<bdmv::INavSettingsListener*>(all)));
    EXPECT_EQ(2 * size, offsetOf(static_cast<bdmv::INavButtonListener*>(all)));
    EXPECT_EQ(3 * size, offsetOf(static_cast<bdmv::INavInteractiveListener*>(all)));
}

TEST_F(BinaryInterface, OfListenerAddsNoOperations)
{
    EXPECT_EQ(CountOperations<bdmv::INavControlListener>(),
              CountOperations<bdmv::INavigatorListener>());
}

TEST_F(BinaryInterface, OfErrorInterfaceHasNoOperations)
{
    EXPECT_EQ(0, CountOperations<bdmv::INavError>());
}

TEST_F(BinaryInterface, OfPlayListMarkHasNoOperations)
{
    EXPECT_EQ(0, CountOperations<bdmv::IPlayListMark>());
}

TEST_F(BinaryInterface, OfPlaybackContext)
{
    typedef bdmv::IPlaybackContext I;
    typedef void StreamInfo(bd::StreamNumberDef*, bd::UInt8*);
    ExpectInThisOrder<I>(
        context, journal,
        {
            Op<const bd::DataBlockDef&()>("GetSystemResumeData", &I::GetSystemResumeData),
            Op<void()>("CleanupSystemResumeData", &I::CleanupSystemResumeData),
            Op<bool()>("IsPlayingAfterSystemResume", &I::IsPlayingAfterSystemResume),
            Op<bd::PlayListIdDef()>("GetPlayListId", &I::GetPlayListId),
            Op<bd::PlayItemIdDef()>("GetPlayItemId", &I::GetPlayItemId),
            Op<const bd::PlayMode&()>("GetPlayMode", &I::GetPlayMode),
            Op<bd::Trigger()>("GetTrigger", &I::GetTrigger),
            Op<bd::TimePosition()>("GetTriggerReachedTime", &I::GetTriggerReachedTime),
            Op<bd::TriggerType()>("GetCurrentABRepeatState", &I::GetCurrentABRepeatState),
            Op<bd::TriggerType()>("GetCurrentChpTitleRepeatState",
                                  &I::GetCurrentChpTitleRepeatState),
            Op<bd::TriggerType(bd::TimePosition)>("GetTriggerTypeByTime", &I::GetTriggerTypeByTime),
            Op<bd::ChapterNumberDef()>("GetCurrentChapter", &I::GetCurrentChapter),
            Op<bd::PlayListMarkIdDef(bd::TimePosition&)>("GetCurrentPLMarkId",
                                                         &I::GetCurrentPLMarkId),
            Op<StreamInfo>("GetVideoInfo", &I::GetVideoInfo),
            Op<void(bd::VideoFormatType&, bd::VideoAspectRatioType&)>("GetVideoAttributes",
                                                                      &I::GetVideoAttributes),
            Op<StreamInfo>("GetAudioInfo", &I::GetAudioInfo),
            Op<StreamInfo>("GetIgInfo", &I::GetIgInfo),
            Op<bdmv::INavError::ErrCode(bd::StreamNumberDef*, bd::UInt8*)>("rGetPgTextStInfo",
                                                                           &I::rGetPgTextStInfo),
            Op<StreamInfo>("GetPgTextStInfo", &I::GetPgTextStInfo),
            Op<void(bd::StreamNumberDef*, bd::UInt8*, bool*)>("GetSecondaryVideoInfo",
                                                              &I::GetSecondaryVideoInfo),
            Op<StreamInfo>("GetSecondaryAudioInfo", &I::GetSecondaryAudioInfo),
            Op<StreamInfo>("GetPipPgTextStInfo", &I::GetPipPgTextStInfo),
            Op<void(bd::AngleNumberDef*, bd::UInt8*)>("GetAngleInfo", &I::GetAngleInfo),
            Op<bool()>("GetPgTextStDisplay", &I::GetPgTextStDisplay),
            Op<bool()>("GetSecondaryVideoDisplay", &I::GetSecondaryVideoDisplay),
            Op<bool()>("GetSecondaryAudioDisplay", &I::GetSecondaryAudioDisplay),
            Op<bool()>("GetPipPgTextStSelect", &I::GetPipPgTextStSelect),
            Op<void(bdmv::UOMaskTable&)>("GetUOMask", &I::GetUOMask),
            Op<const bd::PlayMode&()>("GetCurrentPlayMode", &I::GetCurrentPlayMode),
            Op<bd::TimePosition()>("GetCurrentTimePosition", &I::GetCurrentTimePosition),
            Op<void(bd::RefPtr<bdmv::IProgramData>&, bd::UInt32&, bd::ButtonId&)>(
                "GetExecuteButtonData", &I::GetExecuteButtonData),
            Op<bd::UserStyleNumber()>("GetCurrentTextSubtitleStyleNumber",
                                      &I::GetCurrentTextSubtitleStyleNumber),
            Op<bd::UInt8()>("GetNumberOfTextSubtitleStyles", &I::GetNumberOfTextSubtitleStyles),
            Op<bdstreaming::FinishedReason()>("GetFinishedReason", &I::GetFinishedReason),
            Op<void(bd::ZOOM_PARAM_Def&)>("GetZoomScaleInfo", &I::GetZoomScaleInfo),
            Op<void(bool&, bool&, bool&, bool&)>("IsAsyncPipInCurrentPlayItem",
                                                 &I::IsAsyncPipInCurrentPlayItem),
        });
    EXPECT_EQ(36, CountOperations<I>());
}

TEST_F(BinaryInterface, OfProgramData)
{
    typedef bdmv::IProgramData I;
    RecordingProgram program(journal);
    ExpectInThisOrder<I>(program, journal,
                         {
                             Op<bd::UInt16() const>("GetNumberOfNavigationCommands",
                                                    &I::GetNumberOfNavigationCommands),
                             Op<const bdmv::INavigationCommandData*(I::CommandIdDef) const>(
                                 "GetNavigationCommandData", &I::GetNavigationCommandData),
                         });
    EXPECT_EQ(2, CountOperations<I>());
}

TEST_F(BinaryInterface, OfNavigationCommandData)
{
    typedef bdmv::INavigationCommandData I;
    RecordingCommand command(journal);
    ExpectInThisOrder<I>(
        command, journal,
        {
            Op<I::Command() const>("GetCommand", &I::GetCommand),
            Op<void(bool&, bd::UInt32&, bool&, bd::UInt32&) const>("GetOperands", &I::GetOperands),
        });
    EXPECT_EQ(2, CountOperations<I>());
}

TEST_F(BinaryInterface, OfNavigatorEvent)
{
    typedef bdmv::INavigatorEvent I;
    RecordingEvent event(journal);
    ExpectInThisOrder<I>(
        event, journal,
        {
            Op<void(bd::EventListenerList<bdmv::INavigatorListener>&)>("Dispatch", &I::Dispatch),
        });
    EXPECT_EQ(1, CountOperations<I>());
}
