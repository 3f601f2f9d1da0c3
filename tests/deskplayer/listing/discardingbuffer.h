/**
 * @file
 * A place for output that nobody looks at.
 */
#ifndef TESTS_DESKPLAYER_LISTING_DISCARDINGBUFFER_H
#define TESTS_DESKPLAYER_LISTING_DISCARDINGBUFFER_H

#include <algorithm>
#include <cstddef>
#include <streambuf>

namespace deskplayer
{

/** Keeps nothing of what is written but how much it was, and how much at once. */
class DiscardingBuffer : public std::streambuf
{
public:
    std::size_t Size() const { return m_Size; }
    std::size_t GreatestPiece() const { return m_GreatestPiece; }

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
        m_GreatestPiece = std::max(m_GreatestPiece, size);
    }

    std::size_t m_Size = 0;
    std::size_t m_GreatestPiece = 0;
};

} // namespace deskplayer

#endif
