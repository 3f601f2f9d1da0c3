// A program that uses the Linux port unchanged.
#include "bd/logging.h"
#include "database/uomasktable.h"
#include "kevro_linux.h"

int main()
{
    char message[200];
    const bool configured = KEVRO_Log_Configure("Test=Info", message, sizeof message);
    constexpr bd::LogTag tag = {bd::CompIdTest, KEVRO_Log_LevelInfo, 0};
    BD_LOG(tag, "the Linux port of an installed package");
    return configured && KEVRO_Log_IsEnabled(bd::CompIdTest, KEVRO_Log_LevelInfo, 0) &&
                   bdmv::UOMaskTable(1).GetUOMaskTable() == 1ULL << 63
               ? 0
               : 1;
}
