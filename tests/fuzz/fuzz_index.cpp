// Reads any bytes as the index of a disc.

#include "disc/index.h"
#include "discfile.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    return fuzz::OnDiscFile(data, size, deskplayer::ParseIndex);
}
