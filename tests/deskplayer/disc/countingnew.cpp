#include "countingnew.h"

#include <cstdlib>
#include <new>

namespace
{

thread_local std::size_t g_BytesAskedFor = 0;

} // namespace

namespace deskplayer
{

std::size_t BytesAskedFor()
{
    return g_BytesAskedFor;
}

} // namespace deskplayer

void* operator new(std::size_t size)
{
    g_BytesAskedFor += size;
    if (void* const memory = std::malloc(size)) {
        return memory;
    }
    throw std::bad_alloc();
}

// Sorting asks this one for its buffer.
void* operator new(std::size_t size, const std::nothrow_t& /*nothrow*/) noexcept
{
    g_BytesAskedFor += size;
    return std::malloc(size);
}

void operator delete(void* memory) noexcept
{
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept
{
    std::free(memory);
}
