/**
 * @file
 * Copies of blocks of bytes in memory that is allocated once.
 */
#ifndef CLIENTKIT_BLOCKBUFFER_H
#define CLIENTKIT_BLOCKBUFFER_H

#include <cstddef>
#include <vector>

#include "bd/types.h"

namespace bdmv
{

/**
 * A ring of bytes. Blocks are removed in the order in which they were added, and each is
 * contiguous.
 *
 * For one thread at a time.
 */
class BlockBuffer
{
public:
    /**
     * @param blocks  how many blocks of the largest size fit, if nothing else has been added; the
     *                second one always fits
     * @param largest the largest size of a block, in bytes
     * @throw std::length_error more memory than can be addressed
     * @throw std::bad_alloc    not enough memory
     */
    BlockBuffer(std::size_t blocks, std::size_t largest);

    BlockBuffer(const BlockBuffer&) = delete;
    BlockBuffer& operator=(const BlockBuffer&) = delete;

    /**
     * Copies a block. Never allocates.
     *
     * @param data the bytes, not null
     * @param size in bytes, not 0
     * @return the copy, aligned for any type, valid until it is removed; null when there is no room
     *         or the block is larger than the largest
     */
    const void* Add(const void* data, std::size_t size);

    /**
     * Removes the block that was added first.
     *
     * @param block what Add() returned for it
     * @param size  what Add() was given for it
     */
    void Remove(const void* block, std::size_t size);

private:
    const std::size_t m_Largest;
    std::vector<unsigned char> m_Bytes;
    std::size_t m_Begin; ///< the first byte of the oldest block
    std::size_t m_End;   ///< where the newest block ends, rounded up
    std::size_t
        m_Blocks; ///< distinguishes a full ring from an empty one if both positions are equal
};

} // namespace bdmv

#endif
