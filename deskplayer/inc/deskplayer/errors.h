/**
 * @file
 * What the desk player throws, and how it reports what it can live with.
 */
#ifndef DESKPLAYER_INC_DESKPLAYER_ERRORS_H
#define DESKPLAYER_INC_DESKPLAYER_ERRORS_H

#include <functional>
#include <stdexcept>
#include <string>

namespace deskplayer
{

/**
 * A disc cannot be read. what() is one line without control characters: the file, what was found
 * there, and what was expected.
 */
class DiscError : public std::runtime_error
{
public:
    using std::runtime_error::runtime_error;
};

/**
 * A session cannot be read. what() is one line without control characters: the file, the line and
 * column if its text is malformed, what was found there, and what was expected.
 */
class SessionError : public std::runtime_error
{
public:
    using std::runtime_error::runtime_error;
};

/**
 * A recording cannot be read. what() is one line without control characters: the recording, the
 * line and, if its text is malformed, the column in bytes, what was found there, and what was
 * expected.
 */
class RecordingError : public std::runtime_error
{
public:
    using std::runtime_error::runtime_error;
};

/** Receives a message of one line. */
using MessageHandler = std::function<void(const std::string& message)>;

} // namespace deskplayer

#endif
