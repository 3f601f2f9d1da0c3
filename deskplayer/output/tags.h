/**
 * @file
 * Tags: what identifies a recording among others, such as the device and its firmware.
 *
 * @code
 * const Tags tags = ParseTags({"firmware=2.1", "device=box 7"});
 * TagsJson(tags); // {"device":"box 7","firmware":"2.1"}
 * @endcode
 */
#ifndef DESKPLAYER_OUTPUT_TAGS_H
#define DESKPLAYER_OUTPUT_TAGS_H

#include <cstddef>
#include <map>
#include <string>
#include <vector>

namespace deskplayer
{

/** Values by name, in the order in which they are written. All are valid UTF-8. */
using Tags = std::map<std::string, std::string>;

/** Bytes of all tags that ParseTags() accepts, as TagsJson() writes them: far below a line's. */
constexpr std::size_t LongestTags = 4096;

/**
 * Reads tags as a user writes them.
 *
 * @param texts "NAME=VALUE" each; the value may be empty or contain further equals signs
 * @throw std::invalid_argument a text has no name or no '=', two have the same name, one is not
 *        valid UTF-8, or they are too long; names the text
 */
Tags ParseTags(const std::vector<std::string>& texts);

/** An object of strings, on one line. */
std::string TagsJson(const Tags& tags);

} // namespace deskplayer

#endif
