/**
 * @file
 * A callback without arguments as a value.
 */
#ifndef CLIENTKIT_WITHOUTARGUMENTS_H
#define CLIENTKIT_WITHOUTARGUMENTS_H

#include "bdmvnavigator/inavigatorlistener.h"
#include "clientkit/callbackid.h"

namespace bdmv
{
namespace callbacks
{

/**
 * @tparam id    the callback
 * @tparam Owner the interface that declares it
 * @tparam slot  its method
 */
template <CallbackId id, typename Owner, void (Owner::*slot)()> struct WithoutArguments {
    static constexpr CallbackId Id() { return id; }

    void CallOn(INavigatorListener& listener) const { (listener.*slot)(); }

    template <typename Self, typename Visitor> static void VisitArguments(Self&, Visitor&) {}
};

} // namespace callbacks
} // namespace bdmv

#endif
