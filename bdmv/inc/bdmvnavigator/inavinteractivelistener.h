/**
 * @file
 * Callbacks that report the state of the interactive-graphics plane.
 */
#ifndef BDMVNAVIGATOR_INAVINTERACTIVELISTENER_H
#define BDMVNAVIGATOR_INAVINTERACTIVELISTENER_H

namespace bdmv
{

/**
 * State of the interactive-graphics plane: menus and the activation of buttons.
 *
 * INavigatorListener states the rules that all callbacks share. Their order is part of the binary
 * interface.
 */
class INavInteractiveListener
{
public:
    INavInteractiveListener() = default;
    virtual ~INavInteractiveListener() = default;
    INavInteractiveListener(const INavInteractiveListener&) = default;
    INavInteractiveListener& operator=(const INavInteractiveListener&) = default;

    /** The menu became visible. Sent by InteractiveGraphicsVisibleEvent. */
    virtual void InteractiveGraphicsVisible() = 0;

    /** The menu became invisible. Sent by InteractiveGraphicsInvisibleEvent. */
    virtual void InteractiveGraphicsInvisible() = 0;

    /** A pop-up menu became available. Sent by PopUpMenuAvailableEvent. */
    virtual void PopUpMenuAvailable() = 0;

    /** A pop-up menu became unavailable. Sent by PopUpMenuUnavailableEvent. */
    virtual void PopUpMenuUnavailable() = 0;

    /** The activation of a button is under way. Sent by ButtonActivationBusyEvent. */
    virtual void ButtonActivationBusy() = 0;

    /** The activation of a button is done. Sent by ButtonActivationDoneEvent. */
    virtual void ButtonActivationDone() = 0;

    /** The menu became active. Sent by InteractiveGraphicsActiveEvent. */
    virtual void InteractiveGraphicsActive() = 0;

    /** The menu became inactive. Sent by InteractiveGraphicsInactiveEvent. */
    virtual void InteractiveGraphicsInactive() = 0;
};

} // namespace bdmv

#endif
