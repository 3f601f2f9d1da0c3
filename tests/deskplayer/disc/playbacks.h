/**
 * @file
 * What the tests play: every sample session on every disc, and every play list.
 *
 * @code
 * class EveryRecording : public testing::TestWithParam<Playback> {...};
 * INSTANTIATE_TEST_SUITE_P(Disc, EveryRecording, testing::ValuesIn(PlaybacksOf(SampleDiscs())),
 *                          testing::PrintToStringParamName());
 * @endcode
 */
#ifndef TESTS_DESKPLAYER_DISC_PLAYBACKS_H
#define TESTS_DESKPLAYER_DISC_PLAYBACKS_H

#include <cstdint>
#include <filesystem>
#include <ostream>
#include <vector>

namespace deskplayer
{

/** What to play of a disc. */
struct Playback {
    std::filesystem::path disc;
    std::uint32_t playList = 0;
    std::filesystem::path session; ///< empty: from start to end without a viewer
};

/** As the name of a test: "titles_800", "sample_1_evening". */
std::ostream& operator<<(std::ostream& stream, const Playback& playback);

/** The sample disc, and those in tests/discs. */
std::vector<std::filesystem::path> SampleDiscs();

/** The files in examples/sessions. They are made for the sample disc; others refuse commands. */
std::vector<std::filesystem::path> SampleSessions();

/** Every play list of every disc, from start to end and with every sample session. */
std::vector<Playback> PlaybacksOf(const std::vector<std::filesystem::path>& discs);

} // namespace deskplayer

#endif
