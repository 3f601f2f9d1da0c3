/**
 * @file
 * Parses a description of a play list.
 */
#ifndef TESTS_DESKPLAYER_LISTING_READDESCRIPTION_H
#define TESTS_DESKPLAYER_LISTING_READDESCRIPTION_H

#include <string>

#include <nlohmann/json.hpp>

namespace deskplayer
{

/**
 * The values in a description, in the form that a disc's expected.json uses for a play list, and
 * the chapters. Text in parentheses is skipped.
 *
 * @throw std::runtime_error a line or a value is malformed
 */
nlohmann::json ReadDescription(const std::string& description);

} // namespace deskplayer

#endif
