#include "output/htmloutput.h"

#include <utility>

namespace deskplayer
{

HtmlOutput::HtmlOutput(std::ostream& stream, const VirtualClock& clock, const OutputFilter& filter,
                       const std::string& name, std::shared_ptr<const PageFrame> frame)
    : Output(stream, clock, OutputFilter()), m_pFrame(std::move(frame))
{
    stream << m_pFrame->head;
    m_Element.emplace(stream, name);
    m_Lines.emplace(m_Element->Lines(), clock, filter);
}

HtmlOutput::~HtmlOutput()
{
    m_Lines.reset();
    m_Element.reset();
    if (m_pFrame->writeOthers) {
        m_pFrame->writeOthers(Stream());
    }
    Stream() << m_pFrame->tail;
}

} // namespace deskplayer
