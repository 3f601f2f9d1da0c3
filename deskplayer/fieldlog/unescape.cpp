#include "fieldlog/unescape.h"

#include <charconv>

namespace deskplayer
{

namespace
{

/** The number of characters of the escape at the beginning of the text; 0 if there is none. */
std::size_t ReadEscape(std::string_view text, char& character)
{
    switch (text.size() < 2 ? '\0' : text[1]) {
    case '\\':
        character = '\\';
        return 2;
    case 'n':
        character = '\n';
        return 2;
    case 'r':
        character = '\r';
        return 2;
    case 't':
        character = '\t';
        return 2;
    case 'x': {
        unsigned char byte = 0;
        const std::string_view digits = text.substr(2, 2);
        const auto result = std::from_chars(digits.data(), digits.data() + digits.size(), byte, 16);
        character = static_cast<char>(byte);
        return result.ptr == digits.data() + 2 ? 4 : 0;
    }
    default:
        return 0;
    }
}

} // namespace

std::string_view Unescape(std::string_view text, std::string& buffer)
{
    std::size_t backslash = text.find('\\');
    if (backslash == std::string_view::npos) {
        return text;
    }
    buffer.clear();
    for (; backslash != std::string_view::npos; backslash = text.find('\\')) {
        buffer.append(text.substr(0, backslash));
        text.remove_prefix(backslash);
        char character = '\\';
        const std::size_t length = ReadEscape(text, character);
        buffer.push_back(length == 0 ? '\\' : character);
        text.remove_prefix(length == 0 ? 1 : length);
    }
    buffer.append(text);
    return buffer;
}

} // namespace deskplayer
