#include "navigator/transport.h"

#include <gtest/gtest.h>

#include "rooms.h"

namespace deskplayer
{

namespace
{

struct TransportRooms : EventRooms {
    using EventRooms::EventRooms;

    VirtualClock clock;
    PopUpMenu menu{playhead, state, sender};
    Announcer announcer{playhead, state, context, sender};
    Transport transport{clock, state, playhead, menu, announcer, sender};
};

TEST(Transport, PlaysWithoutAskingForPermission)
{
    TransportRooms rooms(ListOf({Forbidding(Item(2), {bd::UserOperationTimeSearch})}));
    rooms.transport.Start();
    rooms.Take();

    rooms.transport.JumpTo(Second);

    EXPECT_EQ(rooms.Take(), "A.JumpOccurred()\n"
                            "A.CurrentTimePosition(45000)\n");
}

TEST(Transport, ReturnsTheTimeThatIsLeftWhenPlaybackEnds)
{
    TransportRooms rooms(ListOf({Item(2)}));
    rooms.transport.Start();

    EXPECT_EQ(rooms.transport.Advance(5 * Second), 3 * Second);

    EXPECT_EQ(rooms.clock.Now(), 2 * Second);
    EXPECT_EQ(rooms.state.status, Status::Finished);
}

TEST(Transport, ClosesTheMenuBeforeItBecomesUnavailable)
{
    TransportRooms rooms(ListOf({RichItem(2), Item(2)}));
    rooms.transport.Start();
    rooms.menu.Open();
    rooms.Take();

    rooms.transport.Advance(2 * Second);

    const std::string heard = rooms.Take();
    EXPECT_EQ(heard.substr(heard.find("A.InteractiveGraphicsInvisible")),
              "A.InteractiveGraphicsInvisible()\n"
              "A.InteractiveGraphicsInactive()\n"
              "A.PopUpMenuUnavailable()\n");
    EXPECT_FALSE(rooms.menu.IsOpen());
}

TEST(Transport, KeepsTheMenuOpenWhereTheNextItemHasOne)
{
    TransportRooms rooms(ListOf({RichItem(2), RichItem(2)}));
    rooms.transport.Start();
    rooms.menu.Open();

    rooms.transport.Advance(3 * Second);

    EXPECT_TRUE(rooms.menu.IsOpen());
}

TEST(Transport, WaitsForAnOperationUnlessItPlaysOrATimedStillLasts)
{
    TransportRooms rooms(ListOf({WithTimedStill(Item(1), 5)}));
    EXPECT_EQ(rooms.transport.TimeToNextChange(), std::nullopt);

    rooms.transport.Start();
    EXPECT_EQ(rooms.transport.TimeToNextChange(), Second);

    rooms.transport.Advance(3 * Second);
    EXPECT_EQ(rooms.transport.TimeToNextChange(), 3 * Second);

    rooms.state.status = Status::Paused;
    EXPECT_EQ(rooms.transport.TimeToNextChange(), std::nullopt);
}

TEST(Transport, KeepsTheSelectionWhenItStartsAgain)
{
    TransportRooms rooms(ListOf({RichItem(2)}));
    rooms.transport.Start();
    rooms.state.selection.audio = 2;
    rooms.state.pointA = Second;
    rooms.transport.Stop();

    rooms.transport.Start();

    EXPECT_EQ(rooms.state.selection.audio, 2);
    EXPECT_EQ(rooms.state.pointA, std::nullopt);
}

} // namespace

} // namespace deskplayer
