#include "text/choice.h"

#include <algorithm>
#include <numeric>
#include <stdexcept>
#include <utility>

#include "text/printable.h"

namespace deskplayer
{

namespace
{

char LowerCase(char character)
{
    return character >= 'A' && character <= 'Z' ? static_cast<char>(character - 'A' + 'a')
                                                : character;
}

/** The number of characters to insert, delete or replace, without regard to case. */
std::size_t EditDistance(std::string_view left, std::string_view right)
{
    std::vector<std::size_t> distances(right.size() + 1); // from a part of left
    std::iota(distances.begin(), distances.end(), std::size_t{0});
    for (std::size_t i = 0; i < left.size(); ++i) {
        std::size_t diagonal = std::exchange(distances[0], i + 1);
        for (std::size_t j = 0; j < right.size(); ++j) {
            const bool same = LowerCase(left[i]) == LowerCase(right[j]);
            const std::size_t distance =
                std::min({distances[j] + 1, distances[j + 1] + 1, diagonal + (same ? 0 : 1)});
            diagonal = std::exchange(distances[j + 1], distance);
        }
    }
    return distances.back();
}

/** The choice that differs least from a word; empty if all differ in a third of it or more. */
std::string_view SimilarChoice(std::string_view word, const std::vector<std::string_view>& choices)
{
    constexpr std::size_t longest = 64; // of a word that can be similar
    std::string_view similar;
    std::size_t least = word.size() <= longest ? (word.size() + 2) / 3 : 0;
    for (const std::string_view choice : choices) {
        const std::size_t distance = least == 0 ? 0 : EditDistance(word, choice);
        if (distance < least) {
            least = distance;
            similar = choice;
        }
    }
    return similar;
}

} // namespace

std::size_t FindChoice(std::string_view word, std::string_view kind,
                       const std::vector<std::string_view>& choices)
{
    const auto found = std::find(choices.begin(), choices.end(), word);
    if (found != choices.end()) {
        return static_cast<std::size_t>(found - choices.begin());
    }
    std::string message = "'" + Printable(word) + "' is not ";
    message.append(kind);
    if (const std::string_view similar = SimilarChoice(word, choices); !similar.empty()) {
        throw std::invalid_argument(message.append("; did you mean ").append(similar).append("?"));
    }
    message.append("; expected ").append(choices.front());
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
