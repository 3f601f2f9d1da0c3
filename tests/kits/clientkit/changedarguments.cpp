#include "kits/clientkit/changedarguments.h"

#include <cstdint>
#include <cstring>
#include <type_traits>

#include "kits/clientkit/everycallback.h"

namespace bdmvtest
{

namespace
{

/**
 * Passes every number among the arguments of a callback to a function, and stores the result. The
 * members of a rectangle, a mask, an address and the choice of a program are numbers.
 */
class NumberChanger
{
public:
    typedef std::function<bd::UInt64(const char* name, bd::UInt64 number, int bits)> Change;

    explicit NumberChanger(Change change) : m_Change(std::move(change)) {}

    void operator()(const char* name, bool& value) { value = (m_Change(name, value, 1) & 1) != 0; }

    template <typename Number> void operator()(const char* name, Number& value)
    {
        value = static_cast<Number>(
            m_Change(name, static_cast<bd::UInt64>(value), 8 * int{sizeof value}));
    }

    void operator()(const char* name, bd::ZoomRectangleDef& value)
    {
        (*this)(name, value.X);
        (*this)(name, value.Y);
        (*this)(name, value.Width);
        (*this)(name, value.Height);
    }

    void operator()(const char* name, bdmv::UOMaskTable& value)
    {
        bd::UInt64 stored = 0;
        std::memcpy(&stored, &value, sizeof value);
        value = bdmv::UOMaskTable(m_Change(name, stored, 64));
    }

    void operator()(const char* name, bdmv::IProgramData::RefPtr& value)
    {
        if (m_Change(name, 0, 1) != 0) {
            value = MakeProgram();
        }
    }

    // The address is a member of callbacks::SystemSuspended: see ChangeAddress().
    void operator()(const char* /*name*/, const bdmv::Bytes& /*value*/) {}

    template <typename Arguments> void ChangeAddress(Arguments& /*arguments*/) {}

    void ChangeAddress(bdmv::callbacks::SystemSuspended& arguments)
    {
        auto address = reinterpret_cast<std::uintptr_t>(arguments.data);
        (*this)("data", address);
        std::memcpy(&arguments.data, &address, sizeof address);
    }

private:
    Change m_Change;
};

bdmv::Callback Changed(const bdmv::Callback& callback, const NumberChanger::Change& change)
{
    bdmv::Callback result(callback);
    NumberChanger changer(change);
    callback.Visit([&](const auto& arguments) {
        auto changed = arguments;
        decltype(changed)::VisitArguments(changed, changer);
        changer.ChangeAddress(changed);
        result = changed;
    });
    return result;
}

} // namespace

bdmv::Callback WithNumbers(const bdmv::Callback& callback,
                           const std::function<bd::UInt64()>& source)
{
    return Changed(callback,
                   [&](const char* /*name*/, bd::UInt64, int /*bits*/) { return source(); });
}

std::vector<ChangedCallback> WithEachNumberChanged(const bdmv::Callback& callback)
{
    std::vector<ChangedCallback> result;
    int count = 1;
    for (int changed = 0; changed < count; ++changed) {
        for (const bool highest : {false, true}) {
            int index = 0;
            std::string change;
            const bdmv::Callback other =
                Changed(callback, [&](const char* name, bd::UInt64 number, int bits) {
                    if (index++ != changed) {
                        return number;
                    }
                    change = std::string(NameOf(callback.Id())) + "." + name;
                    return number ^ (bd::UInt64(1) << (highest ? bits - 1 : 0));
                });
            count = index;
            if (!change.empty()) {
                result.push_back({other, change});
            }
        }
    }
    return result;
}

} // namespace bdmvtest
