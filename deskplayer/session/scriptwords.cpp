#include "session/scriptwords.h"

#include <charconv>
#include <limits>
#include <optional>
#include <system_error>

#include "session/script.h"

namespace deskplayer
{

namespace
{

/** The absence of callbacks in an expectation; never the name of one. */
constexpr std::string_view Nothing = "nothing";

/**
 * Removes leading digits from @p text. A number that does not fit the result becomes the greatest
 * one, which is out of range wherever numbers are used.
 */
std::optional<std::uint32_t> TakeNumber(std::string_view& text)
{
    std::uint32_t number = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    if (error == std::errc::invalid_argument) {
        return std::nullopt;
    }
    text.remove_prefix(std::size_t(end - text.data()));
    return error == std::errc() ? number : std::numeric_limits<std::uint32_t>::max();
}

/** Removes @p character from the front of @p text. @return false if it is not there */
bool TakeCharacter(std::string_view& text, char character)
{
    const bool found = !text.empty() && text.front() == character;
    text.remove_prefix(found ? 1 : 0);
    return found;
}

bool IsNegative(std::string_view word)
{
    return TakeCharacter(word, '-') && TakeNumber(word);
}

Meaning ReadNumber(std::string_view word)
{
    if (IsNegative(word)) {
        return {0, "is negative"};
    }
    const auto number = TakeNumber(word);
    if (!number) {
        return {0, Unexpected};
    }
    if (!word.empty()) {
        return {0, "is not a whole number"};
    }
    if (*number > GreatestNumber) {
        return {0, "is not between 0 and 65535"};
    }
    return {*number, ""};
}

/** Removes a decimal fraction from the front of @p text. @return thousandths; 0 without one */
std::optional<std::uint64_t> TakeThousandths(std::string_view& text)
{
    if (!TakeCharacter(text, '.')) {
        return 0;
    }
    const std::size_t sizeBefore = text.size();
    const auto number = TakeNumber(text);
    const std::size_t digits = sizeBefore - text.size();
    if (!number || digits > 3) {
        return std::nullopt;
    }
    constexpr std::uint64_t thousandths[] = {100, 10, 1};
    return *number * thousandths[digits - 1];
}

/** The number of milliseconds in a unit of time. */
std::optional<std::uint64_t> ReadUnit(std::string_view unit)
{
    if (unit == "ms") {
        return 1;
    }
    if (unit == "s" || unit.empty()) {
        return 1000;
    }
    if (unit == "m") {
        return 60 * 1000;
    }
    if (unit == "h") {
        return 3600 * 1000;
    }
    return std::nullopt;
}

Meaning ReadTime(std::string_view word)
{
    constexpr Meaning notATime{0, "is not a time"};

    if (IsNegative(word)) {
        return {0, "is negative"};
    }
    const auto first = TakeNumber(word);
    if (!first) {
        return {0, Unexpected};
    }
    std::uint64_t whole = *first;
    std::size_t colons = 0;
    while (colons < 2 && TakeCharacter(word, ':')) {
        const auto part = TakeNumber(word);
        if (!part) {
            return notATime;
        }
        if (*part > 59) {
            return {0, "is not a time: minutes and seconds must be below 60"};
        }
        whole = whole * 60 + *part;
        ++colons;
    }
    const auto thousandths = TakeThousandths(word);
    const auto unit = ReadUnit(word);
    if (!thousandths || !unit || (colons > 0 && !word.empty())) {
        return notATime;
    }
    if (*thousandths * *unit % 1000 != 0) {
        return {0, "is finer than a millisecond"};
    }
    constexpr std::uint64_t ticksPerMillisecond = TicksPerSecond / 1000;
    const std::uint64_t milliseconds = whole * *unit + *thousandths * *unit / 1000;
    if (milliseconds > LongestSession.count() / ticksPerMillisecond) {
        return {0, "is more than 1000 hours"};
    }
    return {milliseconds * ticksPerMillisecond, ""};
}

Meaning ReadArgument(std::string_view word)
{
    const std::size_t equals = word.find('=');
    const bool fits = equals != std::string_view::npos && equals > 0 && equals + 1 < word.size();
    return {0, fits ? "" : Unexpected};
}

} // namespace

bool IsValuePlaceholder(std::string_view patternWord)
{
    return patternWord == NumberPlaceholder || patternWord == TimePlaceholder;
}

bool IsWordPlaceholder(std::string_view patternWord)
{
    return patternWord == CallbackPlaceholder || patternWord == ArgumentPlaceholder;
}

Meaning ReadWord(std::string_view patternWord, std::string_view word)
{
    if (patternWord == NumberPlaceholder) {
        return ReadNumber(word);
    }
    if (patternWord == TimePlaceholder) {
        return ReadTime(word);
    }
    if (patternWord == ArgumentPlaceholder) {
        return ReadArgument(word);
    }
    if (patternWord == CallbackPlaceholder) {
        return {0, word == Nothing ? Unexpected : ""};
    }
    return {0, patternWord == word ? "" : Unexpected};
}

std::string DescribePatternWord(std::string_view patternWord)
{
    if (patternWord == NumberPlaceholder) {
        return "a NUMBER";
    }
    if (patternWord == TimePlaceholder) {
        return "a TIME (such as 1:02:03.5, 02:03, 3.25, 2s, 500ms, 1.5m or 1h)";
    }
    if (patternWord == CallbackPlaceholder) {
        return "a CALLBACK";
    }
    if (patternWord == ArgumentPlaceholder) {
        return "an ARGUMENT=VALUE (such as number=2) or the end of the line";
    }
    return std::string(patternWord);
}

} // namespace deskplayer
