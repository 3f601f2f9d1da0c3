/**
 * @file
 * The callback that has a button executed.
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
     * All listeners see the one RefPtr that the event holds. A listener that keeps the program
     * copies it; one that resets it changes what the listeners behind it see.
     *
     * @param ticket   identifies the request
     * @param buttonId the activated button
     * @param program  the button's navigation program; empty when none is pending
     */
    virtual void ExecuteButton(bd::UInt32 ticket, bd::ButtonId buttonId,
                               IProgramData::RefPtr& program) = 0;
};

} // namespace bdmv

#endif
