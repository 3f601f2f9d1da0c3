#include "fieldlog/prefixpattern.h"

#include <algorithm>
#include <stdexcept>

#include "fieldlog/textcursor.h"
#include "text/choice.h"
#include "text/printable.h"

namespace deskplayer
{

PrefixPattern::PrefixPattern(std::string_view pattern)
{
    TextCursor cursor(pattern);
    while (!cursor.Rest().empty()) {
        if (cursor.Skip("{{")) {
            AddLiteral('{');
        } else if (cursor.Skip("{")) {
            const auto name = cursor.Until("}");
            if (!name) {
                throw std::invalid_argument("'{' without '}'; '{{' stands for a brace");
            }
            AddPlace(*name);
        } else {
            const char character = cursor.Rest().front();
            cursor.SkipOneOf(cursor.Rest().substr(0, 1));
            AddLiteral(character);
        }
    }
    if (!Contains(Part::Time)) {
        throw std::invalid_argument("'{time}' is missing");
    }
    if (m_Elements.back().part != Part::Text) {
        throw std::invalid_argument("'{text}' must be at the end");
    }
}

std::optional<LogLine> PrefixPattern::Read(std::string_view line) const
{
    LogLine result;
    TextCursor cursor(line);
    for (auto element = m_Elements.begin(); element != m_Elements.end(); ++element) {
        if (element->part == Part::Literal) {
            if (!cursor.Skip(element->literal)) {
                return std::nullopt;
            }
        } else if (element->part == Part::Blanks) {
            if (!cursor.Skip(" ")) {
                return std::nullopt;
            }
            cursor.SkipBlanks();
        } else if (element->part == Part::Time) {
            cursor.SkipBlanks();
            std::string_view rest = cursor.Rest();
            const auto time = TakeLineTime(rest);
            if (!time) {
                return std::nullopt;
            }
            result.time = *time;
            cursor = TextCursor(rest);
        } else if (element->part == Part::Text) {
            result.text = cursor.Rest();
        } else {
            const Element& next = element[1];
            const std::size_t length =
                cursor.Rest().find(next.part == Part::Blanks ? " " : next.literal);
            if (length == std::string_view::npos) {
                return std::nullopt;
            }
            const std::string_view word = cursor.Rest().substr(0, length);
            cursor = TextCursor(cursor.Rest().substr(length));
            if (element->part == Part::Component) {
                result.component = word;
            } else if (element->part == Part::Level) {
                result.level = word;
            }
        }
    }
    return result;
}

PrefixPattern::Part PrefixPattern::PartNamed(std::string_view name)
{
    const std::vector<std::string_view> names = {"time", "component", "level", "any", "text"};
    constexpr Part Parts[] = {Part::Time, Part::Component, Part::Level, Part::Any, Part::Text};
    return Parts[FindChoice(name, "a place in a log line", names)];
}

void PrefixPattern::AddLiteral(char character)
{
    const Part part = character == ' ' ? Part::Blanks : Part::Literal;
    if (m_Elements.empty() || m_Elements.back().part != part) {
        m_Elements.push_back({part, ""});
    }
    m_Elements.back().literal += character;
}

void PrefixPattern::AddPlace(std::string_view name)
{
    const Part part = PartNamed(name);
    if (part != Part::Any && Contains(part)) {
        throw std::invalid_argument("'{" + std::string(name) + "}' is there twice");
    }
    const bool afterLiteral = m_Elements.empty() || m_Elements.back().part == Part::Literal ||
                              m_Elements.back().part == Part::Blanks ||
                              m_Elements.back().part == Part::Time;
    if (!afterLiteral) {
        throw std::invalid_argument("nothing separates '{" + std::string(name) +
                                    "}' from what is before it");
    }
    m_Elements.push_back({part, ""});
}

bool PrefixPattern::Contains(Part part) const
{
    return std::any_of(m_Elements.begin(), m_Elements.end(),
                       [part](const Element& element) { return element.part == part; });
}

} // namespace deskplayer
