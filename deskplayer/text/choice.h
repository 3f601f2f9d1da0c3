/**
 * @file
 * Words of which a user writes one or several.
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
 * Finds the word that a user wrote.
 *
 * @param word    exactly as one of @p choices is written
 * @param kind    what a choice is, for the message: "output format"
 * @param choices at least two
 * @return index among @p choices
 * @throw std::invalid_argument "'xml' is no output format; expected text, json or trace"
 */
std::size_t FindChoice(std::string_view word, std::string_view kind,
                       const std::vector<std::string_view>& choices);

/**
 * Finds the words of a list that are separated by commas, such as "control,settings".
 *
 * @return their indexes, in the order of the list
 * @throw std::invalid_argument the first word that is wrong, as FindChoice() does
 */
std::vector<std::size_t> FindChoices(std::string_view list, std::string_view kind,
                                     const std::vector<std::string_view>& choices);

} // namespace deskplayer

#endif
