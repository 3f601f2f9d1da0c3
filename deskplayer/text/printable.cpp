#include "text/printable.h"

namespace deskplayer
{

std::string Printable(const std::string& text)
{
    static const char digits[] = "0123456789ABCDEF";
    std::string printable;
    for (const char character : text) {
        const auto byte = static_cast<unsigned char>(character);
        if (byte >= 0x20 && byte < 0x7F && character != '\\') {
            printable += character;
        } else {
            printable += {'\\', 'x', digits[byte >> 4], digits[byte & 0xF]};
        }
    }
    return printable;
}

} // namespace deskplayer
