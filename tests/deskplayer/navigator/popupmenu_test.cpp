#include "navigator/popupmenu.h"

#include <gtest/gtest.h>

#include "parts.h"

namespace deskplayer
{

namespace
{

class MenuOfThreeChapters : public testing::Test
{
protected:
    // The mark outside its play item uses up chapter number 2 and has no button.
    EventParts parts{ListOf({RichItem(10)}, {Entry(0, Ticks(0)), Entry(0, 60 * Second),
                                             Entry(0, 5 * Second), Entry(0, 8 * Second)})};
    PopUpMenu menu{parts.playhead, parts.state, parts.sender};
};

TEST_F(MenuOfThreeChapters, OpensWithTheButtonOfTheCurrentChapter)
{
    parts.state.position = 6 * Second;

    menu.Open();

    EXPECT_TRUE(menu.IsOpen());
    EXPECT_EQ(menu.SelectedButton(), 2);
    EXPECT_EQ(parts.Take(), "A.InteractiveGraphicsActive()\n"
                            "A.InteractiveGraphicsVisible()\n");
}

TEST_F(MenuOfThreeChapters, HasAButtonForEachChapter)
{
    EXPECT_EQ(menu.NumberOfButtons(), 3U);
}

TEST_F(MenuOfThreeChapters, ClosesOnce)
{
    menu.Open();
    parts.Take();

    menu.Close();
    menu.Close();

    EXPECT_FALSE(menu.IsOpen());
    EXPECT_EQ(parts.Take(), "A.InteractiveGraphicsInvisible()\n"
                            "A.InteractiveGraphicsInactive()\n");
}

TEST_F(MenuOfThreeChapters, PassesOnTheProgramAndReturnsTheChapter)
{
    menu.Open();
    menu.Select(3);
    parts.Take();

    const Chapter& chapter = menu.ExecuteSelectedButton();

    EXPECT_EQ(chapter.number, 4U);
    EXPECT_FALSE(parts.state.button.program) << "released after it was passed on";
    const std::string received = parts.Take();
    EXPECT_EQ(received.substr(0, received.find('(')), "A.ButtonActivationBusy");
    EXPECT_NE(received.find("A.ExecuteButton(1, 3, "), std::string::npos);
    EXPECT_EQ(received.substr(received.find("A.ButtonActivationDone")),
              "A.ButtonActivationDone()\n"
              "A.InteractiveGraphicsInvisible()\n"
              "A.InteractiveGraphicsInactive()\n");
    EXPECT_EQ(parts.state.position, Ticks(0)) << "the caller performs the jump";
}

TEST(PopUpMenu, SelectsTheFirstButtonBeforeTheFirstChapter)
{
    EventParts parts(ListOf({RichItem(10)}, {Entry(0, 5 * Second)}));
    PopUpMenu menu(parts.playhead, parts.state, parts.sender);

    menu.Open();

    EXPECT_EQ(menu.SelectedButton(), 1);
}

} // namespace

} // namespace deskplayer
