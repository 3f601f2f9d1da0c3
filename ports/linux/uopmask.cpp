#include <limits>

#include "database/uomasktable.h"
#include "settings.h"

int g_u1Bduopmask = 0;

namespace kevro
{

namespace
{

[[maybe_unused]] const bool g_PresetAtStart =
    ApplyEnvironment("KEVRO_UOPMASK", [](const char* text) {
        using Range = std::numeric_limits<int>;
        g_u1Bduopmask = static_cast<int>(Word::Whole(text).Number(Range::min(), Range::max()));
    });

} // namespace

} // namespace kevro
