#include "logclock.h"

#include <algorithm>
#include <atomic>
#include <chrono>
#include <cinttypes>
#include <cstdio>
#include <mutex>

#include <spdlog/details/log_msg.h>
#include <spdlog/pattern_formatter.h>

#include "kevro_linux.h"

namespace kevro
{

namespace
{

using std::chrono::microseconds;

/** Held during a call of the clock, so that the program can destroy what the previous one used. */
std::mutex g_Mutex;
KEVRO_UInt64 (*g_pMicroseconds)(void* user) = nullptr;
void* g_pUser = nullptr;
std::atomic<bool> g_IsSet{false}; ///< saves the lock while no clock is set

constexpr char NameOfProgramClock[] = "program";

class LineFormatter final : public spdlog::formatter
{
public:
    void format(const spdlog::details::log_msg& message, spdlog::memory_buf_t& line) override
    {
        if (message.logger_name.size() == 0) {
            m_SystemTime.format(message, line);
            return;
        }
        const auto time = static_cast<std::uint64_t>(
            std::chrono::duration_cast<microseconds>(message.time.time_since_epoch()).count());
        const std::uint64_t seconds = time / 1000000;
        char text[64];
        const int length = std::snprintf(text, sizeof(text), "%02" PRIu64 ":%02u:%02u.%06u ",
                                         seconds / 3600, static_cast<unsigned>(seconds / 60 % 60),
                                         static_cast<unsigned>(seconds % 60),
                                         static_cast<unsigned>(time % 1000000));
        line.append(text, text + length);
        line.append(message.payload.begin(), message.payload.end());
        line.push_back('\n');
    }

    std::unique_ptr<spdlog::formatter> clone() const override { return MakeLineFormatter(); }

private:
    spdlog::pattern_formatter m_SystemTime{"%Y-%m-%d %H:%M:%S.%f %v",
                                           spdlog::pattern_time_type::local, "\n"};
};

} // namespace

LineTime CurrentTime() noexcept
{
    if (g_IsSet) {
        const std::lock_guard<std::mutex> lock(g_Mutex);
        if (g_pMicroseconds != nullptr) {
            constexpr auto latest = std::chrono::duration_cast<microseconds>(
                spdlog::log_clock::time_point::max().time_since_epoch());
            const auto time =
                std::min(g_pMicroseconds(g_pUser), static_cast<KEVRO_UInt64>(latest.count()));
            return {spdlog::log_clock::time_point(microseconds(time)), 1};
        }
    }
    return {spdlog::log_clock::now(), 0};
}

spdlog::string_view_t NameForClock(const LineTime& time)
{
    return time.isOfProgram != 0 ? spdlog::string_view_t(NameOfProgramClock)
                                 : spdlog::string_view_t();
}

std::unique_ptr<spdlog::formatter> MakeLineFormatter()
{
    return std::make_unique<LineFormatter>();
}

} // namespace kevro

void KEVRO_Log_SetClock(KEVRO_UInt64 (*microseconds)(void* user), void* user)
{
    const std::lock_guard<std::mutex> lock(kevro::g_Mutex);
    kevro::g_pMicroseconds = microseconds;
    kevro::g_pUser = user;
    kevro::g_IsSet = microseconds != nullptr;
}
