#include "fieldlog/prefixpattern.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>

namespace deskplayer
{

namespace
{

std::string ErrorOf(const std::string& pattern)
{
    try {
        PrefixPattern{pattern};
    } catch (const std::invalid_argument& error) {
        return error.what();
    }
    return "";
}

TEST(PrefixPattern, FindsItsPlaces)
{
    const auto line = PrefixPattern("[{time}] {any} {component}/{level}: {text}")
                          .Read("[  90.500000] player(1): BdmvNavigator/Event: Sending Paused");

    ASSERT_TRUE(line);
    EXPECT_EQ(line->time.microseconds, 90500000);
    EXPECT_EQ(line->component, "BdmvNavigator");
    EXPECT_EQ(line->level, "Event");
    EXPECT_EQ(line->text, "Sending Paused");
}

TEST(PrefixPattern, TakesABlankForOneOrMore)
{
    const PrefixPattern pattern("{time} {any} {text}");

    EXPECT_EQ(pattern.Read("05-31 20:15:00.123   1234 Sending Paused")->text, "Sending Paused");
    EXPECT_FALSE(pattern.Read("05-31 20:15:00.123"));
    EXPECT_FALSE(pattern.Read("05-31 20:15:00.123 1234"));
}

TEST(PrefixPattern, MayHaveBraces)
{
    EXPECT_EQ(PrefixPattern("{{{time}}{text}").Read("{1}x")->text, "x");
}

TEST(PrefixPattern, RefusesOtherLines)
{
    const PrefixPattern pattern("[{time}] {text}");

    EXPECT_FALSE(pattern.Read(""));
    EXPECT_FALSE(pattern.Read("(1) x"));
    EXPECT_FALSE(pattern.Read("[x] x"));
    EXPECT_FALSE(pattern.Read("[1]x"));
}

TEST(PrefixPattern, SaysWhatIsWrongWithIt)
{
    EXPECT_EQ(ErrorOf(""), "'{time}' is missing");
    EXPECT_EQ(ErrorOf("{text}"), "'{time}' is missing");
    EXPECT_EQ(ErrorOf("{time} "), "'{text}' must be at the end");
    EXPECT_EQ(ErrorOf("{time} {text}."), "'{text}' must be at the end");
    EXPECT_EQ(ErrorOf("{time"), "'{' without '}'; '{{' stands for a brace");
    EXPECT_EQ(ErrorOf("{time} {time} {text}"), "'{time}' is there twice");
    EXPECT_EQ(ErrorOf("{time} {any}{text}"), "nothing separates '{text}' from what is before it");
    EXPECT_EQ(ErrorOf("{time} {levl} {text}"),
              "'levl' is not a place in a log line; did you mean level?");
    EXPECT_EQ(ErrorOf("{time} {any} {any} {text}"), "");
}

} // namespace

} // namespace deskplayer
