#include "text/printable.h"

#include <cstddef>

namespace deskplayer
{

namespace
{

/** The length of the valid UTF-8 character at the start of a text; 0 if there is none. */
std::size_t LengthOfCharacter(std::string_view text)
{
    const auto byte = [text](std::size_t index) {
        return index < text.size() ? static_cast<unsigned char>(text[index]) : 0U;
    };
    const unsigned lead = byte(0);
    if (lead < 0x80) {
        return 1;
    }
    const std::size_t length = lead >= 0xC2 && lead < 0xE0   ? 2
                               : lead >= 0xE0 && lead < 0xF0 ? 3
                               : lead >= 0xF0 && lead < 0xF5 ? 4
                                                             : 0;
    for (std::size_t i = 1; i < length; ++i) {
        if ((byte(i) & 0xC0) != 0x80) {
            return 0;
        }
    }
    // Three and four bytes also encode characters with shorter encodings, surrogates, and numbers
    // above the last character.
    const unsigned second = byte(1);
    const bool excluded = (lead == 0xE0 && second < 0xA0) || (lead == 0xED && second >= 0xA0) ||
                          (lead == 0xF0 && second < 0x90) || (lead == 0xF4 && second >= 0x90);
    return excluded ? 0 : length;
}

/** @param character a valid one */
bool IsControl(std::string_view character)
{
    const auto lead = static_cast<unsigned char>(character.front());
    return lead < 0x20 || lead == 0x7F ||
           (lead == 0xC2 && static_cast<unsigned char>(character[1]) < 0xA0);
}

} // namespace

std::string Printable(std::string_view text)
{
    static const char digits[] = "0123456789ABCDEF";
    std::string printable;
    while (!text.empty()) {
        const std::size_t length = LengthOfCharacter(text);
        const std::string_view character = text.substr(0, length == 0 ? 1 : length);
        if (length != 0 && !IsControl(character) && character != "\\") {
            printable += character;
        } else {
            for (const char escaped : character) {
                const auto byte = static_cast<unsigned char>(escaped);
                printable += {'\\', 'x', digits[byte >> 4], digits[byte & 0xF]};
            }
        }
        text.remove_prefix(character.size());
    }
    return printable;
}

bool IsUtf8(std::string_view text)
{
    while (!text.empty()) {
        const std::size_t length = LengthOfCharacter(text);
        if (length == 0) {
            return false;
        }
        text.remove_prefix(length);
    }
    return true;
}

std::string_view FirstCharacters(std::string_view text, std::size_t longest)
{
    std::size_t end = 0;
    while (end < text.size()) {
        const std::size_t length = LengthOfCharacter(text.substr(end));
        const std::size_t next = end + (length == 0 ? 1 : length);
        if (next > longest) {
            break;
        }
        end = next;
    }
    return text.substr(0, end);
}

} // namespace deskplayer
