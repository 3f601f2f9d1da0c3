#include "output/outputfilter.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>

#include "text/names.h"

namespace deskplayer
{
namespace
{

std::size_t CountPassing(const OutputFilter& filter)
{
    std::size_t count = 0;
    for (int id = 0; id < bdmv::Callback__sizeof; ++id) {
        count += filter.Passes(static_cast<bdmv::CallbackId>(id)) ? 1 : 0;
    }
    return count;
}

template <typename Operation> std::string MessageOf(Operation operation)
{
    try {
        operation();
    } catch (const std::invalid_argument& error) {
        return error.what();
    }
    return "no error";
}

TEST(OutputFilter, PassesEverythingAtFirst)
{
    EXPECT_EQ(CountPassing(OutputFilter()), std::size_t{bdmv::Callback__sizeof});
}

TEST(OutputFilter, KeepsTheCallbacksOfInterfaces)
{
    OutputFilter filter;
    filter.KeepInterfaces("interactive,button");

    EXPECT_EQ(CountPassing(filter), 9U);
    EXPECT_TRUE(filter.Passes(bdmv::CallbackExecuteButton));
    EXPECT_TRUE(filter.Passes(bdmv::CallbackInteractiveGraphicsInactive));
    EXPECT_FALSE(filter.Passes(bdmv::CallbackPlayStarted));
    EXPECT_FALSE(filter.Passes(bdmv::CallbackAudioInfo));
}

TEST(OutputFilter, KeepsCallbacksByName)
{
    OutputFilter filter;
    filter.KeepCallbacks("PlayItem,AudioInfo");

    EXPECT_EQ(CountPassing(filter), 2U);
    EXPECT_TRUE(filter.Passes(bdmv::CallbackPlayItem));
    EXPECT_TRUE(filter.Passes(bdmv::CallbackAudioInfo));
}

TEST(OutputFilter, AcceptsANameTwice)
{
    OutputFilter filter;
    filter.KeepCallbacks("PlayItem,PlayItem");

    EXPECT_EQ(CountPassing(filter), 1U);
}

TEST(OutputFilter, NarrowsWithEveryOperation)
{
    OutputFilter filter;
    filter.KeepInterfaces("control");
    filter.KeepCallbacks("Paused,PlayItem");

    EXPECT_EQ(CountPassing(filter), 1U);
    EXPECT_TRUE(filter.Passes(bdmv::CallbackPaused));

    filter.KeepInterfaces("settings");
    EXPECT_EQ(CountPassing(filter), 0U);
}

TEST(OutputFilter, NamesAnUnknownInterfaceAndAllInterfaces)
{
    OutputFilter filter;

    EXPECT_EQ(MessageOf([&] { filter.KeepInterfaces("control,remote"); }),
              "'remote' is not a listener interface; expected control, settings, button or "
              "interactive");
}

TEST(OutputFilter, NamesAnUnknownCallbackAndAllCallbacks)
{
    OutputFilter filter;
    const std::string message = MessageOf([&] { filter.KeepCallbacks("PlayItem,Picture"); });

    EXPECT_EQ(message.rfind("'Picture' is not a callback; expected PlayStarted, ", 0), 0U)
        << message;
    for (const std::string_view name : CallbackNames()) {
        EXPECT_NE(message.find(' ' + std::string(name)), std::string::npos) << name;
    }
}

TEST(OutputFilter, RefusesEmptyWords)
{
    for (const char* list : {"", ",control", "control,", "control,,button"}) {
        OutputFilter filter;
        EXPECT_EQ(MessageOf([&] { filter.KeepInterfaces(list); }).rfind("'' is not a", 0), 0U)
            << list;
    }
}

TEST(OutputFilter, IsUnchangedIfAWordIsInvalid)
{
    OutputFilter filter;
    EXPECT_THROW(filter.KeepCallbacks("Paused,?"), std::invalid_argument);

    EXPECT_EQ(CountPassing(filter), std::size_t{bdmv::Callback__sizeof});
}

TEST(OutputFilter, MakesWordsInMessagesPrintable)
{
    OutputFilter filter;

    EXPECT_EQ(
        MessageOf([&] { filter.KeepInterfaces("\033[31m"); }).rfind("'\\x1B[31m' is not a", 0), 0U);
}

} // namespace
} // namespace deskplayer
