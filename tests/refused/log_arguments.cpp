#include "bd/logging.h"

/** Passes a line an argument that does not fit its format. */
void WriteNumberAsText(bd::VargLogger& logger)
{
    logger.Log("%s", 1);
}
