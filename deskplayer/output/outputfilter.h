/**
 * @file
 * Which callbacks are written.
 */
#ifndef DESKPLAYER_OUTPUT_OUTPUTFILTER_H
#define DESKPLAYER_OUTPUT_OUTPUTFILTER_H

#include <bitset>
#include <string_view>

#include "output/callbacks.h"

namespace deskplayer
{

/** A set of callbacks: all at first, fewer with every Keep operation. A plain value. */
class OutputFilter
{
public:
    /**
     * Keeps the callbacks of some interfaces.
     *
     * @param interfaces InterfaceNames separated by commas: "control,settings"
     * @throw std::invalid_argument names the word that is none and all that there are; the filter
     *        stays as it is
     */
    void KeepInterfaces(std::string_view interfaces);

    /**
     * Keeps some callbacks.
     *
     * @param callbacks names of AllCallbacks separated by commas: "PlayItem,AudioInfo"
     * @throw std::invalid_argument as KeepInterfaces() does
     */
    void KeepCallbacks(std::string_view callbacks);

    bool Passes(CallbackId id) const { return m_Passing[static_cast<std::size_t>(id)]; }

private:
    using CallbackSet = std::bitset<AllCallbacks.size()>;

    CallbackSet m_Passing = CallbackSet().set();
};

} // namespace deskplayer

#endif
