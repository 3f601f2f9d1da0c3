// The dump of every callback, compared byte for byte with a file: the same on every target.
// Examples in documents are compared with what they show.

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include "boxtest.h"
#include "samplecallbacks.h"

namespace bdmvtest
{
namespace
{

class BlackBoxGolden : public BoxTest
{
};

std::string ContentsOf(const char* file)
{
    std::ostringstream text;
    text << std::ifstream(file, std::ios::binary).rdbuf();
    return text.str();
}

TEST_F(BlackBoxGolden, IsTheSameOnEveryTarget)
{
    const std::vector<bdmv::Callback> callbacks = SampleCallbacks();
    bdmv::BlackBox box(callbacks.size(), Ticks, 3);
    box.Paused(); // overwritten
    for (const bdmv::Callback& callback : callbacks) {
        s_Ticks = NextSampleTime(s_Ticks);
        bdmv::Deliver(callback, box);
    }

    EXPECT_EQ(DumpOf(box), ContentsOf(BDMVNAVIGATOR_SAMPLE_DUMP));
}

TEST_F(BlackBoxGolden, IsWhatTheDocumentationShows)
{
    bdmv::BlackBox box(3, Ticks);
    box.PlayStarted();
    box.PlayItem(800, 0, bd::VideoFormatType1080p, bd::VideoAspectRatioType16x9);
    s_Ticks = 45000 * 58;
    box.Paused();
    s_Ticks = 45000 * 60;
    box.Stepped(45000 * 58 + 1877, bd::PlayDirectionForward);
    box.Finished(bdmv::INavControlListener::EndOfMedia);

    const std::string dump = DumpOf(box);
    const std::string gap = dump.substr(0, dump.find('\n') + 1);
    const std::string documentation = ContentsOf(BDMVNAVIGATOR_OUTPUTS_DOCUMENT);
    EXPECT_NE(documentation.find("```json\n" + dump + "```\n"), std::string::npos) << dump;
    EXPECT_NE(documentation.find("```json\n" + gap + "```\n"), std::string::npos) << gap;
}

/** The lines of a text without indentation and comment marks. */
std::vector<std::string> LinesOf(const std::string& text)
{
    std::vector<std::string> lines;
    std::istringstream stream(text);
    for (std::string line; std::getline(stream, line);) {
        const std::size_t begin = line.find_first_not_of(" *");
        lines.push_back(begin == std::string::npos ? "" : line.substr(begin));
    }
    return lines;
}

TEST(BlackBoxHeader, ShowsAnExampleThatIsCompiled)
{
    const std::string header = ContentsOf(BDMVNAVIGATOR_BLACKBOX_HEADER);
    const std::size_t begin = header.find("@code") + 5;
    const std::vector<std::string> example =
        LinesOf(header.substr(begin, header.find("@endcode") - begin));
    ASSERT_GT(example.size(), 10u);

    const std::vector<std::string> program = LinesOf(ContentsOf(BDMVNAVIGATOR_BLACKBOX_EXAMPLE));
    auto from = program.begin();
    for (const std::string& line : example) {
        if (!line.empty() && line != "..." && line.compare(0, 2, "//") != 0) {
            from = std::find(from, program.end(), line);
            ASSERT_NE(from, program.end()) << line;
        }
    }
}

} // namespace
} // namespace bdmvtest
