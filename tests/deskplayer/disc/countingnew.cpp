#include "countingnew.h"

#include <cstdlib>
#include <new>

namespace
{

thread_local std::size_t g_AllocatedBytes = 0;

} // namespace

namespace deskplayer
{

std::size_t AllocatedBytes()
{
    return g_AllocatedBytes;
}

} // namespace deskplayer

void* operator new(std::size_t size)
{
    g_AllocatedBytes += size;
    if (void* const memory = std::malloc(size)) {
        return memory;
    }
    throw std::bad_alloc();
}

// Used by std::stable_sort for its buffer.
void* operator new(std::size_t size, const std::nothrow_t& /*nothrow*/) noexcept
{
    g_AllocatedBytes += size;
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
