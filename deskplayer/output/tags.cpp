#include "output/tags.h"

#include <stdexcept>
#include <utility>

#include <nlohmann/json.hpp>

#include "text/printable.h"

namespace deskplayer
{

Tags ParseTags(const std::vector<std::string>& texts)
{
    Tags tags;
    for (const std::string& text : texts) {
        const std::size_t nameEnd = text.find('=');
        if (nameEnd == std::string::npos || nameEnd == 0) {
            throw std::invalid_argument("'" + Printable(text) +
                                        "' is not a tag; expected NAME=VALUE");
        }
        if (!IsUtf8(text)) {
            throw std::invalid_argument("tag '" + Printable(text) + "' is not valid UTF-8");
        }
        const std::string name = text.substr(0, nameEnd);
        if (!tags.emplace(name, text.substr(nameEnd + 1)).second) {
            throw std::invalid_argument("tag '" + Printable(name) + "' given twice");
        }
    }
    const std::size_t size = TagsJson(tags).size();
    if (size > LongestTags) {
        throw std::invalid_argument("tags too long: " + std::to_string(size) +
                                    " bytes of JSON; expected at most " +
                                    std::to_string(LongestTags));
    }
    return tags;
}

std::string TagsJson(const Tags& tags)
{
    return nlohmann::json(tags).dump();
}

} // namespace deskplayer
