/**
 * @file
 * Base integer types of the platform layer. Plain C (C99) and C++.
 *
 * Every width here is exact on every target. The layers above build their identifiers and their
 * binary layouts on these types, so a port must not change their definitions.
 */
#ifndef KEVRO_KEVRO_TYPES_H
#define KEVRO_KEVRO_TYPES_H

#include <stdint.h>

/** A truth value in C: 0 is false, anything else is true. */
typedef int32_t KEVRO_Bool;

typedef uint8_t KEVRO_UInt8;   /**< unsigned, 8 bits */
typedef uint16_t KEVRO_UInt16; /**< unsigned, 16 bits */
typedef uint32_t KEVRO_UInt32; /**< unsigned, 32 bits */
typedef uint64_t KEVRO_UInt64; /**< unsigned, 64 bits */
typedef int32_t KEVRO_Int32;   /**< signed, 32 bits */
typedef int64_t KEVRO_Int64;   /**< signed, 64 bits */

/** A time of the platform's clock. */
typedef KEVRO_Int64 KEVRO_TimeCode;

#endif
