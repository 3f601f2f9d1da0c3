#include "sinks.h"

#include <cerrno>
#include <cstdio>
#include <mutex>
#include <set>
#include <string_view>

#include <poll.h>
#include <syslog.h>
#include <unistd.h>

#include <spdlog/details/os.h>
#include <spdlog/sinks/base_sink.h>
#include <spdlog/sinks/rotating_file_sink.h>

#include "logclock.h"

namespace kevro
{

namespace
{

/** Standard error. Unlike spdlog's own sink it throws when a line could not be written. */
class StderrSink final : public spdlog::sinks::base_sink<std::mutex>
{
protected:
    void sink_it_(const spdlog::details::log_msg& message) override
    {
        spdlog::memory_buf_t line;
        formatter_->format(message, line);
        std::string_view rest(line.data(), line.size());
        while (!rest.empty()) {
            const ssize_t written = ::write(STDERR_FILENO, rest.data(), rest.size());
            if (written >= 0) {
                rest.remove_prefix(static_cast<std::size_t>(written));
            } else if (errno == EAGAIN) {
                // Another program may have made the shared terminal non-blocking.
                pollfd writable = {STDERR_FILENO, POLLOUT, 0};
                ::poll(&writable, 1, -1);
            } else if (errno != EINTR) {
                spdlog::throw_spdlog_ex("standard error", errno);
            }
        }
    }

    void flush_() override {}
};

/**
 * The system's log. spdlog's own sink closes it on destruction, which would remove the name of a
 * sink created in the meantime.
 */
class SyslogSink final : public spdlog::sinks::base_sink<std::mutex>
{
public:
    explicit SyslogSink(const std::string& ident)
    {
        ::openlog(ident.empty() ? nullptr : Keep(ident), LOG_PID, LOG_USER);
    }

protected:
    void sink_it_(const spdlog::details::log_msg& message) override
    {
        ::syslog(Priority(message.level), "%.*s", static_cast<int>(message.payload.size()),
                 message.payload.data());
    }

    void flush_() override {}

private:
    /** The system keeps the pointer to the name, so a name is never freed. */
    static const char* Keep(const std::string& ident)
    {
        static std::mutex& mutex = *new std::mutex;
        static std::set<std::string>& idents = *new std::set<std::string>;
        const std::lock_guard<std::mutex> lock(mutex);
        return idents.insert(ident).first->c_str();
    }

    static int Priority(spdlog::level::level_enum level)
    {
        switch (level) {
        case spdlog::level::critical:
            return LOG_CRIT;
        case spdlog::level::err:
            return LOG_ERR;
        case spdlog::level::warn:
            return LOG_WARNING;
        case spdlog::level::info:
            return LOG_INFO;
        default:
            return LOG_DEBUG;
        }
    }
};

} // namespace

std::unique_ptr<spdlog::sinks::sink> MakeStderrSink()
{
    auto sink = std::make_unique<StderrSink>();
    sink->set_formatter(MakeLineFormatter());
    return sink;
}

std::unique_ptr<spdlog::sinks::sink> MakeFileSink(const std::string& path, std::size_t size,
                                                  std::size_t files)
{
    spdlog::file_event_handlers handlers;
    handlers.before_open = [](const spdlog::filename_t& file) {
        // spdlog would create missing directories: a misspelt path must not leave any.
        const spdlog::filename_t directory = spdlog::details::os::dir_name(file);
        if (!directory.empty() && !spdlog::details::os::path_exists(directory)) {
            spdlog::throw_spdlog_ex("Failed opening file " + file + " for writing", ENOENT);
        }
    };
    handlers.after_open = [](const spdlog::filename_t&, std::FILE* file) {
        // Unbuffered, a full disk is noticed at the line that is lost, and a crash loses none.
        std::setvbuf(file, nullptr, _IONBF, 0);
    };
    auto sink =
        std::make_unique<spdlog::sinks::rotating_file_sink_mt>(path, size, files, false, handlers);
    sink->set_formatter(MakeLineFormatter());
    return sink;
}

std::unique_ptr<spdlog::sinks::sink> MakeSyslogSink(const std::string& ident)
{
    return std::make_unique<SyslogSink>(ident);
}

} // namespace kevro
