/**
 * @file
 * Takes a description of a play list apart again.
 */
#ifndef TESTS_DESKPLAYER_LISTING_READDESCRIPTION_H
#define TESTS_DESKPLAYER_LISTING_READDESCRIPTION_H

#include <string>

#include <nlohmann/json.hpp>

namespace deskplayer
{

/**
 * The values a description shows, in the form of a play list in a disc's expected.json, and its
 * chapters besides. What stands in parentheses is passed over.
 *
 * @throw std::runtime_error a line or a value is not as it should be
 */
nlohmann::json ReadDescription(const std::string& description);

} // namespace deskplayer

#endif
