/**
 * @file
 * Callbacks and their kinds as text, by name.
 *
 * @code
 * bdmvtest::Describe(callback); // "PlayItem(playListId=800, playItemId=1, videoFormat=1080p,
 *                               //           aspectRatio=16:9)"
 *
 * EXPECT_EQ(spy.Callbacks().back(), expected); // GoogleTest prints both like this
 * @endcode
 *
 * GoogleTest finds the functions PrintTo(), but nothing here needs it. A program that prints
 * callbacks in GoogleTest's messages includes this header, or testkit/spylistener.h, in every
 * source that does; else GoogleTest may print the bytes of a callback in all of them.
 */
#ifndef TESTKIT_DESCRIBECALLBACK_H
#define TESTKIT_DESCRIBECALLBACK_H

#include <cstdint>
#include <cstring>
#include <ostream>
#include <string>
#include <type_traits>
#include <vector>

#include "clientkit/callback.h"
#include "clientkit/names.h"
#include "testkit/describe.h"

namespace bdmvtest
{

/** The name that all outputs of this project give an enumerator; a value without one in decimal. */
template <typename Enumeration> std::string ShortName(Enumeration value)
{
    const char* const name = bdmv::NameOf(value);
    return name != nullptr ? name : std::to_string(+value);
}

/** An argument of a callback, for messages and comparisons. */
struct Argument {
    std::string name; ///< as outputs write it
    std::string text; ///< for people
    std::string
        value; ///< equal if and only if the arguments are; bytes are compared, not addresses
};

/** Collects the arguments of a callback: pass it to bdmv::Callback::VisitArguments(). */
class ArgumentCollector
{
public:
    std::vector<Argument> arguments; ///< those visited so far

    /** Adds an argument. */
    template <typename Value> void operator()(const char* name, const Value& value)
    {
        if constexpr (std::is_enum_v<Value>) {
            Add(name, ShortName(value), Describe(value));
        } else {
            Add(name, Describe(value), Describe(value));
        }
    }

    /** Adds a mask, as stored. */
    void operator()(const char* name, const bdmv::UOMaskTable& mask)
    {
        // The stored mask: the reported one depends on a debug setting.
        bd::UInt64 stored = 0;
        static_assert(sizeof stored == sizeof mask, "the mask and nothing else");
        std::memcpy(&stored, &mask, sizeof stored);
        Add(name, DescribeOperations(mask), Describe(stored));
    }

    /** Adds a block by its bytes. */
    void operator()(const char* name, const bdmv::Bytes& bytes)
    {
        const std::string text = DescribeBytes(bytes.data, bytes.size);
        Add(name, text.substr(0, text.rfind(',')), text);
    }

    /** Adds a program by its address. */
    void operator()(const char* name, const bdmv::IProgramData::RefPtr& program)
    {
        const void* const address = program.Get();
        Add(name, program ? Describe(program->GetNumberOfNavigationCommands()) : "null",
            Describe(reinterpret_cast<std::uintptr_t>(address)));
    }

private:
    void Add(const char* name, const std::string& text, const std::string& value)
    {
        arguments.push_back({name, text, value});
    }
};

/** The arguments of a callback in the order in which outputs write them. */
inline std::vector<Argument> ArgumentsOf(const bdmv::Callback& callback)
{
    ArgumentCollector collector;
    callback.VisitArguments(collector);
    return collector.arguments;
}

/**
 * A callback with the names of its arguments. Times are in ticks of 45 kHz, masks list the
 * operations that they forbid, programs show the number of their commands.
 */
inline std::string Describe(const bdmv::Callback& callback)
{
    std::string text;
    for (const Argument& argument : ArgumentsOf(callback)) {
        AppendTo(text, argument.name + "=" + argument.text);
    }
    return NameOf(callback.Id()) + ("(" + text + ")");
}

} // namespace bdmvtest

namespace bdmv
{

/** Prints with Describe(); called by GoogleTest. */
inline void PrintTo(const Callback& callback, std::ostream* stream)
{
    *stream << bdmvtest::Describe(callback);
}

/** Prints with Describe(); called by GoogleTest. */
inline void PrintTo(CallbackId id, std::ostream* stream)
{
    *stream << NameOf(id);
}

} // namespace bdmv

#endif
