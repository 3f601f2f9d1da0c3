#include "text/choice.h"

#include <algorithm>
#include <stdexcept>

#include "text/printable.h"

namespace deskplayer
{

std::size_t FindChoice(std::string_view word, std::string_view kind,
                       const std::vector<std::string_view>& choices)
{
    const auto found = std::find(choices.begin(), choices.end(), word);
    if (found != choices.end()) {
        return static_cast<std::size_t>(found - choices.begin());
    }
    std::string message = "'" + Printable(word) + "' is not ";
    message.append(kind).append("; expected ").append(choices.front());
    for (std::size_t i = 1; i < choices.size(); ++i) {
        message.append(i + 1 < choices.size() ? ", " : " or ").append(choices[i]);
    }
    throw std::invalid_argument(message);
}

std::vector<std::size_t> FindChoices(std::string_view list, std::string_view kind,
                                     const std::vector<std::string_view>& choices)
{
    std::vector<std::size_t> found;
    for (std::size_t begin = 0; begin <= list.size();) {
        const std::size_t end = std::min(list.find(',', begin), list.size());
        found.push_back(FindChoice(list.substr(begin, end - begin), kind, choices));
        begin = end + 1;
    }
    return found;
}

} // namespace deskplayer
