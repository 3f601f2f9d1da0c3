#include "output/callbacks.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "everycallback.h"

namespace deskplayer
{
namespace
{

TEST(Callbacks, AreInOrderOfDeclaration)
{
    CollectingListener listener;
    CallEveryCallback(listener);

    ASSERT_EQ(listener.callbacks.size(), AllCallbacks.size());
    for (std::size_t i = 0; i < AllCallbacks.size(); ++i) {
        EXPECT_EQ(listener.callbacks[i].id, static_cast<CallbackId>(i)) << AllCallbacks[i].name;
    }
}

TEST(Callbacks, NameTheInterfaceThatDeclaresThem)
{
    const auto count = [](ListenerInterface interface) {
        return std::count_if(
            AllCallbacks.begin(), AllCallbacks.end(),
            [interface](const CallbackInfo& info) { return info.interface == interface; });
    };

    EXPECT_EQ(count(ListenerInterface::Control), 21);
    EXPECT_EQ(count(ListenerInterface::Settings), 26);
    EXPECT_EQ(count(ListenerInterface::Button), 1);
    EXPECT_EQ(count(ListenerInterface::Interactive), 8);
    EXPECT_EQ(InfoOf(CallbackId::PreloadFailed).interface, ListenerInterface::Control);
    EXPECT_EQ(InfoOf(CallbackId::Playlist).interface, ListenerInterface::Settings);
    EXPECT_EQ(InfoOf(CallbackId::ExecuteButton).interface, ListenerInterface::Button);
    EXPECT_EQ(InfoOf(CallbackId::InteractiveGraphicsVisible).interface,
              ListenerInterface::Interactive);
}

TEST(Callbacks, AreNamedAsTheyAreDeclared)
{
    EXPECT_EQ(InfoOf(CallbackId::PipPgTextStInfo).name, "PipPgTextStInfo");
}

} // namespace
} // namespace deskplayer
