/**
 * @file
 * Reports a failed expectation as a finding of the fuzzer.
 */
#ifndef FUZZ_EXPECT_H
#define FUZZ_EXPECT_H

#include <algorithm>
#include <cstdlib>
#include <string>
#include <string_view>

#include "text/printable.h"

namespace fuzz
{

inline void Expect(bool holds)
{
    if (!holds) {
        std::abort();
    }
}

/** Expects valid UTF-8 without control characters; a backslash begins an escape sequence. */
inline void ExpectPrintableLine(std::string_view text)
{
    Expect(!text.empty());
    std::string unescaped(text);
    unescaped.erase(std::remove(unescaped.begin(), unescaped.end(), '\\'), unescaped.end());
    Expect(deskplayer::Printable(unescaped) == unescaped);
}

} // namespace fuzz

#endif
