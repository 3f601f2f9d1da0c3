#include <cstdio>
#include <memory>

#include "kevro/kevro_log.h"
#include "logchannel.h"

void KEVRO_Log_VWrite(KEVRO_UInt32 component, KEVRO_Int32 level, KEVRO_Bool, const char* format,
                      va_list args)
{
    using namespace kevro;
    LogLine line = {CurrentTime(), component, level, {}};
    va_list argsAgain;
    va_copy(argsAgain, args);
    try {
        char onStack[256];
        const int result = std::vsnprintf(onStack, sizeof(onStack), format, args);
        if (result < 0) {
            TheLogChannel().AddLost();
        } else if (const auto length = static_cast<std::size_t>(result); length < sizeof(onStack)) {
            line.text = std::string_view(onStack, length);
            TheLogChannel().Write(line);
        } else {
            const auto onHeap = std::make_unique<char[]>(length + 1);
            std::vsnprintf(onHeap.get(), length + 1, format, argsAgain);
            line.text = std::string_view(onHeap.get(), length);
            TheLogChannel().Write(line);
        }
    } catch (...) {
        TheLogChannel().AddLost();
    }
    va_end(argsAgain);
}
