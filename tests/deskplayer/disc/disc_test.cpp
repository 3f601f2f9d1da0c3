#include <gtest/gtest.h>
#include <sys/resource.h>
#include <unistd.h>

#include "bytewriter.h"
#include "disc/aspectratios.h"
#include "disc/disc.h"
#include "expectederror.h"
#include "testdiscs.h"

namespace deskplayer
{

namespace
{

namespace fs = std::filesystem;

/** A scratch folder for each test, with an empty disc. */
class DiscFiles : public testing::Test
{
protected:
    DiscFiles()
    {
        std::string pattern = (fs::temp_directory_path() / "disc_test_XXXXXX").string();
        m_Folder = mkdtemp(pattern.data());
        fs::create_directories(m_Folder / "BDMV" / "PLAYLIST");
        fs::create_directories(m_Folder / "BDMV" / "CLIPINF");
    }

    ~DiscFiles() override { fs::remove_all(m_Folder); }

    fs::path PathOf(const std::string& name) const { return m_Folder / "BDMV" / name; }

    void Write(const std::string& name, const Bytes& bytes) const
    {
        WriteBytes(PathOf(name), bytes);
    }

    /** A play list of one item of @p duration ticks. */
    void WritePlayList(const std::string& name, std::uint32_t duration) const
    {
        PlayItemBytes item;
        item.inTime = 5;
        item.outTime = 5 + duration;
        Write("PLAYLIST/" + name + ".mpls", WithItem(item).Make());
    }

    Disc MakeDisc() const { return Disc(m_Folder); }

    fs::path m_Folder;
};

TEST_F(DiscFiles, IsFoundFromTheBdmvFolderAndFromItsParent)
{
    EXPECT_EQ(Disc(TestDisc("titles")).PlayListNumbers().size(), 5u);
    EXPECT_EQ(Disc(TestDisc("titles") / "BDMV").PlayListNumbers().size(), 5u);
    EXPECT_EQ(Disc(TestDisc("titles") / "BDMV" / "").PlayListNumbers().size(), 5u);
}

TEST_F(DiscFiles, IsNotFoundInAFolderWithoutBdmv)
{
    const fs::path folder = m_Folder / "else\nwhere";
    EXPECT_EQ(FileErrorOf([&] { Disc disc(folder); }),
              (m_Folder / "else").string() +
                  "\\x0Awhere: not a disc, expected a BDMV folder or its parent");
}

TEST_F(DiscFiles, ListsPlayListsOfFiveDigitsInOrder)
{
    for (const char* const name : {"00800.mpls", "00001.mpls", "99999.mpls", "00000.mpls",
                                   "0001.mpls", "000010.mpls", "0000a.mpls", "00002.MPLSX",
                                   "00003.mpls~", "00004.clpi", ".mpls", "00005", "1.mplsmpls"}) {
        Write(std::string("PLAYLIST/") + name, {});
    }
    EXPECT_EQ(MakeDisc().PlayListNumbers(), (std::vector<std::uint32_t>{0, 1, 800, 99999}));
}

TEST_F(DiscFiles, AreFoundWhateverTheCaseOfTheirNames)
{
    WritePlayList("00001", 30);
    Write("CLIPINF/00000.CLPI", ReadContents(TestDisc("ntsc43") / "BDMV/CLIPINF/00000.clpi"));
    Write("INDEX.BDMV", ReadContents(TestDisc("ntsc43") / "BDMV/index.bdmv"));
    Write("movieobject.bdmv", ReadContents(TestDisc("ntsc43") / "BDMV/MovieObject.bdmv"));
    fs::rename(PathOf("PLAYLIST/00001.mpls"), PathOf("PLAYLIST/00001.MPLS"));
    fs::rename(PathOf("PLAYLIST"), PathOf("playlist"));
    fs::rename(PathOf("CLIPINF"), PathOf("Clipinf"));
    fs::rename(m_Folder / "BDMV", m_Folder / "bdmv");

    for (const fs::path& folder : {m_Folder, m_Folder / "bdmv"}) {
        const Disc disc(folder);
        EXPECT_EQ(disc.PlayListNumbers(), std::vector<std::uint32_t>{1});
        EXPECT_EQ(disc.ReadPlayList(1).playItems.at(0).outTime, 35u);
        EXPECT_EQ(disc.ReadClipInfo("00000").version, "0200");
        EXPECT_EQ(disc.ReadIndex().version, "0200");
        EXPECT_EQ(disc.ReadMovieObjects().version, "0200");
    }
}

/** A disc with a play list of 30 ticks in its backup folder. */
class BackupFiles : public DiscFiles
{
protected:
    BackupFiles()
    {
        fs::create_directories(PathOf("BACKUP/PLAYLIST"));
        WritePlayList("00001", 30);
        fs::rename(PathOf("PLAYLIST/00001.mpls"), PathOf("BACKUP/PLAYLIST/00001.mpls"));
    }

