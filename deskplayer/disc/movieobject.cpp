#include "disc/movieobject.h"

#include "disc/fields.h"

namespace deskplayer
{

namespace
{

constexpr std::size_t SmallestMovieObject = 4;
constexpr std::size_t CommandSize = 12;

} // namespace

MovieObjects ParseMovieObjects(const Bytes& bytes, const std::string& fileName)
{
    ByteReader file(bytes, fileName);
    MovieObjects movieObjects;
    movieObjects.version = ReadTypeAndVersion(file, "MOBJ");
    file.Skip(FileHeaderSize - file.Offset(), "header");

    ByteReader section = file.TakePart32({"movie object section"});
    section.Skip(4, "padding");
    movieObjects.objects.resize(section.Count16(SmallestMovieObject, "number of movie objects"));
    for (MovieObject& object : movieObjects.objects) {
        const std::uint16_t flags = section.UInt16("flags of the movie object");
        object.resumeIntention = Bit(flags, 0);
        object.menuCallMask = Bit(flags, 1);
        object.titleSearchMask = Bit(flags, 2);
        object.commandCount = section.Count16(CommandSize, "number of commands");
        section.Skip(CommandSize * object.commandCount, "commands");
    }
    return movieObjects;
}

} // namespace deskplayer
