#include "logoutput.h"

#include <cinttypes>
#include <cstdio>
#include <cstring>
#include <utility>

#include <spdlog/details/log_msg.h>

#include "bd/logging.h"
#include "printable.h"

namespace kevro
{

namespace
{

/**
 * The parts of a queued line besides its time point and its text.
 *
 * spdlog's messages have no field for them, but the queue copies the name of a message's logger
 * next to the text. That name is not used here, so these bytes are passed in its place.
 */
struct Heading {
    KEVRO_UInt64 number; ///< of the line, from 1
    KEVRO_UInt32 component;
    KEVRO_Int32 level;
    KEVRO_UInt32 timeIsOfProgram;
    KEVRO_UInt32 reserved; ///< fills the structure: no byte is passed uninitialised

    spdlog::string_view_t AsName() const
    {
        return {reinterpret_cast<const char*>(this), sizeof(*this)};
    }

    static Heading FromName(spdlog::string_view_t name)
    {
        Heading heading;
        std::memcpy(&heading, name.data(), sizeof(heading));
        return heading;
    }
};

} // namespace

Output::Output(std::mutex& mutex, std::unique_ptr<spdlog::sinks::sink> destination,
               std::size_t queueLines)
    : m_Destination(std::move(destination)), m_rMutex(mutex)
{
    if (queueLines != 0) {
        // The logger is a member of this object, so its pointer to this object owns nothing.
        const spdlog::sink_ptr self(spdlog::sink_ptr(), this);
        m_Queue = std::make_shared<spdlog::details::thread_pool>(queueLines, 1);
        m_Logger = std::make_shared<spdlog::async_logger>(
            std::string(), self, m_Queue, spdlog::async_overflow_policy::overrun_oldest);
    }
}

void Output::Write(Lock& lock, const LogLine& line) noexcept
{
    if (!m_Queue) {
        WriteDirectly(lock, line);
        return;
    }
    try {
        Queue(lock, line);
    } catch (...) {
        ++m_Refused;
    }
}

void Output::Drain(Lock& lock) noexcept
{
    const KEVRO_UInt64 accepted = m_Accepted;
    m_Progress.wait(lock, [&] { return m_Done >= accepted; });
    const KEVRO_UInt64 lost = CountLost(lock);
    lock.unlock();
    {
        const std::lock_guard<std::mutex> writing(m_WriteMutex);
        ReportLost(lost);
    }
    lock.lock();
}

void Output::AddLost(const Lock& /*lock*/) noexcept
{
    ++m_Refused;
}

KEVRO_UInt64 Output::CountLost(const Lock& /*lock*/) const noexcept
{
    return m_Refused + (m_Queue ? m_Queue->overrun_counter() : 0);
}

void Output::log(const spdlog::details::log_msg& message)
{
    const Heading heading = Heading::FromName(message.logger_name);
    const std::string_view text(message.payload.data(), message.payload.size());

    Lock lock(m_rMutex);
    // Not while lines are waiting: each report could displace one of them.
    const KEVRO_UInt64 lost = m_Queue->queue_size() == 0 ? CountLost(lock) : 0;
    lock.unlock();
    const bool written = WriteToDestination(
        {{message.time, heading.timeIsOfProgram}, heading.component, heading.level, text}, lost);
    lock.lock();
    // The queue keeps the order: every earlier line has been written or dropped.
    MarkDone(lock, heading.number, written);
}

void Output::flush()
{
    m_Destination->flush();
}

void Output::set_pattern(const std::string& pattern)
{
    m_Destination->set_pattern(pattern);
}

void Output::set_formatter(std::unique_ptr<spdlog::formatter> formatter)
{
    m_Destination->set_formatter(std::move(formatter));
}

void Output::WriteDirectly(Lock& lock, const LogLine& line) noexcept
{
    ++m_Accepted;
    const KEVRO_UInt64 lost = CountLost(lock);
    lock.unlock();
    const bool written = WriteToDestination(line, lost);
    lock.lock();
    MarkDone(lock, m_Done + 1, written);
}

void Output::Queue(const Lock& /*lock*/, const LogLine& line)
{
    const Heading heading = {m_Accepted + 1, line.component, line.level, line.time.isOfProgram, 0};
    // Not through the logger: some of its versions hide that memory ran out.
    m_Queue->post_log(
        std::shared_ptr<spdlog::async_logger>(m_Logger),
        spdlog::details::log_msg(line.time.point, spdlog::source_loc(), heading.AsName(),
                                 Severity(line.level),
                                 spdlog::string_view_t(line.text.data(), line.text.size())),
        spdlog::async_overflow_policy::overrun_oldest);
    ++m_Accepted;
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
            line.time.point, spdlog::source_loc(), NameForClock(line.time), Severity(line.level),
            spdlog::string_view_t(text.data(), text.size())));
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
    if (TryWrite({CurrentTime(), bd::CompIdCommon, KEVRO_Log_LevelWarning,
                  std::string_view(text, static_cast<std::size_t>(length))})) {
        m_ReportedLost = lost;
    }
}

void Output::MarkDone(const Lock& /*lock*/, KEVRO_UInt64 done, bool written) noexcept
{
    m_Done = done;
    m_Refused += written ? 0 : 1;
    m_Progress.notify_all();
}

} // namespace kevro
