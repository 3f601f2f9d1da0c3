// Runs one command with the port and ends, so that a test can check the start and the end of a
// program: port_helper COMMAND [ARGUMENT...]
#include <cstdio>
#include <cstdlib>
#include <cstring>

#include "bd/logging.h"
#include "database/uomasktable.h"
#include "kevro/kevro_osa.h"
#include "kevro_linux.h"

namespace
{

void WriteEvent(const char* text)
{
    bd::VargLogger(bd::CompIdBdmvNavigator, KEVRO_Log_LevelEvent, 0).Log("%s", text);
}

void WriteEvents(int count)
{
    for (int i = 0; i < count; ++i) {
        WriteEvent("a line");
    }
}

/** Constructed before the port's static objects and destroyed after them. */
class EarlyStatic
{
public:
    ~EarlyStatic()
    {
        if (m_WriteAtEnd) {
            WriteEvent("from a destructor");
        }
    }
    bool m_WriteAtEnd = false;
};

EarlyStatic g_EarlyStatic;

} // namespace

int main(int argc, char** argv)
{
    const char* const command = argc > 1 ? argv[1] : "";
    if (std::strcmp(command, "enabled") == 0 && argc > 4) {
        std::printf("%d\n", KEVRO_Log_IsEnabled(static_cast<KEVRO_UInt32>(std::atoi(argv[2])),
                                                std::atoi(argv[3]), std::atoi(argv[4])));
    } else if (std::strcmp(command, "write") == 0 && argc > 2) {
        WriteEvents(std::atoi(argv[2]));
    } else if (std::strcmp(command, "write-at-end") == 0) {
        g_EarlyStatic.m_WriteAtEnd = true;
    } else if (std::strcmp(command, "assert") == 0 && argc > 2) {
        WriteEvents(std::atoi(argv[2]));
        Assert("a > b", "some/file.cpp", 12);
        std::puts("continued");
    } else if (std::strcmp(command, "uopmask") == 0) {
        std::printf("%d\n", g_u1Bduopmask);
    } else {
        return EXIT_FAILURE;
    }
    return EXIT_SUCCESS;
}
