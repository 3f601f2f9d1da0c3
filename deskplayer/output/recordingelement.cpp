#include "output/recordingelement.h"

#include <string_view>

#include "text/printable.h"

namespace deskplayer
{

namespace
{

/** The value of an attribute in quotes. */
std::string AttributeText(const std::string& text)
{
    std::string escaped;
    for (const char character : Printable(text)) {
        switch (character) {
        case '&':
            escaped += "&amp;";
            break;
        case '<':
            escaped += "&lt;";
            break;
        case '>':
            escaped += "&gt;";
            break;
        case '"':
            escaped += "&quot;";
            break;
        default:
            escaped += character;
        }
    }
    return escaped;
}

} // namespace

ScriptBuffer::int_type ScriptBuffer::overflow(int_type character)
{
    const char written = traits_type::to_char_type(character);
    return xsputn(&written, 1) == 1 ? character : traits_type::eof();
}

std::streamsize ScriptBuffer::xsputn(const char* text, std::streamsize size)
{
    std::string_view rest(text, static_cast<std::size_t>(size));
    for (std::size_t tag = rest.find('<'); tag != std::string_view::npos; tag = rest.find('<')) {
        m_rPage << rest.substr(0, tag) << "\\u003c";
        rest.remove_prefix(tag + 1);
    }
    m_rPage << rest;
    return m_rPage ? size : 0;
}

RecordingElement::RecordingElement(std::ostream& page, const std::string& name)
    : m_rPage(page), m_Buffer(page), m_Lines(&m_Buffer)
{
    m_rPage << R"(<script type="application/x-ndjson" data-name=")" << AttributeText(name)
            << "\">\n";
}

RecordingElement::~RecordingElement()
{
    m_rPage << "</script>";
}

} // namespace deskplayer
