// The examples and tables of docs/outputs.md match the actual output.

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <sstream>

#include "kits/clientkit/everycallback.h"
#include "output/arguments.h"
#include "output/outputformat.h"

namespace deskplayer
{
namespace
{

std::string Documentation()
{
    std::ostringstream text;
    text << std::ifstream(BDMVNAVIGATOR_DOCS "/outputs.md").rdbuf();
    return text.str();
}

/** The session of the documentation's examples. */
std::string Example(OutputFormat format)
{
    OutputSettings options;
    options.format = format;
    std::ostringstream stream;
    VirtualClock clock;
    {
        const std::unique_ptr<Output> output = MakeOutput(options, stream, clock);
        output->PlayStarted();
        output->PlayItem(800, 0, bd::VideoFormatType1080p, bd::VideoAspectRatioType16x9);
        clock.Advance(Ticks(45000 * 58));
        output->Paused();
        clock.Advance(Ticks(45000 * 2));
        output->Stepped(45000 * 58 + 1877, bd::PlayDirectionForward);
        output->Finished(bdmv::INavControlListener::EndOfMedia);
    }
    return stream.str();
}

std::string KindOf(bool /*value*/)
{
    return "boolean";
}

std::string KindOf(std::uint64_t /*value*/)
{
    return "number";
}

std::string KindOf(Position /*value*/)
{
    return "position";
}

std::string KindOf(const std::string& /*value*/)
{
    return "text";
}

std::string KindOf(const std::vector<std::string>& /*value*/)
{
    return "names";
}

std::string KindOf(const bd::ZoomRectangleDef& /*value*/)
{
    return "rectangle";
}

TEST(Documentation, ShowsTheActualOutput)
{
    const std::string documentation = Documentation();
    for (const OutputFormat format :
         {OutputFormat::Text, OutputFormat::Json, OutputFormat::Trace}) {
        const std::string example = Example(format);
        EXPECT_NE(documentation.find("\n" + example + "```\n"), std::string::npos) << example;
    }
}

TEST(Documentation, ListsEveryCallbackWithItsArguments)
{
    const std::string documentation = Documentation();
    for (const bdmv::Callback& callback : bdmvtest::EveryCallback()) {
        std::string row = "| `";
        row.append(NameOf(callback.Id())).append("` | ");
        row.append(NameOf(InterfaceOf(callback.Id()))).append(" |");
        const char* separator = " ";
        VisitShownArguments({Ticks(), callback, {}}, [&](const char* name, const auto& value) {
            row.append(separator).append("`").append(name).append("` ").append(KindOf(value));
            separator = ", ";
        });
        EXPECT_NE(documentation.find("\n" + row + " |\n"), std::string::npos) << row << " |";
    }
}

} // namespace
} // namespace deskplayer
