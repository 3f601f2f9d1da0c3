#include "fieldlog/linetime.h"

#include <algorithm>
#include <array>

#include "fieldlog/textcursor.h"

namespace deskplayer
{

namespace
{

constexpr std::int64_t MicrosecondsPerSecond = 1000000;
constexpr std::int64_t SecondsPerDay = 86400;
constexpr std::int64_t LeapYear = 2000;

/** Hours of sessions and counters beyond it are no times: 11 years. */
constexpr std::int64_t MostHours = 99999;

constexpr std::array<std::string_view, 12> Months{"Jan", "Feb", "Mar", "Apr", "May", "Jun",
                                                  "Jul", "Aug", "Sep", "Oct", "Nov", "Dec"};

/** Days from 1970-01-01 to a day of the Gregorian calendar. @param month from 1 @param day from 1
 */
std::int64_t DaysFrom1970(std::int64_t year, std::int64_t month, std::int64_t day)
{
    // Years begin in March, so that the leap day is the last one.
    const std::int64_t shifted = month <= 2 ? year - 1 : year;
    const std::int64_t monthsFromMarch = (month + 9) % 12;
    return 365 * shifted + shifted / 4 - shifted / 100 + shifted / 400 +
           (153 * monthsFromMarch + 2) / 5 + day - 1 - 719468;
}

/** In microseconds: ".5", ",123456", or nothing. */
std::int64_t TakeFraction(TextCursor& cursor)
{
    TextCursor next = cursor;
    if (!next.SkipOneOf(".,")) {
        return 0;
    }
    std::int64_t unit = MicrosecondsPerSecond;
    std::int64_t fraction = 0;
    std::size_t digits = 0;
    for (; next.AtDigit(); ++digits) {
        unit /= 10;
        fraction += unit * (next.Rest().front() - '0');
        next = TextCursor(next.Rest().substr(1));
    }
    if (digits > 0) {
        cursor = next;
    }
    return fraction;
}

/** HH:MM:SS and a fraction, in microseconds. */
std::optional<std::int64_t> TakeTimeOfDay(TextCursor& cursor, std::size_t mostDigitsOfHours,
                                          std::int64_t mostHours)
{
    const auto hours = cursor.Number(2, mostDigitsOfHours);
    if (!hours || *hours > mostHours || !cursor.Skip(":")) {
        return std::nullopt;
    }
    const auto minutes = cursor.Number(2, 2);
    if (!minutes || *minutes > 59 || !cursor.Skip(":")) {
        return std::nullopt;
    }
    const auto seconds = cursor.Number(2, 2);
    if (!seconds || *seconds > 60) { // 60 is a leap second
        return std::nullopt;
    }
    const std::int64_t whole = (*hours * 60 + *minutes) * 60 + *seconds;
    return whole * MicrosecondsPerSecond + TakeFraction(cursor);
}

/** An offset from universal time, in microseconds; 0 if there is none. */
std::int64_t TakeOffset(TextCursor& cursor)
{
    TextCursor next = cursor;
    if (cursor.Skip("Z")) {
        return 0;
    }
    const bool isNegative = next.Skip("-");
    if (!isNegative && !next.Skip("+")) {
        return 0;
    }
    TextCursor withColon = next;
    auto hours = next.Number(4, 4);
    std::optional<std::int64_t> minutes;
    if (hours) {
        minutes = *hours % 100;
        hours = *hours / 100;
    } else {
        hours = withColon.Number(2, 2);
        withColon.Skip(":");
        minutes = withColon.Number(2, 2);
        next = withColon;
    }
    if (!hours || !minutes || *hours > 23 || *minutes > 59) {
        return 0;
    }
    cursor = next;
    const std::int64_t offset = (*hours * 60 + *minutes) * 60 * MicrosecondsPerSecond;
    return isNegative ? -offset : offset;
}

std::optional<LineTime> TakeDate(TextCursor& cursor, std::optional<std::int64_t> year,
                                 std::optional<std::int64_t> month, std::optional<std::int64_t> day)
{
    if (!month || *month < 1 || *month > 12 || !day || *day < 1 || *day > 31) {
        return std::nullopt;
    }
    LineTime time;
    time.clock = year ? LineClock::Wall : LineClock::WallWithoutYear;
    time.hasT = cursor.Skip("T");
    if (!time.hasT && !cursor.Skip(" ")) {
        return std::nullopt;
    }
    const auto timeOfDay = TakeTimeOfDay(cursor, 2, 23);
    if (!timeOfDay) {
        return std::nullopt;
    }
    time.microseconds = DaysFrom1970(year.value_or(LeapYear), *month, *day) * SecondsPerDay *
                            MicrosecondsPerSecond +
                        *timeOfDay;
    if (year) {
        time.microseconds -= TakeOffset(cursor);
    }
    return time;
}

std::optional<LineTime> TakeNumericDate(TextCursor& cursor)
{
    std::optional<std::int64_t> year = cursor.Number(4, 4);
    if (year && !cursor.Skip("-")) {
        return std::nullopt;
    }
    const auto month = cursor.Number(2, 2);
    if (!month || !cursor.Skip("-")) {
        return std::nullopt;
    }
    const auto day = cursor.Number(2, 2);
    return TakeDate(cursor, year, month, day);
}

std::optional<LineTime> TakeNamedDate(TextCursor& cursor)
{
    const auto* const month =
        std::find_if(Months.begin(), Months.end(), [&](auto name) { return cursor.Skip(name); });
    if (month == Months.end() || !cursor.Skip(" ")) {
        return std::nullopt;
    }
    cursor.Skip(" "); // before a day of one digit
    const auto day = cursor.Number(1, 2);
    return TakeDate(cursor, std::nullopt, month - Months.begin() + 1, day);
}

std::optional<LineTime> TakeSessionTime(TextCursor& cursor)
{
    const auto time = TakeTimeOfDay(cursor, 5, MostHours);
    return time ? std::optional<LineTime>({LineClock::Session, *time, false, {}}) : std::nullopt;
}

std::optional<LineTime> TakeCounter(TextCursor& cursor)
{
    const auto seconds = cursor.Number(1, 10);
    if (!seconds) {
        return std::nullopt;
    }
    return LineTime{
        LineClock::Counter, *seconds * MicrosecondsPerSecond + TakeFraction(cursor), false, {}};
}

} // namespace

std::optional<LineTime> TakeLineTime(std::string_view& rest)
{
    TextCursor cursor(rest);
    std::optional<LineTime> time;
    if (!cursor.AtDigit()) {
        time = TakeNamedDate(cursor);
    } else {
        for (const auto take : {TakeNumericDate, TakeSessionTime, TakeCounter}) {
            cursor = TextCursor(rest);
            time = take(cursor);
            if (time) {
                break;
            }
        }
    }
    if (time) {
        time->text = rest.substr(0, rest.size() - cursor.Rest().size());
        rest = cursor.Rest();
    }
    return time;
}

} // namespace deskplayer
