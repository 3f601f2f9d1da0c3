// Reads any bytes as the movie objects of a disc.

#include "disc/movieobject.h"
#include "discfile.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    return fuzz::OnDiscFile(data, size, deskplayer::ParseMovieObjects);
}
