/**
 * @file
 * The callback that requests the execution of a button.
 */
#ifndef BDMVNAVIGATOR_INAVBUTTONLISTENER_H
#define BDMVNAVIGATOR_INAVBUTTONLISTENER_H

#include "bd/types.h"
#include "database/iprogramdata.h"

namespace bdmv
{

/**
 * Execution of buttons.
 *
 * INavigatorListener states the rules that all callbacks share. Their order is part of the binary
 * interface.
 */
class INavButtonListener
{
public:
    INavButtonListener() = default;
    virtual ~INavButtonListener() = default;
    INavButtonListener(const INavButtonListener&) = default;
    INavButtonListener& operator=(const INavButtonListener&) = default;

    /**
     * A button was activated: its navigation program is to be executed. Sent by ExecuteButtonEvent.
     *
     * All listeners receive the same RefPtr, which belongs to the event. A listener that keeps the
     * program copies it; a listener that resets it changes what the listeners after it receive.
     *
     * @param ticket   identifies the request
     * @param buttonId the activated button
     * @param program  the button's navigation program; empty when no execution is pending
     */
    virtual void ExecuteButton(bd::UInt32 ticket, bd::ButtonId buttonId,
                               IProgramData::RefPtr& program) = 0;
};

} // namespace bdmv

#endif
