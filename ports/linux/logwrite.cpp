#include <charconv>
#include <cstdio>
#include <memory>
#include <string_view>

#include "kevro/kevro_log.h"
#include "logchannel.h"
#include "names.h"
#include "printable.h"

namespace kevro
{

namespace
{

/** A line in the making: on the stack unless it is long. */
using Line = spdlog::memory_buf_t;

void Append(Line& line, std::string_view text)
{
    line.append(text.data(), text.data() + text.size());
}

/** The name of a number, or the number where it has none. */
void AppendName(Line& line, const Names& names, KEVRO_UInt32 number)
{
    if (const Names::Entry* const entry = names.Find(number)) {
        Append(line, entry->name);
        return;
    }
    char digits[16];
    const auto result = std::to_chars(digits, digits + sizeof(digits), number);
    Append(line, std::string_view(digits, static_cast<std::size_t>(result.ptr - digits)));
}

spdlog::level::level_enum Severity(KEVRO_UInt32 level)
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

void WriteLine(KEVRO_UInt32 component, KEVRO_UInt32 level, std::string_view text)
{
    Line line;
    AppendName(line, Components, component);
    line.push_back(' ');
    AppendName(line, Levels, level);
    Append(line, ": ");
    AppendPrintable(line, text);
    TheLogChannel().Write(Severity(level), std::string_view(line.data(), line.size()));
}

} // namespace

} // namespace kevro

void KEVRO_Log_VWrite(KEVRO_UInt32 component, KEVRO_Log_Level level, KEVRO_Bool, const char* format,
                      va_list args)
{
    using namespace kevro;
    const KEVRO_UInt32 number = LevelNumber(level);
    va_list argsAgain;
    va_copy(argsAgain, args);
    try {
        char onStack[256];
        const int result = std::vsnprintf(onStack, sizeof(onStack), format, args);
        if (result < 0) {
            TheLogChannel().AddLost();
        } else if (const auto length = static_cast<std::size_t>(result); length < sizeof(onStack)) {
            WriteLine(component, number, std::string_view(onStack, length));
        } else {
            const auto onHeap = std::make_unique<char[]>(length + 1);
            std::vsnprintf(onHeap.get(), length + 1, format, argsAgain);
            WriteLine(component, number, std::string_view(onHeap.get(), length));
        }
    } catch (...) {
        TheLogChannel().AddLost();
    }
    va_end(argsAgain);
}
