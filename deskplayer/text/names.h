/**
 * @file
 * Names of values for people to read.
 */
#ifndef DESKPLAYER_TEXT_NAMES_H
#define DESKPLAYER_TEXT_NAMES_H

#include <string>
#include <string_view>
#include <vector>

#include "clientkit/bytes.h"
#include "clientkit/names.h"
#include "database/uomasktable.h"

namespace deskplayer
{

/**
 * The name of an enumerator; the number of a value without a name.
 *
 * @tparam Enumeration one of those of "clientkit/names.h"
 */
template <typename Enumeration> std::string NameOrNumber(Enumeration value)
{
    const char* const name = bdmv::NameOf(value);
    return name == nullptr ? std::to_string(value) : name;
}

/** The names of all callbacks, indexed by bdmv::CallbackId. */
std::vector<std::string_view> CallbackNames();

/** The operations that a mask forbids. */
std::vector<std::string> NamesOf(const bdmv::UOMaskTable& mask);

/** Two hexadecimal digits per byte; empty if there is no data, whatever the size. */
std::string HexOf(const bdmv::Bytes& bytes);

} // namespace deskplayer

#endif
