#include <functional>

#include <gtest/gtest.h>

#include "bytewriter.h"
#include "countingnew.h"
#include "disc/disc.h"
#include "disc/timeline.h"
#include "json.h"
#include "testdiscs.h"

namespace deskplayer
{

namespace
{

using nlohmann::json;

/** The readers of a kind of file. */
struct FileKind {
    const char* extension;
    std::function<json(const Bytes&)> toJson; ///< all values of the file
    std::function<void(const Bytes&)> parse;  ///< the same without the cost of JSON
};

json PlayListToJson(const Bytes& bytes)
{
    return ToJson(ParsePlayList(bytes, "file"),
                  [](std::size_t, const Stream&) { return std::nullopt; });
}

void UsePlayList(const Bytes& bytes)
{
    const PlayList playList = ParsePlayList(bytes, "file");
    BuildTimeLine(playList);
    for (std::size_t number = 0; number < playList.playItems.size(); ++number) {
        const StreamTable& streams = playList.playItems[number].streams;
        for (const auto& kind : {streams.primaryVideo, streams.pg, streams.secondaryVideo}) {
            for (const Stream& stream : kind) {
                ClipOfStream(playList, number, stream);
            }
        }
    }
}

json ClipInfoToJson(const Bytes& bytes)
{
    return ToJson(ParseClipInfo(bytes, "file"));
}

void UseClipInfo(const Bytes& bytes)
{
    const ClipInfo clipInfo = ParseClipInfo(bytes, "file");
    Duration(clipInfo);
    AspectRatiosOf(clipInfo);
}

json BdmvToJson(const Bytes& bytes)
{
    const bool isIndex = !bytes.empty() && bytes[0] == 'I';
    return isIndex ? ToJson(ParseIndex(bytes, "file")) : ToJson(ParseMovieObjects(bytes, "file"));
}

/** Calls @p visit with the contents of every file of every disc, and its readers. */
void ForEveryFile(const std::function<void(const Bytes&, const FileKind&)>& visit)
{
    static const FileKind kinds[] = {{".mpls", PlayListToJson, UsePlayList},
                                     {".clpi", ClipInfoToJson, UseClipInfo},
                                     {".bdmv", BdmvToJson, BdmvToJson}};
    for (const auto& folder : {TestDiscs(), FurtherDiscs()}) {
        for (const auto& disc : folder) {
            for (const FileKind& kind : kinds) {
                for (const auto& path : FilesBelow(disc, kind.extension)) {
                    SCOPED_TRACE(path.string());
                    visit(ReadContents(path), kind);
                }
            }
        }
    }
}

/** Calls @p read and returns whether it succeeded. Any exception but a refusal fails the test. */
bool IsAccepted(const std::function<void()>& read)
{
    try {
        read();
        return true;
    } catch (const FormatError&) {
        return false;
    }
}

TEST(DamagedFiles, AreRefusedWhenTruncatedUnlessTheMissingBytesAreInsignificant)
{
    std::size_t refused = 0;
    ForEveryFile([&](const Bytes& bytes, const FileKind& kind) {
        const json whole = kind.toJson(bytes);
        for (std::size_t size = 0; size < bytes.size(); ++size) {
            const Bytes begin(bytes.begin(), bytes.begin() + std::ptrdiff_t(size));
            json value;
            if (IsAccepted([&] { value = kind.toJson(begin); })) {
                ASSERT_EQ(value, whole) << "truncated to " << size << " bytes";
            } else {
                ++refused;
            }
        }
    });
    EXPECT_GT(refused, 10000u);
}

TEST(DamagedFiles, AreReadOrRefusedWhicheverByteIsDamaged)
{
    std::size_t accepted = 0;
    std::size_t refused = 0;
    ForEveryFile([&](Bytes bytes, const FileKind& kind) {
        for (std::uint8_t& byte : bytes) {
            const std::uint8_t original = byte;
            for (const int damaged : {0x00, 0xFF, original ^ 0x80}) {
                byte = static_cast<std::uint8_t>(damaged);
                ++(IsAccepted([&] { kind.parse(bytes); }) ? accepted : refused);
            }
            byte = original;
        }
    });
    EXPECT_GT(accepted, 10000u);
    EXPECT_GT(refused, 1000u);
}

/** The memory that ParsePlayList() allocates, even if it refuses the file. */
std::size_t MemoryForPlayList(const Bytes& bytes)
{
    const std::size_t before = AllocatedBytes();
    IsAccepted([&] { ParsePlayList(bytes, "file"); });
    return AllocatedBytes() - before;
}

TEST(DamagedFiles, AllocateNoMemoryForMissingContent)
{
    PlayListBytes items = WithItem(PlayItemBytes());
    items.itemCount = 0xFFFF;
    EXPECT_LT(MemoryForPlayList(items.Make()), 2000u);

    PlayListBytes subPaths = WithItem(PlayItemBytes());
    subPaths.subPathCount = 0xFFFF;
    EXPECT_LT(MemoryForPlayList(subPaths.Make()), 2000u);

    PlayListBytes marks;
    marks.marks = Part32(Join({U16(0xFFFF), MarkBytes(1, 0, 0)}));
    EXPECT_LT(MemoryForPlayList(marks.Make()), 2000u);

    EXPECT_LT(MemoryForPlayList(WithStreams(Repeat(8, {0xFF}), AudioStream(1)).Make()), 4000u);
}

TEST(DamagedFiles, AllocateMemoryAtMostInProportionToTheirSize)
{
    const Bytes dense = DensePlayList().Make();
    ASSERT_GT(dense.size(), LargestPlayListFile * 9 / 10);
    EXPECT_LT(MemoryForPlayList(dense), 40 * dense.size());
}

} // namespace

} // namespace deskplayer
