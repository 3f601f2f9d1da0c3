/**
 * @file
 * Log files that are open.
 *
 * @code
 * LogFile log("player.log");
 * for (std::string_view part = log.Read(); !part.empty(); part = log.Read()) {
 *     reader.Read(part);
 * }
 * @endcode
 */
#ifndef DESKPLAYER_PROGRAM_LOGFILE_H
#define DESKPLAYER_PROGRAM_LOGFILE_H

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <system_error>

#include "program/failure.h"
#include "text/printable.h"

namespace deskplayer
{

/** A log that is open. */
class LogFile
{
public:
    /** @param name of a file, or `-` for standard input @throw UsageError it cannot be opened */
    explicit LogFile(const std::string& name)
        : m_Name(name == "-" ? "standard input" : Printable(name)),
          m_Descriptor(name == "-" ? STDIN_FILENO : open(name.c_str(), O_RDONLY | O_CLOEXEC))
    {
        if (m_Descriptor < 0 || fstat(m_Descriptor, &m_Status) != 0) {
            Fail(errno);
        }
    }

    ~LogFile()
    {
        if (m_Descriptor != STDIN_FILENO) {
            close(m_Descriptor);
        }
    }

    LogFile(const LogFile&) = delete;
    LogFile& operator=(const LogFile&) = delete;

    const std::string& Name() const { return m_Name; }

    /** Whether it may still grow while it is read. */
    bool IsLive() const { return !S_ISREG(m_Status.st_mode); }

    /** In bytes, when it was opened. Only if it is not live. */
    std::uint64_t Size() const { return static_cast<std::uint64_t>(m_Status.st_size); }

    bool IsFile(const struct stat& other) const
    {
        return S_ISREG(other.st_mode) && other.st_dev == m_Status.st_dev &&
               other.st_ino == m_Status.st_ino;
    }

    /** What follows, until the next call; empty at the end. @throw UsageError it cannot be read */
    std::string_view Read()
    {
        ssize_t size = 0;
        do {
            size = read(m_Descriptor, m_Buffer.data(), m_Buffer.size());
        } while (size < 0 && errno == EINTR);
        if (size < 0) {
            Fail(errno);
        }
        return {m_Buffer.data(), static_cast<std::size_t>(size)};
    }

private:
    [[noreturn]] void Fail(int error) const
    {
        throw UsageError(m_Name + ": cannot be read: " + std::generic_category().message(error));
    }

    const std::string m_Name;
    const int m_Descriptor;
    struct stat m_Status = {};
    std::array<char, std::size_t{64} * 1024> m_Buffer;
};

} // namespace deskplayer

#endif
