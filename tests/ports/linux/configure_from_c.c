/* The port's header as seen from C. */
#include "kevro_linux.h"

bool ConfigureFromC(const char* text);

bool ConfigureFromC(const char* text)
{
    char message[100];
    return KEVRO_Log_Configure(text, message, sizeof message);
}
