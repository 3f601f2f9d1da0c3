/**
 * @file
 * A callback of INavigatorListener and its arguments as one value: to keep, compare, queue, write
 * and deliver later.
 *
 * @code
 * bdmv::Callback callback = bdmv::callbacks::PlayItem{800, 0, videoFormat, aspectRatio};
 *
 * NameOf(callback.Id());                                         // "PlayItem"
 * if (const auto* const item = callback.As<bdmv::callbacks::PlayItem>()) {
 *     Show(item->playListId, item->playItemId);
 * }
 * Deliver(callback, listener);                                   // listener.PlayItem(800, 0, ...)
 * @endcode
 *
 * Lifetime. A value owns its arguments, with two exceptions that callbacks have as well: the bytes
 * of callbacks::SystemSuspended are a pointer and a size, and the program of
 * callbacks::ExecuteButton is shared.
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
    Callback(const Arguments& arguments) : m_Id(Arguments::Id()), m_Arguments()
    {
        static_assert(sizeof(Arguments) <= sizeof(m_Arguments), "the arguments fit");
        static_assert(alignof(Arguments) <= alignof(bd::UInt64), "the arguments are aligned");
        new (m_Arguments) Arguments(arguments);
    }

    Callback(const Callback& other);
    Callback& operator=(const Callback& other);
    ~Callback();

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
    template <typename Visitor> void VisitArguments(Visitor& visitor) const;

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

/** Whether both are the same callback with equal arguments; of bytes and of a program, the address.
 */
bool operator==(const Callback& left, const Callback& right);

inline bool operator!=(const Callback& left, const Callback& right)
{
    return !(left == right);
}

/**
 * Calls the callback on a listener.
 *
 * A program is handed over as a copy of the pointer: resetting it does not change @p callback.
 *
 * @throw whatever the listener throws
 */
void Deliver(const Callback& callback, INavigatorListener& listener);

template <typename Visitor> void Callback::Visit(Visitor&& visitor) const
{
    typedef typename std::remove_reference<Visitor>::type Target;
    static void (*const visits[])(const Callback&, Target&) = {
#define BDMV_CALLBACK_VISIT(interface, name) &Callback::VisitAs<callbacks::name, Target>,
        BDMV_CALLBACKS(BDMV_CALLBACK_VISIT)
#undef BDMV_CALLBACK_VISIT
    };
    visits[m_Id](*this, visitor);
}

template <typename Visitor> void Callback::VisitArguments(Visitor& visitor) const
{
    Visit(ArgumentsVisit<Visitor>{visitor});
}

} // namespace bdmv

#include "clientkit/callbacklistener.h"

#endif