    /** The disc, whose messages are kept. */
    Disc MakeDiscWithCopies()
    {
        return Disc(m_Folder, BackupCopies::Use,
                    [this](const std::string& message) { m_Messages.push_back(message); });
    }

    std::vector<std::string> m_Messages;
};

TEST_F(BackupFiles, ReplaceAMissingFile)
{
    const Disc disc = MakeDiscWithCopies();
    EXPECT_EQ(disc.PlayListNumbers(), std::vector<std::uint32_t>{1});
    EXPECT_EQ(disc.ReadPlayList(1).playItems.at(0).outTime, 35u);
    EXPECT_EQ(m_Messages, std::vector<std::string>{
                              PathOf("PLAYLIST/00001.mpls").string() +
                              ": No such file or directory, expected a file; using the copy "
                              "BDMV/BACKUP/PLAYLIST/00001.mpls"});
}

TEST_F(BackupFiles, ReplaceADamagedFileWithOneMessage)
{
    Write("PLAYLIST/00001.mpls", Ascii("nonsense"));
    const Disc disc = MakeDiscWithCopies();
    disc.ReadPlayList(1);
    EXPECT_EQ(disc.ReadPlayList(1).playItems.at(0).outTime, 35u);
    EXPECT_EQ(m_Messages,
              std::vector<std::string>{
                  "BDMV/PLAYLIST/00001.mpls: offset 0: type indicator is \"nons\", but expected "
                  "\"MPLS\"; using the copy BDMV/BACKUP/PLAYLIST/00001.mpls"});
}

TEST_F(BackupFiles, ReplaceAMissingPlayListFolder)
{
    fs::remove_all(PathOf("PLAYLIST"));
    EXPECT_EQ(MakeDisc().PlayListNumbers(), std::vector<std::uint32_t>{1});
    EXPECT_EQ(MakeDisc().ReadPlayList(1).playItems.size(), 1u);
}

TEST_F(BackupFiles, AreFoundWhateverTheCaseOfTheirNames)
{
    fs::rename(PathOf("BACKUP/PLAYLIST/00001.mpls"), PathOf("BACKUP/PLAYLIST/00001.MPLS"));
    fs::rename(PathOf("BACKUP"), PathOf("backup"));
    EXPECT_EQ(MakeDisc().PlayListNumbers(), std::vector<std::uint32_t>{1});
    EXPECT_EQ(MakeDisc().ReadPlayList(1).playItems.size(), 1u);
}

TEST_F(BackupFiles, AreNotUsedForASoundFile)
{
    WritePlayList("00001", 10);
    EXPECT_EQ(MakeDiscWithCopies().ReadPlayList(1).playItems.at(0).outTime, 15u);
    EXPECT_TRUE(m_Messages.empty());
}

TEST_F(BackupFiles, AreNotUsedIfTheyAreDamagedAsWell)
{
    Write("PLAYLIST/00001.mpls", Ascii("nonsense"));
    Write("BACKUP/PLAYLIST/00001.mpls", Ascii("damaged!"));
    const Disc disc = MakeDiscWithCopies();
    EXPECT_EQ(
        FormatErrorOf([&] { disc.ReadPlayList(1); }),
        "BDMV/PLAYLIST/00001.mpls: offset 0: type indicator is \"nons\", but expected \"MPLS\"");
    EXPECT_TRUE(m_Messages.empty());
}

TEST_F(BackupFiles, AreIgnoredIfTheCallerWantsTheFilesThemselves)
{
    const Disc disc(m_Folder, BackupCopies::Ignore);
    EXPECT_TRUE(disc.PlayListNumbers().empty());
    EXPECT_NE(FileErrorOf([&] { disc.ReadPlayList(1); }), "");
}

TEST_F(DiscFiles, PrefersTheFileWithTheExactName)
{
    WritePlayList("00001", 30);
    fs::rename(PathOf("PLAYLIST/00001.mpls"), PathOf("PLAYLIST/00001.MPLS"));
    WritePlayList("00001", 10);
    EXPECT_EQ(MakeDisc().PlayListNumbers(), std::vector<std::uint32_t>{1});
    EXPECT_EQ(MakeDisc().ReadPlayList(1).playItems.at(0).outTime, 15u);
}

TEST_F(DiscFiles, AreNamedInMessagesAsTheyAreFound)
{
    Write("PLAYLIST/00001.MPLS", Ascii("nonsense"));
    EXPECT_EQ(
        FormatErrorOf([&] { MakeDisc().ReadPlayList(1); }),
        "BDMV/PLAYLIST/00001.MPLS: offset 0: type indicator is \"nons\", but expected \"MPLS\"");
}

TEST_F(DiscFiles, ReportsAMissingPlayListFolder)
{
    fs::remove(PathOf("PLAYLIST"));
    EXPECT_EQ(FileErrorOf([&] { MakeDisc().PlayListNumbers(); }),
              PathOf("PLAYLIST").string() +
                  ": No such file or directory, expected a folder of play lists");
}

TEST_F(DiscFiles, ReportsAMissingFile)
{
    EXPECT_EQ(FileErrorOf([&] { MakeDisc().ReadPlayList(7); }),
              PathOf("PLAYLIST/00007.mpls").string() +
                  ": No such file or directory, expected a file");
    EXPECT_EQ(FileErrorOf([&] { MakeDisc().ReadPlayList(1234567); }),
              PathOf("PLAYLIST/1234567.mpls").string() +
                  ": No such file or directory, expected a file");
}

TEST_F(DiscFiles, ReportsAPathThatIsNotARegularFile)
{
    fs::create_directory(PathOf("index.bdmv"));
    EXPECT_EQ(FileErrorOf([&] { MakeDisc().ReadIndex(); }),
              PathOf("index.bdmv").string() + ": expected a regular file");
    fs::create_symlink("/dev/zero", PathOf("MovieObject.bdmv"));
    EXPECT_EQ(FileErrorOf([&] { MakeDisc().ReadMovieObjects(); }),
              PathOf("MovieObject.bdmv").string() + ": expected a regular file");
}

TEST_F(DiscFiles, RefusesAFileThatIsTooLarge)
{
    Write("index.bdmv", {});
    fs::resize_file(PathOf("index.bdmv"), LargestFile + 1);
    EXPECT_EQ(FileErrorOf([&] { MakeDisc().ReadIndex(); }),
              PathOf("index.bdmv").string() + ": has 4194305 bytes, expected at most 4194304");

    WritePlayList("00000", 1);
    fs::resize_file(PathOf("PLAYLIST/00000.mpls"), LargestPlayListFile + 1);
    EXPECT_EQ(FileErrorOf([&] { MakeDisc().ReadPlayList(0); }),
              PathOf("PLAYLIST/00000.mpls").string() +
                  ": has 1048577 bytes, expected at most 1048576");
}

TEST_F(DiscFiles, ReadsAFileOfTheMaximumSize)
{
    Write("PLAYLIST/00000.mpls", WithItem(PlayItemBytes()).Make());
    fs::resize_file(PathOf("PLAYLIST/00000.mpls"), LargestPlayListFile);
    EXPECT_EQ(MakeDisc().ReadPlayList(0).playItems.size(), 1u);
}

// The sanitizer itself opens files while the test makes opening fail.
#if defined(__has_feature)
#define UNDEFINED_BEHAVIOR_SANITIZER __has_feature(undefined_behavior_sanitizer)
#else
#define UNDEFINED_BEHAVIOR_SANITIZER 0
#endif

#if !UNDEFINED_BEHAVIOR_SANITIZER
TEST_F(DiscFiles, ReportsAFileThatCannotBeOpened)
{
    WritePlayList("00000", 1);
    const Disc disc = MakeDisc();
    rlimit files = {};
    ASSERT_EQ(getrlimit(RLIMIT_NOFILE, &files), 0);
    rlimit none = files;
    none.rlim_cur = 0;
    ASSERT_EQ(setrlimit(RLIMIT_NOFILE, &none), 0);
    const std::string error = FileErrorOf([&] { disc.ReadPlayList(0); });
    ASSERT_EQ(setrlimit(RLIMIT_NOFILE, &files), 0);
    EXPECT_EQ(error, PathOf("PLAYLIST/00000.mpls").string() +
                         ": cannot be read: Too many open files, expected 122 bytes");
}
#endif

TEST_F(DiscFiles, NamesAMalformedFileRelativeToTheDisc)
{
    Write("index.bdmv", Ascii("nonsense"));
    EXPECT_EQ(FormatErrorOf([&] { MakeDisc().ReadIndex(); }),
              "BDMV/index.bdmv: offset 0: type indicator is \"nons\", but expected \"INDX\"");
    Write("MovieObject.bdmv", Ascii("nonsense"));
    EXPECT_EQ(FormatErrorOf([&] { MakeDisc().ReadMovieObjects(); }),
              "BDMV/MovieObject.bdmv: offset 0: type indicator is \"nons\", but expected \"MOBJ\"");
    Write("PLAYLIST/00012.mpls", Ascii("nonsense"));
    EXPECT_EQ(
        FormatErrorOf([&] { MakeDisc().ReadPlayList(12); }),
        "BDMV/PLAYLIST/00012.mpls: offset 0: type indicator is \"nons\", but expected \"MPLS\"");
    Write("CLIPINF/00034.clpi", Ascii("nonsense"));
    EXPECT_EQ(
        FormatErrorOf([&] { MakeDisc().ReadClipInfo("00034"); }),
        "BDMV/CLIPINF/00034.clpi: offset 0: type indicator is \"nons\", but expected \"HDMV\"");
}

/** Looks up the aspect ratio of the first video stream of the disc "ntsc43", which is 4:3. */
class AspectRatioLookup : public DiscFiles
{
protected:
    AspectRatioLookup() : m_PlayList(Disc(TestDisc("ntsc43")).ReadPlayList(0))
    {
        fs::copy_file(TestDisc("ntsc43") / "BDMV" / "CLIPINF" / "00000.clpi",
                      PathOf("CLIPINF/00000.clpi"));
    }

