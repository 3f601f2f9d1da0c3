/**
 * @file
 * What is wrong with a disc.
 */
#ifndef DESKPLAYER_CHECK_FAULT_H
#define DESKPLAYER_CHECK_FAULT_H

#include <cstddef>
#include <functional>
#include <optional>
#include <string>

namespace deskplayer
{

/** A fault in a file. */
struct Fault {
    std::string file;
    std::optional<std::size_t> offset; ///< in bytes from the start; none for a file as a whole
    std::string found;                 ///< may be empty without an offset
    std::string expected;              ///< may be empty without an offset
};

using FaultHandler = std::function<void(const Fault& fault)>;

} // namespace deskplayer

#endif
