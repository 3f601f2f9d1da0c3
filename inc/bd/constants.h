/**
 * @file
 * Values of the navigation model that mean "none".
 */
#ifndef BD_CONSTANTS_H
#define BD_CONSTANTS_H

#include "bd/types.h"

namespace bd
{

/** The time position that means none: all ones. */
constexpr TimePosition TimePositionNone = 0xFFFFFFFFFFFFFFFFULL;

} // namespace bd

#endif
