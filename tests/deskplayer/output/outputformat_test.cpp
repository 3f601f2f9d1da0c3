#include "output/outputformat.h"

#include <gtest/gtest.h>

#include <memory>
#include <sstream>
#include <stdexcept>

namespace deskplayer
{
namespace
{

/** The beginning of a session that is paused. */
std::string Written(const OutputSettings& options)
{
    std::ostringstream stream;
    VirtualClock clock;
    const std::unique_ptr<Output> output = MakeOutput(options, stream, clock);
    output->Paused();
    return stream.str();
}

TEST(OutputFormat, IsParsedByItsName)
{
    EXPECT_EQ(ParseOutputFormat("text"), OutputFormat::Text);
    EXPECT_EQ(ParseOutputFormat("json"), OutputFormat::Json);
    EXPECT_EQ(ParseOutputFormat("trace"), OutputFormat::Trace);
    EXPECT_EQ(ParseOutputFormat("html"), OutputFormat::Html);
}

TEST(OutputFormat, NamesAnUnknownFormatAndAllFormats)
{
    try {
        ParseOutputFormat("xml");
        FAIL() << "no error";
    } catch (const std::invalid_argument& error) {
        EXPECT_STREQ(error.what(),
                     "'xml' is not an output format; expected text, json, trace or html");
    }
}

TEST(OutputFormat, DeterminesTheOutput)
{
    OutputSettings options;
    EXPECT_EQ(Written(options).substr(0, 12), "00:00:00.000");

    options.format = OutputFormat::Json;
    EXPECT_EQ(Written(options).front(), '{');

    options.format = OutputFormat::Trace;
    EXPECT_EQ(Written(options).front(), '[');

    options.format = OutputFormat::Html;
    options.page = std::make_shared<PageFrame>(PageFrame{"head", "tail", {}});
    EXPECT_EQ(Written(options).substr(0, 4), "head");
}

TEST(OutputFormat, IsCombinedWithTheOtherOptions)
{
    OutputSettings options;
    options.coloured = true;
    EXPECT_NE(Written(options).find('\033'), std::string::npos);

    for (const OutputFormat format : {OutputFormat::Text, OutputFormat::Json}) {
        options.format = format;
        options.filter.KeepCallbacks("Stopped");
        EXPECT_EQ(Written(options), "");
    }
    options.format = OutputFormat::Trace;
    EXPECT_EQ(Written(options).find("\"ph\":\"i\""), std::string::npos);
}

} // namespace
} // namespace deskplayer
