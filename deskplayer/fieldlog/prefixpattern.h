/**
 * @file
 * Where a log of another kind has its time, component, level and text.
 *
 * @code
 * const PrefixPattern pattern("[{time}] {any} {component}/{level}: {text}");
 * pattern.Read("[  90.500000] player: BdmvNavigator/Event: Sending Paused");
 * @endcode
 */
#ifndef DESKPLAYER_FIELDLOG_PREFIXPATTERN_H
#define DESKPLAYER_FIELDLOG_PREFIXPATTERN_H

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "fieldlog/logline.h"

namespace deskplayer
{

/** A pattern of lines. A plain value. */
class PrefixPattern
{
public:
    /**
     * @param pattern `{time}`, `{component}`, `{level}`, `{any}` and, at its end, `{text}`, with
     * the characters between them. A blank stands for one or more; `{{` stands for a brace. What
     *        stands for a word ends where the characters after it first appear. `{time}` and
     *        `{text}` are required; without the others, all lines are taken as the navigator's.
     * @throw std::invalid_argument says what is wrong with the pattern
     */
    explicit PrefixPattern(std::string_view pattern);

    /** @return nothing if the line is not of this pattern; the parts refer to @p line */
    std::optional<LogLine> Read(std::string_view line) const;

private:
    enum class Part { Literal, Blanks, Time, Component, Level, Any, Text };

    struct Element {
        Part part;
        std::string literal; ///< of Part::Literal
    };

    static Part PartNamed(std::string_view name);
    void AddLiteral(char character);
    void AddPlace(std::string_view name);
    bool Contains(Part part) const;

    std::vector<Element> m_Elements;
};

} // namespace deskplayer

#endif
