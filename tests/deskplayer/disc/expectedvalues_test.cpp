#include <cctype>
#include <fstream>

#include <gtest/gtest.h>

#include "disc/aspectratios.h"
#include "disc/disc.h"
#include "json.h"
#include "testdiscs.h"

namespace deskplayer
{

namespace
{

using nlohmann::json;

class EveryDisc : public testing::TestWithParam<std::filesystem::path>
{
protected:
    EveryDisc() : m_Disc(GetParam()) { std::ifstream(GetParam() / "expected.json") >> m_Expected; }

    /** Reports differences as a patch that converts the value read to the expected one. */
    static void Compare(const json& read, const json& expected)
    {
        EXPECT_EQ(json::diff(read, expected).dump(1), "[]");
    }

    Disc m_Disc;
    json m_Expected;
};

std::string NameOfDisc(const testing::TestParamInfo<std::filesystem::path>& info)
{
    std::string name = info.param.filename().string();
    for (char& character : name) {
        if (std::isalnum(static_cast<unsigned char>(character)) == 0) {
            character = '_';
        }
    }
    return name;
}

INSTANTIATE_TEST_SUITE_P(Disc, EveryDisc, testing::ValuesIn(TestDiscs()), NameOfDisc);
INSTANTIATE_TEST_SUITE_P(FurtherDisc, EveryDisc, testing::ValuesIn(FurtherDiscs()), NameOfDisc);

TEST_P(EveryDisc, HasTheExpectedIndex)
{
    Compare(ToJson(m_Disc.ReadIndex()), m_Expected.at("index"));
}

TEST_P(EveryDisc, HasTheExpectedMovieObjects)
{
    Compare(ToJson(m_Disc.ReadMovieObjects()), m_Expected.at("movie_object"));
}

TEST_P(EveryDisc, HasTheExpectedClips)
{
    json clips = json::object();
    for (const auto& path : FilesBelow(GetParam(), ".clpi")) {
        const std::string clip = path.stem().string();
        clips[clip] = ToJson(m_Disc.ReadClipInfo(clip));
    }
    Compare(clips, m_Expected.at("clips"));
}

TEST_P(EveryDisc, HasTheExpectedPlayLists)
{
    json playLists = json::object();
    AspectRatios ratios(m_Disc);
    for (const std::uint32_t number : m_Disc.PlayListNumbers()) {
        const PlayList playList = m_Disc.ReadPlayList(number);
        const std::string name = std::to_string(100000 + number).substr(1);
        playLists[name] = ToJson(playList, [&](std::size_t playItem, const Stream& stream) {
            return ratios.Find(playList, playItem, stream).code;
        });
    }
    Compare(playLists, m_Expected.at("play_lists"));
}

} // namespace

} // namespace deskplayer
