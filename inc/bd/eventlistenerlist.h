/**
 * @file
 * A list of listeners, and functions that call one method with the same arguments on all of them.
 *
 * @code
 * bd::EventListenerList<bdmv::INavigatorListener> listeners;
 * listeners.AddListener(&frontPanel);
 * listeners.AddListener(&userInterface);
 *
 * // frontPanel.AngleInfo(2), then userInterface.AngleInfo(2)
 * bd::EventListenerList_FireParam1(listeners, &bdmv::INavigatorListener::AngleInfo, 2);
 * @endcode
 *
 * Lifetime. The list does not own its listeners. Once RemoveListener() has returned, no callback of
 * that listener is running and none will run, so the listener may be destroyed. That promise is why
 * the lock is held during the whole walk.
 *
 * Re-entrancy. The lock is not recursive. A callback that adds, removes, looks up or fires on the
 * list that is calling it gets std::system_error with
 * std::errc::resource_deadlock_would_occur; the list and its lock stay valid. Post such work to the
 * thread that delivers events and do it there after the delivery. To silence a listener at once,
 * make it ignore further callbacks until it has been removed.
 *
 * Threads. Every operation may be called from any thread. Callbacks run on the thread that fires,
 * one after another, front to back. A thread that fires or registers meanwhile waits for the whole
 * walk, so a callback must return promptly and must not wait for a thread that may use the same
 * list.
 *
 * Exceptions. The firing function passes on the exception that a callback throws: the listeners
 * after that one are not called, and the lock is released.
 *
 * Memory. Firing allocates nothing. AddListener() allocates one list node.
 */
#ifndef BD_EVENTLISTENERLIST_H
#define BD_EVENTLISTENERLIST_H

#include <algorithm>
#include <list>

#include "bd/guard.h"
#include "bd/threadmutex.h"

