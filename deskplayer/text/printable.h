/**
 * @file
 * Makes text from files and users safe to print.
 */
#ifndef DESKPLAYER_TEXT_PRINTABLE_H
#define DESKPLAYER_TEXT_PRINTABLE_H

#include <cstddef>
#include <string>
#include <string_view>

namespace deskplayer
{

/**
 * @p text as it appears in every message: valid UTF-8 as it is, and every byte of control
 * characters, of the backslash and of anything else written as \\xNN.
 */
std::string Printable(std::string_view text);

/** Whether @p text consists of valid UTF-8 characters only. */
bool IsUtf8(std::string_view text);

/** The start of @p text, at most @p longest bytes, that ends between two characters. */
std::string_view FirstCharacters(std::string_view text, std::size_t longest);

} // namespace deskplayer

#endif
