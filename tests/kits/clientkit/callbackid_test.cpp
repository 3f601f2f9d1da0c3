#include "clientkit/callbackid.h"

#include <gtest/gtest.h>

#include <iterator>
#include <map>
#include <string>

#include "bdmv/bdmvnavigator/virtualslot.h"
#include "bdmvnavigator/inavigatorlistener.h"

namespace bdmv
{
namespace
{

/** Where a callback is called. */
struct Slot {
    ListenerInterface interface;
    const char* name;
    long slot;
};

const Slot g_Slots[] = {
#define SLOT_OF_CALLBACK(interface, name)                                                          \
    {ListenerInterface##interface, #name,                                                          \
     bdmvtest::SlotOf(&INav##interface##Listener::name) - bdmvtest::DestructorSlots},
    BDMV_CALLBACKS(SLOT_OF_CALLBACK)
#undef SLOT_OF_CALLBACK
};

TEST(CallbackId, CountsAllCallbacks)
{
    EXPECT_EQ(56, Callback__sizeof);
}

TEST(CallbackId, HasFixedNumbers)
{
    EXPECT_EQ(0, CallbackPlayStarted);
    EXPECT_EQ(20, CallbackPreloadFailed);
    EXPECT_EQ(21, CallbackPlaylist);
    EXPECT_EQ(46, CallbackPipPgTextSelect);
    EXPECT_EQ(47, CallbackExecuteButton);
    EXPECT_EQ(48, CallbackInteractiveGraphicsVisible);
    EXPECT_EQ(55, CallbackInteractiveGraphicsInactive);
}

TEST(CallbackId, CountsTheSlotsOfOneInterfaceAfterTheOther)
{
    ASSERT_EQ(std::size_t{Callback__sizeof}, std::size(g_Slots));
    long first = 0;
    for (long id = 0; id < Callback__sizeof; ++id) {
        const Slot& slot = g_Slots[id];
        if (id > 0 && slot.interface != g_Slots[id - 1].interface) {
            EXPECT_EQ(g_Slots[id - 1].interface + 1, slot.interface) << slot.name;
            first = id;
        }
        EXPECT_EQ(id - first, slot.slot) << slot.name;
    }
}

TEST(CallbackId, IsNamedAsTheCallbackIsDeclared)
{
    for (int id = 0; id < Callback__sizeof; ++id) {
        EXPECT_STREQ(g_Slots[id].name, NameOf(static_cast<CallbackId>(id)));
    }
    EXPECT_STREQ("PipPgTextStInfo", NameOf(CallbackPipPgTextStInfo));
}

TEST(CallbackId, IsUnknownOutsideTheCallbacks)
{
    EXPECT_STREQ("unknown", NameOf(Callback__sizeof));
    EXPECT_STREQ("unknown", NameOf(static_cast<CallbackId>(-1)));
}

TEST(CallbackId, BelongsToTheInterfaceThatDeclaresIt)
{
    std::map<ListenerInterface, int> counts;
    for (int id = 0; id < Callback__sizeof; ++id) {
        ++counts[InterfaceOf(static_cast<CallbackId>(id))];
        EXPECT_EQ(g_Slots[id].interface, InterfaceOf(static_cast<CallbackId>(id)));
    }
    EXPECT_EQ((std::map<ListenerInterface, int>{{ListenerInterfaceControl, 21},
                                                {ListenerInterfaceSettings, 26},
                                                {ListenerInterfaceButton, 1},
                                                {ListenerInterfaceInteractive, 8}}),
              counts);
}

TEST(CallbackId, OutsideTheCallbacksBelongsToNoInterface)
{
    EXPECT_EQ(InterfaceOf(Callback__sizeof), ListenerInterface__sizeof);
    EXPECT_EQ(InterfaceOf(static_cast<CallbackId>(-1)), ListenerInterface__sizeof);
}

TEST(ListenerInterface, HasAName)
{
    EXPECT_STREQ("control", NameOf(ListenerInterfaceControl));
    EXPECT_STREQ("settings", NameOf(ListenerInterfaceSettings));
    EXPECT_STREQ("button", NameOf(ListenerInterfaceButton));
    EXPECT_STREQ("interactive", NameOf(ListenerInterfaceInteractive));
}

TEST(ListenerInterface, IsUnknownOutsideTheInterfaces)
{
    EXPECT_STREQ("unknown", NameOf(ListenerInterface__sizeof));
    EXPECT_STREQ("unknown", NameOf(static_cast<ListenerInterface>(-1)));
}

} // namespace
} // namespace bdmv
