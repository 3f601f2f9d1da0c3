/**
 * @file
 * The JSON of one line, and where its parts are.
 *
 * @code
 * const nlohmann::json value = ParseLine(line);
 * if (!value.at("gap").is_object()) {
 *     throw LineError{ColumnOf(line, {"gap"}), "unexpected 5; expected an object"};
 * }
 * @endcode
 */
#ifndef DESKPLAYER_RECORDING_LINEJSON_H
#define DESKPLAYER_RECORDING_LINEJSON_H

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include <nlohmann/json.hpp>

namespace deskplayer
{

/** A line cannot be read. */
struct LineError {
    std::size_t column;  ///< in bytes, from 1
    std::string message; ///< what was found and what was expected; may contain any bytes
};

/** How deep objects and arrays may be nested: more than in any line that is written. */
constexpr int DeepestNesting = 8;

/**
 * @throw LineError the line is not JSON, nested too deeply, has thousands of values, or an object
 *        in it has a member twice
 */
nlohmann::json ParseLine(std::string_view line);

/**
 * The column where a value begins.
 *
 * @param line that ParseLine() can read
 * @param path the names of the members that lead from the line's object to the value
 */
std::size_t ColumnOf(std::string_view line, const std::vector<std::string>& path);

} // namespace deskplayer

#endif
