#include "check/check.h"

#include <algorithm>
#include <vector>

#include <gtest/gtest.h>

#include "../disc/bytewriter.h"
#include "../disc/testdiscs.h"
#include "../listing/scratchdisc.h"

namespace deskplayer
{

namespace
{

namespace fs = std::filesystem;

std::vector<Fault> FaultsOf(const Disc& disc)
{
    std::vector<Fault> faults;
    const std::size_t count =
        CheckDisc(disc, [&faults](const Fault& fault) { faults.push_back(fault); });
    EXPECT_EQ(count, faults.size());
    return faults;
}

std::string TextOf(const Fault& fault)
{
    return fault.file + " " + (fault.offset ? std::to_string(*fault.offset) : "none") + " " +
           fault.found + " / " + fault.expected;
}

class EveryDisc : public testing::TestWithParam<fs::path>
{
};

std::string NameOfDisc(const testing::TestParamInfo<fs::path>& info)
{
    std::string name = info.param.filename().string();
    std::replace(name.begin(), name.end(), '-', '_');
    return name;
}

INSTANTIATE_TEST_SUITE_P(Disc, EveryDisc, testing::ValuesIn(TestDiscs()), NameOfDisc);
INSTANTIATE_TEST_SUITE_P(FurtherDisc, EveryDisc, testing::ValuesIn(FurtherDiscs()), NameOfDisc);

TEST_P(EveryDisc, IsSoundExceptForStreamsThatItsClipsDoNotHave)
{
    // Its play list was written by hand around clips without menus and text subtitles.
    const std::size_t streams = GetParam().filename() == "edited-menu" ? 3 : 0;
    const std::vector<Fault> faults = FaultsOf(Disc(GetParam(), BackupCopies::Ignore));
    EXPECT_EQ(faults.size(), streams);
    for (const Fault& fault : faults) {
        if (streams == 0 || fault.found.rfind("PID is ", 0) != 0) {
            ADD_FAILURE() << TextOf(fault);
        }
    }
}

/** A copy of a disc with one change. */
class ChangedDisc : public testing::Test
{
protected:
    explicit ChangedDisc(const std::string& name = "pip") : m_Name(name), m_Scratch(name) {}

    Disc Read() const { return m_Scratch.Read(); }

    /** Replaces bytes of a file by big-endian @p value. */
    void Patch(const std::string& file, std::size_t offset, std::size_t size, std::uint32_t value)
    {
        Bytes bytes = ReadContents(TestDisc(m_Name) / "BDMV" / file);
        for (std::size_t index = 0; index < size; ++index) {
            bytes.at(offset + index) = static_cast<std::uint8_t>(value >> (8 * (size - 1 - index)));
        }
        m_Scratch.Write(file, bytes);
    }

    /** Expects one fault: its offset, and the start of what was found. */
    void ExpectFault(const std::string& file, std::size_t offset, const std::string& found)
    {
        const std::vector<Fault> faults = FaultsOf(Read());
        ASSERT_EQ(faults.size(), 1u);
        EXPECT_EQ(faults[0].file, "BDMV/" + file);
        EXPECT_EQ(faults[0].offset, offset) << TextOf(faults[0]);
        EXPECT_EQ(faults[0].found.rfind(found, 0), 0u) << TextOf(faults[0]);
        EXPECT_NE(faults[0].expected, "");
    }

    void ExpectFaultAfterPatch(std::size_t offset, std::size_t size, std::uint32_t value,
                               const std::string& found)
    {
        SCOPED_TRACE(found);
        Patch(PlayListFile, offset, size, value);
        ExpectFault(PlayListFile, offset, found);
    }

