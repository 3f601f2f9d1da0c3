/**
 * @file
 * Text from outside, made harmless for terminals and for whoever reads a log line by line.
 */
#ifndef KEVRO_PRINTABLE_H
#define KEVRO_PRINTABLE_H

#include <string_view>

namespace kevro
{

/**
 * Appends a text, every character that is not a printable one of ASCII as an escape sequence of C.
 *
 * A backslash is doubled, so that what a line shows can be told from what it was.
 *
 * @tparam Buffer a sequence of char with push_back()
 */
template <typename Buffer> void AppendPrintable(Buffer& buffer, std::string_view text)
{
    constexpr char Digits[] = "0123456789ABCDEF";
    const auto appendEscape = [&buffer](char letter) {
        buffer.push_back('\\');
        buffer.push_back(letter);
    };
    for (const char c : text) {
        const auto byte = static_cast<unsigned char>(c);
        switch (c) {
        case '\\':
            appendEscape('\\');
            break;
        case '\n':
            appendEscape('n');
            break;
        case '\r':
            appendEscape('r');
            break;
        case '\t':
            appendEscape('t');
            break;
        default:
            if (byte >= 0x20 && byte < 0x7F) {
                buffer.push_back(c);
            } else {
                appendEscape('x');
                buffer.push_back(Digits[byte >> 4]);
                buffer.push_back(Digits[byte & 0xF]);
            }
        }
    }
}

} // namespace kevro

#endif
