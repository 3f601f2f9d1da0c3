#include "output/outputformat.h"

#include "output/jsonoutput.h"
#include "output/textoutput.h"
#include "output/traceoutput.h"
#include "text/choice.h"

namespace deskplayer
{

OutputFormat ParseOutputFormat(std::string_view name)
{
    return static_cast<OutputFormat>(
        FindChoice(name, "an output format", {OutputFormatNames.begin(), OutputFormatNames.end()}));
}

std::unique_ptr<Output> MakeOutput(const OutputSettings& settings, std::ostream& stream,
                                   const VirtualClock& clock)
{
    switch (settings.format) {
    case OutputFormat::Json:
        return std::make_unique<JsonOutput>(stream, clock, settings.filter, settings.tags);
    case OutputFormat::Trace:
        return std::make_unique<TraceOutput>(stream, clock, settings.filter);
    case OutputFormat::Html:
        return std::make_unique<HtmlOutput>(stream, clock, settings.filter, settings.recordingName,
                                            settings.page);
    case OutputFormat::Text:
        break;
    }
    return std::make_unique<TextOutput>(stream, clock, settings.filter, settings.coloured);
}

} // namespace deskplayer
