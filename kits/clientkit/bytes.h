/**
 * @file
 * The block of bytes that a callback carries.
 */
#ifndef CLIENTKIT_BYTES_H
#define CLIENTKIT_BYTES_H

#include "bd/types.h"

namespace bdmv
{

/** A block of bytes owned elsewhere. */
struct Bytes {
    const void* data; ///< first byte; may be null, whatever the size
    bd::UInt32 size;  ///< in bytes

    /** Refers to @p theSize bytes. */
    Bytes(const void* theData, bd::UInt32 theSize) : data(theData), size(theSize) {}
};

} // namespace bdmv

#endif
