/**
 * @file
 * The words of session scripts and of the patterns of commands.
 */
#ifndef DESKPLAYER_SESSION_SCRIPTWORDS_H
#define DESKPLAYER_SESSION_SCRIPTWORDS_H

#include <cstdint>
#include <string>
#include <string_view>

namespace deskplayer
{

// Placeholders in patterns.
constexpr std::string_view NumberPlaceholder = "NUMBER";
constexpr std::string_view TimePlaceholder = "TIME";
constexpr std::string_view CallbackPlaceholder = "CALLBACK";
constexpr std::string_view ArgumentPlaceholder = "ARGUMENT=VALUE";

/** The problem of a word that does not fit and has no explanation of its own. */
constexpr std::string_view Unexpected = "unexpected";

/** The meaning of a word at its position. */
struct Meaning {
    std::uint64_t value = 0;
    std::string_view problem; ///< empty if the word fits
};

/** Reads @p word as @p patternWord of a command's pattern. */
Meaning ReadWord(std::string_view patternWord, std::string_view word);

/** Whether a placeholder stands for a number: NUMBER or TIME. */
bool IsValuePlaceholder(std::string_view patternWord);

/** Whether a placeholder stands for a word: CALLBACK or ARGUMENT=VALUE. */
bool IsWordPlaceholder(std::string_view patternWord);

/** What is expected in place of @p patternWord, for messages. */
std::string DescribePatternWord(std::string_view patternWord);

} // namespace deskplayer

#endif
