/* The version in the header is that of the package found. */
#include <string.h>

#include "bdmvnavigator/version.h"

int main(void)
{
    return strcmp(BDMVNAVIGATOR_VERSION_TEXT, EXPECTED) == 0 && strcmp(FOUND, EXPECTED) == 0 ? 0
                                                                                             : 1;
}
