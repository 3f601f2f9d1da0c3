#include "text/printable.h"

#include <gtest/gtest.h>

namespace deskplayer
{

namespace
{

TEST(Printable, KeepsPrintableAscii)
{
    std::string ascii;
    for (char character = ' '; character <= '~'; ++character) {
        ascii += character == '\\' ? '/' : character;
    }
    EXPECT_EQ(Printable(ascii), ascii);
    EXPECT_EQ(Printable(""), "");
}

TEST(Printable, KeepsValidUtf8)
{
    for (const char* const text :
         {"\xC2\xA0", "d\xC3\xA9j\xC3\xA0", "\xDF\xBF", "\xE0\xA0\x80", "\xE6\x98\xA0\xE7\x94\xBB",
          "\xED\x9F\xBF", "\xEE\x80\x80", "\xEF\xBF\xBF", "\xF0\x90\x80\x80", "\xF0\x9F\x8E\xAC",
          "\xF4\x8F\xBF\xBF"}) {
        EXPECT_EQ(Printable(text), text);
    }
}

TEST(Printable, EscapesControlCharactersAndTheBackslash)
{
    EXPECT_EQ(Printable(std::string_view("a\0\n\x1B\x1F\x7F\\~", 8)),
              "a\\x00\\x0A\\x1B\\x1F\\x7F\\x5C~");
    EXPECT_EQ(Printable("\xC2\x80"
                        "a\xC2\x9B"
                        "b\xC2\x9F"),
              "\\xC2\\x80a\\xC2\\x9B"
              "b\\xC2\\x9F");
}

TEST(Printable, EscapesEveryByteThatIsNotValidUtf8)
{
    const struct {
        const char* text;
        const char* printable;
    } examples[] = {{"\xE9", "\\xE9"},
                    {"\xE9t", "\\xE9t"},
                    {"\x80\xBF", "\\x80\\xBF"},
                    {"\xC1\xBF", "\\xC1\\xBF"},                   // encodes ASCII
                    {"\xE0\x9F\xBF", "\\xE0\\x9F\\xBF"},          // two bytes suffice
                    {"\xF0\x8F\xBF\xBF", "\\xF0\\x8F\\xBF\\xBF"}, // three bytes suffice
                    {"\xED\xA0\x80", "\\xED\\xA0\\x80"},          // a surrogate
                    {"\xF4\x90\x80\x80", "\\xF4\\x90\\x80\\x80"}, // above the last character
                    {"\xF5\x80\x80\x80", "\\xF5\\x80\\x80\\x80"}, // the same
                    {"\xE6\x98", "\\xE6\\x98"},                   // cut off
                    {"\xE6\x98\xC3\xA9", "\\xE6\\x98\xC3\xA9"},   // cut off by a valid character
                    {"\xF0\x9F\x8E", "\\xF0\\x9F\\x8E"}};
    for (const auto& example : examples) {
        EXPECT_EQ(Printable(example.text), example.printable);
        EXPECT_FALSE(IsUtf8(example.text)) << example.printable;
    }
}

TEST(Utf8, ConsistsOfValidCharacters)
{
    EXPECT_TRUE(IsUtf8(""));
    EXPECT_TRUE(IsUtf8("a\x1F\xC3\xA9\xE2\x82\xAC\xF0\x9F\x8E\xAC"));
    EXPECT_FALSE(IsUtf8("a\xC3\xA9\xFF"));
}

TEST(FirstCharacters, EndBetweenTwoCharacters)
{
    EXPECT_EQ(FirstCharacters("abc", 2), "ab");
    EXPECT_EQ(FirstCharacters("abc", 3), "abc");
    EXPECT_EQ(FirstCharacters("abc", 4), "abc");
    EXPECT_EQ(FirstCharacters("a\xC3\xA9", 2), "a");
    EXPECT_EQ(FirstCharacters("a\xC3\xA9", 3), "a\xC3\xA9");
    EXPECT_EQ(FirstCharacters("a\xE9\xE9", 2), "a\xE9") << "an invalid byte is a character";
}

} // namespace

} // namespace deskplayer
