#include "clientkit/callback.h"

#include <cstdint>
#include <cstring>

namespace bdmv
{

namespace
{

/** The arguments of a callback as numbers, equal if and only if the arguments are. */
class ArgumentNumbers
{
public:
    explicit ArgumentNumbers(const Callback& callback) : m_Numbers(), m_Count(0)
    {
        callback.VisitArguments(*this);
    }

    template <typename Number> void operator()(const char* /*name*/, const Number& value)
    {
        Add(static_cast<bd::UInt64>(value));
    }

    void operator()(const char* /*name*/, const bd::ZoomRectangleDef& value) { AddBytes(value); }

    // The stored mask: the reported one depends on a debug setting.
    void operator()(const char* /*name*/, const UOMaskTable& value) { AddBytes(value); }

    void operator()(const char* /*name*/, const Bytes& value) { AddAddress(value.data); }

    void operator()(const char* /*name*/, const IProgramData::RefPtr& value)
    {
        AddAddress(value.Get());
    }

    bool operator==(const ArgumentNumbers& other) const
    {
        return std::memcmp(m_Numbers, other.m_Numbers, sizeof m_Numbers) == 0;
    }

private:
    void Add(bd::UInt64 number) { m_Numbers[m_Count++] = number; }

    void AddAddress(const void* address) { Add(reinterpret_cast<std::uintptr_t>(address)); }

    template <typename Value> void AddBytes(const Value& value)
    {
        static_assert(sizeof value == sizeof(bd::UInt64), "fills a number");
        bd::UInt64 number = 0;
        std::memcpy(&number, &value, sizeof value);
        Add(number);
    }

    bd::UInt64 m_Numbers[7]; ///< as many as callbacks::AudioInfoChanged has
    std::size_t m_Count;
};

/** Calls a callback of any type. */
struct Delivery {
    INavigatorListener& listener;

    template <typename Arguments> void operator()(const Arguments& arguments)
    {
        arguments.CallOn(listener);
    }
};

} // namespace

Callback::Callback(const Callback& other) : m_Id(other.m_Id), m_Arguments()
{
    Copy(other);
}

Callback& Callback::operator=(const Callback& other)
{
    if (this != &other) {
        // Releases a program last, because its destructor may destroy other.
        const Callback former(*this);
        Destroy();
        m_Id = other.m_Id;
        Copy(other);
    }
    return *this;
}

Callback::~Callback()
{
    Destroy();
}

// Only a program is more than its bytes.

void Callback::Copy(const Callback& other)
{
    if (const auto* const button = other.As<callbacks::ExecuteButton>()) {
        new (m_Arguments) callbacks::ExecuteButton(*button);
    } else {
        std::memcpy(m_Arguments, other.m_Arguments, sizeof m_Arguments);
    }
}

void Callback::Destroy()
{
    if (m_Id == CallbackExecuteButton) {
        Get<callbacks::ExecuteButton>().~ExecuteButton();
    }
}

bool operator==(const Callback& left, const Callback& right)
{
    return left.Id() == right.Id() && ArgumentNumbers(left) == ArgumentNumbers(right);
}

void Deliver(const Callback& callback, INavigatorListener& listener)
{
    callback.Visit(Delivery{listener});
}

} // namespace bdmv
