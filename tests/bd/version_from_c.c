/* The version as seen from C. */
#include "bdmvnavigator/version.h"

const char* VersionFromC(void);

const char* VersionFromC(void)
{
    return BDMVNAVIGATOR_VERSION_TEXT;
}
