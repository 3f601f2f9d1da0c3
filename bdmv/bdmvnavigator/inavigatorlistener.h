/**
 * @file
 * The listener interface of the navigator.
 *
 * @code
 * class UserInterface : public bdmv::INavigatorListener { ... every callback ... };
 *
 * UserInterface userInterface;
 * navigatorListeners.AddListener(&userInterface);
 * ...
 * navigatorListeners.RemoveListener(&userInterface); // no callback runs after this
 * @endcode
 *
 * A client that needs only a few callbacks derives from NavigatorListenerAdapter instead.
 */
#ifndef BDMVNAVIGATOR_INAVIGATORLISTENER_H
#define BDMVNAVIGATOR_INAVIGATORLISTENER_H

#include "bdmvnavigator/inavbuttonlistener.h"
#include "bdmvnavigator/inavcontrollistener.h"
#include "bdmvnavigator/inavinteractivelistener.h"
#include "bdmvnavigator/inavsettingslistener.h"

namespace bdmv
{

/**
 * Everything the navigator reports to its clients.
 *
 * Threads. Every callback runs on the thread that dispatches the event, once for every registered
 * listener, in order of registration, while the lock of the list is held: it must return promptly.
 * The playback context is not locked meanwhile.
 *
 * Re-entrancy. A callback must not use the list that is calling it, nor dispatch an event to it;
 * bd::EventListenerList describes what happens otherwise, and what to do instead.
 *
 * Exceptions. An exception thrown by a callback leaves INavigatorEvent::Dispatch(): later listeners
 * miss this callback, and all listeners miss the rest of the event.
 *
 * Lifetime. The object of a reference argument lives for the duration of the call. Copy what is
 * needed later.
 *
 * The order of the bases is part of the binary interface.
 */
class INavigatorListener : public INavControlListener,
                           public INavSettingsListener,
                           public INavButtonListener,
                           public INavInteractiveListener
{
public:
    INavigatorListener() = default;
    ~INavigatorListener() override = default;
    INavigatorListener(const INavigatorListener&) = default;
    INavigatorListener& operator=(const INavigatorListener&) = default;
};

} // namespace bdmv

#endif
