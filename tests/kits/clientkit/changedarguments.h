/**
 * @file
 * Callbacks with other arguments than a given one.
 */
#ifndef TESTS_KITS_CLIENTKIT_CHANGEDARGUMENTS_H
#define TESTS_KITS_CLIENTKIT_CHANGEDARGUMENTS_H

#include <functional>
#include <string>
#include <vector>

#include "clientkit/callback.h"

namespace bdmvtest
{

/** The same callback with every number replaced by one of @p source, and with another program. */
bdmv::Callback WithNumbers(const bdmv::Callback& callback,
                           const std::function<bd::UInt64()>& source);

/** A callback that differs from another in one number, one bit of which is changed. */
struct ChangedCallback {
    bdmv::Callback callback;
    std::string change; ///< the callback and the argument
};

/** The same callback with each number in turn changed in its lowest and in its highest bit. */
std::vector<ChangedCallback> WithEachNumberChanged(const bdmv::Callback& callback);

} // namespace bdmvtest

#endif
