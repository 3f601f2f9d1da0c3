#include "session/sessionfile.h"

#include <fcntl.h>
#include <poll.h>
#include <unistd.h>

#include <array>
#include <cstddef>

#include "deskplayer/errors.h"
#include "session/script.h"
#include "text/printable.h"

namespace deskplayer
{

namespace
{

/** An open file. */
class File
{
public:
    explicit File(const std::string& fileName)
        : m_Descriptor(open(fileName.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC))
    {
    }

    ~File() { close(m_Descriptor); }

    File(const File&) = delete;
    File& operator=(const File&) = delete;

    /** Waits for input, the end or an error. @return false if it timed out */
    bool WaitForInput() const
    {
        constexpr int timeout = 500; // milliseconds
        pollfd input = {m_Descriptor, POLLIN, 0};
        return m_Descriptor < 0 || poll(&input, 1, timeout) != 0;
    }

    /** @return the number of bytes read; 0 at the end, negative on an error */
    ssize_t Read(char* bytes, std::size_t size) const { return read(m_Descriptor, bytes, size); }

private:
    int m_Descriptor;
};

} // namespace

std::string ReadSessionText(const std::string& fileName)
{
    const File file(fileName);
    std::string text;
    std::array<char, 4096> buffer;
    ssize_t size = 1;
    while (size > 0 && text.size() <= LongestScript) {
        if (!file.WaitForInput()) {
            throw SessionError(Printable(fileName) + ": timed out waiting for input");
        }
        size = file.Read(buffer.data(), buffer.size());
        if (size < 0) {
            throw SessionError(Printable(fileName) + ": cannot read session, expected a text file");
        }
        text.append(buffer.data(), static_cast<std::size_t>(size));
    }
    if (text.size() > LongestScript) {
        throw SessionError(Printable(fileName) + ": session too long, expected at most " +
                           std::to_string(LongestScript) + " bytes");
    }
    return text;
}

} // namespace deskplayer
