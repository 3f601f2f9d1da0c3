/**
 * @file
 * Calls every callback once.
 */
#ifndef TESTS_DESKPLAYER_OUTPUT_EVERYCALLBACK_H
#define TESTS_DESKPLAYER_OUTPUT_EVERYCALLBACK_H

#include <vector>

#include "bdmvnavigator/inavigatorlistener.h"
#include "output/callbacklistener.h"

namespace deskplayer
{

/** Calls every callback once, in order of declaration, with distinct arguments. */
void CallEveryCallback(bdmv::INavigatorListener& listener);

/** Records the callbacks. */
class CollectingListener : public CallbackListener
{
public:
    std::vector<Callback> callbacks;

private:
    void OnCallback(const Callback& callback) override { callbacks.push_back(callback); }
};

} // namespace deskplayer

#endif
