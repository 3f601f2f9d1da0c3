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
#include "output/record.h"

namespace deskplayer
{

/**
 * Writes the callbacks that pass a filter: those of a session, with its time, or those of a
 * recording, with their own. Gaps and starts of a recording always pass.
 *
 * Writes on the delivering thread and never flushes. The output is complete once this object is
 * destroyed; the state of the stream shows whether writing succeeded.
 */
class Output : public bdmv::CallbackListener, public RecordListener
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
    virtual void Follow(const CallbackRecord& /*record*/) {}

    /** Called for every callback that passes the filter, after Follow(). */
    virtual void Write(const CallbackRecord& record) = 0;

    virtual void Write(const GapRecord& gap) = 0;

    virtual void Write(const StartRecord& start) = 0;

    void OnCallback(const bdmv::Callback& callback) final { OnRecord({Now(), callback, {}}); }

    void OnRecord(const CallbackRecord& record) final
    {
        Follow(record);
        if (m_Filter.Passes(record.callback.Id())) {
            Write(record);
        }
    }

    void OnGap(const GapRecord& gap) final { Write(gap); }

    void OnStart(const StartRecord& start) final { Write(start); }

    std::ostream& m_rStream;
    const VirtualClock& m_rClock;
    OutputFilter m_Filter;
};

} // namespace deskplayer

#endif
