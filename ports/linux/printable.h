/**
 * @file
 * Escapes text from outside, so that it cannot control a terminal or break a log line.
 */
#ifndef KEVRO_PRINTABLE_H
#define KEVRO_PRINTABLE_H

#include <algorithm>
#include <string_view>

namespace kevro
{

/**
 * Appends a text with every character but printable ASCII as an escape sequence of C.
 *
 * A backslash is doubled, so that the original text can be recovered.
 *
 * @tparam Buffer a sequence of char with push_back(), and append() of a range
 */
template <typename Buffer> void AppendPrintable(Buffer& buffer, std::string_view text)
{
    constexpr char Digits[] = "0123456789ABCDEF";
    const auto isPlain = [](char c) { return c >= ' ' && c <= '~' && c != '\\'; };
    const char* rest = text.data();
    const char* const end = rest + text.size();
    for (;;) {
        const char* const special = std::find_if_not(rest, end, isPlain);
        buffer.append(rest, special);
        if (special == end) {
            return;
        }
        rest = special + 1;
        buffer.push_back('\\');
        switch (*special) {
        case '\\':
            buffer.push_back('\\');
            break;
        case '\n':
            buffer.push_back('n');
            break;
        case '\r':
            buffer.push_back('r');
            break;
        case '\t':
            buffer.push_back('t');
            break;
        default:
            buffer.push_back('x');
            buffer.push_back(Digits[static_cast<unsigned char>(*special) >> 4]);
            buffer.push_back(Digits[static_cast<unsigned char>(*special) & 0xF]);
        }
    }
}

} // namespace kevro

#endif
