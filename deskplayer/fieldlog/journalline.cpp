#include "fieldlog/journalline.h"

#include <cstddef>
#include <cstdint>

#include <nlohmann/json.hpp>

#include "fieldlog/textcursor.h"

namespace deskplayer
{

namespace
{

using nlohmann::json;

/** A string, or the array of bytes that journalctl writes for what is not printable. */
std::optional<std::string> TextOf(const json& object, const char* name)
{
    const auto member = object.find(name);
    if (member == object.end()) {
        return std::nullopt;
    }
    if (member->is_string()) {
        return member->get<std::string>();
    }
    if (!member->is_array()) {
        return std::nullopt;
    }
    std::string text;
    for (const json& byte : *member) {
        if (!byte.is_number_unsigned() || byte.get<std::uint64_t>() > 0xFF) {
            return std::nullopt;
        }
        text.push_back(static_cast<char>(byte.get<std::uint64_t>()));
    }
    return text;
}

/** @param number from 0 to 99 */
std::string TwoDigits(std::int64_t number)
{
    return std::to_string(100 + number).substr(1);
}

bool IsLeapYear(std::int64_t year)
{
    return year % 4 == 0 && (year % 100 != 0 || year % 400 == 0);
}

/** "2024-05-31". Not by the system's calendar, which may end in 2038. */
std::string DateText(std::int64_t daysFrom1970)
{
    std::int64_t rest = daysFrom1970;
    std::int64_t year = 1970;
    for (; rest >= (IsLeapYear(year) ? 366 : 365); ++year) {
        rest -= IsLeapYear(year) ? 366 : 365;
    }
    const int days[] = {31, IsLeapYear(year) ? 29 : 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
    std::size_t month = 0;
    for (; rest >= days[month]; ++month) {
        rest -= days[month];
    }
    return std::to_string(year) + "-" + TwoDigits(static_cast<std::int64_t>(month) + 1) + "-" +
           TwoDigits(rest + 1);
}

/** "2024-05-31T18:15:00.123456Z" */
std::string UniversalTimeText(std::int64_t microseconds)
{
    const std::int64_t seconds = microseconds / 1000000;
    const std::string fraction = std::to_string(1000000 + microseconds % 1000000).substr(1);
    return DateText(seconds / 86400) + "T" + TwoDigits(seconds / 3600 % 24) + ":" +
           TwoDigits(seconds / 60 % 60) + ":" + TwoDigits(seconds % 60) + "." + fraction + "Z";
}

} // namespace

std::optional<LogLine> JournalLineReader::Read(std::string_view text)
{
    const json object = json::parse(text, nullptr, false);
    if (!object.is_object()) {
        return std::nullopt;
    }
    const auto message = TextOf(object, "MESSAGE");
    const auto time = TextOf(object, "__REALTIME_TIMESTAMP");
    if (!message || !time) {
        return std::nullopt;
    }
    TextCursor cursor(*time);
    const auto microseconds = cursor.Number(1, 16); // to the year 2286
    if (!microseconds || !cursor.Rest().empty()) {
        return std::nullopt;
    }
    m_Message = *message;
    m_Time = UniversalTimeText(*microseconds);
    m_Process = TextOf(object, "_BOOT_ID").value_or("") + " " + TextOf(object, "_PID").value_or("");
    LogLine line;
    line.time = {LineClock::Wall, *microseconds, true, m_Time};
    line.process = m_Process;
    return ReadMessage(m_Message, line) ? std::optional<LogLine>(line) : std::nullopt;
}

} // namespace deskplayer
