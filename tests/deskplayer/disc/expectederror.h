/**
 * @file
 * Returns the messages of expected exceptions.
 */
#ifndef TESTS_DESKPLAYER_DISC_EXPECTEDERROR_H
#define TESTS_DESKPLAYER_DISC_EXPECTEDERROR_H

#include <functional>
#include <string>

namespace deskplayer
{

/** what() of the FormatError that @p operation throws; fails the test if it throws none. */
std::string FormatErrorOf(const std::function<void()>& operation);

/** what() of the FileError that @p operation throws; fails the test if it throws none. */
std::string FileErrorOf(const std::function<void()>& operation);

} // namespace deskplayer

#endif
