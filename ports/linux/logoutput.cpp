#include "logoutput.h"

#include <cinttypes>
#include <cstdio>
#include <utility>

#include <spdlog/details/log_msg.h>

#include "bd/logging.h"

namespace kevro
{

Output::Output(std::mutex& mutex, std::unique_ptr<spdlog::sinks::sink> destination,
               std::size_t queueLines)
    : m_Destination(std::move(destination)), m_rMutex(mutex), m_Queue(queueLines)
{
    if (queueLines != 0) {
        m_QueueThread = std::thread([this] { WriteQueued(); });
    }
}

Output::~Output()
{
    if (m_QueueThread.joinable()) {
        {
            const Lock lock(m_rMutex);
            m_Ending = true;
            m_LineQueued.notify_one();
        }
        m_QueueThread.join();
    }
}

void Output::Write(Lock& lock, const LogLine& line) noexcept
{
    ++m_Accepted;
    if (m_Queue.empty()) {
        const KEVRO_UInt64 lost = LostToReport();
        lock.unlock();
        const bool written = WriteToDestination(line, lost);
        lock.lock();
        Account(lock, written);
        return;
    }
    try {
        Queue(line);
    } catch (...) {
        Account(lock, false);
    }
}

void Output::Drain(Lock& lock) noexcept
{
    // The queue keeps the order and loses its oldest line first: once as many lines are done as had
    // been accepted, it is those.
    const KEVRO_UInt64 accepted = m_Accepted;
    m_Progress.wait(lock, [&] { return m_Done >= accepted; });
    const KEVRO_UInt64 lost = m_Lost;
    lock.unlock();
    {
        const std::lock_guard<std::mutex> writing(m_WriteMutex);
        ReportLost(lost);
    }
    lock.lock();
}

void Output::AddLost(const Lock& /*lock*/) noexcept
{
    ++m_Lost;
}

KEVRO_UInt64 Output::CountLost(const Lock& /*lock*/) const noexcept
{
    return m_Lost;
}

void Output::Queue(const LogLine& line)
{
    if (m_Waiting == m_Queue.size()) {
        m_Oldest = m_Oldest + 1 == m_Queue.size() ? 0 : m_Oldest + 1;
        --m_Waiting;
        ++m_Done;
        ++m_Lost;
    }
    const std::size_t place = m_Oldest + m_Waiting;
    QueuedLine& queued = m_Queue[place < m_Queue.size() ? place : place - m_Queue.size()];
    queued.line = line;
    queued.text.clear();
    queued.text.append(line.text.data(), line.text.data() + line.text.size());
    if (++m_Waiting == 1) {
        m_LineQueued.notify_one();
    }
}

void Output::WriteQueued() noexcept
{
    Lock lock(m_rMutex);
    for (;;) {
        m_LineQueued.wait(lock, [this] { return m_Waiting != 0 || m_Ending; });
        if (m_Waiting == 0) {
            return;
        }
        QueuedLine& oldest = m_Queue[m_Oldest];
        const TextBuffer text = std::move(oldest.text);
        LogLine line = oldest.line;
        line.text = std::string_view(text.data(), text.size());
        m_Oldest = m_Oldest + 1 == m_Queue.size() ? 0 : m_Oldest + 1;
        --m_Waiting;

        const KEVRO_UInt64 lost = LostToReport();
        lock.unlock();
        const bool written = WriteToDestination(line, lost);
        lock.lock();
        Account(lock, written);
    }
}

KEVRO_UInt64 Output::LostToReport() const noexcept
{
    // Not while lines are waiting: each of these reports would cost one of them its place.
    return m_Waiting == 0 ? m_Lost : 0;
}

bool Output::WriteToDestination(const LogLine& line, KEVRO_UInt64 lost) noexcept
{
    const std::lock_guard<std::mutex> writing(m_WriteMutex);
    ReportLost(lost);
    return TryWrite(line);
}

bool Output::TryWrite(const LogLine& line) noexcept
{
    try {
        TextBuffer text;
        AppendLine(text, line);
        m_Destination->log(spdlog::details::log_msg(
            line.time, spdlog::source_loc(), spdlog::string_view_t(), Severity(line.level),
            spdlog::string_view_t(text.data(), text.size())));
        return true;
    } catch (...) {
        return false;
    }
}

void Output::ReportLost(KEVRO_UInt64 lost) noexcept
{
    // Another writer may have counted later and come first.
    if (lost <= m_ReportedLost) {
        return;
    }
    char text[64];
    const int length =
        std::snprintf(text, sizeof(text), "lines lost: %" PRIu64, lost - m_ReportedLost);
    if (TryWrite({spdlog::log_clock::now(), bd::CompIdCommon, KEVRO_Log_LevelWarning,
                  std::string_view(text, static_cast<std::size_t>(length))})) {
        m_ReportedLost = lost;
    }
}

void Output::Account(const Lock& /*lock*/, bool written) noexcept
{
    ++m_Done;
    m_Lost += written ? 0 : 1;
    m_Progress.notify_all();
}

} // namespace kevro