namespace bd
{

/**
 * The registered listeners, in order of registration.
 *
 * @tparam T the listener interface
 */
template <typename T> class EventListenerList
{
public:
    EventListenerList() = default;

    /** Drops the listeners that are still registered. No other thread may be using the list. */
    ~EventListenerList() = default;

    EventListenerList(const EventListenerList&) = delete;
    EventListenerList& operator=(const EventListenerList&) = delete;

    /**
     * Appends a listener.
     *
     * @param listener not owned; must live until it is removed or the list is destroyed
     * @return false, and no change, for null and for a listener that is already in the list
     * @throw std::bad_alloc out of memory; the list is unchanged
     * @throw std::system_error the lock could not be taken, see ThreadMutex::Acquire()
     */
    bool AddListener(T* listener)
    {
        const Guard<ThreadMutex> guard(m_ListenersLock);
        if (listener == nullptr || Find(listener) != m_Listeners.end()) {
            return false;
        }
        m_Listeners.push_back(listener);
        return true;
    }

    /**
     * Removes a listener. Once this has returned, no callback of the listener is running or will
     * run.
     *
     * @return false for null and for a listener that is not in the list
     * @throw std::system_error the lock could not be taken, see ThreadMutex::Acquire()
     */
    bool RemoveListener(T* listener)
    {
        const Guard<ThreadMutex> guard(m_ListenersLock);
        const auto found = Find(listener);
        if (found == m_Listeners.end()) {
            return false;
        }
        m_Listeners.erase(found);
        return true;
    }

    /**
     * @return whether the listener is in the list
     * @throw std::system_error the lock could not be taken, see ThreadMutex::Acquire()
     */
    bool ListenerExists(T* listener)
    {
        const Guard<ThreadMutex> guard(m_ListenersLock);
        return Find(listener) != m_Listeners.end();
    }

private:
    typedef std::list<T*> Listeners;

    typename Listeners::iterator Find(T* listener)
    {
        return std::find(m_Listeners.begin(), m_Listeners.end(), listener);
    }

    template <typename Listener, typename Invoker>
    friend void EventListenerList_FireInvoker(EventListenerList<Listener>& list, Invoker& invoker);

    Listeners m_Listeners;
    ThreadMutex m_ListenersLock; ///< guards m_Listeners, held for every walk
};

/**
 * One method of a listener and the arguments to call it with.
 *
 * A value parameter is copied once, here; every listener receives a copy of that copy. A reference
 * parameter is stored as a reference: every listener sees the caller's object, which must outlive
 * the invoker.
 *
 * @tparam T the listener interface; EventInvokerParam1 to EventInvokerParam4 add the parameter
 *         types of the method, exactly as it declares them
 */
template <typename T> class EventInvokerParam0
{
public:
    typedef void (T::*MethodPointer)(); ///< the method

    /** Stores the method. */
    explicit EventInvokerParam0(MethodPointer method) : m_pMethod(method) {}

    /** Calls the method on @p listener, once. */
    void Fire(T& listener) { (listener.*m_pMethod)(); }

private:
    MethodPointer m_pMethod;
};

/** See EventInvokerParam0. */
template <typename T, typename P1> class EventInvokerParam1
{
public:
    typedef void (T::*MethodPointer)(P1); ///< the method

    /** Stores the method and its arguments. */
    EventInvokerParam1(MethodPointer method, const P1& param) : m_Param(param), m_pMethod(method) {}

    /** Calls the method on @p listener, once. */
    void Fire(T& listener) { (listener.*m_pMethod)(m_Param); }

private:
    P1 m_Param;
    MethodPointer m_pMethod;
};

/** See EventInvokerParam0. */
template <typename T, typename P1, typename P2> class EventInvokerParam2
{
public:
    typedef void (T::*MethodPointer)(P1, P2); ///< the method

    /** Stores the method and its arguments. */
    EventInvokerParam2(MethodPointer method, const P1& param1, const P2& param2)
        : m_Param1(param1), m_Param2(param2), m_pMethod(method)
    {
    }

    /** Calls the method on @p listener, once. */
    void Fire(T& listener) { (listener.*m_pMethod)(m_Param1, m_Param2); }

private:
    P1 m_Param1;
    P2 m_Param2;
    MethodPointer m_pMethod;
};

/** See EventInvokerParam0. */
template <typename T, typename P1, typename P2, typename P3> class EventInvokerParam3
{
public:
    typedef void (T::*MethodPointer)(P1, P2, P3); ///< the method

    /** Stores the method and its arguments. */
    EventInvokerParam3(MethodPointer method, const P1& param1, const P2& param2, const P3& param3)
        : m_Param1(param1), m_Param2(param2), m_Param3(param3), m_pMethod(method)
    {
    }

    /** Calls the method on @p listener, once. */
    void Fire(T& listener) { (listener.*m_pMethod)(m_Param1, m_Param2, m_Param3); }

private:
    P1 m_Param1;
    P2 m_Param2;
    P3 m_Param3;
    MethodPointer m_pMethod;
};

/** See EventInvokerParam0. */
template <typename T, typename P1, typename P2, typename P3, typename P4> class EventInvokerParam4
{
public:
    typedef void (T::*MethodPointer)(P1, P2, P3, P4); ///< the method

    /** Stores the method and its arguments. */
    EventInvokerParam4(MethodPointer method, const P1& param1, const P2& param2, const P3& param3,
                       const P4& param4)
        : m_Param1(param1), m_Param2(param2), m_Param3(param3), m_Param4(param4), m_pMethod(method)
    {
    }

    /** Calls the method on @p listener, once. */
    void Fire(T& listener) { (listener.*m_pMethod)(m_Param1, m_Param2, m_Param3, m_Param4); }

private:
    P1 m_Param1;
    P2 m_Param2;
    P3 m_Param3;
    P4 m_Param4;
    MethodPointer m_pMethod;
};

/**
 * The type of a firing function's value argument. It follows from the method's parameter, not from
 * the argument passed: for a reference parameter it is that reference, for a value parameter
 * a const reference, so that the value is not copied before it reaches the invoker.
 */
template <typename P> struct FiredValue {
    typedef const P& Type; ///< of the argument
};

/**
 * Calls Fire() of @p invoker with every listener, front to back, with the list's lock held from
 * before the first call to after the last.
 *
 * @tparam Invoker has Fire(T&)
 * @throw std::system_error the lock could not be taken, see ThreadMutex::Acquire()
 * @throw whatever a callback throws
 */
template <typename T, typename Invoker>
inline void EventListenerList_FireInvoker(EventListenerList<T>& list, Invoker& invoker)
{
    const Guard<ThreadMutex> guard(list.m_ListenersLock);
    for (T* const listener : list.m_Listeners) {
        invoker.Fire(*listener);
    }
}

// `inline` matters here: with it g++ resolves the stored pointer to member at compile time, which
// removes the run-time test from every call.

/**
 * Calls a method without parameters on every listener; see EventListenerList_FireInvoker().
 *
 * EventListenerList_FireParam1() to EventListenerList_FireParam4() do the same for methods with
 * that many parameters. The argument for a value parameter P binds to a `const P&`: a class's
 * static constant passed there needs a definition as well as its value in the class.
 *
 * @tparam Owner the class that declares the method: T or one of its bases
 */
template <typename T, typename Owner>
inline void EventListenerList_FireParam0(EventListenerList<T>& list, void (Owner::*method)())
{
    EventInvokerParam0<T> invoker(method);
    EventListenerList_FireInvoker(list, invoker);
}

/** See EventListenerList_FireParam0(). */
template <typename T, typename P1, typename Owner>
inline void EventListenerList_FireParam1(EventListenerList<T>& list, void (Owner::*method)(P1),
                                         typename FiredValue<P1>::Type param)
{
    EventInvokerParam1<T, P1> invoker(method, param);
    EventListenerList_FireInvoker(list, invoker);
}

/** See EventListenerList_FireParam0(). */
template <typename T, typename P1, typename P2, typename Owner>
inline void EventListenerList_FireParam2(EventListenerList<T>& list, void (Owner::*method)(P1, P2),
                                         typename FiredValue<P1>::Type param1,
                                         typename FiredValue<P2>::Type param2)
{
    EventInvokerParam2<T, P1, P2> invoker(method, param1, param2);
    EventListenerList_FireInvoker(list, invoker);
}

/** See EventListenerList_FireParam0(). */
template <typename T, typename P1, typename P2, typename P3, typename Owner>
inline void EventListenerList_FireParam3(EventListenerList<T>& list,
                                         void (Owner::*method)(P1, P2, P3),
                                         typename FiredValue<P1>::Type param1,
                                         typename FiredValue<P2>::Type param2,
                                         typename FiredValue<P3>::Type param3)
{
    EventInvokerParam3<T, P1, P2, P3> invoker(method, param1, param2, param3);
    EventListenerList_FireInvoker(list, invoker);
}

/** See EventListenerList_FireParam0(). */
template <typename T, typename P1, typename P2, typename P3, typename P4, typename Owner>
inline void EventListenerList_FireParam4(EventListenerList<T>& list,
                                         void (Owner::*method)(P1, P2, P3, P4),
                                         typename FiredValue<P1>::Type param1,
                                         typename FiredValue<P2>::Type param2,
                                         typename FiredValue<P3>::Type param3,
                                         typename FiredValue<P4>::Type param4)
{
    EventInvokerParam4<T, P1, P2, P3, P4> invoker(method, param1, param2, param3, param4);
    EventListenerList_FireInvoker(list, invoker);
}

} // namespace bd

#endif
