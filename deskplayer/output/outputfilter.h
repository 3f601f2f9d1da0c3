/**
 * @file
 * Selects the callbacks to write.
 */
#ifndef DESKPLAYER_OUTPUT_OUTPUTFILTER_H
#define DESKPLAYER_OUTPUT_OUTPUTFILTER_H

#include <bitset>
#include <string_view>

#include "clientkit/callbackid.h"

namespace deskplayer
{

/** A set of callbacks: initially all; every Keep operation reduces it. A plain value. */
class OutputFilter
{
public:
    /**
     * Keeps only the callbacks of some interfaces.
     *
     * @param interfaces names of bdmv::ListenerInterface separated by commas: "control,settings"
     * @throw std::invalid_argument names the unknown word and a similar one or all valid ones; the
     *        filter is unchanged
     */
    void KeepInterfaces(std::string_view interfaces);

    /**
     * Keeps only some callbacks.
     *
     * @param callbacks names of bdmv::CallbackId separated by commas: "PlayItem,AudioInfo"
     * @throw std::invalid_argument as KeepInterfaces() does
     */
    void KeepCallbacks(std::string_view callbacks);

    bool Passes(bdmv::CallbackId id) const { return m_Passing[static_cast<std::size_t>(id)]; }

private:
    using CallbackSet = std::bitset<bdmv::Callback__sizeof>;

    CallbackSet m_Passing = CallbackSet().set();
};

} // namespace deskplayer

#endif
