/**
 * @file
 * A stream buffer that discards its output.
 */
#ifndef TESTS_DESKPLAYER_LISTING_DISCARDINGBUFFER_H
#define TESTS_DESKPLAYER_LISTING_DISCARDINGBUFFER_H

#include <algorithm>
#include <cstddef>
#include <streambuf>

namespace deskplayer
{

/** Discards everything written; records the total size and the largest single write. */
class DiscardingBuffer : public std::streambuf
{
public:
    std::size_t Size() const { return m_Size; }
    std::size_t LargestWrite() const { return m_LargestWrite; }

private:
    int_type overflow(int_type character) override
    {
        Add(1);
        return traits_type::not_eof(character);
    }

    std::streamsize xsputn(const char*, std::streamsize size) override
    {
        Add(static_cast<std::size_t>(size));
        return size;
    }

    void Add(std::size_t size)
    {
        m_Size += size;
        m_LargestWrite = std::max(m_LargestWrite, size);
    }

    std::size_t m_Size = 0;
    std::size_t m_LargestWrite = 0;
};

} // namespace deskplayer

#endif
