/**
 * @file
 * Names chosen by a user from a list.
 */
#ifndef DESKPLAYER_TEXT_CHOICE_H
#define DESKPLAYER_TEXT_CHOICE_H

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace deskplayer
{

/**
 * Finds the choice that equals a user's word.
 *
 * @param word    must equal one of @p choices exactly
 * @param kind    the noun for a choice, with its article, for the message: "an output format"
 * @param choices at least two
 * @return index into @p choices
 * @throw std::invalid_argument "'xml' is not an output format; expected text, json, trace or html",
 *        or "'jason' is not an output format; did you mean json?"
 */
std::size_t FindChoice(std::string_view word, std::string_view kind,
                       const std::vector<std::string_view>& choices);

/**
 * Finds the words of a comma-separated list, such as "control,settings".
 *
 * @return their indices, in the order of the list
 * @throw std::invalid_argument for the first invalid word, as FindChoice() does
 */
std::vector<std::size_t> FindChoices(std::string_view list, std::string_view kind,
                                     const std::vector<std::string_view>& choices);

} // namespace deskplayer

#endif
