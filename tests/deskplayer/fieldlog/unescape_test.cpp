#include "fieldlog/unescape.h"

#include <gtest/gtest.h>

#include <string>

#include "../../../ports/linux/printable.h"

namespace deskplayer
{

namespace
{

std::string Unescaped(std::string_view text)
{
    std::string buffer;
    return std::string(Unescape(text, buffer));
}

TEST(Unescape, UndoesWhatThePortWrites)
{
    std::string text;
    for (int character = 0; character < 256; ++character) {
        text += {'a', static_cast<char>(character)};
    }
    std::string escaped;
    kevro::AppendPrintable(escaped, text);

    EXPECT_EQ(Unescaped(escaped), text);
}

TEST(Unescape, LeavesOtherBackslashes)
{
    for (const char* const text : {"\\", "a\\q", "\\x", "\\x4", "\\xG0", "\\x4G"}) {
        EXPECT_EQ(Unescaped(text), text);
    }
}

} // namespace

} // namespace deskplayer
