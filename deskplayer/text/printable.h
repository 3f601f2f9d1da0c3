/**
 * @file
 * Makes text from files and users safe to print.
 */
#ifndef DESKPLAYER_TEXT_PRINTABLE_H
#define DESKPLAYER_TEXT_PRINTABLE_H

#include <string>

namespace deskplayer
{

/** @p text with every byte except printable ASCII, and the backslash, written as \\xNN. */
std::string Printable(const std::string& text);

} // namespace deskplayer

#endif
