#include "fieldlog/logline.h"

#include <algorithm>

#include "fieldlog/textcursor.h"

namespace deskplayer
{

namespace
{

/** A word before @p end: a component, a level, a host. */
std::optional<std::string_view> TakeWord(TextCursor& cursor, std::string_view end)
{
    const std::string_view rest = cursor.Rest();
    const auto* const stop = std::find_if(rest.begin(), rest.end(), [](char character) {
        return character == ' ' || character == ':';
    });
    const std::string_view word = rest.substr(0, static_cast<std::size_t>(stop - rest.begin()));
    TextCursor next(rest.substr(word.size()));
    if (word.empty() || !next.Skip(end)) {
        return std::nullopt;
    }
    cursor = next;
    return word;
}

/** Skips structured data: "-", or elements in brackets, in whose values a backslash escapes. */
bool SkipStructuredData(TextCursor& cursor)
{
    if (cursor.Skip("-")) {
        return true;
    }
    if (cursor.Rest().empty() || cursor.Rest().front() != '[') {
        return false;
    }
    while (cursor.Skip("[")) {
        while (!cursor.Skip("]")) {
            cursor.Skip("\\");
            if (!cursor.SkipOneOf(cursor.Rest().substr(0, 1))) {
                return false;
            }
        }
    }
    return true;
}

/** The rest of a line of RFC 5424 after its time. */
bool ReadNewSyslog(TextCursor cursor, LogLine& line)
{
    cursor.Skip(" ");
    const auto host = cursor.Until(" ");
    const std::string_view process = cursor.Rest();
    const auto name = cursor.Until(" ");
    const auto identifier = cursor.Until(" ");
    const auto message = cursor.Until(" ");
    if (!host || !name || !identifier || !message || !SkipStructuredData(cursor) ||
        !cursor.Skip(" ")) {
        return false;
    }
    line.process = process.substr(0, name->size() + 1 + identifier->size());
    cursor.SkipBlanks();         // rsyslog adds the one that follows the tag of a local message
    cursor.Skip("\xEF\xBB\xBF"); // the mark of a text in UTF-8
    return ReadMessage(cursor.Rest(), line);
}

/** The rest of a line of RFC 3164, or of the journal, after its time. */
bool ReadOldSyslog(TextCursor cursor, LogLine& line)
{
    if (!cursor.Skip(" ") || !cursor.Until(" ")) {
        return false;
    }
    const auto process = cursor.Until(": ");
    if (!process) {
        return false;
    }
    line.process = *process;
    return ReadMessage(cursor.Rest(), line);
}

/** Skips "<14>". */
bool SkipPriority(TextCursor& cursor)
{
    TextCursor next = cursor;
    if (!next.Skip("<") || !next.Number(1, 3) || !next.Skip(">")) {
        return false;
    }
    cursor = next;
    return true;
}

} // namespace

bool ReadMessage(std::string_view message, LogLine& line)
{
    std::string_view rest = message;
    if (const std::optional<LineTime> time = TakeLineTime(rest)) {
        if (time->clock != LineClock::Counter && rest.substr(0, 1) == " ") {
            line.time = *time;
            message = rest.substr(1);
        }
    }
    TextCursor cursor(message);
    const auto component = TakeWord(cursor, " ");
    const auto level = TakeWord(cursor, ": ");
    if (!component || !level) {
        return false;
    }
    line.component = *component;
    line.level = *level;
    line.text = cursor.Rest();
    return true;
}

std::optional<LogLine> ReadPlainLine(std::string_view text)
{
    TextCursor cursor(text);
    const bool isNew = SkipPriority(cursor) && cursor.Skip("1 ");
    std::string_view rest = cursor.Rest();
    const std::optional<LineTime> time = TakeLineTime(rest);
    if (!time || time->clock == LineClock::Counter) {
        return std::nullopt;
    }
    LogLine line;
    line.time = *time;
    cursor = TextCursor(rest);
    bool isRead = false;
    if (isNew) {
        isRead = ReadNewSyslog(cursor, line);
    } else if (time->hasT || time->clock == LineClock::WallWithoutYear) {
        isRead = ReadOldSyslog(cursor, line);
    } else {
        isRead = cursor.Skip(" ") && ReadMessage(cursor.Rest(), line);
    }
    return isRead ? std::optional<LogLine>(line) : std::nullopt;
}

} // namespace deskplayer
