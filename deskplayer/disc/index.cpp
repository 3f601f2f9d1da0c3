#include "disc/index.h"

#include "disc/fields.h"

namespace deskplayer
{

namespace
{

constexpr std::size_t IndexObjectSize = 12;

IndexObject ReadIndexObject(ByteReader& reader)
{
    IndexObject object;
    object.offset = static_cast<std::uint32_t>(reader.Offset());
    const std::uint8_t types = reader.UInt8("object type");
    object.objectType = types >> 6;
    object.accessType = types >> 4 & 3;
    reader.Skip(3, "padding");
    object.playbackType = reader.UInt8("playback type") >> 6;
    reader.Skip(1, "padding");
    if (object.objectType == ObjectTypeJavaObject) {
        object.javaObject = reader.Text(5, "name of the Java object");
        reader.Skip(1, "padding");
    } else {
        object.movieObject = reader.UInt16("number of the movie object");
        reader.Skip(4, "padding");
    }
    return object;
}

} // namespace

Index ParseIndex(const Bytes& bytes, const std::string& fileName)
{
    ByteReader file(bytes, fileName);
    Index index;
    index.version = ReadTypeAndVersion(file, "INDX");
    ByteReader indexes = file.PartAtAddress(FileHeaderSize, {"indexes"});
    file.Skip(FileHeaderSize - file.Offset(), "header");

    ByteReader applicationInfo = file.TakePart32({"application info"});
    const std::uint8_t flags = applicationInfo.UInt8("stereoscopic flags");
    index.stereoscopicOutputPreferred = Bit(flags, 1);
    index.stereoscopicContent = Bit(flags, 2);
    const std::uint8_t formatAndRate = applicationInfo.UInt8("video format and frame rate");
    index.videoFormat = HighHalf(formatAndRate);
    index.frameRate = LowHalf(formatAndRate);

    index.firstPlayback = ReadIndexObject(indexes);
    index.topMenu = ReadIndexObject(indexes);
    index.titles.resize(indexes.Count16(IndexObjectSize, "number of titles"));
    for (IndexObject& title : index.titles) {
        title = ReadIndexObject(indexes);
    }
    return index;
}

} // namespace deskplayer
