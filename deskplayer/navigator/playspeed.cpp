#include "navigator/playspeed.h"

#include <array>
#include <cstddef>

namespace deskplayer
{

SpeedRatio RatioOf(bd::PlaySpeedDef speed)
{
    static constexpr std::array<SpeedRatio, 18> ratios = {{{1, 32},
                                                           {1, 16},
                                                           {1, 8},
                                                           {1, 4},
                                                           {1, 2},
                                                           {1, 1},
                                                           {2, 1},
                                                           {4, 1},
                                                           {8, 1},
                                                           {16, 1},
                                                           {32, 1},
                                                           {48, 1},
                                                           {64, 1},
                                                           {80, 1},
                                                           {96, 1},
                                                           {112, 1},
                                                           {120, 1},
                                                           {128, 1}}};
    const auto step = static_cast<std::size_t>(speed);
    return step < ratios.size() ? ratios[step] : SpeedRatio{1, 1};
}

} // namespace deskplayer
