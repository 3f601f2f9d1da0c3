#include "clientkit/blockbuffer.h"

#include <algorithm>
#include <cstring>
#include <limits>
#include <stdexcept>

namespace bdmv
{

namespace
{

constexpr std::size_t Alignment = alignof(std::max_align_t);

/** The bytes that a block takes up, so that the next one is aligned. */
std::size_t RoundUp(std::size_t size)
{
    return (size + Alignment - 1) / Alignment * Alignment;
}

std::size_t SizeOf(std::size_t blocks, std::size_t largest)
{
    const std::size_t most =
        std::numeric_limits<std::size_t>::max() / std::max<std::size_t>(blocks, 1);
    if (largest > most - most % Alignment) {
        throw std::length_error("bdmv::BlockBuffer: too many bytes");
    }
    return blocks * RoundUp(largest);
}

} // namespace

BlockBuffer::BlockBuffer(std::size_t blocks, std::size_t largest)
    : m_Largest(largest), m_Bytes(SizeOf(blocks, largest)), m_Begin(0), m_End(0), m_Blocks(0)
{
}

const void* BlockBuffer::Add(const void* data, std::size_t size)
{
    if (size > m_Largest) {
        return nullptr;
    }
    const std::size_t room = RoundUp(size);
    const bool wrapped = m_Blocks > 0 && m_End <= m_Begin;
    std::size_t position = m_End;
    if ((wrapped ? m_Begin : m_Bytes.size()) - position < room) {
        if (wrapped || m_Begin < room) {
            return nullptr;
        }
        position = 0; // the rest of the ring is too short
    }
    std::memcpy(&m_Bytes[position], data, size);
    m_End = position + room;
    ++m_Blocks;
    return &m_Bytes[position];
}

void BlockBuffer::Remove(const void* block, std::size_t size)
{
    const auto* const bytes = static_cast<const unsigned char*>(block);
    m_Begin = static_cast<std::size_t>(bytes - m_Bytes.data()) + RoundUp(size);
    --m_Blocks;
    if (m_Blocks == 0) {
        m_Begin = 0;
        m_End = 0;
    }
}

} // namespace bdmv
