/**
 * @file
 * GoogleMock matchers for callbacks. Failures name callbacks, arguments and enumerators.
 *
 * @code
 * using namespace bdmv::callbacks;
 *
 * EXPECT_THAT(spy.Callbacks(), testing::ElementsAre(
 *     bdmvtest::Is(Playlist{800}),                         // the callback and all its arguments
 *     bdmvtest::IsA(bdmv::CallbackPlayItem),               // the callback, whatever its arguments
 *     bdmvtest::Has(&Continued::speed, bd::PlaySpeedFast2), // the callback and one argument
 *     testing::AllOf(bdmvtest::Has(&MarkInfo::playListId, 800u),
 *                    bdmvtest::Has(&MarkInfo::time, testing::Gt(45000u)))));
 * @endcode
 *
 * This is the only header of the test kit that needs GoogleTest and GoogleMock.
 */
#ifndef TESTKIT_MATCHERS_H
#define TESTKIT_MATCHERS_H

#include <gmock/gmock.h>

#include <cstddef>
#include <ostream>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

#include "clientkit/callback.h"
#include "testkit/describecallback.h"

namespace bdmvtest
{

typedef testing::Matcher<const bdmv::Callback&> CallbackMatcher; ///< matches callbacks

/// @cond The functions below create these and describe what they do.

/** Matches equal callbacks. */
class EqualCallbackMatcher : public testing::MatcherInterface<const bdmv::Callback&>
{
public:
    explicit EqualCallbackMatcher(const bdmv::Callback& expected) : m_Expected(expected) {}

    bool MatchAndExplain(const bdmv::Callback& callback,
                         testing::MatchResultListener* listener) const override
    {
        if (callback.Id() != m_Expected.Id()) {
            return false;
        }
        const std::vector<Argument> expected = ArgumentsOf(m_Expected);
        const std::vector<Argument> actual = ArgumentsOf(callback);
        std::string differences;
        for (std::size_t i = 0; i < expected.size(); ++i) {
            if (actual[i].value != expected[i].value) {
                AppendTo(differences, expected[i].name);
            }
        }
        if (!differences.empty()) {
            *listener << "which differs in " << differences;
        }
        return differences.empty();
    }

    void DescribeTo(std::ostream* stream) const override
    {
        *stream << "is " << Describe(m_Expected);
    }

    void DescribeNegationTo(std::ostream* stream) const override
    {
        *stream << "isn't " << Describe(m_Expected);
    }

private:
    bdmv::Callback m_Expected;
};

/** Matches callbacks of a kind. */
class KindOfCallbackMatcher : public testing::MatcherInterface<const bdmv::Callback&>
{
public:
    explicit KindOfCallbackMatcher(bdmv::CallbackId id) : m_Id(id) {}

    bool MatchAndExplain(const bdmv::Callback& callback,
                         testing::MatchResultListener*) const override
    {
        return callback.Id() == m_Id;
    }

    void DescribeTo(std::ostream* stream) const override { *stream << "is " << NameOf(m_Id); }

    void DescribeNegationTo(std::ostream* stream) const override
    {
        *stream << "isn't " << NameOf(m_Id);
    }

private:
    bdmv::CallbackId m_Id;
};

/** Finds the name of an argument: pass it to the arguments' VisitArguments(). */
class ArgumentName
{
public:
    /** @param size in bytes: a structure and its first member have the same address */
    ArgumentName(const void* argument, std::size_t size) : m_pArgument(argument), m_Size(size) {}

    template <typename Visited> void operator()(const char* name, const Visited& visited)
    {
        Compare(name, &visited, sizeof visited);
    }

    /** "argument" if it was not visited, as a structure that outputs write member by member. */
    const std::string& Get() const { return m_Name; }

private:
    void Compare(const char* name, const void* visited, std::size_t size)
    {
        if (visited == m_pArgument && size == m_Size) {
            m_Name = name;
        }
    }

    const void* m_pArgument;
    std::size_t m_Size;
    std::string m_Name = "argument";
};

/** Matches callbacks of a kind by one of their arguments. */
template <typename Arguments, typename Member>
class ArgumentMatcher : public testing::MatcherInterface<const bdmv::Callback&>
{
public:
    /** bd::UInt8 is a number, but GoogleTest prints it as a character. */
    typedef std::conditional_t<std::is_same_v<Member, bd::UInt8>, bd::UInt32, Member> Value;
    typedef testing::Matcher<const Value&> ValueMatcher;

    ArgumentMatcher(Member Arguments::*argument, ValueMatcher matcher)
        : m_Argument(argument), m_Matcher(std::move(matcher)), m_Name(NameOfArgument(argument))
    {
    }

    bool MatchAndExplain(const bdmv::Callback& callback,
                         testing::MatchResultListener* listener) const override
    {
        const Arguments* const arguments = callback.As<Arguments>();
        if (arguments == nullptr) {
            return false;
        }
        const Value value = arguments->*m_Argument;
        testing::StringMatchResultListener explanation;
        const bool matches = m_Matcher.MatchAndExplain(value, &explanation);
        *listener << "whose " << m_Name << " is " << testing::PrintToString(value);
        if (!explanation.str().empty()) {
            *listener << ", " << explanation.str();
        }
        return matches;
    }

    void DescribeTo(std::ostream* stream) const override
    {
        *stream << "is " << NameOf(Arguments::Id()) << " whose " << m_Name << " ";
        m_Matcher.DescribeTo(stream);
    }

    void DescribeNegationTo(std::ostream* stream) const override
    {
        *stream << "isn't " << NameOf(Arguments::Id()) << " whose " << m_Name << " ";
        m_Matcher.DescribeTo(stream);
    }

private:
    static std::string NameOfArgument(Member Arguments::*argument)
    {
        const Arguments arguments = {};
        ArgumentName name(&(arguments.*argument), sizeof(Member));
        Arguments::VisitArguments(arguments, name);
        return name.Get();
    }

    Member Arguments::*m_Argument;
    ValueMatcher m_Matcher;
    std::string m_Name;
};

/// @endcond

/**
 * Matches a callback that equals @p expected in all arguments. Blocks of bytes are equal if their
 * bytes are, programs if they are the same object.
 *
 * @param expected a type of the namespace bdmv::callbacks, or a bdmv::Callback; a block that it
 *                 points to must outlive the matcher
 */
inline CallbackMatcher Is(const bdmv::Callback& expected)
{
    return testing::MakeMatcher(new EqualCallbackMatcher(expected));
}

/** Matches any callback of a kind. */
inline CallbackMatcher IsA(bdmv::CallbackId id)
{
    return testing::MakeMatcher(new KindOfCallbackMatcher(id));
}

/**
 * Matches a callback by one argument, whatever the others are.
 *
 * @param argument a member of a type of the namespace bdmv::callbacks, which is the callback's kind
 * @param matcher  a value or a matcher
 */
template <typename Arguments, typename Member, typename Matcher>
CallbackMatcher Has(Member Arguments::*argument, const Matcher& matcher)
{
    typedef ArgumentMatcher<Arguments, Member> Has;
    return testing::MakeMatcher(
        new Has(argument, testing::SafeMatcherCast<const typename Has::Value&>(matcher)));
}

} // namespace bdmvtest

#endif
