/**
 * @file
 * Reports a failed expectation as a finding of the fuzzer.
 */
#ifndef FUZZ_EXPECT_H
#define FUZZ_EXPECT_H

#include <cstdlib>
#include <string_view>

namespace fuzz
{

inline void Expect(bool holds)
{
    if (!holds) {
        std::abort();
    }
}

inline void ExpectPrintableLine(std::string_view text)
{
    Expect(!text.empty());
    for (const char character : text) {
        Expect(character >= 0x20 && character < 0x7F);
    }
}

} // namespace fuzz

#endif
