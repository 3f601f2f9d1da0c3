#include "navigator/popupmenu.h"

#include <gtest/gtest.h>

#include "rooms.h"

namespace deskplayer
{

namespace
{

class MenuOfThreeChapters : public testing::Test
{
protected:
    // The mark outside of its play item takes chapter number 2, and has no button.
    EventRooms rooms{ListOf({RichItem(10)}, {Entry(0, Ticks(0)), Entry(0, 60 * Second),
                                             Entry(0, 5 * Second), Entry(0, 8 * Second)})};
    PopUpMenu menu{rooms.playhead, rooms.state, rooms.sender};
};

TEST_F(MenuOfThreeChapters, OpensWithTheButtonOfTheCurrentChapter)
{
    rooms.state.position = 6 * Second;

    menu.Open();

    EXPECT_TRUE(menu.IsOpen());
    EXPECT_EQ(menu.SelectedButton(), 2);
    EXPECT_EQ(rooms.Take(), "A.InteractiveGraphicsActive()\n"
                            "A.InteractiveGraphicsVisible()\n");
}

TEST_F(MenuOfThreeChapters, HasAButtonForEachChapter)
{
    EXPECT_EQ(menu.NumberOfButtons(), 3U);
}

TEST_F(MenuOfThreeChapters, ClosesOnce)
{
    menu.Open();
    rooms.Take();

    menu.Close();
    menu.Close();

    EXPECT_FALSE(menu.IsOpen());
    EXPECT_EQ(rooms.Take(), "A.InteractiveGraphicsInvisible()\n"
                            "A.InteractiveGraphicsInactive()\n");
}

TEST_F(MenuOfThreeChapters, HandsOverTheProgramAndReturnsTheChapter)
{
    menu.Open();
    menu.Select(3);
    rooms.Take();

    const Chapter& chapter = menu.ExecuteSelectedButton();

    EXPECT_EQ(chapter.number, 4U);
    EXPECT_FALSE(rooms.state.button.program) << "released once it was handed over";
    const std::string heard = rooms.Take();
    EXPECT_EQ(heard.substr(0, heard.find('(')), "A.ButtonActivationBusy");
    EXPECT_NE(heard.find("A.ExecuteButton(1, 3, "), std::string::npos);
    EXPECT_EQ(heard.substr(heard.find("A.ButtonActivationDone")),
              "A.ButtonActivationDone()\n"
              "A.InteractiveGraphicsInvisible()\n"
              "A.InteractiveGraphicsInactive()\n");
    EXPECT_EQ(rooms.state.position, Ticks(0)) << "the jump is its caller's";
}

TEST(Menu, SelectsTheFirstButtonBeforeTheFirstChapter)
{
    EventRooms rooms(ListOf({RichItem(10)}, {Entry(0, 5 * Second)}));
    PopUpMenu menu(rooms.playhead, rooms.state, rooms.sender);

    menu.Open();

    EXPECT_EQ(menu.SelectedButton(), 1);
}

} // namespace

} // namespace deskplayer
