#include "deskplayer/replay.h"

#include "recording/absence.h"
#include "recording/recordingreader.h"

namespace deskplayer
{

namespace
{

/** Calls one callback on every listener that it is fired at. */
struct CallbackInvoker {
    const bdmv::Callback& callback;

    void Fire(bdmv::INavigatorListener& listener) const { Deliver(callback, listener); }
};

/** Delivers the records of a reader, and counts them. */
class Delivery : public RecordListener
{
public:
    Delivery(const RecordingReader& reader, bdmv::INavigatorEvent::Listeners& listeners,
             const ReplayClock& clock, const ReplayOptions& options)
        : m_rReader(reader), m_rListeners(listeners), m_rClock(clock), m_rOptions(options)
    {
    }

    ReplayReport Report() const { return m_Report; }

    void OnRecord(const CallbackRecord& record) override
    {
        PassTime(record.time);
        if (IsComplete(record)) {
            Fire(record.callback);
            return;
        }
        ReportAbsence(record);
        if (m_rOptions.fill) {
            CallbackRecord filled = record;
            Fill(filled);
            ++m_Report.filled;
            Fire(filled.callback);
        } else {
            ++m_Report.skipped;
        }
    }

    void OnGap(const GapRecord& gap) override
    {
        PassTime(gap.time);
        Print("gap: " + gap.cause);
        ++m_Report.gaps;
    }

    void OnStart(const StartRecord& start) override
    {
        PassTime(start.time);
        ++m_Report.starts;
    }

private:
    void PassTime(Ticks time) const
    {
        if (m_rClock) {
            m_rClock(time);
        }
    }

    void Fire(const bdmv::Callback& callback)
    {
        CallbackInvoker invoker{callback};
        EventListenerList_FireInvoker(m_rListeners, invoker);
        ++m_Report.delivered;
    }

    void ReportAbsence(const CallbackRecord& record) const
    {
        Print((m_rOptions.fill ? "filled " : "skipped ") +
              std::string(NameOf(record.callback.Id())) + ", which lacks " +
              AbsentArguments(record));
    }

    void Print(const std::string& message) const
    {
        if (m_rOptions.onMessage) {
            m_rOptions.onMessage(m_rReader.Place() + ": " + message);
        }
    }

    const RecordingReader& m_rReader;
    bdmv::INavigatorEvent::Listeners& m_rListeners;
    const ReplayClock& m_rClock;
    const ReplayOptions& m_rOptions;
    ReplayReport m_Report;
};

} // namespace

ReplayReport Replay(std::istream& stream, bdmv::INavigatorEvent::Listeners& listeners,
                    const ReplayClock& clock, const ReplayOptions& options)
{
    RecordingReader reader(stream, options.name);
    Delivery delivery(reader, listeners, clock, options);
    while (reader.Next(delivery)) {
    }
    return delivery.Report();
}

} // namespace deskplayer
