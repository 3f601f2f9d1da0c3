#include "logformat.h"

#include <charconv>
#include <cstdio>
#include <cstring>

namespace kevro
{

namespace
{

/** A copy of arguments that can be read once. */
struct Arguments {
    explicit Arguments(va_list args) { va_copy(list, args); }
    ~Arguments() { va_end(list); }
    Arguments(const Arguments&) = delete;
    Arguments& operator=(const Arguments&) = delete;

    va_list list;
};

template <typename Number> void AppendNumber(TextBuffer& buffer, Number number)
{
    constexpr std::size_t longest = 20; // 64 bits, or 63 and a sign
    const std::size_t size = buffer.size();
    buffer.resize(size + longest);
    const auto result = std::to_chars(buffer.data() + size, buffer.end(), number);
    buffer.resize(static_cast<std::size_t>(result.ptr - buffer.data()));
}

/** Formats the conversions that log lines have most; returns false at any other. */
bool AppendCommon(TextBuffer& buffer, const char* format, Arguments&& args)
{
    while (const char* const percent = std::strchr(format, '%')) {
        buffer.append(format, percent);
        const std::size_t longs = std::strspn(percent + 1, "l");
        const char conversion = percent[1 + longs];
        if (conversion == 'd' && longs == 0) {
            AppendNumber(buffer, va_arg(args.list, int));
        } else if (conversion == 'd' && longs == 1) {
            AppendNumber(buffer, va_arg(args.list, long));
        } else if (conversion == 'd' && longs == 2) {
            AppendNumber(buffer, va_arg(args.list, long long));
        } else if (conversion == 'u' && longs == 0) {
            AppendNumber(buffer, va_arg(args.list, unsigned));
        } else if (conversion == 'u' && longs == 1) {
            AppendNumber(buffer, va_arg(args.list, unsigned long));
        } else if (conversion == 'u' && longs == 2) {
            AppendNumber(buffer, va_arg(args.list, unsigned long long));
        } else if (conversion == 's' && longs == 0) {
            const char* const text = va_arg(args.list, const char*);
            if (text == nullptr) {
                return false;
            }
            buffer.append(text, text + std::strlen(text));
        } else {
            return false;
        }
        format = percent + 1 + longs + 1;
    }
    buffer.append(format, format + std::strlen(format));
    return true;
}

} // namespace

bool AppendFormatted(TextBuffer& buffer, const char* format, va_list args)
{
    const std::size_t size = buffer.size();
    if (AppendCommon(buffer, format, Arguments(args))) {
        return true;
    }
    // The terminating null character needs room, but is not part of the text.
    const std::size_t room = buffer.capacity() - size;
    const int length = std::vsnprintf(buffer.data() + size, room, format, Arguments(args).list);
    if (length < 0) {
        return false;
    }
    const std::size_t end = size + static_cast<std::size_t>(length);
    if (end - size >= room) {
        buffer.resize(end + 1);
        std::vsnprintf(buffer.data() + size, end + 1 - size, format, args);
    }
    buffer.resize(end);
    return true;
}

} // namespace kevro
