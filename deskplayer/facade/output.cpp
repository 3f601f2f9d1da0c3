#include "deskplayer/output.h"

#include <stdexcept>

#include "facade/outputsettings.h"
#include "facade/parts.h"

namespace deskplayer
{

OutputSettings ReadOutputOptions(const OutputOptions& options)
{
    OutputSettings settings;
    settings.format = ParseOutputFormat(options.format);
    if (!options.interfaces.empty()) {
        settings.filter.KeepInterfaces(options.interfaces);
    }
    if (!options.callbacks.empty()) {
        settings.filter.KeepCallbacks(options.callbacks);
    }
    settings.coloured = options.coloured;
    settings.tags = ParseTags(options.tags);
    return settings;
}

namespace
{

/** A page needs a file that is not part of the library. */
OutputSettings ReadDeskOutputOptions(const OutputOptions& options)
{
    OutputSettings settings = ReadOutputOptions(options);
    if (settings.format == OutputFormat::Html) {
        throw std::invalid_argument(
            "only bdmv-deskplayer writes html; expected text, json or trace");
    }
    return settings;
}

} // namespace

DeskOutput::DeskOutput(Desk& desk, std::ostream& stream, const OutputOptions& options)
    : m_rDesk(desk),
      m_pOutput(MakeOutput(ReadDeskOutputOptions(options), stream, PartsOf(desk).Clock()))
{
    m_rDesk.Listeners().AddListener(m_pOutput.get());
}

DeskOutput::~DeskOutput()
{
    m_rDesk.Listeners().RemoveListener(m_pOutput.get());
}

} // namespace deskplayer
