#include "expectederror.h"

#include <gtest/gtest.h>

#include "disc/errors.h"

namespace deskplayer
{

namespace
{

template <typename Error> std::string ErrorOf(const std::function<void()>& operation)
{
    try {
        operation();
    } catch (const Error& error) {
        return error.what();
    }
    ADD_FAILURE() << "nothing was thrown";
    return "";
}

} // namespace

std::string FormatErrorOf(const std::function<void()>& operation)
{
    return ErrorOf<FormatError>(operation);
}

std::string FileErrorOf(const std::function<void()>& operation)
{
    return ErrorOf<FileError>(operation);
}

} // namespace deskplayer