    Stream& Video() { return m_PlayList.playItems.at(0).streams.primaryVideo.at(0); }

    AspectRatio Find()
    {
        m_Missing.clear();
        m_Unreadable.clear();
        const Disc disc = MakeDisc();
        AspectRatios ratios(
            disc, {[this](const std::string& message) { m_Missing.push_back(message); },
                   [this](const std::string& message) { m_Unreadable.push_back(message); }});
        ratios.Find(m_PlayList, 0, Video());
        return ratios.Find(m_PlayList, 0, Video());
    }

    /** @return the reason */
    std::string ExpectUnknown(const std::string& reason)
    {
        const AspectRatio ratio = Find();
        EXPECT_EQ(ratio.code, std::nullopt);
        EXPECT_NE(ratio.reason.find(reason), std::string::npos) << ratio.reason;
        return ratio.reason;
    }

    PlayList m_PlayList;
    std::vector<std::string> m_Missing;
    std::vector<std::string> m_Unreadable;
};

TEST_F(AspectRatioLookup, ComesFromTheClipInformation)
{
    EXPECT_EQ(Find().code, 2);
}

TEST_F(AspectRatioLookup, ComesFromTheClipThatTheSubPathNames)
{
    SubPlayItem subItem;
    subItem.clip.name = "00000";
    m_PlayList.subPaths = {{5, false, {subItem}}};
    m_PlayList.playItems.at(0).clip.name = "00001";
    Video().entryType = EntryTypeSubPath;
    EXPECT_EQ(Find().code, 2);
}

TEST_F(AspectRatioLookup, IsUnknownWithoutClipInformation)
{
    fs::remove(PathOf("CLIPINF/00000.clpi"));
    const std::string reason = ExpectUnknown("00000.clpi: No such file or directory");
    EXPECT_EQ(m_Missing, std::vector<std::string>{reason}) << "once for each clip";
    EXPECT_TRUE(m_Unreadable.empty());
}

TEST_F(AspectRatioLookup, IsUnknownIfTheClipHasNoSuchStream)
{
    Video().pid = 1;
    ExpectUnknown("not in the clip information");
    Video().pid = 0xFFFF;
    ExpectUnknown("not in the clip information");
}

TEST_F(AspectRatioLookup, IsUnknownIfNoClipIsNamed)
{
    Video().entryType = EntryTypeSubPath;
    ExpectUnknown("its clip is unknown");
}

TEST_F(AspectRatioLookup, IsUnknownIfTheClipInformationIsDamaged)
{
    fs::resize_file(PathOf("CLIPINF/00000.clpi"), 50);
    const std::string reason = ExpectUnknown("BDMV/CLIPINF/00000.clpi: offset ");
    EXPECT_EQ(m_Unreadable, std::vector<std::string>{reason}) << "once for each clip";
    EXPECT_TRUE(m_Missing.empty());
}

TEST_F(AspectRatioLookup, IsReadOncePerClip)
{
    const Disc disc = MakeDisc();
    AspectRatios ratios(disc);
    EXPECT_EQ(ratios.Find(m_PlayList, 0, Video()).code, 2);
    fs::remove(PathOf("CLIPINF/00000.clpi"));
    EXPECT_EQ(ratios.Find(m_PlayList, 0, Video()).code, 2);
}

TEST_F(DiscFiles, FindsTheLongestPlayList)
{
    WritePlayList("00000", 10);
    WritePlayList("00001", 30);
    WritePlayList("00002", 20);
    const LongestPlayList longest = MakeDisc().FindLongestPlayList();
    EXPECT_EQ(longest.number, 1u);
    EXPECT_EQ(longest.playList.playItems.at(0).outTime, 35u);
    EXPECT_TRUE(longest.skipped.empty());
}

TEST_F(DiscFiles, FindsTheLowestNumberAmongTheLongestPlayLists)
{
    WritePlayList("00002", 20);
    WritePlayList("00001", 20);
    WritePlayList("00000", 10);
    EXPECT_EQ(MakeDisc().FindLongestPlayList().number, 1u);
}

TEST_F(DiscFiles, FindsAnEmptyPlayListIfThereIsNoOther)
{
    Write("PLAYLIST/00003.mpls", PlayListBytes().Make());
    EXPECT_EQ(MakeDisc().FindLongestPlayList().number, 3u);
}

TEST_F(DiscFiles, ReportsTheSkippedPlayLists)
{
    Write("PLAYLIST/00000.mpls", Ascii("damaged"));
    WritePlayList("00001", 10);
    fs::create_directory(PathOf("PLAYLIST/00002.mpls"));
    const LongestPlayList longest = MakeDisc().FindLongestPlayList();
    EXPECT_EQ(longest.number, 1u);
    EXPECT_EQ(longest.skipped,
              (std::vector<std::string>{
                  "BDMV/PLAYLIST/00000.mpls: offset 0: type indicator is \"dama\", but expected "
                  "\"MPLS\"",
                  PathOf("PLAYLIST/00002.mpls").string() + ": expected a regular file"}));
}

TEST_F(DiscFiles, SkipsPlayListsThatAreTooLongToPlay)
{
    constexpr std::uint32_t hours10 = 10 * 3600 * 45000;
    const auto writeHundredHoursAnd = [this](const std::string& name, std::uint32_t ticks) {
        PlayListBytes playList;
        playList.itemCount = 11;
        for (unsigned number = 0; number < playList.itemCount; ++number) {
            PlayItemBytes item;
            item.outTime = item.inTime + (number < 10 ? hours10 : ticks);
            const Bytes bytes = item.Make();
            playList.items.insert(playList.items.end(), bytes.begin(), bytes.end());
        }
        Write("PLAYLIST/" + name + ".mpls", playList.Make());
    };
    writeHundredHoursAnd("00000", 45);
    EXPECT_EQ(FileErrorOf([&] { MakeDisc().FindLongestPlayList(); }),
              PathOf("PLAYLIST").string() +
                  ": no play list can be played: BDMV/PLAYLIST/00000.mpls: lasts 100:00:00.001, "
                  "expected at most 100:00:00.000");

    WritePlayList("00001", 10);
    EXPECT_EQ(MakeDisc().FindLongestPlayList().number, 1u);
    EXPECT_EQ(MakeDisc().FindLongestPlayList().skipped,
              std::vector<std::string>{"BDMV/PLAYLIST/00000.mpls: lasts 100:00:00.001, expected at "
                                       "most 100:00:00.000"});

    writeHundredHoursAnd("00002", 0);
    EXPECT_EQ(MakeDisc().FindLongestPlayList().number, 2u);
}

TEST_F(DiscFiles, ReportsThatThereIsNoPlayList)
{
    EXPECT_EQ(FileErrorOf([&] { MakeDisc().FindLongestPlayList(); }),
              PathOf("PLAYLIST").string() + ": no play list, expected files such as 00000.mpls");
}

TEST_F(DiscFiles, ReportsThatNoPlayListCanBePlayed)
{
    Write("PLAYLIST/00000.mpls", {});
    EXPECT_EQ(FileErrorOf([&] { MakeDisc().FindLongestPlayList(); }),
              PathOf("PLAYLIST").string() +
                  ": no play list can be played: BDMV/PLAYLIST/00000.mpls: offset 0: file has 0 "
                  "bytes left, but expected 4 bytes for type indicator");
}

} // namespace

} // namespace deskplayer
