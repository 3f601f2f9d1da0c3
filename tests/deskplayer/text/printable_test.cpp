#include "text/printable.h"

#include <gtest/gtest.h>

namespace deskplayer
{

namespace
{

TEST(Printable, EscapesAllButPrintableAscii)
{
    EXPECT_EQ(Printable(std::string("a~ \0\n\x1B\x7F\xE9\\", 9)),
              "a~ \\x00\\x0A\\x1B\\x7F\\xE9\\x5C");
}

} // namespace

} // namespace deskplayer
