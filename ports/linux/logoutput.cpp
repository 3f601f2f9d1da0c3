#include "logoutput.h"

#include <chrono>
#include <cinttypes>
#include <cstdio>
#include <utility>

#include <spdlog/details/log_msg.h>

#include "bd/logging.h"
#include "logformat.h"
#include "printable.h"

namespace kevro
{

namespace
{

/** Returns false if the arguments cannot be formatted, or memory ran out. */
BD_PRINTF_FORMAT(2, 0)
bool Format(TextBuffer& text, const char* format, va_list args) noexcept
{
    try {
        return AppendFormatted(text, format, args);
    } catch (...) {
        return false;
    }
}

} // namespace

Output::Output(std::mutex& mutex, std::unique_ptr<spdlog::sinks::sink> destination,
               std::size_t queueLines)
    : m_Destination(std::move(destination)), m_rMutex(mutex)
{
    if (queueLines != 0) {
        m_Queue = std::make_unique<LogQueue>(queueLines);
        m_Thread = std::thread([this, pLine = std::make_unique<QueuedLine>()]() mutable {
            WriteQueuedLines(std::move(pLine));
        });
    }
}

Output::~Output()
{
    if (m_Queue) {
        {
            const Lock lock(m_rMutex);
            m_IsClosing = true;
            m_Arrived.notify_one();
        }
        m_Thread.join();
    }
}

void Output::Write(Lock& lock, const LineHead& head, const char* format, va_list args) noexcept
{
    if (m_Queue) {
        Queue(lock, head, format, args);
    } else {
        WriteDirectly(lock, head, format, args);
    }
}

void Output::Drain(Lock& lock) noexcept
{
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

void Output::WriteDirectly(Lock& lock, const LineHead& head, const char* format,
                           va_list args) noexcept
{
    ++m_Accepted;
    const KEVRO_UInt64 lost = m_Lost;
    lock.unlock();
    TextBuffer text;
    const bool written = Format(text, format, args) &&
                         WriteToDestination(head, std::string_view(text.data(), text.size()), lost);
    lock.lock();
    MarkDone(lock, m_Done + 1, written);
}

void Output::Queue(const Lock& /*lock*/, const LineHead& head, const char* format,
                   va_list args) noexcept
{
    QueuedLine& line = m_Queue->Next();
    line.head = head;
    if (!Format(line.text, format, args)) {
        ++m_Lost;
        return;
    }
    m_Lost += m_Queue->Append() ? 1 : 0;
    ++m_Accepted;
    if (!m_IsResting || m_Queue->IsHalfFull()) {
        m_Arrived.notify_one();
    }
}

void Output::WriteQueuedLines(std::unique_ptr<QueuedLine> pLine) noexcept
{
    for (Lock lock(m_rMutex);;) {
        m_Arrived.wait(lock, [this] { return m_Queue->Size() != 0 || m_IsClosing; });
        if (m_Queue->Size() == 0) {
            return;
        }
        m_Queue->Take(pLine);
        // The queue keeps the order: every earlier line has been written or dropped.
        const KEVRO_UInt64 number = m_Accepted - m_Queue->Size();
        // Not while lines are waiting: each report could displace one of them.
        const KEVRO_UInt64 lost = m_Queue->Size() == 0 ? m_Lost : 0;
        lock.unlock();
        const std::string_view text(pLine->text.data(), pLine->text.size());
        const bool written = WriteToDestination(pLine->head, text, lost);
        pLine->text = TextBuffer(); // releases what a long line needed
        lock.lock();
        MarkDone(lock, number, written);
        if (m_Queue->Size() == 0) {
            Rest(lock);
        }
    }
}

/** Lets lines gather for a moment, unless they are many: to wake this thread takes a writer longer
 * than many lines do. */
void Output::Rest(Lock& lock) noexcept
{
    m_IsResting = true;
    m_Arrived.wait_for(lock, std::chrono::microseconds(100),
                       [this] { return m_Queue->IsHalfFull() || m_IsClosing; });
    m_IsResting = false;
}

bool Output::WriteToDestination(const LineHead& head, std::string_view text,
                                KEVRO_UInt64 lost) noexcept
{
    const std::lock_guard<std::mutex> writing(m_WriteMutex);
    ReportLost(lost);
    return TryWrite(head, text);
}

bool Output::TryWrite(const LineHead& head, std::string_view text) noexcept
{
    try {
        TextBuffer line;
        AppendLine(line, head, text);
        m_Destination->log(spdlog::details::log_msg(
            head.time.point, spdlog::source_loc(), NameForClock(head.time), Severity(head.level),
            spdlog::string_view_t(line.data(), line.size())));
        return true;
    } catch (const spdlog::spdlog_ex& failure) {
        ReportFailure(failure.what());
        return false;
    } catch (...) {
        return false; // no memory, which says nothing about the destination
    }
}

/** The log itself can report lost lines only once the destination accepts lines again. */
void Output::ReportFailure(std::string_view reason) noexcept
{
    if (std::exchange(m_FailureReported, true)) {
        return;
    }
    try {
        TextBuffer text;
        AppendPrintable(text, reason);
        std::fprintf(stderr, "Log lines are lost: %.*s\n", static_cast<int>(text.size()),
                     text.data());
    } catch (...) {
        // The lines are counted nevertheless.
    }
}

void Output::ReportLost(KEVRO_UInt64 lost) noexcept
{
    // Another writer may have counted later but reported first.
    if (lost <= m_ReportedLost) {
        return;
    }
    char text[64];
    const int length =
        std::snprintf(text, sizeof(text), "lines lost: %" PRIu64, lost - m_ReportedLost);
    if (TryWrite({CurrentTime(), bd::CompIdCommon, KEVRO_Log_LevelWarning},
                 std::string_view(text, static_cast<std::size_t>(length)))) {
        m_ReportedLost = lost;
    }
}

void Output::MarkDone(const Lock& /*lock*/, KEVRO_UInt64 done, bool written) noexcept
{
    m_Done = done;
    m_Lost += written ? 0 : 1;
    m_Progress.notify_all();
}

} // namespace kevro
