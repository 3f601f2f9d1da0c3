#include "program/target.h"

#include <fcntl.h>
#include <poll.h>
#include <unistd.h>

#include <cerrno>
#include <system_error>
#include <utility>

#include "program/failure.h"
#include "text/printable.h"

namespace deskplayer
{

DescriptorBuffer::DescriptorBuffer()
{
    setp(m_Buffer.data(), m_Buffer.data() + m_Buffer.size());
}

DescriptorBuffer::int_type DescriptorBuffer::overflow(int_type character)
{
    if (!WriteAll()) {
        return traits_type::eof();
    }
    if (!traits_type::eq_int_type(character, traits_type::eof())) {
        *pptr() = traits_type::to_char_type(character);
        pbump(1);
    }
    return traits_type::not_eof(character);
}

int DescriptorBuffer::sync()
{
    return WriteAll() ? 0 : -1;
}

/** What cannot be written is dropped: nothing is written after a gap. */
bool DescriptorBuffer::WriteAll()
{
    const char* next = pbase();
    while (m_Error == 0 && next < pptr()) {
        const ssize_t written = write(m_Descriptor, next, static_cast<std::size_t>(pptr() - next));
        if (written >= 0) {
            next += written;
        } else if (errno == EAGAIN) {
            // Another program may have made a shared terminal or pipe non-blocking.
            pollfd writable = {m_Descriptor, POLLOUT, 0};
            poll(&writable, 1, -1);
        } else if (errno != EINTR) {
            m_Error = errno;
        }
    }
    setp(m_Buffer.data(), m_Buffer.data() + m_Buffer.size());
    return m_Error == 0;
}

Target::Target(std::string fileName) : m_FileName(std::move(fileName)), m_Stream(&m_Buffer)
{
    m_Buffer.Attach(STDOUT_FILENO);
}

Target::~Target()
{
    if (m_File >= 0) {
        close(m_File);
    }
}

std::ostream& Target::Open()
{
    if (!m_FileName.empty()) {
        m_File = open(m_FileName.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0666);
        if (m_File < 0) {
            Fail(errno);
        }
        m_Buffer.Attach(m_File);
    }
    return m_Stream;
}

void Target::Finish()
{
    if (!m_Stream.flush()) {
        Fail(m_Buffer.Error());
    }
}

void Target::Fail(int error) const
{
    throw OutputError((m_FileName.empty() ? "standard output" : Printable(m_FileName)) +
                      ": cannot be written: " + std::generic_category().message(error));
}

} // namespace deskplayer
