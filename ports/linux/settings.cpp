#include "settings.h"

#include <algorithm>
#include <charconv>
#include <cstdio>
#include <cstdlib>

#include "printable.h"

namespace kevro
{

namespace
{

constexpr std::string_view Blanks = " \t\r\n";

} // namespace

Word Word::Whole(std::string_view text)
{
    return Word{text, 1}.Part(0);
}

Word Word::Part(std::size_t from, std::size_t count) const
{
    Word part{text.substr(from, count), position + from};
    const std::size_t leading = std::min(part.text.find_first_not_of(Blanks), part.text.size());
    part.text.remove_prefix(leading);
    part.position += leading;
    part.text.remove_suffix(part.text.size() - (part.text.find_last_not_of(Blanks) + 1));
    return part;
}

std::vector<Word> Word::Split(char separator) const
{
    std::vector<Word> parts;
    std::size_t from = 0;
    for (;;) {
        const std::size_t to = text.find(separator, from);
        if (to == std::string_view::npos) {
            parts.push_back(Part(from));
            return parts;
        }
        parts.push_back(Part(from, to - from));
        from = to + 1;
    }
}

long long Word::Number(long long smallest, long long largest) const
{
    long long number = 0;
    const char* const end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, number);
    if (error != std::errc() || stop != end || number < smallest || number > largest) {
        Refuse("a number from " + std::to_string(smallest) + " to " + std::to_string(largest));
    }
    return number;
}

void Word::Refuse(const std::string& expected) const
{
    RefuseBecause("expected " + expected);
}

void Word::RefuseBecause(const std::string& reason) const
{
    std::string word = "nothing";
    if (!text.empty()) {
        word = '"';
        AppendPrintable(word, text);
        word += '"';
    }
    throw Refusal(word + " at character " + std::to_string(position) + ": " + reason);
}

bool Apply(const Setting& setting, const char* text, char* message,
           std::size_t messageSize) noexcept
{
    const auto report = [&](const char* reason) {
        if (message != nullptr) {
            std::snprintf(message, messageSize, "%s", reason);
        }
    };
    try {
        if (text == nullptr) {
            throw Refusal("no text");
        }
        setting(text);
        report("");
        return true;
    } catch (const std::exception& reason) {
        report(reason.what());
        return false;
    }
}

bool ApplyEnvironment(const char* variable, const Setting& setting) noexcept
{
    // A program with more privileges than its caller does not let the caller choose a file.
    const char* const value = secure_getenv(variable);
    if (value == nullptr) {
        return false;
    }
    char message[256];
    if (!Apply(setting, value, message, sizeof(message))) {
        std::fprintf(stderr, "%s: %s; using the default\n", variable, message);
        return false;
    }
    return true;
}

} // namespace kevro
