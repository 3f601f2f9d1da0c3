/**
 * @file
 * Counts what a summary says, from the lines of JSON that the desk player gives for the same
 * recording, without its code.
 */
#ifndef TESTS_DESKPLAYER_RECOUNT_H
#define TESTS_DESKPLAYER_RECOUNT_H

#include <nlohmann/json.hpp>
#include <string>

/** Lines of JSON as an array. */
nlohmann::json ParseLines(const std::string& text);

/** Expects that a summary in JSON says what the lines of JSON of the same recording do. */
void ExpectAgreement(const nlohmann::json& summary, const nlohmann::json& lines);

#endif
