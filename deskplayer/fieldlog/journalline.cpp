#include "fieldlog/journalline.h"

#include <cstdint>
#include <ctime>

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

/** "2024-05-31T18:15:00.123456Z" */
std::string UniversalTimeText(std::int64_t microseconds)
{
    const auto seconds = static_cast<std::time_t>(microseconds / 1000000);
    std::tm parts{};
    gmtime_r(&seconds, &parts);
    char text[64];
    const std::size_t length = std::strftime(text, sizeof(text), "%Y-%m-%dT%H:%M:%S", &parts);
    const std::string fraction = std::to_string(1000000 + microseconds % 1000000).substr(1);
    return std::string(text, length) + "." + fraction + "Z";
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
