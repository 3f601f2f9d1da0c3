/**
 * @file
 * Reads a text from its beginning.
 */
#ifndef DESKPLAYER_FIELDLOG_TEXTCURSOR_H
#define DESKPLAYER_FIELDLOG_TEXTCURSOR_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>

namespace deskplayer
{

/** The part of a text that has not been read. Every operation leaves it unchanged if it fails. */
class TextCursor
{
public:
    explicit TextCursor(std::string_view text) : m_Rest(text) {}

    std::string_view Rest() const { return m_Rest; }

    /** Whether a digit follows. */
    bool AtDigit() const { return !m_Rest.empty() && IsDigit(m_Rest.front()); }

    bool Skip(std::string_view literal)
    {
        if (m_Rest.substr(0, literal.size()) != literal) {
            return false;
        }
        m_Rest.remove_prefix(literal.size());
        return true;
    }

    bool SkipOneOf(std::string_view characters)
    {
        if (m_Rest.empty() || characters.find(m_Rest.front()) == std::string_view::npos) {
            return false;
        }
        m_Rest.remove_prefix(1);
        return true;
    }

    void SkipBlanks() { m_Rest.remove_prefix(Length(m_Rest.find_first_not_of(' '))); }

    /** A number of @p fewest to @p most digits; at most 18. */
    std::optional<std::int64_t> Number(std::size_t fewest, std::size_t most)
    {
        std::int64_t number = 0;
        std::size_t digits = 0;
        for (; digits < m_Rest.size() && IsDigit(m_Rest[digits]); ++digits) {
            if (digits == most) {
                return std::nullopt;
            }
            number = 10 * number + (m_Rest[digits] - '0');
        }
        if (digits < fewest) {
            return std::nullopt;
        }
        m_Rest.remove_prefix(digits);
        return number;
    }

    /** What precedes @p end, which is skipped. */
    std::optional<std::string_view> Until(std::string_view end)
    {
        const std::size_t found = m_Rest.find(end);
        if (found == std::string_view::npos) {
            return std::nullopt;
        }
        const std::string_view text = m_Rest.substr(0, found);
        m_Rest.remove_prefix(found + end.size());
        return text;
    }

private:
    static bool IsDigit(char character) { return character >= '0' && character <= '9'; }

    std::size_t Length(std::size_t found) const
    {
        return found == std::string_view::npos ? m_Rest.size() : found;
    }

    std::string_view m_Rest;
};

} // namespace deskplayer

#endif
