/**
 * @file
 * The output formats.
 */
#ifndef DESKPLAYER_OUTPUT_OUTPUTFORMAT_H
#define DESKPLAYER_OUTPUT_OUTPUTFORMAT_H

#include <array>
#include <memory>
#include <ostream>
#include <string>
#include <string_view>

#include "output/htmloutput.h"
#include "output/output.h"

namespace deskplayer
{

enum class OutputFormat {
    Text,  ///< TextOutput
    Json,  ///< JsonOutput
    Trace, ///< TraceOutput
    Html   ///< HtmlOutput
};

/** Indexed by OutputFormat. */
inline constexpr std::array<std::string_view, 4> OutputFormatNames{"text", "json", "trace", "html"};

/** What the names of files with such an output end in; indexed by OutputFormat. */
inline constexpr std::array<std::string_view, OutputFormatNames.size()> OutputFormatExtensions{
    ".txt", ".jsonl", ".json", ".html"};

/**
 * @param name one of OutputFormatNames
 * @throw std::invalid_argument names the unknown word and a similar one or all valid ones
 */
OutputFormat ParseOutputFormat(std::string_view name);

/** What to write, and how. */
struct OutputSettings {
    OutputFormat format = OutputFormat::Text;
    OutputFilter filter;
    bool coloured = false; ///< for text only
    Tags tags;             ///< for json only

    std::string recordingName;             ///< for people; for html only
    std::shared_ptr<const PageFrame> page; ///< not null for html
};

/** @param stream does not throw; it and @p clock must outlive the output */
std::unique_ptr<Output> MakeOutput(const OutputSettings& settings, std::ostream& stream,
                                   const VirtualClock& clock);

} // namespace deskplayer

#endif
