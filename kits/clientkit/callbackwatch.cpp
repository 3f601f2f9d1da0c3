#include "clientkit/callbackwatch.h"

#include <algorithm>
#include <iterator>

#include "bd/logging.h"

namespace bdmv
{

namespace
{

/** The line about a callback over budget. */
constexpr bd::LogTag Diagnostic = {bd::CompIdBdmvNavigator, KEVRO_Log_LevelWarning, 0};

std::chrono::microseconds Microseconds(CallbackTimes::Duration time)
{
    return std::chrono::duration_cast<std::chrono::microseconds>(time);
}

} // namespace

CallbackWatch::CallbackWatch(INavigatorListener& client, const char* name,
                             std::chrono::microseconds budget)
    : m_rClient(client), m_Name(name), m_Times(budget)
{
}

CallbackWatch::Statistics CallbackWatch::Get(CallbackId id) const
{
    const CallbackTimes::Record record = m_Times.Get(id);
    Statistics statistics = {
        record.count, Microseconds(record.longest), Microseconds(record.total), {}};
    std::copy(std::begin(record.histogram), std::end(record.histogram), statistics.histogram);
    return statistics;
}

void CallbackWatch::OnCallback(const Callback& callback)
{
    const CallbackTimes::Time begin = std::chrono::steady_clock::now();
    try {
        Deliver(callback, m_rClient);
    } catch (...) {
        Count(callback.Id(), begin);
        throw;
    }
    Count(callback.Id(), begin);
}

void CallbackWatch::Count(CallbackId id, CallbackTimes::Time begin)
{
    const CallbackTimes::Time end = std::chrono::steady_clock::now();
    if (m_Times.Add(id, begin, end)) {
        BD_LOG(Diagnostic, "Slow callback - listener: %s, callback: %s, time: %llu us",
               m_Name.c_str(), NameOf(id),
               static_cast<unsigned long long>(Microseconds(end - begin).count()));
    }
}

} // namespace bdmv
