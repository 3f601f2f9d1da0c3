#include "text/timetext.h"

#include <array>
#include <cinttypes>
#include <cstdio>

namespace deskplayer
{

std::string TimeText(Ticks time)
{
    const std::uint64_t milliseconds = time.count() / (TicksPerSecond / 1000);
    const std::uint64_t seconds = milliseconds / 1000;
    std::array<char, 32> text{};
    std::snprintf(text.data(), text.size(), "%02" PRIu64 ":%02" PRIu64 ":%02" PRIu64 ".%03" PRIu64,
                  seconds / 3600, seconds / 60 % 60, seconds % 60, milliseconds % 1000);
    return text.data();
}

} // namespace deskplayer
