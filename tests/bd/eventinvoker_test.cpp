#include <gtest/gtest.h>

#include <array>
#include <cstddef>
#include <cstring>
#include <vector>

#include "bd/eventlistenerlist.h"
#include "probe.h"

using bdmvtest::CountedValue;
using bdmvtest::IProbe;
using bdmvtest::Probe;

namespace
{

class EventInvoker : public testing::Test
{
protected:
    bdmvtest::Journal journal;
    Probe a{journal, "A"};
    Probe b{journal, "B"};
};

/** Takes integers of a size that leaves no padding in an invoker. */
class IWide
{
public:
    virtual void Wide0() = 0;
    virtual void Wide1(std::size_t a) = 0;
    virtual void Wide2(std::size_t a, std::size_t b) = 0;
    virtual void Wide3(std::size_t a, std::size_t b, std::size_t c) = 0;
    virtual void Wide4(std::size_t a, std::size_t b, std::size_t c, std::size_t d) = 0;

protected:
    ~IWide() = default;
};

/** Whether the invoker consists of these arguments, then the method, and nothing else. */
template <typename Invoker, typename... Arguments>
bool Consists(const Invoker& invoker, typename Invoker::MethodPointer method,
              Arguments... arguments)
{
    const std::array<std::size_t, sizeof...(Arguments)> expected = {arguments...};
    const std::size_t size = sizeof...(Arguments) * sizeof(std::size_t);
    const char* const bytes = reinterpret_cast<const char*>(&invoker);
    return sizeof(invoker) == size + sizeof(method) &&
           (size == 0 || std::memcmp(bytes, expected.data(), size) == 0) &&
           std::memcmp(bytes + size, &method, sizeof(method)) == 0;
}

} // namespace

TEST_F(EventInvoker, WithoutArgumentsCallsTheMethodOnce)
{
    bd::EventInvokerParam0<IProbe> invoker(&IProbe::Call0);
    invoker.Fire(a);

    EXPECT_EQ("A.Call0()\n", journal.Take());
}

TEST_F(EventInvoker, WithOneArgumentCallsTheMethodOnce)
{
    bd::EventInvokerParam1<IProbe, int> invoker(&IProbe::Call1, 1);
    invoker.Fire(a);

    EXPECT_EQ("A.Call1(1)\n", journal.Take());
}

TEST_F(EventInvoker, WithTwoArgumentsKeepsTheirOrder)
{
    bd::EventInvokerParam2<IProbe, int, int> invoker(&IProbe::Call2, 1, 2);
    invoker.Fire(a);

    EXPECT_EQ("A.Call2(1, 2)\n", journal.Take());
}

TEST_F(EventInvoker, WithThreeArgumentsKeepsTheirOrder)
{
    bd::EventInvokerParam3<IProbe, int, int, int> invoker(&IProbe::Call3, 1, 2, 3);
    invoker.Fire(a);

    EXPECT_EQ("A.Call3(1, 2, 3)\n", journal.Take());
}

TEST_F(EventInvoker, WithFourArgumentsKeepsTheirOrder)
{
    bd::EventInvokerParam4<IProbe, int, int, int, int> invoker(&IProbe::Call4, 1, 2, 3, 4);
    invoker.Fire(a);

    EXPECT_EQ("A.Call4(1, 2, 3, 4)\n", journal.Take());
}

TEST_F(EventInvoker, CallsTheListenerItIsGiven)
{
    bd::EventInvokerParam1<IProbe, int> invoker(&IProbe::Call1, 1);
    invoker.Fire(b);
    invoker.Fire(a);

    EXPECT_EQ("B.Call1(1)\nA.Call1(1)\n", journal.Take());
}

TEST_F(EventInvoker, HoldsTheValueGivenAtConstruction)
{
    int number = 1;
    bd::EventInvokerParam1<IProbe, int> invoker(&IProbe::Call1, number);
    number = 2;
    invoker.Fire(a);

    EXPECT_EQ("A.Call1(1)\n", journal.Take());
}

TEST_F(EventInvoker, HoldsAReferenceToTheCallersObject)
{
    int number = 1;
    bd::EventInvokerParam1<IProbe, int&> invoker(&IProbe::Refer1, number);
    number = 2;
    invoker.Fire(a);

    EXPECT_EQ("A.Refer1(2)\n", journal.Take());
    EXPECT_EQ(std::vector<const int*>{&number}, a.referents);
}

TEST_F(EventInvoker, CopiesAValueOnceAtConstruction)
{
    const CountedValue value(1);
    CountedValue::copies = 0;
    const bd::EventInvokerParam1<IProbe, CountedValue> invoker(&IProbe::Copy1, value);

    EXPECT_EQ(1, CountedValue::copies);
}

TEST_F(EventInvoker, CopiesAValueOncePerCall)
{
    const CountedValue value(1);
    bd::EventInvokerParam1<IProbe, CountedValue> invoker(&IProbe::Copy1, value);
    CountedValue::copies = 0;
    invoker.Fire(a);
    EXPECT_EQ(1, CountedValue::copies);
    invoker.Fire(b);
    EXPECT_EQ(2, CountedValue::copies);
}

TEST_F(EventInvoker, TakesAConstValueLikeAValue)
{
    CountedValue::copies = 0;
    bd::EventInvokerParam1<IProbe, const CountedValue> invoker(&IProbe::CopyConst, CountedValue(1));
    invoker.Fire(a);

    EXPECT_EQ("A.CopyConst(1)\n", journal.Take());
    EXPECT_EQ(2, CountedValue::copies);
}

TEST_F(EventInvoker, HoldsItsArgumentsInOrderThenTheMethod)
{
    typedef std::size_t Size;

    EXPECT_TRUE(Consists(bd::EventInvokerParam0<IWide>(&IWide::Wide0), &IWide::Wide0));
    EXPECT_TRUE(
        Consists(bd::EventInvokerParam1<IWide, Size>(&IWide::Wide1, 1), &IWide::Wide1, Size(1)));
    EXPECT_TRUE(Consists(bd::EventInvokerParam2<IWide, Size, Size>(&IWide::Wide2, 1, 2),
                         &IWide::Wide2, Size(1), Size(2)));
    EXPECT_TRUE(Consists(bd::EventInvokerParam3<IWide, Size, Size, Size>(&IWide::Wide3, 1, 2, 3),
                         &IWide::Wide3, Size(1), Size(2), Size(3)));
    EXPECT_TRUE(
        Consists(bd::EventInvokerParam4<IWide, Size, Size, Size, Size>(&IWide::Wide4, 1, 2, 3, 4),
                 &IWide::Wide4, Size(1), Size(2), Size(3), Size(4)));
}
