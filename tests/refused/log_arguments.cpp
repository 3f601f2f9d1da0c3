#include "bd/logging.h"

/** Gives a line an argument that its format does not name. */
void WriteNumberAsText(bd::VargLogger& logger)
{
    logger.Log("%s", 1);
}
