/**
 * @file
 * Writes callbacks to a stream.
 */
#ifndef DESKPLAYER_OUTPUT_OUTPUT_H
#define DESKPLAYER_OUTPUT_OUTPUT_H

#include <ostream>

#include "clientkit/callback.h"
#include "navigator/virtualclock.h"
#include "output/outputfilter.h"

namespace deskplayer
{

/**
 * Writes the callbacks that pass a filter, with the time of the session.
 *
 * Writes on the delivering thread and never flushes. The output is complete once this object is
 * destroyed; the state of the stream shows whether writing succeeded.
 */
class Output : public bdmv::CallbackListener
{
public:
    /** @param stream does not throw; it and @p clock must outlive the output */
    Output(std::ostream& stream, const VirtualClock& clock, const OutputFilter& filter)
        : m_rStream(stream), m_rClock(clock), m_Filter(filter)
    {
    }

    ~Output() override = default;
    Output(const Output&) = delete;
    Output& operator=(const Output&) = delete;

protected:
    std::ostream& Stream() { return m_rStream; }

    /** The time of the session. */
    Ticks Now() const { return m_rClock.Now(); }

private:
    /** Called for every callback, for outputs that also need those the filter hides. */
    virtual void Follow(const bdmv::Callback& /*callback*/) {}

    /** Called for every callback that passes the filter, after Follow(). */
    virtual void Write(const bdmv::Callback& callback) = 0;

    void OnCallback(const bdmv::Callback& callback) final
    {
        Follow(callback);
        if (m_Filter.Passes(callback.Id())) {
            Write(callback);
        }
    }

    std::ostream& m_rStream;
    const VirtualClock& m_rClock;
    OutputFilter m_Filter;
};

} // namespace deskplayer

#endif
