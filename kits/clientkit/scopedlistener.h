/**
 * @file
 * Registers a listener for as long as an object lives.
 *
 * @code
 * class FrontPanel
 * {
 * public:
 *     explicit FrontPanel(bdmv::INavigatorEvent::Listeners& listeners)
 *         : m_Registration(listeners, m_Display)
 *     {
 *     }
 *
 * private:
 *     Display m_Display; // an INavigatorListener
 *     bdmv::ScopedListener<bdmv::INavigatorListener> m_Registration; // last: removed first
 * };
 * @endcode
 *
 * Lifetime. List and listener outlive the registration. In a class, declare the registration after
 * the listener and everything that the listener uses: callbacks may run until it is destroyed.
 *
 * Re-entrancy. A registration can be neither made nor removed inside a callback of its list. A
 * registration that is destroyed or replaced there is reported through Assert(), and its listener
 * stays in the list; it must not be destroyed before it has been removed in another way.
 *
 * Threads. One thread at a time may use a registration.
 */
#ifndef CLIENTKIT_SCOPEDLISTENER_H
#define CLIENTKIT_SCOPEDLISTENER_H

#include <system_error>
#include <utility>

#include "bd/eventlistenerlist.h"
#include "kevro/kevro_osa.h"

namespace bdmv
{

/**
 * The registration of a listener in a list. Movable; a registration that was moved from is empty.
 *
 * @tparam T the listener interface
 */
template <typename T> class ScopedListener
{
public:
    /** An empty registration. */
    ScopedListener() : m_pList(nullptr), m_pListener(nullptr) {}

    /**
     * Adds the listener to the list; the registration is empty if it is in the list already.
     *
     * @throw what bd::EventListenerList::AddListener() throws
     */
    ScopedListener(bd::EventListenerList<T>& list, T& listener)
        : m_pList(list.AddListener(&listener) ? &list : nullptr), m_pListener(&listener)
    {
    }

    /** Takes over the registration of @p other, which is empty afterwards. */
    ScopedListener(ScopedListener&& other) noexcept
        : m_pList(other.m_pList), m_pListener(other.m_pListener)
    {
        other.m_pList = nullptr;
    }

    /**
     * Takes over the registration of @p other; the one before ends as if it were destroyed. Moving
     * a registration to itself changes nothing.
     */
    ScopedListener& operator=(ScopedListener&& other) noexcept
    {
        if (this != &other) {
            const ScopedListener before(std::move(*this));
            m_pList = other.m_pList;
            m_pListener = other.m_pListener;
            other.m_pList = nullptr;
        }
        return *this;
    }

    /** Removes the listener. No callback of it is running or will run then. */
    ~ScopedListener()
    {
        try {
            Remove();
        } catch (const std::system_error&) {
            Assert("bdmv::ScopedListener: not destroyed inside a callback of its list", __FILE__,
                   __LINE__);
        }
    }

    /** False too when the listener was in the list before. */
    bool IsRegistered() const { return m_pList != nullptr; }

    /**
     * Removes the listener; nothing happens if there is none. No callback of the listener is
     * running or will run when this has returned.
     *
     * @throw std::system_error std::errc::resource_deadlock_would_occur inside a callback of the
     *        list; the listener is still registered
     */
    void Remove()
    {
        if (m_pList != nullptr) {
            m_pList->RemoveListener(m_pListener);
            m_pList = nullptr;
        }
    }

private:
    bd::EventListenerList<T>* m_pList; ///< null when empty
    T* m_pListener;
};

} // namespace bdmv

#endif