    const std::string PlayListFile = "PLAYLIST/00000.mpls";
    const std::string m_Name;
    const ScratchDisc m_Scratch;
};

TEST_F(ChangedDisc, HasAFaultForAMissingFile)
{
    for (const char* const file : {"index.bdmv", "MovieObject.bdmv"}) {
        const ScratchDisc scratch("pip");
        scratch.Remove(file);
        const std::vector<Fault> faults = FaultsOf(scratch.Read());
        ASSERT_EQ(faults.size(), 1u);
        EXPECT_NE(faults[0].file.find(file), std::string::npos);
        EXPECT_EQ(faults[0].offset, std::nullopt);
        EXPECT_EQ(faults[0].found, "No such file or directory");
        EXPECT_EQ(faults[0].expected, "a file");
    }
}

TEST_F(ChangedDisc, HasAFaultForAMalformedFile)
{
    for (const char* const file :
         {"index.bdmv", "MovieObject.bdmv", "PLAYLIST/00000.mpls", "CLIPINF/00000.clpi"}) {
        const ScratchDisc scratch("pip");
        scratch.Write(file, Ascii("nonsense"));
        const std::vector<Fault> faults = FaultsOf(scratch.Read());
        ASSERT_EQ(faults.size(), 1u) << file;
        EXPECT_EQ(faults[0].file, std::string("BDMV/") + file);
        EXPECT_EQ(faults[0].offset, 0u);
        EXPECT_EQ(faults[0].found, "type indicator is \"nons\"");
    }
}

TEST_F(ChangedDisc, HasAFaultForMalformedClipInformationThatNoPlayListUses)
{
    m_Scratch.Write("CLIPINF/99999.clpi", Ascii("nonsense"));
    ExpectFault("CLIPINF/99999.clpi", 0, "type indicator");
}

TEST_F(ChangedDisc, HasAFaultForAMovieObjectThatDoesNotExist)
{
    const Index index = Read().ReadIndex();
    for (const IndexObject& object : {index.firstPlayback, index.topMenu, index.titles.at(0)}) {
        Patch("index.bdmv", object.offset + 6, 2, 999);
        ExpectFault("index.bdmv", object.offset + 6, "movie object of ");
    }
}

TEST_F(ChangedDisc, HasAFaultForAPlayItemWithInvalidReferencesOrTimes)
{
    const PlayItem item = Read().ReadPlayList(0).playItems.at(0);
    const std::size_t clip = item.clip.offset;
    ExpectFaultAfterPatch(clip + 11, 1, 7, "STC sequence is 7");
    ExpectFaultAfterPatch(clip + 12, 4, 5, "IN time is 5");
    ExpectFaultAfterPatch(clip + 16, 4, 0xFFFFFFFF, "OUT time is 4294967295");
    Patch(PlayListFile, clip + 4, 1, '7');
    const std::vector<Fault> faults = FaultsOf(Read());
    ASSERT_FALSE(faults.empty());
    EXPECT_EQ(TextOf(faults[0]), "BDMV/PLAYLIST/00000.mpls " + std::to_string(clip) +
                                     " clip name is \"00007\" / a clip with clip information, "
                                     "CLIPINF/00007.clpi");
}

TEST_F(ChangedDisc, HasAFaultForAStreamWithInvalidReferences)
{
    const StreamTable streams = Read().ReadPlayList(0).playItems.at(0).streams;
    const Stream video = streams.primaryVideo.at(0);
    ExpectFaultAfterPatch(video.offset + 1, 2, 0x1FF0, "PID is 0x1FF0");
    ExpectFaultAfterPatch(video.offset, 1, 9, "entry type is 9");

    const std::size_t codingType = video.offset + 10;
    Patch(PlayListFile, codingType, 1, 0x02);
    ExpectFault(PlayListFile, video.offset, "stream 0x1011 has coding type 0x02");

    const Stream secondaryVideo = streams.secondaryVideo.at(0);
    ASSERT_NE(secondaryVideo.entryType, EntryTypePlayItem);
    ExpectFaultAfterPatch(secondaryVideo.offset + 1, 1, 9, "sub path of the stream is 9");
}

TEST(CheckDisc, HasAFaultForAReferenceToAStreamThatDoesNotExist)
{
    const ScratchDisc scratch("secaudio");
    const Disc disc = scratch.Read();
    const Stream audio = disc.ReadPlayList(0).playItems.at(0).streams.secondaryAudio.at(0);
    ASSERT_FALSE(audio.primaryAudioReferences.empty());
    const std::size_t reference = audio.offset + 9 + 6 + 2; // after entry, attributes and count
    Bytes bytes = ReadContents(TestDisc("secaudio") / "BDMV/PLAYLIST/00000.mpls");
    ASSERT_EQ(bytes.at(reference), audio.primaryAudioReferences[0]);
    bytes[reference] = 99;
    scratch.Write("PLAYLIST/00000.mpls", bytes);

    const std::vector<Fault> faults = FaultsOf(disc);
    ASSERT_EQ(faults.size(), 1u);
    EXPECT_EQ(faults[0].offset, audio.offset);
    EXPECT_NE(faults[0].found.find("refers to number 99"), std::string::npos);
}

TEST_F(ChangedDisc, HasAFaultForAMarkWithInvalidReferences)
{
    const Mark mark = Read().ReadPlayList(0).marks.at(0);
    ExpectFaultAfterPatch(mark.offset + 2, 2, 99, "play item of mark 0 is 99");
    ExpectFaultAfterPatch(mark.offset + 4, 4, 5, "time of mark 0 is 5");
}

TEST_F(ChangedDisc, HasAFaultForASubPlayItemWithInvalidReferencesOrTimes)
{
    const PlayList playList = Read().ReadPlayList(0);
    ASSERT_FALSE(playList.subPaths.empty());
    const std::size_t clip = playList.subPaths.at(0).items.at(0).clip.offset;
    ExpectFaultAfterPatch(clip + 13, 1, 7, "STC sequence is 7");
    ExpectFaultAfterPatch(clip + 14, 4, 5, "IN time is 5");
    ExpectFaultAfterPatch(clip + 22, 2, 99, "sync play item is 99");
    ExpectFaultAfterPatch(clip + 24, 4, 5, "sync time is 5");
}

TEST(CheckDisc, HasAFaultForAnAngleWithoutAClip)
{
    const ScratchDisc scratch("edited-angles");
    const Disc disc = scratch.Read();
    for (const std::uint32_t number : disc.PlayListNumbers()) {
        for (const PlayItem& item : disc.ReadPlayList(number).playItems) {
            if (item.furtherAngles.empty() || item.furtherAngles[0].name == item.clip.name) {
                continue;
            }
            scratch.Remove("CLIPINF/" + item.furtherAngles[0].name + ".clpi");
            const std::vector<Fault> faults = FaultsOf(disc);
            EXPECT_TRUE(std::any_of(faults.begin(), faults.end(), [&](const Fault& fault) {
                return fault.offset == item.furtherAngles[0].offset;
            }));
            return;
        }
    }
    FAIL() << "no angle with a clip of its own";
}

TEST(CheckDisc, NamesEachFileBeforeItIsRead)
{
    std::vector<std::string> files;
    CheckDisc(
        Disc(TestDisc("pip")), [](const Fault&) {},
        [&files](const std::string& file) { files.push_back(file); });
    EXPECT_EQ(files.front(), "BDMV/index.bdmv");
    EXPECT_EQ(files.back(), "BDMV/PLAYLIST/00000.mpls");
    EXPECT_EQ(std::count(files.begin(), files.end(), "BDMV/CLIPINF/00000.clpi"), 1);
}

} // namespace

} // namespace deskplayer
