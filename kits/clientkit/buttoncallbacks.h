/**
 * @file
 * The callbacks of INavButtonListener as values: each has the name and the arguments of its
 * callback.
 */
#ifndef CLIENTKIT_BUTTONCALLBACKS_H
#define CLIENTKIT_BUTTONCALLBACKS_H

#include "bdmvnavigator/inavigatorlistener.h"
#include "clientkit/callbackid.h"

namespace bdmv
{
namespace callbacks
{

/** INavButtonListener::ExecuteButton(). */
struct ExecuteButton {
    static constexpr CallbackId Id() { return CallbackExecuteButton; }

    bd::UInt32 ticket;
    bd::ButtonId buttonId;
    IProgramData::RefPtr program;

    void CallOn(INavigatorListener& listener) const
    {
        // A copy: what the listener does to the pointer does not change this value.
        IProgramData::RefPtr copy(program);
        listener.ExecuteButton(ticket, buttonId, copy);
    }

    template <typename Self, typename Visitor>
    static void VisitArguments(Self& self, Visitor& visitor)
    {
        visitor("ticket", self.ticket);
        visitor("buttonId", self.buttonId);
        visitor("commands", self.program);
    }
};

} // namespace callbacks
} // namespace bdmv

#endif
