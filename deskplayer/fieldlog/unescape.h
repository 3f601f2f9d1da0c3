/**
 * @file
 * Undoes the escapes of log lines.
 */
#ifndef DESKPLAYER_FIELDLOG_UNESCAPE_H
#define DESKPLAYER_FIELDLOG_UNESCAPE_H

#include <string>
#include <string_view>

namespace deskplayer
{

/**
 * The text whose escaped form the Linux port wrote into a line: `\\`, `\n`, `\r`, `\t` and `\xNN`
 * are single characters. Any other backslash stands for itself.
 *
 * @param buffer holds the result if anything was escaped; must outlive it
 */
std::string_view Unescape(std::string_view text, std::string& buffer);

} // namespace deskplayer

#endif
