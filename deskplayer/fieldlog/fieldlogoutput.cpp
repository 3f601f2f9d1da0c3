#include "fieldlog/fieldlogoutput.h"

#include <nlohmann/json.hpp>

#include "text/timetext.h"

namespace deskplayer
{

FieldLogOutput::FieldLogOutput(const OutputSettings& settings, std::ostream& stream)
    : m_Format(settings.format), m_rStream(stream),
      m_pOutput(MakeOutput(settings, stream, m_Clock)), m_rRecords(*m_pOutput)
{
}

void FieldLogOutput::OnStart(const StartRecord& start)
{
    if (m_Format == OutputFormat::Json) {
        const nlohmann::ordered_json line = {{"ticks", start.time.count()},
                                             {"start", {{"wallClock", start.wallClock}}}};
        m_rStream << line.dump() << '\n';
    } else if (m_Format == OutputFormat::Text) {
        m_rStream << TimeText(start.time) << "  (start) at " << start.wallClock << '\n';
    }
}

} // namespace deskplayer
