#include "navigator/permission.h"

#include <gtest/gtest.h>

#include "database/uomasktable.h"
#include "parts.h"
#include "text/names.h"

namespace deskplayer
{

namespace
{

PlayList ForbiddingList()
{
    PlayList list =
        ListOf({Forbidding(Item(10), {bd::UserOperationStop, bd::UserOperationPauseOn})});
    list.applicationInfo.uoMask = MaskOf({bd::UserOperationStop, bd::UserOperationTimeSearch});
    return list;
}

class PermissionWhilePlaying : public testing::Test
{
protected:
    PermissionWhilePlaying() { parts.state.status = Status::Playing; }

    StateParts parts{ForbiddingList()};
    const Permission permission{parts.playhead, parts.state};
};

TEST_F(PermissionWhilePlaying, IsGivenIfNothingForbidsTheOperation)
{
    EXPECT_TRUE(permission.CheckMask(bd::UserOperationChapterSearch).IsDone());
}

TEST_F(PermissionWhilePlaying, NamesThePlayListOrItemThatForbidsAnOperation)
{
    EXPECT_EQ(permission.CheckMask(bd::UserOperationTimeSearch).Reason(),
              "TimeSearch is forbidden by play list 7");
    EXPECT_EQ(permission.CheckMask(bd::UserOperationPauseOn).Reason(),
              "PauseOn is forbidden by play item 0");
    EXPECT_EQ(permission.CheckMask(bd::UserOperationStop).Reason(),
              "Stop is forbidden by play list 7 and its play item 0");
}

TEST_F(PermissionWhilePlaying, NamesTheOverrideThatForbidsEveryOperation)
{
    g_u1Bduopmask = 2;
    for (const auto operation : {bd::UserOperationTimeSearch, bd::UserOperationPauseOn,
                                 bd::UserOperationStop, bd::UserOperationChapterSearch}) {
        EXPECT_EQ(permission.CheckMask(operation).Reason(),
                  NameOrNumber(operation) + " is forbidden by the debug override KEVRO_UOPMASK=2");
    }
    g_u1Bduopmask = 1;
    EXPECT_TRUE(permission.CheckMask(bd::UserOperationStop).IsDone());
    g_u1Bduopmask = 0;
}

TEST_F(PermissionWhilePlaying, IsGivenWhileNothingPlays)
{
    for (const Status status : {Status::Stopped, Status::Standby, Status::Finished}) {
        parts.state.status = status;
        EXPECT_TRUE(permission.CheckMask(bd::UserOperationStop).IsDone());
    }
    for (const Status status : {Status::Paused, Status::Still, Status::Suspended}) {
        parts.state.status = status;
        EXPECT_FALSE(permission.CheckMask(bd::UserOperationStop).IsDone());
    }
}

TEST_F(PermissionWhilePlaying, DependsOnTheStatus)
{
    EXPECT_TRUE(permission.CheckStatus({Status::Playing}).IsDone());
    EXPECT_TRUE(permission.CheckStatus({Status::Paused, Status::Playing}).IsDone());
    EXPECT_EQ(permission.CheckStatus({Status::Paused, Status::Still}).Reason(),
              "not paused or in a still, but playing");
}

TEST_F(PermissionWhilePlaying, IsActiveWhileAPictureIsShown)
{
    for (const Status status : {Status::Playing, Status::Paused, Status::Still}) {
        parts.state.status = status;
        EXPECT_TRUE(permission.CheckActive().IsDone());
    }
    for (const Status status :
         {Status::Stopped, Status::Suspended, Status::Standby, Status::Finished}) {
        parts.state.status = status;
        EXPECT_FALSE(permission.CheckActive().IsDone());
    }
}

} // namespace

} // namespace deskplayer
