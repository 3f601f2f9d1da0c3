#include <gtest/gtest.h>

#include "bdmvnavigator/navigatorlisteneradapter.h"
#include "clientkit/names.h"
#include "kits/clientkit/everycallback.h"
#include "testkit/fakeplatform.h"
#include "testkit/operatornew.h"

namespace bdmv
{
namespace
{

/** The allocations of the calling thread while it executes an operation. */
template <typename Operation> std::size_t AllocationsOf(Operation operation)
{
    const std::size_t before = bdmvtest::CountAllocations();
    operation();
    return bdmvtest::CountAllocations() - before;
}

/** Copies, assigns, compares and delivers every callback. */
class UsingListener : public CallbackListener
{
public:
    int uses = 0;

private:
    void OnCallback(const Callback& callback) override
    {
        Callback copy(m_Button);
        copy = callback;
        Callback button(m_Button);
        Callback other(copy);
        other = button;
        button = copy;
        uses += button == copy && other != copy ? 1 : 0;
        Deliver(button, m_Client);
    }

    const Callback m_Button = callbacks::ExecuteButton{1, 2, bdmvtest::MakeProgram()};
    NavigatorListenerAdapter m_Client;
};

TEST(CallbackAllocation, HappensForNoCallback)
{
    UsingListener listener;
    IProgramData::RefPtr program = bdmvtest::MakeProgram();

    EXPECT_EQ(0U, AllocationsOf([&] { bdmvtest::CallEveryCallback(listener, program); }));

    EXPECT_EQ(Callback__sizeof, listener.uses);
}

TEST(CallbackAllocation, HappensForNoName)
{
    EXPECT_EQ(0U, AllocationsOf([] {
                  NameOf(CallbackPaused);
                  NameOf(bd::AudioChannelTypeOthers);
                  NamesOf<bd::AudioChannelType>();
              }));
}

} // namespace
} // namespace bdmv
