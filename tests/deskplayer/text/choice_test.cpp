#include "text/choice.h"

#include <gtest/gtest.h>

#include <stdexcept>

namespace deskplayer
{

namespace
{

std::string ErrorOf(std::string_view word)
{
    try {
        FindChoice(word, "a callback", {"PlayItem", "PlayMode", "Paused", "UOMask"});
    } catch (const std::invalid_argument& error) {
        return error.what();
    }
    ADD_FAILURE() << "nothing was thrown";
    return "";
}

TEST(FindChoice, SuggestsASimilarChoice)
{
    EXPECT_EQ(ErrorOf("playitem"), "'playitem' is not a callback; did you mean PlayItem?");
    EXPECT_EQ(ErrorOf("PlayModes"), "'PlayModes' is not a callback; did you mean PlayMode?");
    EXPECT_EQ(ErrorOf("PlyItm"), "'PlyItm' is not a callback; expected PlayItem, PlayMode, Paused "
                                 "or UOMask");
    EXPECT_EQ(ErrorOf("PlyItem"), "'PlyItem' is not a callback; did you mean PlayItem?");
    EXPECT_EQ(ErrorOf("Paysed"), "'Paysed' is not a callback; did you mean Paused?");
}

TEST(FindChoice, ListsAllChoicesIfNoneIsSimilar)
{
    for (const std::string word : {"", "P", "xml", "Stopped"}) {
        EXPECT_EQ(ErrorOf(word),
                  "'" + word +
                      "' is not a callback; expected PlayItem, PlayMode, Paused or UOMask");
    }
    EXPECT_EQ(ErrorOf(std::string(1000000, 'P')).find("did you mean"), std::string::npos);
}

} // namespace

} // namespace deskplayer
