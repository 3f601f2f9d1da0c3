#include "logoutput.h"

#include <cinttypes>
#include <cstdio>
#include <string>
#include <utility>

namespace kevro
{

Output::Output(std::unique_ptr<spdlog::sinks::sink> destination, std::size_t queueLines)
    : m_Destination(std::move(destination))
{
    // The logger lives inside this object and shares nothing with it.
    const spdlog::sink_ptr self(spdlog::sink_ptr(), this);
    if (queueLines == 0) {
        m_Logger = std::make_shared<spdlog::logger>(std::string(), self);
    } else {
        m_Queue = std::make_shared<spdlog::details::thread_pool>(queueLines, 1);
        m_Logger = std::make_shared<spdlog::async_logger>(
            std::string(), self, m_Queue, spdlog::async_overflow_policy::overrun_oldest);
    }
    m_Logger->set_level(spdlog::level::trace);
}

void Output::Write(spdlog::level::level_enum level, std::string_view line) noexcept
{
    {
        // Before the line is on its way, so that nobody who waits can overlook it.
        const std::lock_guard<std::mutex> lock(m_CountMutex);
        ++m_Accepted;
    }
    try {
        m_Logger->log(spdlog::source_loc(), level, spdlog::string_view_t(line.data(), line.size()));
    } catch (...) {
        Account(false);
    }
}

void Output::Drain() noexcept
{
    {
        std::unique_lock<std::mutex> lock(m_CountMutex);
        // The queue keeps the order and loses its oldest line first: once as many lines are through
        // or lost as had been accepted, it is those.
        const KEVRO_UInt64 accepted = m_Accepted;
        m_Progress.wait(lock, [&] { return m_Done + CountOverrun() >= accepted; });
    }
    const std::lock_guard<std::mutex> lock(m_WriteMutex);
    ReportLost();
}

void Output::AddLost() noexcept
{
    const std::lock_guard<std::mutex> lock(m_CountMutex);
    ++m_Refused;
}

KEVRO_UInt64 Output::CountLost() const noexcept
{
    const std::lock_guard<std::mutex> lock(m_CountMutex);
    return m_Refused + CountOverrun();
}

void Output::log(const spdlog::details::log_msg& message)
{
    bool written;
    {
        const std::lock_guard<std::mutex> lock(m_WriteMutex);
        // Not while lines are waiting: each of these reports would cost one of them its place.
        if (IsCaughtUp()) {
            ReportLost();
        }
        written = TryWrite(message);
    }
    Account(written);
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

bool Output::TryWrite(const spdlog::details::log_msg& message) noexcept
{
    try {
        m_Destination->log(message);
        return true;
    } catch (...) {
        return false;
    }
}

void Output::ReportLost() noexcept
{
    const KEVRO_UInt64 lost = CountLost();
    if (lost == m_ReportedLost) {
        return;
    }
    char text[64];
    const int length = std::snprintf(text, sizeof(text), "Common Warning: lines lost: %" PRIu64,
                                     lost - m_ReportedLost);
    const spdlog::string_view_t line(text, static_cast<std::size_t>(length));
    if (TryWrite(spdlog::details::log_msg(spdlog::string_view_t(), spdlog::level::warn, line))) {
        m_ReportedLost = lost;
    }
}

void Output::Account(bool written) noexcept
{
    {
        const std::lock_guard<std::mutex> lock(m_CountMutex);
        ++m_Done;
        m_Refused += written ? 0 : 1;
    }
    m_Progress.notify_all();
}

bool Output::IsCaughtUp() const noexcept
{
    return !m_Queue || m_Queue->queue_size() == 0;
}

KEVRO_UInt64 Output::CountOverrun() const noexcept
{
    return m_Queue ? m_Queue->overrun_counter() : 0;
}

} // namespace kevro
