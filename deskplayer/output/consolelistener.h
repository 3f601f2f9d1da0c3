/**
 * @file
 * Callbacks on a console.
 */
#ifndef DESKPLAYER_OUTPUT_CONSOLELISTENER_H
#define DESKPLAYER_OUTPUT_CONSOLELISTENER_H

#include <ostream>

#include "navigator/virtualclock.h"
#include "output/callbacklistener.h"

namespace deskplayer
{

/**
 * Prints one line a callback: the time of the session, the callback, and its arguments by name.
 *
 *     00:00:20.000  Stepped                position=00:00:20.041 direction=Forward
 */
class ConsoleListener : public CallbackListener
{
public:
    /** @param output and @p clock must outlive the listener */
    ConsoleListener(std::ostream& output, const VirtualClock& clock);

private:
    void OnCallback(const Callback& callback) override;

    std::ostream& m_rOutput;
    const VirtualClock& m_rClock;
};

} // namespace deskplayer

#endif
