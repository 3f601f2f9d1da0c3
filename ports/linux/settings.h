/**
 * @file
 * The parsing that all settings of the port share: words of a text, refusals that name the word,
 * environment variables.
 */
#ifndef KEVRO_SETTINGS_H
#define KEVRO_SETTINGS_H

#include <cstddef>
#include <functional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

namespace kevro
{

/** The reason why a text was refused. */
class Refusal : public std::runtime_error
{
public:
    using std::runtime_error::runtime_error;
};

/** A part of a text, without surrounding blanks. */
struct Word {
    std::string_view text;
    std::size_t position; ///< of its first character in the whole text, from 1

    /** The whole of a text. */
    static Word Whole(std::string_view text);

    /** The part of @p count characters that begins at @p from. */
    Word Part(std::size_t from, std::size_t count = std::string_view::npos) const;

    /** The words between the separators: one more than the number of separators. */
    std::vector<Word> Split(char separator) const;

    /** The value of the word; refused unless it is an integer from @p smallest to @p largest. */
    long long Number(long long smallest, long long largest) const;

    /** Throws the Refusal that names the word, its position and what was expected instead. */
    [[noreturn]] void Refuse(const std::string& expected) const;

    /** Throws the Refusal that names the word, its position and the reason. */
    [[noreturn]] void RefuseBecause(const std::string& reason) const;
};

/** Applies a text, or throws and changes nothing. */
using Setting = std::function<void(const char* text)>;

/**
 * Applies a setting for a caller that cannot handle exceptions.
 *
 * @param message receives the reason of a refusal, else an empty text; cut to @p messageSize; may
 *                be null
 * @return whether the setting was applied
 */
bool Apply(const Setting& setting, const char* text, char* message,
           std::size_t messageSize) noexcept;

/**
 * Applies the value of an environment variable, if it is set. A refusal is reported in one line on
 * standard error.
 *
 * @return whether a value was applied
 */
bool ApplyEnvironment(const char* variable, const Setting& setting) noexcept;

} // namespace kevro

#endif
