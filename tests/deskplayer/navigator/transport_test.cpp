#include "navigator/transport.h"

#include <gtest/gtest.h>

#include "parts.h"

namespace deskplayer
{

namespace
{

struct TransportParts : EventParts {
    using EventParts::EventParts;

    VirtualClock clock;
    PopUpMenu menu{playhead, state, sender};
    Announcer announcer{playhead, state, context, sender};
    Transport transport{clock, state, playhead, menu, announcer, sender};
};

TEST(Transport, PlaysWithoutCheckingPermission)
{
    TransportParts parts(ListOf({Forbidding(Item(2), {bd::UserOperationTimeSearch})}));
    parts.transport.Start();
    parts.Take();

    parts.transport.JumpTo(Second);

    EXPECT_EQ(parts.Take(), "A.JumpOccurred()\n"
                            "A.CurrentTimePosition(45000)\n");
}

TEST(Transport, ReturnsTheTimeLeftWhenPlaybackEnds)
{
    TransportParts parts(ListOf({Item(2)}));
    parts.transport.Start();

    EXPECT_EQ(parts.transport.Advance(5 * Second), 3 * Second);

    EXPECT_EQ(parts.clock.Now(), 2 * Second);
    EXPECT_EQ(parts.state.status, Status::Finished);
}

TEST(Transport, ClosesTheMenuBeforeItBecomesUnavailable)
{
    TransportParts parts(ListOf({RichItem(2), Item(2)}));
    parts.transport.Start();
    parts.menu.Open();
    parts.Take();

    parts.transport.Advance(2 * Second);

    const std::string received = parts.Take();
    EXPECT_EQ(received.substr(received.find("A.InteractiveGraphicsInvisible")),
              "A.InteractiveGraphicsInvisible()\n"
              "A.InteractiveGraphicsInactive()\n"
              "A.PopUpMenuUnavailable()\n");
    EXPECT_FALSE(parts.menu.IsOpen());
}

TEST(Transport, KeepsTheMenuOpenIfTheNextItemHasOne)
{
    TransportParts parts(ListOf({RichItem(2), RichItem(2)}));
    parts.transport.Start();
    parts.menu.Open();

    parts.transport.Advance(3 * Second);

    EXPECT_TRUE(parts.menu.IsOpen());
}

TEST(Transport, WaitsForAnOperationUnlessPlayingOrInATimedStill)
{
    TransportParts parts(ListOf({WithTimedStill(Item(1), 5)}));
    EXPECT_EQ(parts.transport.TimeToNextChange(), std::nullopt);

    parts.transport.Start();
    EXPECT_EQ(parts.transport.TimeToNextChange(), Second);

    parts.transport.Advance(3 * Second);
    EXPECT_EQ(parts.transport.TimeToNextChange(), 3 * Second);

    parts.state.status = Status::Paused;
    EXPECT_EQ(parts.transport.TimeToNextChange(), std::nullopt);
}

TEST(Transport, KeepsTheSelectionWhenItStartsAgain)
{
    TransportParts parts(ListOf({RichItem(2)}));
    parts.transport.Start();
    parts.state.selection.audio = 2;
    parts.state.pointA = Second;
    parts.transport.Stop();

    parts.transport.Start();

    EXPECT_EQ(parts.state.selection.audio, 2);
    EXPECT_EQ(parts.state.pointA, std::nullopt);
}

} // namespace

} // namespace deskplayer
