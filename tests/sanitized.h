/**
 * @file
 * Whether a test program is built with a sanitizer that replaces the heap.
 */
#ifndef TESTS_SANITIZED_H
#define TESTS_SANITIZED_H

namespace bdmvtest
{

/**
 * Whether AddressSanitizer or ThreadSanitizer is on: they need more memory than a program may be
 * limited to, and stop it when an allocation is too large.
 */
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
constexpr bool Sanitized = true;
#elif !defined(__has_feature)
constexpr bool Sanitized = false;
#elif __has_feature(address_sanitizer) || __has_feature(thread_sanitizer)
constexpr bool Sanitized = true;
#else
constexpr bool Sanitized = false;
#endif

} // namespace bdmvtest

#endif
