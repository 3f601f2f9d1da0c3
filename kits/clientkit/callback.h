/**
 * @file
 * A callback of INavigatorListener and its arguments as one value: to keep, compare, queue, write
 * and deliver later.
 *
 * @code
 * class Recorder : public bdmv::CallbackListener
 * {
 *     void OnCallback(const bdmv::Callback& callback) override { m_Callbacks.push_back(callback); }
 *     ...
 * };
 *
 * NameOf(callback.Id());                                       // "PlayItem"
 * if (const auto* const item = callback.As<bdmv::callbacks::PlayItem>()) {
 *     Show(item->playListId, item->playItemId);
 * }
 * Deliver(callback, listener);                                 // listener.PlayItem(800, 0, ...)
 * Deliver(bdmv::callbacks::PlayItem{800, 0, videoFormat, aspectRatio}, listener);
 * @endcode
 *
 * Lifetime. A value owns its arguments, with two exceptions that callbacks have as well: the bytes
 * of callbacks::SystemSuspended are a pointer and a size, and the program of
 * callbacks::ExecuteButton is shared. Releasing a program runs its destructor: a value that holds
 * the last pointer to one runs it when it is assigned or destroyed.
 *
 * Names. Inside a class derived from CallbackListener, PlayItem is the method; the type is written
 * callbacks::PlayItem.
 */
#ifndef CLIENTKIT_CALLBACK_H
#define CLIENTKIT_CALLBACK_H

#include <cstddef>
#include <new>
#include <type_traits>

#include "clientkit/buttoncallbacks.h"
#include "clientkit/callbackid.h"
#include "clientkit/controlcallbacks.h"
#include "clientkit/interactivecallbacks.h"
#include "clientkit/settingscallbacks.h"

namespace bdmv
{

/**
 * One callback and its arguments. A plain value; copying allocates nothing.
 *
 * Several threads may read one value at once.
 */
class Callback
{
public:
    /** @tparam Arguments one of the types in the namespace callbacks */
    template <typename Arguments, typename = decltype(Arguments::Id())>
    // NOLINTNEXTLINE(google-explicit-constructor): the arguments are the callback
    Callback(const Arguments& arguments) : m_Id(Arguments::Id()), m_Arguments()
    {
        static_assert(sizeof(Arguments) <= sizeof(m_Arguments), "the arguments fit");
        static_assert(alignof(Arguments) <= alignof(bd::UInt64), "the arguments are aligned");
        static_assert(std::is_trivially_copyable<Arguments>::value ||
                          std::is_same<Arguments, callbacks::ExecuteButton>::value,
                      "the arguments are copied as bytes");
        new (m_Arguments) Arguments(arguments);
    }

    /** The same callback with the same arguments; shares a program. */
    Callback(const Callback& other);

    /** Becomes the same callback with the same arguments; shares a program. */
    Callback& operator=(const Callback& other);
    ~Callback();

    /** Which callback it is. */
    CallbackId Id() const { return m_Id; }

    /**
     * The arguments, or null if this is another callback. Valid until this value is assigned or
     * destroyed.
     *
     * @tparam Arguments one of the types in the namespace callbacks
     */
    template <typename Arguments> const Arguments* As() const
    {
        return m_Id == Arguments::Id() ? &Get<Arguments>() : nullptr;
    }

    /**
     * Calls @p visitor with the arguments, as the type of this callback in the namespace callbacks.
     *
     * @param visitor callable with each of these types
     */
    template <typename Visitor> void Visit(Visitor&& visitor) const;

    /**
     * Calls @p visitor with the name and the value of each argument, in the order in which outputs
     * write them.
     *
     * @param visitor callable with a name, a `const char*`, and each of: `bool`; the enumerations
     *        of "clientkit/names.h"; bd::UInt8, bd::UInt16 and bd::UInt32, which are numbers;
     *        bd::TimePosition; bd::ZoomRectangleDef; UOMaskTable; Bytes; IProgramData::RefPtr
     */
    template <typename Visitor> void VisitArguments(Visitor&& visitor) const;

private:
    /** Visits the arguments of any callback. */
    template <typename Visitor> struct ArgumentsVisit {
        Visitor& visitor;

        template <typename Arguments> void operator()(const Arguments& arguments)
        {
            Arguments::VisitArguments(arguments, visitor);
        }
    };

    template <typename Arguments> const Arguments& Get() const
    {
        return *static_cast<const Arguments*>(static_cast<const void*>(m_Arguments));
    }

    template <typename Arguments, typename Visitor>
    static void VisitAs(const Callback& callback, Visitor& visitor)
    {
        visitor(callback.Get<Arguments>());
    }

    void Copy(const Callback& other);
    void Destroy();

    CallbackId m_Id;
    alignas(bd::UInt64) unsigned char m_Arguments[32]; ///< an object of the callback's type
};

/**
 * Whether both are the same callback with equal arguments. Of bytes it compares address and size,
 * of a program the address, and masks as they are stored.
 */
bool operator==(const Callback& left, const Callback& right);

/** Whether they are different callbacks or have different arguments. */
inline bool operator!=(const Callback& left, const Callback& right)
{
    return !(left == right);
}

/**
 * Calls the callback on a listener.
 *
 * A program is handed over as a copy of the pointer: resetting it does not change @p callback.
 * Other arguments by reference refer into @p callback, which must exist and keep its value until
 * the listener returns.
 *
 * @throw whatever the listener throws
 */
void Deliver(const Callback& callback, INavigatorListener& listener);

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

template <typename Visitor> void Callback::Visit(Visitor&& visitor) const
{
    typedef typename std::remove_reference<Visitor>::type Target;
    static void (*const visits[])(const Callback&, Target&) = {
/// @cond not for programs
#define BDMV_CALLBACK_VISIT(interface, name) &Callback::VisitAs<callbacks::name, Target>,
        BDMV_CALLBACKS(BDMV_CALLBACK_VISIT)
#undef BDMV_CALLBACK_VISIT
        /// @endcond
    };
    visits[m_Id](*this, visitor);
}

template <typename Visitor> void Callback::VisitArguments(Visitor&& visitor) const
{
    Visit(ArgumentsVisit<typename std::remove_reference<Visitor>::type>{visitor});
}

} // namespace bdmv

#endif
