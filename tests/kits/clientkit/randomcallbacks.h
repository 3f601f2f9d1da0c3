/**
 * @file
 * Callbacks with random arguments, and a listener that keeps what it receives.
 */
#ifndef KITS_CLIENTKIT_RANDOMCALLBACKS_H
#define KITS_CLIENTKIT_RANDOMCALLBACKS_H

#include <limits>
#include <random>
#include <type_traits>
#include <vector>

#include "clientkit/callbacklistener.h"

namespace bdmvtest
{

/** The same sequence for the same seed, on every target. */
class RandomCallbacks
{
public:
    explicit RandomCallbacks(unsigned seed) : m_Numbers(seed) {}

    /** Any of the 56, with any arguments. */
    bdmv::Callback Next() { return Make(static_cast<bdmv::CallbackId>(m_Numbers() % 56)); }

    bdmv::Callback Make(bdmv::CallbackId id)
    {
        static bdmv::Callback (RandomCallbacks::*const makers[])() = {
#define BDMVTEST_MAKER(interface, name) &RandomCallbacks::MakeAs<bdmv::callbacks::name>,
            BDMV_CALLBACKS(BDMVTEST_MAKER)
#undef BDMVTEST_MAKER
        };
        return (this->*makers[id])();
    }

    std::vector<bdmv::Callback> Sequence(std::size_t length)
    {
        std::vector<bdmv::Callback> callbacks;
        while (callbacks.size() < length) {
            callbacks.push_back(Next());
        }
        return callbacks;
    }

    // The arguments of a callback.

    template <typename Number> void operator()(const char* /*name*/, Number& value)
    {
        value = static_cast<Number>(NextNumber());
    }

    void operator()(const char* /*name*/, bd::ZoomRectangleDef& value)
    {
        value = {NextUInt16(), NextUInt16(), NextUInt16(), NextUInt16()};
    }

    void operator()(const char* /*name*/, bdmv::UOMaskTable& value)
    {
        value = bdmv::UOMaskTable(NextNumber());
    }

    /** Callbacks own neither blocks nor programs: both are left empty. */
    void operator()(const char* /*name*/, const bdmv::Bytes& /*value*/) {}
    void operator()(const char* /*name*/, bdmv::IProgramData::RefPtr& /*value*/) {}

private:
    template <typename Arguments> bdmv::Callback MakeAs()
    {
        Arguments arguments{};
        Arguments::VisitArguments(arguments, *this);
        return arguments;
    }

    /** Often a small number, so that values recur; else an extreme or any other. */
    bd::UInt64 NextNumber()
    {
        switch (m_Numbers() % 8) {
        case 0:
            return std::numeric_limits<bd::UInt64>::max();
        case 1:
            return m_Numbers() * (bd::UInt64(1) << 32) + m_Numbers();
        default:
            return m_Numbers() % 4;
        }
    }

    bd::UInt16 NextUInt16()
    {
        return static_cast<bd::UInt16>(NextNumber());
    }

    std::mt19937 m_Numbers;
};

/** Keeps every callback. */
class CallbackKeeper : public bdmv::CallbackListener
{
public:
    std::vector<bdmv::Callback> callbacks;

protected:
    void OnCallback(const bdmv::Callback& callback) override { callbacks.push_back(callback); }
};

} // namespace bdmvtest

#endif
