#include "docs/markdown.h"

#include <cctype>
#include <fstream>
#include <regex>
#include <sstream>
#include <stdexcept>

namespace
{

std::string WithoutBlanksAround(const std::string& text)
{
    const std::size_t first = text.find_first_not_of(' ');
    return first == std::string::npos ? ""
                                      : text.substr(first, text.find_last_not_of(' ') + 1 - first);
}

bool IsNumbered(const std::string& line)
{
    const std::size_t end = line.find_first_not_of("0123456789");
    return end != 0 && end != std::string::npos && line.compare(end, 2, ". ") == 0;
}

/** The cells of a line of a table. A bar after a backslash belongs to its cell. */
TableRow CellsOf(const std::string& line)
{
    TableRow cells;
    std::string cell;
    for (std::size_t i = 1; i < line.size(); ++i) {
        if (line[i] == '|') {
            cells.push_back(WithoutBlanksAround(cell));
            cell.clear();
        } else {
            i += line.compare(i, 2, "\\|") == 0 ? 1U : 0U;
            cell += line[i];
        }
    }
    return cells;
}

} // namespace

std::string Chapter::Anchor() const
{
    std::string anchor;
    for (const char c : title) {
        if (c == ' ') {
            anchor += '-';
        } else if (std::isalnum(static_cast<unsigned char>(c)) != 0 || c == '-' || c == '_') {
            anchor += static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
        }
    }
    return anchor;
}

std::vector<TableRow> Chapter::TableRows() const
{
    std::vector<TableRow> rows;
    bool inBody = false;
    for (const std::string& line : lines) {
        if (!StartsWith(line, "|")) {
            inBody = false;
        } else if (StartsWith(line, "|--")) {
            inBody = true;
        } else if (inBody) {
            rows.push_back(CellsOf(line));
        }
    }
    return rows;
}

std::vector<std::vector<std::string>> Chapter::NumberedItems() const
{
    std::vector<std::vector<std::string>> items;
    bool inItem = false;
    for (const std::string& line : lines) {
        if (IsNumbered(line)) {
            items.push_back({line});
            inItem = true;
        } else if (inItem && StartsWith(line, "   - ")) {
            items.back().push_back(line.substr(3));
        } else if (inItem && StartsWith(line, "   ")) {
            items.back().back() += " " + WithoutBlanksAround(line);
        } else {
            inItem = false;
        }
    }
    return items;
}

std::vector<Chapter> ReadMarkdown(const std::string& path)
{
    std::vector<Chapter> chapters(1);
    bool inCode = false;
    std::istringstream text(ReadFile(path));
    for (std::string line; std::getline(text, line);) {
        inCode = inCode != StartsWith(line, "```");
        const std::size_t level = line.find_first_not_of('#');
        if (!inCode && level != 0 && level != std::string::npos && line[level] == ' ') {
            chapters.emplace_back();
            chapters.back().title = line.substr(level + 1);
            chapters.back().level = static_cast<int>(level);
        } else {
            chapters.back().lines.push_back(line);
        }
    }
    return chapters;
}

std::vector<std::string> LinkTargets(const std::string& text)
{
    return AllMatches(text, "\\]\\(([^)]*)\\)");
}

std::vector<std::string> CodeSpans(const std::string& text)
{
    return AllMatches(text, "`([^`]*)`");
}

bool StartsWith(const std::string& text, const std::string& start)
{
    return text.compare(0, start.size(), start) == 0;
}

std::string ReadFile(const std::string& path)
{
    std::ifstream file(path, std::ios::binary);
    std::ostringstream content;
    content << file.rdbuf();
    if (!file) {
        throw std::runtime_error("cannot read " + path);
    }
    return content.str();
}

std::vector<std::string> AllMatches(const std::string& text, const std::string& expression)
{
    std::vector<std::string> matches;
    const std::regex regex(expression);
    for (std::sregex_iterator i(text.begin(), text.end(), regex), end; i != end; ++i) {
        matches.push_back((*i)[1]);
    }
    return matches;
}
