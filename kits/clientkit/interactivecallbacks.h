/**
 * @file
 * The callbacks of INavInteractiveListener as values: each has the name and the arguments of its
 * callback.
 */
#ifndef CLIENTKIT_INTERACTIVECALLBACKS_H
#define CLIENTKIT_INTERACTIVECALLBACKS_H

#include "clientkit/callbackid.h"
#include "clientkit/withoutarguments.h"

namespace bdmv
{
namespace callbacks
{

/** INavInteractiveListener::InteractiveGraphicsVisible(). */
typedef WithoutArguments<CallbackInteractiveGraphicsVisible, INavInteractiveListener,
                         &INavInteractiveListener::InteractiveGraphicsVisible>
    InteractiveGraphicsVisible;

/** INavInteractiveListener::InteractiveGraphicsInvisible(). */
typedef WithoutArguments<CallbackInteractiveGraphicsInvisible, INavInteractiveListener,
                         &INavInteractiveListener::InteractiveGraphicsInvisible>
    InteractiveGraphicsInvisible;

/** INavInteractiveListener::PopUpMenuAvailable(). */
typedef WithoutArguments<CallbackPopUpMenuAvailable, INavInteractiveListener,
                         &INavInteractiveListener::PopUpMenuAvailable>
    PopUpMenuAvailable;

/** INavInteractiveListener::PopUpMenuUnavailable(). */
typedef WithoutArguments<CallbackPopUpMenuUnavailable, INavInteractiveListener,
                         &INavInteractiveListener::PopUpMenuUnavailable>
    PopUpMenuUnavailable;

/** INavInteractiveListener::ButtonActivationBusy(). */
typedef WithoutArguments<CallbackButtonActivationBusy, INavInteractiveListener,
                         &INavInteractiveListener::ButtonActivationBusy>
    ButtonActivationBusy;

/** INavInteractiveListener::ButtonActivationDone(). */
typedef WithoutArguments<CallbackButtonActivationDone, INavInteractiveListener,
                         &INavInteractiveListener::ButtonActivationDone>
    ButtonActivationDone;

/** INavInteractiveListener::InteractiveGraphicsActive(). */
typedef WithoutArguments<CallbackInteractiveGraphicsActive, INavInteractiveListener,
                         &INavInteractiveListener::InteractiveGraphicsActive>
    InteractiveGraphicsActive;

/** INavInteractiveListener::InteractiveGraphicsInactive(). */
typedef WithoutArguments<CallbackInteractiveGraphicsInactive, INavInteractiveListener,
                         &INavInteractiveListener::InteractiveGraphicsInactive>
    InteractiveGraphicsInactive;

} // namespace callbacks
} // namespace bdmv

#endif
