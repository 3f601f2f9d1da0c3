#include "logline.h"

#include <charconv>

#include "kevro/kevro_log.h"
#include "names.h"
#include "printable.h"

namespace kevro
{

namespace
{

void Append(TextBuffer& buffer, std::string_view text)
{
    buffer.append(text.data(), text.data() + text.size());
}

/** Appends the name of a number, or the number if it has no name. */
template <typename Number> void AppendName(TextBuffer& buffer, const Names& names, Number number)
{
    if (const Names::Entry* const entry = names.Find(static_cast<KEVRO_UInt32>(number))) {
        Append(buffer, entry->name);
        return;
    }
    char digits[16];
    const auto result = std::to_chars(digits, digits + sizeof(digits), number);
    Append(buffer, std::string_view(digits, static_cast<std::size_t>(result.ptr - digits)));
}

} // namespace

void AppendLine(TextBuffer& buffer, const LineHead& head, std::string_view text)
{
    AppendName(buffer, Components, head.component);
    buffer.push_back(' ');
    AppendName(buffer, Levels, head.level);
    Append(buffer, ": ");
    AppendPrintable(buffer, text);
}

spdlog::level::level_enum Severity(KEVRO_Int32 level)
{
    switch (level) {
    case KEVRO_Log_LevelFatal:
        return spdlog::level::critical;
    case KEVRO_Log_LevelException:
        return spdlog::level::err;
    case KEVRO_Log_LevelWarning:
        return spdlog::level::warn;
    case KEVRO_Log_LevelMethod:
    case KEVRO_Log_LevelInterface:
        return spdlog::level::trace;
    case KEVRO_Log_LevelFree1:
    case KEVRO_Log_LevelFree2:
    case KEVRO_Log_LevelFree3:
    case KEVRO_Log_LevelFree4:
        return spdlog::level::debug;
    default:
        return spdlog::level::info;
    }
}

} // namespace kevro
