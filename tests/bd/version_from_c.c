/* The version as a program in C sees it. */
#include "bdmvnavigator/version.h"

const char* VersionFromC(void);

const char* VersionFromC(void)
{
    return BDMVNAVIGATOR_VERSION_TEXT;
}
