#include "recording/linejson.h"

#include <algorithm>
#include <array>
#include <iterator>

#include "text/printable.h"

namespace deskplayer
{

namespace
{

using nlohmann::json;

/** Counts the characters that the parser has consumed. */
class CountingIterator
{
public:
    using iterator_category = std::input_iterator_tag;
    using value_type = char;
    using difference_type = std::ptrdiff_t;
    using pointer = const char*;
    using reference = const char&;

    CountingIterator(const char* position, std::size_t& consumed)
        : m_pPosition(position), m_pConsumed(&consumed)
    {
    }

    reference operator*() const { return *m_pPosition; }

    CountingIterator& operator++()
    {
        ++m_pPosition;
        ++*m_pConsumed;
        return *this;
    }

    bool operator==(const CountingIterator& other) const
    {
        return m_pPosition == other.m_pPosition;
    }
    bool operator!=(const CountingIterator& other) const { return !(*this == other); }

private:
    const char* m_pPosition;
    std::size_t* m_pConsumed;
};

/**
 * More names, values, begins and ends than any line has that is written. The library's time grows
 * with the square of the number of objects in an array.
 */
constexpr int MostEvents = 2000;

/** The beginning of a text from a line, as a message shows it. */
std::string Shortened(std::string_view text)
{
    constexpr std::size_t longest = 160;
    return std::string(FirstCharacters(text, longest));
}

/** The library's message without its prefixes: "unexpected end of input; expected '}'". */
std::string MessageOf(const json::exception& error)
{
    const std::string_view message = error.what();
    const std::size_t prefix = message.find(" - ");
    const std::size_t start =
        prefix == std::string_view::npos ? message.find("] ") + 2 : prefix + 3;
    return "not JSON: " + Shortened(message.substr(start));
}

/** Finds where the values and names of a line begin, as the parser reports them. */
class Places
{
public:
    explicit Places(std::string_view line) : m_Line(line) {}

    /** Where the next value or name begins. @param consumed by the parser, up to its end */
    std::size_t Next(std::size_t consumed)
    {
        // A number has ended one character before the parser knows it: a character to skip.
        const std::size_t begin = m_Line.find_first_not_of(" \t\r,:}]", m_End);
        m_End = consumed;
        return begin;
    }

private:
    const std::string_view m_Line;
    std::size_t m_End = 0; ///< of the last one
};

/** The names that the open objects have so far, by depth. */
class NamesByDepth
{
public:
    void BeginObject(std::size_t depth) { m_Names.at(depth).clear(); }

    /** @return false if the object at @p depth has this name already */
    bool Add(std::size_t depth, const std::string& name)
    {
        std::vector<std::string>& names = m_Names.at(depth);
        if (std::find(names.begin(), names.end(), name) != names.end()) {
            return false;
        }
        names.push_back(name);
        return true;
    }

private:
    std::array<std::vector<std::string>, DeepestNesting + 1> m_Names;
};

/** @param onEvent called as a json::parser_callback_t; returns nothing */
template <typename Callback>
json Parse(std::string_view line, std::size_t& consumed, const Callback& onEvent)
{
    const CountingIterator first(line.data(), consumed);
    const CountingIterator last(line.data() + line.size(), consumed);
    return json::parse(first, last, [&onEvent](int depth, json::parse_event_t event, json& value) {
        onEvent(depth, event, value);
        return true;
    });
}

} // namespace

json ParseLine(std::string_view line)
{
    std::size_t consumed = 0;
    int events = 0;
    Places places(line);
    NamesByDepth names;
    try {
        return Parse(line, consumed, [&](int depth, json::parse_event_t event, const json& value) {
            if (depth > DeepestNesting) {
                throw LineError{consumed, "nested too deeply; expected at most " +
                                              std::to_string(DeepestNesting) + " levels"};
            }
            if (++events > MostEvents) {
                throw LineError{consumed, "too many values; expected at most a few hundred"};
            }
            const std::size_t begin = places.Next(consumed);
            const auto level = static_cast<std::size_t>(depth);
            if (event == json::parse_event_t::object_start) {
                names.BeginObject(level);
            } else if (event == json::parse_event_t::key) {
                // The names of an object are a level deeper than the object.
                const auto& name = value.get_ref<const std::string&>();
                if (!names.Add(level - 1, name)) {
                    throw LineError{begin + 1, "repeated member '" + Shortened(name) +
                                                   "'; expected each member once"};
                }
            }
        });
    } catch (const json::exception& error) {
        throw LineError{std::max<std::size_t>(consumed, 1), MessageOf(error)};
    }
}

std::size_t ColumnOf(std::string_view line, const std::vector<std::string>& path)
{
    std::size_t consumed = 0;
    std::size_t column = 1;
    Places places(line);
    std::vector<std::string> names;
    Parse(line, consumed, [&](int depth, json::parse_event_t event, const json& value) {
        const std::size_t begin = places.Next(consumed);
        const auto level = static_cast<std::size_t>(depth);
        if (event == json::parse_event_t::key) {
            names.resize(level);
            names.back() = value.get<std::string>();
        } else if (event != json::parse_event_t::object_end &&
                   event != json::parse_event_t::array_end && level == path.size() &&
                   names.size() >= level && std::equal(path.begin(), path.end(), names.begin())) {
            column = begin + 1;
        }
    });
    return column;
}

} // namespace deskplayer
